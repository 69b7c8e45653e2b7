#include "CurveFeet.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace kareport
{

namespace
{

CurveFeet feetOnLine(const PlaneCurve &curve, PlanePoint point)
{
    const PlanePoint seen = seenFrom(curve.start(), point);
    CurveFeet found;
    if (seen.northing >= -placeRounding && seen.northing <= curve.length() + placeRounding) {
        found.feet.push_back({std::clamp(seen.northing, 0.0, curve.length()), seen.easting});
    }
    return found;
}

CurveFeet feetOnArc(const PlaneCurve &curve, PlanePoint point)
{
    const PlanePoint seen = seenFrom(curve.start(), point);
    const double curvature = curve.startCurvature();
    // In a circle of radius 1 whose centre is the origin; differences of large numbers are kept out of it.
    const double sine = curvature * seen.northing;
    const double cosine = 1 - curvature * seen.easting;
    const double fromCentre = std::hypot(sine, cosine);
    const double radius = 1 / std::fabs(curvature);
    CurveFeet found;
    // Of a large circle, the last digits of the radius say no more.
    const double nearCentre = std::max(10 * placeRounding, 8 * std::numeric_limits<double>::epsilon() * radius);
    if (fromCentre * radius < nearCentre) {
        found.isUndetermined = true;
        return found;
    }
    const double near = std::atan2(sine, cosine) / curvature;
    const double square = seen.northing * seen.northing + seen.easting * seen.easting;
    const double nearOffset = (2 * seen.easting - curvature * square) / (1 + fromCentre);
    const double farOffset = (1 + fromCentre) / curvature;
    const double half = std::numbers::pi * radius;
    // The near side is seen once a turn, and the far side half a turn away from it.
    for (double length = near - 2 * half; length <= curve.length() + placeRounding; length += 2 * half) {
        for (const CurveFoot foot : {CurveFoot{length, nearOffset}, CurveFoot{length + half, farOffset}}) {
            if (foot.length >= -placeRounding && foot.length <= curve.length() + placeRounding) {
                found.feet.push_back({std::clamp(foot.length, 0.0, curve.length()), foot.offset});
            }
        }
    }
    return found;
}

/// Searches a transition for places from which a point is neither ahead nor back. How fast it can come nearer at most tells
/// which stretches have no such place; a stretch along which it only comes nearer, or only goes farther, has one or none.
class TransitionSearch
{
public:
    TransitionSearch(PlaneCurve curve, PlanePoint point) : curve_(std::move(curve)), point_(point) {}

    CurveFeet run()
    {
        const std::size_t pieces = curve_.pieces();
        const double step = curve_.length() / static_cast<double>(pieces);
        budget_ = 4000 + 20 * pieces;
        addEnd(0);
        for (std::size_t piece = 0; piece < pieces; ++piece) {
            const double from = static_cast<double>(piece) * step;
            search(from, piece + 1 == pieces ? curve_.length() : from + step);
        }
        addEnd(curve_.length());
        return std::move(found_);
    }

private:
    double aheadAt(double length) const { return seenFrom(curve_.at(length), point_).northing; }

    void addEnd(double length)
    {
        const PlanePoint seen = seenFrom(curve_.at(length), point_);
        if (std::fabs(seen.northing) <= placeRounding) {
            add(length, seen.easting);
        }
    }

    void add(double length, double offset)
    {
        constexpr double same = 1e-6;
        if (found_.feet.empty() || length - found_.feet.back().length > same) {
            found_.feet.push_back({length, offset});
        }
    }

    void search(double from, double to)
    {
        if (budget_ == 0) {
            found_.isUndetermined = true;
            return;
        }
        --budget_;
        const double half = (to - from) / 2;
        const double middle = from + half;
        const CurvePlace place = curve_.at(middle);
        const PlanePoint seen = seenFrom(place, point_);
        const auto [least, most] = curve_.curvaturesBetween(from, to);
        const double bend = std::max(std::fabs(least), std::fabs(most));
        const double change = 1 + bend * (distanceBetween(place.point, point_) + half);
        if (std::fabs(seen.northing) > change * half) {
            return;
        }
        // Going on by a little, what is ahead comes nearer by that, less the bend's part of what is to the side.
        const double side = bend * half * (std::fabs(seen.northing) + change * half);
        const auto [fewest, greatest] = std::minmax({least * (seen.easting - side), least * (seen.easting + side),
                                                     most * (seen.easting - side), most * (seen.easting + side)});
        // Beside the centre of a place, what is ahead hardly changes: there the coarse limit leaves far too much to search.
        if (std::fabs(seen.northing) > std::max(std::fabs(fewest - 1), std::fabs(greatest - 1)) * half) {
            return;
        }
        if (greatest < 1 || fewest > 1) {
            addBetween(from, to);
        } else if (half < placeRounding) {
            add(middle, seen.easting); // the point is at the centre of this very place
        } else {
            search(from, middle);
            search(middle, to);
        }
    }

    void addBetween(double from, double to)
    {
        double low = aheadAt(from);
        double high = aheadAt(to);
        if (low * high > 0) {
            return;
        }
        for (int round = 0; round < 100 && low != 0 && high != 0; ++round) {
            // The secant where it serves, halving where it does not.
            double at = from + (to - from) * (low / (low - high));
            if (!(at > from && at < to) || round % 3 == 2) {
                at = from + (to - from) / 2;
            }
            if (!(at > from && at < to) || to - from < 1e-12) {
                break;
            }
            const double ahead = aheadAt(at);
            if (std::fabs(ahead) < 1e-10) {
                from = at;
                low = ahead;
                break;
            }
            if ((ahead > 0) == (low > 0)) {
                from = at;
                low = ahead;
            } else {
                to = at;
                high = ahead;
            }
        }
        const double at = std::fabs(low) < std::fabs(high) ? from : to;
        add(at, seenFrom(curve_.at(at), point_).easting);
    }

    PlaneCurve curve_;
    PlanePoint point_;
    CurveFeet found_;
    std::size_t budget_ = 0;
};

} // namespace

CurveFeet feetOn(const PlaneCurve &curve, PlanePoint point)
{
    if (!std::isfinite(point.northing) || !std::isfinite(point.easting)) {
        return {};
    }
    if (curve.isLine()) {
        return feetOnLine(curve, point);
    }
    if (curve.isArc()) {
        return feetOnArc(curve, point);
    }
    // Seen from the start, so that large coordinates do not take digits away.
    return TransitionSearch(curve.placed({}, 0), seenFrom(curve.start(), point)).run();
}

} // namespace kareport
