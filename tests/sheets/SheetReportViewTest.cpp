#include "SheetReport.h"

#include "FindBar.h"
#include "PageBar.h"
#include "PlaceFields.h"
#include "ReportCommandIds.h"
#include "SheetLayout.h"

#include <QApplication>
#include <QComboBox>
#include <QLabel>
#include <QLineEdit>
#include <QScrollBar>
#include <QSpinBox>
#include <QToolButton>
#include <QWheelEvent>

#include <gtest/gtest.h>

namespace
{

using kareport::SheetView;
using Shows = kareport::SheetReportView::Shows;

TEST(SheetReportView, ShowsTextSheetsOrBoth)
{
    SheetReport shown;
    shown.writePages(5, 60);
    EXPECT_TRUE(shown.edit().isVisible());
    shown.show(Shows::Sheets);
    EXPECT_FALSE(shown.edit().isVisible());
    EXPECT_TRUE(shown.sheets().isVisible());
    EXPECT_EQ(shown.sheets().count(), 5);
    shown.show(Shows::Both);
    EXPECT_TRUE(shown.edit().isVisible());
    EXPECT_TRUE(shown.sheets().isVisible());
    EXPECT_GT(shown.edit().width(), 200);
    EXPECT_GT(shown.sheets().width(), 100);
    shown.show(Shows::Text);
    EXPECT_TRUE(shown.edit().isVisible());
    EXPECT_FALSE(shown.sheets().isVisible());
    EXPECT_EQ(shown.view().sheets().layout(), nullptr) << "nothing is found while nothing is shown";
}

TEST(SheetReportView, TheKeyboardIsWhereTheReportIsShown)
{
    SheetReport shown;
    shown.writePages(3, 60);
    shown.window().window()->activateWindow();
    ASSERT_TRUE(waitUntil([&shown] { return shown.window().isActiveWindow(); }));
    shown.edit().setFocus();
    shown.show(Shows::Sheets);
    EXPECT_TRUE(shown.sheets().hasFocus());
    shown.window().openFindBar();
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
    EXPECT_TRUE(shown.sheets().hasFocus()) << "the find bar gives it back to the sheets";
    QTest::keyClick(&shown.sheets(), Qt::Key_G, Qt::ControlModifier);
    EXPECT_TRUE(shown.window().pageBar().isVisible());
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
    EXPECT_TRUE(shown.sheets().hasFocus());
    shown.show(Shows::Text);
    EXPECT_TRUE(shown.edit().hasFocus());
}

TEST(SheetReportView, AClickPutsTheCursorThere)
{
    SheetReport shown;
    shown.writePages(5, 60);
    shown.show(Shows::Sheets);
    const QString text = shown.edit().document()->toPlainText();
    const int wanted = static_cast<int>(text.indexOf(QStringLiteral("line 7 of page 1"))) + 5;
    shown.sheets().setCursorPlace(wanted, wanted, true);
    const QPoint place = shown.sheets().cursorRect().center().toPoint();
    shown.sheets().setCursorPlace(0, 0, false);
    QTest::mouseClick(shown.sheets().viewport(), Qt::LeftButton, Qt::NoModifier, place);
    EXPECT_EQ(shown.edit().textCursor().position(), wanted);
    QTest::mouseClick(shown.sheets().viewport(), Qt::LeftButton, Qt::ShiftModifier, place + QPoint(0, 60));
    EXPECT_EQ(shown.edit().textCursor().anchor(), wanted);
    EXPECT_GT(shown.edit().textCursor().position(), wanted + 20) << "with Shift the selection goes there";
    QTest::mouseDClick(shown.sheets().viewport(), Qt::LeftButton, Qt::NoModifier, place - QPoint(8, 0));
    EXPECT_EQ(shown.edit().textCursor().selectedText(), QStringLiteral("line"));
    const QPoint beside(3, place.y());
    QTest::mouseClick(shown.sheets().viewport(), Qt::LeftButton, Qt::NoModifier, beside);
    EXPECT_EQ(shown.edit().textCursor().selectedText(), QStringLiteral("line")) << "beside the sheet nothing happens";
}

TEST(SheetReportView, TheSheetWithTheCursorIsMarkedAndShown)
{
    SheetReport shown;
    shown.writePages(20, 60);
    shown.show(Shows::Both);
    EXPECT_EQ(shown.sheets().current(), 0);
    shown.window().goToPage(12);
    EXPECT_EQ(shown.sheets().current(), 11);
    EXPECT_TRUE(shown.sheets().sheetRect(11).intersects(shown.sheets().viewport()->rect()));
    EXPECT_TRUE(QRectF(shown.sheets().viewport()->rect()).contains(shown.sheets().cursorRect().center()));
    EXPECT_EQ(shown.thumbnails().current(), 11);
    EXPECT_TRUE(shown.thumbnails().viewport()->rect().contains(shown.thumbnails().sheetRect(11).center()));
    const QImage image = shown.sheets().viewport()->grab().toImage();
    const QRect rect = shown.sheets().sheetRect(11);
    const QColor edge = image.pixelColor(rect.left() - 1, std::max(rect.top(), 0) + 10);
    EXPECT_EQ(edge, shown.sheets().palette().color(QPalette::Highlight)) << "its edge";
}

TEST(SheetReportView, KeysScroll)
{
    SheetReport shown;
    shown.writePages(20, 60);
    shown.show(Shows::Sheets);
    SheetView &sheets = shown.sheets();
    QTest::keyClick(&sheets, Qt::Key_End);
    EXPECT_EQ(sheets.verticalScrollBar()->value(), sheets.verticalScrollBar()->maximum());
    QTest::keyClick(&sheets, Qt::Key_Home);
    EXPECT_EQ(sheets.verticalScrollBar()->value(), 0);
    sheets.setFit(SheetView::Fit::Page);
    EXPECT_EQ(sheets.shownSheet(), 0);
    QTest::keyClick(&sheets, Qt::Key_PageDown);
    EXPECT_EQ(sheets.shownSheet(), 1) << "a whole sheet";
    QTest::keyClick(&sheets, Qt::Key_PageUp);
    EXPECT_EQ(sheets.shownSheet(), 0);
    const int before = sheets.verticalScrollBar()->value();
    QTest::keyClick(&sheets, Qt::Key_Down);
    EXPECT_GT(sheets.verticalScrollBar()->value(), before);
}

void turnWheel(QWidget &widget, int delta, QPoint place)
{
    QWheelEvent event(place, widget.mapToGlobal(place), QPoint(), QPoint(0, delta), Qt::NoButton, Qt::ControlModifier,
                      Qt::NoScrollPhase, false);
    QApplication::sendEvent(&widget, &event);
}

TEST(SheetReportView, ThePageBarGoesToSheets)
{
    SheetReport shown;
    writeLines(shown.report, 2000); // lines that flow
    shown.report.UpdateAllViews(nullptr, 0, nullptr);
    shown.show(Shows::Sheets);
    QTest::keyClick(&shown.sheets(), Qt::Key_G, Qt::ControlModifier);
    kareport::PageBar &bar = shown.window().pageBar();
    ASSERT_TRUE(bar.isVisible());
    EXPECT_EQ(bar.page().maximum(), shown.sheets().count());
    bar.page().selectAll();
    QTest::keyClicks(&bar.page(), QStringLiteral("9"));
    QTest::keyClick(&bar.page(), Qt::Key_Return);
    EXPECT_EQ(shown.sheets().shownSheet(), 8);
    EXPECT_EQ(shown.edit().textCursor().position(), 0) << "the cursor stays";
}

TEST(SheetReportView, ZoomsAndFits)
{
    SheetReport shown;
    shown.writePages(20, 60);
    shown.show(Shows::Sheets);
    SheetView &sheets = shown.sheets();
    const QRect window = sheets.viewport()->rect();
    EXPECT_EQ(sheets.fit(), SheetView::Fit::Width) << "at first";
    EXPECT_EQ(sheets.sheetRect(0).width(), window.width() - 24);
    sheets.setFit(SheetView::Fit::Page);
    EXPECT_LE(sheets.sheetRect(0).height(), window.height());
    EXPECT_GE(sheets.sheetRect(0).height(), window.height() - 26);
    EXPECT_EQ(sheets.sheetRect(0).top(), 12) << "all of it, and nothing of the next one";
    sheets.setZoomPercent(100);
    EXPECT_EQ(sheets.sheetRect(0).width(), qRound(210 / 25.4 * sheets.logicalDpiX())) << "as large as the paper";
    turnWheel(*sheets.viewport(), 120, window.center());
    EXPECT_EQ(sheets.zoomPercent(), 125);
    QTest::keyClick(&sheets, Qt::Key_Minus, Qt::ControlModifier);
    EXPECT_EQ(sheets.zoomPercent(), 100);
    sheets.setZoomPercent(100000);
    EXPECT_EQ(sheets.zoomPercent(), 500);
    sheets.setZoomPercent(1);
    EXPECT_EQ(sheets.zoomPercent(), 10);
    EXPECT_EQ(shown.edit().zoomPercent(), 100) << "that of the text is its own";
    sheets.setZoomPercent(100);
    sheets.goToSheet(12);
    sheets.setZoomPercent(50);
    EXPECT_EQ(sheets.shownSheet(), 12) << "zooming keeps the place";
    sheets.setFit(SheetView::Fit::Width);
    EXPECT_EQ(sheets.shownSheet(), 12);
    shown.window().resize(500, 600);
    QCoreApplication::processEvents();
    EXPECT_EQ(sheets.shownSheet(), 12) << "and so does a window that gets smaller";
    EXPECT_EQ(sheets.sheetRect(12).width(), sheets.viewport()->width() - 24);
}

TEST(SheetReportView, TheCommandsOfZoomAreThoseOfWhatIsShown)
{
    SheetReport shown;
    shown.writePages(3, 60);
    shown.show(Shows::Sheets);
    shown.sheets().setZoomPercent(100);
    EXPECT_TRUE(shown.view().runCommand(kareport::zoomInCommand));
    EXPECT_EQ(shown.sheets().zoomPercent(), 125);
    EXPECT_EQ(shown.edit().zoomPercent(), 100);
    EXPECT_TRUE(shown.view().runCommand(kareport::zoomResetCommand));
    EXPECT_EQ(shown.sheets().zoomPercent(), 100);
    shown.show(Shows::Text);
    EXPECT_TRUE(shown.view().runCommand(kareport::zoomInCommand));
    EXPECT_EQ(shown.edit().zoomPercent(), 110);
}

TEST(SheetReportView, FollowsEditsAndUndo)
{
    SheetReport shown;
    writeLines(shown.report, 250);
    shown.report.UpdateAllViews(nullptr, 0, nullptr);
    shown.show(Shows::Both);
    const int before = shown.sheets().count();
    const int linesOfSheet = shown.report.GetLinesPerPage();
    QTextCursor cursor(shown.edit().document());
    cursor.insertText(QStringLiteral("more\n").repeated(linesOfSheet));
    ASSERT_TRUE(shown.settle());
    EXPECT_EQ(shown.sheets().count(), before + 1);
    shown.edit().undo();
    ASSERT_TRUE(shown.settle());
    EXPECT_EQ(shown.sheets().count(), before);
}

TEST(SheetReportView, FollowsTheReportAndKeepsThePlace)
{
    SheetReport shown;
    writeLines(shown.report, 2000);
    shown.report.UpdateAllViews(nullptr, 0, nullptr);
    shown.show(Shows::Sheets);
    const int before = shown.sheets().count();
    shown.sheets().goToSheet(8);
    const int value = shown.sheets().verticalScrollBar()->value();
    writeLines(shown.report, 1000);
    shown.report.UpdateAllViews(nullptr, 0, nullptr);
    ASSERT_TRUE(shown.settle());
    EXPECT_GT(shown.sheets().count(), before + 8);
    EXPECT_EQ(shown.sheets().verticalScrollBar()->value(), value);
    EXPECT_EQ(shown.sheets().shownSheet(), 8);
}

TEST(SheetReportView, FollowsThePageSetup)
{
    AnsweredPrinting printing;
    SheetReport shown;
    writeLines(shown.report, 250);
    shown.report.UpdateAllViews(nullptr, 0, nullptr);
    shown.show(Shows::Sheets);
    const int before = shown.sheets().count();
    printing.changeSetup = [](kareport::PageSetup &setup) {
        setup.portrait = false;
        setup.margins = QMargins(1000, 5000, 1000, 5000);
    };
    shown.view().OnPageSetup();
    ASSERT_TRUE(shown.settle());
    EXPECT_GT(shown.sheets().count(), before);
    EXPECT_GT(shown.sheets().sheetRect(0).width(), shown.sheets().sheetRect(0).height()) << "it lies";
}

/// How many points of a picture have a color.
int pointsOf(const QImage &image, const QColor &color)
{
    int points = 0;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            points += image.pixelColor(x, y) == color ? 1 : 0;
        }
    }
    return points;
}

