// The geometry of curves.
#include "LandXmlCurveParts.h"
#include "Xlate.h"

#include <algorithm>
#include <numbers>

namespace kareport
{

namespace
{

/// Whether an arc is longer than half a circle, as far as the file says. One of which it says nothing is taken for the shorter
/// one, which is noted with what is compared.
bool isLongArc(const LandXmlElement &element)
{
    const double half = std::numbers::pi;
    // Some programs write the angle of a curve to the left below zero.
    return isGiven(element.delta) ? std::fabs(element.delta) > half : element.length > half * element.radius;
}

std::variant<PlanePoint, LandXmlFault> centreOfCurve(const LandXmlElement &element, const LandXmlEnds &ends,
                                                     bool isRight, double tolerance)
{
    if (element.centre.isGiven()) {
        return positionOf(element.centre);
    }
    if (!isGiven(element.radius)) {
        return LandXmlFault{missingGeometry("Center"), element.byte};
    }
    const auto centre = centreOfArc(ends.start, ends.end, element.radius, isRight, isLongArc(element), tolerance);
    if (!centre) {
        return LandXmlFault{Xlate("the element has no geometry: its radius does not reach from its start to its end"),
                            element.byte};
    }
    return *centre;
}

/// The arc of the stated radius between the ends. About half a circle, the digits of the ends hardly say how far it turns:
/// the other values of the file do, where they lead to the end.
FittedCurve arcOfRadius(const LandXmlElement &element, const LandXmlEnds &ends, bool isRight, double tolerance)
{
    const double radius = element.radius;
    const double chord = distanceBetween(ends.start, ends.end);
    if (std::fabs(chord - 2 * radius) <= tolerance) {
        for (const double turn : {std::fabs(element.delta), element.length / radius}) { // not a number where not given
            if (std::fabs(2 * radius * std::sin(turn / 2) - chord) <= tolerance) {
                return arcTowards(ends.start, ends.end, radius, isRight, turn);
            }
        }
    }
    return arcOver(ends.start, ends.end, radius, isRight, isLongArc(element), tolerance);
}

/// Whether an arc of the stated length ends about where the file has its end. Lengths have few digits, and of several turns
/// their errors add up. What has no length ends where it starts.
bool endsNear(const FittedCurve &fitted, const LandXmlEnds &ends, double radius, double tolerance)
{
    constexpr double part = 0.05; // of the radius
    const auto *curve = std::get_if<PlaneCurve>(&fitted);
    const PlanePoint end = curve != nullptr ? curve->end().point : ends.start;
    return distanceBetween(end, ends.end) <= (curve != nullptr ? std::max(tolerance, part * radius) : tolerance);
}

} // namespace

LandXmlCurves arcOf(const LandXmlElement &element, const LandXmlEnds &ends, double tolerance)
{
    const auto isRight = isToTheRight(element);
    if (!isRight) {
        return LandXmlFault{missingGeometry("rot=\"cw\" or rot=\"ccw\""), element.byte};
    }
    const auto centre = centreOfCurve(element, ends, *isRight, tolerance);
    if (const auto *fault = std::get_if<LandXmlFault>(&centre)) {
        return *fault;
    }
    const PlanePoint middle = std::get<PlanePoint>(centre);
    const bool hasCentre = element.centre.isGiven();
    const double radius = hasCentre ? distanceBetween(middle, ends.start) : element.radius;
    const double stated = isGiven(element.length) ? element.length : std::fabs(element.delta) * radius;
    const FittedCurve fitted =
        hasCentre ? arcAbout(middle, ends.start, ends.end, *isRight) : arcOfRadius(element, ends, *isRight, tolerance);
    const auto *curve = std::get_if<PlaneCurve>(&fitted);
    // Where start and end are one point, or so near to each other that their digits decide which comes first, the length
    // alone tells a full circle from nothing, and several turns from one. One that leads elsewhere is a mistake.
    if (distanceBetween(ends.start, ends.end) == 0 && !isGiven(stated)) {
        return resultOf(element, arcAbout(middle, ends.start, 0, *isRight));
    }
    if (curve != nullptr && std::fabs(curve->length() - stated) > std::numbers::pi * radius) {
        const FittedCurve wound = arcAbout(middle, ends.start, stated, *isRight);
        return resultOf(element, endsNear(wound, ends, radius, tolerance) ? wound : fitted);
    }
    return resultOf(element, fitted);
}

} // namespace kareport
