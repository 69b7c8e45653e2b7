#include "ReportResources.h"

#include <QFontMetrics>

#include <gtest/gtest.h>

namespace
{

TEST(ReportResources, TextsAreKnownByTheirNumbers)
{
    struct Row
    {
        unsigned number;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {11001, "KaReport", "the window's title"},
        {11007, "Save", "a button"},
        {11009, "View\\Edit Report", "a button; one backslash"},
        {11011, "Print", "a button"},
        {11018, "", "the toolbar has no text"},
        {11008, "", "between two buttons"},
        {0, "", "no number"},
        {0xFFFFFFFF, "", "no number"},
    };
    for (const Row &row : rows) {
        EXPECT_STREQ(kareport::reportString(row.number), row.expected) << row.reason;
    }
}

TEST(ReportResources, TheBarHasItsButtonsInTheirOrder)
{
    EXPECT_EQ(kareport::reportBar(11018).commands, (std::vector<unsigned>{11007, 11009, 11011}));
    EXPECT_EQ(kareport::reportBar(11018).buttonSize, QSize(16, 16));
    EXPECT_TRUE(kareport::reportBar(155).commands.empty()) << "a dialog";
}

TEST(ReportResources, TheDialogHasAFontAListAndASizeThatFollowsTheFont)
{
    const kareport::DialogResource dialog = kareport::reportDialog(155);
    EXPECT_EQ(dialog.size, QSize(220, 89));
    EXPECT_EQ(dialog.control, 11005U);
    EXPECT_EQ(dialog.controlPlace, QRect(0, 0, 219, 88));
    EXPECT_EQ(dialog.font().family(), QStringLiteral("MS Shell Dlg"));
    EXPECT_EQ(dialog.font().pointSize(), 8);
    const QFontMetrics font(dialog.font());
    EXPECT_EQ(kareport::pixelsOfDialogUnits(QRect(4, 8, 8, 16), font),
              QRect(font.averageCharWidth(), font.height(), 2 * font.averageCharWidth(), 2 * font.height()));
    EXPECT_EQ(kareport::reportDialog(11018).control, 0U) << "a bar";
}

} // namespace
