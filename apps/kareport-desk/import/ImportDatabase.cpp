#include "ImportDatabase.h"

#include "ImportTables.h"
#include "PostgresPreview.h"
#include "SqlitePreview.h"
#include "StandardText.h"
#include "WorkAside.h"
#include "Xlate.h"

#include <QHash>

#include <algorithm>
#include <new>
#include <utility>

namespace kareport
{

namespace
{

constexpr int mostRowsRead = 20;

class SqliteImport : public ImportDatabase
{
public:
    explicit SqliteImport(QString file) : file_(std::move(file)) {}

    QString dataKind() const override { return QStringLiteral("sqlite"); }

    Expected<std::vector<ImportTable>> tables() const override
    {
        const auto names = sqliteTables(file_);
        if (const InputError *wrong = errorOf(names)) {
            return *wrong;
        }
        std::vector<ImportTable> tables;
        for (const QString &name : std::get<QStringList>(names)) {
            tables.push_back({name});
        }
        return tables;
    }

    QJsonObject keysOf(const QString &table) const override { return {{QStringLiteral("table"), table}}; }

    DataPreview preview(const QString & /*table*/, const QJsonObject &options, const VariablesIn &variablesIn,
                        int mostRows) const override
    {
        return previewSqliteTable(file_, options, variablesIn, mostRows);
    }

private:
    QString file_;
};

class PostgresImport : public ImportDatabase
{
public:
    PostgresImport(QString connection, std::vector<PostgresTable> tables)
        : connection_(std::move(connection)), tables_(std::move(tables))
    {}

    QString dataKind() const override { return QStringLiteral("postgresql"); }

    Expected<std::vector<ImportTable>> tables() const override
    {
        std::vector<ImportTable> listed;
        for (const PostgresTable &table : tables_) {
            listed.push_back({table.name, table.columns});
        }
        return listed;
    }

    void open(const QString &table) override
    {
        const auto known = samples_.constFind(table);
        if (known == samples_.constEnd() || errorOf(*known) != nullptr) {
            samples_.insert(table, read(table));
        }
    }

    QJsonObject keysOf(const QString &table) const override
    {
        return {{QStringLiteral("query"), queryOfTable(sqlOf(table))}};
    }

    DataPreview preview(const QString &table, const QJsonObject &options, const VariablesIn &variablesIn,
                        int mostRows) const override
    {
        DataPreview preview;
        const auto known = samples_.constFind(table);
        if (known == samples_.constEnd()) {
            return preview;
        }
        if (const InputError *wrong = errorOf(*known)) {
            preview.error = *wrong;
            return preview;
        }
        preview = previewPostgresTable(std::get<PostgresSample>(*known), options, variablesIn);
        preview.rows.resize(std::min(preview.rows.size(), static_cast<std::size_t>(mostRows)));
        return preview;
    }

private:
    QString sqlOf(const QString &table) const
    {
        const auto found = std::find_if(tables_.begin(), tables_.end(),
                                        [&table](const PostgresTable &one) { return one.name == table; });
        return found != tables_.end() ? found->sql : table;
    }

    Expected<PostgresSample> read(const QString &table) const
    {
        const auto result = std::make_shared<Expected<PostgresSample>>();
        const bool isDone = doAside(Xlate("Reading %1").arg(table), UserInput::Kept,
                                    [result, connection = connection_, sql = sqlOf(table)](AsideState &state) {
                                        state.setPercent(-1); // nobody knows how long it takes
                                        try {
                                            *result = readPostgresSample(connection, sql, mostRowsRead,
                                                                         [&state] { return state.isStopped(); });
                                        } catch (const std::bad_alloc &) {
                                            *result = InputError{connection, std::nullopt, noMemoryText()};
                                        }
                                    });
        if (!isDone) {
            return InputError{connection_, std::nullopt, Xlate("the table was not read. Choose it again to read it")};
        }
        return *result;
    }

    QString connection_;
    std::vector<PostgresTable> tables_;
    QHash<QString, Expected<PostgresSample>> samples_;
};

} // namespace

std::shared_ptr<ImportDatabase> sqliteImport(const QString &file)
{
    return std::make_shared<SqliteImport>(file);
}

std::shared_ptr<ImportDatabase> postgresImport(const QString &connection, std::vector<PostgresTable> tables)
{
    return std::make_shared<PostgresImport>(connection, std::move(tables));
}

} // namespace kareport
