#include "ColumnMapping.h"

#include "TextFolding.h"

#include <QJsonArray>

#include <algorithm>

namespace kareport
{

namespace
{

const QString skipped = QStringLiteral("-");

/// Whether a column can be named by its name: no other one has it.
bool isNamed(const DataPreview &own, std::size_t column)
{
    const QString &name = own.columns[column].name;
    return !name.isEmpty() && std::count_if(own.columns.begin(), own.columns.end(), [&](const PreviewedColumn &other) {
                                  return equalFolded(other.name, name);
                              }) == 1;
}

int columnOf(const QJsonValue &value, const DataPreview &own)
{
    if (value.isDouble()) {
        return value.toInt() - 1;
    }
    const auto found = std::find_if(own.columns.begin(), own.columns.end(), [&](const PreviewedColumn &column) {
        return equalFolded(column.name, value.toString());
    });
    return found != own.columns.end() ? static_cast<int>(found - own.columns.begin()) : -1;
}

} // namespace

void ColumnMapping::choose(int column, const QString &variable)
{
    chosen_.insert_or_assign(column, Choice{variable, ++choices_});
}

bool ColumnMapping::isOvertaken(int column, const Choice &choice) const
{
    return std::any_of(chosen_.begin(), chosen_.end(), [&](const auto &other) {
        return other.first != column && other.second.number > choice.number &&
               equalFolded(other.second.variable, choice.variable);
    });
}

QStringList ColumnMapping::variables(const DataPreview &own) const
{
    QStringList variables;
    for (std::size_t i = 0; i < own.columns.size(); ++i) {
        const auto chosen = chosen_.find(static_cast<int>(i));
        if (chosen != chosen_.end()) {
            const Choice &choice = chosen->second;
            variables.append(isOvertaken(chosen->first, choice) ? QString() : choice.variable);
            continue;
        }
        const QString &name = own.columns[i].variable;
        const bool isTaken = std::any_of(chosen_.begin(), chosen_.end(),
                                         [&](const auto &other) { return equalFolded(other.second.variable, name); });
        variables.append(isTaken ? QString() : name);
    }
    return variables;
}

QJsonObject ColumnMapping::put(QJsonObject options, const DataPreview &own, bool takesList) const
{
    if (isEmpty()) {
        return options;
    }
    const QStringList wanted = variables(own);
    // A column that is not read although its name, or the order, says so can be left out of a list alone.
    bool isLeftOut = false;
    QJsonObject byVariable;
    QJsonArray inOrder;
    for (qsizetype i = 0; i < wanted.size(); ++i) {
        const QString &variable = wanted[i];
        const QString &name = own.columns[static_cast<std::size_t>(i)].variable;
        inOrder.append(variable.isEmpty() ? skipped : variable);
        isLeftOut = isLeftOut || (variable.isEmpty() && !name.isEmpty() && !wanted.contains(name, Qt::CaseInsensitive));
        if (!variable.isEmpty() && !equalFolded(variable, name)) {
            const bool hasName = isNamed(own, static_cast<std::size_t>(i)) && !options.contains(orderKey);
            byVariable.insert(variable, hasName ? QJsonValue(own.columns[static_cast<std::size_t>(i)].name)
                                                : QJsonValue(static_cast<int>(i) + 1));
        }
    }
    if (isLeftOut && takesList) {
        options.remove(orderKey);
        options.insert(columnsKey, inOrder);
    } else if (!byVariable.isEmpty()) {
        options.insert(columnsKey, byVariable);
    }
    return options;
}

void ColumnMapping::take(const QJsonObject &options, const DataPreview &own)
{
    clear();
    const QJsonValue columns = options.value(columnsKey);
    const int count = static_cast<int>(own.columns.size());
    const QJsonArray inOrder = columns.toArray();
    for (qsizetype i = 0; i < std::min<qsizetype>(inOrder.size(), count); ++i) {
        const QString name = inOrder[i].toString();
        choose(static_cast<int>(i), name == skipped ? QString() : name);
    }
    const QJsonObject byVariable = columns.toObject();
    for (auto variable = byVariable.begin(); variable != byVariable.end(); ++variable) {
        const int column = columnOf(variable.value(), own);
        if (column >= 0 && column < count) {
            choose(column, variable.key());
        }
    }
}

} // namespace kareport
