#pragma once

#include <cstddef>
#include <vector>

namespace kareport
{

/// In metres: two stations that differ by no more than what rounding leaves are the same.
inline constexpr double stationTolerance = 1e-7;

/// A place where the count of stations breaks off and continues with another number.
struct StationEquation
{
    double internal;           ///< the place, as a station that is counted from the start without equations
    double ahead;              ///< the station of the same place from there on
    bool isDecreasing = false; ///< from there on, stations fall along the alignment
};

/// Names of places along an alignment with station equations. Between the equations there are regions, counted from 0: a
/// number may name places in several of them, or none.
class Stationing
{
public:
    struct Name
    {
        double station;
        std::size_t region;
    };

    /// @param start  the station of the alignment's start
    explicit Stationing(double start) : start_(start) {}

    /// Adds an equation ahead of the others. The first one may be at the start, whose name back is then the station of the
    /// start. @return false, and nothing is added, where a number is not finite, or the equation is before the start or not
    /// ahead of the others
    bool add(const StationEquation &equation);

    double start() const { return start_; }
    const std::vector<StationEquation> &equations() const { return equations_; }

    /// The station of a place. @param back  on an equation, the name that the place has before it
    Name nameOf(double internal, bool back = false) const;
    /// The place that a station names in a region; the region's borders belong to it. It may be outside the region: then the
    /// station names no place of it.
    double internalIn(std::size_t region, double station) const;
    /// All places that a station names, in order, up to an end of the alignment. A place on an equation whose two names
    /// are equal is there once.
    std::vector<double> placesOf(double station, double endInternal) const;
    /// The equation that a place is on, or null.
    const StationEquation *equationAt(double internal) const;

private:
    double start_;
    std::vector<StationEquation> equations_;
};

} // namespace kareport
