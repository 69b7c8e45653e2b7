#include "Alignment.h"

#include "Stationing.h"

#include <algorithm>

namespace kareport
{

void Alignment::add(const PlaneCurve &curve, double length)
{
    elements_.push_back({curve, length, length_, curve.at(curve.length() / 2).point});
    length_ += length;
}

std::size_t Alignment::elementAt(double distance) const
{
    const auto next = std::upper_bound(elements_.begin(), elements_.end(), distance,
                                       [](double at, const Element &element) { return at < element.start; });
    return next == elements_.begin() ? 0 : static_cast<std::size_t>(next - elements_.begin()) - 1;
}

std::optional<CurvePlace> Alignment::at(double distance, bool before) const
{
    if (elements_.empty() || !(distance >= -stationTolerance && distance <= length_ + stationTolerance)) {
        return std::nullopt;
    }
    std::size_t index = elementAt(distance);
    // A distance that misses a border by its last digits is on it.
    if (before && index > 0 && distance <= elements_[index].start + stationTolerance) {
        --index;
    } else if (!before && index + 1 < elements_.size() && distance >= elements_[index + 1].start - stationTolerance) {
        ++index;
    }
    const Element &element = elements_[index];
    double along = distance - element.start;
    if (along < stationTolerance) {
        along = 0;
    } else if (along > element.length - stationTolerance) {
        along = element.length;
    }
    return element.curve.at(along * (element.curve.length() / element.length));
}

} // namespace kareport
