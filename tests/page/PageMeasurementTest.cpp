#include "PageMeasurement.h"

#include "DefaultPrinter.h"
#include "PrintQt.h"

#include <QFontDatabase>

#include <gtest/gtest.h>

namespace
{

using kareport::DefaultPrinter;
using kareport::measurePage;
using kareport::mulDiv;
using kareport::pageDevice;
using kareport::PaperSize;
using kareport::PrinterSource;

TEST(PageMeasurement, MulDivRoundsHalvesAwayFromZero)
{
    constexpr int most = 2147483647;
    struct Row
    {
        int a;
        int b;
        int c;
        int expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, 600, 2540, 0, "nothing"},
        {1000, 600, 2540, 236, "236.22"},
        {1200, 600, 2540, 283, "283.46"},
        {2000, 600, 2540, 472, "472.44"},
        {8, 600, 72, 67, "66.67"},
        {9, 600, 72, 75, "exactly 75"},
        {127, 10, 2540, 1, "a half goes up"},
        {126, 10, 2540, 0, "a little less than a half"},
        {-127, 10, 2540, -1, "a half below zero goes down"},
        {-126, 10, 2540, 0, "a little less than a half below zero"},
        {-1000, 600, 2540, -236, "-236.22"},
        {1, 1, 3, 0, "a third"},
        {2, 1, 3, 1, "two thirds"},
        {1, 3, 7, 0, "three sevenths"},
        {1, 4, 7, 1, "four sevenths"},
        {5, 1, 1, 5, "a divisor of 1"},
        {most, most, most, most, "the product needs 64 bits"},
        {-most, most, most, -most, "the product needs 64 bits"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(mulDiv(row.a, row.b, row.c), row.expected)
            << row.a << " * " << row.b << " / " << row.c << ": " << row.reason;
    }
}

TEST(PageMeasurement, CountsWhatFitsBetweenTheMargins)
{
    struct Row
    {
        QSize page;
        int resolution;
        QMargins margins;
        kareport::FontExtents font;
        int lines;
        int characters;
        const char *reason;
    };
    const QMargins usual(1000, 1000, 1200, 2000);
    const QMargins none;
    const Row rows[] = {
        {{4961, 7016}, 600, usual, {78, 0, 40}, 80, 111, "(7016-472-236)/78 = 80.9; (4961-283-236)/40 = 111.05"},
        {{7016, 4961}, 600, usual, {78, 0, 40}, 54, 162, "(4961-708)/78 = 54.5; (7016-519)/40 = 162.4"},
        {{5100, 6600}, 600, usual, {78, 0, 40}, 75, 114, "(6600-708)/78 = 75.5; (5100-519)/40 = 114.5"},
        {{4961, 7016}, 600, usual, {78, 2, 40}, 78, 111, "the leading counts with every line: 6308/80 = 78.9"},
        {{4961, 7016}, 600, none, {78, 0, 40}, 89, 124, "no margins"},
        {{1000, 1000}, 254, {1000, 1000, 1000, 1000}, {10, 0, 10}, 80, 80, "fits exactly: margins of 100 dots"},
        {{999, 999}, 254, {1000, 1000, 1000, 1000}, {10, 0, 10}, 79, 79, "one dot less is one line and character less"},
        {{1000, 1000}, 254, {0, 1000, 0, 0}, {10, 0, 10}, 90, 100, "the top margin takes lines"},
        {{1000, 1000}, 254, {0, 0, 0, 1000}, {10, 0, 10}, 90, 100, "the bottom margin takes lines"},
        {{1000, 1000}, 254, {1000, 0, 0, 0}, {10, 0, 10}, 100, 90, "the left margin takes characters"},
        {{1000, 1000}, 254, {0, 0, 1000, 0}, {10, 0, 10}, 100, 90, "the right margin takes characters"},
        {{1000, 1000}, 254, {0, -1000, 0, 0}, {10, 0, 10}, 110, 100, "a margin below 0 is not checked"},
        {{100, 100}, 254, {1000, 1000, 1000, 1000}, {30, 0, 30}, -3, -3, "-100/30 is cut towards zero"},
        {{200, 200}, 254, {1000, 1000, 1000, 1000}, {10, 0, 10}, 0, 0, "margins as large as the page"},
        {{1000, 1000}, 254, none, {1001, 0, 1001}, 0, 0, "a font larger than the page"},
    };
    for (const Row &row : rows) {
        const kareport::PageGeometry page = measurePage({row.page, row.resolution}, row.margins, row.font);
        EXPECT_EQ(page.linesPerPage, row.lines) << row.reason;
        EXPECT_EQ(page.charsPerRow, row.characters) << row.reason;
        EXPECT_EQ(page.pageSize, row.page) << row.reason;
        EXPECT_EQ(page.resolution, static_cast<unsigned>(row.resolution)) << row.reason;
    }
}

TEST(PageMeasurement, APageThatWasNotMeasuredHasTheUsualFigures)
{
    const kareport::PageGeometry page;
    EXPECT_EQ(page.pageSize, QSize(0, 0));
    EXPECT_EQ(page.resolution, 0U);
    EXPECT_EQ(page.linesPerPage, 72);
    EXPECT_EQ(page.charsPerRow, 80);
}

TEST(PageMeasurement, TheBuiltInDeviceIsTheWholeSheet)
{
    struct Row
    {
        PaperSize paper;
        int resolution;
        QSize upright;
        const char *reason;
    };
    const Row rows[] = {
        {PaperSize::A4, 600, {4961, 7016}, "210 mm = 4960.6 dots, 297 mm = 7015.7 dots"},
        {PaperSize::A3, 600, {7016, 9921}, "297 mm = 7015.7 dots, 420 mm = 9921.3 dots"},
        {PaperSize::Letter, 600, {5100, 6600}, "8.5 by 11 inches"},
        {PaperSize::Legal, 600, {5100, 8400}, "8.5 by 14 inches"},
        {PaperSize::Letter, 300, {2550, 3300}, "half the resolution"},
        {PaperSize::A4, 1200, {9921, 14031}, "210 mm = 9921.3 dots, 297 mm = 14031.5 dots"},
    };
    for (const Row &row : rows) {
        const DefaultPrinter printer = {PrinterSource::BuiltIn, row.paper, row.resolution};
        const auto portrait = pageDevice(printer, true);
        ASSERT_TRUE(portrait) << row.reason;
        EXPECT_EQ(portrait->size, row.upright) << row.reason;
        EXPECT_EQ(portrait->resolution, row.resolution) << row.reason;
        const auto landscape = pageDevice(printer, false);
        ASSERT_TRUE(landscape) << row.reason;
        EXPECT_EQ(landscape->size, row.upright.transposed()) << row.reason << ", lying";
        EXPECT_EQ(landscape->resolution, row.resolution) << row.reason << ", lying";
    }
}

TEST(PageMeasurement, AHostWithoutAPrinterHasNoPage)
{
    const DefaultPrinter none = {PrinterSource::None, PaperSize::A4, 600};
    EXPECT_FALSE(pageDevice(none, true));
    EXPECT_FALSE(pageDevice(none, false));
}

TEST(PageMeasurement, WhereNoPrinterIsInstalledTheBuiltInDeviceStandsIn)
{
    const auto device = pageDevice({}, true);
    ASSERT_TRUE(device) << "a report always has a page";
    EXPECT_GT(device->resolution, 0);
    EXPECT_GT(device->size.height(), device->size.width());
}

TEST(PageMeasurement, MeasuresAFixedPitchFace)
{
    const QString face = QStringLiteral("DejaVu Sans Mono");
    if (!QFontDatabase::hasFamily(face)) {
        GTEST_SKIP() << "the figures below are those of DejaVu Sans Mono, which is not installed";
    }
    // Of 2048 units: ascent 1901, descent 483, no leading, width 1233.
    struct Row
    {
        unsigned points;
        int resolution;
        int height;
        int width;
        const char *reason;
    };
    constexpr Row rows[] = {
        {8, 600, 62 + 16, 40, "67 dots: 62.2, 15.8 and 40.3"},
        {9, 600, 70 + 18, 45, "75 dots: 69.6, 17.7 and 45.2"},
        {12, 600, 93 + 24, 60, "100 dots: 92.8, 23.6 and 60.2"},
        {8, 1200, 123 + 31, 80, "133 dots: 123.5, 31.4 and 80.1"},
    };
    for (const Row &row : rows) {
        const kareport::FontExtents font = kareport::measureFont(face, row.points, row.resolution);
        EXPECT_EQ(font.height, row.height) << row.reason;
        EXPECT_EQ(font.averageWidth, row.width) << row.reason;
        EXPECT_EQ(font.externalLeading, 0) << row.reason;

        const kareport::FontExtents other =
            kareport::measureFont(QStringLiteral("No Such Face At All"), row.points, row.resolution);
        EXPECT_EQ(other.averageWidth, row.width) << "a face that is not installed is replaced by a fixed-pitch one";
    }
}

} // namespace
