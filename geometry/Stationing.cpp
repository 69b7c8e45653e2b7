#include "Stationing.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace kareport
{

bool Stationing::add(const StationEquation &equation)
{
    const bool isAhead = equations_.empty() ? equation.internal >= start_ - stationTolerance
                                            : equation.internal > equations_.back().internal + stationTolerance;
    if (!std::isfinite(equation.internal) || !std::isfinite(equation.ahead) || !isAhead) {
        return false;
    }
    equations_.push_back(equation);
    return true;
}

Stationing::Name Stationing::nameOf(double internal, bool back) const
{
    // What misses an equation by its last digits is on it.
    const auto next =
        std::upper_bound(equations_.begin(), equations_.end(), internal + (back ? -stationTolerance : stationTolerance),
                         [](double at, const StationEquation &equation) { return at < equation.internal; });
    const auto region = static_cast<std::size_t>(next - equations_.begin());
    if (region == 0) {
        return {internal, 0};
    }
    const StationEquation &equation = equations_[region - 1];
    const double along = internal - equation.internal;
    return {equation.ahead + (equation.isDecreasing ? -along : along), region};
}

double Stationing::internalIn(std::size_t region, double station) const
{
    if (region == 0) {
        return station;
    }
    const StationEquation &equation = equations_[region - 1];
    const double along = station - equation.ahead;
    return equation.internal + (equation.isDecreasing ? -along : along);
}

std::vector<double> Stationing::placesOf(double station, double endInternal) const
{
    std::vector<double> places;
    for (std::size_t region = 0; region <= equations_.size(); ++region) {
        const double from = region == 0 ? start_ : equations_[region - 1].internal;
        const double to = region == equations_.size() ? endInternal : equations_[region].internal;
        const double place = internalIn(region, station);
        const bool isThere = place >= from - stationTolerance && place <= std::min(to, endInternal) + stationTolerance;
        if (isThere && (places.empty() || place > places.back() + stationTolerance)) {
            places.push_back(place);
        }
    }
    return places;
}

const StationEquation *Stationing::equationAt(double internal) const
{
    const auto next =
        std::lower_bound(equations_.begin(), equations_.end(), internal - stationTolerance,
                         [](const StationEquation &equation, double at) { return equation.internal < at; });
    return next != equations_.end() && next->internal <= internal + stationTolerance ? &*next : nullptr;
}

} // namespace kareport
