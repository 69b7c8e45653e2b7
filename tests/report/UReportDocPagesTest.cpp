#include "FrameFixture.h"
#include "ReportFixture.h"
#include "ReportPages.h"
#include "ReportTextCodec.h"

#include <QBuffer>
#include <QTemporaryDir>

#include <gtest/gtest.h>

using kareport::ReportPage;

namespace
{

/// The lines of each page, as "12 12 3".
QString linesOf(const UReportDoc &report)
{
    QStringList lines;
    for (const ReportPage &page : report.GetPages()) {
        lines += QString::number(page.lines);
    }
    return lines.join(u' ');
}

/// What each page begins with, up to a blank.
QString wordsOf(const UReportDoc &report)
{
    QStringList words;
    const QString text = report.CopyText();
    for (const ReportPage &page : report.GetPages()) {
        words += text.mid(page.begin, page.end - page.begin).section(u' ', 0, 0).section(u'\r', 0, 0);
    }
    return words.join(u' ');
}

void rows(UReportDoc &written, int count)
{
    for (int i = 0; i < count; ++i) {
        written.WriteLine(QStringLiteral("row"), 0, 1, 0);
    }
}

class UReportDocPages : public testing::Test
{
protected:
    UReportDocPages()
    {
        report.FixPage(12, 80);
        report.SetHeaderFlag(true);
    }
    void writeRows(int count) { rows(report, count); }

