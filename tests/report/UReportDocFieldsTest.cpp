#include "ReportFixture.h"

#include "Preferences.h"
#include "ReportMargins.h"
#include "sXmlReportField.h"

#include <gtest/gtest.h>

namespace
{

QString marginsOf(const UReportDoc &report)
{
    return kareport::marginsToText(report.GetMargins());
}

QString storedMargins()
{
    return GetProfileString(QString(), QStringLiteral("Report Margins"));
}

void store(const QString &entry, const QString &value)
{
    WriteProfileString(QString(), entry, value);
}

TEST(UReportDocFields, ANewReportHasTheUsualFields)
{
    const FixedSurroundings surroundings;
    const UReportDoc report;
    EXPECT_EQ(report.GetTemplate(), nullptr);
    EXPECT_EQ(report.GetDataColumnSeparator(), u' ');
    EXPECT_FALSE(report.IsZeroBlank());
    EXPECT_TRUE(report.GetText().isEmpty());
    EXPECT_EQ(report.GetData()[0], u'\0');
    EXPECT_EQ(report.GetLineNumber(), 0);
    EXPECT_EQ(report.GetLineCount(), 0);
    EXPECT_EQ(report.GetPageNumber(), 0);
    EXPECT_EQ(report.GetLinesPerPage(), 72);
    EXPECT_EQ(report.GetCharsPerRow(), 80);
    EXPECT_EQ(report.GetPrintResolution(), 0U);
    EXPECT_EQ(report.GetPageSize(), QSize(0, 0));
    EXPECT_EQ(marginsOf(report), QStringLiteral("1000, 1000, 1200, 2000"));
    EXPECT_EQ(report.GetTitle(), QString());
    EXPECT_EQ(report.GetFontName(), QStringLiteral("Lucida Console"));
    EXPECT_EQ(report.GetFontSize(), 8U);
    EXPECT_FALSE(report.GetHeaderFlag());
    EXPECT_FALSE(report.GetExternalEditorFlag());
    EXPECT_EQ(report.GetReportFileName(), QString());
    EXPECT_EQ(report.GetReportWindow(), nullptr);
    EXPECT_FALSE(report.GetCloseDocumentFlag());
    EXPECT_FALSE(report.HasTextObj());
    EXPECT_EQ(report.GetTextObject(), nullptr);
    EXPECT_TRUE(report.EnableCloseOption());
    EXPECT_FALSE(report.IsOptionExcel());
    EXPECT_FALSE(report.IsExternalExcel());
    EXPECT_FALSE(report.IsModified());
    EXPECT_TRUE(report.GetViews().empty());
}

TEST(UReportDocFields, TheConstructorTakesNameAndFlags)
{
    const FixedSurroundings surroundings;
    const UReportDoc named(QStringLiteral("Survey"), true, true, nullptr);
    EXPECT_EQ(named.GetTitle(), QStringLiteral("Survey"));
    EXPECT_EQ(named.GetReportFileName(), QStringLiteral("Survey"));
    EXPECT_TRUE(named.GetExternalEditorFlag());
    EXPECT_TRUE(named.GetCloseDocumentFlag());
    const UReportDoc editor(QString(), true, false, nullptr);
    EXPECT_EQ(editor.GetTitle(), QString());
    EXPECT_EQ(editor.GetReportFileName(), QString());
    EXPECT_TRUE(editor.GetExternalEditorFlag());
    EXPECT_FALSE(editor.GetCloseDocumentFlag());
    const UReportDoc closes(QString(), false, true, nullptr);
    EXPECT_FALSE(closes.GetExternalEditorFlag());
    EXPECT_TRUE(closes.GetCloseDocumentFlag());
}

TEST(UReportDocFields, AccessorsGiveWhatWasSet)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetFontSize(12);
    report.SetFontName(QStringLiteral("Courier"));
    report.SetReportFileName(QStringLiteral("/x/Survey.rep"));
    report.SetExternalEditorFlag(true);
    report.SetCloseDocumentFlag(true);
    report.EnableCloseOption(false);
    report.SetZeroBlank(true);
    EXPECT_EQ(report.GetFontSize(), 12U);
    EXPECT_EQ(report.GetFontName(), QStringLiteral("Courier"));
    EXPECT_EQ(report.GetReportFileName(), QStringLiteral("/x/Survey.rep"));
    EXPECT_TRUE(report.GetExternalEditorFlag());
    EXPECT_TRUE(report.GetCloseDocumentFlag());
    EXPECT_FALSE(report.EnableCloseOption());
    EXPECT_TRUE(report.IsZeroBlank());
    report.GetTitle() = QStringLiteral("by reference");
    EXPECT_EQ(report.GetTitle(), QStringLiteral("by reference"));
    EXPECT_EQ(report.GetLinesPerPage(), 72) << "font and margins do not measure again";
}

TEST(UReportDocFields, TheExcelOptionsAreTwo)
{
    const FixedSurroundings surroundings;
    UReportDoc first;
    first.SetOptionExcel();
    EXPECT_TRUE(first.IsOptionExcel());
    EXPECT_FALSE(first.IsExternalExcel());
    UReportDoc second;
    second.SetExternalExcel();
    EXPECT_FALSE(second.IsOptionExcel());
    EXPECT_TRUE(second.IsExternalExcel());
    second.SetOptionExcel();
    EXPECT_TRUE(second.IsOptionExcel());
    EXPECT_TRUE(second.IsExternalExcel());
}

