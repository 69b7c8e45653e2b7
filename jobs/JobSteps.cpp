#include "JobSteps.h"

#include "TemplateCheck.h"
#include "UXmlReportTpl.h"
#include "Xlate.h"

#include <algorithm>
#include <new>

namespace kareport
{

namespace
{

/// What has been found writable is not written for one reason only.
void needMemory(bool isWritten)
{
    if (!isWritten) {
        throw std::bad_alloc();
    }
}

} // namespace

std::optional<InputError> JobSteps::write()
{
    for (const Job::Step &step : job_.steps) {
        auto wrong = std::visit([&](const auto &action) { return write(action, step.path); }, step.action);
        if (wrong || isStopped_()) {
            return wrong;
        }
        needMemory(!report_.HasLostText());
    }
    return std::nullopt;
}

JobSteps::Wrong JobSteps::write(const Job::Heading &step, const JsonPath & /*path*/)
{
    report_.SetHeading(step.text, step.before, step.after);
    return std::nullopt;
}

JobSteps::Wrong JobSteps::write(const Job::Line &step, const JsonPath & /*path*/)
{
    report_.WriteLine(step.text, step.before, step.after, step.style);
    return std::nullopt;
}

JobSteps::Wrong JobSteps::write(const Job::LineFeed &step, const JsonPath & /*path*/)
{
    report_.LineFeed(step.count);
    return std::nullopt;
}

JobSteps::Wrong JobSteps::write(const Job::NewPage &step, const JsonPath & /*path*/)
{
    report_.NewPage(step.linesNeeded);
    return std::nullopt;
}

JobSteps::Wrong JobSteps::write(const Job::Clear & /*step*/, const JsonPath & /*path*/)
{
    report_.Clear();
    return std::nullopt;
}

JobSteps::Wrong JobSteps::write(const Job::Block &step, const JsonPath &path)
{
    const sXmlReportBlock *block = report_.GetTemplate()->GetBlock(step.name);
    if (block == nullptr) {
        QStringList names;
        report_.GetTemplate()->GetAllBlocks(names);
        return noSuchRecord(Xlate("block"), step.name, names, path);
    }
    if (auto wrong = wrongRecord(*block, Xlate("block"), step.name, path)) {
        return wrong;
    }
    const auto opened = openRows(step.data, block->Use, true);
    if (const InputError *error = errorOf(opened)) {
        return *error;
    }
    RowList &rows = *std::get<std::unique_ptr<RowList>>(opened);
    // All rows must be valid, though only the first one is shown.
    for (std::size_t row = 0; rows.GetAt(row) != nullptr; ++row) {
    }
    if (auto error = rows.error()) {
        return error;
    }
    if (auto wrong = noteColumns(rows, step.data, *block, Xlate("block"), path)) {
        return wrong;
    }
    if (auto wrong = noteSource(rows)) {
        return wrong;
    }
    if (const UDataObject *object = rows.GetAt(0)) {
        needMemory(report_.WriteDataBlock(step.name, object, step.before, step.after));
        return std::nullopt;
    }
    return isStopped_() ? std::nullopt : std::optional(data_.noRow(step.data, path));
}

JobSteps::Wrong JobSteps::write(const Job::Table &step, const JsonPath &path)
{
    const sXmlReportTable *table = report_.GetTemplate()->GetTable(step.name);
    if (table == nullptr) {
        QStringList names;
        report_.GetTemplate()->GetAllTables(names);
        return noSuchRecord(Xlate("table"), step.name, names, path);
    }
    if (auto wrong = wrongRecord(*table, Xlate("table"), step.name, path)) {
        return wrong;
    }
    const auto opened = openRows(step.data, table->Use, false);
    if (const InputError *error = errorOf(opened)) {
        return *error;
    }
    RowList &rows = *std::get<std::unique_ptr<RowList>>(opened);
    // Columns that are known already are looked at before hundreds of thousands of rows are.
    if (auto wrong = noteColumns(rows, step.data, *table, Xlate("table"), path)) {
        return wrong;
    }
    needMemory(report_.WriteDataTable(step.name, &rows, step.before, step.after, step.headingAfter));
    if (const auto error = rows.error()) {
        return error;
    }
    if (auto wrong = noteColumns(rows, step.data, *table, Xlate("table"), path)) {
        return wrong;
    }
    if (isStopped_()) {
        return std::nullopt;
    }
    auto wrong = noteSource(rows);
    auto other = noteValues(rows, step.name, path);
    return wrong ? wrong : other;
}

JobSteps::Wrong JobSteps::noSuchRecord(const QString &what, const QString &name, const QStringList &names,
                                       const JsonPath &path) const
{
    return source_.errorAt(path,
                           Xlate("the template has no %1 named \"%2\": one of %3 was expected")
                               .arg(what, name, names.isEmpty() ? Xlate("none") : names.join(QStringLiteral(", "))));
}

/// What keeps a table or block that the template has from being written.
template <typename Record>
JobSteps::Wrong JobSteps::wrongRecord(const Record &record, const QString &what, const QString &name,
                                      const JsonPath &path) const
{
    if (report_.GetTemplate()->GetDictionary(record.Use) == nullptr) {
        return source_.errorAt(path,
                               Xlate("the %1 \"%2\" cannot be written: the template has no dictionary named \"%3\"")
                                   .arg(what, name, record.Use));
    }
    for (const sXmlReportField &field : record.Fields) {
        if (field.Width > widestColumn || field.Width < -widestColumn || field.Decimals > widestColumn) {
            return source_.errorAt(
                path, Xlate("the %1 \"%2\" cannot be written: the format of its field \"%3\" is beyond %4 characters")
                          .arg(what, name, field.VariableName, QString::number(widestColumn)));
        }
    }
    return std::nullopt;
}

/// Notes what of the data and of a table or block does not come together, once the columns are known.
template <typename Record>
JobSteps::Wrong JobSteps::noteColumns(const RowList &rows, const QString &data, const Record &record,
                                      const QString &what, const JsonPath &path)
{
    const auto columns = rows.columns();
    if (!columns) {
        return std::nullopt;
    }
    const UXmlReportTpl &tpl = *report_.GetTemplate();
    const sXmlReportDictionary &dictionary = *tpl.GetDictionary(record.Use);
    auto wrong = notes_.add(unknownColumns(*columns, dictionary));
    const auto unfilled = unfilledFields(*columns, record.Fields, dictionary);
    for (const UnfilledField &field : unfilled) {
        const QString sentence =
            field.isVariable
                ? Xlate("no column fills the field \"%1\" of the %2 \"%3\"").arg(field.variable, what, record.Name)
                : Xlate("the field \"%1\" of the %2 \"%3\" is not a variable of the dictionary \"%4\"")
                      .arg(field.variable, what, record.Name, record.Use);
        const auto note = source_.errorAt(
            path, field.question.isEmpty() ? sentence : sentence + QStringLiteral(": ") + field.question);
        auto other = notes_.add({{JobNote::Kind::UnfilledField, note}});
        wrong = wrong ? wrong : other;
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

/// Notes which values of a table that was written do not show as they are.
JobSteps::Wrong JobSteps::noteValues(const RowList &rows, const QString &table, const JsonPath &path)
{
    Wrong wrong;
    const auto columns = rows.columns();
    const auto note = [&](JobNote::Kind kind, const QString &text, const ValueCount &values) {
        auto one = notes_.add({{kind, source_.errorAt(path, text), values.firstLine, values.count, values.firstRow}});
        wrong = wrong ? wrong : one;
    };
    for (const ColumnRemarks &column : notes_.remarks.columns) {
        if (column.tooWide.count > 0) {
            const QString sentence =
                job_.options.printHash ? Xlate("%1 values are wider than the field \"%2\" of the table \"%3\" and show "
                                               "as #, the first one in row %4, line %5 of the report")
                                       : Xlate("%1 values are wider than the field \"%2\" of the table \"%3\", the "
                                               "first one in row %4, line %5 of the report");
            note(JobNote::Kind::WideValue,
                 sentence.arg(QString::number(column.tooWide.count), column.variable, table,
                              QString::number(column.tooWide.firstRow), QString::number(column.tooWide.firstLine)),
                 column.tooWide);
        }
        // Of a field that no column fills there is a note already.
        const bool isFilled =
            !columns || std::find(columns->ids.begin(), columns->ids.end(), column.id) != columns->ids.end();
        if (column.missing.count > 0 && isFilled) {
            note(
                JobNote::Kind::MissingValue,
                Xlate(
                    "%1 values of the field \"%2\" of the table \"%3\" are missing and show as 0, the first one in row "
                    "%4, line %5 of the report")
                    .arg(QString::number(column.missing.count), column.variable, table,
                         QString::number(column.missing.firstRow), QString::number(column.missing.firstLine)),
                column.missing);
        }
    }
    return wrong;
}

/// Notes what a source says of itself.
JobSteps::Wrong JobSteps::noteSource(const RowList &rows)
{
    Wrong wrong;
    for (const InputError &note : rows.notes()) {
        using Kind = JobNote::Kind;
        auto one = notes_.add({{note.place ? Kind::Difference : Kind::PassedOver, note}});
        wrong = wrong ? wrong : one;
    }
    return wrong;
}

/// The rows of a data set, typed by a dictionary of the template.
Expected<std::unique_ptr<RowList>> JobSteps::openRows(const QString &data, const QString &dictionary, bool firstOnly)
{
    const UXmlReportTpl *tpl = report_.GetTemplate();
    const JobData::VariablesIn variablesIn = [tpl, dictionary](const DataUnits &units) {
        Variables variables;
        variables.find = [tpl, units, dictionary](const QString &variable) -> std::optional<ValueParser> {
            qint32 id = 0;
            qint32 type = 0;
            if (!tpl->FindVariable(dictionary, variable, id, type)) {
                return std::nullopt;
            }
            return ValueParser(type, static_cast<unsigned>(id), units);
        };
        variables.names = variableNames(*tpl->GetDictionary(dictionary));
        return variables;
    };
    return data_.open(data, variablesIn, firstOnly);
}

} // namespace kareport
