#include "FormulaBinding.h"

#include "Measures.h"
#include "TextFolding.h"
#include "VariableType.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// What a formula of operands measures; nothing where they do not go together.
std::optional<Measure> formulaMeasure(RowFormula::Kind kind, const std::vector<FoundVariable> &operands)
{
    const Measure first = measureOf(operands.front().type);
    const bool areSame = std::all_of(operands.begin(), operands.end(), [first](const FoundVariable &operand) {
        return measureOf(operand.type) == first;
    });
    switch (kind) {
    case RowFormula::Kind::Sum:
    case RowFormula::Kind::Difference: return areSame ? std::optional(first) : std::nullopt;
    case RowFormula::Kind::Distance: return areSame && first == Measure::Length ? std::optional(first) : std::nullopt;
    case RowFormula::Kind::Bearing:
        return areSame && first == Measure::Length ? std::optional(Measure::Angle) : std::nullopt;
    case RowFormula::Kind::Product: break;
    }
    const Measure second = measureOf(operands.back().type);
    if (first == Measure::Number || second == Measure::Number) {
        return first == Measure::Number ? second : first;
    }
    return first == Measure::Length && second == first ? std::optional(Measure::Area) : std::nullopt;
}

} // namespace

QString noFit(const FoundVariable &target)
{
    return Xlate(
               "the variable \"%1\" does not fit the result: a variable of the same measure was expected, such as a length for lengths")
        .arg(target.name);
}

std::optional<RowFormula> bindFormula(const TableShape::Formula &formula, const FoundVariable &result,
                                      VariableLookup &lookup)
{
    std::vector<FoundVariable> operands;
    for (const TableShape::Name &name : formula.operands) {
        operands.push_back(lookup.find(name));
        if (equalFolded(name.text, formula.variable.text)) {
            lookup.fail(name.path, Xlate("a variable cannot be computed from itself: another variable was expected"));
        } else if (!lookup.error() && !isNumeric(operands.back().type)) {
            lookup.fail(
                name.path,
                Xlate("the variable \"%1\" does not hold numbers: a numeric variable was expected").arg(name.text));
        }
        lookup.expectSet(name, operands.back());
    }
    if (lookup.error()) {
        return std::nullopt;
    }
    RowFormula bound;
    bound.kind = formula.kind;
    const auto measure = formulaMeasure(bound.kind, operands);
    if (!measure || *measure == Measure::Thickness) {
        lookup.fail(
            formula.path,
            Xlate(
                "the variables cannot be combined: variables of the same measure were expected, such as lengths, or for a product two lengths or a number and another variable"));
        return std::nullopt;
    }
    const bool areWhole = std::all_of(operands.begin(), operands.end(),
                                      [](const FoundVariable &operand) { return operand.type == VARIABLE_INTEGER; });
    bound.isWhole = result.type == VARIABLE_INTEGER;
    if (measureOf(result.type) != *measure || (bound.isWhole && !areWhole)) {
        lookup.fail(formula.variable.path, noFit(result));
        return std::nullopt;
    }
    for (const FoundVariable &operand : operands) {
        bound.operands.push_back({operand.id, operand.reader});
        bound.productFactor *= operand.reader.factor();
        bound.productPerUnit *= operand.reader.perUnit();
    }
    bound.target = result.id;
    bound.result = result.reader;
    bound.direction = result.turn;
    const bool areDirections = std::all_of(operands.begin(), operands.end(),
                                           [](const FoundVariable &operand) { return operand.turn.has_value(); });
    if (areDirections) {
        bound.turn = operands.front().turn;
    }
    return bound;
}

} // namespace kareport
