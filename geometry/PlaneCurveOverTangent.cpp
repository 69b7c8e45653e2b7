// Transition curves that are drawn over their tangent.
#include "GaussLegendre.h"
#include "PlaneCurveTable.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

constexpr std::size_t tangentPieces = 16;

} // namespace

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

} // namespace kareport
