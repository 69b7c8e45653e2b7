#include "PostgresRows.h"

#include "NumberText.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

namespace
{

constexpr qsizetype longestQuote = 40;

/// The type of a column of bytes, which has this number in every database.
constexpr Oid bytesType = 17;

std::string_view textOf(const PGresult *row, int column)
{
    return {PQgetvalue(row, 0, column), static_cast<std::size_t>(PQgetlength(row, 0, column))};
}

QString quoteOf(std::string_view text)
{
    const QString shown =
        QString::fromUtf8(text.data(), static_cast<qsizetype>(std::min<std::size_t>(text.size(), 160)));
    return shown.size() > longestQuote ? shown.left(longestQuote) + u'…' : shown;
}

} // namespace

PostgresRows::PostgresRows(const PostgresQuery &query, const Variables &variables,
                           const std::function<bool()> &isToStop)
    : connection_(query.connection, isToStop)
{
    error_ = connection_.error();
    for (const auto &parameter : query.parameters) {
        parameters_.push_back(parameter ? std::optional(parameter->toUtf8()) : std::nullopt);
    }
    if (error_ || connection_.isStopped() || !prepare(query) || !bindColumns(query, variables)) {
        return;
    }
    const bool needsSystems = std::any_of(sources_.begin(), sources_.end(), [](const Source &source) {
        return source.part == GeometryPart::System || source.part == GeometryPart::SystemName;
    });
    if (needsSystems) {
        readSystems();
    }
}

bool PostgresRows::fail(const QString &text)
{
    error_ = InputError{connection_.name(), std::nullopt, text};
    return false;
}

bool PostgresRows::prepare(const PostgresQuery &query)
{
    const PostgresResult description = connection_.prepare(query.query);
    if (!description) {
        if (!connection_.isStopped()) {
            error_ = connection_.failure();
        }
        return false;
    }
    const int wanted = PQnparams(description.get());
    if (wanted != static_cast<int>(parameters_.size())) {
        return fail(Xlate("the query has %1 parameters: values of %2 are given").arg(wanted).arg(parameters_.size()));
    }
    if (PQnfields(description.get()) == 0) {
        return fail(Xlate("the query is not a single SELECT, which was expected"));
    }
    return findColumns(description.get());
}

bool PostgresRows::findColumns(const PGresult *description)
{
    for (int i = 0; i < PQnfields(description); ++i) {
        columns_.push_back({QString::fromUtf8(PQfname(description, i)), std::nullopt, false});
    }
    ownColumns_ = columns_.size();
    std::vector<Oid> types;
    const bool hasOwnTypes = [&] {
        for (int i = 0; i < PQnfields(description); ++i) {
            if (PQftype(description, i) >= 16384 || PQftype(description, i) == bytesType) { // not of the server itself
                return true;
            }
        }
        return false;
    }();
    if (hasOwnTypes) {
        const PostgresResult found =
            connection_.ask("SELECT oid FROM pg_type WHERE typname IN ('geometry', 'geography')");
        for (int i = 0; found && i < PQntuples(found.get()); ++i) {
            types.push_back(QByteArray(PQgetvalue(found.get(), i, 0)).toUInt());
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
    for (int i = 0; i < PQnfields(description); ++i) {
        const Oid type = PQftype(description, i);
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
    if (const auto fault = binding_.bind(columns_, query.columns, variables)) {
        if (!fault->choice.isEmpty()) {
            wrongChoice_ = fault;
        }
        return fail(fault->text);
    }
    if (binding_.fields().empty()) {
        return fail(Xlate("no column is a variable of the dictionary: there are %1")
                        .arg(namesOf(columns_).join(QStringLiteral(", "))));
    }
    for (const BoundField &field : binding_.fields()) {
        Source &source = sources_.emplace_back();
        if (field.column < ownColumns_) {
            source.column = static_cast<int>(field.column);
        } else {
            source.part = geometryParts[field.column - ownColumns_].first;
            needsGeometry_ = true;
        }
    }
    return true;
}

/// Reads the reference systems, which the database describes where PostGIS is installed.
void PostgresRows::readSystems()
{
    const PostgresResult table = connection_.ask("SELECT to_regclass('spatial_ref_sys') IS NOT NULL");
    if (!table || PQntuples(table.get()) != 1 || PQgetvalue(table.get(), 0, 0)[0] != 't') {
        return;
    }
    const PostgresResult rows = connection_.ask("SELECT srid, auth_name || ':' || auth_srid, "
                                                "substring(srtext from '\"([^\"]*)\"') FROM spatial_ref_sys");
    for (int i = 0; rows && i < PQntuples(rows.get()); ++i) {
        systems_.insert(
            QByteArray(PQgetvalue(rows.get(), i, 0)).toInt(),
            {QString::fromUtf8(PQgetvalue(rows.get(), i, 1)), QString::fromUtf8(PQgetvalue(rows.get(), i, 2))});
    }
}

void PostgresRows::rewind()
{
    connection_.drain();
    isSent_ = false;
    row_ = 0;
    error_.reset();
}

bool PostgresRows::next(UDataObject &object, const std::vector<unsigned> * /*onlyIds*/)
{
    if (connection_.isStopped()) {
        return false;
    }
    if (!isSent_) {
        isSent_ = connection_.send(parameters_);
        if (!isSent_) {
            error_ = connection_.failure();
            return false;
        }
    }
    const PostgresResult row = connection_.next();
    if (!row) {
        if (!connection_.isStopped()) {
            error_ = connection_.failure();
        }
        return false;
    }
    return PQresultStatus(row.get()) == PGRES_SINGLE_TUPLE && storeRow(row.get(), object);
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
        const Source &source = sources_[i];
        if (!source.part) {
            if (!storeCell(fields[i], row, source.column, object)) {
                return false;
            }
            continue;
        }
        const auto system = point_ ? systems_.constFind(point_->referenceSystem) : systems_.constEnd();
        const auto wrong = storeGeometryPart(binding_, fields[i], *source.part, point_,
                                             system != systems_.constEnd() ? &*system : nullptr, object);
        if (wrong) {
            return failInRow(*wrong);
        }
    }
    return true;
}

bool PostgresRows::storeCell(const BoundField &field, const PGresult *row, int column, UDataObject &object)
{
    const std::string_view text = textOf(row, column);
    rowBytes_ += text.size();
    if (PQgetisnull(row, 0, column) != 0 || field.parser.isNone(text)) {
        binding_.storeNone(field, object);
        return true;
    }
    return field.parser.storeValue(text, object) ||
           failInRow(Xlate("the value \"%1\" of the column \"%2\" does not fit: %3 was expected")
                         .arg(quoteOf(text), field.name, field.parser.expected()));
}

/// Reads the point of the row. @return whether there is one, or no geometry at all
bool PostgresRows::readGeometry(const PGresult *row)
{
    point_.reset();
    if (PQgetisnull(row, 0, *geometryColumn_) != 0) {
        return true;
    }
    const std::string_view text = textOf(row, *geometryColumn_);
    rowBytes_ += text.size();
    const PointOrFault read = parseHexPoint(text);
    if (const QString *instead = std::get_if<QString>(&read)) {
        return failInRow(Xlate("there is %1: a point was expected").arg(*instead));
    }
    point_ = std::get<PointGeometry>(read);
    return true;
}

bool PostgresRows::failInRow(const QString &text)
{
    return fail(Xlate("row %1: ").arg(row_) + text);
}

} // namespace kareport
