#include "DataReport.h"

#include <QCoreApplication>
#include <QTranslator>

#include <gtest/gtest.h>

namespace
{

QString headerLine(const QString &title, int charsPerRow)
{
    const QString front = QStringLiteral("TALVEN - ") + title;
    return front + u' ' + QStringLiteral("Mar 05, 2024  02:07PM").rightJustified(charsPerRow - front.size() - 20) +
           QStringLiteral("    Page:  1");
}

QString firstLine(const UReportDoc &report)
{
    return textOf(report).section(QStringLiteral("\r\n"), 0, 0);
}

TEST(UReportDocHeader, OnlyMakingAReportItsTitleAndSetHeaderBuildTheLine)
{
    const FixedSurroundings surroundings;
    const ReportApplication application;
    UReportDoc *unnamed = CreateReport(QString(), true, false, nullptr, 0, nullptr);
    ASSERT_NE(unnamed, nullptr);
    const int measured = unnamed->GetCharsPerRow();
    ASSERT_NE(measured, 80) << "A4 at 600 dots an inch takes more";
    unnamed->NewPage(0);
    EXPECT_EQ(firstLine(*unnamed), headerLine(QString(), 80)) << "built before the page was measured";

    UReportDoc *named = CreateReport(QStringLiteral("Named"), true, false, nullptr, 0, nullptr);
    ASSERT_NE(named, nullptr);
    named->NewPage(0);
    EXPECT_EQ(firstLine(*named), headerLine(QStringLiteral("Named"), measured)) << "its title came after that";

    unnamed->Clear();
    unnamed->FixPage(72, 90);
    unnamed->SetPageSize();
    unnamed->SetHeaderFlag(true);
    unnamed->NewPage(0);
    EXPECT_EQ(firstLine(*unnamed), headerLine(QString(), 80)) << "measuring again does not build it";
    unnamed->Clear();
    unnamed->SetHeader();
    unnamed->NewPage(0);
    EXPECT_EQ(firstLine(*unnamed), headerLine(QString(), 90));
}

TEST(UReportDocHeader, WhatWritesSetsTheModifiedFlag)
{
    struct Row
    {
        void (*act)(UReportDoc &);
        bool expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {[](UReportDoc &report) { report.Write(QStringLiteral("x"), 0); }, true, "a text"},
        {[](UReportDoc &report) { report.LineFeed(1); }, true, "a line end"},
        {[](UReportDoc &report) { report.NewPage(-1); }, true, "a page break"},
        {[](UReportDoc &report) { report.WriteLine(QString(), 0, 0, 0); }, true, "an empty open line"},
        {[](UReportDoc &report) { report.WriteHeader(); }, true, "a page header"},
        {[](UReportDoc &report) { report.LineFeed(0); }, false, "no line end"},
        {[](UReportDoc &report) { report.LineFeed(-1); }, false, "less than no line end"},
        {[](UReportDoc &report) { report.NewPage(0); }, false, "a page that has room"},
        {[](UReportDoc &report) { report.SetTitle(QStringLiteral("N")); }, false, "the title"},
        {[](UReportDoc &report) { report.SetHeader(); }, false, "the header line is not written yet"},
        {[](UReportDoc &report) { report.SetHeading(QStringLiteral("h"), 1, 1); }, false, "nor is the heading"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        UReportDoc report;
        report.WriteLine(QStringLiteral("start"), 0, 1, 0);
        ASSERT_TRUE(report.IsModified());
        report.SetModifiedFlag(false);
        row.act(report);
        EXPECT_EQ(report.IsModified(), row.expected) << row.reason;
    }
}

/// Knows the two texts that a report shows by itself.
class Translator : public QTranslator
{
public:
    Translator() { QCoreApplication::installTranslator(this); }
    ~Translator() override { QCoreApplication::removeTranslator(this); }

    QString translate(const char *, const char *text, const char *note, int) const override
    {
        if (qstrcmp(text, "Station") == 0) {
            return QStringLiteral(u"\u6E2C\u7AD9");
        }
        if (qstrcmp(text, "   Page:") == 0 && qstrcmp(note, "Report Header") == 0) {
            return QStringLiteral("  Seite:");
        }
        return {};
    }
    bool isEmpty() const override { return false; }
};

TEST(UReportDocHeader, ItsTextsAreThoseOfTheUsersLanguage)
{
    const Translator translator;
    TableReport t({markup::field("Chainage", "Station", "10"), markup::field("Number", "Pt", "3")}, "124");
    t.report.SetHeaderFlag(true);
    QString header = headerOf(QStringLiteral("Title"), 1);
    header.replace(QStringLiteral("   Page:"), QStringLiteral("  Seite:"));
    EXPECT_EQ(t.write(0, 0, 1),
              reportLines(header + QStringLiteral("\n\n\n\n") + QStringLiteral(u"\u6E2C\u7AD9   |Pt \n")));
}

} // namespace