TEST(SheetReportView, WhatIsFoundIsMarked)
{
    const QColor mark(255, 224, 102);
    SheetReport shown;
    shown.writePages(3, 60);
    shown.show(Shows::Sheets);
    EXPECT_EQ(pointsOf(shown.sheets().viewport()->grab().toImage(), mark), 0);
    shown.window().openFindBar();
    shown.window().findBar().field().setText(QStringLiteral("page 2"));
    QCoreApplication::processEvents();
    EXPECT_EQ(shown.sheets().current(), 1) << "the first match is selected, and its sheet shown";
    const int marked = pointsOf(shown.sheets().viewport()->grab().toImage(), mark);
    EXPECT_GT(marked, 500);
    shown.window().findBar().close();
    EXPECT_EQ(pointsOf(shown.sheets().viewport()->grab().toImage(), mark), 0);
}

TEST(SheetReportView, SmallPicturesLeadToTheirSheets)
{
    SheetReport shown;
    shown.writePages(20, 60);
    shown.show(Shows::Sheets);
    QTest::mouseClick(shown.thumbnails().viewport(), Qt::LeftButton, Qt::NoModifier,
                      shown.thumbnails().sheetRect(1).center());
    EXPECT_EQ(shown.sheets().shownSheet(), 1);
    EXPECT_EQ(shown.thumbnails().shown(), 1);
    QTest::keyClick(&shown.thumbnails(), Qt::Key_Down);
    EXPECT_EQ(shown.sheets().shownSheet(), 2);
    QTest::keyClick(&shown.thumbnails(), Qt::Key_End);
    EXPECT_EQ(shown.sheets().shownSheet(), 19);
    EXPECT_TRUE(shown.thumbnails().viewport()->rect().contains(shown.thumbnails().sheetRect(19).center()));
    shown.sheets().goToSheet(4);
    EXPECT_EQ(shown.thumbnails().shown(), 4) << "and follow them";
    shown.view().setShowsThumbnails(false);
    EXPECT_FALSE(shown.thumbnails().isVisible());
}

