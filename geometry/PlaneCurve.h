#pragma once

#include "PlanePoint.h"
#include "TransitionForm.h"

#include <cstddef>
#include <memory>
#include <utility>
#include <variant>
#include <vector>

namespace kareport
{

/// Where one is on a curve, and how it continues there.
struct CurvePlace
{
    PlanePoint point;
    double bearing = 0;   ///< of the tangent; radians clockwise from north, 0 to below a full circle
    double curvature = 0; ///< one over the radius, positive to the right; 0 on a line
};

/// A point seen from a place: how far ahead it is, and how far to the right.
inline PlanePoint seenFrom(const CurvePlace &place, PlanePoint point)
{
    return turned(point - place.point, -place.bearing);
}

/// Why there is no curve for some measures.
enum class CurveFault
{
    NotFinite,    ///< a measure is not a number, or infinite
    NoLength,     ///< the length is zero or below
    TooManyTurns, ///< a curve that winds round thousands of times
    TooSteep,     ///< a form over its tangent that leaves it by more than 45 degrees
    NoStraightEnd ///< a form over its tangent that is curved at both ends
};

/// A line, an arc or a transition curve of a plane map: a value, cheap to copy.
class PlaneCurve
{
public:
    /// A curve of a start, a bearing there, a length, and the curvatures (positive to the right) at its start and its end.
    /// Equal curvatures make a line or an arc, whatever the form.
    static std::variant<PlaneCurve, CurveFault> make(TransitionForm form, PlanePoint start, double bearing,
                                                     double length, double startCurvature, double endCurvature);

    double length() const { return length_; }
    double startCurvature() const { return startCurvature_; }
    double endCurvature() const { return endCurvature_; }
    bool isLine() const { return startCurvature_ == 0 && endCurvature_ == 0; }
    bool isArc() const { return startCurvature_ == endCurvature_ && startCurvature_ != 0; }
    TransitionForm form() const { return form_; }

    /// The place at a length from the start; a length before the start or after the end is taken for that end.
    CurvePlace at(double length) const;
    CurvePlace start() const { return at(0); }
    CurvePlace end() const { return at(length_); }
    /// How far the bearing turns from the start to a length, full circles included, positive to the right.
    double turnTo(double length) const { return localAt(length).turn; }
    /// The curvature at a length, positive to the right.
    double curvatureAt(double length) const;
    /// Two curvatures that all those between two lengths lie between.
    std::pair<double, double> curvaturesBetween(double from, double to) const;
    /// The same curve in another place.
    PlaneCurve placed(PlanePoint start, double bearing) const;
    /// The area between the curve and its chord, positive where the curve is to the left of the chord. The sum of these
    /// and of the area inside the chords is the area inside a closed figure that is walked round clockwise.
    double areaBesideChord() const;
    /// Lengths that no part of the curve turns by more than about a radian between: at least 1. The memory and the time
    /// that the curve takes are in proportion to it.
    std::size_t pieces() const { return pieces_; }

private:
    /// A place with the start as origin and the bearing there as north.
    struct LocalPlace
    {
        PlanePoint point;
        double turn;
        double curvature;
    };
    struct Table;

    PlaneCurve() = default;
    LocalPlace localAt(double length) const;
    LocalPlace arcAt(double length) const;
    LocalPlace transitionAt(double length) const;
    LocalPlace overTangentAt(double length) const;
    LocalPlace rising(double length) const;
    double turnAlong(double length) const;
    double partOf(double length) const;
    double lengthTo(double part) const;
    void fillTable();
    bool fillOverTangent();
    void fillLengths();
    template <typename Function>
    double integratedParts(const Function &function) const;

    TransitionForm form_ = TransitionForm::Clothoid;
    PlanePoint start_;
    double bearing_ = 0;
    double cosine_ = 1;
    double sine_ = 0;
    double length_ = 0;
    double startCurvature_ = 0;
    double endCurvature_ = 0;
    std::size_t pieces_ = 1;
    double abscissa_ = 0; ///< of the end, of a form over its tangent
    double slope_ = 0; ///< the abscissa by the radius at the curved end, as the curve lies seen from its straight end
    std::shared_ptr<const Table> table_; ///< of a transition
};

} // namespace kareport
