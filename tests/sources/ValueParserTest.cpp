#include "ValueParser.h"

#include "PrintQt.h"
#include "VariableType.h"

#include <gtest/gtest.h>

#include <limits>
#include <numbers>
#include <string_view>

namespace
{

using kareport::DataUnits;
using kareport::ValueParser;

constexpr double infinite = std::numeric_limits<double>::infinity();
constexpr unsigned id = 7;

/// What a text is stored as: the kind and the value, "none" or "misfit".
QString stored(const ValueParser &parser, std::string_view text)
{
    UDictionary object;
    if (!parser.store(text, object)) {
        return QStringLiteral("misfit");
    }
    const UDictEntry *entry = object.Find(id);
    if (entry == nullptr) {
        return QStringLiteral("none");
    }
    const QString kind = QString::number(entry->GetKind()) + u' ';
    switch (entry->GetKind()) {
    case 1: return kind + (*static_cast<const bool *>(entry->GetData()) ? QStringLiteral("yes") : QStringLiteral("no"));
    case 4: return kind + QString::number(*static_cast<const qint32 *>(entry->GetData()));
    case 8: return kind + QString::number(*static_cast<const double *>(entry->GetData()), 'g', 17);
    case 16: return kind + *static_cast<const QString *>(entry->GetData());
    case 32: return kind + static_cast<const UPointNumber *>(entry->GetData())->Convert();
    default: return kind + u'?';
    }
}

/// A text, and what a variable of a type has of it.
struct Stored
{
    int type;
    const char *text;
    const char *expected;
    const char *reason;
};
constexpr Stored storedTexts[] = {
    {VARIABLE_INTEGER, "12", "4 12", "kind 4"},
    {VARIABLE_INTEGER, "+12", "4 12", "a plus"},
    {VARIABLE_INTEGER, " -12 ", "4 -12", "blanks around it"},
    {VARIABLE_INTEGER, "2147483647", "4 2147483647", "the largest"},
    {VARIABLE_INTEGER, "-2147483648", "4 -2147483648", "the smallest"},
    {VARIABLE_INTEGER, "2147483648", "misfit", "one too large"},
    {VARIABLE_INTEGER, "-2147483649", "misfit", "one too small"},
    {VARIABLE_INTEGER, "1.5", "misfit", "not whole"},
    {VARIABLE_INTEGER, "INF", "misfit", "not whole"},
    {VARIABLE_INTEGER, "0x1F", "misfit", "no other base"},
    {VARIABLE_INTEGER, "12a", "misfit", "letters"},
    {VARIABLE_TEXT, "ab", "16 ab", "kind 16"},
    {VARIABLE_TEXT, " ab ", "16  ab ", "blanks are part of a text"},
    {VARIABLE_TEXT, "12", "16 12", "digits are a text"},
    {VARIABLE_TEXT,
     "Gr\xC3\xB6\xC3\x9F"
     "e \xF0\x9D\x84\x9E",
     "16 Gr\xC3\xB6\xC3\x9F"
     "e \xF0\x9D\x84\x9E",
     "UTF-8"},
    {VARIABLE_NAME, "ab", "16 ab", "kind 16"},
    {VARIABLE_NUMBER, "BM-3", "32 BM-3", "kind 32"},
    {VARIABLE_NUMBER, "007", "32 007", "a point's number keeps its zeros"},
    {VARIABLE_DOUBLE, "2.5", "8 2.5", "as given"},
    {VARIABLE_DOUBLE, "INF", "8 inf", "infinite is a number"},
    {VARIABLE_DOUBLE, "NAN", "8 nan", "not-a-number is a number"},
    {VARIABLE_DOUBLE, "two", "misfit", "a word"},
    {VARIABLE_COORDINATE, "2.5", "8 2.5", "metres"},
    {VARIABLE_LENGTH, "2.5", "8 2.5", "metres"},
    {VARIABLE_LENGTH, "1+234", "misfit", "a plus inside is for stations only"},
    {VARIABLE_DISTANCE, "2.5", "8 2.5", "metres"},
    {VARIABLE_ELEVATION, "-INF", "8 -inf", "infinite below 0"},
    {VARIABLE_OFFSET, "-2.5", "8 -2.5", "metres"},
    {VARIABLE_AREA, "2.5", "8 2.5", "square metres"},
    {VARIABLE_THICKNESS, "-1", "8 -1", "as given"},
    {VARIABLE_PLAIN, "2.5", "8 2.5", "as given"},
    {12, "2.5", "8 2.5", "every other type is a number as given"},
    {-1, "2.5", "8 2.5", "every other type is a number as given"},
    {VARIABLE_STATION, "12+345.678", "8 12345.678", "the plus is dropped"},
    {VARIABLE_STATION, "123+45.678", "8 12345.678", "wherever it is"},
    {VARIABLE_STATION, "0+000", "8 0", "zero"},
    {VARIABLE_STATION, "-1+234.5", "8 -1234.5", "negative"},
    {VARIABLE_STATION, "+1+234.5", "8 1234.5", "a plus in front is a sign"},
    {VARIABLE_STATION, "12345.5", "8 12345.5", "without a plus"},
    {VARIABLE_STATION, "1e+3", "8 1000", "the plus of an exponent"},
    {VARIABLE_STATION, "INF", "8 inf", "infinite"},
    {VARIABLE_STATION, "1+2+3", "misfit", "two pluses"},
    {VARIABLE_STATION, "1+5.0", "misfit", "1+005.0 or 1+05.0 may be meant: 15.0 is neither"},
    {VARIABLE_STATION, "1+0456", "misfit", "no station has four digits there"},
    {VARIABLE_STATION, "12+", "misfit", "nothing after the plus"},
    {VARIABLE_STATION, "+", "misfit", "a plus alone"},
    {VARIABLE_STATION, "12+-345", "misfit", "a sign after the plus"},
    {VARIABLE_STATION, "12++345", "misfit", "two pluses"},
    {VARIABLE_STATION, "12-345", "misfit", "a minus is not a plus"},
};

TEST(ValueParser, StoresByTheTypeOfTheVariable)
{
    for (const Stored &value : storedTexts) {
        EXPECT_EQ(stored(ValueParser(value.type, id, DataUnits()), value.text), QString::fromUtf8(value.expected))
            << "type " << value.type << ", " << value.text << ": " << value.reason;
    }
}

TEST(ValueParser, BooleansAndFlagsTakeTheirWordsInAnyCase)
{
    struct Row
    {
        const char *text;
        const char *expected;
    };
    constexpr Row rows[] = {
        {"true", "1 yes"},   {"TRUE", "1 yes"}, {"yes", "1 yes"},  {"Yes", "1 yes"},  {"y", "1 yes"},
        {"Y", "1 yes"},      {"t", "1 yes"},    {"T", "1 yes"},    {"1", "1 yes"},    {"*", "1 yes"},
        {" y ", "1 yes"},    {"false", "1 no"}, {"False", "1 no"}, {"no", "1 no"},    {"NO", "1 no"},
        {"n", "1 no"},       {"N", "1 no"},     {"f", "1 no"},     {"F", "1 no"},     {"0", "1 no"},
        {"2", "misfit"},     {"-1", "misfit"},  {"on", "misfit"},  {"off", "misfit"}, {"ja", "misfit"},
        {"truee", "misfit"}, {"**", "misfit"},  {"1.0", "misfit"}, {"", "none"},
    };
    for (const int type : {VARIABLE_BOOLEAN, VARIABLE_FLAG}) {
        for (const Row &row : rows) {
            EXPECT_EQ(stored(ValueParser(type, id, DataUnits()), row.text), QString::fromUtf8(row.expected))
                << "type " << type << ": " << row.text;
        }
    }
}

TEST(ValueParser, AnEmptyCellStoresNothingAndTakesNothingAway)
{
    for (int type = -1; type <= 22; ++type) {
        const ValueParser parser(type, id, DataUnits());
        UDictionary object;
        ASSERT_TRUE(parser.store("1", object)) << "type " << type;
        ASSERT_NE(object.Find(id), nullptr) << "type " << type;
        EXPECT_TRUE(parser.store("", object)) << "type " << type;
        EXPECT_NE(object.Find(id), nullptr) << "type " << type << ": another variable of the identifier has stored it";
        UDictionary empty;
        EXPECT_TRUE(parser.store("", empty)) << "type " << type;
        EXPECT_EQ(empty.Find(id), nullptr) << "type " << type;
    }
}

TEST(ValueParser, NumbersAreMultipliedIntoInternalUnits)
{
    DataUnits feet;
    feet.length = kareport::LengthUnit::InternationalFoot;
    feet.area = kareport::AreaUnit::Acre;
    feet.angle = kareport::AngleUnit::Gon;
    DataUnits dms;
    dms.sexagesimal = true;
    struct Row
    {
        int type;
        DataUnits units;
        const char *text;
        double expected;
        const char *reason;
    };
    const Row rows[] = {
        {VARIABLE_COORDINATE, feet, "10", 10 * 0.3048, "feet"},
        {VARIABLE_STATION, feet, "1+000", 1000 * 0.3048, "a station with its plus in feet"},
        {VARIABLE_AREA, feet, "2", 2 * 4046.8564224, "acres"},
        {VARIABLE_ANGLE, feet, "100", 100 * (std::numbers::pi / 200), "gon"},
        {VARIABLE_BEARING, DataUnits(), "90", 90 * (std::numbers::pi / 180), "degrees"},
        {VARIABLE_DOUBLE, feet, "10", 10, "as given"},
        {VARIABLE_THICKNESS, feet, "10", 10, "as given"},
        {VARIABLE_BEARING, dms, "45-30-0", 45.5 * (std::numbers::pi / 180), "a text of degrees and minutes"},
        {VARIABLE_VANGLE, dms,
         "-45\xC2\xB0"
         "30'",
         -45.5 * (std::numbers::pi / 180), "a text with marks"},
        {VARIABLE_LENGTH, dms, "45", 45, "only angles are such texts"},
        {VARIABLE_COORDINATE, feet, "-INF", -infinite, "infinite in any unit"},
    };
    for (const Row &row : rows) {
        const ValueParser parser(row.type, id, row.units);
        UDictionary object;
        ASSERT_TRUE(parser.store(row.text, object)) << row.reason;
        const UDictEntry *entry = object.Find(id);
        ASSERT_TRUE(entry != nullptr && entry->GetKind() == 8) << row.reason;
        EXPECT_DOUBLE_EQ(*static_cast<const double *>(entry->GetData()), row.expected) << row.reason;
    }
    EXPECT_EQ(stored(ValueParser(VARIABLE_LENGTH, id, dms), "45-30-0"), QStringLiteral("misfit"));
    EXPECT_EQ(stored(ValueParser(VARIABLE_ANGLE, id, DataUnits()), "45-30-0"), QStringLiteral("misfit"))
        << "only where the units say so";
    EXPECT_EQ(stored(ValueParser(VARIABLE_ANGLE, id, dms), "45-60-0"), QStringLiteral("misfit"));
}

TEST(ValueParser, StoresUnderItsIdentifier)
{
    const ValueParser parser(VARIABLE_TEXT, 40000, DataUnits());
    EXPECT_EQ(parser.id(), 40000U);
    UDictionary object;
    ASSERT_TRUE(parser.store("a", object));
    EXPECT_NE(object.Find(40000), nullptr);
    EXPECT_EQ(object.Find(id), nullptr);
}

TEST(ValueParser, SaysWhatWasExpected)
{
    DataUnits dms;
    dms.sexagesimal = true;
    struct Row
    {
        int type;
        DataUnits units;
        const char *contains;
    };
    const Row rows[] = {
        {VARIABLE_INTEGER, {}, "whole number"}, {VARIABLE_DOUBLE, {}, "number"},     {VARIABLE_TEXT, {}, "text"},
        {VARIABLE_STATION, {}, "12+345.678"},   {VARIABLE_BOOLEAN, {}, "yes or no"}, {VARIABLE_FLAG, {}, "yes or no"},
        {VARIABLE_ANGLE, {}, "number"},         {VARIABLE_ANGLE, dms, "45-30-15"},
    };
    for (const Row &row : rows) {
        EXPECT_TRUE(ValueParser(row.type, id, row.units).expected().contains(QString::fromUtf8(row.contains)))
            << "type " << row.type;
    }
}

} // namespace
