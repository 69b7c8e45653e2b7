#include "GroupBinding.h"

#include "GroupTextReader.h"
#include "Measures.h"
#include "TextFolding.h"
#include "UnitRatios.h"
#include "Xlate.h"

#include <algorithm>
#include <utility>

namespace kareport
{

namespace
{

QString quoted(const QStringList &names)
{
    return u'"' + names.join(QStringLiteral("\", \"")) + u'"';
}

} // namespace

TableGroups GroupBinding::bind(const TableShape &shape, const std::vector<unsigned> &sortIds)
{
    bindLevels(shape);
    groups_.tableTotals = lines(shape.totals, {});
    groups_.pageTotals = lines(shape.pageTotals, {});
    groups_.addsPrinted = shape.addsPrinted;
    if (!lookup_.error()) {
        checkSort(shape, sortIds);
    }
    if (shape.rounding && groups_.variables.empty()) {
        lookup_.fail(*shape.rounding, Xlate("\"rounding\" was expected only with totals"));
    }
    return std::move(groups_);
}

void GroupBinding::bindLevels(const TableShape &shape)
{
    for (const TableShape::Group &group : shape.groups) {
        GroupLevel level;
        for (const TableShape::Name &name : group.by) {
            by_.push_back(lookup_.find(name));
            level.ids.push_back(by_.back().id);
        }
        level.hasHeading = group.heading.has_value();
        if (group.heading) {
            level.heading = text(*group.heading, by_);
        }
        level.totals = lines(group.totals, by_);
        level.before = group.before;
        level.keep = group.keep;
        level.newPage = group.newPage;
        groups_.levels.push_back(std::move(level));
    }
}

/// Rows of a group come one after the other only where they are sorted by what makes the groups.
void GroupBinding::checkSort(const TableShape &shape, const std::vector<unsigned> &sortIds)
{
    bool areFirst = by_.size() <= sortIds.size();
    for (std::size_t i = 0; areFirst && i < by_.size(); ++i) {
        areFirst = by_[i].id == sortIds[i];
    }
    if (areFirst) {
        return;
    }
    QStringList names;
    for (const FoundVariable &variable : by_) {
        names.append(variable.name);
    }
    const sXmlSortTableReport *sort =
        lookup_.surroundings().reportTemplate.GetSortList(lookup_.surroundings().table.Name);
    QStringList keys;
    if (sort != nullptr) {
        for (const sXmlSortVariable &key : sort->Entries) {
            keys.append(key.VariableName);
        }
    }
    for (const TableShape::Name &key : shape.sort) {
        keys.append(key.text);
    }
    const QString expected = Xlate("groups by %1 need rows that are sorted by them first").arg(quoted(names));
    lookup_.fail(shape.groups.front().by.front().path,
                 expected + QStringLiteral(": ") +
                     (keys.isEmpty() ? Xlate("the key \"sort\" was expected in the step")
                                     : Xlate("they are sorted by %1").arg(quoted(keys))));
}

TotalCell GroupBinding::total(TotalKind kind, const TableShape::Name &name)
{
    const FoundVariable variable = lookup_.find(name);
    TotalCell cell;
    cell.kind = kind;
    if (lookup_.error()) {
        return cell;
    }
    if (cell.kind != TotalKind::Count && !isAdded(variable.type)) {
        lookup_.fail(name.path,
                     Xlate("values of the variable \"%1\" cannot be added up: a number, a length, an area or "
                           "an angle was expected, or \"count\"")
                         .arg(name.text));
        return cell;
    }
    const auto found =
        std::find_if(groups_.variables.begin(), groups_.variables.end(), [&](const TotalledVariable &other) {
            return equalFolded(other.field.VariableName, variable.name);
        });
    cell.variable = static_cast<std::size_t>(found - groups_.variables.begin());
    if (found == groups_.variables.end()) {
        TotalledVariable added;
        added.field = lookup_.fieldOf(variable);
        added.suffix = lookup_.suffixOf(variable);
        added.reader = variable.reader;
        added.isNumber = isNumeric(variable.type);
        added.ratio = unitRatio(variable.type, lookup_.surroundings().units, lookup_.surroundings().settings);
        if (variable.reader.perUnit() != 1) {
            added.ratio.divisors.push_back(static_cast<quint32>(variable.reader.perUnit()));
        }
        groups_.variables.push_back(std::move(added));
    }
    return cell;
}

GroupText GroupBinding::text(const TableShape::Name &name, const std::vector<FoundVariable> &by)
{
    return readGroupText(
        name, by, [this](TotalKind kind, const TableShape::Name &variable) { return total(kind, variable); }, lookup_);
}

std::vector<TotalLine> GroupBinding::lines(const std::vector<TableShape::TotalLine> &lines,
                                           const std::vector<FoundVariable> &by)
{
    std::vector<TotalLine> bound;
    for (const TableShape::TotalLine &line : lines) {
        TotalLine one;
        one.label = text(line.label, by);
        for (const TableShape::Total &asked : line.totals) {
            const TotalCell cell = total(asked.kind, asked.variable);
            if (lookup_.error()) {
                break;
            }
            if (lookup_.columnOf(lookup_.find(asked.variable)) == nullptr) {
                lookup_.fail(asked.variable.path, Xlate("the table \"%1\" has no column \"%2\" for a total")
                                                      .arg(lookup_.surroundings().table.Name, asked.variable.text));
            }
            const bool isTwice = std::any_of(one.cells.begin(), one.cells.end(),
                                             [&](const TotalCell &other) { return other.variable == cell.variable; });
            if (isTwice) {
                lookup_.fail(asked.variable.path,
                             Xlate("the column \"%1\" has a total already: another line was expected for a second one")
                                 .arg(asked.variable.text));
            }
            one.cells.push_back(cell);
        }
        bound.push_back(std::move(one));
    }
    return bound;
}

} // namespace kareport
