#include "ColumnChoices.h"
#include "DataKinds.h"
#include "JobFileName.h"
#include "SqliteObjectList.h"
#include "Xlate.h"

#include <QFileInfo>

namespace kareport
{

namespace
{

class SqliteData : public DataSource
{
public:
    explicit SqliteData(SqliteQuery query) : query_(std::move(query)) {}

    Expected<std::unique_ptr<RowList>> open(const DataRequest &request) const override
    {
        if (!QFileInfo::exists(query_.file)) {
            return request.errorAt(QStringLiteral("sqlite"), Xlate("there is no database \"%1\"").arg(query_.file));
        }
        auto &file = request.files.database(query_.file);
        if (!file) {
            file = SqliteObjectList::openFile(query_.file);
        }
        auto rows = std::make_unique<SqliteObjectList>(file, query_, request.variables(),
                                                       request.beginReading(QFileInfo(query_.file).fileName(), 0));
        return openedRows(std::move(rows), request);
    }

    QStringList files() const override
    {
        QStringList files(query_.file);
        if (QFileInfo::exists(logFile())) {
            files.append(logFile());
        }
        return files;
    }

    QStringList possibleFiles() const override
    {
        QStringList files(query_.file);
        files.append(logFile());
        return files;
    }

private:
    /// What other programs have written and not yet moved into the file.
    QString logFile() const { return query_.file + QStringLiteral("-wal"); }

    SqliteQuery query_;
};

std::shared_ptr<const DataSource> read(const JsonNode &set, const QDir &folder)
{
    SqliteQuery query;
    query.file = folder.filePath(readFileName(set[QStringLiteral("sqlite")]));
    query.table = readWholeText(set[QStringLiteral("table")]);
    query.query = readWholeText(set[QStringLiteral("query")]);
    query.columns = readColumnChoices(set[QStringLiteral("columns")]);
    if (query.table.isEmpty() == query.query.isEmpty()) {
        set.fail(Xlate("either \"table\" or \"query\" was expected"));
    }
    return std::make_shared<SqliteData>(query);
}

} // namespace

DataKind sqliteDataKind()
{
    QStringList options;
    for (const char *key : {"table", "query", "columns"}) {
        options.append(QLatin1StringView(key));
    }
    return {QStringLiteral("sqlite"), options, read};
}

} // namespace kareport
