#pragma once

#include "Alignment.h"
#include "LandXmlModel.h"
#include "LandXmlNotes.h"
#include "LandXmlPointTable.h"
#include "LandXmlUnits.h"
#include "Stationing.h"
#include "VerticalProfile.h"

#include <QString>

#include <numbers>
#include <optional>
#include <variant>
#include <vector>

namespace kareport
{

/// How far what a file states may be from what its own geometry gives, before it is said.
struct LandXmlTolerance
{
    double length = 0.002;                         ///< metres
    double angle = 0.001 * std::numbers::pi / 200; ///< radians; ten hundred-thousandths of a right angle
};

/// Why an element has no geometry, and where it stands.
struct LandXmlFault
{
    QString text;
    std::size_t byte;
};

/// The curves of an element, one after the other. An irregular line has several.
using LandXmlCurves = std::variant<std::vector<PlaneCurve>, LandXmlFault>;

/// A grade line with its heights.
struct LandXmlProfile
{
    VerticalProfile heights;
    std::vector<std::size_t> vertices; ///< of the stored points: which vertex each is
};

/// Makes geometry of what a file stores, and compares what the file states with it.
class LandXmlGeometry
{
public:
    /// @param points  of the file; null when no coordinates refer to one
    /// @param notes   is told of the differences; null tells nobody
    LandXmlGeometry(const LandXmlUnits &units, const LandXmlTolerance &tolerance, const LandXmlPointTable *points,
                    LandXmlNotes *notes)
        : units_(units), tolerance_(tolerance), points_(points), notes_(notes)
    {}

    LandXmlCurves curvesOf(const LandXmlElement &element) const;
    /// The coordinates, or those of the point that they refer to.
    std::variant<PlanePoint, LandXmlFault> positionOf(const LandXmlCoordinates &at) const;
    /// The grade line, or why there is none.
    std::variant<LandXmlProfile, LandXmlFault> profileOf(const LandXmlGradeLine &line) const;

    /// Tells of a length that differs. @param what  its name in the file
    void compareLength(std::size_t byte, const char *what, double stated, double computed) const;

private:
    struct Ends
    {
        PlanePoint start;
        PlanePoint end;
    };

    LandXmlCurves lineOf(const LandXmlElement &element, const Ends &ends) const;
    LandXmlCurves irregularLineOf(const LandXmlElement &element, const Ends &ends) const;
    LandXmlCurves curveOf(const LandXmlElement &element, const Ends &ends) const;
    LandXmlCurves spiralOf(const LandXmlElement &element, const Ends &ends) const;
    std::variant<PlanePoint, LandXmlFault> centreOfCurve(const LandXmlElement &element, const Ends &ends,
                                                         bool isRight) const;
    void compareWithStated(const LandXmlElement &element, const Ends &ends, const PlaneCurve &curve) const;
    void compareDirection(std::size_t byte, const char *what, double stated, double bearing) const;
    void compareIntersection(const LandXmlElement &element, const PlaneCurve &curve) const;
    void say(std::size_t byte, const char *what, double stated, double computed, double unit, int decimals) const;

    LandXmlUnits units_;
    LandXmlTolerance tolerance_;
    const LandXmlPointTable *points_;
    LandXmlNotes *notes_;
};

} // namespace kareport
