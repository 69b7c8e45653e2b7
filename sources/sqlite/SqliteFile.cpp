#include "SqliteFile.h"

#include "Interrupt.h"
#include "Xlate.h"

#include <QFileInfo>

#include <new>
#include <system_error>

namespace kareport
{

namespace
{

/// Larger values are taken for what a broken file says.
constexpr int largestValue = 64 << 20;
/// Steps of a statement between looks whether it is to stop.
constexpr int stepsBetween = 20000;
/// How often, and for how long each time, a lock is waited for.
constexpr int mostWaits = 40;
constexpr int waitMilliseconds = 50;

int lookWhetherToStop(void *file)
{
    return static_cast<const SqliteFile *>(file)->isStopped() || isInterrupted() ? 1 : 0;
}

int waitForLock(void *file, int waits)
{
    if (waits >= mostWaits || lookWhetherToStop(file) != 0) {
        return 0;
    }
    sqlite3_sleep(waitMilliseconds);
    return 1;
}

/// Lets a query read, and nothing else: no other file, no setting.
int allowReading(void * /*file*/, int action, const char * /*first*/, const char * /*second*/,
                 const char * /*database*/, const char * /*trigger*/)
{
    switch (action) {
    case SQLITE_ATTACH:
    case SQLITE_DETACH:
    case SQLITE_PRAGMA:
    case SQLITE_TRANSACTION:
    case SQLITE_SAVEPOINT: return SQLITE_DENY;
    default: return SQLITE_OK;
    }
}

/// Whether a text has nothing but blanks, comments and semicolons.
bool isBlankSql(sqlite3 *database, const char *text)
{
    while (*text != '\0') {
        sqlite3_stmt *statement = nullptr;
        const int code = sqlite3_prepare_v2(database, text, -1, &statement, &text);
        sqlite3_finalize(statement);
        if (code != SQLITE_OK || statement != nullptr) {
            return false;
        }
    }
    return true;
}

} // namespace

QString textOfColumn(sqlite3_stmt *statement, int column)
{
    if (sqlite3_column_type(statement, column) == SQLITE_NULL) {
        return {};
    }
    const std::string_view text = bytesOfText(statement, column);
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

std::string_view bytesOfText(sqlite3_stmt *statement, int column)
{
    const auto *text = reinterpret_cast<const char *>(sqlite3_column_text(statement, column));
    if (text == nullptr) {
        throw std::bad_alloc(); // there is a text, and no memory for it
    }
    return {text, static_cast<std::size_t>(sqlite3_column_bytes(statement, column))};
}

SqliteFile::SqliteFile(const QString &path) : path_(path)
{
    const QFileInfo info(path);
    if (info.exists() && !info.isFile()) {
        error_ = InputError{path_, std::nullopt, Xlate("a database file was expected, not a folder or a device")};
        return;
    }
    // A complete path is never taken for an address with options in it.
    const QByteArray name = info.absoluteFilePath().toUtf8();
    // One thread at a time uses it, so that no lock is needed for each value that is read.
    const int code = sqlite3_open_v2(name.constData(), &database_, SQLITE_OPEN_READONLY | SQLITE_OPEN_NOMUTEX, nullptr);
    if (code != SQLITE_OK) {
        error_ = failure(code);
        return;
    }
    configure();
    if (begin()) {
        // Not before: another program may have written while the lock was waited for, and that is not a change.
        const QFileInfo locked(path);
        size_ = locked.size();
        modified_ = locked.lastModified();
        sqlite3_set_authorizer(database_, allowReading, this);
    }
}

SqliteFile::~SqliteFile()
{
    sqlite3_close_v2(database_);
}

void SqliteFile::configure()
{
    sqlite3_extended_result_codes(database_, 1);
    sqlite3_limit(database_, SQLITE_LIMIT_LENGTH, largestValue);
    sqlite3_progress_handler(database_, stepsBetween, lookWhetherToStop, this);
    sqlite3_busy_handler(database_, waitForLock, this);
    // Code in the file is not run, its log stays as it is, and a misspelt name in quotes is not taken for a text.
    sqlite3_db_config(database_, SQLITE_DBCONFIG_DEFENSIVE, 1, nullptr);
    sqlite3_db_config(database_, SQLITE_DBCONFIG_TRUSTED_SCHEMA, 0, nullptr);
    sqlite3_db_config(database_, SQLITE_DBCONFIG_NO_CKPT_ON_CLOSE, 1, nullptr);
    sqlite3_db_config(database_, SQLITE_DBCONFIG_DQS_DML, 0, nullptr);
}

/// Begins the transaction that all is read in. @return whether the file can be read
bool SqliteFile::begin()
{
    int code =
        sqlite3_exec(database_, "PRAGMA mmap_size=0; PRAGMA cell_size_check=ON; BEGIN", nullptr, nullptr, nullptr);
    if (code == SQLITE_OK) {
        const SqliteStatement first = prepare(QStringLiteral("SELECT count(*) FROM sqlite_master"));
        code = first ? sqlite3_step(first.get()) : sqlite3_extended_errcode(database_);
    }
    if (code != SQLITE_OK && code != SQLITE_ROW) {
        error_ = failure(code);
        return false;
    }
    const SqliteStatement mode = prepare(QStringLiteral("PRAGMA journal_mode"));
    hasLog_ = mode && sqlite3_step(mode.get()) == SQLITE_ROW && textOfColumn(mode.get(), 0) == u"wal";
    return true;
}

SqliteStatement SqliteFile::prepare(const QString &sql)
{
    const QByteArray text = sql.toUtf8();
    sqlite3_stmt *statement = nullptr;
    sqlite3_prepare_v2(database_, text.constData(), static_cast<int>(text.size()) + 1, &statement, nullptr);
    return {statement, sqlite3_finalize};
}

Expected<SqliteStatement> SqliteFile::prepareQuery(const QString &sql)
{
    const QByteArray text = sql.toUtf8();
    sqlite3_stmt *prepared = nullptr;
    const char *rest = nullptr;
    const int code =
        sqlite3_prepare_v2(database_, text.constData(), static_cast<int>(text.size()) + 1, &prepared, &rest);
    SqliteStatement statement(prepared, sqlite3_finalize);
    const bool isRefused = code == SQLITE_AUTH;
    if (code != SQLITE_OK && !isRefused) {
        return failure(code);
    }
    if (isRefused || !statement || sqlite3_column_count(prepared) == 0 || sqlite3_stmt_readonly(prepared) == 0 ||
        !isBlankSql(database_, rest))
    {
        return InputError{path_, std::nullopt, Xlate("the query is not a single SELECT, which was expected")};
    }
    if (sqlite3_bind_parameter_count(prepared) > 0) {
        return InputError{path_, std::nullopt, Xlate("the query has parameters: values were expected in their places")};
    }
    return statement;
}

bool SqliteFile::has(const QString &table)
{
    const SqliteStatement found = prepare(
        QStringLiteral("SELECT 1 FROM sqlite_master WHERE type IN ('table', 'view') AND lower(name) = lower(?)"));
    const QByteArray name = table.toUtf8();
    return found && sqlite3_bind_text(found.get(), 1, name.constData(), -1, SQLITE_TRANSIENT) == SQLITE_OK &&
           sqlite3_step(found.get()) == SQLITE_ROW;
}

QStringList SqliteFile::tables()
{
    const SqliteStatement names = prepare(QStringLiteral(
        "SELECT name FROM sqlite_master WHERE type IN ('table', 'view') AND name NOT LIKE 'sqlite\\_%' ESCAPE '\\' "
        "AND name NOT LIKE 'gpkg\\_%' ESCAPE '\\' AND name NOT LIKE 'rtree\\_%' ESCAPE '\\' ORDER BY name"));
    QStringList found;
    while (names && sqlite3_step(names.get()) == SQLITE_ROW) {
        found.append(textOfColumn(names.get(), 0));
    }
    return found;
}

InputError SqliteFile::failure(int code) const
{
    if ((code & 0xFF) == SQLITE_NOMEM) {
        throw std::bad_alloc();
    }
    return {path_, std::nullopt, reasonOf(code)};
}

QString SqliteFile::reasonOf(int code) const
{
    const QString text = QString::fromUtf8(sqlite3_errmsg(database_));
    switch (code & 0xFF) {
    case SQLITE_BUSY:
    case SQLITE_LOCKED: return Xlate("the database is locked: another program writes to it");
    case SQLITE_NOTADB: return Xlate("the file is not a SQLite database, or it is encrypted");
    case SQLITE_CORRUPT: return Xlate("the database is broken: %1").arg(text);
    case SQLITE_READONLY:
        return Xlate(
            "a program that wrote to the database did not finish its work: open the database with that program first");
    case SQLITE_CANTOPEN: {
        const int reason = sqlite3_system_errno(database_);
        return Xlate("the database cannot be opened: %1")
            .arg(reason != 0 ? QString::fromStdString(std::generic_category().message(reason)) : text);
    }
    case SQLITE_IOERR: return Xlate("the database cannot be read: %1").arg(text);
    case SQLITE_INTERRUPT: return Xlate("reading was stopped");
    default: return Xlate("the database does not answer the query: %1").arg(text);
    }
}

std::optional<InputError> SqliteFile::changed() const
{
    // With a log, others may move what they have written into the file while it is read: its state for us stays.
    const QFileInfo info(path_);
    if (error_ || hasLog_ || (info.size() == size_ && info.lastModified() == modified_)) {
        return std::nullopt;
    }
    return InputError{path_, std::nullopt,
                      Xlate("the database was changed while it was read, by a program that does not "
                            "use SQLite")};
}

} // namespace kareport
