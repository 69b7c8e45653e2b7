#pragma once

#include "ColumnBinding.h"
#include "DataPreview.h"
#include "DataUnits.h"

#include <QJsonObject>
#include <QString>
#include <QStringList>

#include <functional>
#include <memory>
#include <vector>

namespace kareport
{

struct PostgresTable;

/// A table or a view that can be imported.
struct ImportTable
{
    QString name;
    QStringList columns = {}; ///< their names, where they are known beforehand
};

/// A database that data is imported from: its tables, and the first rows of each.
class ImportDatabase
{
public:
    /// Gives the variables that are wanted, for numbers in units.
    using VariablesIn = std::function<Variables(const DataUnits &)>;

    ImportDatabase() = default;
    virtual ~ImportDatabase() = default;
    ImportDatabase(const ImportDatabase &) = delete;
    ImportDatabase &operator=(const ImportDatabase &) = delete;

    /// The key of its data sets in a job.
    virtual QString dataKind() const = 0;
    /// The tables and views, in the order in which they are offered.
    virtual Expected<std::vector<ImportTable>> tables() const = 0;
    /// Gets what is shown of a table ready, which may take a while: the user can stop it.
    virtual void open(const QString & /*table*/) {}
    /// The keys of a data set that read a table.
    virtual QJsonObject keysOf(const QString &table) const = 0;
    /// The first rows of a table that was opened, as a job with these keys reads them.
    /// @param options  keys of a data set, those of `keysOf` among them
    virtual DataPreview preview(const QString &table, const QJsonObject &options, const VariablesIn &variablesIn,
                                int mostRows) const = 0;
};

/// The database of a SQLite file, a GeoPackage among them. @param file  its complete name
std::shared_ptr<ImportDatabase> sqliteImport(const QString &file);
/// The database of a PostgreSQL server. What was read of a table is kept.
/// @param tables  of the database, as `postgresTables` lists them
std::shared_ptr<ImportDatabase> postgresImport(const QString &connection, std::vector<PostgresTable> tables);

} // namespace kareport
