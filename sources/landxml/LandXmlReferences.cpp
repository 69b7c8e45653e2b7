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
        at.isUnreadable = isReference(at) && points.isUnreadable(at.reference);
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

QString noPosition(const std::string &name, bool isUnreadable)
{
    constexpr std::size_t longest = 100;
    const QString text = isUnreadable ? Xlate("the coordinates of the point \"%1\" cannot be read")
                                      : Xlate("the point \"%1\" is not in the file");
    return text.arg(QString::fromStdString(name.substr(0, longest)));
}

void noteAmbiguous(const std::string &name, std::size_t byte, LandXmlNotes &notes)
{
    notes.add(byte, Xlate("several points have the name \"%1\" that is referred to: the first one was taken")
                        .arg(QString::fromStdString(name)));
}

} // namespace kareport
