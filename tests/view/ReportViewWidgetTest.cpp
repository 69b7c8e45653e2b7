#include "FindBar.h"
#include "PageBar.h"
#include "ViewFixture.h"

#include <QLabel>
#include <QPushButton>
#include <QSpinBox>

namespace
{

using kareport::ReportViewWidget;

/// The place that is shown, which follows the text on the screen.
QString placeIn(const ReportViewWidget &widget)
{
    QCoreApplication::processEvents();
    return QStringList{widget.pageLabel().text(), widget.lineLabel().text(), widget.columnLabel().text()}.join(
        QStringLiteral(", "));
}

TEST(ReportViewWidget, SaysWhereTheCursorIs)
{
    struct Row
    {
        const char16_t *text;
        int linesPerPage;
        int position;
        const char *expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", 3, 0, "Page 1 of 1, Line 1, Column 1", "nothing"},
        {u"ab", 3, 2, "Page 1 of 1, Line 1, Column 3", "after the last character"},
        {u"1\n2\n3\n", 3, 4, "Page 1 of 1, Line 3, Column 1", "a full page"},
        {u"1\n2\n3\n", 3, 6, "Page 1 of 1, Line 4, Column 1", "what the last line end opens begins no page"},
        {u"1\n2\n3\n4", 3, 6, "Page 2 of 2, Line 4, Column 1", "a character more does"},
        {u"1\n2\n3\n4", 1, 2, "Page 2 of 4, Line 2, Column 1", "pages of one line"},
        {u"1\n2\n3\n4", 0, 6, "Page 4 of 4, Line 4, Column 1", "no lines at all are one"},
        {u"1\n2", -5, 2, "Page 2 of 2, Line 2, Column 1", "fewer than none as well"},
        {u"\U0001F600\U0001F600x", 3, 4, "Page 1 of 1, Line 1, Column 3", "a pair is one character"},
        {u"\tx", 3, 1, "Page 1 of 1, Line 1, Column 2", "and so is a tab"},
    };
    for (const Row &row : rows) {
        ReportViewWidget widget;
        widget.setLinesPerPage([&row] { return row.linesPerPage; });
        widget.edit().loadPlainText(QString::fromUtf16(row.text));
        putCursor(widget.edit(), row.position);
        EXPECT_EQ(placeIn(widget), QString::fromUtf8(row.expected)) << row.reason;
    }
}

TEST(ReportViewWidget, ThePlaceFollowsTypingAndLoading)
{
    ReportViewWidget widget;
    widget.setLinesPerPage([] { return 2; });
    QTest::keyClicks(&widget.edit(), QStringLiteral("ab"));
    EXPECT_EQ(placeIn(widget), QStringLiteral("Page 1 of 1, Line 1, Column 3"));
    QTest::keyClick(&widget.edit(), Qt::Key_Return);
    QTest::keyClick(&widget.edit(), Qt::Key_Return);
    QTest::keyClick(&widget.edit(), Qt::Key_X);
    EXPECT_EQ(placeIn(widget), QStringLiteral("Page 2 of 2, Line 3, Column 2"));
    widget.edit().loadPlainText(QString());
    EXPECT_EQ(placeIn(widget), QStringLiteral("Page 1 of 1, Line 1, Column 1"));
    widget.edit().setZoomPercent(150);
    EXPECT_EQ(widget.zoomLabel().text(), QStringLiteral("150 %"));
}

TEST(ReportViewWidget, LinesOfAPageAreTheReports)
{
    ShownReport t(reportLines(QStringLiteral("line\n")).repeated(100));
    t.report.FixPage(10, 80);
    UReportView &view = t.open();
    EXPECT_EQ(widgetOf(view).pageCount(), 10);
    t.report.FixPage(25, 80);
    EXPECT_EQ(widgetOf(view).pageCount(), 4) << "asked for anew";
}

TEST(ReportViewWidget, GoesToAPageWhoseFirstLineIsThenAtTheTop)
{
    struct Row
    {
        int page;
        int line;
        const char *reason;
    };
    constexpr Row rows[] = {
        {1, 0, "the first"},
        {3, 40, "one in the middle"},
        {50, 980, "the last"},
        {0, 0, "below the first"},
        {51, 980, "after the last"},
        {-2147483647, 0, "far below"},
        {2147483647, 980, "far past it"},
    };
    ReportViewWidget widget;
    widget.setLinesPerPage([] { return 20; });
    widget.edit().loadPlainText(QStringLiteral("line\n").repeated(1000));
    widget.resize(500, 300);
    widget.show();
    for (const Row &row : rows) {
        widget.goToPage(row.page);
        EXPECT_EQ(widget.edit().textCursor().blockNumber(), row.line) << row.reason;
        if (row.line < 900) {
            EXPECT_EQ(widget.edit().firstVisibleLine(), row.line) << row.reason;
        }
    }
}

TEST(ReportViewWidget, AsksForAPageByTheKeyboard)
{
    ReportViewWidget widget;
    widget.setLinesPerPage([] { return 20; });
    widget.edit().loadPlainText(QStringLiteral("line\n").repeated(1000));
    widget.resize(500, 300);
    widget.show();
    QApplication::setActiveWindow(&widget);
    QSpinBox &page = widget.pageBar().page();
    EXPECT_FALSE(widget.pageBar().isVisible());
    QTest::keyClick(&widget.edit(), Qt::Key_G, Qt::ControlModifier);
    ASSERT_TRUE(widget.pageBar().isVisible());
    EXPECT_TRUE(page.hasFocus());
    EXPECT_EQ(page.value(), 1) << "the page of the cursor";
    EXPECT_EQ(page.maximum(), 50);
    QTest::keyClicks(&page, QStringLiteral("7"));
    QTest::keyClick(&page, Qt::Key_Return);
    EXPECT_EQ(widget.currentPage(), 7);
    EXPECT_FALSE(widget.pageBar().isVisible());
    EXPECT_TRUE(widget.edit().hasFocus());

    QTest::keyClick(&widget.edit(), Qt::Key_G, Qt::ControlModifier);
    EXPECT_EQ(page.value(), 7);
    QTest::keyClick(&page, Qt::Key_Escape);
    EXPECT_FALSE(widget.pageBar().isVisible());
    EXPECT_EQ(widget.currentPage(), 7) << "and nothing else has happened";

    widget.openPageBar();
    page.setValue(9);
    QTest::mouseClick(widget.pageBar().findChild<QPushButton *>(), Qt::LeftButton);
    EXPECT_EQ(widget.currentPage(), 9);
}

/// Counts the times that a widget is laid out again.
class LayoutCount : public QObject
{
public:
    explicit LayoutCount(QWidget &watched) { watched.installEventFilter(this); }
    int count = 0;

protected:
    bool eventFilter(QObject *watched, QEvent *event) override
    {
        count += event->type() == QEvent::LayoutRequest ? 1 : 0;
        return QObject::eventFilter(watched, event);
    }
};

TEST(ReportViewWidget, AKeyLaysNothingOutAnew)
{
    QWidget window;
    ReportViewWidget widget(&window);
    window.show();
    widget.edit().loadPlainText(QStringLiteral("line\n").repeated(300));
    QCoreApplication::processEvents();
    LayoutCount inside(widget);
    LayoutCount around(window);
    const QString before = placeIn(widget);
    QTest::keyClicks(&widget.edit(), QStringLiteral("xy"));
    putCursor(widget.edit(), 1200);
    EXPECT_NE(placeIn(widget), before);
    EXPECT_EQ(inside.count, 0);
    EXPECT_EQ(around.count, 0);
}

TEST(ReportViewWidget, ThePlaceIsShownWholeHoweverLongItIs)
{
    ReportViewWidget widget;
    widget.resize(900, 300);
    widget.show();
    widget.setLinesPerPage([] { return 1; });
    widget.edit().loadPlainText(QStringLiteral("x\n").repeated(123'456));
    putCursor(widget.edit(), 246'910);
    EXPECT_TRUE(placeIn(widget).startsWith(QStringLiteral("Page 123456 of 123456,")));
    QCoreApplication::processEvents();
    for (const QLabel *label : {&widget.pageLabel(), &widget.lineLabel(), &widget.columnLabel()}) {
        EXPECT_GE(label->width(), label->fontMetrics().horizontalAdvance(label->text())) << label->text().toStdString();
        EXPECT_GE(label->height(), label->fontMetrics().height());
    }
}

TEST(ReportViewWidget, EveryControlHasAName)
{
    ReportViewWidget widget;
    EXPECT_FALSE(widget.edit().accessibleName().isEmpty());
    EXPECT_FALSE(widget.pageBar().page().accessibleName().isEmpty());
    for (const QLabel *label : {&widget.pageLabel(), &widget.lineLabel(), &widget.columnLabel(), &widget.zoomLabel()}) {
        EXPECT_FALSE(label->accessibleName().isEmpty());
    }
}

TEST(ReportViewWidget, TellsOfAPressOfTheMouse)
{
    ReportViewWidget widget;
    widget.resize(400, 300);
    widget.show();
    QTest::mouseClick(widget.edit().viewport(), Qt::LeftButton); // nothing is connected
    int presses = 0;
    widget.setPressHandler([&presses] { ++presses; });
    QTest::mouseClick(widget.edit().viewport(), Qt::LeftButton);
    EXPECT_EQ(presses, 1);
}

} // namespace
