#include "ColumnNotes.h"

#include "FieldFormatter.h"
#include "FieldMarker.h"
#include "TextFolding.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// More columns than this are not worth a note each: the file is then read with the wrong delimiter, or is not a table.
constexpr std::size_t mostColumnNotes = 100;
/// How many names a misspelt one is compared with.
constexpr qsizetype mostNames = 1000;
/// More fields than this are not asked about: looking for the nearest name takes long.
constexpr std::size_t mostQuestions = 100;

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

ColumnComparison::ColumnComparison(const SourceColumns &columns, const sXmlReportDictionary &dictionary,
                                   const QString &data, NameQuestions &questions)
    : columns_(columns),
      dictionary_(dictionary),
      data_(data),
      questions_(questions),
      read_(columns.variables.begin(), columns.variables.end())
{
    for (const sXmlReportVariable &variable : dictionary.Variables) {
        const QString key = foldedKey(variable.VariableName);
        variables_.insert(key, &variable);
        if (read_.contains(key)) {
            readById_.insert(variable.ID, &variable);
        }
    }
}

bool ColumnComparison::isRead(const QString &variable) const
{
    return read_.contains(foldedKey(variable));
}

/// Whether a column is not a variable. One whose variable is read from another column, as the job says, is a variable all the same.
bool ColumnComparison::isUnknown(const SourceColumn &column) const
{
    return !column.isKnown && !column.isOffered && !column.name.isEmpty() &&
           !variables_.contains(foldedKey(column.name));
}

/// The variable that shows in place of another one: it is read, under the same identifier, and what it has is a number
/// where a number is shown.
QString ColumnComparison::shownInstead(const sXmlReportVariable &variable) const
{
    const auto [begin, end] = readById_.equal_range(variable.ID);
    QString shown;
    qsizetype last = -1;
    for (auto other = begin; other != end; ++other) {
        const bool shows = (FieldFormatter::kindsOf((*other)->Type) & FieldFormatter::kindsOf(variable.Type)) != 0;
        const qsizetype column = columns_.variables.lastIndexOf(foldedKey((*other)->VariableName));
        if (shows && column > last) { // the column that is read last takes the place of the others
            shown = (*other)->VariableName;
            last = column;
        }
    }
    return shown;
}

/// Asks which variable of the dictionary was meant.
QString ColumnComparison::variableQuestion(const QString &name) const
{
    return questions_.ask(dictionary_.DictionaryName, name, [this] { return variableNames(dictionary_); });
}

/// Asks which column was meant of those that are not variables.
QString ColumnComparison::columnQuestion(const QString &name) const
{
    return questions_.ask(dictionary_.DictionaryName + QChar() + data_, name, [this] {
        QStringList unknown;
        for (const SourceColumn &column : columns_.columns) {
            if (isUnknown(column) && unknown.size() < mostNames) {
                unknown.append(column.name);
            }
        }
        return unknown;
    });
}

std::vector<JobNote> ColumnComparison::unknownColumns(const AtName &atName) const
{
    std::vector<JobNote> notes;
    std::size_t more = 0;
    for (std::size_t i = 0; i < columns_.columns.size(); ++i) {
        const SourceColumn &column = columns_.columns[i];
        if (!isUnknown(column)) {
            continue;
        }
        if (notes.size() == mostColumnNotes) {
            ++more;
            continue;
        }
        const QString sentence = Xlate("the column \"%1\" is not a variable of the dictionary \"%2\"")
                                     .arg(column.name, dictionary_.DictionaryName);
        const QString text = joinedQuestion(sentence, variableQuestion(column.name));
        notes.push_back({JobNote::Kind::UnknownColumn, column.namer == ColumnNamer::Data
                                                           ? InputError{columns_.source, column.place, text}
                                                           : atName(column.namer, i, text)});
    }
    if (more > 0) {
        const QString sentence = more == 1 ? Xlate("%1 more column is not a variable of the dictionary \"%2\"")
                                           : Xlate("%1 more columns are not variables of the dictionary \"%2\"");
        const QString text = sentence.arg(QString::number(more), dictionary_.DictionaryName);
        notes.push_back({JobNote::Kind::UnknownColumn, InputError{columns_.source, std::nullopt, text}});
    }
    return notes;
}

QStringList ColumnComparison::assumedUnits(const DataUnits &units) const
{
    QStringList keys;
    for (const sXmlReportVariable &variable : dictionary_.Variables) {
        const QString key = units.assumedKey(variable.Type);
        if (!key.isEmpty() && !keys.contains(key) && isRead(variable.VariableName)) {
            keys.append(key);
        }
    }
    return keys;
}

std::vector<UnfilledField> ColumnComparison::unfilledFields(const sXmlReportFields &fields) const
{
    std::vector<UnfilledField> unfilled;
    const auto isAsked = [&unfilled] { return unfilled.size() < mostQuestions; };
    QSet<QString> seen;
    for (const sXmlReportField &field : fields) {
        const QString key = foldedKey(field.VariableName);
        // A marker, or a label without a variable, is filled by no column.
        if (field.VariableName.isEmpty() || fieldMarker(field.VariableName) != FieldMarker::None || seen.contains(key))
        {
            continue;
        }
        seen.insert(key);
        const sXmlReportVariable *variable = variables_.value(key);
        if (variable == nullptr) {
            const QString question = isAsked() ? variableQuestion(field.VariableName) : QString();
            unfilled.push_back({field.VariableName, question, false, {}});
        } else if (!read_.contains(key)) { // not the identifier counts: another variable may have the same one
            const QString question = isAsked() ? columnQuestion(field.VariableName) : QString();
            unfilled.push_back({field.VariableName, question, true, shownInstead(*variable)});
        }
    }
    return unfilled;
}

} // namespace kareport
