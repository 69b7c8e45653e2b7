#include "RowConditions.h"
#include "RowFormulas.h"
#include "RunningValues.h"
#include "VariableType.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <numbers>
#include <optional>
#include <vector>

namespace
{

using namespace kareport;

constexpr quint32 target = 100;
constexpr double infinite = std::numeric_limits<double>::infinity();

/// A row with numbers under 1, 2, ...; nothing for a value that is missing.
UDataObject rowOf(const std::vector<std::optional<double>> &numbers)
{
    UDataObject object;
    quint32 id = 1;
    for (const auto &number : numbers) {
        if (number) {
            object.Set(id, *number);
        }
        ++id;
    }
    return object;
}

std::optional<double> numberAt(const UDataObject &object, quint32 id = target)
{
    const UDictEntry *entry = object.Find(id);
    return entry != nullptr ? std::optional(std::get<double>(entry->value())) : std::nullopt;
}

TEST(RowFormula, ComputesDecimally)
{
    using Kind = RowFormula::Kind;
    const struct
    {
        Kind kind;
        double factor; ///< of numbers of the data
        std::vector<std::optional<double>> operands;
        std::optional<double> value;
        const char *reason;
    } rows[] = {
        {Kind::Sum, 1, {0.1, 0.2, 0.3}, 0.6, "0.6 and not 0.6000000000000001"},
        {Kind::Difference, 1, {12.345, 12.33}, 0.015, "0.015 and not 0.01500000000000057"},
        {Kind::Difference, 0.3048, {12.345, 12.33}, 0.015, "in feet"},
        {Kind::Product, 1, {0.1, 3}, 0.3, "0.3 and not 0.30000000000000004"},
        {Kind::Product, 1, {123456789.12345, -98765432.1}, -12193263123456119.492745, "more digits than 64 bits have"},
        {Kind::Product, 1, {0, 5}, 0, "nothing"},
        {Kind::Distance, 1, {1, 2, 4, 6}, 5, "in the plane"},
        {Kind::Distance, 1, {1, 2, 3, 3, 5, 9}, 7, "in space"},
        {Kind::Distance, 1, {5512345.678, 3487654.321, 5512345.677, 3487654.321}, 0.001, "not 0.00099999997764826"},
        {Kind::Distance, 0.3048, {5512345.678, 3, 5512345.675, 7}, std::hypot(0.003, 4), "in feet"},
        {Kind::Product, 1, {1e200, 1e200}, infinite, "beyond all numbers, and not 0"},
        {Kind::Sum, 1, {1e308, 1e308}, infinite, "the same"},
        {Kind::Bearing, 1, {0, 0, 1, 1}, std::numbers::pi / 4, "north-east"},
        {Kind::Bearing,
         1,
         {5512345.678, 3487654.321, 5512345.679, 3487654.322},
         std::numbers::pi / 4,
         "a millimetre each"},
        {Kind::Bearing, 1, {0, 0, 0, -1}, std::numbers::pi * 1.5, "west"},
        {Kind::Sum, 1, {1, std::nullopt}, std::nullopt, "an operand is missing"},
        {Kind::Sum, 1, {1, infinite}, infinite, "an operand is infinite"},
        {Kind::Difference, 1, {1, infinite}, -infinite, "an infinite one is subtracted"},
    };
    for (const auto &row : rows) {
        RowFormula formula;
        formula.kind = row.kind;
        formula.target = target;
        formula.result = CellReader(row.factor);
        std::vector<std::optional<double>> internal;
        for (std::size_t i = 0; i < row.operands.size(); ++i) {
            formula.operands.push_back({static_cast<quint32>(i + 1), CellReader(row.factor)});
            internal.push_back(row.operands[i] ? std::optional(*row.operands[i] * row.factor) : std::nullopt);
        }
        UDataObject object = rowOf(internal);
        object.Set(target, 77.0); // of an earlier row
        formula.setValue(object);
        EXPECT_EQ(numberAt(object), row.value ? std::optional(*row.value * row.factor) : std::nullopt) << row.reason;
    }
}

TEST(RowFormula, GivesWholeNumbersOfThirtyTwoBits)
{
    RowFormula formula;
    formula.operands = {{1, CellReader()}, {2, CellReader()}};
    formula.target = target;
    formula.isWhole = true;
    UDataObject object;
    object.Set(1, qint32(2'000'000'000));
    object.Set(2, qint32(-1));
    formula.setValue(object);
    EXPECT_EQ(std::get<qint32>(object.Find(target)->value()), 1'999'999'999);
    object.Set(2, qint32(2'000'000'000));
    formula.setValue(object);
    EXPECT_EQ(object.Find(target), nullptr) << "too large is not a value";
}

TEST(RowCondition, AsksOneValue)
{
    using Kind = RowCondition::Kind;
    const struct
    {
        Kind kind;
        std::optional<double> value;
        double limit;
        std::optional<double> beside;
        bool holds;
        const char *reason;
    } rows[] = {
        {Kind::Above, 1.5, 1, std::nullopt, true, "above"},
        {Kind::Above, 1, 1, std::nullopt, false, "the limit is not above it"},
        {Kind::Below, -1.5, -1, std::nullopt, true, "below"},
        {Kind::Below, -1, -1, std::nullopt, false, "the limit is not below it"},
        {Kind::Outside, -0.03, 0.02, std::nullopt, true, "outside on the lower side"},
        {Kind::Outside, 0.02, 0.02, std::nullopt, false, "the limit is inside"},
        {Kind::Outside, 100.03, 0.03, 100.0, false, "0.03 and not 0.030000000000001137"},
        {Kind::Outside, 100.0301, 0.03, 100.0, true, "a little more"},
        {Kind::Above, 99.0, 0, 100.0, false, "less than the other one"},
        {Kind::Below, 99.0, 0, 100.0, true, "the same the other way"},
        {Kind::Above, std::nullopt, 0, std::nullopt, false, "a missing value"},
        {Kind::Below, std::nullopt, 0, std::nullopt, false, "a missing value is not 0"},
        {Kind::Above, infinite, 0, std::nullopt, true, "infinite"},
        {Kind::Outside, std::numeric_limits<double>::quiet_NaN(), 0, std::nullopt, false, "not a number"},
        {Kind::Exists, 0, 0, std::nullopt, true, "there"},
        {Kind::Exists, std::nullopt, 0, std::nullopt, false, "not there"},
        {Kind::Missing, std::nullopt, 0, std::nullopt, true, "not there, asked the other way"},
    };
    for (const auto &row : rows) {
        for (const double factor : {1.0, 0.3048}) {
            RowCondition condition;
            condition.id = 1;
            condition.kind = row.kind;
            condition.limit = row.limit * factor;
            condition.reader = CellReader(factor);
            const auto internal = [factor](std::optional<double> number) {
                return number ? std::optional(*number * factor) : std::nullopt;
            };
            if (row.beside) {
                condition.beside = 2;
            }
            EXPECT_EQ(condition.holds(rowOf({internal(row.value), internal(row.beside)})), row.holds)
                << row.reason << ' ' << factor;
        }
    }
    RowCondition beside;
    beside.id = 1;
    beside.kind = Kind::Above;
    beside.beside = 2;
    EXPECT_FALSE(beside.holds(rowOf({1.0}))) << "what it is compared with is missing";
}

TEST(RowCondition, ComparesTextsAsTheSortDoes)
{
    RowCondition condition;
    condition.id = 1;
    condition.kind = RowCondition::Kind::Is;
    condition.values = {UDictEntry(1, QStringLiteral("road")), UDictEntry(1, QStringLiteral("kerb"))};
    UDataObject object;
    EXPECT_FALSE(condition.holds(object)) << "missing";
    object.Set(1, QStringLiteral("KERB"));
    EXPECT_TRUE(condition.holds(object));
    condition.kind = RowCondition::Kind::IsNot;
    EXPECT_FALSE(condition.holds(object));
    object.Remove(1);
    EXPECT_TRUE(condition.holds(object)) << "a missing one is none of them";
}

TEST(RowFlags, TheFirstThatHoldsCounts)
{
    const auto flag = [](int type, const char *text, double limit) {
        RowFlag made;
        made.target = type == VARIABLE_FLAG ? target + 1 : target;
        made.type = type;
        made.text = QString::fromLatin1(text);
        made.condition.id = 1;
        made.condition.kind = RowCondition::Kind::Above;
        made.condition.limit = limit;
        return made;
    };
    std::vector<RowFlag> flags;
    flags.push_back(flag(VARIABLE_TEXT, "!!", 10));
    flags.push_back(flag(VARIABLE_FLAG, "", 5));
    flags.push_back(flag(VARIABLE_TEXT, "!", 2));
    const struct
    {
        double value;
        const char *text;
        bool mark;
    } rows[] = {{1, "", false}, {3, "!", false}, {6, "!", true}, {11, "!!", true}};
    UDataObject object;
    for (const auto &row : rows) {
        object.Set(1, row.value);
        setFlags(flags, object);
        const UDictEntry *text = object.Find(target);
        EXPECT_EQ(text != nullptr ? std::get<QString>(text->value()) : QString(), QString::fromLatin1(row.text));
        EXPECT_EQ(std::get<bool>(object.Find(target + 1)->value()), row.mark) << row.value;
    }
    object.Set(1, 0.0);
    setFlags(flags, object);
    EXPECT_EQ(object.Find(target), nullptr) << "the flag of the row before is gone";
}

TEST(RunningValue, GoesOnFromRowToRow)
{
    using Kind = RunningValue::Kind;
    struct Row
    {
        std::optional<double> value;
        bool beginsGroup;
        std::optional<double> sum;
        std::optional<double> difference;
        std::optional<double> number;
    };
    const Row rows[] = {
        {0.1, true, 0.1, std::nullopt, 1},
        {0.2, false, 0.3, 0.1, 2},
        {std::nullopt, false, 0.3, std::nullopt, 3},
        {0.4, false, 0.7, std::nullopt, 4},
        {0.9, true, 0.9, std::nullopt, 1},
        {infinite, false, 0.9, infinite, 2},
        {0.2, false, 1.1, -infinite, 3},
    };
    const auto running = [](Kind kind) {
        return RunningValue(kind, 1, CellReader(), RunningValue::Target{target, VARIABLE_DOUBLE}, true);
    };
    RunningValue sum = running(Kind::Sum);
    RunningValue difference = running(Kind::Difference);
    RunningValue number = running(Kind::RowNumber);
    for (int turn = 0; turn < 2; ++turn) {
        quint64 at = 0;
        for (const Row &row : rows) {
            UDataObject object = rowOf({row.value});
            sum.setValue(object, row.beginsGroup, ++at);
            EXPECT_EQ(numberAt(object), row.sum);
            difference.setValue(object, row.beginsGroup, at);
            EXPECT_EQ(numberAt(object), row.difference);
            number.setValue(object, row.beginsGroup, at);
            EXPECT_EQ(numberAt(object), row.number);
        }
        EXPECT_EQ(sum.leftOut().missing, 1U);
        EXPECT_EQ(sum.leftOut().firstMissing, 3U) << "also of a group before";
        EXPECT_EQ(sum.leftOut().notFinite, 1U);
        sum.restart();
        difference.restart();
        number.restart();
    }
}

TEST(RunningValue, CountsOverGroupsWhereItIsOfTheTable)
{
    RunningValue number(RunningValue::Kind::RowNumber, 0, CellReader(), {target, VARIABLE_NUMBER}, false);
    UDataObject object;
    number.setValue(object, true, 1);
    number.setValue(object, true, 1);
    EXPECT_EQ(std::get<UPointNumber>(object.Find(target)->value()).Convert(), QStringLiteral("2"));
}

} // namespace
