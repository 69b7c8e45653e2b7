#include "LandXmlCurveParts.h"

#include "LandXmlReferences.h"
#include "Xlate.h"

namespace kareport
{

std::optional<bool> isToTheRight(const LandXmlElement &element)
{
    if (element.rotation == "cw") {
        return true;
    }
    return element.rotation == "ccw" ? std::optional(false) : std::nullopt;
}

std::variant<PlanePoint, LandXmlFault> positionOf(const LandXmlCoordinates &at)
{
    if (at.position) {
        return *at.position;
    }
    return LandXmlFault{noPosition(at.reference, at.isUnreadable), at.byte};
}

QString textOf(CurveFault fault)
{
    switch (fault) {
    case CurveFault::NotFinite: return Xlate("the element has no geometry: a radius above zero was expected");
    case CurveFault::NoLength: return Xlate("the element has no geometry: a length above zero was expected");
    case CurveFault::TooManyTurns: return Xlate("the element turns too many times");
    case CurveFault::TooSteep:
        return Xlate("the element turns by more than 45 degrees from its tangent: its form allows less");
    case CurveFault::NoStraightEnd: return Xlate("the element is curved at both ends: its form needs a straight end");
    }
    return {};
}

LandXmlCurves resultOf(const LandXmlElement &element, const FittedCurve &fitted)
{
    if (const auto *fault = std::get_if<CurveFault>(&fitted)) {
        return LandXmlFault{textOf(*fault), element.byte};
    }
    return std::vector{std::get<PlaneCurve>(fitted)};
}

QString missingGeometry(const char *what)
{
    return Xlate("the element has no geometry: %1 was expected").arg(QString::fromUtf8(what));
}

QString shortText(const std::string &text)
{
    return QString::fromStdString(text.substr(0, 100));
}

} // namespace kareport
