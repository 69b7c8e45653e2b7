#include "UReportList.h"

#include "PrintQt.h"
#include "ReportContent.h"

#include <QAbstractItemModel>
#include <QApplication>
#include <QClipboard>
#include <QImage>
#include <QMainWindow>
#include <QMenuBar>
#include <QScrollBar>
#include <QTest>

#include <gtest/gtest.h>

#include <memory>

namespace
{

/// A list on the screen, in the font of reports.
class ReportListTest : public testing::Test
{
protected:
    ReportListTest()
    {
        list.setFont(kareport::reportFont(QStringLiteral("Lucida Console"), 8));
        list.resize(300, 200);
        list.show();
        QApplication::setActiveWindow(&list);
        list.setFocus();
    }

    void write(int count)
    {
        for (int i = 0; i < count; ++i) {
            list.WriteLine(QStringLiteral("line %1").arg(i));
        }
    }
    /// Waits until the view knows of every line.
    bool shown()
    {
        const bool known = QTest::qWaitFor([this] { return list.model()->rowCount() == list.GetCount(); }, 5000);
        settle();
        return known;
    }
    /// Bars come and go a turn of the event loop after the lines that need them.
    static void settle()
    {
        QCoreApplication::processEvents();
        QCoreApplication::processEvents();
    }
    QRect rectOf(int row) const { return list.visualRect(list.model()->index(row, 0)); }
    bool isWhollyVisible(int row) const
    {
        const QRect rect = rectOf(row);
        return rect.top() >= 0 && rect.bottom() < list.viewport()->height();
    }
    QImage picture() { return list.viewport()->grab().toImage(); }
    int currentRow() const { return list.currentIndex().row(); }

