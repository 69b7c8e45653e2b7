#pragma once

#include "GeometryColumns.h"
#include "SqliteFile.h"

#include <QHash>
#include <QString>

#include <functional>
#include <optional>
#include <utility>
#include <vector>

namespace kareport
{

/// What a GeoPackage says about its geometries. Any other database has none.
class SqliteGeometry
{
public:
    explicit SqliteGeometry(SqliteFile &file);

    /// What is wrong with the list of geometries.
    const std::optional<InputError> &error() const { return error_; }
    /// What is wrong with the list of reference systems, which matters where one is read.
    const std::optional<InputError> &systemsError() const { return systemsError_; }

    /// Whether a column of a table holds geometries.
    bool isGeometry(const QString &table, const QString &column) const;
    /// A reference system by its number in the GeoPackage; nothing when that does not describe it.
    const ReferenceSystem *referenceSystem(qint32 number) const;

private:
    std::vector<std::pair<QString, QString>> columns_; ///< tables and their columns
    QHash<qint32, ReferenceSystem> systems_;
    std::optional<InputError> error_;
    std::optional<InputError> systemsError_;
};

} // namespace kareport
