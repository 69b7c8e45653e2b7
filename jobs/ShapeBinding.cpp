#include "ShapeBinding.h"

#include "ConditionBinding.h"
#include "FormulaBinding.h"
#include "GroupBinding.h"
#include "Measures.h"
#include "TextFolding.h"
#include "VariableLookup.h"
#include "VariableType.h"
#include "Xlate.h"

#include <algorithm>
#include <utility>

namespace kareport
{

namespace
{

/// Looks up the names of a step.
class Binding
{
public:
    Binding(const TableShape &shape, VariableLookup &lookup) : shape_(shape), lookup_(lookup) {}

    BoundShape bind();

private:
    void addSets();
    int firstFlagOf(const QString &variable) const;
    void bindSort();
    void bindFormula(const TableShape::Formula &formula);
    void bindRunning(const TableShape::Running &running);
    void bindFlag(const TableShape::Flag &flag);
    FoundVariable target(const TableShape::Name &name);
    const TableShape::Name *setName(const QString &variable) const;

    const TableShape &shape_;
    VariableLookup &lookup_;
    BoundShape bound_;
};

BoundShape Binding::bind()
{
    addSets();
    int stage = 0;
    for (const TableShape::Formula &formula : shape_.compute) {
        lookup_.goTo(stage++);
        bindFormula(formula);
    }
    lookup_.goTo(stage++);
    for (const TableShape::Condition &one : shape_.where) {
        bound_.rows.conditions.push_back(bindCondition(one, lookup_));
    }
    for (const TableShape::Running &running : shape_.running) {
        lookup_.goTo(stage++);
        bindRunning(running);
    }
    for (const TableShape::Flag &flag : shape_.flags) {
        lookup_.goTo(stage + firstFlagOf(flag.variable.text));
        bindFlag(flag);
    }
    bindSort();
    bound_.needed = lookup_.needed();
    return std::move(bound_);
}

/// Says which variables the step sets, in the order that it sets them in.
void Binding::addSets()
{
    int stage = 0;
    for (const TableShape::Formula &formula : shape_.compute) {
        lookup_.addSet(formula.variable.text, stage++);
    }
    ++stage; // of the conditions
    for (const TableShape::Running &running : shape_.running) {
        lookup_.addSet(running.variable.text, stage++);
    }
    for (const TableShape::Flag &flag : shape_.flags) {
        lookup_.addSet(flag.variable.text, stage + firstFlagOf(flag.variable.text));
    }
}

/// The first of the flags that set a variable: all of them are asked with it.
int Binding::firstFlagOf(const QString &variable) const
{
    const auto found = std::find_if(shape_.flags.begin(), shape_.flags.end(), [&](const TableShape::Flag &flag) {
        return equalFolded(flag.variable.text, variable);
    });
    return static_cast<int>(found - shape_.flags.begin());
}

/// A variable that rows are given.
FoundVariable Binding::target(const TableShape::Name &name)
{
    FoundVariable found = lookup_.find(name);
    const QString key = foldedKey(name.text);
    if (!bound_.rows.variables.contains(key)) {
        bound_.rows.variables.append(key);
    }
    return found;
}

/// Where the step sets a variable; null where it does not.
const TableShape::Name *Binding::setName(const QString &variable) const
{
    const auto find = [&variable](const auto &entries) -> const TableShape::Name * {
        for (const auto &entry : entries) {
            if (equalFolded(entry.variable.text, variable)) {
                return &entry.variable;
            }
        }
        return nullptr;
    };
    const TableShape::Name *name = find(shape_.compute);
    name = name != nullptr ? name : find(shape_.running);
    return name != nullptr ? name : find(shape_.flags);
}

void Binding::bindSort()
{
    const auto &[source, tpl, table, units, settings] = lookup_.surroundings();
    const sXmlSortTableReport *sort = tpl.GetSortList(table.Name);
    if (sort != nullptr && !shape_.sort.empty()) {
        lookup_.fail(
            shape_.sort.front().path,
            Xlate("the template sorts the table \"%1\": \"sort\" is for tables that it does not sort").arg(table.Name));
    }
    const auto failSet = [&](const JsonPath &path, const QString &variable) {
        lookup_.fail(
            path,
            Xlate("rows are sorted before \"%1\" is computed: a variable of the data was expected").arg(variable));
    };
    for (const TableShape::Name &name : shape_.sort) {
        bound_.sortIds.push_back(lookup_.find(name).id);
        if (lookup_.isSet(bound_.sortIds.back())) {
            failSet(name.path, name.text);
        }
    }
    std::vector<unsigned> ids = bound_.sortIds;
    if (sort != nullptr) {
        for (const sXmlSortVariable &key : sort->Entries) {
            ids.push_back(key.ID);
            if (const TableShape::Name *set = setName(key.VariableName)) {
                failSet(set->path, set->text);
            }
        }
    }
    bound_.rows.groups = GroupBinding(lookup_).bind(shape_, ids);
}

void Binding::bindFormula(const TableShape::Formula &formula)
{
    const FoundVariable result = target(formula.variable);
    if (auto bound = kareport::bindFormula(formula, result, lookup_)) {
        bound_.rows.formulas.push_back(*std::move(bound));
    }
}

void Binding::bindRunning(const TableShape::Running &running)
{
    using Kind = RunningValue::Kind;
    const FoundVariable result = target(running.variable);
    FoundVariable of;
    const bool isRowNumber = running.kind == Kind::RowNumber;
    if (running.perGroup && shape_.groups.empty()) {
        lookup_.fail(running.path,
                     Xlate("\"per\": \"group\" needs groups: the key \"groups\" was expected in the step"));
    }
    if (!isRowNumber) {
        of = lookup_.find(running.of);
        if (!lookup_.error() && (!isAdded(of.type) || equalFolded(running.of.text, running.variable.text))) {
            lookup_.fail(running.of.path,
                         Xlate("another variable with numbers, lengths, areas or angles was expected"));
        }
        lookup_.expectSet(running.of, of);
    }
    if (lookup_.error()) {
        return;
    }
    const Measure measure = measureOf(result.type);
    const bool isLabel = isRowNumber && measure == Measure::Text;
    const bool isWholeOfOthers = !isRowNumber && result.type == VARIABLE_INTEGER && of.type != VARIABLE_INTEGER;
    const Measure wanted = isRowNumber ? Measure::Number : measureOf(of.type);
    if (isWholeOfOthers || (!isLabel && measure != wanted)) {
        lookup_.fail(running.variable.path, noFit(result));
        return;
    }
    bound_.rows.running.emplace_back(running.kind, of.id, of.reader, RunningValue::Target{result.id, result.type},
                                     running.perGroup);
}

void Binding::bindFlag(const TableShape::Flag &flag)
{
    RowFlag bound;
    bound.condition = bindCondition(flag.condition, lookup_);
    const FoundVariable result = target(flag.variable);
    if (lookup_.error()) {
        return;
    }
    bound.target = result.id;
    bound.type = result.type;
    const Measure measure = measureOf(result.type);
    if (measure != Measure::Text && measure != Measure::Truth) {
        lookup_.fail(flag.variable.path,
                     Xlate("a flag needs a text, or a mark: the variable \"%1\" is neither").arg(result.name));
    } else if (measure == Measure::Text && !flag.text) {
        lookup_.fail(flag.path, Xlate("the key \"text\" with the text of the flag was expected"));
    } else if (measure == Measure::Truth && flag.text) {
        lookup_.fail(flag.text->path, Xlate("the variable \"%1\" has a mark and no text").arg(result.name));
    }
    bound.text = flag.text ? flag.text->text : QString();
    bound_.rows.flags.push_back(std::move(bound));
}

} // namespace

Expected<BoundShape> bindShape(const TableShape &shape, const ShapeSurroundings &surroundings)
{
    VariableLookup lookup(surroundings);
    BoundShape bound = Binding(shape, lookup).bind();
    if (lookup.error()) {
        return *lookup.error();
    }
    return bound;
}

} // namespace kareport
