#include "PostgresRows.h"

#include "PostgresColumns.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

std::string_view textOf(const PGresult *row, int column)
{
    const LibPq &pq = libPq();
    return {pq.getvalue(row, 0, column), static_cast<std::size_t>(pq.getlength(row, 0, column))};
}

} // namespace

PostgresRows::PostgresRows(std::shared_ptr<PostgresConnection> connection, const PostgresQuery &query,
                           const Variables &variables, const std::function<bool()> &isToStop)
    : connection_(std::move(connection))
{
    const auto asking = connection_->stopWhen(isToStop);
    error_ = connection_->error();
    for (const auto &parameter : query.parameters) {
        parameters_.push_back(parameter ? std::optional(parameter->toUtf8()) : std::nullopt);
    }
    if (error_ || connection_->isStopped() || !prepare(query) || !bindColumns(query, variables)) {
        return;
    }
    if (needsReferenceSystem(sources_)) {
        readSystems();
    }
}

bool PostgresRows::fail(const QString &text)
{
    error_ = InputError{connection_->name(), std::nullopt, text};
    return false;
}

/// Keeps why there is no answer, unless reading was stopped. @return false
bool PostgresRows::failUnlessStopped()
{
    if (!connection_->isStopped()) {
        error_ = connection_->failure();
    }
    return false;
}

void PostgresRows::rewind()
{
    connection_->drain();
    isSent_ = false;
    row_ = 0;
    error_.reset();
}

bool PostgresRows::next(UDataObject &object, const std::vector<unsigned> * /*onlyIds*/)
{
    if (connection_->isStopped()) {
        return false;
    }
    if (!isSent_) {
        isSent_ = connection_->send(parameters_);
        if (!isSent_) {
            error_ = connection_->failure();
            return false;
        }
    }
    const PostgresResult row = connection_->next();
    if (!row) {
        return failUnlessStopped();
    }
    return pq_.resultStatus(row.get()) == PGRES_SINGLE_TUPLE && storeRow(row.get(), object);
}

bool PostgresRows::storeRow(const PGresult *row, UDataObject &object)
{
    ++row_;
    rowBytes_ = 0;
    if (needsGeometry_ && !readGeometry(row)) {
        return false;
    }
    binding_.begin(object);
    const auto &fields = binding_.fields();
    for (std::size_t i = 0; i < fields.size(); ++i) {
        const FieldSource &source = sources_[i];
        const auto store = [&] {
            return source.part ? storePart(fields[i], *source.part, object)
                               : storeCell(fields[i], row, source.column, object);
        };
        if (!storeOver(binding_.isShared(fields[i]), fields[i].parser.id(), fields[i].variable, object, store, noPlace))
        {
            return false;
        }
    }
    return true;
}

bool PostgresRows::storePart(const BoundField &field, GeometryPart part, UDataObject &object)
{
    const auto system = point_ ? systems_.constFind(point_->referenceSystem) : systems_.constEnd();
    const auto wrong =
        storeGeometryPart(binding_, field, part, point_, system != systems_.constEnd() ? &*system : nullptr, object);
    return !wrong || failInRow(*wrong);
}

bool PostgresRows::storeCell(const BoundField &field, const PGresult *row, int column, UDataObject &object)
{
    const std::string_view text = textOf(row, column);
    rowBytes_ += text.size();
    if (pq_.getisnull(row, 0, column) != 0 || field.parser.isNone(text)) {
        binding_.storeNone(field, object);
        return true;
    }
    const auto wrong = storePostgresCell(field, text, pq_.ftype(row, column), object);
    return !wrong || failInRow(*wrong);
}

/// Reads the point of the row. @return whether there is one, or no geometry at all
bool PostgresRows::readGeometry(const PGresult *row)
{
    point_.reset();
    if (pq_.getisnull(row, 0, *geometryColumn_) != 0) {
        return true;
    }
    const std::string_view text = textOf(row, *geometryColumn_);
    rowBytes_ += text.size();
    const PointOrFault read = parseHexPoint(text);
    if (const QString *instead = std::get_if<QString>(&read)) {
        return failInRow(Xlate("a point was expected instead of %1").arg(*instead));
    }
    point_ = std::get<PointGeometry>(read);
    return true;
}

bool PostgresRows::failInRow(const QString &text)
{
    return fail(Xlate("row %1: ").arg(row_) + text);
}

} // namespace kareport
