#include "FrameFixture.h"
#include "ReportFixture.h"

#include "ReportContent.h"

#include <QFontMetricsF>
#include <QTemporaryDir>
#include <QTextBlock>
#include <QTextDocument>

#include <gtest/gtest.h>

namespace
{

using kareport::reportFont;
using kareport::showReportContent;

QFont firstFont(const QTextDocument &document)
{
    const QTextBlock block = document.firstBlock();
    return block.begin().atEnd() ? document.defaultFont() : block.begin().fragment().charFormat().font();
}

TEST(ReportContent, TheFontIsOfFixedPitchAlsoWhereTheFaceIsMissing)
{
    const QFont font = reportFont(QStringLiteral("Lucida Console"), 8);
    EXPECT_EQ(font.families().value(0), QStringLiteral("Lucida Console")) << "the one that is asked for comes first";
    EXPECT_GT(font.families().size(), 1);
    EXPECT_EQ(font.pointSize(), 8);
    EXPECT_TRUE(font.fixedPitch());
    const QFontMetricsF metrics(reportFont(QStringLiteral("No Such Face"), 9));
    EXPECT_EQ(metrics.horizontalAdvance(u'i'), metrics.horizontalAdvance(u'W'));
    EXPECT_GT(reportFont(QStringLiteral("Lucida Console"), 0).pointSize(), 0) << "a size of 0 is ignored";
}

TEST(ReportContent, AFacesNameIsOf31CharactersAtMost)
{
    struct Row
    {
        qsizetype given;
        qsizetype taken;
        const char *reason;
    };
    constexpr Row rows[] = {
        {30, 30, "shorter"},
        {31, 31, "the longest"},
        {32, 31, "the first 31 of one more"},
        {300, 31, "and of many more"},
    };
    const FixedSurroundings surroundings;
    QTextDocument document;
    for (const Row &row : rows) {
        const QString name = QString(row.given, u'x');
        UReportDoc report;
        report.SetFontName(name);
        report.SetData(QStringLiteral("x"));
        showReportContent(report, document);
        EXPECT_EQ(document.defaultFont().families().value(0), name.left(row.taken)) << row.reason;
        EXPECT_EQ(report.GetFontName(), name) << "the document keeps what was given: " << row.reason;
    }
}

TEST(ReportContent, WhatBeginsAsRichTextIsShownAsSuch)
{
    struct Row
    {
        QString text;
        QString shown;
        const char *reason;
    };
    const Row rows[] = {
        {QString(), QString(), "empty"},
        {QStringLiteral("A\r\nB\r\n"), QStringLiteral("A\nB\n"), "plain text, a line a paragraph"},
        {QStringLiteral("a{b}\\c"), QStringLiteral("a{b}\\c"), "plain text with markup characters"},
        {QStringLiteral("<b>a</b> &amp;"), QStringLiteral("<b>a</b> &amp;"), "plain text, whatever else it looks like"},
        {QStringLiteral(u"\u6E2C \xD83D\xDE00"), QStringLiteral(u"\u6E2C \xD83D\xDE00"),
         "plain text of any characters"},
        {QStringLiteral("{\\rtf1 a\\par b}"), QStringLiteral("a\nb"), "rich text"},
        {QStringLiteral("{\\rtf1 a\r\n\r\nb}"), QStringLiteral("ab"), "rich text in lines"},
        {QStringLiteral(u"{\\rtf1 \u6E2C\xE9}"), QStringLiteral(u"\u6E2C\xE9"),
         "rich text with characters as they are"},
        {QStringLiteral("x{\\rtf1 a}"), QStringLiteral("x{\\rtf1 a}"), "rich text later on is plain text"},
        {QStringLiteral("{\\RTF1 a}"), QStringLiteral("{\\RTF1 a}"), "in small letters only"},
        {QStringLiteral("{\\rt"), QStringLiteral("{\\rt"), "cut off"},
    };
    const FixedSurroundings surroundings;
    QTextDocument document;
    for (const Row &row : rows) {
        UReportDoc report;
        report.SetData(row.text);
        EXPECT_EQ(showReportContent(report, document), std::nullopt) << row.reason;
        EXPECT_EQ(document.toPlainText(), row.shown) << row.reason << ": in place of what was there";
        EXPECT_EQ(textOf(report), row.text) << row.reason;
    }
}

TEST(ReportContent, AnOpenedRichTextIsReadWithItsCodePage)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.rtf"));
    putFile(path, "{\\rtf1\\ansi\\ansicpg1251 \xCF\xF0\xE8\r\n}");
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetAutoDelete(false);
    ASSERT_TRUE(report.OnOpenDocument(path));
    QTextDocument document;
    EXPECT_FALSE(showReportContent(report, document));
    EXPECT_TRUE(document.toPlainText().startsWith(QStringLiteral("При"))) << document.toPlainText().toStdString();
    QTextDocument viewed;
    EXPECT_FALSE(kareport::readShownRichText(report, kareport::shownText(report).value(), viewed));
    EXPECT_EQ(viewed.toPlainText(), document.toPlainText()) << "a view reads it in the same way";

