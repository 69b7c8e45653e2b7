#include "FormattedField.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

#include <limits>
#include <numbers>
#include <string>

namespace
{

constexpr double infinity = std::numeric_limits<double>::infinity();
constexpr double nan = std::numeric_limits<double>::quiet_NaN();
constexpr double halfRadian = 0.5; // 28.6478897565 degrees

struct Row
{
    int type;
    int width;
    int decimals;
    double value;
    const char *expected;
    const char *zeroBlank; ///< with zeros as blanks
    const char *reason;
};

constexpr Row rows[] = {
    // plain numbers take their decimals from the settings, 3, not from the field
    {1, 8, 1, 2.5, "   2.500", "   2.500", "DOUBLE"},
    {1, 8, 1, -2.5, "  -2.500", "  -2.500", "DOUBLE, negative"},
    {1, 8, 1, 0, "   0.000", "        ", "DOUBLE, zero"},
    {1, 8, 1, -0.0, "  -0.000", "        ", "DOUBLE, negative zero is exactly zero"},
    {1, 8, 1, -0.0001, "  -0.000", "  -0.000", "DOUBLE, rounded to zero it keeps its sign and is not a zero"},
    {1, 4, 1, 12345.0625, "12345.062", "12345.062", "DOUBLE, wider than its column; a tie goes to the even digit"},
    {1, 0, 1, 2.5, "2.500", "2.500", "DOUBLE, no width"},
    {1, -8, 1, 2.5, "2.500   ", "2.500   ", "DOUBLE, a negative width fills on the right"},
    {1, 6, 1, infinity, "      ", "      ", "DOUBLE, infinite"},
    {1, 6, 1, -infinity, "      ", "      ", "DOUBLE, infinite"},
    {1, 6, 1, nan, "      ", "      ", "DOUBLE, not a number"},
    {11, 8, 1, 2.5, "   2.500", "   2.500", "AREA"},
    {11, 8, 1, 0, "   0.000", "        ", "AREA, zero"},
    {11, 3, 1, nan, "   ", "   ", "AREA, not a number"},
    // angles take their decimals from the field
    {3, 8, 2, std::numbers::pi, "  180.00", "  180.00", "ANGLE, from radians to degrees"},
    {3, 8, 0, -std::numbers::pi / 2, "     -90", "     -90", "ANGLE, negative, no decimals"},
    {3, 6, 2, 0, "  0.00", "      ", "ANGLE, zero"},
    {3, 6, 2, infinity, "      ", "      ", "ANGLE, infinite"},
    {18, 8, 4, halfRadian, " 28.6479", " 28.6479", "VANGLE"},
    {18, 6, 2, 0, "  0.00", "      ", "VANGLE, zero"},
    {18, 6, 2, nan, "      ", "      ", "VANGLE, not a number"},
    {4, 18, 2, halfRadian, "     N 28°38'52\" E", "     N 28°38'52\" E", "BEARING, in the form of the settings"},
    {4, 0, 2, 0, "N 00°00'00\" E", " ", "BEARING, zero; blanks are at least one"},
    {4, 6, 2, infinity, "      ", "      ", "BEARING, infinite"},
    // lengths take their decimals from the settings
    {5, 10, 1, 12.5, "    12.500", "    12.500", "COORDINATE"},
    {5, 10, 1, -12.5, "   -12.500", "   -12.500", "COORDINATE, negative"},
    {5, 8, 1, 0, "   0.000", "        ", "COORDINATE of 0 with zeros as blanks is as many blanks as it is wide"},
    {5, 8, 1, -0.0, "   0.000", "        ", "COORDINATE, a length of zeros has no sign"},
    {5, 8, 1, -0.0001, "   0.000", "   0.000", "COORDINATE, rounded to zero it is not a zero"},
    {5, 4, 1, 123456.5, "123456.500", "123456.500", "COORDINATE, wider than its column"},
    {5, -10, 1, 12.5, "12.500    ", "12.500    ", "COORDINATE, a negative width"},
    {5, 4, 1, nan, "    ", "    ", "COORDINATE, not a number"},
    {6, 8, 1, 1, "   1.000", "   1.000", "LENGTH"},
    {6, 8, 1, 0, "   0.000", "        ", "LENGTH, zero"},
    {6, 4, 1, infinity, "    ", "    ", "LENGTH, infinite"},
    {7, 8, 1, 1, "   1.000", "   1.000", "DISTANCE"},
    {7, 8, 1, 0, "   0.000", "        ", "DISTANCE, zero"},
    {7, 4, 1, -infinity, "    ", "    ", "DISTANCE, infinite"},
    {8, 8, 1, -1, "  -1.000", "  -1.000", "ELEVATION"},
    {8, 8, 1, 0, "   0.000", "        ", "ELEVATION, zero"},
    {8, 4, 1, nan, "    ", "    ", "ELEVATION, not a number"},
    {9, 12, 1, 12345.678, "  12+345.678", "  12+345.678", "STATION"},
    {9, 12, 1, -5.5, "  -0+005.500", "  -0+005.500", "STATION, negative"},
    {9, 12, 1, 0, "   0+000.000", "   0+000.000", "STATION of 0 is still printed with zeros as blanks"},
    {9, 4, 1, 5.5, "0+005.500", "0+005.500", "STATION, wider than its column"},
    {9, 3, 1, nan, "   ", "   ", "STATION, not a number"},
    // offsets take their decimals from the field
    {10, 8, 2, -2.5, "   2.50L", "   2.50L", "OFFSET of -2.5: seven columns and an L"},
    {10, 8, 2, 2.5, "   2.50R", "   2.50R", "OFFSET to the right"},
    {10, 8, 2, 0, "    0.00", "    0.00", "OFFSET of 0: the whole width, no side; never blank"},
    {10, 8, 2, -0.0, "    0.00", "    0.00", "OFFSET of negative zero"},
    {10, 8, 2, 9e-10, "    0.00", "    0.00", "OFFSET that counts as zero"},
    {10, 8, 2, -9e-10, "    0.00", "    0.00", "OFFSET that counts as zero, to the left"},
    {10, 8, 2, 1e-9, "   0.00R", "   0.00R", "OFFSET just not zero keeps its side"},
    {10, 8, 2, -1e-9, "   0.00L", "   0.00L", "OFFSET just not zero keeps its side"},
    {10, 8, -1, 2.5, "  2.500R", "  2.500R", "OFFSET, decimals of -1 are the settings' own"},
    {10, 5, 2, 2.5, "2.50R", "2.50R", "OFFSET that just fits"},
    {10, 3, 2, -2.5, "2.50L", "2.50L", "OFFSET wider than its column"},
    {10, 0, 2, -2.5, "2.50L", "2.50L", "OFFSET without a width"},
    {10, -7, 2, -2.5, "2.50L  ", "2.50L  ", "OFFSET with a negative width"},
    {10, 3, 2, nan, "   ", "   ", "OFFSET, not a number"},
    {10, 3, 2, -infinity, "   ", "   ", "OFFSET, infinite"},
    // the type without a keyword is any number
    {21, 8, 1, 2.5, "   2.500", "   2.500", "type 21: decimals of the settings"},
    {21, 8, 1, 0, "   0.000", "   0.000", "type 21: never blank"},
    {21, 8, 1, infinity, "     inf", "     inf", "type 21: infinite as it is"},
    {21, 8, 1, -infinity, "    -inf", "    -inf", "type 21: infinite as it is"},
    {21, 8, 1, nan, "     nan", "     nan", "type 21: not a number as it is"},
    {21, 2, 1, infinity, "inf", "inf", "type 21: wider than its column"},
    // a thickness is held in hundredths, bit 15 means "by layer"
    {22, 8, 2, 250, "    2.50", "    2.50", "THICKNESS of 250"},
    {22, 8, 2, 0, "    0.00", "    0.00", "THICKNESS of 0, never blank"},
    {22, 8, 2, -1, " ByLayer", " ByLayer", "THICKNESS of -1"},
    {22, 8, 3, -0.5, "  -0.005", "  -0.005", "THICKNESS that is cut to 0"},
    {22, 8, 2, -1.5, " ByLayer", " ByLayer", "THICKNESS that is cut to -1"},
    {22, 8, 2, 32767, "  327.67", "  327.67", "THICKNESS below bit 15"},
    {22, 8, 3, 32767.9, " 327.679", " 327.679", "THICKNESS that is cut below bit 15"},
    {22, 8, 2, 32768, " ByLayer", " ByLayer", "THICKNESS of bit 15 alone"},
    {22, 8, 2, 65535, " ByLayer", " ByLayer", "THICKNESS of the last number with bit 15"},
    {22, 8, 2, 65536, "  655.36", "  655.36", "THICKNESS above bit 15"},
    {22, 8, 2, -32768, " ByLayer", " ByLayer", "THICKNESS of the last negative number with bit 15"},
    {22, 8, 2, -32769, " -327.69", " -327.69", "THICKNESS below it"},
    {22, 8, 2, 2147483647, " ByLayer", " ByLayer", "THICKNESS of the largest number: bit 15 is set"},
    {22, 8, 2, 2147483647.5, " ByLayer", " ByLayer", "THICKNESS that is cut to the largest number"},
    {22, 8, 2, 2147483648.0, "21474836.48", "21474836.48", "THICKNESS outside 32 bits: without bit 15"},
    {22, 8, 2, -2147483648.0, "-21474836.48", "-21474836.48", "THICKNESS of the smallest number: bit 15 is clear"},
    {22, 8, 2, -2147483649.0, "-21474836.49", "-21474836.49", "THICKNESS outside 32 bits: without bit 15"},
    {22, 8, 2, 4294967295.0, "42949672.95", "42949672.95", "THICKNESS outside 32 bits: without bit 15"},
    {22, 8, 2, infinity, "     inf", "     inf", "THICKNESS, infinite: without bit 15"},
    {22, 8, 2, -infinity, "    -inf", "    -inf", "THICKNESS, infinite: without bit 15"},
    {22, 8, 2, nan, "     nan", "     nan", "THICKNESS, not a number: without bit 15"},
    {22, 3, 2, -1, "ByLayer", "ByLayer", "THICKNESS wider than its column"},
};

TEST(FieldFormatter, ShowsANumberByItsType)
{
    for (const Row &row : rows) {
        FormattedField formatted(row.type, row.width, row.decimals);
        EXPECT_EQ(formatted.of(row.value), QString::fromUtf8(row.expected)) << row.reason;
        formatted.options.zeroBlank = true;
        EXPECT_EQ(formatted.of(row.value), QString::fromUtf8(row.zeroBlank)) << row.reason << ", zeros as blanks";
    }
}

TEST(FieldFormatter, ShowsIntegersOfBothSizes)
{
    const struct
    {
        int width;
        qint32 value;
        const char *expected;
        const char *zeroBlank;
        const char *reason;
    } integers[] = {
        {5, 42, "   42", "   42", "in its column"},
        {5, -42, "  -42", "  -42", "negative"},
        {5, 0, "    0", "     ", "zero"},
        {0, 0, "0", " ", "zero without a width: one blank"},
        {-4, 0, "0   ", "    ", "zero in a negative width"},
        {2, 12345, "12345", "12345", "wider than its column"},
        {-5, 42, "42   ", "42   ", "a negative width fills on the right"},
        {3, 2147483647, "2147483647", "2147483647", "the largest"},
        {3, -2147483647 - 1, "-2147483648", "-2147483648", "the smallest"},
    };
    for (const auto &row : integers) {
        FormattedField formatted(0, row.width, 2);
        for (const bool zeroBlank : {false, true}) {
            formatted.options.zeroBlank = zeroBlank;
            const QString expected = QString::fromLatin1(zeroBlank ? row.zeroBlank : row.expected);
            EXPECT_EQ(formatted.of(row.value), expected) << row.reason;
            if (row.value >= -32768 && row.value <= 32767) {
                EXPECT_EQ(formatted.of(static_cast<qint16>(row.value)), expected) << row.reason << ", 16 bits";
            }
        }
    }
    EXPECT_EQ(FormattedField(0, 0).of(qint16(-32768)), QStringLiteral("-32768"));
}

TEST(FieldFormatter, ShowsSignedOffsets)
{
    const struct
    {
        int width;
        int decimals;
        double value;
        const char *expected;
        const char *reason;
    } offsets[] = {
        {8, 1, -2.5, "    -2.5", "negative, right-aligned"},
        {8, 2, 2.5, "   +2.50", "positive"},
        {8, 2, 0, "   +0.00", "zero has a plus"},
        {8, 2, -0.0, "   +0.00", "negative zero is not negative"},
        {8, 2, -0.0001, "   -0.00", "a negative value keeps its sign when it is rounded to zero"},
        {8, 2, -9e-10, "   -0.00", "also where the other style takes it for zero"},
        {8, -1, 2.5, "  +2.500", "decimals of -1 are the settings' own"},
        {3, 2, 2.5, "+2.50", "wider than its column"},
        {0, 2, 2.5, "+2.50", "no width"},
        {-8, 2, 2.5, "+2.50   ", "a negative width"},
        {3, 2, nan, "   ", "not a number"},
        {3, 2, infinity, "   ", "infinite"},
    };
    for (const auto &row : offsets) {
        FormattedField formatted(10, row.width, row.decimals);
        formatted.suffix = QStringLiteral("+");
        EXPECT_EQ(formatted.of(row.value), QString::fromLatin1(row.expected)) << row.reason;
        formatted.options.zeroBlank = true;
        EXPECT_EQ(formatted.of(row.value), QString::fromLatin1(row.expected)) << row.reason << ", zeros as blanks";
    }
}

TEST(FieldFormatter, EveryOtherOffsetStyleNamesTheSide)
{
    for (const char *style : {"", "R", "L", "-", "++", " +", "+ "}) {
        FormattedField formatted(10, 8, 2);
        formatted.suffix = QString::fromLatin1(style);
        EXPECT_EQ(formatted.of(-2.5), QStringLiteral("   2.50L")) << style;
        EXPECT_EQ(formatted.of(2.5), QStringLiteral("   2.50R")) << style;
    }
}

TEST(FieldFormatter, OffsetStyleChangesNoOtherType)
{
    for (const int type : {1, 5, 9, 21}) {
        FormattedField plain(type, 12, 2);
        FormattedField styled(type, 12, 2);
        styled.suffix = QStringLiteral("+");
        EXPECT_EQ(styled.of(2.5), plain.of(2.5)) << type;
    }
}

TEST(FieldFormatter, ShowsTextsAndPointNumbers)
{
    for (const int type : {2, 16, 17}) {
        const FormattedField formatted(type, 6, 2, "L");
        EXPECT_EQ(formatted.of(QStringLiteral("AB")), QStringLiteral("AB    ")) << type;
        EXPECT_EQ(formatted.of(UPointNumber(QStringLiteral("BM-3"))), QStringLiteral("BM-3  ")) << type;
        EXPECT_EQ(formatted.of(QString()), QStringLiteral("      ")) << type;
        EXPECT_EQ(formatted.of(QStringLiteral(" a b ")), QStringLiteral(" a b  ")) << type << ": blanks are kept";
        EXPECT_EQ(formatted.of(QStringLiteral("%s%d\t")), QStringLiteral("%s%d\t "))
            << type << ": no format of its own";
        EXPECT_EQ(formatted.of(QStringLiteral("点\U0001F600")), QStringLiteral("点\U0001F600   "))
            << type << ": a surrogate pair is two characters wide";
        EXPECT_EQ(formatted.of(QStringLiteral("0")), QStringLiteral("0     ")) << type;
    }
}

TEST(FieldFormatter, ShowsMarksForBooleansAndFlags)
{
    EXPECT_EQ(FormattedField(19, 3).of(true), QStringLiteral("  Y"));
    EXPECT_EQ(FormattedField(19, 3).of(false), QStringLiteral("  N"));
    EXPECT_EQ(FormattedField(20, 3).of(true), QStringLiteral("  *"));
    EXPECT_EQ(FormattedField(20, 3).of(false), QStringLiteral("   "));
    EXPECT_EQ(FormattedField(20, 0).of(false), QStringLiteral(" "));
    const quint8 any = 0x80;
    EXPECT_EQ(FormattedField(19, 1).of(1, &any), QStringLiteral("Y")) << "any byte but 0";
    FormattedField blank(19, 1);
    blank.options.zeroBlank = true;
    EXPECT_EQ(blank.of(false), QStringLiteral("N")) << "zeros as blanks are for numbers";
}

TEST(FieldFormatter, ShowsQuestionMarksForOtherTypes)
{
    for (const int type : {-1, 12, 13, 14, 15, 23, 24, 1000, -1000}) {
        EXPECT_EQ(FormattedField(type, 4, 2).of(2.5), QStringLiteral("????")) << type;
        EXPECT_EQ(FormattedField(type, 1).of(QStringLiteral("AB")), QStringLiteral("?")) << type;
        EXPECT_EQ(FormattedField(type, 0).of(2.5), QString()) << type;
        EXPECT_EQ(FormattedField(type, -3).of(2.5), QStringLiteral("   ")) << type << ": only the column";
        FormattedField blank(type, 4);
        blank.options.zeroBlank = true;
        EXPECT_EQ(blank.of(0.0), QStringLiteral("????")) << type;
    }
}

} // namespace
