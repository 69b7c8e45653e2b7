#include "CurveFit.h"

namespace kareport
{

namespace
{

constexpr double halfCircle = std::numbers::pi;

// Points of a half circle whose last digits are rounded may be a little more than the diameter from each other.
constexpr double rounding = 1e-6;

/// Whether a circle of a radius has a chord.
bool reaches(double radius, double chord, double tolerance)
{
    return radius > 0 && chord <= 2 * radius * (1 + rounding) + tolerance;
}

FittedCurve arcOfTurn(PlanePoint centre, PlanePoint start, double turn, bool isRight)
{
    const double radius = distanceBetween(centre, start);
    const double side = isRight ? 1 : -1;
    if (!(radius > 0)) {
        return CurveFault::NotFinite;
    }
    return PlaneCurve::make(TransitionForm::Clothoid, start, bearingBetween(centre, start) + side * halfCircle / 2,
                            radius * turn, side / radius, side / radius);
}

} // namespace

FittedCurve lineBetween(PlanePoint start, PlanePoint end)
{
    return PlaneCurve::make(TransitionForm::Clothoid, start, bearingBetween(start, end), distanceBetween(start, end), 0,
                            0);
}

FittedCurve arcAbout(PlanePoint centre, PlanePoint start, PlanePoint end, bool isRight)
{
    const double from = bearingBetween(centre, start);
    const double to = bearingBetween(centre, end);
    const double turn = normalizedBearing(isRight ? to - from : from - to);
    return arcOfTurn(centre, start, turn == 0 ? 2 * halfCircle : turn, isRight);
}

FittedCurve arcAbout(PlanePoint centre, PlanePoint start, double length, bool isRight)
{
    return arcOfTurn(centre, start, length / distanceBetween(centre, start), isRight);
}

FittedCurve arcOver(PlanePoint start, PlanePoint end, double radius, bool isRight, bool isLong, double tolerance)
{
    const double chord = distanceBetween(start, end);
    if (!std::isfinite(radius) || !reaches(radius, chord, tolerance)) {
        return CurveFault::NotFinite;
    }
    const double shortTurn = 2 * std::asin(std::min(1.0, chord / 2 / radius));
    return chord > 0 ? arcTowards(start, end, radius, isRight, isLong ? 2 * halfCircle - shortTurn : shortTurn)
                     : CurveFault::NoLength;
}

FittedCurve arcTowards(PlanePoint start, PlanePoint end, double radius, bool isRight, double turn)
{
    const double side = isRight ? 1 : -1;
    return PlaneCurve::make(TransitionForm::Clothoid, start, bearingBetween(start, end) - side * turn / 2,
                            radius * turn, side / radius, side / radius);
}

std::optional<PlanePoint> centreOfArc(PlanePoint start, PlanePoint end, double radius, bool isRight, bool isLong,
                                      double tolerance)
{
    const double chord = distanceBetween(start, end);
    if (!(chord > 0) || !reaches(radius, chord, tolerance)) {
        return std::nullopt;
    }
    const double height = std::sqrt(std::max(0.0, (radius - chord / 2) * (radius + chord / 2)));
    const PlanePoint middle = (start + end) * 0.5;
    return pointBeside(middle, bearingBetween(start, end), isRight != isLong ? height : -height);
}

FittedCurve curveTowards(TransitionForm form, PlanePoint start, PlanePoint end, double length, double startCurvature,
                         double endCurvature)
{
    FittedCurve fitted = PlaneCurve::make(form, start, 0, length, startCurvature, endCurvature);
    if (auto *curve = std::get_if<PlaneCurve>(&fitted)) {
        // Measured from an origin of its own, which keeps the digits that large coordinates have no room for.
        const PlanePoint chord = curve->placed({}, 0).end().point;
        *curve = curve->placed(start, bearingBetween(start, end) - bearingBetween({}, chord));
    }
    return fitted;
}

std::optional<PlanePoint> tangentIntersection(const PlaneCurve &curve)
{
    const CurvePlace start = curve.start();
    const PlaneCurve local = curve.placed({}, 0);
    const CurvePlace end = local.end();
    const double sine = std::sin(local.turnTo(local.length()));
    constexpr double parallel = 1e-12;
    if (std::fabs(sine) < parallel) {
        return std::nullopt;
    }
    const double along = end.point.northing - end.point.easting * std::cos(end.bearing) / sine;
    return start.point + turned({along, 0}, start.bearing);
}

std::optional<PlanePoint> centreOf(const PlaneCurve &curve)
{
    if (!curve.isArc()) {
        return std::nullopt;
    }
    const CurvePlace start = curve.start();
    return pointBeside(start.point, start.bearing, 1 / start.curvature);
}

} // namespace kareport
