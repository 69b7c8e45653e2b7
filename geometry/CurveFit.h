#pragma once

#include "PlaneCurve.h"

#include <optional>
#include <variant>

namespace kareport
{

using FittedCurve = std::variant<PlaneCurve, CurveFault>;

/// The line between two points.
FittedCurve lineBetween(PlanePoint start, PlanePoint end);

/// The arc about a centre that begins at `start` and continues, to the right or to the left, to the direction of `end`.
/// A start that is the end as well makes a full circle.
FittedCurve arcAbout(PlanePoint centre, PlanePoint start, PlanePoint end, bool isRight);
/// The arc about a centre of a length.
FittedCurve arcAbout(PlanePoint centre, PlanePoint start, double length, bool isRight);
/// The arc of a radius between two points. It does not need the centre, whose digits are too few for the angle where it is
/// far away. A fault where the points are the same, or too far from each other for the radius.
/// @param isLong     the arc is longer than half a circle
/// @param tolerance  the points of half a circle may be farther from each other than its diameter by that
FittedCurve arcOver(PlanePoint start, PlanePoint end, double radius, bool isRight, bool isLong, double tolerance = 0);
/// The arc of a radius that turns by an angle and leads towards a point. Where the points are a diameter from each other, their
/// last digits decide how far an arc between them turns.
FittedCurve arcTowards(PlanePoint start, PlanePoint end, double radius, bool isRight, double turn);
/// The centre of an arc of a radius between two points, which lies to the right or to the left of the way from start to
/// end. Nothing when the points are the same, or too far from each other for the radius.
/// @param isLong  the arc is longer than half a circle: its centre is then on the other side of the chord
std::optional<PlanePoint> centreOfArc(PlanePoint start, PlanePoint end, double radius, bool isRight, bool isLong,
                                      double tolerance = 0);

/// A curve of a length and of curvatures at its ends, laid so that it begins at `start` and its chord leads towards `end`.
/// It ends at `end` when the measures fit the points; how far it does not is seen by its end.
FittedCurve curveTowards(TransitionForm form, PlanePoint start, PlanePoint end, double length, double startCurvature,
                         double endCurvature);

/// Where the tangents of both ends meet; nothing when they are parallel.
std::optional<PlanePoint> tangentIntersection(const PlaneCurve &curve);
/// The centre of an arc; nothing for other curves.
std::optional<PlanePoint> centreOf(const PlaneCurve &curve);

} // namespace kareport
