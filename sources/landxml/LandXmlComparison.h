#pragma once

#include "LandXmlNotes.h"
#include "LandXmlUnits.h"
#include "PlaneCurve.h"

#include <cstddef>
#include <numbers>
#include <vector>

namespace kareport
{

/// How far what a file states may differ from what its own geometry gives, before it is noted.
struct LandXmlTolerance
{
    double length = 0.002;                         ///< metres
    double angle = 0.001 * std::numbers::pi / 200; ///< radians; ten hundred-thousandths of a right angle
};

/// Compares what a file states with its own geometry, and notes what differs, in the units of the file.
class LandXmlComparison
{
public:
    /// @param notes  must outlive this object
    LandXmlComparison(const LandXmlUnits &units, const LandXmlTolerance &tolerance, LandXmlNotes &notes)
        : units_(units), tolerance_(tolerance), notes_(notes)
    {}

    const LandXmlTolerance &tolerance() const { return tolerance_; }

    // A value that is not a number is not stated, and nothing is compared. `byte` is where a note belongs, `what` the name
    // of the value in the file.
    void length(std::size_t byte, const char *what, double stated, double computed);
    /// Areas are stated with few digits: they may differ by one part in a thousand, or a tenth of a square metre; by more or
    /// less in proportion to another tolerance of lengths than the default one.
    void area(std::size_t byte, const char *what, double stated, double computed);
    /// Keeps a direction for `noteDirections`. The shorter an element is, and the smaller its radius, the more its direction
    /// depends on the digits of its points.
    void direction(std::size_t byte, const char *what, double stated, double bearing, const PlaneCurve &curve);
    /// Compares the end of an element.
    void end(std::size_t byte, PlanePoint stated, PlanePoint computed);
    /// Notes an element that does not begin where the one before ends.
    void gap(std::size_t byte, PlanePoint before, PlanePoint start);
    /// Notes an element that does not continue in the direction of the one before, where it would if one of both bent to the
    /// other side, or where one of both is a transition. Other lines and arcs may meet at any angle.
    void corner(std::size_t byte, const PlaneCurve &before, const PlaneCurve &curve);
    /// Notes a curve that the file leaves open to be the shorter or the longer arc of its circle.
    void shortWay(std::size_t byte);
    /// The point where the tangents meet has to lie on both.
    void intersection(std::size_t byte, PlanePoint stated, const PlaneCurve &curve);

    /// Compares all directions that were kept. A file measures them clockwise from north, or the other way round, from north
    /// or from east: the format's words and its programs differ. The way that most directions of the file fit is taken for
    /// all.
    void noteDirections();

private:
    struct Direction
    {
        std::size_t byte;
        const char *what;
        double stated;
        double bearing;
        double allowed; ///< how far they may differ
    };

    void note(std::size_t byte, const char *what, const QString &stated, const QString &computed);
    QString lengthText(double metres) const;
    QString pointText(PlanePoint point) const;
    QString bearingText(double bearing) const;
    double allowedTurn(const PlaneCurve &curve) const;

    LandXmlUnits units_;
    LandXmlTolerance tolerance_;
    LandXmlNotes &notes_;
    std::vector<Direction> directions_;
};

} // namespace kareport
