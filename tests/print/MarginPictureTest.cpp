#include "MarginPicture.h"

#include <QFontMetrics>
#include <QImage>
#include <QPainter>

#include <gtest/gtest.h>

namespace
{

constexpr int dotsPerInch = 144;

QImage blankSheet()
{
    QImage sheet(400, 500, QImage::Format_RGB32);
    sheet.setDotsPerMeterX(qRound(dotsPerInch / 0.0254));
    sheet.setDotsPerMeterY(qRound(dotsPerInch / 0.0254));
    sheet.fill(Qt::white);
    return sheet;
}

/// The dots of a column, or row, that are not white.
int marksInRow(const QImage &sheet, int y, int from, int to)
{
    int marks = 0;
    for (int x = from; x < to; ++x) {
        marks += sheet.pixelColor(x, y) == QColor(Qt::white) ? 0 : 1;
    }
    return marks;
}

int marksInColumn(const QImage &sheet, int x, int from, int to)
{
    int marks = 0;
    for (int y = from; y < to; ++y) {
        marks += sheet.pixelColor(x, y) == QColor(Qt::white) ? 0 : 1;
    }
    return marks;
}

TEST(MarginPicture, DrawsEdgesAndRows)
{
    QImage sheet = blankSheet();
    QPainter painter(&sheet);
    painter.setPen(Qt::red);
    const QFont font = painter.font();
    // 500 twips are 50 dots here; the rectangle is 50, 100, 300 x 300 dots.
    kareport::drawMargins(painter, QRect(500, 1000, 3000, 3000));
    EXPECT_EQ(painter.pen().color(), QColor(Qt::red));
    EXPECT_EQ(painter.pen().style(), Qt::SolidLine) << "put back";
    EXPECT_EQ(painter.font(), font);
    painter.end();

    EXPECT_GT(marksInRow(sheet, 100, 0, 50), 10) << "top: across the whole sheet, dotted";
    EXPECT_LT(marksInRow(sheet, 100, 0, 50), 50);
    EXPECT_GT(marksInRow(sheet, 400, 0, 50), 10) << "bottom";
    EXPECT_GT(marksInColumn(sheet, 50, 0, 100), 20) << "left";
    EXPECT_GT(marksInColumn(sheet, 350, 0, 100), 20) << "right";
    EXPECT_EQ(marksInRow(sheet, 50, 60, 340), 0) << "nothing above";
    EXPECT_EQ(marksInRow(sheet, 450, 60, 340), 0) << "nothing below";
    // 10 points are 20 dots: a row each from the top, drawn to the right of the left margin only.
    EXPECT_GT(marksInRow(sheet, 120, 120, 340), 60) << "row 1";
    EXPECT_EQ(marksInRow(sheet, 120, 0, 49), 0) << "not in the left margin";
}

TEST(MarginPicture, ARectangleLowerThanARowHasEdgesOnly)
{
    QImage sheet = blankSheet();
    QPainter painter(&sheet);
    kareport::drawMargins(painter, QRect(500, 1000, 3000, 100));
    painter.end();
    EXPECT_GT(marksInRow(sheet, 110, 0, 50), 10) << "bottom";
    EXPECT_EQ(marksInRow(sheet, 105, 60, 340), 0) << "no number";
}

TEST(MarginPicture, APainterThatDoesNotPaintIsLeftAlone)
{
    QPainter idle;
    kareport::drawMargins(idle, QRect(500, 1000, 3000, 3000));
    EXPECT_FALSE(idle.isActive());
}

} // namespace
