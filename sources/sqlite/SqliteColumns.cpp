#include "SqliteRows.h"

#include "NearestName.h"
#include "Xlate.h"

#include <algorithm>

// How the columns of a table or a query are found.

namespace kareport
{

namespace
{

/// A name in a query.
QString quoted(const QString &name)
{
    return u'"' + QString(name).replace(u'"', QStringLiteral("\"\"")) + u'"';
}

} // namespace

/// Prepares what all columns are known by.
bool SqliteRows::prepareAll(const SqliteQuery &query)
{
    if (!query.table.isEmpty()) {
        const QStringList tables = file_->tables();
        const bool isThere = file_->prepare(QStringLiteral("SELECT * FROM ") + quoted(query.table)) != nullptr;
        if (!isThere && !tables.contains(query.table, Qt::CaseInsensitive)) {
            error_ = InputError{
                query.file, std::nullopt,
                tables.isEmpty()
                    ? Xlate("the database has no tables: the table \"%1\" was expected").arg(query.table)
                    : withExpected(Xlate("the database has no table \"%1\"").arg(query.table), query.table, tables)};
            return false;
        }
    }
    auto statement = file_->prepareQuery(
        query.table.isEmpty() ? query.query : QStringLiteral("SELECT * FROM ") + quoted(query.table));
    if (const InputError *wrong = errorOf(statement)) {
        error_ = *wrong;
        return false;
    }
    statement_ = std::move(std::get<SqliteStatement>(statement));
    return true;
}

bool SqliteRows::findColumns(const SqliteQuery &query)
{
    for (int i = 0; i < sqlite3_column_count(statement_.get()); ++i) {
        columns_.push_back({QString::fromUtf8(sqlite3_column_name(statement_.get(), i)), std::nullopt, false});
        const QString table = QString::fromUtf8(sqlite3_column_table_name(statement_.get(), i));
        const QString origin = QString::fromUtf8(sqlite3_column_origin_name(statement_.get(), i));
        // A view is registered by its own name, though its columns come from a table.
        const bool isGeometry = geometry_.isGeometry(table, origin) ||
                                (!query.table.isEmpty() && geometry_.isGeometry(query.table, columns_.back().name));
        if (isGeometry && geometryColumn_) {
            error_ =
                InputError{query.file, std::nullopt,
                           Xlate("the columns \"%1\" and \"%2\" both have geometries: a query with one of them was "
                                 "expected")
                               .arg(columns_[static_cast<std::size_t>(*geometryColumn_)].name, columns_.back().name)};
            return false;
        }
        geometryColumn_ = isGeometry ? std::optional(i) : geometryColumn_;
    }
    ownColumns_ = columns_.size();
    if (geometryColumn_) {
        columns_[static_cast<std::size_t>(*geometryColumn_)].isOffered = true; // its parts are what is read
        offerGeometryParts(columns_);
    }
    return true;
}

bool SqliteRows::bindColumns(const SqliteQuery &query, const Variables &variables)
{
    const auto fault = bindDatabaseColumns(binding_, columns_, query.columns, variables, ownColumns_, sources_);
    if (fault) {
        wrongChoice_ = fault->choice.isEmpty() ? std::nullopt : fault;
        error_ = InputError{query.file, std::nullopt, fault->text};
        return false;
    }
    needsGeometry_ = needsGeometry(sources_);
    error_ = needsReferenceSystem(sources_) ? geometry_.systemsError() : std::nullopt;
    return !error_;
}

/// Prepares a table anew with the columns alone that are read: a polygon that is not needed is not fetched.
bool SqliteRows::prepareNeeded(const SqliteQuery &query)
{
    if (query.table.isEmpty()) {
        return true;
    }
    std::vector<int> needed;
    for (const FieldSource &source : sources_) {
        needed.push_back(source.part ? *geometryColumn_ : source.column);
    }
    std::sort(needed.begin(), needed.end());
    needed.erase(std::unique(needed.begin(), needed.end()), needed.end());
    const auto indexOf = [&needed](int column) {
        return static_cast<int>(std::lower_bound(needed.begin(), needed.end(), column) - needed.begin());
    };
    QStringList names;
    for (const int column : needed) {
        names.append(quoted(columns_[static_cast<std::size_t>(column)].name));
    }
    for (FieldSource &source : sources_) {
        source.column = source.part ? -1 : indexOf(source.column);
    }
    geometryColumn_ = needsGeometry_ ? std::optional(indexOf(*geometryColumn_)) : std::nullopt;
    // Rows come in the order of the table itself, not in that of an index that has all these columns.
    auto statement = file_->prepareQuery(
        QStringLiteral("SELECT %1 FROM %2 NOT INDEXED").arg(names.join(QStringLiteral(", ")), quoted(query.table)));
    if (const InputError *wrong = errorOf(statement)) {
        error_ = *wrong;
        return false;
    }
    statement_ = std::move(std::get<SqliteStatement>(statement));
    return true;
}

} // namespace kareport
