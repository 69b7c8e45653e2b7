#include "ReportPages.h"
#include "PageHeader.h"

#include <gtest/gtest.h>

using kareport::ReportPage;
using kareport::reportPages;

namespace
{

/// Each page as "begin-end/lines".
QString shown(const std::vector<ReportPage> &pages)
{
    QStringList texts;
    for (const ReportPage &page : pages) {
        texts += QStringLiteral("%1-%2/%3").arg(page.begin).arg(page.end).arg(page.lines);
    }
    return texts.join(u' ');
}

/// A text with its page starts, and its pages: begin, end and lines of each.
struct CountedText
{
    QString text;
    std::vector<qint64> starts;
    int linesPerPage;
    QString pages;
    const char *reason;
};
const QString three = QStringLiteral("a\r\nb\r\nc\r\n");
const QString blank = QStringLiteral("\r\n");
const CountedText countedTexts[] = {
    {QString(), {}, 2, QString(), "an empty text has no page"},
    {QString(), {0}, 2, QString(), "nor has it with a start"},
    {three, {}, 2, QStringLiteral("0-6/2 6-9/1"), "without starts by counting lines"},
    {three, {}, 1, QStringLiteral("0-3/1 3-6/1 6-9/1"), "a page of one line"},
    {three, {}, 0, QStringLiteral("0-3/1 3-6/1 6-9/1"), "less than one line counts as one"},
    {three, {}, -5, QStringLiteral("0-3/1 3-6/1 6-9/1"), "margins may leave less than nothing"},
    {three, {}, 3, QStringLiteral("0-9/3"), "a full page"},
    {three.chopped(2), {}, 3, QStringLiteral("0-7/3"), "the last line needs no line end"},
    {three, {0, 3}, 2, QStringLiteral("0-3/1 3-9/2"), "by starts"},
    {three, {0}, 2, QStringLiteral("0-9/3"), "a page with too many lines is one page"},
    {three, {6}, 1, QStringLiteral("0-3/1 3-6/1 6-9/1"), "text before the first start by counting lines"},
    {three, {0, 4, 6}, 2, QStringLiteral("0-6/2 6-9/1"), "a start within a line counts for nothing"},
    {three, {4}, 2, QStringLiteral("0-6/2 6-9/1"), "also as the only one"},
    {three, {0, 9, 20}, 2, QStringLiteral("0-9/3"), "nothing begins after the text"},
    {three, {-3, 0, 0, 3, 3}, 2, QStringLiteral("0-3/1 3-9/2"), "doubles and negative places are skipped"},
    {three + blank + blank + three,
     {0, 13},
     9,
     QStringLiteral("0-9/3 13-22/3"),
     "blank lines at a page's end are left out"},
    {three + QStringLiteral(" \t\r\n") + three,
     {0, 13},
     9,
     QStringLiteral("0-9/3 13-22/3"),
     "a line of blanks is blank"},
    {blank + three, {0}, 9, QStringLiteral("0-11/4"), "blank lines before a line are the page's"},
    {three + blank + three, {0, 9, 11}, 9, QStringLiteral("0-9/3 9-9/0 11-20/3"), "a blank page within stays"},
    {three + blank.repeated(9), {0}, 2, QStringLiteral("0-9/3"), "blank lines at the end are not pages"},
    {three + blank.repeated(9), {}, 3, QStringLiteral("0-9/3"), "nor where lines are counted"},
    {three + blank.repeated(9), {0, 9, 11}, 3, QStringLiteral("0-9/3"), "nor where pages were begun"},
    {three + blank.repeated(6) + three,
     {},
     3,
     QStringLiteral("0-9/3 9-9/0 15-15/0 21-30/3"),
     "blank lines between lines are counted like others"},
    {three + blank.repeated(6) + three,
     {21},
     3,
     QStringLiteral("0-9/3 21-30/3"),
     "before the first start they are at a page's end"},
    {blank.repeated(5), {}, 2, QStringLiteral("0-0/0"), "blank lines alone are one page"},
    {blank.repeated(5), {0, 4}, 2, QStringLiteral("0-0/0"), "with starts as well"},
    {QStringLiteral("a\nb\n"), {0, 2}, 9, QStringLiteral("0-2/1 2-4/1"), "a line may end with a line feed alone"},
    {QStringLiteral("a\rb\r"), {}, 1, QStringLiteral("0-4/1"), "a carriage return alone ends none"},
};

TEST(ReportPages, PagesOfATextByItsStartsAndByLines)
{
    for (const CountedText &paged : countedTexts) {
        EXPECT_EQ(shown(reportPages(QStringView(paged.text), paged.starts, paged.linesPerPage)), paged.pages)
            << paged.reason;
        const QByteArray bytes = paged.text.toLatin1();
        EXPECT_EQ(shown(reportPages(QLatin1StringView(bytes), paged.starts, paged.linesPerPage)), paged.pages)
            << paged.reason << ", one byte a character";
    }
}

TEST(ReportPages, StartsAsLinesAndBack)
{
    const QString text = QStringLiteral("a\r\nb\r\n\r\nc");
    const std::vector<qint64> lines = {0, 1, 3};
    EXPECT_EQ(kareport::linesOfStarts(QStringView(text), {0, 1, 3, 8, 9, 40}), lines) << "8 is the last line";
    EXPECT_EQ(kareport::startsOfLines(QStringView(text), {0, 1, 3, 4, 9}), std::vector<qint64>({0, 3, 8}));
    EXPECT_EQ(kareport::startsOfLines(QStringView(), {0, 1}), std::vector<qint64>()) << "an empty text has no line";
}

} // namespace
