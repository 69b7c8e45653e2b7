#pragma once

#include "ColumnBinding.h"
#include "PointGeometry.h"
#include "UDataObject.h"

#include <QString>

#include <array>
#include <optional>
#include <utility>
#include <vector>

namespace kareport
{

/// What a column that stands for a part of a geometry gives.
enum class GeometryPart
{
    X,
    Y,
    Z,
    System,
    SystemName
};

/// The names of the columns that stand for parts of a geometry.
inline constexpr std::array<std::pair<GeometryPart, const char16_t *>, 5> geometryParts = {
    {{GeometryPart::X, u"@x"},
     {GeometryPart::Y, u"@y"},
     {GeometryPart::Z, u"@z"},
     {GeometryPart::System, u"@srs"},
     {GeometryPart::SystemName, u"@srsName"}}};

/// A system that coordinates refer to.
struct ReferenceSystem
{
    QString key; ///< such as "EPSG:25832"
    QString name;
};

/// Adds the columns that stand for parts of a geometry after those of the data itself.
void offerGeometryParts(std::vector<SourceColumn> &columns);

/// Stores a part of a point; what the point does not have is no value.
/// @param point   nothing where there is no geometry
/// @param system  null where it is not known
/// @return what is wrong; nothing when it is stored
std::optional<QString> storeGeometryPart(const ColumnBinding &binding, const BoundField &field, GeometryPart part,
                                         const std::optional<PointGeometry> &point, const ReferenceSystem *system,
                                         UDataObject &object);

} // namespace kareport
