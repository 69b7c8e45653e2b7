#include "ConditionBinding.h"

#include "EntryOrder.h"
#include "Measures.h"
#include "Xlate.h"

#include <cmath>

namespace kareport
{

namespace
{

void bindLimit(RowCondition &bound, const TableShape::Condition &condition, const FoundVariable &of,
               VariableLookup &lookup)
{
    if (!isNumeric(of.type)) {
        lookup.fail(condition.of.path,
                    Xlate("the variable \"%1\" does not hold numbers: a numeric variable was expected").arg(of.name));
        return;
    }
    const auto limit = lookup.valueOf(of, condition.values.front());
    if (!limit) {
        return;
    }
    bound.limit = numberOf(&*limit).value_or(0);
    if (bound.kind == RowCondition::Kind::Outside && !(bound.limit >= 0)) {
        lookup.fail(condition.values.front().path, Xlate("a tolerance of 0 or more was expected"));
    } else if (std::isnan(bound.limit)) {
        lookup.fail(condition.values.front().path, Xlate("a number was expected: nothing is above or below NAN"));
    }
    if (!condition.beside) {
        return;
    }
    if (std::isfinite(bound.limit)) { // as differences become internal
        bound.limit = bound.reader.internal(bound.reader.read(bound.limit).toDouble());
    }
    const FoundVariable beside = lookup.find(*condition.beside);
    lookup.expectSet(*condition.beside, beside);
    if (!lookup.error() && measureOf(beside.type) != measureOf(of.type)) {
        lookup.fail(condition.beside->path,
                    Xlate("\"%1\" and \"%2\" cannot be compared: they have different units").arg(of.name, beside.name));
    }
    bound.beside = beside.id;
    bound.turn = beside.turn ? of.turn : std::nullopt;
}

} // namespace

RowCondition bindCondition(const TableShape::Condition &condition, VariableLookup &lookup)
{
    using Kind = RowCondition::Kind;
    RowCondition bound;
    const FoundVariable of = lookup.find(condition.of);
    lookup.expectSet(condition.of, of);
    if (lookup.error()) {
        return bound;
    }
    bound.id = of.id;
    bound.reader = of.reader;
    bound.kind = condition.kind;
    if (bound.kind == Kind::Exists || bound.kind == Kind::Missing) {
        return bound;
    }
    if (bound.kind == Kind::Is || bound.kind == Kind::IsNot) {
        for (const TableShape::Value &value : condition.values) {
            if (const auto entry = lookup.valueOf(of, value)) {
                bound.values.push_back(*entry);
            }
        }
        return bound;
    }
    bindLimit(bound, condition, of, lookup);
    return bound;
}

} // namespace kareport
