#pragma once

#include <QString>

#include <limits>
#include <string_view>
#include <variant>

namespace kareport
{

/// A point as databases store it. A coordinate that it does not have is not-a-number; an empty point has none.
struct PointGeometry
{
    double x = std::numeric_limits<double>::quiet_NaN();
    double y = std::numeric_limits<double>::quiet_NaN();
    double z = std::numeric_limits<double>::quiet_NaN();
    qint32 referenceSystem = 0; ///< its number; 0 where none is said
};

/// A point, or what is there instead, for a message that says that a point was expected.
using PointOrFault = std::variant<PointGeometry, QString>;

/// Reads a geometry in well-known binary: of ISO with dimensions in its type (1, 1001, 2001, 3001), or extended with flags
/// and the number of its reference system.
PointOrFault parseWkbPoint(std::string_view bytes);
/// The same in hexadecimal digits, with or without "\x" in front, as PostgreSQL writes it.
PointOrFault parseHexPoint(std::string_view text);
/// Reads the geometry of a GeoPackage: a header with the reference system and an envelope, then well-known binary.
PointOrFault parseGeoPackagePoint(std::string_view bytes);

} // namespace kareport
