#include "LandXmlReader.h"

#include "LandXmlTags.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

constexpr std::size_t longestText = std::size_t(1) << 26;

} // namespace

LandXmlReader::LandXmlReader(std::shared_ptr<const FileBytes> file, const LandXmlUnits &units,
                             const LandXmlWants &wants, LandXmlNotes &notes)
    : stream_(std::move(file), *this), units_(units), wants_(wants), notes_(notes)
{
    // They are parts of alignments.
    wants_.alignments = wants.alignments || wants.surfaceLines || wants.sections;
}

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
        {Tag::SurfacePoints, "P", Tag::SurfacePoint}, // first what there is most of
        {Tag::Points, "CgPoint", Tag::Point},
        {Tag::Root, "CgPoints", Tag::Points},
        {Tag::Root, "Surfaces", Tag::Surfaces},
        {Tag::Root, "Alignments", Tag::Alignments},
        {Tag::Root, "Parcels", Tag::Parcels},
        {Tag::Points, "CgPoints", Tag::Points},
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

/// What says who made a file and where, which is not data.
bool LandXmlReader::isHeader(std::string_view name)
{
    return name == "Units" || name == "Project" || name == "Application" || name == "CoordinateSystem";
}

XmlHandler::Interest LandXmlReader::startElement(std::string_view name, const XmlAttributes &attributes)
{
    if (open_.empty()) {
        open_.push_back({Tag::Root, false});
        return Interest::Parts;
    }
    const Tag tag = tagOf(open_.back().tag, name);
    if (tag == Tag::None) {
        if (open_.back().tag == Tag::Geometry && name != "Feature") {
            beginOther(name);
        } else if (open_.size() > 1 || !isHeader(name)) {
            notes_.passOver(name);
        }
        return Interest::None;
    }
    const Interest interest = begin(tag, attributes);
    if (interest != Interest::None) {
        open_.push_back({tag, interest == Interest::Text});
        if (interest == Interest::Text) {
            text_.clear();
            textByte_ = stream_.currentByte();
        }
    }
    return interest;
}

void LandXmlReader::endElement()
{
    const Open closed = open_.back();
    open_.pop_back();
    if (closed.isRead) {
        end(closed.tag);
    } else if (closed.tag == Tag::Points || closed.tag == Tag::Surface) {
        openOwners_.pop_back();
    } else if (closed.tag == Tag::Parcel) {
        --parcelDepth_;
        if (wants_.parcels) {
            parcelPath_.pop_back();
        }
    }
}

void LandXmlReader::text(std::string_view piece)
{
    if (text_.size() + piece.size() > longestText) {
        stream_.fail(textByte_, Xlate("the element holds more than %1 bytes of text").arg(longestText));
        return;
    }
    text_ += piece;
}

void LandXmlReader::foreignElement(std::string_view name)
{
    notes_.passOver(name);
}

XmlHandler::Interest LandXmlReader::begin(Tag tag, const XmlAttributes &attributes)
{
    switch (tag) {
    case Tag::Points:
    case Tag::Surface:
        openOwners_.push_back(owners_.size());
        owners_.push_back(textOf(attributes, "name"));
        isSurface_.push_back(tag == Tag::Surface);
        return Interest::Parts;
    case Tag::SurfacePoints: return wants_.surfacePoints ? Interest::Parts : Interest::None;
    case Tag::Point:
        if (!wants_.points) {
            return Interest::Parts;
        }
        [[fallthrough]];
    case Tag::SurfacePoint: beginPoint(tag, attributes); return Interest::Text;
    case Tag::Parcel: beginParcel(attributes); return Interest::Parts;
    default: break;
    }
    if (tag < Tag::Alignment || !isGeometryWanted()) {
        return Interest::Parts;
    }
    if (tag >= Tag::Profile && tag <= Tag::SurfaceLine) {
        return beginInProfile(tag, attributes);
    }
    return tag >= Tag::Sections && tag <= Tag::SectionPoint ? beginInSections(tag, attributes)
                                                            : beginInAlignment(tag, attributes);
}

XmlHandler::Interest LandXmlReader::beginInAlignment(Tag tag, const XmlAttributes &attributes)
{
    switch (tag) {
    case Tag::Alignment: beginAlignment(attributes); return Interest::Parts;
    case Tag::Equation: beginEquation(attributes); return Interest::Parts;
    case Tag::Line:
    case Tag::IrregularLine:
    case Tag::Curve:
    case Tag::Spiral: beginElement(tag, attributes); return Interest::Parts;
    case Tag::Start:
    case Tag::End:
    case Tag::Centre:
    case Tag::Intersection: startCoordinates(coordinatesOf(tag), attributes); return Interest::Text;
    case Tag::PointList2:
    case Tag::PointList3: return isListRead() ? Interest::Text : Interest::Parts;
    default: return Interest::Parts;
    }
}

/// Whether a list of points in the element at hand is wanted.
bool LandXmlReader::isListRead() const
{
    switch (open_.back().tag) {
    case Tag::SurfaceLine: return wants_.surfaceLines;
    case Tag::SectionSurface: return wants_.sections;
    default: return true;
    }
}

XmlHandler::Interest LandXmlReader::beginInProfile(Tag tag, const XmlAttributes &attributes)
{
    LandXmlAlignment &alignment = alignments.back();
    if (tag == Tag::GradeLine) {
        LandXmlGradeLine &line = alignment.gradeLines.emplace_back();
        line.name = textOf(attributes, "name");
        line.byte = stream_.currentByte();
    } else if (tag == Tag::SurfaceLine && wants_.surfaceLines) {
        LandXmlHeightLine &line = alignment.surfaceLines.emplace_back();
        line.name = textOf(attributes, "name");
        line.byte = stream_.currentByte();
    } else if (tag >= Tag::GradePoint && tag <= Tag::Circle) {
        beginGradePoint(tag, attributes);
        return Interest::Text;
    }
    return Interest::Parts;
}

XmlHandler::Interest LandXmlReader::beginInSections(Tag tag, const XmlAttributes &attributes)
{
    if (!wants_.sections) {
        return Interest::Parts;
    }
    if (tag == Tag::Section) {
        beginSection(attributes);
    } else if (tag == Tag::SectionSurface || tag == Tag::DesignSectionSurface) {
        beginSectionSurface(tag, attributes);
    } else if (tag == Tag::SectionPoint) {
        const auto format = attributes.find("dataFormat");
        if (format && *format != "Offset Elevation") {
            notes_.passOver("CrossSectPnt " + std::string(*format));
            return Interest::Parts;
        }
        alignments.back().sections.back().surfaces.back().points.push_back({0, 0, textOf(attributes, "code")});
        return Interest::Text;
    }
    return Interest::Parts;
}

} // namespace kareport
