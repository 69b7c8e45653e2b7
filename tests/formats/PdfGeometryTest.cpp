#include "PdfGeometry.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace
{

using kareport::FaceHeight;
using kareport::LinePlacement;
using kareport::PdfPageBox;
using kareport::pdfPageBox;
using kareport::PdfPageSetup;
using kareport::placeLines;

TEST(PdfGeometry, ABoxIsTheSheetWithoutItsMargins)
{
    struct Row
    {
        PdfPageSetup setup;
        PdfPageBox expected;
        const char *reason;
    };
    const Row rows[] = {
        {{QSize(5100, 6600), 600, QMargins()}, {612, 792, 0, 792, 612, 0}, "Letter at 600 dpi"},
        {{QSize(4961, 7016), 600, QMargins()}, {595.32F, 841.92F, 0, 841.92F, 595.32F, 0}, "A4 at 600 dpi"},
        {{QSize(5100, 6600), 600, QMargins(1270, 0, 0, 0)}, {612, 792, 36, 792, 612, 0}, "half an inch is 36 points"},
        {{QSize(5100, 6600), 600, QMargins(2540, 1270, 5080, 254)},
         {612, 792, 72, 756, 468, 7.2F},
         "each margin on its own side, from the lower left corner"},
        {{QSize(100, 200), 72, QMargins(1, 1, 1, 1)},
         {100, 200, 0.0283464567F, 199.971654F, 99.9716535F, 0.0283464567F},
         "a hundredth of a millimetre"},
        {{QSize(612, 792), 72, QMargins(-1270, -1270, -1270, -1270)},
         {612, 792, -36, 828, 648, -36},
         "negative margins reach over the edge"},
        {{QSize(612, 792), 72, QMargins(25400, 25400, 25400, 25400)},
         {612, 792, 720, 72, -108, 720},
         "margins that are wider than the sheet"},
        {{QSize(612, 792), 72, QMargins(2147483647, 0, 0, 0)},
         {612, 792, 60873552.2F, 792, 612, 0},
         "the widest margin does not overflow"},
    };
    for (const Row &row : rows) {
        const PdfPageBox box = pdfPageBox(row.setup);
        EXPECT_FLOAT_EQ(box.width, row.expected.width) << row.reason;
        EXPECT_FLOAT_EQ(box.height, row.expected.height) << row.reason;
        EXPECT_FLOAT_EQ(box.left, row.expected.left) << row.reason;
        EXPECT_FLOAT_EQ(box.top, row.expected.top) << row.reason;
        EXPECT_FLOAT_EQ(box.right, row.expected.right) << row.reason;
        EXPECT_FLOAT_EQ(box.bottom, row.expected.bottom) << row.reason;
    }
}

/// A box of 700 points' height.
constexpr PdfPageBox box{600, 800, 50, 750, 550, 50};
/// A line of 10 points is 12 points high, 8 of them above the baseline.
constexpr FaceHeight face{800, -400};

PdfPageSetup setupOf(unsigned fontSize, int linesPerPage)
{
    return {QSize(6000, 8000), 720, QMargins(), fontSize, linesPerPage};
}

TEST(PdfGeometry, LinesAreAsFarApartAsTheyAreHighOrAsTheyMustBeToFit)
{
    constexpr float closest = 700 / 93.6F;
    constexpr float longer = 700 / 960.F;
    struct Row
    {
        unsigned fontSize;
        qsizetype linesToFit;
        qsizetype lines;
        LinePlacement expected;
        const char *reason;
    };
    const Row rows[] = {
        {10, 50, 50, {10, 12, 742}, "there is room: as far apart as the face is high"},
        {10, 1, 1, {10, 12, 742}, "a page of one line"},
        {10, 60, 60, {10, 688 / 59.F, 742}, "59 steps in what the first line leaves"},
        {10, 60, 1, {10, 688 / 59.F, 742}, "a page that is not full looks like the others"},
        {10, 60, 0, {10, 688 / 59.F, 742}, "an empty page"},
        {10, 92, 92, {10, 688 / 91.F, 742}, "the closest at which they do not run into each other"},
        {10, 93, 93, {closest / 0.75F, closest, 750 - 0.8F / 0.75F * closest}, "they would: the font gives way"},
        {10, 50, 58, {10, 12, 742}, "broken lines that find room"},
        {10, 50, 80, {10 * longer, 12 * longer, 750 - 8 * longer}, "a longer page: all of it is smaller"},
        {10, 50, 117, {5, 6, 746}, "not below 5 points"},
        {4, 50, 500, {4, 4.8F, 746.8F}, "type that is smaller already stays as it is"},
        {10, 500, 500, {5, 3.75F, 746}, "nor for pages that are too long"},
        {10,
         60,
         120,
         {10 * 700 / (119 * 688 / 59.F + 12), 688 / 59.F * 700 / (119 * 688 / 59.F + 12),
          750 - 8 * 700 / (119 * 688 / 59.F + 12)},
         "close lines, and broken ones"},
        {700, 1, 1, {700, 840, 190}, "a single line that is higher than the box keeps its size"},
    };
    for (const Row &row : rows) {
        const LinePlacement placement = placeLines(row.fontSize, box, face, row.linesToFit, row.lines);
        EXPECT_FLOAT_EQ(placement.fontSize, row.expected.fontSize) << row.reason;
        EXPECT_FLOAT_EQ(placement.leading, row.expected.leading) << row.reason;
        EXPECT_FLOAT_EQ(placement.firstBaseline, row.expected.firstBaseline) << row.reason;
    }
}

TEST(PdfGeometry, AllLinesAreInTheBox)
{
    for (const int linesPerPage : {1, 2, 59, 60, 61, 72, 100, 500}) {
        for (const unsigned fontSize : {1U, 8U, 9U, 10U, 12U, 40U, 580U}) {
            for (const qsizetype lines : {qsizetype(0), qsizetype(linesPerPage), qsizetype(linesPerPage) * 3}) {
                const LinePlacement placement = placeLines(fontSize, box, face, linesPerPage, lines);
                const double ascent = double(face.ascent) / 1000 * double(placement.fontSize);
                const double descent = double(face.descent) / 1000 * double(placement.fontSize);
                const qsizetype taken = std::min(lines, placement.lines);
                const double steps = static_cast<double>(std::max<qsizetype>(taken, 1) - 1);
                const double last = double(placement.firstBaseline) - double(placement.leading) * steps;
                const auto which = testing::Message()
                                   << linesPerPage << " lines a page, " << fontSize << " points, " << lines << " lines";
                EXPECT_LE(double(placement.firstBaseline) + ascent, double(box.top) + 0.01) << which;
                EXPECT_GE(last + descent, double(box.bottom) - 0.01) << which;
                EXPECT_GE(double(placement.leading), double(placement.fontSize) * 0.749)
                    << which << ": lines run into each other";
                EXPECT_LE(placement.fontSize, float(fontSize)) << which;
            }
        }
    }
}

TEST(PdfGeometry, ABoxWithoutHeightStillGivesNumbersThatCanBeSaid)
{
    for (const float bottom : {750.F, 2000.F}) {
        PdfPageBox none = box;
        none.bottom = bottom;
        for (const qsizetype lines : {qsizetype(1), qsizetype(60), qsizetype(100000)}) {
            const LinePlacement placement = placeLines(10, none, face, 60, lines);
            EXPECT_GE(placement.fontSize, 0.0099F) << lines;
            EXPECT_GE(placement.leading, 0.0099F) << lines;
            EXPECT_LE(placement.firstBaseline, 750.F) << lines;
        }
    }
}

TEST(PdfGeometry, APageHasRoomForItsLinesOrForThoseOfAShortReport)
{
    struct Row
    {
        int linesPerPage;
        qsizetype linesOfReport;
        qsizetype expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {60, 60, 60, "a full page"},
        {60, 1, 60, "a short report is placed like a long one"},
        {60, 100000, 60, "a long report"},
        {92, 1, 92, "close, but not running into each other"},
        {93, 1, 1, "a page that is too long for its font: the report's lines are what has to fit"},
        {32000, 25, 25, "no pages are meant"},
        {32000, 0, 1, "no pages are meant, and nothing is written"},
        {32000, 100000, 32000, "more lines than even such a page has"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(kareport::linesToFit(setupOf(10, row.linesPerPage), box, face, row.linesOfReport), row.expected)
            << row.reason;
    }
}

} // namespace
