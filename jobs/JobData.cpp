#include "JobData.h"

#include "CsvObjectList.h"
#include "JsonObjectList.h"
#include "Xlate.h"

#include <QFileInfo>

namespace kareport
{

Expected<std::unique_ptr<RowList>> JobData::open(const QString &name, const FindVariable &findVariable, bool firstOnly)
{
    const Job::DataSet &set = *job_.data.constFind(name);
    if (!set.csv.isEmpty()) {
        return openCsv(name, set, findVariable);
    }
    const JsonPath values = {QStringLiteral("data"), name, QStringLiteral("values")};
    std::unique_ptr<RowList> rows = std::make_unique<JsonObjectList>(source_, values, findVariable, firstOnly,
                                                                     [this](std::size_t) { return !isStopped_(); });
    if (auto error = rows->error()) {
        return *std::move(error);
    }
    return rows;
}

Expected<std::unique_ptr<RowList>> JobData::openCsv(const QString &name, const Job::DataSet &set,
                                                    const FindVariable &findVariable)
{
    // A pipe can be read once only: its bytes serve every step.
    auto &bytes = files_[set.csv];
    if (!bytes) {
        auto file = FileBytes::open(set.csv);
        if (const InputError *error = errorOf(file)) {
            return source_.errorAt({QStringLiteral("data"), name, QStringLiteral("csv")},
                                   Xlate("the data file \"%1\" cannot be read: %2").arg(set.csv, error->text));
        }
        bytes = std::get<std::shared_ptr<const FileBytes>>(file);
    }
    progress_.begin(Xlate("Reading %1").arg(QFileInfo(set.csv).fileName()), bytes->view().size());
    std::unique_ptr<RowList> rows =
        std::make_unique<CsvObjectList>(bytes, set.delimiter, findVariable, [this](std::size_t read) {
            progress_.advance(read);
            return !isStopped_();
        });
    if (auto error = rows->error()) {
        return *std::move(error);
    }
    return rows;
}

InputError JobData::noRow(const QString &name, const JsonPath &step) const
{
    const QString &csv = job_.data.constFind(name)->csv;
    if (csv.isEmpty()) {
        return source_.errorAt(step, Xlate("the data \"%1\" has no row: a block shows the first one").arg(name));
    }
    return {csv, TextPlace(), Xlate("a row was expected behind the header row: a block shows the first one")};
}

} // namespace kareport
