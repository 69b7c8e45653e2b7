// What the reader takes from the attributes of elements.
#include "LandXmlReader.h"
#include "LandXmlTags.h"
#include "Xlate.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

void LandXmlReader::beginAlignment(const XmlAttributes &attributes)
{
    weigh(leastElement);
    LandXmlAlignment &alignment = alignments.emplace_back();
    alignment.name = textOf(attributes, "name");
    alignment.description = textOf(attributes, "desc");
    isInAlignment_ = true;
    const double start = length(attributes, "staStart");
    alignment.isStartStated = !std::isnan(start);
    alignment.staStart = alignment.isStartStated ? start : 0;
    alignment.length = length(attributes, "length");
    alignment.byte = stream_.currentByte();
}

/// Begins a point. A file has most of them, so that its attributes are gone through once.
void LandXmlReader::beginPoint(Tag tag, const XmlAttributes &attributes)
{
    LandXmlPoint &point = points_[pointCount_];
    for (std::string *text : {&point.name, &point.id, &point.code, &point.description, &point.at.reference}) {
        text->clear();
    }
    const std::string_view id = tag == Tag::Point ? "oID" : "id";
    for (const char *const *pair = attributes.pairs(); *pair != nullptr; pair += 2) {
        const std::string_view key = *pair;
        std::string *text = key == "name"     ? &point.name
                            : key == "code"   ? &point.code
                            : key == "desc"   ? &point.description
                            : key == id       ? &point.id
                            : key == "pntRef" ? &point.at.reference
                                              : nullptr;
        if (text != nullptr) {
            *text = pair[1];
        }
    }
    if (point.name.empty() || tag == Tag::SurfacePoint) {
        std::swap(point.name, point.id);
    }
    if (wants_.isForReferences && !(point.name.empty() && point.id.empty())) {
        weigh(leastNamedPoint);
    }
    isInPoint_ = true;
    point.owner = openOwners_.back();
    point.at.position.reset();
    point.at.height = notGiven;
    point.at.byte = stream_.currentByte();
}

/// Begins coordinates, without the position that they may have.
void LandXmlReader::startCoordinates(LandXmlCoordinates &at, const XmlAttributes &attributes)
{
    at.position.reset();
    at.height = notGiven;
    at.reference = attributes.text("pntRef");
    at.name = attributes.text("name");
    at.byte = stream_.currentByte();
}

/// The element of the alignment or the parcel that is read.
LandXmlElement &LandXmlReader::element()
{
    return parcelPath_.empty() ? alignments.back().elements.back() : parcels[parcelPath_.back()].elements.back();
}

LandXmlCoordinates &LandXmlReader::coordinatesOf(Tag tag)
{
    if (open_.back().tag == Tag::Parcel) {
        return parcels[parcelPath_.back()].centre;
    }
    LandXmlElement &owner = element();
    return tag == Tag::Start    ? owner.start
           : tag == Tag::End    ? owner.end
           : tag == Tag::Centre ? owner.centre
                                : owner.intersection;
}

void LandXmlReader::beginElement(Tag tag, const XmlAttributes &attributes)
{
    weigh(leastElement);
    auto &elements = parcelPath_.empty() ? alignments.back().elements : parcels[parcelPath_.back()].elements;
    LandXmlElement &element = elements.emplace_back();
    element.byte = stream_.currentByte();
    element.kind = tag == Tag::Line            ? LandXmlElement::Kind::Line
                   : tag == Tag::IrregularLine ? LandXmlElement::Kind::IrregularLine
                   : tag == Tag::Curve         ? LandXmlElement::Kind::Curve
                                               : LandXmlElement::Kind::Spiral;
    element.name = textOf(attributes, "name");
    element.form = textOf(attributes, "spiType");
    element.rotation = textOf(attributes, "rot");
    element.length = length(attributes, "length");
    element.radius = radius(attributes, "radius");
    element.radiusStart = radius(attributes, "radiusStart");
    element.radiusEnd = radius(attributes, "radiusEnd");
    element.staStart = length(attributes, "staStart");
    element.direction = angle(attributes, tag == Tag::Line ? "dir" : "dirStart", units_.direction);
    element.directionEnd = angle(attributes, "dirEnd", units_.direction);
    element.delta = angle(attributes, "delta", units_.angle);
}

