// What a query of a PostgreSQL database is made of: its columns, and the systems of its coordinates.
#include "PostgresColumns.h"
#include "PostgresRows.h"

#include "Xlate.h"

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
    auto found = findPostgresColumns(*connection_, description.get());
    if (const InputError *wrong = errorOf(found)) {
        if (!connection_->isStopped()) {
            error_ = *wrong;
        }
        return false;
    }
    auto &columns = std::get<PostgresColumns>(found);
    columns_ = std::move(columns.columns);
    ownColumns_ = columns.own;
    geometryColumn_ = columns.geometry;
    return true;
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
