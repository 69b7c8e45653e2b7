#include "VariableLookup.h"

#include "ColumnNotes.h"
#include "NearestName.h"
#include "TextFolding.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

FoundVariable VariableLookup::find(const TableShape::Name &name)
{
    const auto &[source, tpl, table, units, settings] = surroundings_;
    qint32 id = 0;
    qint32 type = 0;
    if (!tpl.FindVariable(table.Use, name.text, id, type)) {
        const QStringList names = variableNames(*tpl.GetDictionary(table.Use));
        fail(name.path, Xlate("the dictionary \"%1\" has no variable \"%2\": %3")
                            .arg(table.Use, name.text, oneOfExpected(name.text, names)));
        return {};
    }
    return {name.text, static_cast<quint32>(id), type, CellReader(units.factorOf(type))};
}

const sXmlReportField *VariableLookup::columnOf(const FoundVariable &variable) const
{
    const sXmlReportFields &fields = surroundings_.table.Fields;
    const auto found = std::find_if(fields.begin(), fields.end(), [&](const sXmlReportField &field) {
        return equalFolded(field.VariableName, variable.name);
    });
    return found != fields.end() ? &*found : nullptr;
}

sXmlReportField VariableLookup::fieldOf(const FoundVariable &variable) const
{
    if (const sXmlReportField *column = columnOf(variable)) {
        return *column;
    }
    constexpr int usualDecimals = 3;
    sXmlReportField field;
    field.VariableName = variable.name;
    field.Decimals = usualDecimals;
    field.Align = QStringLiteral("L");
    field.ID = static_cast<qint32>(variable.id);
    field.Type = variable.type;
    return field;
}

std::optional<UDictEntry> VariableLookup::valueOf(const FoundVariable &variable, const TableShape::Value &value)
{
    const ValueParser parser(variable.type, variable.id, surroundings_.units);
    UDictionary object;
    bool fits = false;
    if (const auto given = surroundings_.source.setText(value.path)) {
        fits = parser.store(given->toStdString(), object);
    } else if (value.value.isString()) {
        fits = parser.store(value.value.toString().toStdString(), object);
    } else if (value.value.isDouble()) {
        fits = parser.storeNumber(value.value.toDouble(), object);
    } else if (value.value.isBool()) {
        fits = parser.storeBoolean(value.value.toBool(), object);
    }
    const UDictEntry *entry = object.Find(variable.id);
    if (!fits || entry == nullptr) {
        fail(value.path, Xlate("%1 was expected, as the variable \"%2\" has it").arg(parser.expected(), variable.name));
        return std::nullopt;
    }
    return *entry;
}

} // namespace kareport
