#include "LandXmlTags.h"

namespace kareport
{

/// What an element is by its name and the element that it is in.
LandXmlReader::Tag LandXmlReader::tagOf(Tag parent, std::string_view name)
{
    struct Row
    {
        Tag parent;
        std::string_view name;
        Tag tag;
    };
    static constexpr Row rows[] = {
        {Tag::SurfacePoints, "P", Tag::SurfacePoint}, // first those of which a file has most
        {Tag::Points, "CgPoint", Tag::Point},
        {Tag::Root, "CgPoints", Tag::Points},
        {Tag::Root, "Survey", Tag::Survey},
        {Tag::Root, "Surfaces", Tag::Surfaces},
        {Tag::Root, "Alignments", Tag::Alignments},
        {Tag::Root, "Parcels", Tag::Parcels},
        {Tag::Root, "GradeModel", Tag::GradeModel},
        {Tag::GradeModel, "GradeSurface", Tag::GradeSurface},
        {Tag::GradeSurface, "Zones", Tag::Zones},
        {Tag::Zones, "Zone", Tag::Zone},
        {Tag::Zone, "ZoneWidth", Tag::ZoneWidth},
        {Tag::Points, "CgPoints", Tag::Points},
        {Tag::Survey, "CgPoints", Tag::Points},
        {Tag::Surfaces, "Surface", Tag::Surface},
        {Tag::Surface, "Definition", Tag::Definition},
        {Tag::Definition, "Pnts", Tag::SurfacePoints},
        {Tag::Alignments, "Alignment", Tag::Alignment},
        {Tag::Alignment, "StaEquation", Tag::Equation},
        {Tag::Alignment, "CoordGeom", Tag::Geometry},
        {Tag::Alignment, "Profile", Tag::Profile},
        {Tag::Alignment, "CrossSects", Tag::Sections},
        {Tag::Geometry, "Line", Tag::Line},
        {Tag::Geometry, "IrregularLine", Tag::IrregularLine},
        {Tag::Geometry, "Curve", Tag::Curve},
        {Tag::Geometry, "Spiral", Tag::Spiral},
        {Tag::Profile, "ProfAlign", Tag::GradeLine},
        {Tag::Profile, "ProfSurf", Tag::SurfaceLine},
        {Tag::GradeLine, "PVI", Tag::GradePoint},
        {Tag::GradeLine, "ParaCurve", Tag::Parabola},
        {Tag::GradeLine, "UnsymParaCurve", Tag::UnsymmetricParabola},
        {Tag::GradeLine, "CircCurve", Tag::Circle},
        {Tag::SurfaceLine, "PntList2D", Tag::PointList2},
        {Tag::Sections, "CrossSect", Tag::Section},
        {Tag::Section, "CrossSectSurf", Tag::SectionSurface},
        {Tag::Section, "DesignCrossSectSurf", Tag::DesignSectionSurface},
        {Tag::SectionSurface, "PntList2D", Tag::PointList2},
        {Tag::DesignSectionSurface, "CrossSectPnt", Tag::SectionPoint},
        {Tag::Parcels, "Parcel", Tag::Parcel},
        {Tag::Parcel, "Center", Tag::Centre},
        {Tag::Parcel, "CoordGeom", Tag::Geometry},
        {Tag::Parcel, "Parcels", Tag::Parcels},
        {Tag::IrregularLine, "PntList2D", Tag::PointList2},
        {Tag::IrregularLine, "PntList3D", Tag::PointList3},
    };
    for (const Row &row : rows) {
        if (row.parent == parent && row.name == name) {
            return row.tag;
        }
    }
    if (parent >= Tag::Line && parent <= Tag::Spiral) {
        return name == "Start"    ? Tag::Start
               : name == "End"    ? Tag::End
               : name == "Center" ? Tag::Centre
               : name == "PI"     ? Tag::Intersection
                                  : Tag::None;
    }
    return Tag::None;
}

/// Whether an element says who made a file and where, which is not data.
bool LandXmlReader::isHeader(std::string_view name)
{
    return name == "Units" || name == "Project" || name == "Application" || name == "CoordinateSystem";
}

} // namespace kareport
