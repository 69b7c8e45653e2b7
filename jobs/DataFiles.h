#pragma once

#include "FileBytes.h"

#include <QHash>
#include <QString>

#include <memory>

namespace kareport
{

class PostgresConnection;
class SqliteFile;

/// The files and databases that the data of a job is read from, each opened once: a pipe can be read once only, and every step
/// sees the same state of the data.
class DataFiles
{
public:
    /// @param path  "-" for standard input
    Expected<std::shared_ptr<const FileBytes>> open(const QString &path);

    /// The SQLite database of a path; empty until it is opened.
    std::shared_ptr<SqliteFile> &database(const QString &path);
    /// The connection to a PostgreSQL database; empty until it is made.
    std::shared_ptr<PostgresConnection> &connection(const QString &name) { return connections_[name]; }

private:
    QHash<QString, std::shared_ptr<const FileBytes>> files_; ///< by what files they are
    QHash<QString, std::shared_ptr<SqliteFile>> databases_;  ///< by what files they are
    QHash<QString, std::shared_ptr<PostgresConnection>> connections_;
};

/// Says that a file with data cannot be read.
QString unreadableData(const QString &path, const QString &why);

} // namespace kareport
