#include "StationPlaces.h"

#include "Xlate.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

/// Takes places in order, and joins those that are one place.
class StationPlaces::Merged
{
public:
    explicit Merged(double length) : length_(length) {}

    void add(Place place)
    {
        if (!(place.distance >= -samePlace && place.distance <= length_ + samePlace)) {
            return;
        }
        place.distance = std::clamp(place.distance, 0.0, length_);
        const bool isNear = !distances_.empty() && place.distance - distances_.back() <= samePlace;
        const bool areEquations = place.rank == Rank::Equation && rank_ == Rank::Equation; // each has names of its own
        if (!isNear || areEquations) {
            distances_.push_back(place.distance);
            rank_ = place.rank;
        } else if (place.rank > rank_) {
            distances_.back() = place.distance;
            rank_ = place.rank;
        }
    }
    std::vector<double> take() { return std::move(distances_); }

private:
    double length_;
    std::vector<double> distances_;
    Rank rank_ = Rank::Regular; ///< of the last one
};

std::optional<std::vector<double>> StationPlaces::of(const LandXmlRoute &route, std::size_t most) const
{
    const auto interval = regular(route, static_cast<double>(most));
    if (!interval) {
        return std::nullopt;
    }
    Merged merged(route.length);
    auto next = interval->begin();
    for (const Place &place : chosen(route)) {
        for (; next != interval->end() && *next <= place.distance; ++next) {
            merged.add({*next, Rank::Regular});
        }
        merged.add(place);
    }
    for (; next != interval->end(); ++next) {
        merged.add({*next, Rank::Regular});
    }
    return merged.take();
}

/// The places but for those of the interval, in order.
std::vector<StationPlaces::Place> StationPlaces::chosen(const LandXmlRoute &route) const
{
    std::vector<Place> places;
    if (query_.atElements) {
        for (const LandXmlRoute::Piece &piece : route.pieces) {
            places.push_back({piece.start, Rank::Border});
        }
        places.push_back({route.length, Rank::Border});
    }
    for (const StationEquation &equation : route.stationing.equations()) {
        places.push_back({equation.internal - route.stationing.start(), Rank::Equation});
    }
    addListed(route, places);
    std::sort(places.begin(), places.end(),
              [](const Place &left, const Place &right) { return left.distance < right.distance; });
    return places;
}

void StationPlaces::addListed(const LandXmlRoute &route, std::vector<Place> &places) const
{
    const double end = route.stationing.start() + route.length;
    for (const double station : query_.stations) {
        const std::vector<double> found = route.stationing.placesOf(station, end);
        if (found.size() != 1) {
            const QString text = QString::number(station / unit_, 'f', 3);
            notes_.add(route.stored->byte, found.empty()
                                               ? Xlate("the alignment has no station %1").arg(text)
                                               : Xlate("the alignment has the station %1 at several places").arg(text));
        }
        for (const double place : found) {
            places.push_back({place - route.stationing.start(), Rank::Listed});
        }
    }
}

/// The places that the interval gives, in order.
std::optional<std::vector<double>> StationPlaces::regular(const LandXmlRoute &route, double most) const
{
    std::vector<double> distances;
    const double interval = query_.interval;
    if (!(interval > 0)) {
        return distances;
    }
    if (!(route.length / interval < most)) {
        return std::nullopt;
    }
    if (query_.fromRound) {
        return round(route, most);
    }
    // An end that is an interval but for its last digits counts.
    const auto last = static_cast<std::size_t>((route.length + samePlace) / interval);
    for (std::size_t i = 0; i <= last; ++i) {
        distances.push_back(static_cast<double>(i) * interval);
    }
    return distances;
}

/// The places of stations that are whole multiples of the interval, in each region between equations.
std::optional<std::vector<double>> StationPlaces::round(const LandXmlRoute &route, double most) const
{
    std::vector<double> distances;
    const Stationing &stationing = route.stationing;
    const auto &equations = stationing.equations();
    const double interval = query_.interval;
    const double end = stationing.start() + route.length;
    for (std::size_t region = 0; region <= equations.size(); ++region) {
        const StationEquation *equation = region == 0 ? nullptr : &equations[region - 1];
        const double from = equation == nullptr ? stationing.start() : equation->internal;
        const double to = region == equations.size() ? end : std::min(equations[region].internal, end);
        if (to < from) {
            continue;
        }
        const double first = equation == nullptr ? from : equation->ahead;
        const double last = first + (equation != nullptr && equation->isDecreasing ? from - to : to - from);
        const double low = std::ceil((std::min(first, last) - samePlace) / interval);
        const double high = std::floor((std::max(first, last) + samePlace) / interval);
        // Far from 0, neighbouring multiples are one number: what is counted is their difference.
        const double count = high - low + 1;
        if (!(count + static_cast<double>(distances.size()) < most)) {
            return std::nullopt;
        }
        for (qint64 i = 0; i < static_cast<qint64>(count); ++i) {
            const double number = low + static_cast<double>(i);
            distances.push_back(stationing.internalIn(region, number * interval) - stationing.start());
        }
    }
    std::sort(distances.begin(), distances.end());
    return distances;
}

} // namespace kareport