TEST(UReportDocFields, ATextObjectIsKnownByItsSize)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    int object = 0;
    report.SetTextObject(&object, 0);
    EXPECT_FALSE(report.HasTextObj()) << "an object of size 0";
    EXPECT_EQ(report.GetTextObject(), &object);
    report.SetTextObject(nullptr, 1);
    EXPECT_TRUE(report.HasTextObj()) << "the size alone decides";
    report.SetTextObject(&object, 0xFFFFFFFFU);
    EXPECT_TRUE(report.HasTextObj());
    report.SetTextObject(nullptr, 0);
    EXPECT_FALSE(report.HasTextObj());
}

TEST(UReportDocFields, TheExcelFormatHasTabsAndNoHeader)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetHeaderFlag(true);
    report.SetDataColumnSeparator(u'|', false);
    report.SetExcelFormat();
    EXPECT_FALSE(report.GetHeaderFlag());
    EXPECT_EQ(report.GetDataColumnSeparator(), u'\t');
    EXPECT_FALSE(report.IsOptionExcel()) << "the format is not the export option";
}

TEST(UReportDocFields, ARawSeparatorIsTheCharacter255WhateverIsPassed)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    for (const char16_t separator : {u'\0', u'\t', u'|', u'\xFF', u'\u6E2C', u'\xFFFF'}) {
        report.SetDataColumnSeparator(separator, false);
        EXPECT_EQ(report.GetDataColumnSeparator(), separator);
        report.SetDataColumnSeparator(separator, true);
        EXPECT_EQ(report.GetDataColumnSeparator(), u'\xFF');
    }
}

TEST(UReportDocFields, ADocIdIsAlwaysEmptyAndNeverMatches)
{
    const FixedSurroundings surroundings;
    const UReportDoc report(QStringLiteral("Survey"), false, false, nullptr);
    EXPECT_EQ(report.GetDocId(), QString());
    for (const QString &id : {QString(), QStringLiteral(""), QStringLiteral("Survey"), report.GetDocId()}) {
        EXPECT_FALSE(report.IsThatDocId(id)) << testing::PrintToString(id);
    }
}

TEST(UReportDocFields, MarginsAndFontSizeComeFromThePreferences)
{
    const FixedSurroundings surroundings;
    struct Row
    {
        QString stored;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("1, 2, 3, 4"), QStringLiteral("1, 2, 3, 4"), "all four"},
        {QStringLiteral("100, 200"), QStringLiteral("100, 200, 1200, 2000"), "two numbers set left and top only"},
        {QStringLiteral("letters"), QStringLiteral("0, 1000, 1200, 2000"), "letters only set the left margin to 0"},
        {QStringLiteral(" "), QStringLiteral("1000, 1000, 1200, 2000"), "no number at all"},
    };
    for (const Row &row : rows) {
        store(QStringLiteral("Report Margins"), row.stored);
        const UReportDoc report;
        EXPECT_EQ(marginsOf(report), row.expected) << row.reason;
        EXPECT_EQ(storedMargins(), row.stored) << row.reason << ": loading stores nothing";
    }
    SetReportFontSize(11);
    EXPECT_EQ(UReportDoc().GetFontSize(), 11U);
}

TEST(UReportDocFields, MarginsThatWereNeverStoredAreStoredWhenLoaded)
{
    const FixedSurroundings surroundings;
    EXPECT_EQ(storedMargins(), QString());
    UReportDoc report;
    EXPECT_EQ(storedMargins(), QStringLiteral("1000, 1000, 1200, 2000"));

    store(QStringLiteral("Report Margins"), QString());
    report.SetMargins(QMargins(1, 2, 3, 4));
    EXPECT_EQ(storedMargins(), QString()) << "setting margins stores nothing";
    report.LoadSettings();
    EXPECT_EQ(marginsOf(report), QStringLiteral("1, 2, 3, 4"));
    EXPECT_EQ(storedMargins(), QStringLiteral("1, 2, 3, 4")) << "the margins of now";
}

TEST(UReportDocFields, SavingSettingsStoresTheMarginsOnly)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetMargins(QMargins(-1, 20, 300, 4000));
    report.SetFontSize(20);
    report.SaveSettings();
    EXPECT_EQ(storedMargins(), QStringLiteral("-1, 20, 300, 4000"));
    const UReportDoc next;
    EXPECT_EQ(marginsOf(next), QStringLiteral("-1, 20, 300, 4000"));
    EXPECT_EQ(next.GetFontSize(), 8U);
    report.LoadSettings();
    EXPECT_EQ(report.GetFontSize(), 8U) << "loading takes the preference again";
}

TEST(UReportDocFields, EveryNewReportReadsThePrintHashEntry)
{
    const FixedSurroundings surroundings;
    sXmlReportField field;
    field.Width = 3;
    field.Align = QStringLiteral("L");
    field.Type = 2;
    const QString wide = QStringLiteral("wide");
    const UReportDoc earlier;
    struct Row
    {
        QString entry;
        bool hash;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("1"), true, "on"},
        {QString(), true, "an empty entry leaves it as it was"},
        {QStringLiteral("  \t "), true, "blanks are an empty entry"},
        {QStringLiteral("0"), false, "off"},
        {QString(), false, "an empty entry leaves it as it was"},
        {QStringLiteral("  -7 "), true, "any number but 0, trimmed"},
        {QStringLiteral("yes"), false, "a text without a number is 0"},
        {QStringLiteral("2x"), true, "a number with something after it"},
        {QStringLiteral("00"), false, "0 in two digits"},
    };
    for (const Row &row : rows) {
        store(QStringLiteral("ReportPrintHash"), row.entry);
        const UReportDoc report;
        const QString expected = row.hash ? QStringLiteral("###") : wide;
        EXPECT_EQ(report.FormatXmlStringToDisplay(&field, 16, &wide, QString()), expected) << row.reason;
        EXPECT_EQ(earlier.FormatXmlStringToDisplay(&field, 16, &wide, QString()), expected)
            << row.reason << ": it holds for all reports";
    }
}

} // namespace
