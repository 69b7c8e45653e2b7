#include "PostgresColumns.h"

#include "GeometryColumns.h"
#include "NearestName.h"
#include "NumberText.h"
#include "PostgresConnection.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

namespace
{

/// The type of a column of bytes, which has this number in every database.
constexpr Oid bytesType = 17;
/// Types with this number or a larger one are not of the server itself.
constexpr Oid firstOwnType = 16384;
constexpr qsizetype longestQuote = 40;

/// Types of numbers with decimals: single and double precision, and numeric.
bool isNumeric(Oid type)
{
    return type == 700 || type == 701 || type == 1700;
}

QString quoteOf(std::string_view text)
{
    constexpr std::size_t longestBytes = 4 * std::size_t(longestQuote) + 4; // what is cut off is not shown
    const auto bytes = static_cast<qsizetype>(std::min(text.size(), longestBytes));
    return shortened(QString::fromUtf8(text.data(), bytes), longestQuote);
}

/// The column of geometries, or else the only one of bytes. Two of geometries are an error.
std::optional<InputError> findGeometry(const PostgresConnection &connection, const std::vector<Oid> &geometryTypes,
                                       PostgresColumns &found)
{
    std::vector<int> geometries;
    std::vector<int> bytes;
    for (std::size_t i = 0; i < found.own; ++i) {
        const Oid type = found.types[i];
        if (std::find(geometryTypes.begin(), geometryTypes.end(), type) != geometryTypes.end()) {
            geometries.push_back(static_cast<int>(i));
        } else if (isBytes(type)) {
            bytes.push_back(static_cast<int>(i));
        }
    }
    if (geometries.size() > 1) {
        return InputError{
            connection.name(), std::nullopt,
            Xlate("the columns \"%1\" and \"%2\" both have geometries: a query with one of them was expected")
                .arg(found.columns[static_cast<std::size_t>(geometries[0])].name,
                     found.columns[static_cast<std::size_t>(geometries[1])].name)};
    }
    const std::vector<int> &chosen = geometries.empty() ? bytes : geometries;
    found.geometry = chosen.size() == 1 ? std::optional(chosen.front()) : std::nullopt;
    return std::nullopt;
}

} // namespace

bool isBytes(Oid type)
{
    return type == bytesType;
}

Expected<PostgresColumns> findPostgresColumns(PostgresConnection &connection, const PGresult *description)
{
    const LibPq &pq = libPq();
    PostgresColumns found;
    bool hasOwnTypes = false;
    for (int i = 0; i < pq.nfields(description); ++i) {
        found.columns.push_back({QString::fromUtf8(pq.fname(description, i)), std::nullopt, false});
        const Oid type = pq.ftype(description, i);
        found.types.push_back(type);
        hasOwnTypes = hasOwnTypes || type >= firstOwnType || isBytes(type);
    }
    found.own = found.columns.size();
    std::vector<Oid> geometryTypes;
    if (hasOwnTypes) {
        const PostgresResult types =
            connection.read("SELECT oid FROM pg_type WHERE typname IN ('geometry', 'geography')");
        if (!types) {
            return connection.failure();
        }
        for (int i = 0; i < pq.ntuples(types.get()); ++i) {
            geometryTypes.push_back(QByteArray(pq.getvalue(types.get(), i, 0)).toUInt());
        }
    }
    if (const auto wrong = findGeometry(connection, geometryTypes, found)) {
        return *wrong;
    }
    if (found.geometry) {
        found.columns[static_cast<std::size_t>(*found.geometry)].isOffered = true; // its parts are what is read
        offerGeometryParts(found.columns);
    }
    return found;
}

std::optional<QString> storePostgresCell(const BoundField &field, std::string_view text, Oid type, UDataObject &object)
{
    const auto misfit = [&field](const QString &value) {
        return Xlate("the value \"%1\" of the column \"%2\" does not fit: %3 was expected")
            .arg(value, field.name, field.parser.expected());
    };
    if (isBytes(type)) {
        return misfit(Xlate("%1 bytes").arg((text.size() - std::min<std::size_t>(text.size(), 2)) / 2));
    }
    double number = 0;
    const bool isStored = field.parser.storeValue(text, object) ||
                          // A number of the database such as 5.0 is whole, as one of JSON is.
                          (isNumeric(type) && parseNumber(text, number) && field.parser.storeNumber(number, object));
    return isStored ? std::nullopt : std::optional(misfit(quoteOf(text)));
}

} // namespace kareport
