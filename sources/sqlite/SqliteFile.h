#pragma once

#include "InputError.h"

#include <QDateTime>
#include <QString>
#include <QStringList>

#include <atomic>
#include <memory>
#include <optional>
#include <string_view>

#include <sqlite3.h>

namespace kareport
{

/// A statement of a database, which must live longer.
using SqliteStatement = std::unique_ptr<sqlite3_stmt, int (*)(sqlite3_stmt *)>;

/// A SQLite database that is read, in one state from the opening to the end. Its file is never written. What other programs
/// have written and not yet moved into the file counts. One thread at a time may use it, which may change; only `stop` and
/// `isStopped` are for all.
class SqliteFile
{
public:
    /// Opens a database. `error` says what is wrong with it.
    explicit SqliteFile(const QString &path);
    ~SqliteFile();
    SqliteFile(const SqliteFile &) = delete;
    SqliteFile &operator=(const SqliteFile &) = delete;

    const std::optional<InputError> &error() const { return error_; }
    const QString &path() const { return path_; }

    /// A statement of SQL that was made here.
    SqliteStatement prepare(const QString &sql);
    /// The statement of a query from outside: one SELECT and nothing else.
    Expected<SqliteStatement> prepareQuery(const QString &sql);

    /// Whether it has a table or a view of a name.
    bool has(const QString &table);
    /// What the last call answered.
    int lastCode() const { return sqlite3_extended_errcode(database_); }
    /// Names of its tables and views, but for those that belong to the format.
    QStringList tables();

    /// What the last call has to say. An answer that means no memory throws `std::bad_alloc`.
    InputError failure(int code) const;
    /// Whether the file was changed by a program that does not use SQLite.
    std::optional<InputError> changed() const;

    /// Ends what is running, from any thread.
    void stop() { isStopped_ = true; }
    /// Lets it be read again after `stop`, in the same state.
    void resume() { isStopped_ = false; }
    bool isStopped() const { return isStopped_; }

private:
    void configure();
    bool begin();
    QString reasonOf(int code) const;

    QString path_;
    sqlite3 *database_ = nullptr;
    std::optional<InputError> error_;
    std::atomic<bool> isStopped_ = false;
    bool hasLog_ = false; ///< other programs may write to it meanwhile, into a separate log
    qint64 size_ = 0;
    QDateTime modified_;
};

/// A value of a statement's column as a text in UTF-8; valid until the next call for the column. It must not be NULL.
/// @throws std::bad_alloc
std::string_view bytesOfText(sqlite3_stmt *statement, int column);
/// The same as a text; empty for NULL.
QString textOfColumn(sqlite3_stmt *statement, int column);

} // namespace kareport
