#include "ReportFixture.h"

#include <gtest/gtest.h>

#include <limits>

namespace
{

const QString head =
    QStringLiteral("{\\rtf1\\ansi\\ansicpg1252\\deff0\\deflang1033{\\fonttbl{\\f9\\fnil\\fcharset0 Lucida Console;}}");

/// A report of 9 points in rich-text mode.
class RichReport : public UReportDoc
{
public:
    RichReport()
    {
        SetFontSize(9);
        SetRTFDataFlag(true);
    }
};

QString documentOf(const UReportDoc &report)
{
    QString document = QStringLiteral("what was there before");
    report.GetRTFData(document);
    return document;
}

/// The fragments of a document that begins with the head above.
QString bodyOf(const UReportDoc &report)
{
    const QString document = documentOf(report);
    return document.startsWith(head) && document.endsWith(u'}')
               ? document.sliced(head.size(), document.size() - head.size() - 1)
               : QStringLiteral("(another head) ") + document;
}

QString plain(const QString &text)
{
    return QStringLiteral("\\viewkind4\\uc1\\pard\\f1\\fs18 ") + text + u' ';
}

TEST(UReportDocRichText, ADocumentIsMadeOfWhatWasWritten)
{
    const FixedSurroundings surroundings;
    RichReport report;
    report.Write(QStringLiteral("ABC"), 0);
    report.LineFeed(1);
    report.Write(QStringLiteral("X"), 1);
    report.LineFeed(1);
    EXPECT_EQ(documentOf(report),
              QStringLiteral("{\\rtf1\\ansi\\ansicpg1252\\deff0\\deflang1033{\\fonttbl{\\f9\\fnil\\fcharset0 Lucida "
                             "Console;}}\\viewkind4\\uc1\\pard\\f1\\fs18 ABC "
                             "\\par\\viewkind4\\uc1\\pard\\b\\f1\\fs18 X\\b0 \\par}"));
    EXPECT_EQ(textOf(report), QStringLiteral("ABC\r\nX\r\n")) << "beside the plain text";
}

TEST(UReportDocRichText, WithoutRichTextModeNothingIsKept)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetFontSize(9);
    EXPECT_FALSE(report.GetRTFDataFlag()) << "off at first";
    report.Write(QStringLiteral("ABC"), 0);
    report.LineFeed(2);
    report.WriteLine(QStringLiteral("line"), 0, 1, 1);
    report.WriteRTFData(QStringLiteral("x"), 0);
    report.WriteRTFData(QString(), 0);
    EXPECT_EQ(documentOf(report), head + u'}');
    report.SetRTFDataFlag(true);
    EXPECT_TRUE(report.GetRTFDataFlag());
    EXPECT_EQ(documentOf(report), head + u'}') << "what was written before is not made up for";
}

