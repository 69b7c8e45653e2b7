#include "JobSteps.h"

#include "NearestName.h"
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

QString withQuestion(const QString &sentence, const QString &question)
{
    return question.isEmpty() ? sentence : sentence + QStringLiteral(": ") + question;
}

/// The first of two errors.
std::optional<InputError> firstOf(std::optional<InputError> first, std::optional<InputError> second)
{
    return first ? first : second;
}

} // namespace

/// Something about a variable that a table or block names, with its place in the template; the step has one anyway.
InputError JobSteps::inTemplate(TemplatePart part, const QString &variable, const WrittenRecord &record,
                                const QString &text) const
{
    if (job_.reportTemplate) {
        const auto &[path, name] = *job_.reportTemplate;
        const auto file = readTemplateSource(path);
        const auto *content = std::get_if<TemplateFile>(&file);
        const auto place =
            content != nullptr ? placeOfVariable(*content, name, part, record.name, variable) : std::nullopt;
        if (place) {
            return {path, place, text};
        }
    }
    return source_.errorAt(record.path, text);
}

/// Notes what of the data and of a table or block does not match, once the columns are known.
JobSteps::Wrong JobSteps::noteColumns(const RowList &rows, const QString &data, const WrittenRecord &record)
{
    const auto columns = rows.columns();
    if (!columns) {
        return std::nullopt;
    }
    const sXmlReportDictionary &dictionary = *report_.GetTemplate()->GetDictionary(record.use);
    auto wrong = notes_.add(unknownColumns(*columns, dictionary));
    for (const UnfilledField &field : unfilledFields(*columns, record.fields, dictionary)) {
        wrong = firstOf(wrong, noteField(field, record));
    }
    const Job::DataSet &set = *job_.data.constFind(data);
    if (!set.source->hasOwnUnits()) {
        for (const QString &key : assumedUnits(*columns, dictionary, set.units)) {
            const QString text =
                Xlate("the data \"%1\" does not say the unit of its numbers: %2 was taken").arg(data, key);
            notes_.add({{JobNote::Kind::AssumedUnit, source_.errorAt({QStringLiteral("data"), data}, text)}});
        }
    }
    return wrong;
}

JobSteps::Wrong JobSteps::noteField(const UnfilledField &field, const WrittenRecord &record)
{
    using Kind = JobNote::Kind;
    if (!field.isVariable) {
        const QString sentence = Xlate("the field \"%1\" of the %2 \"%3\" is not a variable of the dictionary \"%4\"")
                                     .arg(field.variable, record.what, record.name, record.use);
        return notes_.add({{Kind::UnfilledField,
                            inTemplate(record.part, field.variable, record, withQuestion(sentence, field.question))}});
    }
    const QString sentence =
        Xlate("no column fills the field \"%1\" of the %2 \"%3\"").arg(field.variable, record.what, record.name);
    const QString reason = field.shown.isEmpty() ? sentence
                                                 : sentence + QStringLiteral("; ") +
                                                       Xlate("\"%1\" has the same ID and shows there").arg(field.shown);
    return notes_.add({{Kind::UnfilledField, source_.errorAt(record.path, withQuestion(reason, field.question))}});
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
    for (const sXmlSortVariable &key : sort->Entries) {
        const bool isKnown = std::any_of(names.begin(), names.end(),
                                         [&key](const QString &name) { return equalFolded(name, key.VariableName); });
        if (isKnown) {
            continue;
        }
        const QString sentence =
            Xlate("the sort key \"%1\" of the table \"%2\" is not a variable of the dictionary \"%3\"")
                .arg(key.VariableName, record.name, record.use);
        const QString text = withQuestion(sentence, didYouMean(key.VariableName, names));
        wrong = firstOf(wrong, notes_.add({{JobNote::Kind::UnknownSortKey,
                                            inTemplate(TemplatePart::SortKey, key.VariableName, record, text)}}));
    }
    return wrong;
}

/// Notes which values of a table or block that was written do not show as they are.
JobSteps::Wrong JobSteps::noteValues(const RowList &rows, const WrittenRecord &record)
{
    Wrong wrong;
    for (const ColumnRemarks &column : notes_.remarks.columns) {
        wrong = firstOf(wrong, noteValue(column, rows, record));
    }
    return wrong;
}

JobSteps::Wrong JobSteps::noteValue(const ColumnRemarks &column, const RowList &rows, const WrittenRecord &record)
{
    using Kind = JobNote::Kind;
    Wrong wrong;
    const auto note = [&](Kind kind, const QString &sentence, const ValueCount &values) {
        if (values.count == 0) {
            return;
        }
        const QString text = sentence.arg(QString::number(values.count), column.variable, record.what, record.name,
                                          QString::number(values.firstRow), QString::number(values.firstLine));
        wrong = firstOf(wrong, notes_.add({{kind, source_.errorAt(record.path, text), values.firstLine, values.count,
                                            values.firstRow}}));
    };
    note(Kind::WideValue,
         job_.options.printHash ? Xlate("%1 values are wider than the field \"%2\" of the %3 \"%4\" and show as #, the "
                                        "first one in row %5, line %6 of the report")
                                : Xlate("%1 values are wider than the field \"%2\" of the %3 \"%4\", the first one in "
                                        "row %5, line %6 of the report"),
         column.tooWide);
    note(Kind::NotFinite,
         Xlate("%1 values of the field \"%2\" of the %3 \"%4\" are infinite or not a number, the first one in row %5, "
               "line %6 of the report"),
         column.notFinite);
    // Of a field that no column fills there is a note already.
    const auto columns = rows.columns();
    if (!columns || isRead(*columns, column.variable)) {
        note(Kind::MissingValue,
             Xlate("%1 values of the field \"%2\" of the %3 \"%4\" are missing and show as 0, the first one in row %5, "
                   "line %6 of the report"),
             column.missing);
        note(Kind::BlankValue,
             Xlate("%1 values of the field \"%2\" of the %3 \"%4\" are missing and show as blanks, the first one in "
                   "row %5, line %6 of the report"),
             column.blank);
    }
    return wrong;
}

/// Notes what a source says of itself.
JobSteps::Wrong JobSteps::noteSource(const RowList &rows)
{
    Wrong wrong;
    for (const InputError &note : rows.notes()) {
        using Kind = JobNote::Kind;
        wrong = firstOf(wrong, notes_.add({{note.place ? Kind::Difference : Kind::PassedOver, note}}));
    }
    return wrong;
}

} // namespace kareport