TEST(SheetReportView, PageAndZoomAreShownAndChosenBelow)
{
    SheetReport shown;
    shown.writePages(20, 60);
    QCoreApplication::processEvents();
    kareport::PageField &page = shown.view().pageField();
    kareport::ZoomField &zoom = shown.view().zoomField();
    EXPECT_FALSE(shown.window().pageLabel().isVisible());
    EXPECT_EQ(page.page().value(), 1);
    EXPECT_EQ(page.pages().text(), QStringLiteral("of 20"));
    QTest::mouseClick(&page.next(), Qt::LeftButton);
    EXPECT_EQ(shown.window().currentPage(), 2) << "of the text";
    page.page().setFocus();
    page.page().selectAll();
    QTest::keyClicks(&page.page(), QStringLiteral("7"));
    QTest::keyClick(&page.page(), Qt::Key_Return);
    EXPECT_EQ(shown.window().currentPage(), 7);
    QTest::mouseClick(&zoom.larger(), Qt::LeftButton);
    EXPECT_EQ(shown.edit().zoomPercent(), 110);
    EXPECT_EQ(zoom.zoom().currentText(), QStringLiteral("110 %"));
    EXPECT_EQ(zoom.zoom().findData(kareport::ZoomField::FitPage), -1) << "a text fits no page";

    shown.show(Shows::Sheets);
    EXPECT_EQ(page.page().value(), 7) << "the sheet with the cursor is shown";
    QTest::mouseClick(&page.previous(), Qt::LeftButton);
    EXPECT_EQ(shown.sheets().shownSheet(), 5);
    Q_EMIT zoom.zoom().activated(zoom.zoom().findData(kareport::ZoomField::FitPage));
    EXPECT_EQ(shown.sheets().fit(), SheetView::Fit::Page);
    zoom.zoom().lineEdit()->setFocus();
    zoom.zoom().lineEdit()->selectAll();
    QTest::keyClicks(zoom.zoom().lineEdit(), QStringLiteral("150"));
    QTest::keyClick(zoom.zoom().lineEdit(), Qt::Key_Return);
    EXPECT_EQ(shown.sheets().zoomPercent(), 150);
    EXPECT_EQ(shown.edit().zoomPercent(), 110);
}

