#include "LandXmlPointTable.h"

namespace kareport
{

void LandXmlPointTable::add(const LandXmlPoint &point)
{
    byName_.try_emplace(point.name, point.at);
    if (!point.id.empty()) {
        byId_.try_emplace(point.id, point.at);
    }
}

const LandXmlCoordinates *LandXmlPointTable::coordinatesOf(std::string_view name) const
{
    if (const auto point = byName_.find(name); point != byName_.end()) {
        return &point->second;
    }
    const auto point = byId_.find(name);
    return point != byId_.end() ? &point->second : nullptr;
}

std::optional<LandXmlPointTable::Found> LandXmlPointTable::find(std::string_view name) const
{
    std::string_view next = name;
    constexpr int longestChain = 100;
    for (int step = 0; step <= longestChain; ++step) {
        const LandXmlCoordinates *at = coordinatesOf(next);
        if (at == nullptr) {
            return std::nullopt;
        }
        if (at->position) {
            return Found{*at->position, at->height};
        }
        next = at->reference;
    }
    return std::nullopt;
}

} // namespace kareport