    FixedSurroundings surroundings_;
    UReportDoc report;
};

/// What is written into a report, and the lines of its pages then.
struct Writing
{
    void (*write)(UReportDoc &report);
    const char16_t *lines;
    const char *reason;
};
constexpr Writing writings[] = {
    {[](UReportDoc &) {}, u"", "nothing was written"},
    {[](UReportDoc &r) { rows(r, 1); }, u"5", "header, three blank lines and a row"},
    {[](UReportDoc &r) { rows(r, 7); }, u"11 1", "the last line of a page stays free, the next page has its header"},
    {[](UReportDoc &r) { rows(r, 16); }, u"11 11 6", "as counting lines gives it"},
    {[](UReportDoc &r) {
         r.SetHeading(QStringLiteral("one\r\ntwo\r\nthree"), 0, 1);
         rows(r, 9);
     },
     u"9 9 9 9 8", "a heading of three lines counts twice: a page of ten lines is full"},
    {[](UReportDoc &r) {
         rows(r, 2);
         r.LineFeed(30);
         rows(r, 2);
     },
     u"6 6", "a long line feed is a page's end"},
    {[](UReportDoc &r) {
         rows(r, 1);
         r.LineFeed(30);
         r.Write(QStringLiteral("end"), 0);
     },
     u"36", "or within the page when nothing begins another one"},
    {[](UReportDoc &r) {
         r.SetHeaderFlag(false);
         rows(r, 1);
         r.NewPage(-1);
         r.NewPage(-1);
         rows(r, 1);
     },
     u"1 0 1", "a blank page in between"},
    {[](UReportDoc &r) {
         r.SetHeaderFlag(false);
         rows(r, 1);
         r.NewPage(-1);
         r.NewPage(-1);
     },
     u"1", "blank pages at the end are not printed"},
    {[](UReportDoc &r) {
         rows(r, 1);
         r.NewPage(-1);
         r.NewPage(-1);
     },
     u"5 1 1", "pages with a header only are"},
    {[](UReportDoc &r) {
         for (int i = 0; i < 30; ++i) {
             r.Write(QStringLiteral("by hand\r\n"), 0);
         }
     },
     u"12 12 6", "no page was begun: counting lines"},
    {[](UReportDoc &r) {
         for (int i = 0; i < 13; ++i) {
             r.Write(QStringLiteral("by hand\r\n"), 0);
         }
         rows(r, 1);
     },
     u"12 1 5", "what was written before the first page by counting"},
    {[](UReportDoc &r) {
         r.SetData(QStringLiteral("a\r\nb\r\n"));
         rows(r, 1);
     },
     u"2 5", "a text and pages after it"},
    {[](UReportDoc &r) {
         r.SetData(QStringLiteral("a\r\nb"));
         rows(r, 1);
     },
     u"6", "a page that begins within a line begins nowhere"},
    {[](UReportDoc &r) {
         r.SetHeaderFlag(false);
         r.FixPage(1, 80);
         rows(r, 3);
     },
     u"1 0 1 0 1", "one line a page: a line that is ended begins the next one, and the next line another"},
    {[](UReportDoc &r) {
         r.FixPage(1, 80);
         rows(r, 2);
     },
     u"5 1 5 1", "a header that is longer than a page: no page is run out"},
    {[](UReportDoc &r) {
         rows(r, 3);
         r.FixPage(20, 80);
         rows(r, 20);
     },
     u"19 12", "more lines a page from the middle of one on"},
    {[](UReportDoc &r) {
         r.WriteLine(QStringLiteral("row"), -1, -1, 0);
         r.LineFeed(-5);
         r.WriteLine(QStringLiteral("row"), -1, 1, 0);
     },
     u"5 1 5", "counts below 0 begin pages"},
};

TEST_F(UReportDocPages, ArePagesOfTheirWriterWhateverIsOnThem)
{
    for (const Writing &writing : writings) {
        UReportDoc other;
        other.FixPage(12, 80);
        other.SetHeaderFlag(true);
        writing.write(other);
        EXPECT_EQ(linesOf(other), QString::fromUtf16(writing.lines)) << writing.reason;
    }
}

TEST_F(UReportDocPages, ALetterLeavesThemAsTheyAre)
{
    report.SetHeading(QStringLiteral("Station\r\nElevation"), 1, 1);
    writeRows(40);
    const QString before = linesOf(report);
    const std::size_t pages = report.GetPages().size();
    ASSERT_GE(pages, 7U);
    for (qint64 at = 0; at < report.GetTextLength(); at += 37) {
        ASSERT_TRUE(report.ReplaceText(at, 0, u"x"));
        EXPECT_EQ(report.GetPages().size(), pages) << at;
        ASSERT_TRUE(report.ReplaceText(at, 1, u""));
        EXPECT_EQ(linesOf(report), before) << at;
    }
}

TEST_F(UReportDocPages, ALineEndBeforeAPageBringsItBack)
{
    writeRows(10);
    ASSERT_EQ(report.GetPages().size(), 2U);
    const qint64 second = report.GetPageStarts().at(1);
    ASSERT_TRUE(report.ReplaceText(second - 4, 4, u"")); // the last line of the page before is blank
    EXPECT_EQ(report.GetPages().size(), 1U) << "its first line is the end of another";
    ASSERT_TRUE(report.ReplaceText(second - 4, 0, u"\r\n"));
    EXPECT_EQ(report.GetPages().size(), 2U);
}

TEST_F(UReportDocPages, PagesThatWereCutComeBackAlsoWithoutHeaders)
{
    report.SetHeaderFlag(false);
    report.FixPage(3, 80);
    writeRows(12);
    const std::vector<qint64> starts = report.GetPageStarts();
    ASSERT_GE(starts.size(), 6U);
    const QString cut = report.CopyText().mid(starts[1], starts[4] - starts[1]);
    ASSERT_TRUE(report.ReplaceText(starts[1], cut.size(), u""));
    EXPECT_EQ(report.GetPageStarts().size(), starts.size() - 3);
    ASSERT_TRUE(report.ReplaceText(starts[1], 0, cut));
    EXPECT_EQ(report.GetPageStarts(), starts);
}

TEST_F(UReportDocPages, ATextIsReadByItsHeadersInAnyLanguage)
{
    for (const QString &label :
         {QStringLiteral("   Page:"), QStringLiteral("   Seite:"), QString::fromUtf8("   \xE9\xA0\x81:")})
    {
        const auto header = [&label](int page) {
            return headerOf(QStringLiteral("T"), page).replace(QStringLiteral("   Page:"), label) +
                   QStringLiteral("\r\n");
        };
        const QString text = header(1) + QStringLiteral("a\r\nPage: 2\r\n") + header(9) + QStringLiteral("b\r\n");
        report.SetData(text);
        EXPECT_EQ(report.GetPageStarts(), std::vector<qint64>({0, text.indexOf(header(9))}))
            << label.toStdString() << ": a number after the label alone is not a header";
    }
    report.SetData(QStringLiteral("a\r\n"));
    EXPECT_TRUE(report.GetPageStarts().empty());
}

TEST_F(UReportDocPages, ClearForgetsThem)
{
    writeRows(10);
    report.Clear();
    EXPECT_TRUE(report.GetPageStarts().empty());
    writeRows(1);
    EXPECT_EQ(linesOf(report), QStringLiteral("5"));
}

TEST_F(UReportDocPages, AnInsertedHeaderBringsItsPage)
{
    writeRows(5);
    const qint64 row = report.CopyText().indexOf(QStringLiteral("row"));
    ASSERT_TRUE(report.ReplaceText(row, 0, headerOf(QString(), 8) + QStringLiteral("\r\nx\r\n")));
    EXPECT_EQ(wordsOf(report), QStringLiteral("TALVEN TALVEN"));
    EXPECT_EQ(report.GetPageStarts(), std::vector<qint64>({0, row}));
}

TEST_F(UReportDocPages, ALoadedFileHasThePagesThatItWasWrittenIn)
{
    writeRows(16);
    const QTemporaryDir folder;
    const QString file = folder.filePath(QStringLiteral("a.rep"));
    ASSERT_TRUE(report.OnSaveDocument(file));
    for (const bool keepsLineEnds : {false, true}) {
        UReportDoc loaded;
        ASSERT_EQ(loaded.LoadFile(file, keepsLineEnds), 1);
        EXPECT_EQ(loaded.GetPages().size(), 3U) << "line ends kept: " << keepsLineEnds;
        EXPECT_EQ(wordsOf(loaded), QStringLiteral("TALVEN TALVEN TALVEN"));
    }
}

TEST_F(UReportDocPages, ALoadedFileIsReadByItsHeadersInAnyLanguage)
{
    const QTemporaryDir folder;
    const QString file = folder.filePath(QStringLiteral("a.rep"));
    for (const QString &label :
         {QStringLiteral("   Page:"), QStringLiteral("   Seite:"), QString::fromUtf8("   \xE9\xA0\x81:")})
    {
        QString text;
        for (const int page : {1, 2, 3}) {
            text += headerOf(QStringLiteral("T"), page).replace(QStringLiteral("   Page:"), label) +
                    QStringLiteral("\na\nb\n");
        }
        putFile(file, ("\xEF\xBB\xBF" + text.toUtf8()).constData());
        UReportDoc loaded; // a character for each byte
        ASSERT_EQ(loaded.LoadFile(file, true), 1);
        EXPECT_EQ(loaded.GetPages().size(), 3U) << label.toStdString();
    }
}

TEST_F(UReportDocPages, RichTextThatWasOpenedHasThePagesOfItsText)
{
    const QTemporaryDir folder;
    const QString file = folder.filePath(QStringLiteral("a.rtf"));
    QFile rtf(file);
    ASSERT_TRUE(rtf.open(QIODevice::WriteOnly));
    const QByteArray first = headerOf(QStringLiteral("T"), 1).toLatin1();
    const QByteArray second = headerOf(QStringLiteral("T"), 2).toLatin1();
    rtf.write("{\\rtf1\\ansi{\\fonttbl{\\f0 Courier;}}\\f0 " + first + "\\par a\\par " + second + "\\par b\\par}");
    rtf.close();
    ASSERT_TRUE(report.OnOpenDocument(file));
    EXPECT_TRUE(report.HoldsRichTextSource());
    EXPECT_EQ(linesOf(report), QStringLiteral("2 2"));
}

TEST_F(UReportDocPages, WhatIsHandedOnHasNoRecord)
{
    QBuffer device;
    device.open(QIODevice::WriteOnly);
    kareport::ReportTextWriter writer(device, kareport::LineEnds::PlainText);
    report.StreamText(&writer);
    writeRows(100);
    EXPECT_TRUE(report.GetPageStarts().empty());
    ASSERT_TRUE(report.EndTextStream(writer));
    writeRows(16);
    EXPECT_FALSE(report.GetPageStarts().empty()) << "what is kept again has one";
}

TEST_F(UReportDocPages, AFixedPageIsKnown)
{
    EXPECT_TRUE(report.IsPageFixed());
    report.FixPage(std::nullopt, std::nullopt);
    EXPECT_FALSE(report.IsPageFixed());
}

} // namespace
