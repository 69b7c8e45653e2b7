#pragma once

#include "LandXmlModel.h"

#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>

namespace kareport
{

/// The points of a file by their names, for coordinates that refer to them.
class LandXmlPointTable
{
public:
    /// Adds a point under its name and its identifier. Of several points with one name the first is found. A name counts
    /// before an identifier: many programs number both, from different points.
    void add(const LandXmlPoint &point);

    struct Found
    {
        PlanePoint position;
        double height;
    };
    /// The coordinates of a point, which may itself refer to another one; nothing when there is no such point, or it refers
    /// to itself in the end.
    std::optional<Found> find(std::string_view name) const;

private:
    struct Hash : std::hash<std::string_view>
    {
        using is_transparent = void;
    };

    const LandXmlCoordinates *coordinatesOf(std::string_view name) const;

    using Points = std::unordered_map<std::string, LandXmlCoordinates, Hash, std::equal_to<>>;
    Points byName_;
    Points byId_;
};

} // namespace kareport
