#include "PostgresRows.h"

#include "Xlate.h"

#include <algorithm>

// How the columns of a query are found.

namespace kareport
{

bool PostgresRows::prepare(const PostgresQuery &query)
{
    const PostgresResult description = connection_->prepare(query.query);
    if (!description) {
        return failUnlessStopped();
    }
    const int wanted = pq_.nparams(description.get());
    if (wanted != static_cast<int>(parameters_.size())) {
        return fail(Xlate("the query has %1 parameters: values of %2 are given").arg(wanted).arg(parameters_.size()));
    }
    if (pq_.nfields(description.get()) == 0) {
        return fail(Xlate("the query is not a single SELECT, which was expected"));
    }
    return findColumns(description.get());
}

bool PostgresRows::findColumns(const PGresult *description)
{
    for (int i = 0; i < pq_.nfields(description); ++i) {
        columns_.push_back({QString::fromUtf8(pq_.fname(description, i)), std::nullopt, false});
    }
    ownColumns_ = columns_.size();
    std::vector<Oid> types;
    const bool hasOwnTypes = [&] {
        for (int i = 0; i < pq_.nfields(description); ++i) {
            if (pq_.ftype(description, i) >= 16384 || pq_.ftype(description, i) == bytesType)
            { // not of the server itself
                return true;
            }
        }
        return false;
    }();
    if (hasOwnTypes) {
        const PostgresResult found =
            connection_->read("SELECT oid FROM pg_type WHERE typname IN ('geometry', 'geography')");
        if (!found) {
            return failUnlessStopped();
        }
        for (int i = 0; i < pq_.ntuples(found.get()); ++i) {
            types.push_back(QByteArray(pq_.getvalue(found.get(), i, 0)).toUInt());
        }
    }
    geometryColumn_ = geometryColumnOf(description, types);
    if (geometryColumn_) {
        columns_[static_cast<std::size_t>(*geometryColumn_)].isOffered = true; // its parts are what is read
        offerGeometryParts(columns_);
    }
    return !error_;
}

/// The column of geometries, or else the only one of bytes. Two of geometries are an error.
std::optional<int> PostgresRows::geometryColumnOf(const PGresult *description, const std::vector<Oid> &types)
{
    std::vector<int> geometries;
    std::vector<int> bytes;
    for (int i = 0; i < pq_.nfields(description); ++i) {
        const Oid type = pq_.ftype(description, i);
        if (std::find(types.begin(), types.end(), type) != types.end()) {
            geometries.push_back(i);
        } else if (type == bytesType) {
            bytes.push_back(i);
        }
    }
    if (geometries.size() > 1) {
        fail(Xlate("the columns \"%1\" and \"%2\" both have geometries: a query with one of them was expected")
                 .arg(columns_[static_cast<std::size_t>(geometries[0])].name,
                      columns_[static_cast<std::size_t>(geometries[1])].name));
        return std::nullopt;
    }
    const std::vector<int> &found = geometries.empty() ? bytes : geometries;
    return found.size() == 1 ? std::optional(found.front()) : std::nullopt;
}

bool PostgresRows::bindColumns(const PostgresQuery &query, const Variables &variables)
{
    const auto fault = bindDatabaseColumns(binding_, columns_, query.columns, variables, ownColumns_, sources_);
    if (fault) {
        wrongChoice_ = fault->choice.isEmpty() ? std::nullopt : fault;
        return fail(fault->text);
    }
    needsGeometry_ = needsGeometry(sources_);
    return true;
}

/// Reads the reference systems, which the database describes where PostGIS is installed.
void PostgresRows::readSystems()
{
    // PostGIS may be in a schema that names are not looked up in, and another table may have the name there: that of the type of
    // geometries comes first.
    const PostgresResult table = connection_->read(
        "SELECT c.oid::pg_catalog.regclass, pg_catalog.has_table_privilege(c.oid, 'SELECT') FROM pg_catalog.pg_class c WHERE c.relname = 'spatial_ref_sys' "
        "AND c.relkind IN ('r', 'v', 'm', 'p', 'f') AND pg_catalog.has_schema_privilege(c.relnamespace, 'USAGE') "
        "ORDER BY c.relnamespace IN (SELECT t.typnamespace FROM pg_catalog.pg_type t WHERE t.typname = 'geometry') DESC, "
        "pg_catalog.pg_table_is_visible(c.oid) DESC, c.oid LIMIT 1");
    if (!table) {
        failUnlessStopped();
        return;
    }
    // One that this user must not read tells him nothing, as if it were not there.
    if (pq_.ntuples(table.get()) == 0 || QByteArray(pq_.getvalue(table.get(), 0, 1)) != "t") {
        return;
    }
    const QByteArray name = pq_.getvalue(table.get(), 0, 0); // as SQL has it, with quotes where they are needed
    const QByteArray sql =
        "SELECT srid, auth_name || ':' || auth_srid, substring(srtext from '\"([^\"]*)\"') FROM " + name;
    const PostgresResult rows = connection_->read(sql.constData());
    if (!rows) {
        failUnlessStopped();
        return;
    }
    for (int i = 0; i < pq_.ntuples(rows.get()); ++i) {
        systems_.insert(
            QByteArray(pq_.getvalue(rows.get(), i, 0)).toInt(),
            {QString::fromUtf8(pq_.getvalue(rows.get(), i, 1)), QString::fromUtf8(pq_.getvalue(rows.get(), i, 2))});
    }
}

} // namespace kareport
