#include "UReportList.h"

#include "PrintQt.h"

#include <QScrollBar>
#include <QTest>

#include <gtest/gtest.h>

namespace
{

constexpr unsigned lineBack = 0;
constexpr unsigned lineForward = 1;
constexpr unsigned pageBack = 2;
constexpr unsigned pageForward = 3;
constexpr unsigned thumbPosition = 4;
constexpr unsigned thumbTrack = 5;
constexpr unsigned toBegin = 6;
constexpr unsigned toEnd = 7;
constexpr unsigned scrollEnd = 8;

/// A list with an inside of 200 by 100.
class ReportListScroll : public testing::Test
{
protected:
    ReportListScroll()
    {
        parent.resize(400, 300);
        parent.show();
        list.setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff); // the inside keeps its size
        EXPECT_TRUE(list.Create(&parent, QRect(10, 20, 200, 100), 11005));
        fitInside(200, 100);
        list.Create(&parent, list.geometry(), 11005);
    }
    ~ReportListScroll() override { list.setParent(nullptr); }

    void fitInside(int width, int height)
    {
        const QSize around = list.size() - list.viewport()->size();
        list.resize(QSize(width, height) + around);
        ASSERT_EQ(list.viewport()->size(), QSize(width, height));
    }

    QWidget parent;
    UReportList list;
};

TEST(UReportList, TheContentIsTheInsideAlsoBeforeItsParentIsShown)
{
    QWidget shown;
    shown.show();
    UReportList early;
    UReportList late;
    QWidget hidden;
    ASSERT_TRUE(early.Create(&shown, QRect(10, 20, 200, 100), 11005));
    ASSERT_TRUE(late.Create(&hidden, QRect(10, 20, 200, 100), 11005));
    EXPECT_EQ(late.GetContentRect(), early.GetContentRect());
    EXPECT_LT(late.GetContentRect().width(), 200);
    hidden.show();
    EXPECT_EQ(late.viewport()->rect(), late.GetContentRect()) << "as it is then";
    early.setParent(nullptr);
    late.setParent(nullptr);
}

TEST(UReportList, IsCreatedAsAChildWithASunkenEdge)
{
    QWidget parent;
    parent.show();
    UReportList list;
    EXPECT_FALSE(list.Create(nullptr, QRect(0, 0, 10, 10), 1)) << "a child needs a parent";
    EXPECT_EQ(list.GetDlgCtrlID(), 0);
    EXPECT_TRUE(list.Create(&parent, QRect(10, 20, 200, 100), 11005));
    EXPECT_EQ(list.parentWidget(), &parent);
    EXPECT_EQ(list.geometry(), QRect(10, 20, 200, 100));
    EXPECT_EQ(list.GetDlgCtrlID(), 11005);
    EXPECT_TRUE(list.isVisible());
    EXPECT_EQ(list.focusPolicy() & Qt::TabFocus, Qt::TabFocus);
    EXPECT_EQ(list.frameShadow(), QFrame::Sunken);
    EXPECT_GT(list.frameWidth(), 0);
    EXPECT_EQ(list.font().pointSize(), 8);
    EXPECT_EQ(list.font().family(), QStringLiteral("MS Shell Dlg"));
    EXPECT_EQ(list.GetContentRect(), QRect(QPoint(), list.viewport()->size())) << "the inside as it is now";
    list.setParent(nullptr);

    UReportList withFont;
    withFont.setFont(QFont(QStringLiteral("DejaVu Sans Mono"), 12));
    EXPECT_TRUE(withFont.Create(&parent, QRect(0, 0, 50, 50), 1));
    EXPECT_EQ(withFont.font().pointSize(), 12) << "a font that it has stays";
    withFont.setParent(nullptr);
}

