#include "ColumnNotes.h"

#include "FieldMarker.h"
#include "NearestName.h"
#include "TextFolding.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// Names of columns that nobody reads, which somebody may have meant for a variable.
QStringList unreadNames(const SourceColumns &columns)
{
    QStringList names;
    for (const SourceColumn &column : columns.columns) {
        if (!column.isKnown && !column.isOffered && !column.name.isEmpty()) {
            names.append(column.name);
        }
    }
    return names;
}

} // namespace

std::optional<InputError> StepNotes::add(const std::vector<JobNote> &found) const
{
    for (const JobNote &note : found) {
        notes.add(note);
    }
    const auto wrong = std::find_if(found.begin(), found.end(), [](const JobNote &note) { return note.isMistake(); });
    return isStrict && wrong != found.end() ? std::optional(wrong->about) : std::nullopt;
}

QStringList variableNames(const sXmlReportDictionary &dictionary)
{
    QStringList names;
    for (const sXmlReportVariable &variable : dictionary.Variables) {
        names.append(variable.VariableName);
    }
    return names;
}

std::vector<JobNote> unknownColumns(const SourceColumns &columns, const sXmlReportDictionary &dictionary)
{
    std::vector<JobNote> notes;
    const QStringList names = variableNames(dictionary);
    for (const SourceColumn &column : columns.columns) {
        if (column.isKnown || column.isOffered || column.name.isEmpty()) {
            continue;
        }
        const QString sentence = Xlate("the column \"%1\" is no variable of the dictionary \"%2\"")
                                     .arg(column.name, dictionary.DictionaryName);
        const QString question = didYouMean(column.name, names);
        const QString text = question.isEmpty() ? sentence : sentence + QStringLiteral(": ") + question;
        notes.push_back({JobNote::Kind::UnknownColumn, InputError{columns.source, column.place, text}});
    }
    return notes;
}

QStringList assumedUnits(const SourceColumns &columns, const sXmlReportDictionary &dictionary, const DataUnits &units)
{
    QStringList keys;
    for (const sXmlReportVariable &variable : dictionary.Variables) {
        const auto id = static_cast<unsigned>(variable.ID);
        const QString key = units.assumedKey(variable.Type);
        const bool isRead = std::find(columns.ids.begin(), columns.ids.end(), id) != columns.ids.end();
        if (isRead && !key.isEmpty() && !keys.contains(key)) {
            keys.append(key);
        }
    }
    return keys;
}

std::vector<UnfilledField> unfilledFields(const SourceColumns &columns, const sXmlReportFields &fields,
                                          const sXmlReportDictionary &dictionary)
{
    std::vector<UnfilledField> unfilled;
    const QStringList unread = unreadNames(columns);
    QStringList seen;
    for (const sXmlReportField &field : fields) {
        // Of several variables with one name the last counts.
        const auto variable = std::find_if(
            dictionary.Variables.rbegin(), dictionary.Variables.rend(),
            [&field](const sXmlReportVariable &other) { return equalFolded(other.VariableName, field.VariableName); });
        // A marker, or a label without a variable, is filled by no column.
        if (field.VariableName.isEmpty() || fieldMarker(field.VariableName) != FieldMarker::None ||
            seen.contains(foldedKey(field.VariableName)))
        {
            continue;
        }
        seen.append(foldedKey(field.VariableName));
        if (variable == dictionary.Variables.rend()) {
            unfilled.push_back({field.VariableName, didYouMean(field.VariableName, variableNames(dictionary)), false});
            continue;
        }
        const auto id = static_cast<unsigned>(variable->ID);
        if (std::find(columns.ids.begin(), columns.ids.end(), id) == columns.ids.end()) {
            unfilled.push_back({field.VariableName, didYouMean(field.VariableName, unread), true});
        }
    }
    return unfilled;
}

} // namespace kareport
