#include "FrameFixture.h"
#include "ReportFixture.h"

#include "PdfExport.h"
#include "PdfReadBack.h"
#include "ReportPages.h"

#include <QBuffer>

#include <gtest/gtest.h>

// The pages of a report, from its writer into its PDF.

namespace
{

constexpr int linesPerPage = 20;

/// A report with page headers whose writer fills some pages.
class PagedReport : public UReportDoc
{
public:
    explicit PagedReport(const QString &heading = QString())
    {
        FixPage(linesPerPage, 80);
        SetPageSize();
        SetTitle(QStringLiteral("Paged"));
        SetHeaderFlag(true);
        if (!heading.isEmpty()) {
            SetHeading(heading, 0, 1);
        }
    }
    void fill(int lines)
    {
        for (int line = 1; line <= lines; ++line) {
            WriteLine(QStringLiteral("row %1").arg(line), 0, 1, 0);
        }
    }
};

QStringList pagesOf(const UReportDoc &report)
{
    QBuffer file;
    file.open(QIODevice::WriteOnly);
    EXPECT_TRUE(report.WritePdf(file));
    return PdfReadBack(file.data()).pages();
}

/// Every page begins with its header, and no other line is one.
void expectHeadersOnTop(const QStringList &pages, const char *reason)
{
    for (qsizetype page = 0; page < pages.size(); ++page) {
        EXPECT_EQ(pages[page].count(QStringLiteral("Page:")), 1) << reason << ", page " << page + 1;
        EXPECT_TRUE(pages[page].section(u'\n', 0, 0).contains(QStringLiteral("Page:")))
            << reason << ", page " << page + 1;
    }
}

TEST(PdfReportPages, ATypedLetterLeavesThePagesAsTheyAre)
{
    const FixedSurroundings surroundings;
    PagedReport report;
    report.fill(100);
    const QStringList before = pagesOf(report);
    ASSERT_GE(before.size(), 6);
    expectHeadersOnTop(before, "as written");
    const qint64 at = textOf(report).indexOf(QStringLiteral("row 5"));
    ASSERT_TRUE(report.ReplaceText(at, 0, u"x"));
    const QStringList letter = pagesOf(report);
    EXPECT_EQ(letter.size(), before.size());
    expectHeadersOnTop(letter, "after a letter");
    // One line would only take the place of a blank one at the page's end.
    const QString more = QStringLiteral("a line more\r\n").repeated(3);
    ASSERT_TRUE(report.ReplaceText(at, 0, more));
    const QStringList lines = pagesOf(report);
    EXPECT_EQ(lines.size(), before.size()) << "the page of the lines is set closer or smaller";
    expectHeadersOnTop(lines, "after lines more");
    EXPECT_EQ(lines.mid(1), before.mid(1)) << "the other pages are as they were";
    ASSERT_TRUE(report.ReplaceText(at, more.size(), u""));
    EXPECT_EQ(pagesOf(report), letter) << "and back";
}

TEST(PdfReportPages, AHeadingOfTwoLinesKeepsThePagesApart)
{
    const FixedSurroundings surroundings;
    PagedReport report(QStringLiteral("Heading\r\nof two lines"));
    report.fill(60);
    const QStringList pages = pagesOf(report);
    EXPECT_EQ(static_cast<std::size_t>(pages.size()), report.GetPages().size());
    expectHeadersOnTop(pages, "two lines");
    for (const QString &page : pages) {
        EXPECT_TRUE(page.contains(QStringLiteral("of two lines"))) << page.toStdString();
    }
}

TEST(PdfReportPages, ALongLineFeedMakesNoBlankPage)
{
    const FixedSurroundings surroundings;
    PagedReport report;
    report.fill(5);
    report.LineFeed(3 * linesPerPage);
    report.NewPage(-1);
    report.fill(5);
    const QStringList pages = pagesOf(report);
    expectHeadersOnTop(pages, "a long line feed");
    EXPECT_EQ(pages.size(), 2);
}

} // namespace
