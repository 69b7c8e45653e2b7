#include "ResultColumns.h"

#include "TextFolding.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// The key of the unit that numbers of a value type are in; empty for a type without a unit.
QString unitOf(int type, DataUnits units)
{
    units.isLengthSaid = false;
    units.isAreaSaid = false;
    units.isAngleSaid = false;
    return units.assumedKey(type);
}

} // namespace

void describeColumn(ResultColumn &column, const sXmlReportDictionary &dictionary, const DataUnits &units)
{
    const auto &variables = dictionary.Variables;
    column.isVariable = std::any_of(variables.begin(), variables.end(), [&](const sXmlReportVariable &variable) {
        return equalFolded(variable.VariableName, column.field.VariableName);
    });
    column.dataFactor = units.factorOf(column.field.Type);
    column.dataUnit = unitOf(column.field.Type, units);
}

std::optional<ResultColumn> hiddenColumn(const QString &name, const sXmlReportDictionary &dictionary)
{
    // Of several variables of one name the last one counts.
    const auto &variables = dictionary.Variables;
    const auto variable = std::find_if(variables.rbegin(), variables.rend(), [&name](const sXmlReportVariable &other) {
        return equalFolded(other.VariableName, name);
    });
    if (variable == variables.rend()) {
        return std::nullopt;
    }
    ResultColumn column;
    column.field.VariableName = variable->VariableName;
    column.field.Label = variable->VariableName;
    column.field.Align = QStringLiteral("L");
    column.field.ID = variable->ID;
    column.field.Type = variable->Type;
    column.isShown = false;
    return column;
}

} // namespace kareport
