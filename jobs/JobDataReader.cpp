#include "JobDataReader.h"

#include "DataKinds.h"
#include "JobSettings.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

/// The one kind whose key a data set has.
const DataKind *kindOf(const JsonNode &set)
{
    QStringList keys;
    QStringList everyKey(QStringLiteral("units"));
    const DataKind *found = nullptr;
    QStringList given;
    for (const DataKind &kind : dataKinds()) {
        keys.append(kind.key);
        everyKey += kind.options;
        if (set[kind.key].exists()) {
            found = &kind;
            given.append(kind.key);
        }
    }
    if (given.size() == 1) {
        return found;
    }
    everyKey.removeDuplicates();
    set.allowOnly(keys + everyKey);
    set.fail(given.isEmpty() ? Xlate("one of the keys %1 was expected").arg(keys.join(QStringLiteral(", ")))
                             : Xlate("only one of the keys %1 was expected").arg(given.join(QStringLiteral(", "))));
    return nullptr;
}

} // namespace

QHash<QString, Job::DataSet> readDataSets(const JsonNode &node, const QDir &folder, bool isJobOnInput)
{
    QHash<QString, Job::DataSet> sets;
    if (!node.expectObject()) {
        return sets;
    }
    for (const QString &name : node.keys()) {
        const JsonNode set = node[name];
        const DataKind *kind = set.expectObject() ? kindOf(set) : nullptr;
        if (kind == nullptr) {
            break;
        }
        set.allowOnly(QStringList(kind->key) + kind->options + QStringList(QStringLiteral("units")));
        const DataUnits units = readDataUnits(set[QStringLiteral("units")]);
        auto data = kind->read(set, folder);
        if (isJobOnInput && data->readsStandardInput()) {
            set[kind->key].fail(Xlate("standard input is the job itself: a file was expected"));
        }
        sets.insert(name, Job::DataSet{kind->key, std::move(data), units});
    }
    return sets;
}

} // namespace kareport
