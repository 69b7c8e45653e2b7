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

/// Where the value of a field comes from.
struct FieldSource
{
    int column = -1;                  ///< of the data itself; below 0 for a part of a geometry
    std::optional<GeometryPart> part; ///< of the geometry of the row
};

/// Binds the columns of a database, where none of them is a variable that is an error too.
/// @param ownColumns  how many columns the data itself has; those of a geometry follow
/// @param sources     receive where the values of the binding's fields come from, in their order
/// @return what is wrong
std::optional<ColumnFault> bindDatabaseColumns(ColumnBinding &binding, std::vector<SourceColumn> &columns,
                                               const std::vector<ColumnChoice> &choices, const Variables &variables,
                                               std::size_t ownColumns, std::vector<FieldSource> &sources);
/// Whether a part of a geometry is read, or one that its reference system gives.
bool needsGeometry(const std::vector<FieldSource> &sources);
bool needsReferenceSystem(const std::vector<FieldSource> &sources);

/// Stores a part of a point; what the point does not have is a missing value.
/// @param point   nothing where there is no geometry
/// @param system  null where it is not known
/// @return what is wrong; nothing when it is stored
std::optional<QString> storeGeometryPart(const ColumnBinding &binding, const BoundField &field, GeometryPart part,
                                         const std::optional<PointGeometry> &point, const ReferenceSystem *system,
                                         UDataObject &object);

} // namespace kareport
