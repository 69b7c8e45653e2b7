#include "SheetNumber.h"

#include "UJobSettings.h"
#include "VariableType.h"

#include <gtest/gtest.h>

namespace
{

using kareport::ResultValues;

kareport::ResultColumn columnOf(int type, int decimals = 0, QChar suffix = QChar())
{
    kareport::ResultColumn column;
    column.field.Type = type;
    column.field.Decimals = decimals;
    column.suffix = suffix;
    return column;
}

TEST(SheetNumber, AColumnHasTheFormatOfItsType)
{
    UJobSettings settings;
    settings.lengthDecimals = 2;
    settings.numberDecimals = 0;
    settings.stationDecimals = 3;
    EXPECT_EQ(kareport::sheetFormat(columnOf(VARIABLE_INTEGER), settings), "0");
    EXPECT_EQ(kareport::sheetFormat(columnOf(VARIABLE_COORDINATE, 7), settings), "0.00") << "as the settings say";
    EXPECT_EQ(kareport::sheetFormat(columnOf(VARIABLE_AREA, 7), settings), "0") << "no decimals";
    EXPECT_EQ(kareport::sheetFormat(columnOf(VARIABLE_ANGLE, 4), settings), "0.0000") << "as the field says";
    EXPECT_EQ(kareport::sheetFormat(columnOf(VARIABLE_STATION), settings), "0+000.000");
    settings.stationFormat = UJobSettings::StationFormat::HundredsPlus;
    EXPECT_EQ(kareport::sheetFormat(columnOf(VARIABLE_STATION), settings), "0+00.000");
    settings.stationFormat = UJobSettings::StationFormat::Plain;
    EXPECT_EQ(kareport::sheetFormat(columnOf(VARIABLE_STATION), settings), "0.000");
    EXPECT_EQ(kareport::sheetFormat(columnOf(VARIABLE_OFFSET, 1), settings), "0.0\"R\";0.0\"L\";0.0");
    EXPECT_EQ(kareport::sheetFormat(columnOf(VARIABLE_OFFSET, 1, u'+'), settings), "+0.0;-0.0;+0.0");
}

TEST(SheetNumber, ANumberIsThePrintedOneOrTheOneBehindIt)
{
    struct Row
    {
        int type;
        double internal;
        QStringView text;
        double printed;
        double exact;
        const char *format;
        const char *exactFormat;
        const char *reason;
    };
    constexpr Row rows[] = {
        {VARIABLE_COORDINATE, 12.3456, u"12.346", 12.346, 12.3456, "", "", "three decimals"},
        {VARIABLE_COORDINATE, -0.0001, u"0.000", 0, -0.0001, "", "0.000;0.000", "a length has no minus before zeros"},
        {VARIABLE_DOUBLE, -0.0001, u"-0.000", 0, -0.0001, "\"-\"0.000", "\"-\"0.000;\"-\"0.000",
         "a plain number has: its format shows it"},
        {VARIABLE_STATION, 12345.6789, u"12+345.679", 12345.679, 12345.6789, "", "",
         "the plus of a station is its format's"},
        {VARIABLE_STATION, -75, u"-0+075.000", -75, -75, "", "", "below zero"},
        {VARIABLE_OFFSET, -2.5, u"2.500L", -2.5, -2.5, "", "", "to the left"},
        {VARIABLE_OFFSET, 2.5, u"2.500R", 2.5, 2.5, "", "", "to the right"},
        {VARIABLE_OFFSET, 0, u"0.000", 0, 0, "0.000", "0.000", "on the line"},
        {VARIABLE_OFFSET, 0.0001, u"0.000R", 0, 0.0001, "0.000\"R\"", "0.000\"R\"",
         "next to it: a number of zero has no side"},
        {VARIABLE_OFFSET, -0.0001, u"0.000L", 0, -0.0001, "0.000\"L\"", "0.000\"L\";0.000\"L\"", "on the other side"},
        {VARIABLE_THICKNESS, 250, u"2.500", 2.5, 2.5, "", "", "held in hundredths"},
    };
    UJobSettings settings;
    for (const Row &row : rows) {
        const UDictEntry entry(1, row.internal);
        const kareport::ResultColumn column = columnOf(row.type, 3);
        const auto printed = kareport::sheetNumber(column, {&entry, row.text}, settings, ResultValues::Printed);
        const auto exact = kareport::sheetNumber(column, {&entry, row.text}, settings, ResultValues::Exact);
        ASSERT_TRUE(printed && exact) << row.reason;
        EXPECT_EQ(printed->value, row.printed) << row.reason;
        EXPECT_EQ(exact->value, row.exact) << row.reason;
        EXPECT_EQ(printed->format, row.format) << row.reason;
        EXPECT_EQ(exact->format, row.exactFormat) << row.reason;
    }
}

TEST(SheetNumber, WhatShowsNoNumberIsNone)
{
    const UJobSettings settings;
    const UDictEntry entry(1, -1.0);
    const auto numberOf = [&](int type, QStringView text) {
        return kareport::sheetNumber(columnOf(type, 3), {&entry, text}, settings, ResultValues::Printed);
    };
    EXPECT_FALSE(numberOf(VARIABLE_THICKNESS, u"ByLayer"));
    EXPECT_FALSE(numberOf(VARIABLE_DOUBLE, u"")) << "a zero that shows as blanks";
    EXPECT_FALSE(numberOf(VARIABLE_PLAIN, u"nan"));
    EXPECT_FALSE(numberOf(VARIABLE_PLAIN, u"-inf"));
    EXPECT_FALSE(numberOf(VARIABLE_COORDINATE, u"????"));
    EXPECT_FALSE(
        kareport::sheetNumber(columnOf(VARIABLE_COORDINATE), {nullptr, u"0.000"}, settings, ResultValues::Printed))
        << "what is missing is not a zero";
}

} // namespace
