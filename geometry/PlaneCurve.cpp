#include "PlaneCurve.h"

#include "GaussLegendre.h"
#include "SmallAngles.h"

#include <algorithm>

namespace kareport
{

/// What was integrated from the start of a transition to the borders of its pieces.
struct PlaneCurve::Table
{
    std::vector<PlanePoint> points; ///< of a form along the curve
    std::vector<double> lengths;    ///< of a form over its tangent
};

namespace
{

constexpr double mostPieces = 65536;
constexpr std::size_t tangentPieces = 16;

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

/// Integrates a function of the part of the abscissa over all pieces.
template <typename Function>
double PlaneCurve::integratedParts(const Function &function) const
{
    double sum = 0;
    for (std::size_t piece = 0; piece < pieces_; ++piece) {
        sum += integrated(static_cast<double>(piece) / static_cast<double>(pieces_),
                          static_cast<double>(piece + 1) / static_cast<double>(pieces_), function);
    }
    return sum;
}

/// Finds the abscissa of the end, whose arc has the given length.
bool PlaneCurve::fillOverTangent()
{
    const bool isReversed = startCurvature_ != 0;
    // Walked from the straight end, a curve that ends straight bends to the other side.
    const double curvature = isReversed ? -startCurvature_ : endCurvature_;
    const double steepest = 1 / transitionTurn(form_, 1);
    pieces_ = tangentPieces;
    // The arc grows ever faster with the abscissa, and is not shorter: Newton's steps from above end at the abscissa.
    abscissa_ = length_;
    for (int round = 0; round < 100; ++round) {
        slope_ = abscissa_ * curvature;
        fillLengths();
        const double growth = integratedParts([this](double t) {
            const double turn = slope_ * transitionTurn(form_, t);
            const double stretch = std::hypot(1.0, turn);
            return stretch + turn * turn / stretch;
        });
        const double change = (table_->lengths.back() - length_) / growth;
        abscissa_ -= change;
        if (!(change > abscissa_ * 1e-15)) {
            break;
        }
    }
    slope_ = abscissa_ * curvature;
    fillLengths();
    return std::fabs(slope_) <= steepest;
}

void PlaneCurve::fillLengths()
{
    auto table = std::make_shared<Table>();
    table->lengths.assign(1, 0.0);
    table_ = table;
    for (std::size_t piece = 1; piece <= pieces_; ++piece) {
        table->lengths.push_back(lengthTo(static_cast<double>(piece) / static_cast<double>(pieces_)));
    }
}

/// The length of the arc from the straight end to a part of the abscissa.
double PlaneCurve::lengthTo(double part) const
{
    const double step = 1 / static_cast<double>(pieces_);
    const std::size_t piece = std::min(static_cast<std::size_t>(part / step), table_->lengths.size() - 1);
    return table_->lengths[piece] + abscissa_ * integrated(static_cast<double>(piece) * step, part, [this](double t) {
                                        return std::hypot(1.0, slope_ * transitionTurn(form_, t));
                                    });
}

/// The part of the abscissa at which the arc from the straight end has a length.
double PlaneCurve::partOf(double length) const
{
    double part = length / length_;
    for (int round = 0; round < 20; ++round) {
        const double slope = slope_ * transitionTurn(form_, part);
        const double change = (lengthTo(part) - length) / (abscissa_ * std::hypot(1.0, slope));
        part = std::clamp(part - change, 0.0, 1.0);
        if (std::fabs(change) < 1e-14) {
            break;
        }
    }
    return part;
}

/// The place on a form over its tangent, walked from the straight end.
PlaneCurve::LocalPlace PlaneCurve::rising(double length) const
{
    const double part = partOf(length);
    const double slope = slope_ * transitionTurn(form_, part);
    const double stretch = std::hypot(1.0, slope);
    return {{abscissa_ * part, abscissa_ * slope_ * transitionOrdinate(form_, part)},
            std::atan(slope),
            slope_ / abscissa_ * transitionGrowth(form_, part) / (stretch * stretch * stretch)};
}

PlaneCurve::LocalPlace PlaneCurve::overTangentAt(double length) const
{
    if (startCurvature_ == 0) {
        return rising(length);
    }
    const LocalPlace end = rising(length_);
    const LocalPlace place = rising(length_ - length);
    const PlanePoint back = turned(place.point - end.point, -end.turn);
    return {{-back.northing, -back.easting}, place.turn - end.turn, -place.curvature};
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