/// Keeps an element of a kind that has no geometry here: those after it are farther along the alignment.
void LandXmlReader::beginOther(std::string_view name)
{
    if (!isGeometryWanted()) {
        return;
    }
    weigh(leastElement);
    auto &elements = parcelPath_.empty() ? alignments.back().elements : parcels[parcelPath_.back()].elements;
    LandXmlElement &element = elements.emplace_back();
    element.byte = stream_.currentByte();
    element.kind = LandXmlElement::Kind::Other;
    element.form = name.substr(0, 100);
}

void LandXmlReader::beginEquation(const XmlAttributes &attributes)
{
    weigh(leastElement);
    LandXmlEquation &equation = alignments.back().equations.emplace_back();
    equation.internal = length(attributes, "staInternal");
    equation.back = length(attributes, "staBack");
    equation.ahead = length(attributes, "staAhead");
    equation.isDecreasing = attributes.text("staIncrement") == "decreasing";
    equation.byte = stream_.currentByte();
}

void LandXmlReader::beginGradePoint(Tag tag, const XmlAttributes &attributes)
{
    weigh(leastGradePoint);
    LandXmlGradePoint &point = alignments.back().gradeLines.back().points.emplace_back();
    using Kind = LandXmlGradePoint::Kind;
    point.kind = tag == Tag::GradePoint            ? Kind::Point
                 : tag == Tag::Parabola            ? Kind::Parabola
                 : tag == Tag::UnsymmetricParabola ? Kind::UnsymmetricParabola
                                                   : Kind::Circle;
    point.length = length(attributes, "length");
    point.lengthIn = length(attributes, "lengthIn");
    point.lengthOut = length(attributes, "lengthOut");
    point.radius = radius(attributes, "radius");
    point.byte = stream_.currentByte();
}

void LandXmlReader::beginSection(const XmlAttributes &attributes)
{
    weigh(leastElement);
    LandXmlSection &section = alignments.back().sections.emplace_back();
    section.name = textOf(attributes, "name");
    section.station = length(attributes, "sta");
    section.cutArea = area(attributes, "areaCut");
    section.fillArea = area(attributes, "areaFill");
    const double skew = angle(attributes, "angleSkew", units_.angle);
    section.byte = stream_.currentByte();
    const bool isUnknown = std::isnan(skew) && !attributes.text("angleSkew").empty();
    if (std::fabs(skew) > 0 || isUnknown) {
        section.isSkew = true;
        notes_.add(section.byte,
                   Xlate("not supported: coordinates of a cross section that lies at a skew to its alignment"));
    }
    if (std::isnan(section.station)) {
        failNumber(section.byte, Xlate("the attribute %1 was expected").arg(QStringLiteral("sta")));
    }
}

void LandXmlReader::beginSectionSurface(Tag tag, const XmlAttributes &attributes)
{
    weigh(leastElement);
    LandXmlSectionSurface &surface = alignments.back().sections.back().surfaces.emplace_back();
    surface.name = textOf(attributes, "name");
    surface.side = textOf(attributes, "side");
    surface.material = textOf(attributes, "material");
    surface.isDesign = tag == Tag::DesignSectionSurface;
    surface.width = length(attributes, "typicalWidth");
    surface.thickness = length(attributes, "typicalThickness");
    surface.byte = stream_.currentByte();
}

void LandXmlReader::beginParcel(const XmlAttributes &attributes)
{
    ++parcelDepth_;
    if (!wants_.parcels) {
        return;
    }
    const std::string owner = parcelPath_.empty() ? std::string() : parcels[parcelPath_.back()].name;
    parcelPath_.push_back(parcels.size());
    weigh(std::max(leastElement, owner.size())); // each part has its own copy
    LandXmlParcel &parcel = parcels.emplace_back();
    parcel.owner = owner;
    parcel.name = textOf(attributes, "name");
    parcel.description = textOf(attributes, "desc");
    parcel.area = area(attributes, "area");
    parcel.byte = stream_.currentByte();
}

std::string LandXmlReader::textOf(const XmlAttributes &attributes, const char *name)
{
    return std::string(attributes.text(name));
}

} // namespace kareport