TEST(SheetReportView, TwoReportsHaveRoomSideBySide)
{
    constexpr int usualWidth = 1000; // of the main window
    SheetReport shown;
    shown.writePages(20, 60);
    QCoreApplication::processEvents();
    EXPECT_LT(shown.window().minimumSizeHint().width(), usualWidth / 2);
    shown.show(Shows::Both);
    EXPECT_LT(shown.window().minimumSizeHint().width(), usualWidth / 2);
}

TEST(SheetReportView, TheCursorStandsBeforeItsCharacter)
{
    SheetReport shown;
    shown.writePages(2, 60);
    shown.show(Shows::Sheets);
    shown.sheets().setFocus();
    // At the end of a line, where no letter is near.
    QTextCursor cursor(shown.edit().document()->findBlockByNumber(4));
    cursor.movePosition(QTextCursor::EndOfBlock);
    shown.edit().setTextCursor(cursor);
    QCoreApplication::processEvents();
    const QRectF place = shown.sheets().cursorRect();
    ASSERT_GT(place.height(), 4);
    const QImage drawn = shown.sheets().viewport()->grab().toImage();
    const QColor mark = shown.sheets().palette().color(QPalette::Highlight);
    const int y = qRound(place.center().y());
    const int x = qRound(place.left());
    ASSERT_TRUE(drawn.rect().contains(x, y));
    EXPECT_EQ(drawn.pixelColor(x - 1, y), mark);
    EXPECT_NE(drawn.pixelColor(x, y), mark) << "the character that follows is not covered";
}

