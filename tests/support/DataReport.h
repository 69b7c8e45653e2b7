#pragma once

#include "ReportFixture.h"
#include "TemplateMarkup.h"

#include <gtest/gtest.h>

#include <vector>

/// A report with the table "Points" of a template, on pages of so many lines.
class TableReport
{
public:
    TableReport(const std::vector<QByteArray> &fields, const char *separator, int linesPerPage = 72,
                std::initializer_list<const char *> sortKeys = {})
    {
        folders_.putIntoLibrary(markup::surveyTemplate(markup::output("Table", "Points", "Survey", fields, sortKeys),
                                                       QByteArray(), markup::separatorOption(separator)));
        report.FixPage(linesPerPage, 80);
        EXPECT_TRUE(
            report.LoadTemplateXml(QStringLiteral("t.xml"), QStringLiteral("T"), QStringLiteral("Points"), QString()));
        report.SetModifiedFlag(false);
    }

    /// Begins page 1 without a header and goes to a line of it.
    void goToLine(int line)
    {
        report.Write(QStringLiteral("start"), 0);
        report.NewPage(0);
        report.LineFeed(line - 1);
    }
    UDataObject &add(const char *number)
    {
        UDataObject &object = list.Add();
        object.Set(1, UPointNumber(QString::fromUtf8(number)));
        return object;
    }
    /// Writes the table. @return what was written for it
    QString write(int before, int after, int headingAfter)
    {
        const qsizetype size = report.GetText().size();
        EXPECT_TRUE(report.WriteDataTable(&list, before, after, headingAfter));
        return report.GetText().sliced(size).toString();
    }

private:
    FixedSurroundings surroundings_;
    TemplateFolders folders_;

public:
    UReportDoc report;
    UDataObjectList list;
};

/// A report with the block "Site" of a template.
class BlockReport
{
public:
    BlockReport(const std::vector<QByteArray> &fields, const char *separator, int linesPerPage = 72)
    {
        folders_.putIntoLibrary(markup::surveyTemplate(QByteArray(), markup::output("Block", "Site", "Survey", fields),
                                                       markup::separatorOption(separator)));
        report.FixPage(linesPerPage, 80);
        EXPECT_TRUE(
            report.LoadTemplateXml(QStringLiteral("t.xml"), QStringLiteral("T"), QString(), QStringLiteral("Site")));
        report.SetModifiedFlag(false);
    }

    /// Writes the block. @return what was written for it
    QString write(int before, int after)
    {
        const qsizetype size = report.GetText().size();
        EXPECT_TRUE(report.WriteDataBlock(&object, before, after));
        return report.GetText().sliced(size).toString();
    }

private:
    FixedSurroundings surroundings_;
    TemplateFolders folders_;

public:
    UReportDoc report;
    UDataObject object;
};
