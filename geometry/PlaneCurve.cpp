#include "PlaneCurve.h"

#include "GaussLegendre.h"
#include "PlaneCurveTable.h"
#include "SmallAngles.h"

#include <algorithm>

namespace kareport
{

namespace
{

constexpr double mostPieces = 65536;

PlanePoint direction(double bearing)
{
    return {std::cos(bearing), std::sin(bearing)};
}

} // namespace

std::variant<PlaneCurve, CurveFault> PlaneCurve::make(TransitionForm form, PlanePoint start, double bearing,
                                                      double length, double startCurvature, double endCurvature)
{
    for (const double measure : {start.northing, start.easting, bearing, length, startCurvature, endCurvature}) {
        if (!std::isfinite(measure)) {
            return CurveFault::NotFinite;
        }
    }
    if (length <= 0) {
        return CurveFault::NoLength;
    }
    PlaneCurve curve;
    curve.form_ = form;
    curve.length_ = length;
    curve.startCurvature_ = startCurvature;
    curve.endCurvature_ = endCurvature;
    const double turns = length * std::max(std::fabs(startCurvature), std::fabs(endCurvature));
    if (!(turns < mostPieces)) {
        return CurveFault::TooManyTurns;
    }
    curve.pieces_ = static_cast<std::size_t>(turns) + 1;
    if (startCurvature != endCurvature) {
        if (isOverTangent(form)) {
            if (startCurvature != 0 && endCurvature != 0) {
                return CurveFault::NoStraightEnd;
            }
            if (!curve.fillOverTangent()) {
                return CurveFault::TooSteep;
            }
        } else {
            if (form != TransitionForm::Clothoid) {
                // The growth itself bends; that of two parabolas has a border in its middle.
                curve.pieces_ = std::max<std::size_t>(8, curve.pieces_ + curve.pieces_ % 2);
            }
            curve.fillTable();
        }
    }
    return curve.placed(start, bearing);
}

PlaneCurve PlaneCurve::placed(PlanePoint start, double bearing) const
{
    PlaneCurve curve = *this;
    curve.start_ = start;
    curve.bearing_ = bearing;
    curve.cosine_ = std::cos(bearing);
    curve.sine_ = std::sin(bearing);
    return curve;
}

CurvePlace PlaneCurve::at(double length) const
{
    const LocalPlace local = localAt(length);
    return {{start_.northing + local.point.northing * cosine_ - local.point.easting * sine_,
             start_.easting + local.point.northing * sine_ + local.point.easting * cosine_},
            normalizedBearing(bearing_ + local.turn),
            local.curvature};
}

PlaneCurve::LocalPlace PlaneCurve::localAt(double length) const
{
    length = std::clamp(length, 0.0, length_);
    if (startCurvature_ == endCurvature_) {
        return arcAt(length);
    }
    return isOverTangent(form_) ? overTangentAt(length) : transitionAt(length);
}

PlaneCurve::LocalPlace PlaneCurve::arcAt(double length) const
{
    // By its chord, which keeps all digits of an arc that is nearly straight.
    const double half = length * startCurvature_ / 2;
    return {direction(half) * (length * sineRatio(half)), 2 * half, startCurvature_};
}

double PlaneCurve::turnAlong(double length) const
{
    return startCurvature_ * length +
           (endCurvature_ - startCurvature_) * length_ * transitionTurn(form_, length / length_);
}

double PlaneCurve::curvatureAt(double length) const
{
    if (startCurvature_ != endCurvature_ && isOverTangent(form_)) {
        return localAt(length).curvature;
    }
    if (length >= length_) {
        return endCurvature_; // to the last digit: it may be that of a line
    }
    const double part = std::max(length / length_, 0.0);
    return startCurvature_ + (endCurvature_ - startCurvature_) * transitionGrowth(form_, part);
}

std::pair<double, double> PlaneCurve::curvaturesBetween(double from, double to) const
{
    if (startCurvature_ == endCurvature_ || !isOverTangent(form_)) {
        return std::minmax({curvatureAt(from), curvatureAt(to)});
    }
    // It is the growth, which rises, times a power of the cosine of the slope, which falls, from the straight end on.
    const bool isReversed = startCurvature_ != 0;
    const double low = partOf(isReversed ? length_ - to : from);
    const double high = partOf(isReversed ? length_ - from : to);
    const double curved = isReversed ? startCurvature_ : endCurvature_;
    const auto bound = [&](double grown, double sloped) {
        const double stretch = std::hypot(1.0, slope_ * transitionTurn(form_, sloped));
        return curved * transitionGrowth(form_, grown) / (stretch * stretch * stretch);
    };
    return std::minmax({bound(low, high), bound(high, low)});
}

PlaneCurve::LocalPlace PlaneCurve::transitionAt(double length) const
{
    const double step = length_ / static_cast<double>(pieces_);
    const std::size_t piece = std::min(static_cast<std::size_t>(length / step), pieces_ - 1);
    const double from = static_cast<double>(piece) * step;
    const PlanePoint rest = integrated(from, length, [this](double along) { return direction(turnAlong(along)); });
    return {table_->points[piece] + rest, turnAlong(length), curvatureAt(length)};
}

void PlaneCurve::fillTable()
{
    auto table = std::make_shared<Table>();
    table->points.reserve(pieces_);
    PlanePoint point;
    const double step = length_ / static_cast<double>(pieces_);
    for (std::size_t piece = 0; piece < pieces_; ++piece) {
        table->points.push_back(point);
        const double from = static_cast<double>(piece) * step;
        point = point + integrated(from, from + step, [this](double along) { return direction(turnAlong(along)); });
    }
    table_ = std::move(table);
}

double PlaneCurve::areaBesideChord() const
{
    if (isLine()) {
        return 0;
    }
    if (isArc()) {
        const double turn = length_ * startCurvature_;
        return withoutSine(turn) / (2 * startCurvature_ * startCurvature_);
    }
    double area = 0;
    const double step = length_ / static_cast<double>(pieces_);
    for (std::size_t piece = 0; piece < pieces_; ++piece) {
        const double from = static_cast<double>(piece) * step;
        area += integrated(from, piece + 1 == pieces_ ? length_ : from + step, [this](double along) {
            const LocalPlace place = localAt(along);
            return (place.point.northing * std::sin(place.turn) - place.point.easting * std::cos(place.turn)) / 2;
        });
    }
    return area;
}

} // namespace kareport
