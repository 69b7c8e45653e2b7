#include "SheetMarks.h"

#include <gtest/gtest.h>

namespace
{

using kareport::PageRow;

/// "abc", an empty line, and "de" that goes on as "f"; each character is 10 wide, each row 20 high.
const std::vector<PageRow> rows = {
    {0, 3, 100, 20, {50, 60, 70, 80}},
    {4, 4, 120, 20, {50}},
    {5, 7, 140, 20, {50, 60, 70}},
    {7, 8, 160, 20, {50, 60}},
};

TEST(SheetMarks, APointIsAtTheNearestPlaceBetweenCharacters)
{
    struct Row
    {
        QPointF point;
        qint64 position;
        const char *reason;
    };
    const Row cases[] = {
        {{50, 110}, 0, "at the beginning"},
        {{64, 110}, 1, "nearer to the left"},
        {{66, 110}, 2, "nearer to the right"},
        {{500, 110}, 3, "right of the line: its end"},
        {{0, 110}, 0, "left of it"},
        {{70, 130}, 4, "an empty line"},
        {{10, 0}, 0, "above all"},
        {{500, 900}, 8, "below all"},
        {{61, 165}, 8, "the rest of a line"},
    };
    for (const Row &row : cases) {
        EXPECT_EQ(kareport::positionAt(rows, row.point), row.position) << row.reason;
    }
    EXPECT_EQ(kareport::positionAt({}, {0, 0}), -1);
}

TEST(SheetMarks, AnExtentHasARectangleARow)
{
    const std::vector<QRectF> found = kareport::rectsOf(rows, 1, 6);
    ASSERT_EQ(found.size(), 2U);
    EXPECT_EQ(found[0], QRectF(60, 100, 20, 20));
    EXPECT_EQ(found[1], QRectF(50, 140, 10, 20));
    EXPECT_TRUE(kareport::rectsOf(rows, 3, 5).empty()) << "a line's end";
}

TEST(SheetMarks, TheCursorIsAtTheBeginningOfTheRowThatGoesOn)
{
    EXPECT_EQ(kareport::cursorRect(rows, 7), QRectF(50, 160, 0, 20));
    EXPECT_EQ(kareport::cursorRect(rows, 3), QRectF(80, 100, 0, 20));
    EXPECT_EQ(kareport::cursorRect(rows, 4), QRectF(50, 120, 0, 20));
    EXPECT_TRUE(kareport::cursorRect(rows, 9).isNull()) << "on another sheet";
}

} // namespace
