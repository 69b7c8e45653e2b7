#include "SqlitePreview.h"

#include "SqliteRows.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

namespace
{

QString shownText(sqlite3_stmt *statement, int column)
{
    constexpr qsizetype longestShown = 200;
    switch (sqlite3_column_type(statement, column)) {
    case SQLITE_NULL: return QString();
    case SQLITE_BLOB: return Xlate("(bytes)");
    default: break;
    }
    const QString text = textOfColumn(statement, column);
    return text.size() <= longestShown ? text : text.first(longestShown) + u'…';
}

/// The first rows as they are in the database.
void readRows(SqliteFile &file, const SqliteQuery &query, int mostRows, DataPreview &preview)
{
    const QString table = u'"' + QString(query.table).replace(u'"', QStringLiteral("\"\"")) + u'"';
    const auto prepared =
        file.prepareQuery(query.table.isEmpty() ? query.query : QStringLiteral("SELECT * FROM ") + table);
    const auto *statement = std::get_if<SqliteStatement>(&prepared);
    while (statement != nullptr && static_cast<int>(preview.rows.size()) < mostRows &&
           sqlite3_step(statement->get()) == SQLITE_ROW)
    {
        std::vector<PreviewedCell> &row = preview.rows.emplace_back(preview.columns.size());
        const int count = std::min(sqlite3_column_count(statement->get()), static_cast<int>(row.size()));
        for (int column = 0; column < count; ++column) {
            row[static_cast<std::size_t>(column)].text = shownText(statement->get(), column);
        }
    }
}

} // namespace

bool isSqlite(std::string_view bytes)
{
    return bytes.starts_with(std::string_view("SQLite format 3\0", 16));
}

Expected<QStringList> sqliteTables(const QString &file)
{
    const auto opened = SqliteObjectList::openFile(file);
    if (opened->error()) {
        return *opened->error();
    }
    return opened->tables();
}

DataPreview previewSqlite(const SqliteQuery &query, const Variables &variables, int mostRows)
{
    DataPreview preview;
    const auto file = SqliteObjectList::openFile(query.file);
    SqliteRows rows(file, query, variables);
    for (const SourceColumn &column : rows.columns()) {
        preview.columns.push_back({column.name, QString()});
    }
    for (const BoundField &field : rows.fields()) {
        preview.columns[field.column].variable = field.variable;
    }
    preview.error = rows.error();
    if (file->error()) {
        return preview;
    }
    readRows(*file, query, mostRows, preview);
    UDataObject object;
    std::size_t row = 0;
    while (row < preview.rows.size() && !preview.error && rows.next(object, nullptr)) {
        ++row;
    }
    if (!preview.error && rows.error() && row < preview.rows.size()) {
        for (const BoundField &field : rows.fields()) {
            preview.rows[row][field.column].wrong = rows.error()->text; // which of them it is, the text says
        }
    }
    preview.error = preview.error ? preview.error : rows.error();
    return preview;
}

} // namespace kareport
