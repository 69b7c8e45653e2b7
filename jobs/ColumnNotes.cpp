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

/// More columns than this are not worth a note each: the file is then read with the wrong delimiter, or is no table.
constexpr std::size_t mostColumnNotes = 100;
/// How many names a misspelt one is compared with.
constexpr qsizetype mostNames = 1000;

bool isUnread(const SourceColumn &column)
{
    return !column.isKnown && !column.isOffered && !column.name.isEmpty();
}

/// Names of columns that are not read and may have been meant for a variable.
QStringList unreadNames(const SourceColumns &columns)
{
    QStringList names;
    for (const SourceColumn &column : columns.columns) {
        if (isUnread(column) && names.size() < mostNames) {
            names.append(column.name);
        }
    }
    return names;
}

/// The variable that is read under the identifier of another one.
QString shownInstead(const SourceColumns &columns, const sXmlReportDictionary &dictionary, qint32 id)
{
    const auto found =
        std::find_if(dictionary.Variables.begin(), dictionary.Variables.end(), [&](const sXmlReportVariable &other) {
            return other.ID == id && isRead(columns, other.VariableName);
        });
    return found != dictionary.Variables.end() ? found->VariableName : QString();
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

bool isRead(const SourceColumns &columns, const QString &variable)
{
    return columns.variables.contains(foldedKey(variable));
}

std::vector<JobNote> unknownColumns(const SourceColumns &columns, const sXmlReportDictionary &dictionary)
{
    std::vector<JobNote> notes;
    const QStringList names = variableNames(dictionary);
    std::size_t more = 0;
    for (const SourceColumn &column : columns.columns) {
        if (!isUnread(column)) {
            continue;
        }
        if (notes.size() == mostColumnNotes) {
            ++more;
            continue;
        }
        const QString sentence = Xlate("the column \"%1\" is not a variable of the dictionary \"%2\"")
                                     .arg(column.name, dictionary.DictionaryName);
        const QString question = didYouMean(column.name, names);
        const QString text = question.isEmpty() ? sentence : sentence + QStringLiteral(": ") + question;
        notes.push_back({JobNote::Kind::UnknownColumn, InputError{columns.source, column.place, text}});
    }
    if (more > 0) {
        const QString text = Xlate("%1 more columns are not variables of the dictionary \"%2\"")
                                 .arg(QString::number(more), dictionary.DictionaryName);
        notes.push_back({JobNote::Kind::UnknownColumn, InputError{columns.source, std::nullopt, text}});
    }
    return notes;
}

QStringList assumedUnits(const SourceColumns &columns, const sXmlReportDictionary &dictionary, const DataUnits &units)
{
    QStringList keys;
    for (const sXmlReportVariable &variable : dictionary.Variables) {
        const QString key = units.assumedKey(variable.Type);
        if (!key.isEmpty() && !keys.contains(key) && isRead(columns, variable.VariableName)) {
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
            unfilled.push_back(
                {field.VariableName, didYouMean(field.VariableName, variableNames(dictionary)), false, {}});
            continue;
        }
        // Not the identifier counts: another variable may have the same one.
        if (!isRead(columns, field.VariableName)) {
            unfilled.push_back({field.VariableName, didYouMean(field.VariableName, unread), true,
                                shownInstead(columns, dictionary, variable->ID)});
        }
    }
    return unfilled;
}

} // namespace kareport
