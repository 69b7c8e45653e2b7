#pragma once

#include "ColumnBinding.h"
#include "DataFiles.h"
#include "DataUnits.h"
#include "JsonNode.h"
#include "JsonPlaces.h"
#include "JsonSource.h"
#include "Progress.h"
#include "RowList.h"
#include "UJobSettings.h"

#include <QDir>
#include <QString>
#include <QStringList>

#include <functional>
#include <memory>
#include <optional>

namespace kareport
{

/// What a data set is opened with.
struct DataRequest
{
    const JsonSource &source; ///< the job, for values that are in it and for the places of errors
    JsonPath path;            ///< of the data set in the job
    /// The variables that are wanted, for numbers in the given units.
    std::function<Variables(const DataUnits &)> variablesIn;
    DataUnits units;              ///< those that the job says, or else the defaults
    bool firstOnly;               ///< one row is enough where the others cost nothing to leave out
    const UJobSettings &settings; ///< of the report, for values that are texts in it
    DataFiles &files;
    Progress &progress;
    /// Is asked now and then; its true ends the rows.
    const std::function<bool()> &isStopped;

    /// The variables in the data set's own units.
    Variables variables() const { return variablesIn(units); }
    /// Begins a piece of progress. @param total  what reading counts to, 0 when that is not known
    /// @return what a list of rows tells its progress to; it must not outlive the objects that the request refers to
    ReadProgress beginReading(const QString &name, std::size_t total) const;
    /// What is wrong with something that a key of the data set says, with the place of the key in the job.
    InputError errorAt(const QString &key, const QString &text) const;
};

/// A data set of a job, as its kind has read it: it says where the rows come from and how they are read.
class DataSource
{
public:
    DataSource() = default;
    virtual ~DataSource() = default;
    DataSource(const DataSource &) = delete;
    DataSource &operator=(const DataSource &) = delete;

    /// Opens the rows. The list must not outlive what the request refers to.
    virtual Expected<std::unique_ptr<RowList>> open(const DataRequest &request) const = 0;

    /// The files that are read, with their complete names: no output takes the place of one.
    virtual QStringList files() const { return {}; }
    /// The same with those that are not there yet and would be read if they came.
    virtual QStringList possibleFiles() const { return files(); }
    /// Whether the files and the job are all that the rows come from, so that their times tell whether a report is older.
    virtual bool isAllInFiles() const { return true; }
    /// Whether the data itself says the units of its numbers; those of the job then do not count.
    virtual bool hasOwnUnits() const { return false; }
    /// Whether standard input is read.
    virtual bool readsStandardInput() const { return false; }
    /// What is wrong where a row is needed and there is none; nothing where the step that needs it says so.
    virtual std::optional<InputError> noRow() const { return std::nullopt; }
};

/// A kind of data sets. `dataKinds` lists them all.
struct DataKind
{
    /// The key of a data set that says its kind, such as "csv".
    QString key;
    /// The other keys that a data set of the kind may have, without "units", which all have.
    QStringList options;
    /// Reads a data set of the kind. What is wrong with it fails the node, and then what comes back is not used.
    /// @param folder  names of files are relative to it
    std::function<std::shared_ptr<const DataSource>(const JsonNode &set, const QDir &folder)> read;
};

} // namespace kareport