TEST(SheetReportView, AnEmptyReportSaysSo)
{
    SheetReport shown;
    shown.show(Shows::Sheets);
    EXPECT_EQ(shown.sheets().count(), 0);
    EXPECT_EQ(shown.sheets().message(), QStringLiteral("This report is empty."));
    QTest::keyClick(&shown.sheets(), Qt::Key_PageDown);
    QTest::mouseClick(shown.sheets().viewport(), Qt::LeftButton);
    shown.sheets().viewport()->grab();
}

/// Counts the sheets that it draws.
class CountingColumn : public kareport::SheetColumn
{
public:
    using SheetColumn::SheetColumn;
    int drawn = 0;

protected:
    QSize sheetSize() const override { return {300, 424}; }
    int gap() const override { return 10; }
    void drawSheet(QPainter &, kareport::SheetLayout &, int, const QRect &) override { ++drawn; }
};

TEST(SheetReportView, OnlyWhatIsShownIsDrawn)
{
    SheetReport shown;
    writeLines(shown.report, 40'000);
    shown.report.UpdateAllViews(nullptr, 0, nullptr);
    shown.show(Shows::Sheets);
    ASSERT_GT(shown.sheets().count(), 400);
    CountingColumn column([&shown] { return shown.view().sheets().layout(); });
    column.resize(400, 600);
    column.show();
    column.sheetsChanged();
    column.verticalScrollBar()->setValue(column.verticalScrollBar()->maximum() / 2);
    QCoreApplication::processEvents();
    column.drawn = 0;
    column.viewport()->repaint();
    EXPECT_LE(column.drawn, 3);
    column.drawn = 0;
    column.viewport()->repaint(QRect(0, 0, 400, 5));
    EXPECT_LE(column.drawn, 1) << "a strip that has come into the window";
}

TEST(SheetReportView, CanBeClosedWhileItsFieldsHaveTheKeyboard)
{
    SheetReport shown;
    shown.writePages(3, 60);
    shown.show(Shows::Both);
    shown.view().pageField().page().setFocus();
    QTest::keyClicks(&shown.view().pageField().page(), QStringLiteral("2"));
    SUCCEED() << "and it goes with what was typed into it";
}

} // namespace
