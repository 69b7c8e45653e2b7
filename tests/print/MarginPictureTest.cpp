#include "MarginPicture.h"

#include "PdfReadBack.h"

#include <QFontMetrics>
#include <QImage>
#include <QPainter>
#include <QPdfWriter>

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

TEST(MarginPicture, IsDrawnInTheColourOfThePainter)
{
    for (const QColor &colour : {QColor(Qt::red), QColor(Qt::blue)}) {
        QImage sheet = blankSheet();
        QPainter painter(&sheet);
        painter.setPen(colour);
        kareport::drawMargins(painter, QRect(500, 1000, 3000, 3000));
        painter.end();
        int marks = 0;
        for (int x = 0; x < 50; ++x) { // the top edge, left of everything else
            const QColor dot = sheet.pixelColor(x, 100);
            marks += dot == colour ? 1 : 0;
            EXPECT_TRUE(dot == colour || dot == QColor(Qt::white)) << x;
        }
        EXPECT_GT(marks, 10);
        bool hasText = false;
        for (int x = 50; x < 90; ++x) {
            for (int y = 102; y < 119; ++y) { // between two rows
                hasText = hasText || sheet.pixelColor(x, y) == colour;
            }
        }
        EXPECT_TRUE(hasText) << "the number";
    }
}

TEST(MarginPicture, EachRowThatHasRoomIsNumberedFromItsLeftEnd)
{
    struct Row
    {
        int height; ///< twips
        int rows;
        const char *reason;
    };
    // A row of 10 points is 200 twips high, and at most a dot more.
    for (const Row &row :
         {Row{3030, 15, "just as many"}, Row{3190, 15, "not quite one more"}, Row{210, 1, "one"}, Row{190, 0, "none"}})
    {
        const QTemporaryDir folder;
        const QString path = folder.filePath(QStringLiteral("a.pdf"));
        {
            QPdfWriter writer(path);
            writer.setResolution(1200);
            writer.setPageMargins(QMarginsF());
            QPainter painter(&writer);
            kareport::drawMargins(painter, QRect(500, 1000, 3000, row.height));
        }
        QFile file(path);
        ASSERT_TRUE(file.open(QIODevice::ReadOnly));
        const char *remark = row.rows == 0 ? "no word list\n" : "";
        const std::vector<PdfWord> words = PdfReadBack(file.readAll(), remark).words();
        ASSERT_EQ(words.size(), static_cast<std::size_t>(row.rows)) << row.reason;
        for (std::size_t i = 0; i < words.size(); ++i) {
            EXPECT_EQ(words[i].text, QStringLiteral("%1->>").arg(i)) << row.reason;
            EXPECT_NEAR(words[i].left, 25, 0.2) << row.reason;
            EXPECT_NEAR(words[i].top, 50 + 10.0 * static_cast<double>(i), 1.5) << row.reason;
        }
    }
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
