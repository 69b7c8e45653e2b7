#include "LandXmlPointTable.h"

namespace kareport
{

void LandXmlPointTable::add(const LandXmlPoint &point)
{
    points_.try_emplace(point.name, point.at);
    if (!point.id.empty()) {
        points_.try_emplace(point.id, point.at);
    }
}

std::optional<LandXmlPointTable::Found> LandXmlPointTable::find(std::string_view name) const
{
    std::string_view next = name;
    for (std::size_t step = 0; step <= points_.size(); ++step) {
        const auto point = points_.find(next);
        if (point == points_.end()) {
            return std::nullopt;
        }
        const LandXmlCoordinates &at = point->second;
        if (at.position) {
            return Found{*at.position, at.height};
        }
        next = at.reference;
        constexpr std::size_t longestChain = 100;
        if (step == longestChain) {
            return std::nullopt;
        }
    }
    return std::nullopt;
}

} // namespace kareport
