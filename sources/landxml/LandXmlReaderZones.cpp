// The widths beside alignments, which are outside of them in the file.
#include "LandXmlReader.h"
#include "LandXmlTags.h"

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
    return {length(attributes, "staStart"), length(attributes, "staEnd"), length(attributes, "startWidth"),
            length(attributes, "endWidth")};
}

} // namespace kareport