    UReportList list;
};

TEST_F(ReportListTest, AnEmptyListHasItsVerticalBar)
{
    settle();
    EXPECT_TRUE(list.verticalScrollBar()->isVisible()) << "as with every line that could come";
    EXPECT_EQ(list.verticalScrollBar()->maximum(), 0);
    EXPECT_FALSE(list.horizontalScrollBar()->isVisible());
}

TEST_F(ReportListTest, EveryQuestionIsAnsweredAsIfEachLineHadBeenThereAtOnce)
{
    EXPECT_EQ(list.GetCount(), 0);
    EXPECT_EQ(list.GetCurSel(), -1);
    EXPECT_EQ(list.GetHorizontalExtent(), 0);
    list.WriteLine(u"  first");
    EXPECT_EQ(list.GetCount(), 1);
    EXPECT_EQ(list.GetCurSel(), 0);
    EXPECT_EQ(list.GetText(0), QStringLiteral("  first")) << "leading blanks included";
    EXPECT_GT(list.GetHorizontalExtent(), 0);
    list.WriteLine(u"second\r\n");
    EXPECT_EQ(list.GetText(1), QStringLiteral("second\r\n")) << "exactly as written";
    EXPECT_EQ(list.GetText(2), QString());
    EXPECT_EQ(list.GetCurSel(), 1);
    EXPECT_EQ(list.model()->rowCount(), 0) << "the view does not know of them yet";
    ASSERT_TRUE(shown());
    EXPECT_EQ(list.GetCount(), 2);
    EXPECT_EQ(list.GetCurSel(), 1);
    EXPECT_EQ(currentRow(), 1);
    EXPECT_TRUE(list.selectionModel()->isSelected(list.model()->index(1, 0)));
    EXPECT_EQ(list.selectionModel()->selectedIndexes().size(), 1) << "only the newest";
}

TEST_F(ReportListTest, OnlyAWiderLineWidensTheList)
{
    list.WriteLine(u"12345678");
    const int eight = list.GetHorizontalExtent();
    struct Row
    {
        QStringView line;
        int expected;
        const char *reason;
    };
    const Row rows[] = {
        {u"1234", eight, "a narrower one leaves it"},
        {u"", eight, "an empty one"},
        {u"iiiiiiii", eight, "as wide: the font has one pitch"},
        {u"1234567890123456", 2 * eight, "twice as wide"},
        {u"12345678", 2 * eight, "narrower again"},
        {u"12345678901234567890123\n", 23 * eight / 8, "the line end takes no room"},
    };
    for (const Row &row : rows) {
        list.WriteLine(row.line);
        EXPECT_NEAR(list.GetHorizontalExtent(), row.expected, 1) << row.reason;
    }
    list.AddString(u"123456789012345678901234");
    EXPECT_NEAR(list.GetHorizontalExtent(), 3 * eight, 1) << "so does a line that is not made the current one";
}

TEST_F(ReportListTest, TheHorizontalBarReachesTheEndOfTheWidestLine)
{
    list.WriteLine(u"short");
    ASSERT_TRUE(shown());
    EXPECT_EQ(list.horizontalScrollBar()->maximum(), 0);
    EXPECT_FALSE(list.horizontalScrollBar()->isVisible());
    const QString line = QString(200, u' ') + u'#';
    list.WriteLine(line);
    ASSERT_TRUE(shown());
    ASSERT_TRUE(list.horizontalScrollBar()->isVisible());
    EXPECT_GE(list.horizontalScrollBar()->maximum() + list.viewport()->width(), list.GetHorizontalExtent());
    list.selectionModel()->clear();
    list.horizontalScrollBar()->setValue(list.horizontalScrollBar()->maximum());
    // The last character, on the white of the list, and nothing in its place.
    const QRect rect = rectOf(1);
    const QImage image = picture().copy(rect & list.viewport()->rect());
    int dark = 0;
    for (int x = 0; x < image.width(); ++x) {
        for (int y = 0; y < image.height(); ++y) {
            dark += image.pixelColor(x, y).lightness() < 128 && x > image.width() - 20 ? 1 : 0;
        }
    }
    EXPECT_GT(dark, 5) << "the line is neither cut nor abbreviated";
}

TEST_F(ReportListTest, ManyLinesAreOneInsertionAndOneSelection)
{
    int insertions = 0;
    int selections = 0;
    QObject::connect(list.model(), &QAbstractItemModel::rowsInserted, [&] { ++insertions; });
    QObject::connect(list.selectionModel(), &QItemSelectionModel::currentRowChanged, [&] { ++selections; });
    write(10000);
    EXPECT_EQ(insertions, 0) << "nothing is shown while lines are written";
    ASSERT_TRUE(shown());
    EXPECT_EQ(insertions, 1);
    EXPECT_EQ(selections, 1);
    EXPECT_EQ(currentRow(), 9999);
    EXPECT_TRUE(isWhollyVisible(9999)) << "the newest line is scrolled to";
}

TEST_F(ReportListTest, TheNewestLineIsSeenThoughTheHorizontalBarComes)
{
    write(100);
    list.WriteLine(QString(300, u'x'));
    ASSERT_TRUE(shown());
    ASSERT_TRUE(QTest::qWaitFor([this] { return list.horizontalScrollBar()->isVisible(); }, 5000));
    settle();
    EXPECT_TRUE(isWhollyVisible(100));
    for (const int height : {120, 60, 300, 90}) {
        list.resize(300, height);
        settle();
        EXPECT_TRUE(isWhollyVisible(100)) << "in a window of " << height;
    }
    list.verticalScrollBar()->setValue(100);
    list.resize(300, 150);
    settle();
    EXPECT_EQ(list.verticalScrollBar()->value(), 100) << "who looks at other lines stays there";
}

TEST_F(ReportListTest, AnAddedLineLeavesTheCurrentOne)
{
    write(50);
    ASSERT_TRUE(shown());
    list.setCurrentIndex(list.model()->index(3, 0));
    EXPECT_EQ(list.AddString(u"added"), 50);
    EXPECT_EQ(list.GetCurSel(), 3);
    ASSERT_TRUE(shown());
    EXPECT_EQ(currentRow(), 3);
    list.WriteLine(u"written");
    EXPECT_EQ(list.AddString(u"added after it"), 52);
    ASSERT_TRUE(shown());
    EXPECT_EQ(currentRow(), 51) << "the last that was written";
}

TEST_F(ReportListTest, LinesOfAHiddenListAreThereWhenItIsShown)
{
    list.hide();
    write(100);
    ASSERT_TRUE(shown());
    list.show();
    settle();
    EXPECT_EQ(currentRow(), 99);
    EXPECT_TRUE(isWhollyVisible(99));
}

TEST_F(ReportListTest, TheKeyboardMovesTheCurrentLine)
{
    write(100);
    ASSERT_TRUE(shown());
    const int page = list.viewport()->height() / rectOf(0).height() - 1;
    struct Row
    {
        Qt::Key key;
        int expected;
        const char *reason;
    };
    const Row rows[] = {
        {Qt::Key_Home, 0, "the first"},       {Qt::Key_Up, 0, "there is none before"},
        {Qt::Key_Down, 1, "the next"},        {Qt::Key_PageDown, 1 + page, "a page, with one line of the one before"},
        {Qt::Key_Down, 2 + page, "the next"}, {Qt::Key_Up, 1 + page, "the one before"},
        {Qt::Key_PageUp, 1, "back"},          {Qt::Key_PageUp, 0, "not before the first"},
        {Qt::Key_End, 99, "the last"},        {Qt::Key_Down, 99, "there is none after it"},
        {Qt::Key_PageDown, 99, "nor a page"},
    };
    for (const Row &row : rows) {
        QTest::keyClick(&list, row.key);
        EXPECT_EQ(currentRow(), row.expected) << row.reason;
        EXPECT_TRUE(isWhollyVisible(row.expected)) << row.reason;
        EXPECT_EQ(list.selectionModel()->selectedIndexes().size(), 1) << row.reason;
    }
}

TEST_F(ReportListTest, LeftAndRightScrollLongLines)
{
    list.WriteLine(QString(200, u'x'));
    ASSERT_TRUE(shown());
    QScrollBar *bar = list.horizontalScrollBar();
    QTest::keyClick(&list, Qt::Key_Right);
    EXPECT_EQ(bar->value(), bar->singleStep()) << "by a character";
    QTest::keyClick(&list, Qt::Key_Right);
    QTest::keyClick(&list, Qt::Key_Left);
    EXPECT_EQ(bar->value(), bar->singleStep());
    QTest::keyClick(&list, Qt::Key_Left);
    QTest::keyClick(&list, Qt::Key_Left);
    EXPECT_EQ(bar->value(), 0);
}

TEST_F(ReportListTest, AnEmptyListTakesKeys)
{
    for (const Qt::Key key : {Qt::Key_Home, Qt::Key_End, Qt::Key_Up, Qt::Key_Down, Qt::Key_PageDown, Qt::Key_Left}) {
        QTest::keyClick(&list, key);
        EXPECT_EQ(currentRow(), -1);
    }
    QTest::mouseClick(list.viewport(), Qt::LeftButton, Qt::NoModifier, QPoint(5, 5));
    EXPECT_EQ(currentRow(), -1);
}

TEST_F(ReportListTest, AClickMakesALineTheCurrentOne)
{
    write(100);
    ASSERT_TRUE(shown());
    list.verticalScrollBar()->setValue(7);
    const QModelIndex index = list.indexAt(QPoint(250, 60));
    ASSERT_EQ(index.row(), (60 + 7) / rectOf(0).height());
    QTest::mouseClick(list.viewport(), Qt::LeftButton, Qt::NoModifier, QPoint(250, 60));
    EXPECT_EQ(currentRow(), index.row()) << "also beside its text";
    EXPECT_EQ(list.selectionModel()->selectedIndexes(), QModelIndexList{index});
    const QColor marked = picture().pixelColor(250, 60);
    EXPECT_NE(marked, picture().pixelColor(250, 60 + 2 * rectOf(0).height())) << "and shows it";
    EXPECT_FALSE(list.indexAt(QPoint(5, -1)).isValid());
    list.resize(300, 5000);
    settle();
    EXPECT_FALSE(list.indexAt(QPoint(5, 4000)).isValid()) << "after the last";
}

TEST_F(ReportListTest, CopiesTheCurrentLineThoughAMenuHasTheKey)
{
    QMainWindow window;
    int copiedElsewhere = 0;
    window.menuBar()
        ->addMenu(QStringLiteral("Edit"))
        ->addAction(QStringLiteral("Copy"), QKeySequence::Copy, &window, [&] { ++copiedElsewhere; });
    window.setCentralWidget(&list);
    window.show();
    QApplication::setActiveWindow(&window);
    list.setFocus();
    list.WriteLine(u"  N 45°12'30\" E  ");
    ASSERT_TRUE(shown());
    QApplication::clipboard()->clear();
    QTest::keySequence(&list, QKeySequence::Copy);
    EXPECT_EQ(QApplication::clipboard()->text(), QStringLiteral("  N 45°12'30\" E  ")) << "as it was written";
    EXPECT_EQ(copiedElsewhere, 0);
    window.takeCentralWidget();
    list.setParent(nullptr);
}

TEST_F(ReportListTest, TabLeavesTheList)
{
    QWidget window;
    list.setParent(&window);
    UReportList other(&window);
    window.show();
    list.show();
    QApplication::setActiveWindow(&window);
    write(3);
    ASSERT_TRUE(shown());
    list.setFocus();
    QTest::keyClick(&list, Qt::Key_Tab);
    EXPECT_FALSE(list.hasFocus());
    list.setParent(nullptr);
}

TEST_F(ReportListTest, AnotherFontIsMeasuredAnew)
{
    list.WriteLine(u"1234567890");
    ASSERT_TRUE(shown());
    const int extent = list.GetHorizontalExtent();
    const int height = rectOf(0).height();
    list.setFont(kareport::reportFont(QStringLiteral("Lucida Console"), 16));
    EXPECT_NEAR(list.GetHorizontalExtent(), 2 * extent, 0.2 * extent);
    EXPECT_GT(rectOf(0).height(), height);
    list.setFont(kareport::reportFont(QStringLiteral("Lucida Console"), 8));
    EXPECT_EQ(list.GetHorizontalExtent(), extent);
    EXPECT_EQ(rectOf(0).height(), height);
}

TEST_F(ReportListTest, RowsFollowEachOtherWithoutGaps)
{
    write(10);
    ASSERT_TRUE(shown());
    for (int row = 1; row < 10; ++row) {
        EXPECT_EQ(rectOf(row).top(), rectOf(row - 1).bottom() + 1);
        EXPECT_EQ(list.indexAt(rectOf(row).topLeft()).row(), row);
        EXPECT_EQ(list.indexAt(rectOf(row).bottomLeft()).row(), row);
    }
    EXPECT_GE(rectOf(0).width(), list.viewport()->width()) << "the mark of a line reaches across the list";
    EXPECT_EQ(list.visualRect(QModelIndex()), QRect());
}

TEST_F(ReportListTest, PlacesOfLinesAreScrolledTo)
{
    write(1000);
    ASSERT_TRUE(shown());
    const int height = rectOf(0).height();
    const int page = list.viewport()->height();
    struct Row
    {
        int row;
        QAbstractItemView::ScrollHint hint;
        int expected;
        const char *reason;
    };
    const Row rows[] = {
        {500, QAbstractItemView::PositionAtTop, 500 * height, "at the top"},
        {503, QAbstractItemView::EnsureVisible, 500 * height, "it is seen: nothing moves"},
        {499, QAbstractItemView::EnsureVisible, 499 * height, "above: as far as is needed"},
        {600, QAbstractItemView::EnsureVisible, 601 * height - page, "below: as far as is needed"},
        {500, QAbstractItemView::PositionAtBottom, 501 * height - page, "at the bottom"},
        {500, QAbstractItemView::PositionAtCenter, (1001 * height - page) / 2, "in the middle"},
        {0, QAbstractItemView::PositionAtBottom, 0, "not before the beginning"},
        {999, QAbstractItemView::PositionAtTop, 1000 * height - page, "not past the end"},
    };
    for (const Row &row : rows) {
        list.scrollTo(list.model()->index(row.row, 0), row.hint);
        EXPECT_EQ(list.verticalScrollBar()->value(), row.expected) << row.reason;
    }
    list.scrollTo(QModelIndex());
    EXPECT_EQ(list.verticalScrollBar()->value(), 1000 * height - page);
}

TEST_F(ReportListTest, AWheelTurnScrollsLines)
{
    write(1000);
    ASSERT_TRUE(shown());
    list.verticalScrollBar()->setValue(0);
    QWheelEvent turn(QPointF(10, 10), list.viewport()->mapToGlobal(QPointF(10, 10)), QPoint(), QPoint(0, -120),
                     Qt::NoButton, Qt::NoModifier, Qt::NoScrollPhase, false);
    QApplication::sendEvent(list.viewport(), &turn);
    EXPECT_EQ(list.verticalScrollBar()->value(), QApplication::wheelScrollLines() * rectOf(0).height());
}

} // namespace
