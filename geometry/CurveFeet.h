#pragma once

#include "PlaneCurve.h"

#include <vector>

namespace kareport
{

/// How far a place may be off by the rounding of coordinates of seven digits before the point.
inline constexpr double placeRounding = 1e-7;

/// A place on a curve from which a point lies at a right angle.
struct CurveFoot
{
    double length; ///< from the curve's start
    double offset; ///< of the point from there, positive to the right
};

/// All such places of a curve, in its direction.
struct CurveFeet
{
    std::vector<CurveFoot> feet;
    bool isUndetermined = false; ///< the point is at a centre of the curve: a whole stretch lies around it
};

/// Finds where a point lies at a right angle to a curve. A place that is off an end by the rounding of the coordinates
/// counts as that end.
CurveFeet feetOn(const PlaneCurve &curve, PlanePoint point);

} // namespace kareport
