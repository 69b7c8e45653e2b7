#include "JobSteps.h"

#include "ReportOutline.h"
#include "ShapeBinding.h"
#include "UXmlReportTpl.h"
#include "Xlate.h"

// How a step writes rows through a table.

namespace kareport
{

JobSteps::Wrong JobSteps::write(const Job::Table &step, const JsonPath &path)
{
    const sXmlReportTable *table = report_.GetTemplate()->GetTable(step.name);
    if (table == nullptr) {
        QStringList names;
        report_.GetTemplate()->GetAllTables(names);
        return noSuchRecord(Xlate("table"), step.name, names, path);
    }
    const WrittenRecord record = {Xlate("table"), TemplatePart::Table, step.name, table->Use, table->Fields, path};
    if (auto wrong = wrongRecord(record)) {
        return wrong;
    }
    auto opened = openRows(step.data, table->Use, false, step.shape.isEmpty() ? &table->Fields : nullptr);
    if (const InputError *error = errorOf(opened)) {
        return *error;
    }
    auto &list = std::get<std::unique_ptr<RowList>>(opened);
    const auto asked = shape(list, step, *table);
    if (const InputError *error = errorOf(asked)) {
        return *error;
    }
    const ShapedRows &shaped = std::get<ShapedRows>(asked);
    RowList &rows = *list;
    // Columns that are known already are looked at before hundreds of thousands of rows are.
    auto columns = rows.columns();
    if (auto wrong = columns ? noteColumns(*columns, step.data, record) : std::nullopt) {
        return wrong;
    }
    if (auto wrong = noteSortKeys(record)) {
        return wrong;
    }
    report_.AnnounceEntry(ReportOutline::tableLevel, table->Name);
    describeResults(step.data, table->Use, neededVariables(step.name, shaped.needed));
    expectMemory(report_.WriteDataTable(step.name, &rows, step.before, step.after, step.headingAfter));
    if (const auto error = rows.error()) {
        return error;
    }
    addFit(true, step.name, table->Fields, step.data, path);
    if (!columns) {
        columns = rows.columns();
        if (auto wrong = columns ? noteColumns(*columns, step.data, record) : std::nullopt) {
            return wrong;
        }
    }
    if (isStopped_()) {
        return std::nullopt;
    }
    auto wrong = noteSource(rows);
    auto other = noteValues(rows, columns, record);
    wrong = wrong ? wrong : other;
    if (shaped.rows != nullptr) {
        other = noteLeftOut(*shaped.rows, record);
    }
    return wrong ? wrong : other;
}

/// Has rows shown as a step asks for it.
Expected<JobSteps::ShapedRows> JobSteps::shape(std::unique_ptr<RowList> &rows, const Job::Table &step,
                                               const sXmlReportTable &table)
{
    if (step.shape.isEmpty()) {
        return ShapedRows();
    }
    const ShapeSurroundings surroundings = {source_, *report_.GetTemplate(), table, units_, job_.settings};
    auto bound = bindShape(step.shape, surroundings);
    if (const InputError *error = errorOf(bound)) {
        return *error;
    }
    auto &[shape, sortIds, needed] = std::get<BoundShape>(bound);
    auto shown = std::make_unique<ShownRows>(std::move(rows), std::move(shape));
    ShownRows *const list = shown.get();
    rows = std::move(shown);
    if (!sortIds.empty()) {
        list->Sort(sortIds);
        if (const auto error = list->error()) {
            return *error;
        }
    }
    return ShapedRows{list, needed};
}

/// The variables without which the rows of a table are not written the same again: the template's sort keys, and those that
/// the step names.
QStringList JobSteps::neededVariables(const QString &table, const QStringList &named) const
{
    QStringList needed;
    if (const sXmlSortTableReport *sort = report_.GetTemplate()->GetSortList(table)) {
        for (const sXmlSortVariable &key : sort->Entries) {
            needed.append(key.VariableName);
        }
    }
    needed.append(named);
    return needed;
}

void JobSteps::describeResults(const QString &data, const QString &dictionary, const QStringList &needed)
{
    if (results_ != nullptr) {
        const Job::DataSet &set = *job_.data.constFind(data);
        // What says its units itself is read in metres, square metres and degrees.
        results_->describe({set.source->hasOwnUnits() ? DataUnits() : set.units,
                            report_.GetTemplate()->GetDictionary(dictionary), needed});
    }
}

} // namespace kareport
