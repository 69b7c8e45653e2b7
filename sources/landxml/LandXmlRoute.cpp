#include "LandXmlRoute.h"

#include <algorithm>

namespace kareport
{

namespace
{

template <typename Line>
std::size_t indexOf(const std::vector<Line> &lines, const std::string &name)
{
    const auto found =
        std::find_if(lines.begin(), lines.end(), [&](const Line &line) { return name.empty() || line.name == name; });
    return static_cast<std::size_t>(found - lines.begin());
}

} // namespace

const VerticalProfile *LandXmlRoute::profile(const std::string &name) const
{
    const std::size_t index = indexOf(stored->gradeLines, name);
    const auto *profile = index < profiles.size() ? std::get_if<LandXmlProfile>(&profiles[index]) : nullptr;
    return profile != nullptr ? &profile->heights : nullptr;
}

const LandXmlHeightLine *LandXmlRoute::surface(const std::string &name) const
{
    const std::size_t index = indexOf(stored->surfaceLines, name);
    return index < isSurfaceSound.size() && isSurfaceSound[index] ? &stored->surfaceLines[index] : nullptr;
}

std::optional<double> heightOn(const LandXmlHeightLine &line, double station)
{
    const auto &points = line.points;
    constexpr double rounding = 1e-4; // of the stations of such lists
    const auto next = std::lower_bound(points.begin(), points.end(), station,
                                       [](const auto &point, double at) { return point.first < at; });
    const auto index = static_cast<std::size_t>(next - points.begin());
    const bool isFirst = std::binary_search(line.pieces.begin(), line.pieces.end(), index);
    if (next != points.begin() && next != points.end() && !isFirst) {
        const auto &[from, height] = *(next - 1);
        return height + (next->second - height) * ((station - from) / (next->first - from));
    }
    if (next != points.end() && next->first - station <= rounding) {
        return next->second;
    }
    if (next != points.begin() && station - (next - 1)->first <= rounding) {
        return (next - 1)->second;
    }
    return std::nullopt;
}

} // namespace kareport
