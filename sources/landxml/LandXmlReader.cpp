#include "LandXmlReader.h"

#include "LandXmlTags.h"
#include "Xlate.h"

namespace kareport
{

namespace
{

constexpr std::size_t longestText = std::size_t(1) << 26;
constexpr std::size_t allowedWeight = 1000000; // of small files, in addition to their bytes

} // namespace

LandXmlReader::LandXmlReader(std::shared_ptr<const FileBytes> file, const LandXmlUnits &units,
                             const LandXmlWants &wants, LandXmlNotes &notes)
    : mostWeight_(allowedWeight + file->view().size()),
      stream_(std::move(file), *this),
      units_(units),
      wants_(wants),
      notes_(notes)
{
    // They are parts of alignments.
    wants_.alignments = wants.alignments || wants.surfaceLines || wants.sections;
}

XmlHandler::Interest LandXmlReader::startElement(std::string_view name, const XmlAttributes &attributes)
{
    if (open_.empty()) {
        open_.push_back({Tag::Root, false});
        return Interest::Parts;
    }
    if (open_.back().isRead) {
        text_ += ' '; // an element parts the numbers around it
    }
    const Tag tag = tagOf(open_.back().tag, name);
    if (tag == Tag::None) {
        return leaveOut(name);
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

XmlHandler::Interest LandXmlReader::leaveOut(std::string_view name)
{
    if (open_.size() == 1 && isHeader(name)) {
        return Interest::None;
    }
    if (open_.back().tag == Tag::Geometry && name != "Feature") {
        beginOther(name);
        return Interest::None;
    }
    notes_.leaveOut(name);
    return Interest::LeftOut;
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
    } else if (closed.tag == Tag::Alignment) {
        isInAlignment_ = false;
    } else if (closed.tag == Tag::GradeModel) {
        isInGradeModel_ = false;
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
    if (!open_.empty() && open_.back().isRead) {
        text_ += ' ';
    }
    notes_.leaveOut(name);
}

/// Counts what is kept, by the bytes that it takes in a file at the least. What is kept takes far more memory than an empty
/// element takes in a file, so that elements without content would fill the memory.
void LandXmlReader::weigh(std::size_t bytes)
{
    weight_ += bytes;
    if (weight_ > mostWeight_) {
        stream_.fail(stream_.currentByte(), Xlate("the file has too many elements without content"));
    }
}

XmlHandler::Interest LandXmlReader::begin(Tag tag, const XmlAttributes &attributes)
{
    switch (tag) {
    case Tag::Points:
    case Tag::Surface:
        weigh(leastElement);
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
    if (tag >= Tag::GradeModel && tag <= Tag::ZoneWidth) {
        if (wants_.gradeSurfaces) {
            beginInGradeModel(tag, attributes);
        }
        return Interest::Parts;
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

/// Whether a list of points in the current element is wanted.
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
        weigh(leastElement);
        LandXmlGradeLine &line = alignment.gradeLines.emplace_back();
        line.name = textOf(attributes, "name");
        line.byte = stream_.currentByte();
    } else if (tag == Tag::SurfaceLine && wants_.surfaceLines) {
        weigh(leastElement);
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
            notes_.leaveOut("CrossSectPnt " + std::string(*format));
            return Interest::Parts;
        }
        weigh(leastSectionPoint);
        alignments.back().sections.back().surfaces.back().points.push_back({0, 0, textOf(attributes, "code")});
        return Interest::Text;
    }
    return Interest::Parts;
}

} // namespace kareport
