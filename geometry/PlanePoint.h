#pragma once

#include <cmath>
#include <numbers>

namespace kareport
{

/// A point of a plane map. All lengths of this folder are in one unit, whichever the caller has.
struct PlanePoint
{
    double northing = 0;
    double easting = 0;
};

inline PlanePoint operator+(PlanePoint left, PlanePoint right)
{
    return {left.northing + right.northing, left.easting + right.easting};
}

inline PlanePoint operator*(PlanePoint vector, double factor)
{
    return {vector.northing * factor, vector.easting * factor};
}

inline PlanePoint operator-(PlanePoint left, PlanePoint right)
{
    return {left.northing - right.northing, left.easting - right.easting};
}

/// How far two points are from each other.
inline double distanceBetween(PlanePoint from, PlanePoint to)
{
    return std::hypot(to.northing - from.northing, to.easting - from.easting);
}

/// A bearing (radians, clockwise from north) from 0 to below a full circle.
inline double normalizedBearing(double bearing)
{
    constexpr double circle = 2 * std::numbers::pi;
    const double rest = std::fmod(bearing, circle);
    const double positive = rest < 0 ? rest + circle : rest;
    return positive < circle ? positive : 0; // a rest just below zero rounds to the full circle
}

/// The difference of two directions, from above minus half a circle to half a circle.
inline double turnBetween(double from, double to)
{
    const double turn = normalizedBearing(to - from);
    return turn > std::numbers::pi ? turn - 2 * std::numbers::pi : turn;
}

/// The bearing of the line from one point to another. Of a point to itself it is 0.
inline double bearingBetween(PlanePoint from, PlanePoint to)
{
    return normalizedBearing(std::atan2(to.easting - from.easting, to.northing - from.northing));
}

/// A vector turned clockwise by an angle.
inline PlanePoint turned(PlanePoint vector, double angle)
{
    const double cosine = std::cos(angle);
    const double sine = std::sin(angle);
    return {vector.northing * cosine - vector.easting * sine, vector.northing * sine + vector.easting * cosine};
}

/// The point beside another one: `offset` at a right angle to a bearing, positive to the right.
inline PlanePoint pointBeside(PlanePoint point, double bearing, double offset)
{
    return {point.northing - offset * std::sin(bearing), point.easting + offset * std::cos(bearing)};
}

} // namespace kareport
