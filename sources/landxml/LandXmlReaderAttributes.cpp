// What the reader takes from the attributes of elements.
#include "LandXmlReader.h"
#include "LandXmlTags.h"
#include "NumberText.h"
#include "Xlate.h"

#include <cmath>

namespace kareport
{

void LandXmlReader::beginAlignment(const XmlAttributes &attributes)
{
    LandXmlAlignment &alignment = alignments.emplace_back();
    alignment.name = textOf(attributes, "name");
    alignment.description = textOf(attributes, "desc");
    alignment.staStart = number(attributes, "staStart", 0) * units_.metres;
    alignment.length = length(attributes, "length");
    alignment.byte = stream_.currentByte();
}

void LandXmlReader::beginPoint(Tag tag, const XmlAttributes &attributes)
{
    LandXmlPoint &point = point_;
    point.name = attributes.text("name");
    point.id = attributes.text(tag == Tag::Point ? "oID" : "id");
    if (point.name.empty() || tag == Tag::SurfacePoint) {
        std::swap(point.name, point.id);
    }
    point.code = attributes.text("code");
    point.description = attributes.text("desc");
    point.owner = openOwners_.back();
    startCoordinates(point.at, attributes);
}

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
    element.radius = length(attributes, "radius");
    element.radiusStart = length(attributes, "radiusStart");
    element.radiusEnd = length(attributes, "radiusEnd");
    element.staStart = length(attributes, "staStart");
    element.direction = angle(attributes, tag == Tag::Line ? "dir" : "dirStart", units_.direction);
    element.directionEnd = angle(attributes, "dirEnd", units_.direction);
    element.delta = angle(attributes, "delta", units_.angle);
}

/// Keeps an element of a kind that has no geometry here: what comes after it stands farther along.
void LandXmlReader::beginOther(std::string_view name)
{
    if (!isGeometryWanted()) {
        return;
    }
    auto &elements = parcelPath_.empty() ? alignments.back().elements : parcels[parcelPath_.back()].elements;
    LandXmlElement &element = elements.emplace_back();
    element.byte = stream_.currentByte();
    element.kind = LandXmlElement::Kind::Other;
    element.form = name.substr(0, 100);
}

void LandXmlReader::beginEquation(const XmlAttributes &attributes)
{
    LandXmlEquation &equation = alignments.back().equations.emplace_back();
    equation.internal = length(attributes, "staInternal");
    equation.back = length(attributes, "staBack");
    equation.ahead = length(attributes, "staAhead");
    equation.isDecreasing = attributes.text("staIncrement") == "decreasing";
    equation.byte = stream_.currentByte();
}

void LandXmlReader::beginGradePoint(Tag tag, const XmlAttributes &attributes)
{
    LandXmlGradePoint &point = alignments.back().gradeLines.back().points.emplace_back();
    using Kind = LandXmlGradePoint::Kind;
    point.kind = tag == Tag::GradePoint            ? Kind::Point
                 : tag == Tag::Parabola            ? Kind::Parabola
                 : tag == Tag::UnsymmetricParabola ? Kind::UnsymmetricParabola
                                                   : Kind::Circle;
    point.length = length(attributes, "length");
    point.lengthIn = length(attributes, "lengthIn");
    point.lengthOut = length(attributes, "lengthOut");
    point.radius = length(attributes, "radius");
    point.byte = stream_.currentByte();
}

void LandXmlReader::beginSection(const XmlAttributes &attributes)
{
    LandXmlSection &section = alignments.back().sections.emplace_back();
    section.name = textOf(attributes, "name");
    section.station = length(attributes, "sta");
    section.cutArea = number(attributes, "areaCut") * units_.squareMetres;
    section.fillArea = number(attributes, "areaFill") * units_.squareMetres;
    const double skew = angle(attributes, "angleSkew", units_.angle);
    section.byte = stream_.currentByte();
    if (std::fabs(skew) > 0) {
        section.isSkew = true;
        notes_.add(section.byte,
                   Xlate("not supported: coordinates of a cross section that lies at a skew to its alignment"));
    }
    if (std::isnan(section.station)) {
        stream_.fail(section.byte, Xlate("the attribute %1 was expected").arg(QStringLiteral("sta")));
    }
}

void LandXmlReader::beginSectionSurface(Tag tag, const XmlAttributes &attributes)
{
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
    LandXmlParcel &parcel = parcels.emplace_back();
    parcel.owner = owner;
    parcel.name = textOf(attributes, "name");
    parcel.description = textOf(attributes, "desc");
    parcel.area = number(attributes, "area") * units_.squareMetres;
    parcel.byte = stream_.currentByte();
}

double LandXmlReader::number(const XmlAttributes &attributes, const char *name, double missing)
{
    const auto value = attributes.find(name);
    double number = missing;
    if (value && !value->empty() && (!parseNumber(*value, number) || std::isnan(number))) {
        stream_.fail(stream_.currentByte(), Xlate("the attribute %1=\"%2\" does not fit: a number was expected")
                                                .arg(QString::fromUtf8(name), quoteOf(*value)));
    }
    return number;
}

double LandXmlReader::angle(const XmlAttributes &attributes, const char *name, LandXmlAngle form)
{
    const auto value = attributes.find(name);
    double radians = notGiven;
    if (value && !value->empty() && !parseLandXmlAngle(*value, form, radians)) {
        stream_.fail(stream_.currentByte(),
                     Xlate("the attribute %1=\"%2\" does not fit: an angle in the file's unit was "
                           "expected")
                         .arg(QString::fromUtf8(name), quoteOf(*value)));
    }
    return radians;
}

std::string LandXmlReader::textOf(const XmlAttributes &attributes, const char *name)
{
    return std::string(attributes.text(name));
}

} // namespace kareport
