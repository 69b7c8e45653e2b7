#include "JobSteps.h"

#include "NameQuestions.h"
#include "TemplateSource.h"
#include "TextFolding.h"
#include "UXmlReportTpl.h"
#include "Xlate.h"

// What the steps of a job note on the data and the template.

namespace kareport
{

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
    const auto atName = [&](ColumnNamer namer, std::size_t column, const QString &text) {
        JsonPath path = {QStringLiteral("data"), data};
        if (namer == ColumnNamer::Order) {
            path.emplace_back(QStringLiteral("order"));
        } else {
            path.emplace_back(QStringLiteral("columns"));
            path.emplace_back(static_cast<qsizetype>(column));
        }
        return source_.errorAt(path, text);
    };
    auto wrong = isNew ? notes_.add(compared.unknownColumns(atName)) : std::nullopt;
    for (const UnfilledField &field : compared.unfilledFields(record.fields)) {
        wrong = firstOf(wrong, noteField(field, record));
    }
    noteUnits(compared, data);
    return wrong;
}

/// Notes the units that were assumed, once for a data set.
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
