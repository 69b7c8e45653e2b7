#include "FormattedField.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

#include <limits>

// The cases at the edges of a value or a column, one by one.

using kareport::LengthUnit;

namespace
{

TEST(FieldFormatterEdge, CoordinateOfZeroWithZeroBlankIsBlanksOfTheWidth)
{
    for (const int width : {1, 8, 200}) {
        FormattedField coordinate(5, width);
        coordinate.options.zeroBlank = true;
        EXPECT_EQ(coordinate.of(0.0), QString(width, u' ')) << width;
        EXPECT_EQ(coordinate.of(-0.0), QString(width, u' ')) << width;
    }
    FormattedField noWidth(5, 0);
    noWidth.options.zeroBlank = true;
    EXPECT_EQ(noWidth.of(0.0), QStringLiteral(" ")) << "the blank itself";
}

TEST(FieldFormatterEdge, StationOfZeroWithZeroBlankIsStillPrinted)
{
    FormattedField station(9, 12);
    station.options.zeroBlank = true;
    EXPECT_EQ(station.of(0.0), QStringLiteral("   0+000.000"));
}

TEST(FieldFormatterEdge, OffsetOfMinusTwoAndAHalfInBothStyles)
{
    FormattedField offset(10, 8, 1);
    EXPECT_EQ(offset.of(-2.5), QStringLiteral("    2.5L")) << "the length in 7 columns, then the side";
    offset.suffix = QStringLiteral("+");
    EXPECT_EQ(offset.of(-2.5), QStringLiteral("    -2.5")) << "with its sign, right-aligned in 8 columns";
}

TEST(FieldFormatterEdge, ThicknessOf250AndOfMinus1)
{
    FormattedField thickness(22, 0, 2);
    EXPECT_EQ(thickness.of(250.0), QStringLiteral("2.50"));
    EXPECT_EQ(thickness.of(-1.0), QStringLiteral("ByLayer"));
}

TEST(FieldFormatterEdge, UnmergedVariableIsQuestionMarks)
{
    EXPECT_EQ(FormattedField(-1, 5).of(2.5), QStringLiteral("?????"));
    EXPECT_EQ(FormattedField(-1, 0).of(2.5), QString());
}

TEST(FieldFormatterEdge, TextABCentredInSevenAndInThree)
{
    EXPECT_EQ(FormattedField(2, 7, 0, "C").of(QStringLiteral("AB")), QStringLiteral("  AB   ")) << "7 characters";
    EXPECT_EQ(FormattedField(2, 3, 0, "C").of(QStringLiteral("AB")), QStringLiteral(" AB ")) << "4 characters";
}

TEST(FieldFormatterEdge, TwelveCharactersInTenColumnsAreTenHashMarks)
{
    for (const char *align : {"L", "C", "R"}) {
        FormattedField text(2, 10, 0, align);
        EXPECT_EQ(text.of(QStringLiteral("twelve chars")), QStringLiteral("twelve chars")) << align;
        text.options.printHash = true;
        EXPECT_EQ(text.of(QStringLiteral("twelve chars")), QStringLiteral("##########")) << align;
    }
}

// A value can be finite as it is stored and too large in the unit that it is shown in.
TEST(FieldFormatterEdge, OnlyAValueThatIsFiniteInItsUnitIsShown)
{
    constexpr struct
    {
        int type;
        int width;
        double value;
        const char *expected;
        const char *reason;
    } rows[] = {
        {5, 4, 1e308, "    ", "COORDINATE"},
        {5, 4, -1e308, "    ", "COORDINATE, negative"},
        {6, 4, 1e308, "    ", "LENGTH"},
        {7, 4, 1e308, "    ", "DISTANCE"},
        {8, 4, 1e308, "    ", "ELEVATION"},
        {9, 3, 1e308, "   ", "STATION"},
        {9, 3, -1e308, "   ", "STATION, negative"},
        {10, 4, 1e308, "    ", "OFFSET, without a side"},
        {10, 4, -1e308, "    ", "OFFSET, without a side"},
    };
    for (const auto &row : rows) {
        for (const bool zeroBlank : {false, true}) {
            for (const char *suffix : {"", "+"}) {
                FormattedField formatted(row.type, row.width, 2);
                formatted.settings.lengthUnit = LengthUnit::Millimetre;
                formatted.options.zeroBlank = zeroBlank;
                formatted.suffix = QString::fromLatin1(suffix);
                EXPECT_EQ(formatted.of(row.value), QString::fromLatin1(row.expected)) << row.reason << suffix;
            }
        }
    }
    FormattedField angle(18, 4, 0);
    EXPECT_EQ(angle.of(std::numeric_limits<double>::max()), QStringLiteral("    ")) << "VANGLE, in degrees";
    FormattedField area(11, 4);
    area.settings.areaUnit = kareport::AreaUnit::SquareFoot;
    EXPECT_EQ(area.of(std::numeric_limits<double>::max()), QStringLiteral("    ")) << "AREA, in square feet";
}

TEST(FieldFormatterEdge, ValueTooLargeForAnotherUnitIsShownWhereNothingIsConverted)
{
    for (const int type : {1, 21}) {
        FormattedField number(type, 4);
        number.settings.lengthUnit = LengthUnit::Millimetre;
        const QString shown = number.of(1e308);
        EXPECT_EQ(shown.size(), 309 + 4) << type << ": all digits, the point and three decimals";
        EXPECT_TRUE(shown.startsWith(QStringLiteral("1000000000000000010979063629440455417404923"))) << type;
        EXPECT_TRUE(shown.endsWith(QStringLiteral(".000"))) << type;
    }
}

TEST(FieldFormatterEdge, PlainNumberIsNotTestedForBeingFinite)
{
    FormattedField plain(21, 6);
    EXPECT_EQ(plain.of(std::numeric_limits<double>::infinity()), QStringLiteral("   inf"));
    EXPECT_EQ(plain.of(-std::numeric_limits<double>::infinity()), QStringLiteral("  -inf"));
    plain.settings.lengthUnit = LengthUnit::Millimetre;
    EXPECT_EQ(plain.of(2.0), QStringLiteral(" 2.000")) << "type 21 has no unit";
}

} // namespace
