#include "ResultSchema.h"

#include "DataColumns.h"
#include "DataText.h"
#include "JsonText.h"
#include "UJobSettings.h"
#include "UnitFactors.h"
#include "VariableKeywords.h"
#include "VariableType.h"

namespace kareport
{

namespace
{

/// The key of the unit that the report shows values of a type in; empty for those without one. A bearing says its unit
/// itself.
QString shownUnit(int type, const UJobSettings &settings)
{
    switch (type) {
    case VARIABLE_COORDINATE:
    case VARIABLE_LENGTH:
    case VARIABLE_DISTANCE:
    case VARIABLE_ELEVATION:
    case VARIABLE_STATION:
    case VARIABLE_OFFSET: return keyOf(settings.lengthUnit).toString();
    case VARIABLE_AREA: return keyOf(settings.areaUnit).toString();
    case VARIABLE_ANGLE:
    case VARIABLE_VANGLE: return keyOf(settings.angleUnit).toString();
    default: return {};
    }
}

void appendMember(std::string &out, const char *key, QStringView text)
{
    out += '"';
    out += key;
    out += "\": ";
    appendJsonText(out, text);
}

} // namespace

bool ResultSchema::beginTable(const ResultTable &table)
{
    appendMember(name_, table.isTable ? "table" : "block", table.name);
    for (const std::size_t place : dataColumns(table, options_.values)) {
        const ResultColumn &column = table.columns[place];
        const QString unit =
            options_.values == ResultValues::Data ? column.dataUnit : shownUnit(column.field.Type, *table.settings);
        columns_ += columns_.empty() ? "\n    {" : ",\n    {";
        appendMember(columns_, "name", column.field.VariableName);
        columns_ += ", ";
        appendMember(columns_, "label", column.field.Label);
        columns_ += ", ";
        appendMember(columns_, "type", keywordOf(column.field.Type));
        if (!unit.isEmpty()) {
            columns_ += ", ";
            appendMember(columns_, "unit", unit);
        }
        columns_ += column.isShown ? "}" : ", \"shown\": false}";
    }
    return true;
}

void ResultSchema::writeEnd()
{
    out() += "{\n  ";
    out() += name_;
    out() += name_.empty() ? "" : ",\n  ";
    appendMember(out(), "data", options_.data);
    out() += ",\n  ";
    appendMember(out(), "values", options_.values == ResultValues::Data ? u"data" : u"printed");
    out() += ",\n  \"rows\": " + std::to_string(rows_) + ",\n  \"columns\": [" + columns_;
    out() += columns_.empty() ? "]\n}\n" : "\n  ]\n}\n";
}

} // namespace kareport
