#include "VariableLookup.h"

#include "ColumnNotes.h"
#include "FieldMarker.h"
#include "Measures.h"
#include "NearestName.h"
#include "TextFolding.h"
#include "VariableType.h"
#include "Xlate.h"

#include <algorithm>
#include <iterator>
#include <numbers>

namespace kareport
{

namespace
{

/// A whole turn of directions in the data's unit.
Turn turnOf(AngleUnit unit)
{
    constexpr double radians = 2 * std::numbers::pi;
    switch (unit) {
    case AngleUnit::Degree: return {{360 * CellReader::secondsOfDegree, 0}, radians};
    case AngleUnit::Gon: return {{400, 0}, radians};
    case AngleUnit::Radian: break;
    }
    return {{}, radians};
}

} // namespace

std::optional<FoundVariable> VariableLookup::known(const QString &name) const
{
    const auto &[source, tpl, table, units, settings] = surroundings_;
    qint32 id = 0;
    qint32 type = 0;
    if (!tpl.FindVariable(table.Use, name, id, type)) {
        return std::nullopt;
    }
    const bool isInDegrees = measureOf(type) == Measure::Angle && units.angle == AngleUnit::Degree;
    FoundVariable found = {name, static_cast<quint32>(id), type,
                           CellReader(units.factorOf(type), isInDegrees ? CellReader::secondsOfDegree : 1),
                           std::nullopt};
    if (type == VARIABLE_BEARING) {
        found.turn = turnOf(units.angle);
    }
    return found;
}

FoundVariable VariableLookup::find(const TableShape::Name &name)
{
    const auto found = known(name.text);
    if (!found) {
        const sXmlReportTable &table = surroundings_.table;
        const QStringList names = variableNames(*surroundings_.reportTemplate.GetDictionary(table.Use));
        fail(name.path, Xlate("the dictionary \"%1\" has no variable \"%2\": %3")
                            .arg(table.Use, name.text, oneOfExpected(name.text, names)));
        return {};
    }
    const bool isNew = std::none_of(found_.begin(), found_.end(),
                                    [&](const FoundVariable &other) { return equalFolded(other.name, name.text); });
    if (isNew) {
        found_.push_back(*found);
    }
    return *found;
}

void VariableLookup::addSet(const QString &variable, int stage)
{
    const auto found = known(variable);
    if (found && !isSet(found->id)) {
        sets_.push_back({found->id, stage});
    }
}

const VariableLookup::Set *VariableLookup::setAt(quint32 id) const
{
    const auto set = std::find_if(sets_.begin(), sets_.end(), [id](const Set &other) { return other.id == id; });
    return set != sets_.end() ? &*set : nullptr;
}

void VariableLookup::expectSet(const TableShape::Name &name, const FoundVariable &variable)
{
    const Set *set = setAt(variable.id);
    if (set != nullptr && set->stage >= stage_) {
        fail(name.path,
             Xlate("the step sets \"%1\" only after this: a variable of the data, or one that is set before, was "
                   "expected")
                 .arg(name.text));
    }
}

QStringList VariableLookup::needed() const
{
    QStringList names;
    for (const FoundVariable &variable : found_) {
        if (!isSet(variable.id)) {
            names.append(variable.name);
        }
    }
    return names;
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

QString VariableLookup::suffixOf(const FoundVariable &variable) const
{
    const sXmlReportFields &fields = surroundings_.table.Fields;
    const sXmlReportField *column = columnOf(variable);
    if (column == nullptr || column == &fields.front()) {
        return {};
    }
    switch (fieldMarker(std::prev(column)->VariableName)) {
    case FieldMarker::SuffixR: return QStringLiteral("R");
    case FieldMarker::SuffixPlus: return QStringLiteral("+");
    default: return {};
    }
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
