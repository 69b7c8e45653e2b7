#pragma once

#include "PlaneCurve.h"

#include <vector>

namespace kareport
{

/// What was integrated from the start of a transition to the borders of its pieces.
struct PlaneCurve::Table
{
    std::vector<PlanePoint> points; ///< of a form along the curve
    std::vector<double> lengths;    ///< of a form over its tangent
};

} // namespace kareport
