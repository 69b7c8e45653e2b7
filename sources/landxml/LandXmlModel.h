#pragma once

#include "PlanePoint.h"

#include <cstddef>
#include <limits>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace kareport
{

/// A number that a file does not state.
inline constexpr double notGiven = std::numeric_limits<double>::quiet_NaN();

// What a LandXML file holds, as it is stored. Lengths are in metres, areas in square metres, angles and directions in
// radians. Texts are in UTF-8. `byte` is the place of the element in the file.

/// Coordinates, or the name of the point that has them.
struct LandXmlCoordinates
{
    std::optional<PlanePoint> position;
    double height = notGiven;
    std::string reference; ///< name of a point
    std::string name;
    std::size_t byte = 0;
    bool isUnreadable = false; ///< the point that is referred to has coordinates that cannot be read

    bool isGiven() const { return position.has_value() || !reference.empty(); }
};

/// A point of a list of points or of a surface.
struct LandXmlPoint
{
    std::string name;
    std::string id; ///< by which others may refer to it as well
    std::string code;
    std::string description;
    std::size_t owner = 0; ///< of its group or its surface, the index among the names that the reader has met
    LandXmlCoordinates at;
};

/// A line, a curve or a transition of an alignment or of a parcel's border.
struct LandXmlElement
{
    enum class Kind
    {
        Line,
        IrregularLine,
        Curve,
        Spiral,
        Other ///< of another kind: it has no geometry here, but its place in the alignment counts
    };

    Kind kind = Kind::Line;
    std::string name;
    std::string form;     ///< of a spiral; of another kind, the name of the element
    std::string rotation; ///< "cw", "ccw" or nothing
    double length = notGiven;
    double radius = notGiven;
    double radiusStart = notGiven; ///< of a spiral; may be infinite
    double radiusEnd = notGiven;
    double staStart = notGiven;
    double direction = notGiven; ///< at the start, as it is written
    double directionEnd = notGiven;
    double delta = notGiven;
    LandXmlCoordinates start, end, centre, intersection;
    std::vector<PlanePoint> between; ///< of an irregular line, points between start and end
    std::size_t byte = 0;
};

struct LandXmlEquation
{
    double internal = notGiven;
    double back = notGiven;
    double ahead = notGiven;
    bool isDecreasing = false;
    std::size_t byte = 0;
};

/// A point of a grade line with the measures of its curve.
struct LandXmlGradePoint
{
    enum class Kind
    {
        Point,
        Parabola,
        UnsymmetricParabola,
        Circle
    };

    Kind kind = Kind::Point;
    double station = notGiven;
    double height = notGiven;
    double length = notGiven;
    double lengthIn = notGiven;
    double lengthOut = notGiven;
    double radius = notGiven;
    std::size_t byte = 0;
};

struct LandXmlGradeLine
{
    std::string name;
    std::vector<LandXmlGradePoint> points;
    std::size_t byte = 0;
};

/// Heights along an alignment: stations, each with its height. There may be several pieces with gaps between them.
struct LandXmlHeightLine
{
    std::string name;
    std::vector<std::pair<double, double>> points;
    std::vector<std::size_t> pieces; ///< indexes of the points that begin a piece
    std::size_t byte = 0;
};

struct LandXmlSectionPoint
{
    double offset;
    double height;
    std::string code;
};

/// A surface in a cross section.
struct LandXmlSectionSurface
{
    std::string name;
    std::string side;
    std::string material;
    bool isDesign = false;
    double width = notGiven;
    double thickness = notGiven;
    std::vector<LandXmlSectionPoint> points;
    std::size_t byte = 0;
};

struct LandXmlSection
{
    std::string name;
    double station = notGiven;
    double cutArea = notGiven;
    double fillArea = notGiven;
    bool isSkew = false; ///< does not lie at a right angle to the alignment
    std::vector<LandXmlSectionSurface> surfaces;
    std::size_t byte = 0;
};

struct LandXmlAlignment
{
    std::string name;
    std::string description;
    double staStart = 0;
    bool isStartStated = false; ///< `staStart` is in the file
    double length = notGiven;
    std::vector<LandXmlEquation> equations;
    std::vector<LandXmlElement> elements;
    std::vector<LandXmlGradeLine> gradeLines;
    std::vector<LandXmlHeightLine> surfaceLines;
    std::vector<LandXmlSection> sections;
    std::size_t byte = 0;
};

/// A width along an alignment that changes evenly between two stations, counted without equations.
struct LandXmlWidth
{
    double staStart = notGiven;
    double staEnd = notGiven;
    double atStart = notGiven;
    double atEnd = notGiven;
    std::size_t byte = 0;
    bool isUnreadable = false; ///< a number of it cannot be read, which was noted
};

/// A stretch beside an alignment, such as a lane.
struct LandXmlZone
{
    bool isRight = false;
    LandXmlWidth whole;               ///< of the zone as a whole; it counts where there are no others
    std::vector<LandXmlWidth> widths; ///< its pieces
};

/// Zones beside an alignment, from the middle outwards.
struct LandXmlGradeSurface
{
    std::string alignment; ///< its name
    std::vector<LandXmlZone> zones;
    std::size_t byte = 0;
};

struct LandXmlParcel
{
    std::string name;
    std::string description;
    std::string owner; ///< the parcel that it is a part of
    double area = notGiven;
    std::vector<LandXmlElement> elements;
    LandXmlCoordinates centre;
    std::size_t byte = 0;
};

} // namespace kareport
