#pragma once

#include "LandXmlReader.h"

namespace kareport
{

/// What an element is, by its name and what it is in. Those of an alignment stand together, and in it those of a profile
/// and of cross sections.
enum class LandXmlReader::Tag : unsigned char
{
    None, ///< nothing that is read
    Root,
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
    Parcels,
    Parcel
};

} // namespace kareport
