#include "ReportFixture.h"

#include "LimitedDevice.h"

#include <QBuffer>

#include <gtest/gtest.h>

namespace
{

std::string richTextFileOf(const UReportDoc &report)
{
    QBuffer file;
    file.open(QIODevice::WriteOnly);
    EXPECT_TRUE(report.WriteRichTextFile(file));
    return file.data().toStdString();
}

TEST(UReportDocRichTextFile, HoldsTheDocumentWithOneByteACharacter)
{
    struct Row
    {
        QString text;
        std::string expected;
        std::string inSpreadsheet;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("ABC"), "ABC", "ABC", "plain letters"},
        {QStringLiteral(u"12\xB0 \xFF"), "12\xB0 \xFF", "12\xB0 \xFF", "up to U+00FF a byte each"},
        {QStringLiteral(u"\u0100\u6E2C"), "\\u256?\\u28204?", "??", "beyond it rich text has a number for it"},
        {QStringLiteral(u"\uFFFD"), "\\u-3?", "?", "a signed one"},
        {QStringLiteral(u"\xD83D\xDE00."), "\\u-10179?\\u-8704?.", "?.", "and one for each half of a pair"},
        {QStringLiteral(u"\xD83D"), "\\u-10179?", "?", "half a pair"},
        {QStringLiteral("a\nb"), "a\r\nb", "a\r\nb", "LF becomes CR LF"},
        {QStringLiteral("a\r\nb\r"), "a\r\r\nb\r", "a\r\r\nb\r", "a CR stays as it is"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        UReportDoc report;
        report.SetFontSize(9);
        report.SetRTFDataFlag(true);
        report.Write(row.text, 0);
        EXPECT_EQ(richTextFileOf(report),
                  "{\\rtf1\\ansi\\ansicpg1252\\deff0\\deflang1033{\\fonttbl{\\f9\\fnil\\fcharset0 Lucida Console;}}"
                  "\\viewkind4\\uc1\\pard\\f1\\fs18 " +
                      row.expected + " }")
            << row.reason << ": without a byte-order mark";

        UReportDoc spreadsheet;
        spreadsheet.SetExternalExcel();
        spreadsheet.SetRTFDataFlag(true);
        spreadsheet.Write(row.text, 0);
        spreadsheet.LineFeed(1);
        EXPECT_EQ(richTextFileOf(spreadsheet), row.inSpreadsheet) << row.reason << ": no markup for a spreadsheet";
    }
}

TEST(UReportDocRichTextFile, TheFontTableGoesOutByItself)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetFontName(QStringLiteral(u"\u00C4 \u6E2C"));
    report.SetFontSize(11);
    QBuffer file;
    file.open(QIODevice::WriteOnly);
    file.write("before ");
    EXPECT_TRUE(report.WriteFontTable(file));
    EXPECT_EQ(file.data().toStdString(), "before {\\fonttbl{\\f11\\fnil\\fcharset0 \xC4 \\u28204?;}}")
        << "where the file is";
}

TEST(UReportDocRichTextFile, AFailedWriteIsNoticed)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetRTFDataFlag(true);
    report.Write(QString(200000, u'x'), 0);
    for (const int room : {-1, 0, 10, 60000}) {
        LimitedDevice full;
        full.limit = room;
        EXPECT_FALSE(report.WriteRichTextFile(full)) << room;
    }
    LimitedDevice none;
    none.limit = 0;
    EXPECT_FALSE(report.WriteFontTable(none));
    LimitedDevice enough;
    enough.limit = 1000000;
    EXPECT_TRUE(report.WriteRichTextFile(enough));
    EXPECT_GT(enough.taken.size(), 200000);
}

} // namespace