    // The image of what is written afterwards is text of its own: a character beyond one byte is not one of a file.
    report.SetRTFDataFlag(true);
    report.Write(QStringLiteral("r = \u221E"), 0);
    viewed.clear();
    EXPECT_FALSE(kareport::readShownRichText(report, kareport::shownText(report).value(), viewed));
    EXPECT_TRUE(viewed.toPlainText().contains(u'\u221E')) << viewed.toPlainText().toStdString();
}

TEST(ReportContent, InRichTextModeTheImageIsShown)
{
    const FixedSurroundings surroundings;
    QTextDocument document;
    UReportDoc report;
    report.SetRTFDataFlag(true);
    report.Write(QStringLiteral("bold"), 1);
    report.LineFeed(1);
    report.Write(QStringLiteral("plain"), 0);
    report.SetData(QStringLiteral("edited"));
    EXPECT_EQ(showReportContent(report, document), std::nullopt);
    EXPECT_EQ(document.toPlainText().trimmed(), QStringLiteral("bold\nplain"));
    EXPECT_TRUE(firstFont(document).bold());
    report.SetRTFDataFlag(false);
    EXPECT_EQ(showReportContent(report, document), std::nullopt);
    EXPECT_EQ(document.toPlainText(), QStringLiteral("edited")) << "else the text";
    EXPECT_FALSE(firstFont(document).bold()) << "without the format of what was shown before";

    UReportDoc spreadsheet;
    spreadsheet.SetExternalExcel();
    spreadsheet.SetRTFDataFlag(true);
    spreadsheet.Write(QStringLiteral("A\tB\n{C}"), 1);
    EXPECT_EQ(showReportContent(spreadsheet, document), std::nullopt);
    EXPECT_EQ(document.toPlainText(), QStringLiteral("A\tB\n{C}")) << "bare text for a spreadsheet is not rich text";
}

TEST(ReportContent, PlainTextHasTheReportsFont)
{
    const FixedSurroundings surroundings;
    QTextDocument document;
    UReportDoc report;
    report.SetFontName(QStringLiteral("Liberation Mono"));
    report.SetFontSize(13);
    for (const QString &text : {QString(), QStringLiteral("x")}) {
        report.SetData(text);
        showReportContent(report, document);
        EXPECT_EQ(document.defaultFont(), reportFont(QStringLiteral("Liberation Mono"), 13));
        EXPECT_EQ(firstFont(document).pointSize(), 13);
    }
}

TEST(ReportContent, BrokenRichTextIsShownAsFarAsItGoes)
{
    const FixedSurroundings surroundings;
    QTextDocument document;
    UReportDoc report;
    report.SetData(QStringLiteral("{\\rtf1 a\\par\nb"));
    const auto error = showReportContent(report, document);
    ASSERT_TRUE(error.has_value());
    EXPECT_FALSE(error->text.isEmpty());
    EXPECT_EQ(error->place.line, 2);
    EXPECT_EQ(document.toPlainText(), QStringLiteral("a\nb"));
    report.SetData(QStringLiteral("{\\rtf1 a}"));
    EXPECT_EQ(showReportContent(report, document), std::nullopt) << "and the next one is whole again";
}

TEST(ReportContent, WhatIsNotShownIsTold)
{
    const FixedSurroundings surroundings;
    QTextDocument document;
    UReportDoc report;
    report.SetData(QStringLiteral("{\\rtf1 a{\\pict 00}{\\footnote n}b}"));
    kareport::RichTextNotes notes;
    EXPECT_EQ(showReportContent(report, document, &notes), std::nullopt);
    EXPECT_EQ(document.toPlainText(), QStringLiteral("ab"));
    EXPECT_EQ(notes.pictures, 1);
    EXPECT_EQ(notes.footnotes, 1);
    EXPECT_EQ(notes.objects, 0);
    EXPECT_EQ(notes.headers, 0);
}

} // namespace
