#pragma once

#include "LandXmlNotes.h"
#include "LandXmlQuery.h"
#include "LandXmlRoute.h"

#include <cstddef>
#include <optional>
#include <vector>

namespace kareport
{

/// Places that are nearer to each other are one: metres.
inline constexpr double samePlace = 1e-4;

/// Chooses the places along alignments that a query of stations asks for.
class StationPlaces
{
public:
    /// @param query  its lengths are in metres
    /// @param unit   metres in the unit that the query was asked in, for notes
    /// @param notes  receives stations that the alignment does not have, or has several times
    StationPlaces(const LandXmlQuery &query, double unit, LandXmlNotes &notes)
        : query_(query), unit_(unit), notes_(notes)
    {}

    /// The distances of the places from the start of the alignment, in order. Of places that are one, that of an equation
    /// counts most, then that of a listed station, then the border of elements.
    /// @param most  places at most. @return nothing where the interval gives more
    std::optional<std::vector<double>> of(const LandXmlRoute &route, std::size_t most) const;

private:
    enum class Rank
    {
        Regular,
        Border,
        Listed,
        Equation
    };
    struct Place
    {
        double distance;
        Rank rank;
    };
    class Merged;

    std::vector<Place> chosen(const LandXmlRoute &route) const;
    void addListed(const LandXmlRoute &route, std::vector<Place> &places) const;
    std::optional<std::vector<double>> regular(const LandXmlRoute &route, double most) const;
    std::optional<std::vector<double>> round(const LandXmlRoute &route, double most) const;

    const LandXmlQuery &query_;
    double unit_;
    LandXmlNotes &notes_;
};

} // namespace kareport
