#include "UFormatBearing.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

#include <limits>
#include <numbers>

namespace
{

constexpr double pi = std::numbers::pi;
constexpr unsigned dms = 0;
constexpr unsigned deg = 1;
constexpr unsigned gon = 2;
constexpr qint16 circle = 0;
constexpr qint16 quadrant = 1;

/// A bearing in degrees, minutes and seconds as a value.
constexpr double at(double degrees, double minutes = 0, double seconds = 0)
{
    return (degrees + minutes / 60 + seconds / 3600) * pi / 180;
}

constexpr double atGon(double value)
{
    return value * pi / 200;
}

struct Row
{
    double value;
    QStringView expected;
    const char *reason;
};

template <std::size_t size>
void expectBearings(const UFormatBearing &format, const Row (&rows)[size])
{
    for (const Row &row : rows) {
        QString text = QStringLiteral("replaced");
        format.ConvertToDisplayString(row.value, text);
        EXPECT_EQ(text, row.expected.toString()) << row.reason;
    }
}

TEST(UFormatBearing, ThatIsNotFiniteGivesNothing)
{
    constexpr Row rows[] = {
        {std::numeric_limits<double>::infinity(), u"", "infinite"},
        {-std::numeric_limits<double>::infinity(), u"", "infinite, negative"},
        {std::numeric_limits<double>::quiet_NaN(), u"", "not a number"},
    };
    for (const unsigned unit : {dms, deg, gon}) {
        for (const qint16 style : {circle, quadrant}) {
            for (const unsigned reference : {0U, 1U}) {
                expectBearings(UFormatBearing(unit, style, 0, 1, reference), rows);
            }
        }
    }
}

TEST(UFormatBearing, ThatOverflowsInItsUnitIsNotFinite)
{
    constexpr double largest = std::numeric_limits<double>::max();
    constexpr Row rows[] = {
        {largest, u"", "the largest number"},
        {-largest, u"", "the largest number below zero"},
        {1e307, u"", "beyond a double when it is turned into degrees"},
    };
    for (const unsigned unit : {dms, deg, gon}) {
        expectBearings(UFormatBearing(unit, circle, 0, 1, 0), rows);
        expectBearings(UFormatBearing(unit, quadrant, 9, 0, 1), rows);
    }
}

TEST(UFormatBearing, WholeCircleInDms)
{
    constexpr Row rows[] = {
        {0, u"000°00'00\"", "north"},
        {-0.0, u"000°00'00\"", "zero with a sign"},
        {at(5, 6, 7), u"005°06'07\"", "one digit each"},
        {at(45), u"045°00'00\"", "two digits"},
        {at(123, 45, 56), u"123°45'56\"", "three digits"},
        {at(359, 59, 59), u"359°59'59\"", "the last second"},
        {at(359, 59, 59.4), u"359°59'59\"", "rounds down"},
        {at(359, 59, 59.6), u"000°00'00\"", "a whole circle is zero"},
        {at(29, 59, 59.9), u"030°00'00\"", "never 60 seconds, nor 60 minutes"},
        {at(29, 58, 59.9), u"029°59'00\"", "never 60 seconds"},
        {at(30), u"030°00'00\"", "a double a little below 30 degrees"},
        {2 * pi, u"000°00'00\"", "one circle"},
        {at(365), u"005°00'00\"", "more than a circle"},
        {at(1085), u"005°00'00\"", "three circles more"},
        {at(-5), u"355°00'00\"", "negative"},
        {at(-365), u"355°00'00\"", "negative, more than a circle"},
        {-2 * pi, u"000°00'00\"", "one circle back"},
        {-1e-20, u"000°00'00\"", "a trace below zero becomes a whole circle, which is zero"},
        {at(0, 0, -0.4), u"000°00'00\"", "rounds up to a whole circle"},
        {at(0, 0, -0.6), u"359°59'59\"", "does not"},
    };
    expectBearings(UFormatBearing(dms, circle, 0, 1, 0), rows);
}

TEST(UFormatBearing, QuadrantsInDms)
{
    constexpr Row rows[] = {
        {0, u"N 00°00'00\" E", "north counts to the first quadrant"},
        {at(0, 0, 1), u"N 00°00'01\" E", "just past north"},
        {at(45, 6, 7), u"N 45°06'07\" E", "first quadrant"},
        {at(89, 59, 59), u"N 89°59'59\" E", "just before east"},
        {pi / 2, u"N 90°00'00\" E", "east counts to the first quadrant"},
        {at(90, 0, 0.4), u"N 90°00'00\" E", "east as it is counted"},
        {at(90, 0, 1), u"S 89°59'59\" E", "just past east"},
        {at(134, 53, 53), u"S 45°06'07\" E", "second quadrant"},
        {pi, u"S 00°00'00\" E", "south counts to the second quadrant"},
        {at(180, 0, 1), u"S 00°00'01\" W", "just past south"},
        {at(225, 6, 7), u"S 45°06'07\" W", "third quadrant"},
        {3 * pi / 2, u"S 90°00'00\" W", "west counts to the third quadrant"},
        {at(270, 0, 1), u"N 89°59'59\" W", "just past west"},
        {at(314, 53, 53), u"N 45°06'07\" W", "fourth quadrant"},
        {at(359, 59, 59), u"N 00°00'01\" W", "just before north"},
        {at(359, 59, 59.6), u"N 00°00'00\" E", "a whole circle is zero"},
        {at(-45), u"N 45°00'00\" W", "negative"},
        {at(405), u"N 45°00'00\" E", "more than a circle"},
        {at(30, 59, 59.9), u"N 31°00'00\" E", "never 60 seconds"},
        {at(149, 0, 0.1), u"S 31°00'00\" E", "never 60 seconds, counted back from south"},
    };
    expectBearings(UFormatBearing(dms, quadrant, 0, 1, 0), rows);
}

TEST(UFormatBearing, CountedFromSouth)
{
    constexpr Row circles[] = {
        {0, u"180°00'00\"", "half a circle is added"},
        {at(90), u"270°00'00\"", "east"},
        {pi, u"000°00'00\"", "south: a whole circle is zero"},
        {at(270), u"090°00'00\"", "west"},
        {at(-90), u"090°00'00\"", "negative"},
        {-pi, u"000°00'00\"", "half a circle back"},
    };
    expectBearings(UFormatBearing(dms, circle, 0, 1, 1), circles);
    constexpr Row quadrants[] = {
        {0, u"S 00°00'00\" E", "half a circle is added"},
        {at(45), u"S 45°00'00\" W", "first quadrant"},
        {pi / 2, u"S 90°00'00\" W", "east"},
        {at(135), u"N 45°00'00\" W", "second quadrant"},
        {pi, u"N 00°00'00\" E", "south"},
        {at(225), u"N 45°00'00\" E", "third quadrant"},
        {at(315), u"S 45°00'00\" E", "fourth quadrant"},
    };
    expectBearings(UFormatBearing(dms, quadrant, 0, 1, 1), quadrants);
    constexpr Row gons[] = {{atGon(50), u"250g", "half a circle is 200 gon"}};
    expectBearings(UFormatBearing(gon, circle, 0, 1, 1), gons);
}

TEST(UFormatBearing, HalvesRoundUp)
{
    // The values give exactly these halves when they are turned into degrees or gon.
    constexpr Row degrees[] = {
        {at(0.5), u"1°", "0.5"},
        {at(1.5), u"2°", "1.5"},
        {at(2.5), u"3°", "2.5, not to the even digit"},
        {at(-0.5), u"0°", "359.5 becomes a whole circle"},
    };
    expectBearings(UFormatBearing(deg, circle, 0, 0, 0), degrees);
    constexpr Row seconds[] = {
        {2.42406840554768e-06, u"0°00'01\"", "0.5 seconds"},
        {7.27220521664304e-06, u"0°00'02\"", "1.5 seconds"},
        {1.21203420277384e-05, u"0°00'03\"", "2.5 seconds, not to the even digit"},
    };
    expectBearings(UFormatBearing(dms, circle, 0, 0, 0), seconds);
    constexpr Row gons[] = {{atGon(0.5), u"1g", "0.5 gon"}};
    expectBearings(UFormatBearing(gon, circle, 0, 0, 0), gons);
}

TEST(UFormatBearing, DegreesAndGon)
{
    constexpr Row degrees[] = {
        {at(5.25), u"005.25°", "padded to three digits"},
        {at(359.994), u"359.99°", "rounds down"},
        {at(359.996), u"000.00°", "a whole circle is zero"},
        {at(-90), u"270.00°", "negative"},
    };
    expectBearings(UFormatBearing(deg, circle, 2, 1, 0), degrees);
    constexpr Row degreeQuadrants[] = {
        {at(5.25), u"N 05.25° E", "padded to two digits"}, {pi / 2, u"N 90.00° E", "east"},
        {at(90.01), u"S 89.99° E", "just past east"},      {pi, u"S 00.00° E", "south"},
        {at(180.01), u"S 00.01° W", "just past south"},    {3 * pi / 2, u"S 90.00° W", "west"},
        {at(270.01), u"N 89.99° W", "just past west"},     {at(359.996), u"N 00.00° E", "a whole circle is zero"},
    };
    expectBearings(UFormatBearing(deg, quadrant, 2, 1, 0), degreeQuadrants);
    constexpr Row gons[] = {
        {0, u"000.0000g", "north"},
        {atGon(5.25), u"005.2500g", "padded to three digits"},
        {pi / 2, u"100.0000g", "east is 100"},
        {atGon(399.99996), u"000.0000g", "a whole circle is 400"},
        {atGon(450), u"050.0000g", "more than a circle"},
        {atGon(-50), u"350.0000g", "negative"},
    };
    expectBearings(UFormatBearing(gon, circle, 4, 1, 0), gons);
    constexpr Row gonQuadrants[] = {
        {atGon(5), u"N 005g E", "padded to three digits in either style"},
        {pi / 2, u"N 100g E", "east"},
        {atGon(101), u"S 099g E", "just past east"},
        {pi, u"S 000g E", "south"},
        {atGon(201), u"S 001g W", "just past south"},
        {3 * pi / 2, u"S 100g W", "west"},
        {atGon(301), u"N 099g W", "just past west"},
        {atGon(399.6), u"N 000g E", "a whole circle is zero"},
    };
    expectBearings(UFormatBearing(gon, quadrant, 0, 1, 0), gonQuadrants);
}

TEST(UFormatBearing, WithoutPadding)
{
    constexpr Row dmsCircle[] = {
        {0, u"0°00'00\"", "north"},
        {at(5, 6, 7), u"5°06'07\"", "minutes and seconds keep two digits"},
        {at(123), u"123°00'00\"", "three digits"},
    };
    expectBearings(UFormatBearing(dms, circle, 0, 0, 0), dmsCircle);
    constexpr Row dmsQuadrant[] = {{at(5, 6, 7), u"N 5°06'07\" E", "one digit"}, {at(45), u"N 45°00'00\" E", "two"}};
    expectBearings(UFormatBearing(dms, quadrant, 0, 0, 0), dmsQuadrant);
    constexpr Row degCircle[] = {{at(0.25), u"0.25°", "a zero before the point"}, {at(5.05), u"5.05°", "one digit"}};
    expectBearings(UFormatBearing(deg, circle, 2, 0, 0), degCircle);
    constexpr Row degQuadrant[] = {{at(175), u"S 5.0° E", "one digit"}};
    expectBearings(UFormatBearing(deg, quadrant, 1, 0, 0), degQuadrant);
    constexpr Row gonCircle[] = {{atGon(5), u"5g", "one digit"}, {atGon(50), u"50g", "two digits"}};
    expectBearings(UFormatBearing(gon, circle, 0, 0, 0), gonCircle);
    constexpr Row gonQuadrant[] = {{atGon(395), u"N 5g W", "one digit"}};
    expectBearings(UFormatBearing(gon, quadrant, 0, 0, 0), gonQuadrant);
}

TEST(UFormatBearing, EveryNumberOfDecimals)
{
    struct DecimalsRow
    {
        QStringView dmsText;
        QStringView degText;
        QStringView gonText;
    };
    // One radian is 57°17'44.80624709636", 57.295779513082°, 63.661977236758 gon.
    constexpr DecimalsRow rows[] = {
        {u"057°17'45\"", u"057°", u"064g"},
        {u"057°17'44.8\"", u"057.3°", u"063.7g"},
        {u"057°17'44.81\"", u"057.30°", u"063.66g"},
        {u"057°17'44.806\"", u"057.296°", u"063.662g"},
        {u"057°17'44.8062\"", u"057.2958°", u"063.6620g"},
        {u"057°17'44.80625\"", u"057.29578°", u"063.66198g"},
        {u"057°17'44.806247\"", u"057.295780°", u"063.661977g"},
        {u"057°17'44.8062471\"", u"057.2957795°", u"063.6619772g"},
        {u"057°17'44.80624710\"", u"057.29577951°", u"063.66197724g"},
        {u"057°17'44.806247096\"", u"057.295779513°", u"063.661977237g"},
    };
    for (qint32 decimals = 0; decimals <= 9; ++decimals) {
        const DecimalsRow &row = rows[decimals];
        expectBearings(UFormatBearing(dms, circle, decimals, 1, 0), {{1.0, row.dmsText, "degrees, minutes, seconds"}});
        expectBearings(UFormatBearing(deg, circle, decimals, 1, 0), {{1.0, row.degText, "degrees"}});
        expectBearings(UFormatBearing(gon, circle, decimals, 1, 0), {{1.0, row.gonText, "gon"}});
    }
}

TEST(UFormatBearing, DecimalsOfSecondsNeverShow60)
{
    constexpr Row rows[] = {
        {at(10, 0, 1.05), u"010°00'01.050\"", "zeros inside the decimals"},
        {at(10, 0, 0.001), u"010°00'00.001\"", "leading zeros of the decimals"},
        {at(9, 59, 59.9996), u"010°00'00.000\"", "carries into the degrees"},
        {at(9, 59, 59.9994), u"009°59'59.999\"", "rounds down"},
        {at(359, 59, 59.9996), u"000°00'00.000\"", "a whole circle is zero"},
    };
    expectBearings(UFormatBearing(dms, circle, 3, 1, 0), rows);
    constexpr Row nine[] = {
        {pi / 2, u"N 90°00'00.000000000\" E", "east with the most decimals"},
        {3 * pi / 2, u"S 90°00'00.000000000\" W", "west with the most decimals"},
        {2 * pi, u"N 00°00'00.000000000\" E", "a whole circle with the most decimals"},
    };
    expectBearings(UFormatBearing(dms, quadrant, 9, 1, 0), nine);
}

} // namespace
