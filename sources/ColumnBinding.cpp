#include "ColumnBinding.h"

#include "NearestName.h"
#include "TextFolding.h"
#include "Xlate.h"

#include <QHash>

#include <algorithm>

namespace kareport
{

namespace
{

/// The first column that a choice means. A number beyond the columns is the name of one, such as a year.
std::optional<std::size_t> columnOf(const ColumnChoice &choice, const std::vector<SourceColumn> &columns)
{
    const int *number = std::get_if<int>(&choice.column);
    if (number != nullptr && *number >= 1 && static_cast<std::size_t>(*number) <= columns.size()) {
        return static_cast<std::size_t>(*number - 1);
    }
    const QString name = number != nullptr ? QString::number(*number) : std::get<QString>(choice.column);
    for (std::size_t i = 0; i < columns.size(); ++i) {
        if (equalFolded(columns[i].name, name)) {
            return i;
        }
    }
    return std::nullopt;
}

QString noColumn(const ColumnChoice &choice, const std::vector<SourceColumn> &columns)
{
    if (const int *number = std::get_if<int>(&choice.column)) {
        return Xlate("there is no column %1: one of 1 to %2 was expected").arg(*number).arg(columns.size());
    }
    const QString &name = std::get<QString>(choice.column);
    return withExpected(Xlate("there is no column \"%1\"").arg(name), name, namesOf(columns));
}

QString twice(std::size_t first, std::size_t second, const QString &name)
{
    return Xlate("the columns %1 and %2 are both named \"%3\": each variable was expected once")
        .arg(QString::number(first + 1), QString::number(second + 1), name);
}

} // namespace

QStringList namesOf(const std::vector<SourceColumn> &columns)
{
    QStringList names;
    for (const SourceColumn &column : columns) {
        if (!column.name.isEmpty()) {
            names.append(column.name);
        }
    }
    return names;
}

std::optional<ColumnFault> ColumnBinding::bind(std::vector<SourceColumn> &columns,
                                               const std::vector<ColumnChoice> &choices, const Variables &variables)
{
    if (auto fault = bindChoices(columns, choices, variables)) {
        return fault;
    }
    if (auto fault = bindNames(columns, choices, variables)) {
        return fault;
    }
    // Cells are looked at in their order, so that the first wrong one is reported.
    std::stable_sort(fields_.begin(), fields_.end(),
                     [](const BoundField &left, const BoundField &right) { return left.column < right.column; });
    noteIds();
    return std::nullopt;
}

std::optional<ColumnFault> ColumnBinding::bindChoices(std::vector<SourceColumn> &columns,
                                                      const std::vector<ColumnChoice> &choices,
                                                      const Variables &variables)
{
    QStringList chosen;
    for (const ColumnChoice &choice : choices) {
        const auto parser = variables.find(choice.variable);
        if (!parser) {
            return ColumnFault{std::nullopt, choice.variable,
                               withExpected(Xlate("the dictionary has no variable \"%1\"").arg(choice.variable),
                                            choice.variable, variables.names)};
        }
        if (chosen.contains(foldedKey(choice.variable))) {
            return ColumnFault{
                std::nullopt, choice.variable,
                Xlate("the variable \"%1\" has two columns: each variable was expected once").arg(choice.variable)};
        }
        chosen.append(foldedKey(choice.variable));
        const auto column = columnOf(choice, columns);
        if (!column) {
            return ColumnFault{std::nullopt, choice.variable, noColumn(choice, columns)};
        }
        SourceColumn &found = columns[*column];
        const auto second =
            std::find_if(columns.begin() + static_cast<std::ptrdiff_t>(*column) + 1, columns.end(),
                         [&](const SourceColumn &other) { return equalFolded(other.name, found.name); });
        if (std::holds_alternative<QString>(choice.column) && second != columns.end()) {
            const auto index = static_cast<std::size_t>(second - columns.begin());
            return ColumnFault{index, choice.variable, twice(*column, index, found.name)};
        }
        found.isKnown = true;
        fields_.push_back({*column, found.name.isEmpty() ? choice.variable : found.name, *parser, choice.variable});
    }
    return std::nullopt;
}

std::optional<ColumnFault> ColumnBinding::bindNames(std::vector<SourceColumn> &columns,
                                                    const std::vector<ColumnChoice> &choices,
                                                    const Variables &variables)
{
    struct Named
    {
        std::size_t column;
        bool isVariable;
    };
    QHash<QString, Named> names;
    for (const ColumnChoice &choice : choices) {
        names.insert(foldedKey(choice.variable), {columns.size(), false});
    }
    for (std::size_t i = 0; i < columns.size(); ++i) {
        SourceColumn &column = columns[i];
        const QString key = foldedKey(column.name);
        const auto earlier = names.constFind(key);
        const bool isChosen = earlier != names.constEnd() && earlier->column == columns.size();
        if (column.isKnown || isChosen) {
            continue;
        }
        const auto parser = variables.find(column.name);
        if (earlier != names.constEnd() && (parser || earlier->isVariable)) {
            return ColumnFault{i, QString(), twice(earlier->column, i, column.name)};
        }
        names.insert(key, {i, parser.has_value()});
        if (parser) {
            column.isKnown = true;
            fields_.push_back({i, column.name, *parser, column.name});
        }
    }
    return std::nullopt;
}

void ColumnBinding::noteIds()
{
    for (const BoundField &field : fields_) {
        const unsigned id = field.parser.id();
        (std::find(ids_.begin(), ids_.end(), id) == ids_.end() ? ids_ : sharedIds_).push_back(id);
    }
}

QStringList ColumnBinding::variables() const
{
    QStringList names;
    for (const BoundField &field : fields_) {
        names.append(foldedKey(field.variable));
    }
    return names;
}

void ColumnBinding::storeNone(const BoundField &field, UDictionary &object) const
{
    if (!isShared(field)) {
        object.Remove(field.parser.id());
    }
}

} // namespace kareport
