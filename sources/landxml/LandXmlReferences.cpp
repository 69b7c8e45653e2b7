#include "LandXmlReferences.h"

#include "Xlate.h"

#include <algorithm>

namespace kareport
{

bool isReference(const LandXmlCoordinates &at)
{
    return !at.reference.empty() && !at.position;
}

bool hasReferences(const std::vector<LandXmlElement> &elements)
{
    return std::any_of(elements.begin(), elements.end(), [](const LandXmlElement &element) {
        return isReference(element.start) || isReference(element.end) || isReference(element.centre) ||
               isReference(element.intersection);
    });
}

void resolve(LandXmlCoordinates &at, const LandXmlPointTable &points, LandXmlNotes &notes)
{
    const auto found = isReference(at) ? points.find(at.reference) : std::nullopt;
    if (!found) {
        return;
    }
    if (found->isAmbiguous) {
        noteAmbiguous(at.reference, at.byte, notes);
    }
    at.position = found->position;
    at.height = found->height;
    if (at.name.empty()) {
        at.name = found->name;
    }
}

void resolve(std::vector<LandXmlElement> &elements, const LandXmlPointTable &points, LandXmlNotes &notes)
{
    for (LandXmlElement &element : elements) {
        for (LandXmlCoordinates *at : {&element.start, &element.end, &element.centre, &element.intersection}) {
            resolve(*at, points, notes);
        }
    }
}

void noteAmbiguous(const std::string &name, std::size_t byte, LandXmlNotes &notes)
{
    notes.add(byte, Xlate("several points have the name \"%1\" that is referred to: the first one was taken")
                        .arg(QString::fromStdString(name)));
}

} // namespace kareport
