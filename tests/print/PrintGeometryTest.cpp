#include "PrintGeometry.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

#include <climits>

namespace
{

using namespace kareport;

TEST(PrintGeometry, MarginsBecomeRoundedTwips)
{
    struct Row
    {
        int hundredths;
        int twips;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, 0, "none"},
        {1000, 567, "566.93"},
        {1200, 680, "680.31"},
        {2000, 1134, "1133.86"},
        {2540, 1440, "an inch"},
        {1, 1, "0.57"},
        {-1000, -567, "a margin below 0 is not checked here"},
        {INT_MAX, 1217471044, "the product needs 64 bits"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(twipsOfHundredths(row.hundredths), row.twips) << row.reason;
    }
    const QMargins margins = twipsOfHundredths(QMargins(1000, 1200, 2000, 2540));
    EXPECT_EQ(margins.left(), 567);
    EXPECT_EQ(margins.top(), 680);
    EXPECT_EQ(margins.right(), 1134);
    EXPECT_EQ(margins.bottom(), 1440);
}

TEST(PrintGeometry, ASheetIsCutOffToTwips)
{
    struct Row
    {
        QSize dots;
        unsigned resolution;
        QSize twips;
        const char *reason;
    };
    const Row rows[] = {
        {{4961, 7016}, 600, {11906, 16838}, "A4: 11906.4 and 16838.4"},
        {{5100, 6600}, 600, {12240, 15840}, "Letter: exact"},
        {{7, 8}, 1000, {10, 11}, "10.08 and 11.52 are cut off, not rounded"},
        {{0, 0}, 600, {0, 0}, "no sheet"},
        {{0, 0}, 0, {0, 0}, "a page that has not been measured"},
        {{100, 100}, 0, {0, 0}, "no resolution"},
        {{2982616, 2982617}, 1200, {3579139, 0}, "63 m: one dot more no longer fits 32 bits"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(twipsOfDots(row.dots, row.resolution), row.twips) << row.reason;
    }
}

TEST(PrintGeometry, MillimetresBecomeRoundedTwips)
{
    EXPECT_EQ(twipsOfMillimetres(25.4), 1440);
    EXPECT_EQ(twipsOfMillimetres(210), 11906) << "11905.5";
    EXPECT_EQ(twipsOfMillimetres(0), 0);
}

TEST(PrintGeometry, CountsPages)
{
    struct Row
    {
        int lines;
        int linesPerPage;
        int pages;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, 72, 0, "nothing to print"},
        {1, 72, 1, "one line"},
        {71, 72, 1, "a page that is not full"},
        {72, 72, 1, "a full page"},
        {73, 72, 2, "one line more"},
        {144, 72, 2, "two full pages"},
        {1'000'000, 72, 13'889, "a long report"},
        {5, 1, 5, "a page for each line"},
        {5, 0, 0, "no line fits a page"},
        {100, -3, -32, "fewer than no lines: no page"},
        {INT_MAX, INT_MAX, 1, "the sum needs 64 bits"},
        {INT_MAX, 1, INT_MAX, "the most"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(expectedPages(row.lines, row.linesPerPage), row.pages) << row.reason;
    }
}

TEST(PrintGeometry, TheMarginsLeaveAPartOfTheSheet)
{
    EXPECT_EQ(printableRect({11906, 16838}, {567, 568, 680, 1134}), QRect(567, 568, 10659, 15136));
    EXPECT_TRUE(printableRect({1000, 1000}, {500, 500, 500, 500}).isEmpty()) << "nothing is left";
    EXPECT_LT(printableRect({1000, 1000}, {600, 0, 600, 0}).width(), 0) << "wider than the paper";
    EXPECT_LT(printableRect({1000, 1000}, {1000000000, 0, 1000000000, 0}).width(), 0) << "as wide as a number allows";
}

TEST(PrintGeometry, TextNeedsASquareOfTenMillimetres)
{
    struct Row
    {
        QSize sheet;
        QMargins margins;
        bool leavesRoom;
        const char *reason;
    };
    const Row rows[] = {
        {{11906, 16838}, {567, 567, 680, 1134}, true, "the usual margins on A4"},
        {{1000, 1000}, {433, 0, 0, 0}, true, "567 twips wide"},
        {{1000, 1000}, {433, 0, 1, 0}, false, "one less"},
        {{1000, 1000}, {0, 200, 0, 233}, true, "567 twips high"},
        {{1000, 1000}, {0, 200, 0, 234}, false, "one less"},
        {{1000, 1000}, {2000, 0, 0, 0}, false, "wider than the paper"},
        {{0, 0}, {0, 0, 0, 0}, false, "no sheet"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(leavesRoom(row.sheet, row.margins), row.leavesRoom) << row.reason;
    }
}

} // namespace