TEST(UReportDocRichText, TheStyleChoosesTheParagraph)
{
    struct Row
    {
        QString text;
        int style;
        QString expected;
        const char *reason;
    };
    constexpr int most = std::numeric_limits<int>::max();
    const Row rows[] = {
        {QStringLiteral("x"), 0, QStringLiteral("\\viewkind4\\uc1\\pard\\f1\\fs18 x "), "plain"},
        {QStringLiteral("x"), 1, QStringLiteral("\\viewkind4\\uc1\\pard\\b\\f1\\fs18 x\\b0 "), "bold"},
        {QStringLiteral("x"), 2, QStringLiteral("\\viewkind4\\uc1\\pard\\ul\\f1\\fs18 x\\ulnone "), "underlined"},
        {QStringLiteral("x"), 3, QStringLiteral("\\viewkind4\\uc1\\pard\\ul\\b\\f1\\fs18 x\\ulnone\\b0 "), "both"},
        {QStringLiteral("x"), 4, QString(), "one style too far"},
        {QStringLiteral("x"), -1, QString(), "one style too few"},
        {QStringLiteral("x"), most, QString(), "far too far"},
        {QStringLiteral("x"), -most - 1, QString(), "far too few"},
        {QStringLiteral("a{b}\\c"), 0, plain(QStringLiteral("a{b}\\c")), "markup characters go in as they are"},
        {QStringLiteral("<<RTF Data>>"), 0, plain(QStringLiteral("<<RTF Data>>")), "the text is not looked at again"},
        {QStringLiteral("a\r\nb"), 0, plain(QStringLiteral("a\r\nb")), "a line end inside a text is text"},
        {QStringLiteral(u"12\xB0 \u6E2C \xD83D\xDE00"), 0, plain(QStringLiteral(u"12\xB0 \u6E2C \xD83D\xDE00")),
         "no escapes are made"},
        {QString(u'\0'), 0, plain(QString(u'\0')), "a character 0 is text"},
        {QStringLiteral(" "), 0, plain(QStringLiteral(" ")), "a blank is text"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        RichReport written;
        EXPECT_TRUE(written.Write(row.text, row.style)) << row.reason;
        EXPECT_EQ(bodyOf(written), row.expected) << row.reason;
        EXPECT_EQ(textOf(written), row.text) << row.reason << ": the plain text has it in any case";

        RichReport given;
        given.WriteRTFData(row.text, row.style);
        EXPECT_EQ(bodyOf(given), row.expected) << row.reason;
        EXPECT_EQ(textOf(given), QString()) << row.reason << ": a piece given by itself is not report text";
    }
}

TEST(UReportDocRichText, LineFeedsBecomeParagraphMarksAndEmptyTextsNothing)
{
    struct Row
    {
        int count;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {3, QStringLiteral("\\par\\par\\par"), "one for each"},
        {1, QStringLiteral("\\par"), "one"},
        {0, QString(), "none"},
        {-1, QString(), "fewer than none"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        RichReport report;
        report.Write(QString(), 0);
        report.Write(QStringLiteral(""), 3);
        report.LineFeed(row.count);
        EXPECT_EQ(bodyOf(report), row.expected) << row.reason;
    }
    const FixedSurroundings surroundings;
    RichReport report;
    report.WriteRTFData(QString(), 7);
    EXPECT_EQ(bodyOf(report), QStringLiteral("\\par")) << "an empty piece is a line end in every style";
}

TEST(UReportDocRichText, PagesAndHeadersAreInTheImageAsInTheText)
{
    const FixedSurroundings surroundings;
    RichReport report;
    report.SetTitle(QStringLiteral("N"));
    report.SetHeaderFlag(true);
    report.SetHeading(QStringLiteral("heading"), 1, 1);
    for (int line = 0; line < 100; ++line) {
        report.WriteLine(QStringLiteral("x"), 0, 1, 0);
    }
    ASSERT_EQ(report.GetPageNumber(), 2);
    const QString body = bodyOf(report);
    EXPECT_EQ(body.count(QStringLiteral("\\par")) - body.count(QStringLiteral("\\pard")),
              textOf(report).count(QStringLiteral("\r\n")))
        << "a paragraph mark for each line end";
    EXPECT_TRUE(body.startsWith(plain(headerOf(QStringLiteral("N"), 1)) + QStringLiteral("\\par")));
    EXPECT_TRUE(body.contains(plain(headerOf(QStringLiteral("N"), 2))));
    EXPECT_EQ(body.count(plain(QStringLiteral("heading"))), 2);
    EXPECT_EQ(body.count(plain(QStringLiteral("x"))), 100);
}

TEST(UReportDocRichText, SwitchingKeepsWhatWasWrittenAndClearForgetsIt)
{
    const FixedSurroundings surroundings;
    RichReport report;
    report.Write(QStringLiteral("a"), 0);
    report.SetRTFDataFlag(true);
    EXPECT_EQ(bodyOf(report), plain(QStringLiteral("a"))) << "switched on once more";
    report.SetRTFDataFlag(false);
    report.Write(QStringLiteral("b"), 0);
    report.LineFeed(1);
    EXPECT_EQ(bodyOf(report), plain(QStringLiteral("a"))) << "off: what was there stays, nothing comes";
    report.SetRTFDataFlag(true);
    report.Write(QStringLiteral("c"), 0);
    EXPECT_EQ(bodyOf(report), plain(QStringLiteral("a")) + plain(QStringLiteral("c")));
    report.SetData(QStringLiteral("edited"));
    EXPECT_EQ(bodyOf(report), plain(QStringLiteral("a")) + plain(QStringLiteral("c")))
        << "the image is of what was written, not of what the text was replaced by";
    report.Clear();
    EXPECT_EQ(documentOf(report), head + u'}');
    EXPECT_TRUE(report.GetRTFDataFlag()) << "the mode stays";
    report.Write(QStringLiteral("d"), 1);
    EXPECT_EQ(bodyOf(report), QStringLiteral("\\viewkind4\\uc1\\pard\\b\\f1\\fs18 d\\b0 ")) << "and its paragraphs";
}

TEST(UReportDocRichText, TheFontTableNamesTheFontThatTheFragmentsDoNotChoose)
{
    struct Row
    {
        QString name;
        unsigned points;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("Lucida Console"), 9, QStringLiteral("{\\fonttbl{\\f9\\fnil\\fcharset0 Lucida Console;}}"),
         "the usual one"},
        {QStringLiteral("Courier New"), 12, QStringLiteral("{\\fonttbl{\\f12\\fnil\\fcharset0 Courier New;}}"),
         "the font's number is its size"},
        {QString(), 0, QStringLiteral("{\\fonttbl{\\f0\\fnil\\fcharset0 ;}}"), "no name and no size"},
        {QStringLiteral(u"\u6E2C;}"), 4294967295U,
         QStringLiteral(u"{\\fonttbl{\\f4294967295\\fnil\\fcharset0 \u6E2C;};}}"),
         "a name goes in as it is, and no size is negative"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        RichReport report;
        report.Write(QStringLiteral("x"), 0);
        report.SetFontName(row.name);
        report.SetFontSize(row.points);
        QString table = QStringLiteral("what was there before");
        report.GetFontTableData(table);
        EXPECT_EQ(table, row.expected) << row.reason;
        EXPECT_EQ(documentOf(report), QStringLiteral("{\\rtf1\\ansi\\ansicpg1252\\deff0\\deflang1033") + row.expected +
                                          plain(QStringLiteral("x")) + u'}')
            << row.reason << ": fragments keep font 1 of 9 points";
    }
}

TEST(UReportDocRichText, ForASpreadsheetOnlyTheTextsAreKept)
{
    const FixedSurroundings surroundings;
    RichReport report;
    report.SetExternalExcel();
    EXPECT_EQ(documentOf(report), QString()) << "no head, no braces";
    report.Write(QStringLiteral("A\t1"), 0);
    report.LineFeed(2);
    report.Write(QStringLiteral("\n"), 0);
    report.Write(QStringLiteral("B\\{}"), 3);
    report.WriteRTFData(QStringLiteral("any style"), 7);
    report.WriteRTFData(QString(), 0);
    EXPECT_EQ(documentOf(report), QStringLiteral("A\t1\nB\\{}any style"));

    RichReport late;
    late.Write(QStringLiteral("before"), 0);
    late.SetExternalExcel();
    late.Write(QStringLiteral("after"), 0);
    EXPECT_EQ(documentOf(late), plain(QStringLiteral("before")) + QStringLiteral("after"))
        << "what had become rich text before stays so";
}

TEST(UReportDocRichText, AFormatStringIsCutDownToItsParagraph)
{
    struct Row
    {
        QStringView document;
        bool cut;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"{\\rtf1{\\fonttbl{\\f1 F;}}\\viewkind4\\pard x }", true, u"\\viewkind4\\pard x ", "the usual document"},
        {u"x\\viewkind}", true, u"\\viewkind", "the shortest"},
        {u"{\\viewkind a}b\\viewkind c}", true, u"\\viewkind a", "the first paragraph, up to the first brace"},
        {u"{\\viewkind{a}}", true, u"\\viewkind{a", "an opening brace is not counted"},
        {u"}}\\viewkind4 a}", true, u"\\viewkind4 a", "braces in front do not end it"},
        {u"\\viewkind4 x}", false, u"\\viewkind4 x}", "it is at the very beginning"},
        {u"\\viewkind4 x}{\\viewkind4 y}", false, u"\\viewkind4 x}{\\viewkind4 y}", "only the first one counts"},
        {u"{\\viewkind4 x", false, u"{\\viewkind4 x", "no brace after it"},
        {u"{a}\\viewkind4 x", false, u"{a}\\viewkind4 x", "the only brace is in front"},
        {u"{\\rtf1 x}", false, u"{\\rtf1 x}", "no paragraph"},
        {u"{\\VIEWKIND4 x}", false, u"{\\VIEWKIND4 x}", "in small letters only"},
        {u"", false, u"", "empty"},
    };
    for (const Row &row : rows) {
        QString document = row.document.toString();
        EXPECT_EQ(UReportDoc::ResetFormatString(document), row.cut) << row.reason;
        EXPECT_EQ(document, row.expected.toString()) << row.reason;
    }
}

} // namespace
