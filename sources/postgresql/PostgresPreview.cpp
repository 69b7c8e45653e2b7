#include "PostgresPreview.h"

#include "GeometryColumns.h"
#include "PointGeometry.h"
#include "PostgresConnection.h"
#include "Xlate.h"

#include <algorithm>
#include <chrono>
#include <memory>

namespace kareport
{

namespace
{

constexpr std::chrono::seconds mostConnecting(5);

/// Connects, and does not wait long for a server that does not answer. @param error  receives what is wrong
std::unique_ptr<PostgresConnection> connectSoon(const QString &connection, const std::function<bool()> &isToStop,
                                                InputError &error)
{
    const auto begun = std::chrono::steady_clock::now();
    auto made = std::make_unique<PostgresConnection>(connection, [&isToStop, begun] {
        return isToStop() || std::chrono::steady_clock::now() - begun > mostConnecting;
    });
    if (made->error()) {
        error = *made->error();
        return nullptr;
    }
    if (made->isStopped()) {
        error = {made->name(), std::nullopt, Xlate("the server does not answer")};
        return nullptr;
    }
    return made;
}

/// Tables and views, with the names of their columns, one a line.
constexpr const char *tablesQuery =
    "SELECT n.nspname || '.' || c.relname, "
    "pg_catalog.quote_ident(n.nspname) || '.' || pg_catalog.quote_ident(c.relname), "
    "(SELECT pg_catalog.string_agg(a.attname, E'\\n' ORDER BY a.attnum) FROM pg_catalog.pg_attribute a "
    "WHERE a.attrelid = c.oid AND a.attnum > 0 AND NOT a.attisdropped) "
    "FROM pg_catalog.pg_class c JOIN pg_catalog.pg_namespace n ON n.oid = c.relnamespace "
    "WHERE c.relkind IN ('r', 'v', 'm', 'p', 'f') AND NOT c.relispartition "
    "AND n.nspname <> 'information_schema' AND n.nspname !~ '^pg_' "
    "AND pg_catalog.has_schema_privilege(n.oid, 'USAGE') AND pg_catalog.has_table_privilege(c.oid, 'SELECT') "
    "AND NOT EXISTS (SELECT 1 FROM pg_catalog.pg_depend d WHERE d.classid = 'pg_catalog.pg_class'::pg_catalog.regclass "
    "AND d.objid = c.oid AND d.deptype = 'e') "
    "ORDER BY pg_catalog.pg_table_is_visible(c.oid) DESC, 1";

QString shownText(const std::optional<QByteArray> &cell, bool areBytes)
{
    constexpr qsizetype longestShown = 200;
    if (!cell) {
        return QString();
    }
    if (areBytes) {
        return Xlate("(bytes)");
    }
    const QString text = QString::fromUtf8(*cell);
    return text.size() <= longestShown ? text : text.first(longestShown) + u'…';
}

std::string_view viewOf(const QByteArray &bytes)
{
    return {bytes.constData(), static_cast<std::size_t>(bytes.size())};
}

/// What is wrong with the value of a field in a row.
QString misfitOf(const PostgresSample &sample, const std::vector<std::optional<QByteArray>> &row,
                 const BoundField &field, const FieldSource &source)
{
    const int column = source.part ? *sample.columns.geometry : source.column;
    const std::optional<QByteArray> &cell = row[static_cast<std::size_t>(column)];
    if (!cell || (!source.part && field.parser.isNone(viewOf(*cell)))) {
        return QString();
    }
    if (!source.part) {
        UDataObject object;
        return storePostgresCell(field, viewOf(*cell), sample.columns.types[static_cast<std::size_t>(column)], object)
            .value_or(QString());
    }
    const PointOrFault read = parseHexPoint(viewOf(*cell));
    const auto *instead = std::get_if<QString>(&read);
    return instead != nullptr ? Xlate("there is %1: a point was expected").arg(*instead) : QString();
}

std::vector<std::optional<QByteArray>> cellsOf(const PGresult *row)
{
    const LibPq &pq = libPq();
    std::vector<std::optional<QByteArray>> cells;
    for (int column = 0; column < pq.nfields(row); ++column) {
        cells.push_back(pq.getisnull(row, 0, column) != 0
                            ? std::nullopt
                            : std::optional(QByteArray(pq.getvalue(row, 0, column), pq.getlength(row, 0, column))));
    }
    return cells;
}

} // namespace

QString queryOfTable(const QString &sql)
{
    return QStringLiteral("SELECT * FROM ") + sql;
}

Expected<std::vector<PostgresTable>> postgresTables(const QString &connection, const std::function<bool()> &isToStop)
{
    const LibPq &pq = libPq();
    InputError error;
    const auto made = connectSoon(connection, isToStop, error);
    if (!made) {
        return error;
    }
    const auto asking = made->stopWhen(isToStop);
    const PostgresResult rows = made->read(tablesQuery);
    if (!rows) {
        return made->failure();
    }
    std::vector<PostgresTable> tables;
    for (int row = 0; row < pq.ntuples(rows.get()); ++row) {
        const auto text = [&](int column) { return QString::fromUtf8(pq.getvalue(rows.get(), row, column)); };
        tables.push_back({text(0), text(1), text(2).split(u'\n', Qt::SkipEmptyParts)});
    }
    return tables;
}

Expected<PostgresSample> readPostgresSample(const QString &connection, const QString &sql, int mostRows,
                                            const std::function<bool()> &isToStop)
{
    const LibPq &pq = libPq();
    InputError error;
    const auto made = connectSoon(connection, isToStop, error);
    if (!made) {
        return error;
    }
    const auto asking = made->stopWhen(isToStop);
    // Made for its first rows alone, a query of a view with much work in it is answered soon.
    const PostgresResult description = made->prepare(queryOfTable(sql) + QStringLiteral(" LIMIT %1").arg(mostRows));
    if (!description) {
        return made->failure();
    }
    auto columns = findPostgresColumns(*made, description.get());
    if (const InputError *wrong = errorOf(columns)) {
        return *wrong;
    }
    PostgresSample sample{made->name(), std::get<PostgresColumns>(columns), {}};
    if (!made->send({})) {
        return made->failure();
    }
    for (;;) {
        const PostgresResult row = made->next();
        if (!row) {
            return made->failure();
        }
        if (pq.resultStatus(row.get()) != PGRES_SINGLE_TUPLE) {
            return sample;
        }
        sample.rows.push_back(cellsOf(row.get()));
    }
}

DataPreview previewPostgres(const PostgresSample &sample, const std::vector<ColumnChoice> &choices,
                            const Variables &variables)
{
    DataPreview preview;
    std::vector<SourceColumn> columns = sample.columns.columns;
    for (const SourceColumn &column : columns) {
        preview.columns.push_back({column.name, QString()});
    }
    ColumnBinding binding;
    std::vector<FieldSource> sources;
    if (const auto fault = bindDatabaseColumns(binding, columns, choices, variables, sample.columns.own, sources)) {
        preview.error = InputError{sample.connection, std::nullopt, fault->text};
    }
    for (const BoundField &field : binding.fields()) {
        preview.columns[field.column].variable = field.variable;
    }
    for (const auto &cells : sample.rows) {
        std::vector<PreviewedCell> &row = preview.rows.emplace_back(columns.size());
        for (std::size_t column = 0; column < cells.size(); ++column) {
            const bool areBytes =
                isBytes(sample.columns.types[column]) || sample.columns.geometry == static_cast<int>(column);
            row[column].text = shownText(cells[column], areBytes);
        }
        for (std::size_t field = 0; field < sources.size(); ++field) {
            const QString wrong = misfitOf(sample, cells, binding.fields()[field], sources[field]);
            row[binding.fields()[field].column].wrong = wrong;
            if (!wrong.isEmpty() && !preview.error) {
                preview.error =
                    InputError{sample.connection, std::nullopt, Xlate("row %1: ").arg(preview.rows.size()) + wrong};
            }
        }
    }
    return preview;
}

} // namespace kareport