TEST_F(ReportListScroll, ARectangleIsClippedToTheInside)
{
    struct Row
    {
        QRect rect;
        QRect expected;
        const char *reason;
    };
    const Row rows[] = {
        {{0, 0, 200, 100}, {0, 0, 200, 100}, "the inside itself"},
        {{10, 20, 30, 40}, {10, 20, 30, 40}, "within"},
        {{-50, -60, 300, 300}, {0, 0, 200, 100}, "around"},
        {{-10, -10, 20, 20}, {0, 0, 10, 10}, "over the upper left corner"},
        {{190, 90, 20, 20}, {190, 90, 10, 10}, "over the lower right one"},
        {{199, 99, 5, 5}, {199, 99, 1, 1}, "one pixel"},
        {{200, 0, 10, 10}, {}, "right of it: the right side is outside"},
        {{0, 100, 10, 10}, {}, "under it"},
        {{201, 0, 10, 10}, {}, "apart from it"},
        {{-11, 0, 10, 10}, {}, "left of it"},
        {{0, -11, 10, 10}, {}, "above it"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(list.ClipRect(row.rect), row.expected) << row.reason;
    }
    EXPECT_EQ(list.ClipRect({-10, 0, 10, 10}), QRect(0, 0, 0, 10)) << "it touches the left side: no width, the height";
    EXPECT_EQ(list.ClipRect({0, -10, 10, 10}), QRect(0, 0, 10, 0)) << "it touches the upper side";
    EXPECT_TRUE(list.ClipRect({-10, 0, 10, 10}).isEmpty());
}

TEST_F(ReportListScroll, TheBarsCoverInsideAndContent)
{
    const QScrollBar *across = list.horizontalScrollBar();
    const QScrollBar *down = list.verticalScrollBar();
    list.UpdateScrollBarInfo();
    EXPECT_EQ(across->minimum(), 0);
    EXPECT_EQ(across->maximum(), 200);
    EXPECT_EQ(across->pageStep(), 200);
    EXPECT_EQ(down->minimum(), 0);
    EXPECT_EQ(down->maximum(), 100);
    EXPECT_EQ(down->pageStep(), 100);

    list.OnHScroll(thumbTrack, 30);
    list.OnVScroll(thumbTrack, 40);
    ASSERT_EQ(list.GetContentRect(), QRect(-30, -40, 200, 100));
    list.UpdateScrollBarInfo();
    EXPECT_EQ(across->minimum(), -30) << "the content begins left of the inside";
    EXPECT_EQ(across->maximum(), 200) << "the inside ends right of the content";
    EXPECT_EQ(down->minimum(), -40);
    EXPECT_EQ(down->maximum(), 100);

    fitInside(120, 60);
    list.UpdateScrollBarInfo();
    EXPECT_EQ(across->pageStep(), 120);
    EXPECT_EQ(across->maximum(), 170) << "the content ends right of the inside";
    EXPECT_EQ(down->pageStep(), 60);
    EXPECT_EQ(down->maximum(), 60) << "they end together";
}

TEST_F(ReportListScroll, TheContentMovesAgainstTheBar)
{
    struct Row
    {
        unsigned code;
        int position;
        int expected; ///< the bar's position
        const char *reason;
    };
    const Row rows[] = {
        {lineForward, 77, 1, "a pixel; the position given does not count"},
        {lineForward, 0, 2, "another one"},
        {lineBack, 77, 1, "a pixel back"},
        {thumbPosition, 50, 50, "to the place where the thumb was left"},
        {thumbTrack, 80, 80, "and where it is now"},
        {thumbTrack, 80, 80, "it did not move"},
        {pageForward, 10, 80, "pages are not for this"},
        {pageBack, 10, 80, "pages are not for this"},
        {toBegin, 10, 80, "nor the ends"},
        {toEnd, 10, 80, "nor the ends"},
        {scrollEnd, 10, 80, "nor the end of scrolling"},
        {99, 10, 80, "nor a code that is not known"},
        {lineBack, 0, 79, "on from there"},
        {thumbPosition, 0, 0, "back to the beginning"},
    };
    list.UpdateScrollBarInfo();
    for (const Row &row : rows) {
        list.OnHScroll(row.code, row.position, list.horizontalScrollBar());
        EXPECT_EQ(list.horizontalScrollBar()->value(), row.expected) << row.reason;
        EXPECT_EQ(list.GetContentRect(), QRect(-row.expected, 0, 200, 100)) << row.reason;
    }
    for (const Row &row : rows) {
        list.OnVScroll(row.code, row.position, list.verticalScrollBar());
        EXPECT_EQ(list.verticalScrollBar()->value(), row.expected) << row.reason;
        EXPECT_EQ(list.GetContentRect(), QRect(0, -row.expected, 200, 100)) << row.reason;
    }
}

TEST_F(ReportListScroll, TheContentDoesNotLeaveTheList)
{
    list.UpdateScrollBarInfo();
    list.OnHScroll(thumbPosition, 199);
    list.OnVScroll(thumbPosition, 99);
    EXPECT_EQ(list.GetContentRect(), QRect(-199, -99, 200, 100)) << "a pixel is left to be seen";
    list.OnHScroll(lineForward, 0);
    list.OnVScroll(lineForward, 0);
    EXPECT_EQ(list.GetContentRect(), QRect(-199, -99, 200, 100)) << "a line further it would be gone";
    EXPECT_EQ(list.horizontalScrollBar()->value(), 199);
    EXPECT_EQ(list.verticalScrollBar()->value(), 99);
    for (const int position : {200, 1000, -1000}) {
        list.OnHScroll(thumbTrack, position);
        list.OnVScroll(thumbTrack, position);
        EXPECT_EQ(list.GetContentRect(), QRect(-199, -99, 200, 100)) << position;
    }
    list.OnHScroll(lineBack, 0);
    EXPECT_EQ(list.GetContentRect(), QRect(-198, -99, 200, 100)) << "back is possible";
}

TEST_F(ReportListScroll, ResizingMovesTheListAndSetsItsBars)
{
    const QSize around = list.size() - list.viewport()->size();
    list.Resize(5, 6, 150 + around.width(), 80 + around.height());
    EXPECT_EQ(list.geometry().topLeft(), QPoint(5, 6));
    EXPECT_EQ(list.viewport()->size(), QSize(150, 80));
    EXPECT_EQ(list.horizontalScrollBar()->pageStep(), 150);
    EXPECT_EQ(list.horizontalScrollBar()->maximum(), 200) << "the content is still 200 wide";
    EXPECT_EQ(list.verticalScrollBar()->pageStep(), 80);
    EXPECT_EQ(list.verticalScrollBar()->maximum(), 100);

    UReportList notCreated;
    notCreated.setGeometry(1, 2, 30, 40);
    notCreated.Resize(5, 6, 70, 80);
    EXPECT_EQ(notCreated.geometry(), QRect(1, 2, 30, 40)) << "there is no window to move";
}

TEST_F(ReportListScroll, TheLinesHaveTheirBarsBackAfterwards)
{
    for (int i = 0; i < 100; ++i) {
        list.WriteLine(QString(100, u'x'));
    }
    ASSERT_TRUE(QTest::qWaitFor([this] { return list.model()->rowCount() == 100; }, 5000));
    QCoreApplication::processEvents();
    const int rowHeight = list.visualRect(list.model()->index(0, 0)).height();
    list.Resize(0, 0, 150, 80);
    ASSERT_TRUE(QTest::qWaitFor(
        [&] { return list.verticalScrollBar()->maximum() == 100 * rowHeight - list.viewport()->height(); }, 5000));
    EXPECT_GE(list.horizontalScrollBar()->maximum(), list.GetHorizontalExtent() - list.viewport()->width());
}

} // namespace
