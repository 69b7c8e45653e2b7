#include "ReportSurroundings.h"

#include "Preferences.h"
#include "ReportFixture.h"
#include "UXmlReportTpl.h"
#include "VariableType.h"

#include <gtest/gtest.h>

namespace
{

using kareport::PaperSize;
using kareport::PrinterSource;
using kareport::ReportSurroundings;

/// Surroundings that differ from those of the fixture in everything.
ReportSurroundings others()
{
    ReportSurroundings others;
    others.application = QStringLiteral("TALVEN Other");
    others.time = QDateTime(QDate(1999, 12, 31), QTime(23, 59));
    others.printer = {PrinterSource::BuiltIn, PaperSize::A3, 300};
    others.isPortrait = false;
    others.margins = {1, 2, 3, 4};
    others.fontSize = 13;
    others.printHash = true;
    return others;
}

/// The first line of a page that is begun now.
QString headerLine(UReportDoc &report)
{
    report.Clear();
    report.SetHeaderFlag(true);
    report.SetHeader();
    report.NewPage(0);
    return textOf(report).section(QStringLiteral("\r\n"), 0, 0);
}

/// What a column of two characters shows of a text of four.
QString narrowValue(const UReportDoc &report)
{
    sXmlReportField field;
    field.Width = 2;
    field.Type = VARIABLE_TEXT;
    const QString value = QStringLiteral("abcd");
    return report.FormatXmlStringToDisplay(&field, 16, &value, QString());
}

const QString printHashEntry = QStringLiteral("ReportPrintHash");
const QString marginsEntry = QStringLiteral("Report Margins");

TEST(UReportDocSurroundings, WhatIsGivenHoldsInThePlaceOfTheProgramsOwn)
{
    const FixedSurroundings surroundings;
    UReportDoc report(others());
    EXPECT_EQ(report.GetMargins(), QMargins(1, 2, 3, 4));
    EXPECT_EQ(report.GetFontSize(), 13U);
    EXPECT_EQ(report.SetPageSize(), 1);
    EXPECT_EQ(report.GetPageSize(), QSize(4961, 3508)) << "A3 on its side with 300 dots per inch";
    EXPECT_EQ(report.GetPrintResolution(), 300U);
    EXPECT_TRUE(headerLine(report).startsWith(QStringLiteral("TALVEN Other - "))) << headerLine(report).toStdString();
    EXPECT_TRUE(headerLine(report).contains(QStringLiteral("Dec 31, 1999  11:59PM")));
    EXPECT_EQ(narrowValue(report), QStringLiteral("##"));
}

TEST(UReportDocSurroundings, WithoutAnyThoseOfTheProgramHoldAgain)
{
    const FixedSurroundings surroundings;
    WriteProfileString(QString(), printHashEntry, QStringLiteral("0"));
    UReportDoc report;
    report.SetSurroundings(others());
    report.SetPageSize();
    report.SetSurroundings(std::nullopt);
    EXPECT_EQ(report.GetMargins(), QMargins(1, 2, 3, 4)) << "what it has measured with stays";
    EXPECT_EQ(report.GetFontSize(), 13U);
    EXPECT_EQ(report.GetPrintResolution(), 300U) << "nothing is measured by it";
    EXPECT_TRUE(headerLine(report).startsWith(QStringLiteral("TALVEN - "))) << headerLine(report).toStdString();
    EXPECT_TRUE(headerLine(report).contains(QStringLiteral("Mar 05, 2024  02:07PM")));
    EXPECT_EQ(narrowValue(report), QStringLiteral("abcd"));
    EXPECT_EQ(report.SetPageSize(), 1);
    EXPECT_EQ(report.GetPageSize(), QSize(4961, 7016)) << "A4 upright with 600 dots per inch";
}

TEST(UReportDocSurroundings, AReportThatIsMadeWithThemAsksForNothing)
{
    const FixedSurroundings surroundings;
    WriteProfileString(QString(), printHashEntry, QStringLiteral("1"));
    WriteProfileString(QString(), marginsEntry, QStringLiteral("5, 6, 7, 8"));
    SetReportFontSize(20);
    const UReportDoc report{ReportSurroundings()};
    EXPECT_EQ(report.GetMargins(), QMargins(1000, 1000, 1200, 2000));
    EXPECT_EQ(report.GetFontSize(), 8U);
    EXPECT_EQ(narrowValue(report), QStringLiteral("abcd"));

    WriteProfileString(QString(), marginsEntry, QString());
    const UReportDoc another{ReportSurroundings()};
    EXPECT_EQ(GetProfileString(QString(), marginsEntry), QString()) << "nothing is written into the preferences";
    EXPECT_TRUE(UReportDoc::IsReportAvailable(&another));
}

TEST(UReportDocSurroundings, ASettingForWideValuesIsThatOfTheReportAlone)
{
    const FixedSurroundings surroundings;
    const UReportDoc given(others());
    const UReportDoc usual;
    EXPECT_EQ(narrowValue(given), QStringLiteral("##"));
    EXPECT_EQ(narrowValue(usual), QStringLiteral("abcd"));
}

} // namespace
