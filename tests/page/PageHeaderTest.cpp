#include "PageHeader.h"

#include "PrintQt.h"

#include <QLocale>

#include <gtest/gtest.h>

namespace
{

const QDateTime afternoon(QDate(2024, 3, 5), QTime(14, 7));
const QString pageLabel = QStringLiteral("   Page:");

TEST(PageHeader, DatesAreEnglishOnATwelveHourClock)
{
    struct Row
    {
        QDate date;
        QTime time;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {{2024, 3, 5}, {14, 7}, QStringLiteral("Mar 05, 2024  02:07PM"), "day and hour have two digits"},
        {{2024, 1, 1}, {0, 0}, QStringLiteral("Jan 01, 2024  12:00AM"), "midnight is twelve"},
        {{2024, 2, 29}, {0, 59}, QStringLiteral("Feb 29, 2024  12:59AM"), "the hour after midnight is twelve"},
        {{2024, 4, 30}, {1, 0}, QStringLiteral("Apr 30, 2024  01:00AM"), "one at night"},
        {{2024, 5, 9}, {11, 59}, QStringLiteral("May 09, 2024  11:59AM"), "last minute before noon"},
        {{2024, 6, 10}, {12, 0}, QStringLiteral("Jun 10, 2024  12:00PM"), "noon is twelve"},
        {{2024, 7, 11}, {12, 59}, QStringLiteral("Jul 11, 2024  12:59PM"), "the hour after noon is twelve"},
        {{2024, 8, 12}, {13, 0}, QStringLiteral("Aug 12, 2024  01:00PM"), "one in the afternoon"},
        {{2024, 9, 13}, {23, 59}, QStringLiteral("Sep 13, 2024  11:59PM"), "last minute of the day"},
        {{2024, 10, 14}, {10, 10}, QStringLiteral("Oct 14, 2024  10:10AM"), "two digits of their own"},
        {{1999, 11, 15}, {20, 0}, QStringLiteral("Nov 15, 1999  08:00PM"), "the year has four digits"},
        {{2000, 12, 31}, {9, 5}, QStringLiteral("Dec 31, 2000  09:05AM"), "minutes have two digits"},
    };
    for (const QLocale::Language language : {QLocale::C, QLocale::German, QLocale::Japanese}) {
        QLocale::setDefault(QLocale(language));
        for (const Row &row : rows) {
            EXPECT_EQ(kareport::pageHeaderDate(QDateTime(row.date, row.time)), row.expected)
                << row.reason << ", language " << language;
        }
    }
    QLocale::setDefault(QLocale::system());
}

TEST(PageHeader, PlacesTheDateByTheWidthThatTheRowLeaves)
{
    const QString date = QStringLiteral("Mar 05, 2024  02:07PM"); // 21 characters
    struct Row
    {
        QString title;
        int charsPerRow;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("T"), 80,
         QStringLiteral("TALVEN - T                              Mar 05, 2024  02:07PM    Page:"),
         "right-aligned in 80 - 10 - 20 = 50"},
        {QStringLiteral("T"), 52, QStringLiteral("TALVEN - T  ") + date + QStringLiteral("    Page:"),
         "a width of 22 fills one blank"},
        {QStringLiteral("T"), 51, QStringLiteral("TALVEN - T ") + date + QStringLiteral("    Page:"),
         "the date fits exactly"},
        {QStringLiteral("T"), 50, QStringLiteral("TALVEN - T ") + date + QStringLiteral("    Page:"),
         "a date longer than its width stays whole"},
        {QStringLiteral("T"), 30, QStringLiteral("TALVEN - T ") + date + QStringLiteral("    Page:"), "width 0"},
        {QStringLiteral("T"), 29, QStringLiteral("TALVEN - T ") + date + QStringLiteral("    Page:"),
         "a width of -1 fills nothing"},
        {QStringLiteral("T"), 9, QStringLiteral("TALVEN - T ") + date + QStringLiteral("    Page:"),
         "a width of -21 is the date's own length"},
        {QStringLiteral("T"), 5, QStringLiteral("TALVEN - T ") + date + QStringLiteral("        Page:"),
         "a width of -25: the date is on the left, with blanks after it"},
        {QStringLiteral("T"), 0, QStringLiteral("TALVEN - T ") + date + QString(9, u' ') + QStringLiteral("    Page:"),
         "a row of nothing is a width of -30"},
        {QString(), 50, QStringLiteral("TALVEN -  ") + date + QStringLiteral("    Page:"),
         "no title: 50 - 9 - 20 = 21"},
        {QStringLiteral("100%s %1 %d"), 61,
         QStringLiteral("TALVEN - 100%s %1 %d ") + date + QStringLiteral("    Page:"),
         "a title is never taken for a format"},
        {QString::fromUtf8("\xF0\x9F\x98\x80\xE6\xB8\xAC"), 53,
         QString::fromUtf8("TALVEN - \xF0\x9F\x98\x80\xE6\xB8\xAC ") + date + QStringLiteral("    Page:"),
         "a surrogate pair counts as two characters: 53 - 12 - 20 = 21"},
        {QString::fromUtf8("\xF0\x9F\x98\x80\xE6\xB8\xAC"), 54,
         QString::fromUtf8("TALVEN - \xF0\x9F\x98\x80\xE6\xB8\xAC  ") + date + QStringLiteral("    Page:"),
         "a surrogate pair counts as two characters: 54 - 12 - 20 = 22"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(kareport::pageHeaderLine(QStringLiteral("TALVEN"), row.title, afternoon, pageLabel, row.charsPerRow),
                  row.expected)
            << row.reason;
    }
}

TEST(PageHeader, WithItsPageNumberTheLineEndsSoManyCharactersBeforeTheRow)
{
    constexpr int pageNumberSize = 3;
    const QString application = QStringLiteral("TALVEN Survey");
    const QString title = QStringLiteral("Traverse");
    // 13 + 3 + 8 characters in front, 20 of room, 21 of date.
    for (int charsPerRow = 65; charsPerRow <= 200; ++charsPerRow) {
        const QString line = kareport::pageHeaderLine(application, title, afternoon, pageLabel, charsPerRow);
        EXPECT_EQ(line.size() + pageNumberSize, charsPerRow - 7) << "a label of 8 characters";
        const QString other =
            kareport::pageHeaderLine(application, title, afternoon, QStringLiteral("Seite:"), charsPerRow);
        EXPECT_EQ(other.size() + pageNumberSize, charsPerRow - 15 + 6) << "a label of 6 characters";
    }
}

TEST(PageHeader, SaysTheNumberOfItsPage)
{
    const QString front =
        kareport::pageHeaderLine(QStringLiteral("A"), QStringLiteral("T 7"), afternoon, pageLabel, 80);
    struct Row
    {
        QString line;
        std::optional<int> number;
        const char *reason;
    };
    const Row rows[] = {
        {front + QStringLiteral("  1"), 1, "padded"},
        {front + QStringLiteral("123"), 123, "three digits"},
        {front + QStringLiteral("12345"), 12345, "more than three"},
        {front + QStringLiteral("  7 \r"), 7, "blanks and a line end after it"},
        {front + QStringLiteral("123456789"), 123456789, "nine digits"},
        {front + QStringLiteral("1234567890"), std::nullopt, "too many"},
        {front, std::nullopt, "none"},
        {QStringLiteral("12.5  7"), std::nullopt, "a line that is not a header"},
        {QString(), std::nullopt, "an empty line"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(kareport::pageNumberOf(row.line), row.number) << row.reason;
    }
}

} // namespace
