#pragma once

#include "DataPreview.h"
#include "PostgresColumns.h"

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <functional>
#include <optional>
#include <vector>

namespace kareport
{

/// A table or a view of a PostgreSQL database.
struct PostgresTable
{
    QString name;        ///< with its schema
    QString sql;         ///< the same as a query names it, with quotes where they are needed
    QStringList columns; ///< their names
};

/// The first rows of a table as the server has sent them: they can be shown in any way without it.
struct PostgresSample
{
    QString connection; ///< what messages call it
    PostgresColumns columns;
    std::vector<std::vector<std::optional<QByteArray>>> rows; ///< the cells of the table's own columns; nothing is NULL
};

/// The tables and views of a database that the user of a connection may read, those that are found without their schema first.
/// Those of the server itself and of its extensions are not among them. A server that does not answer within five seconds is an
/// error.
/// @param isToStop  asked a few times a second; what comes back then is of no use
Expected<std::vector<PostgresTable>> postgresTables(const QString &connection, const std::function<bool()> &isToStop);

/// The query that reads a table. @param sql  its name, as `PostgresTable::sql`
QString queryOfTable(const QString &sql);

/// Reads the first rows of a table, on a connection of its own that is closed again. The rest is as for `postgresTables`.
Expected<PostgresSample> readPostgresSample(const QString &connection, const QString &sql, int mostRows,
                                            const std::function<bool()> &isToStop);

/// The first rows as `PostgresObjectList` reads them. Of a geometry the parts are columns, whose values are not shown.
DataPreview previewPostgres(const PostgresSample &sample, const std::vector<ColumnChoice> &choices,
                            const Variables &variables);

} // namespace kareport
