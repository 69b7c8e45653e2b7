#include "JobData.h"

#include "Xlate.h"

namespace kareport
{

Expected<std::unique_ptr<RowList>> JobData::open(const QString &name, const VariablesIn &variablesIn, bool firstOnly)
{
    const Job::DataSet &set = *job_.data.constFind(name);
    JsonPath path;
    path.emplace_back(QStringLiteral("data"));
    path.emplace_back(name);
    return set.source->open(
        {source_, path, variablesIn, set.units, firstOnly, job_.settings, files_, progress_, isStopped_});
}

InputError JobData::noRow(const QString &name, const JsonPath &step) const
{
    const auto error = job_.data.constFind(name)->source->noRow();
    return error ? *error
                 : source_.errorAt(step, Xlate("the data \"%1\" has no row: a block shows the first one").arg(name));
}

} // namespace kareport
