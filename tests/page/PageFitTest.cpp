#include "PageFit.h"

#include <gtest/gtest.h>

#include <limits>

namespace
{

using kareport::fitPage;
using kareport::PageFit;
using kareport::SheetRoom;

// Type of 8 points on a printer of 600 dots an inch: a row is 78 dots high, a character 40 dots wide.
constexpr double points = 8;
constexpr double rowHeight = 78;
constexpr double character = 40;
/// A4 between the usual margins.
constexpr SheetRoom upright = {4441, 6307};
constexpr SheetRoom lying = {6496, 4252};

TEST(PageFit, TypeIsMadeSmallerDownToFivePointsThenThePageGoesInPieces)
{
    struct Row
    {
        qint64 rows;
        double characters;
        SheetRoom room;
        double points;
        qint64 pieces;
        bool breaksRows;
        const char *reason;
    };
    constexpr double third = 1.0 / 3;
    const Row rows[] = {
        {60, 80, upright, 8, 1, false, "fits"},
        {80, 111, upright, 8, 1, false, "6240 of 6307 dots high, 4440 of 4441 wide"},
        {1, 1, upright, 8, 1, false, "type is not made larger"},
        {0, 0, upright, 8, 1, false, "an empty page takes a sheet"},
        {81, 80, upright, 8 * 6307 / (81 * rowHeight), 1, false, "a row more than the sheet takes: 7.99 points"},
        {60, 112, upright, 8 * 4441 / (112 * character), 1, false, "a character more: 7.93 points"},
        {72, 80, lying, 8 * 4252 / (72 * rowHeight), 1, false, "the height decides: 6.06 points"},
        {55, 177.64, {4441, 4252}, 5, 1, false, "the width decides: 5.00 points, for which 55 rows are low enough"},
        {129, 80, upright, 8 * 6307 / (129 * rowHeight), 1, false, "5.01 points"},
        {130, 80, upright, 5, 2, false, "4.98 would be needed: 129 rows of 5 points and one more"},
        {258, 80, upright, 5, 2, false, "two sheets full"},
        {259, 80, upright, 5, 3, false, "a row more than two sheets"},
        {60, 178, upright, 5, 1, true, "4.99 would be needed for the width"},
        {200, 400, upright, 5, 2, true, "both"},
        {10, 10, {100, 10}, 5, 10, true, "lower than a row: a row a sheet"},
        {10, 10, {0, 0}, 5, 10, true, "no room at all"},
        {10, 10, {-5, -7}, 5, 10, true, "margins that overlap"},
        {3,
         1,
         {3 * third * character, 3 * rowHeight * (0.1 + 0.2) / 0.3},
         8,
         1,
         false,
         "roundings of the last place do not count"},
        {std::numeric_limits<qint64>::max(),
         1,
         {character, std::numeric_limits<double>::max()},
         8,
         1,
         false,
         "numbers without sense do no harm"},
    };
    for (const Row &expected : rows) {
        const PageFit fit = fitPage({points, expected.rows, rowHeight, expected.characters * character}, expected.room);
        EXPECT_NEAR(fit.points, expected.points, 1e-9) << expected.reason;
        EXPECT_EQ(fit.pieces, expected.pieces) << expected.reason;
        EXPECT_EQ(fit.breaksRows, expected.breaksRows) << expected.reason;
    }
}

TEST(PageFit, TypeThatIsSmallAlreadyStays)
{
    struct Row
    {
        double points;
        qint64 rows;
        double expected;
        qint64 pieces;
        const char *reason;
    };
    constexpr Row rows[] = {
        {4, 100, 4, 1, "fits: rows of 10 in 1000"}, {4, 101, 4, 2, "below 5 points already: no smaller"},
        {5, 101, 5, 2, "5 points are the limit"},   {5.5, 101, 5.5 * 1000 / 1010, 1, "5.45 points"},
        {20, 400, 5, 1, "a quarter of 20 points"},  {20, 401, 5, 2, "less than a quarter"},
    };
    for (const Row &row : rows) {
        const PageFit fit = fitPage({row.points, row.rows, 10, 10}, {1000, 1000});
        EXPECT_NEAR(fit.points, row.expected, 1e-9) << row.reason;
        EXPECT_EQ(fit.pieces, row.pieces) << row.reason;
    }
}

} // namespace
