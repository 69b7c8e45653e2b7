#include "JobSteps.h"

#include "NameQuestions.h"
#include "TemplateSource.h"
#include "TextFolding.h"
#include "UXmlReportTpl.h"
#include "Xlate.h"

#include <algorithm>

// What the steps of a job note on the data and the template.

namespace kareport
{

namespace
{

/// The first of two errors.
std::optional<InputError> firstOf(std::optional<InputError> first, std::optional<InputError> second)
{
    return first ? first : second;
}

/// What is said of a value, and of several.
struct ValueSentences
{
    QString one;
    QString several;
};

ValueSentences wideSentences()
{
    return {Xlate("%1 value is wider than the field \"%2\" of the %3 \"%4\", in row %5, line %6 of the report"),
            Xlate("%1 values are wider than the field \"%2\" of the %3 \"%4\", the first one in row %5, line %6 of the "
                  "report")};
}

ValueSentences hashSentences()
{
    return {Xlate("%1 value is wider than the field \"%2\" of the %3 \"%4\" and shows as #, in row %5, line %6 of the "
                  "report"),
            Xlate("%1 values are wider than the field \"%2\" of the %3 \"%4\" and show as #, the first one in row %5, "
                  "line %6 of the report")};
}

ValueSentences infiniteSentences()
{
    return {
        Xlate("%1 value of the field \"%2\" of the %3 \"%4\" is infinite or not a number, in row %5, line %6 of the "
              "report"),
        Xlate("%1 values of the field \"%2\" of the %3 \"%4\" are infinite or not a number, the first one in row %5, "
              "line %6 of the report")};
}

ValueSentences zeroSentences()
{
    return {Xlate("%1 value of the field \"%2\" of the %3 \"%4\" is missing and shows as 0, in row %5, line %6 of the "
                  "report"),
            Xlate("%1 values of the field \"%2\" of the %3 \"%4\" are missing and show as 0, the first one in row %5, "
                  "line %6 of the report")};
}

ValueSentences blankSentences()
{
    return {
        Xlate("%1 value of the field \"%2\" of the %3 \"%4\" is missing and shows as blanks, in row %5, line %6 of the "
              "report"),
        Xlate("%1 values of the field \"%2\" of the %3 \"%4\" are missing and show as blanks, the first one in row "
              "%5, line %6 of the report")};
}

ValueSentences missingInTotals()
{
    return {
        Xlate("%1 value of the variable \"%2\" is missing and in no total of the table \"%3\", in row %4"),
        Xlate(
            "%1 values of the variable \"%2\" are missing and in no total of the table \"%3\", the first one in row %4")};
}

ValueSentences infiniteInTotals()
{
    return {
        Xlate("%1 value of the variable \"%2\" is infinite or not a number and in no total of the table \"%3\", in row "
              "%4"),
        Xlate("%1 values of the variable \"%2\" are infinite or not a number and in no total of the table \"%3\", the "
              "first one in row %4")};
}

} // namespace

/// Something about a variable that a table or block names, with its place in the template; the step has one anyway.
InputError JobSteps::inTemplate(TemplatePart part, const QString &variable, const WrittenRecord &record,
                                const QString &text)
{
    if (job_.reportTemplate && !arePlacesRead_) {
        arePlacesRead_ = true;
        const auto file = readTemplateSource(job_.reportTemplate->file);
        if (const auto *content = std::get_if<TemplateFile>(&file)) {
            places_ = std::make_unique<VariablePlaces>(*content, job_.reportTemplate->name);
        }
    }
    const auto place = places_ ? places_->of(part, record.name, variable) : std::nullopt;
    return place ? InputError{job_.reportTemplate->file, place, text} : source_.errorAt(record.path, text);
}

/// Notes what of the data and of a table or block does not match.
JobSteps::Wrong JobSteps::noteColumns(const SourceColumns &columns, const QString &data, const WrittenRecord &record)
{
    const ColumnComparison compared(columns, *report_.GetTemplate()->GetDictionary(record.use), data, questions_);
    const QString pair = record.use + QChar() + data;
    const bool isNew = !comparedData_.contains(pair); // the notes of another step on them are there already
    comparedData_.insert(pair);
    auto wrong = isNew ? notes_.add(compared.unknownColumns()) : std::nullopt;
    for (const UnfilledField &field : compared.unfilledFields(record.fields)) {
        wrong = firstOf(wrong, noteField(field, record));
    }
    noteUnits(compared, data);
    return wrong;
}

/// Notes the units that nobody says, once for a data set.
void JobSteps::noteUnits(const ColumnComparison &compared, const QString &data)
{
    const Job::DataSet &set = *job_.data.constFind(data);
    if (set.source->hasOwnUnits()) {
        return;
    }
    for (const QString &key : compared.assumedUnits(set.units)) {
        const QString noted = key + u':' + data;
        if (!notedUnits_.contains(noted)) {
            notedUnits_.insert(noted); // finding the place reads the job from its beginning
            const QString text =
                Xlate("the data \"%1\" does not say the unit of its numbers: %2 was taken").arg(data, key);
            notes_.add({{JobNote::Kind::AssumedUnit, source_.errorAt({QStringLiteral("data"), data}, text)}});
        }
    }
}

JobSteps::Wrong JobSteps::noteField(const UnfilledField &field, const WrittenRecord &record)
{
    using Kind = JobNote::Kind;
    if (!field.isVariable) {
        const QString sentence = Xlate("the field \"%1\" of the %2 \"%3\" is not a variable of the dictionary \"%4\"")
                                     .arg(field.variable, record.what, record.name, record.use);
        return notes_.add({{Kind::UnfilledField, inTemplate(record.part, field.variable, record,
                                                            joinedQuestion(sentence, field.question))}});
    }
    const QString sentence =
        Xlate("no column fills the field \"%1\" of the %2 \"%3\"").arg(field.variable, record.what, record.name);
    const QString reason = field.shown.isEmpty() ? sentence
                                                 : sentence + QStringLiteral("; ") +
                                                       Xlate("\"%1\" has the same ID and shows there").arg(field.shown);
    return notes_.add({{Kind::UnfilledField, source_.errorAt(record.path, joinedQuestion(reason, field.question))}});
}

/// Notes sort keys that the dictionary does not have: the key before such a one counts in its place.
JobSteps::Wrong JobSteps::noteSortKeys(const WrittenRecord &record)
{
    const UXmlReportTpl &tpl = *report_.GetTemplate();
    const sXmlSortTableReport *sort = tpl.GetSortList(record.name);
    Wrong wrong;
    if (sort == nullptr) {
        return wrong;
    }
    const QStringList names = variableNames(*tpl.GetDictionary(record.use));
    QSet<QString> known;
    for (const QString &name : names) {
        known.insert(foldedKey(name));
    }
    for (const sXmlSortVariable &key : sort->Entries) {
        if (known.contains(foldedKey(key.VariableName))) {
            continue;
        }
        const QString sentence =
            Xlate("the sort key \"%1\" of the table \"%2\" is not a variable of the dictionary \"%3\"")
                .arg(key.VariableName, record.name, record.use);
        const QString question = questions_.ask(record.use, key.VariableName, [&names] { return names; });
        const QString text = joinedQuestion(sentence, question);
        wrong = firstOf(wrong, notes_.add({{JobNote::Kind::UnknownSortKey,
                                            inTemplate(TemplatePart::SortKey, key.VariableName, record, text)}}));
    }
    return wrong;
}

/// Notes which values of a table or block that was written do not show as they are.
JobSteps::Wrong JobSteps::noteValues(RowList &rows, const std::optional<SourceColumns> &columns,
                                     const WrittenRecord &record)
{
    const QStringList variables = columns ? columns->variables : QStringList();
    const QSet<QString> read(variables.begin(), variables.end());
    Wrong wrong;
    for (const ColumnRemarks &column : notes_.remarks.columns) {
        const bool isRead = !columns || read.contains(foldedKey(column.variable));
        wrong = firstOf(wrong, noteValue(column, isRead, rows, record));
    }
    return wrong;
}

JobSteps::Wrong JobSteps::noteValue(const ColumnRemarks &column, bool isRead, RowList &rows,
                                    const WrittenRecord &record)
{
    using Kind = JobNote::Kind;
    Wrong wrong;
    const auto note = [&](Kind kind, const ValueCount &values, const ValueSentences &sentences) {
        if (values.count == 0) {
            return;
        }
        const QString text = (values.count == 1 ? sentences.one : sentences.several)
                                 .arg(QString::number(values.count), column.variable, record.what, record.name,
                                      QString::number(values.firstRow), QString::number(values.firstLine));
        JobNote found = {kind, source_.errorAt(record.path, text), values.firstLine, values.count, values.firstRow};
        const auto place = rows.placeOf(static_cast<std::size_t>(values.firstRow) - 1, column.variable);
        found.dataFile = place.file;
        found.dataPlace = place.place;
        wrong = firstOf(wrong, notes_.add({found}));
    };
    note(Kind::WideValue, column.tooWide, job_.options.printHash ? hashSentences() : wideSentences());
    note(Kind::NotFinite, column.notFinite, infiniteSentences());
    // Of a field that no column fills there is a note already.
    if (isRead) {
        note(Kind::MissingValue, column.missing, zeroSentences());
        note(Kind::BlankValue, column.blank, blankSentences());
    }
    return wrong;
}

/// Notes which values are in no total of a table that was written.
JobSteps::Wrong JobSteps::noteLeftOut(ShownRows &rows, const WrittenRecord &record)
{
    Wrong wrong;
    const auto note = [&](const QString &variable, quint64 count, quint64 firstRow, const ValueSentences &sentences) {
        if (count == 0) {
            return;
        }
        const QString text = (count == 1 ? sentences.one : sentences.several)
                                 .arg(QString::number(count), variable, record.name, QString::number(firstRow));
        JobNote found = {JobNote::Kind::NotInTotal, source_.errorAt(record.path, text), 0, count, firstRow};
        const auto place = rows.placeOf(static_cast<std::size_t>(firstRow) - 1, variable);
        found.dataFile = place.file;
        found.dataPlace = place.place;
        wrong = firstOf(wrong, notes_.add({found}));
    };
    const auto &variables = rows.groups().variables;
    for (std::size_t i = 0; i < rows.leftOut().size(); ++i) {
        const LeftOut &out = rows.leftOut()[i];
        if (variables[i].isAdded) {
            const QString &name = variables[i].field.VariableName;
            note(name, out.missing, out.firstMissing, missingInTotals());
            note(name, out.notFinite, out.firstNotFinite, infiniteInTotals());
        }
    }
    return wrong;
}

/// Notes what a source says of itself.
JobSteps::Wrong JobSteps::noteSource(const RowList &rows)
{
    using Kind = JobNote::Kind;
    Wrong wrong;
    for (const InputError &note : rows.notes()) {
        wrong = firstOf(wrong, notes_.add({{note.place ? Kind::Difference : Kind::PassedOver, note}}));
    }
    for (const InputError &note : rows.differences()) {
        wrong = firstOf(wrong, notes_.add({{Kind::Difference, note}}));
    }
    return wrong;
}

} // namespace kareport
