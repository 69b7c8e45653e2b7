#pragma once

#include "ReportFixture.h"
#include "TemplateMarkup.h"
#include "UDataObjectList.h"
#include "UPointNumber.h"

#include <gtest/gtest.h>

#include <vector>

/// A report with the table "Points" of a template, on pages of so many lines.
class TableReport
{
public:
    TableReport(const std::vector<QByteArray> &fields, const char *separator, int linesPerPage = 72,
                std::initializer_list<const char *> sortKeys = {});

    /// Begins page 1 without a header and goes to a line of it.
    void goToLine(int line);
    UDataObject &add(const char *number);
    /// Writes the table. @return what was written for it
    QString write(int before, int after, int headingAfter);

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
    BlockReport(const std::vector<QByteArray> &fields, const char *separator, int linesPerPage = 72);

    /// Writes the block. @return what was written for it
    QString write(int before, int after);

private:
    FixedSurroundings surroundings_;
    TemplateFolders folders_;

public:
    UReportDoc report;
    UDataObject object;
};
