// The widths beside alignments, which are outside of them in the file.
#include "LandXmlReader.h"
#include "LandXmlTags.h"

#include <cmath>

namespace kareport
{

void LandXmlReader::beginInGradeModel(Tag tag, const XmlAttributes &attributes)
{
    isInGradeModel_ = true;
    switch (tag) {
    case Tag::GradeSurface: {
        weigh(leastElement);
        LandXmlGradeSurface &surface = gradeSurfaces.emplace_back();
        surface.alignment = textOf(attributes, "alignmentRef");
        surface.byte = stream_.currentByte();
        break;
    }
    case Tag::Zones: isZoneRight_ = attributes.text("side") == "right"; break;
    case Tag::Zone: beginZone(attributes); break;
    case Tag::ZoneWidth:
        weigh(leastElement);
        gradeSurfaces.back().zones.back().widths.push_back(widthOf(attributes));
        break;
    default: break;
    }
}

void LandXmlReader::beginZone(const XmlAttributes &attributes)
{
    weigh(leastElement);
    LandXmlZone &zone = gradeSurfaces.back().zones.emplace_back();
    zone.isRight = isZoneRight_;
    zone.whole = widthOf(attributes);
}

LandXmlWidth LandXmlReader::widthOf(const XmlAttributes &attributes)
{
    LandXmlWidth width;
    width.byte = stream_.currentByte();
    const auto take = [&](const char *name) {
        const double taken = length(attributes, name);
        width.isUnreadable = width.isUnreadable || (std::isnan(taken) && !attributes.text(name).empty());
        return taken;
    };
    width.staStart = take("staStart");
    width.staEnd = take("staEnd");
    width.atStart = take("startWidth");
    width.atEnd = take("endWidth");
    return width;
}

} // namespace kareport
