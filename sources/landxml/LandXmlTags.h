#pragma once

#include "LandXmlReader.h"

namespace kareport
{

/// Bytes that elements take in a file at the least, and points in a list of numbers.
inline constexpr std::size_t leastElement = 40;
inline constexpr std::size_t leastPoint = 12;
inline constexpr std::size_t leastNamedPoint = 30; ///< an element with a name and two numbers
inline constexpr std::size_t leastPair = 8;        ///< a point of a profile or a section
inline constexpr std::size_t leastGradePoint = 20;
inline constexpr std::size_t leastSectionPoint = 30;

/// What an element is, by its name and what it is in. Those of an alignment follow each other, and among them those of a
/// profile and those of cross sections: the reader compares their order.
enum class LandXmlReader::Tag : unsigned char
{
    None, ///< nothing that is read
    Root,
    Survey,
    Points,
    Point,
    Surfaces,
    Surface,
    Definition,
    SurfacePoints,
    SurfacePoint,
    Alignments,
    Alignment,
    Equation,
    Geometry,
    Line,
    IrregularLine,
    Curve,
    Spiral,
    Start,
    End,
    Centre,
    Intersection,
    PointList2,
    PointList3,
    Profile,
    GradeLine,
    GradePoint,
    Parabola,
    UnsymmetricParabola,
    Circle,
    SurfaceLine,
    Sections,
    Section,
    SectionSurface,
    DesignSectionSurface,
    SectionPoint,
    GradeModel,
    GradeSurface,
    Zones,
    Zone,
    ZoneWidth,
    Parcels,
    Parcel
};

} // namespace kareport
