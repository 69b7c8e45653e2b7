#include "LandXmlGeometry.h"

#include "CurveFit.h"
#include "Xlate.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

QString utf8(const std::string &text)
{
    return QString::fromStdString(text.substr(0, 100));
}

bool isGiven(double number)
{
    return !std::isnan(number);
}

/// Whether an element bends to the right; nothing where the file does not say.
std::optional<bool> isToTheRight(const LandXmlElement &element)
{
    if (element.rotation == "cw") {
        return true;
    }
    return element.rotation == "ccw" ? std::optional(false) : std::nullopt;
}

std::optional<TransitionForm> formOf(const std::string &name)
{
    struct Row
    {
        std::string_view name;
        TransitionForm form;
    };
    constexpr Row rows[] = {
        {"clothoid", TransitionForm::Clothoid},           {"bloss", TransitionForm::Bloss},
        {"biquadratic", TransitionForm::Biquadratic},     {"cosine", TransitionForm::Cosine},
        {"sinusoid", TransitionForm::Sinusoid},           {"cubicParabola", TransitionForm::CubicParabola},
        {"japaneseCubic", TransitionForm::CubicParabola}, {"sineHalfWave", TransitionForm::SineHalfWave}};
    for (const Row &row : rows) {
        if (row.name == name) {
            return row.form;
        }
    }
    return std::nullopt;
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

QString missing(const char *what)
{
    return Xlate("the element has no geometry: %1 was expected").arg(QString::fromUtf8(what));
}

struct Ends
{
    PlanePoint start;
    PlanePoint end;
};

std::variant<PlanePoint, LandXmlFault> positionOf(const LandXmlCoordinates &at)
{
    if (at.position) {
        return *at.position;
    }
    return LandXmlFault{Xlate("the point \"%1\" is not in the file").arg(utf8(at.reference)), at.byte};
}

LandXmlCurves lineOf(const LandXmlElement &element, const Ends &ends)
{
    return resultOf(element, lineBetween(ends.start, ends.end));
}

LandXmlCurves irregularLineOf(const LandXmlElement &element, const Ends &ends, LandXmlComparison &comparison)
{
    std::vector<PlaneCurve> curves;
    PlanePoint at = ends.start;
    double length = 0;
    const auto addLine = [&](PlanePoint to) {
        const FittedCurve line = lineBetween(at, to);
        if (const auto *curve = std::get_if<PlaneCurve>(&line)) { // a point that is repeated makes no line
            curves.push_back(*curve);
            length += curve->length();
        }
        at = to;
    };
    for (const PlanePoint point : element.between) {
        addLine(point);
    }
    addLine(ends.end);
    if (curves.empty()) {
        return LandXmlFault{textOf(CurveFault::NoLength), element.byte};
    }
    comparison.length(element.byte, "length", element.length, length);
    return curves;
}

std::variant<PlanePoint, LandXmlFault> centreOfCurve(const LandXmlElement &element, const Ends &ends, bool isRight)
{
    if (element.centre.isGiven()) {
        return positionOf(element.centre);
    }
    if (!isGiven(element.radius)) {
        return LandXmlFault{missing("Center"), element.byte};
    }
    const double half = std::numbers::pi;
    // Some programs write the angle of a curve to the left below zero.
    const bool isLong =
        isGiven(element.delta) ? std::fabs(element.delta) > half : element.length > half * element.radius;
    const auto centre = centreOfArc(ends.start, ends.end, element.radius, isRight, isLong);
    if (!centre) {
        return LandXmlFault{Xlate("the element has no geometry: its radius does not reach from its start to its end"),
                            element.byte};
    }
    return *centre;
}

LandXmlCurves curveOf(const LandXmlElement &element, const Ends &ends)
{
    const auto isRight = isToTheRight(element);
    if (!isRight) {
        return LandXmlFault{missing("rot=\"cw\" or rot=\"ccw\""), element.byte};
    }
    const auto centre = centreOfCurve(element, ends, *isRight);
    if (const auto *fault = std::get_if<LandXmlFault>(&centre)) {
        return *fault;
    }
    const PlanePoint middle = std::get<PlanePoint>(centre);
    const double radius = distanceBetween(middle, ends.start);
    const double stated = isGiven(element.length) ? element.length : std::fabs(element.delta) * radius;
    const FittedCurve fitted = arcAbout(middle, ends.start, ends.end, *isRight);
    const auto *curve = std::get_if<PlaneCurve>(&fitted);
    // Where start and end are one point, or so near to each other that their digits decide which comes first, the length
    // alone tells a full circle from nothing.
    const bool isDoubtful = distanceBetween(ends.start, ends.end) == 0 && !isGiven(stated);
    if (isDoubtful || (curve != nullptr && std::fabs(curve->length() - stated) > std::numbers::pi * radius)) {
        return resultOf(element, arcAbout(middle, ends.start, isDoubtful ? 0 : stated, *isRight));
    }
    return resultOf(element, fitted);
}

LandXmlCurves spiralOf(const LandXmlElement &element, const Ends &ends)
{
    const auto form = formOf(element.form);
    if (!form) {
        return LandXmlFault{Xlate("not supported: a transition of the form \"%1\"").arg(utf8(element.form)),
                            element.byte};
    }
    const auto isRight = isToTheRight(element);
    if (!isRight) {
        return LandXmlFault{missing("rot=\"cw\" or rot=\"ccw\""), element.byte};
    }
    for (const auto &[radius, name] :
         {std::pair(element.radiusStart, "radiusStart"), std::pair(element.radiusEnd, "radiusEnd")})
    {
        if (!(radius > 0)) { // one that is not given as well
            return LandXmlFault{missing(name), element.byte};
        }
    }
    if (std::isinf(element.radiusStart) && std::isinf(element.radiusEnd)) {
        return LandXmlFault{missing("radiusStart"), element.byte};
    }
    if (!isGiven(element.length)) {
        return LandXmlFault{missing("length"), element.byte};
    }
    const double side = *isRight ? 1 : -1;
    return resultOf(element, curveTowards(*form, ends.start, ends.end, element.length, side / element.radiusStart,
                                          side / element.radiusEnd));
}

void compareWithStated(const LandXmlElement &element, const Ends &ends, const PlaneCurve &curve,
                       LandXmlComparison &comparison)
{
    comparison.end(element.byte, ends.end, curve.end().point);
    if (element.kind != LandXmlElement::Kind::Spiral) {
        comparison.length(element.byte, "length", element.length, curve.length());
    }
    if (element.kind == LandXmlElement::Kind::Curve) {
        comparison.length(element.byte, "radius", element.radius, std::fabs(1 / curve.startCurvature()));
    }
    comparison.direction(element.byte, element.kind == LandXmlElement::Kind::Line ? "dir" : "dirStart",
                         element.direction, curve.start().bearing);
    comparison.direction(element.byte, "dirEnd", element.directionEnd, curve.end().bearing);
    if (element.intersection.position) {
        comparison.intersection(element.byte, *element.intersection.position, curve);
    }
}

} // namespace

LandXmlCurves curvesOf(const LandXmlElement &element, LandXmlComparison &comparison)
{
    if (element.kind == LandXmlElement::Kind::Other) {
        return LandXmlFault{
            Xlate("not supported: an element \"%1\" of an alignment or a border").arg(utf8(element.form)),
            element.byte};
    }
    if (!element.start.isGiven() || !element.end.isGiven()) {
        return LandXmlFault{missing(element.start.isGiven() ? "End" : "Start"), element.byte};
    }
    const auto start = positionOf(element.start);
    const auto end = positionOf(element.end);
    for (const auto *position : {&start, &end}) {
        if (const auto *fault = std::get_if<LandXmlFault>(position)) {
            return *fault;
        }
    }
    const Ends ends{std::get<PlanePoint>(start), std::get<PlanePoint>(end)};
    LandXmlCurves curves;
    switch (element.kind) {
    case LandXmlElement::Kind::Line: curves = lineOf(element, ends); break;
    case LandXmlElement::Kind::IrregularLine: return irregularLineOf(element, ends, comparison);
    case LandXmlElement::Kind::Curve: curves = curveOf(element, ends); break;
    case LandXmlElement::Kind::Spiral: curves = spiralOf(element, ends); break;
    case LandXmlElement::Kind::Other: break; // it has no ends
    }
    if (const auto *made = std::get_if<std::vector<PlaneCurve>>(&curves)) {
        compareWithStated(element, ends, made->front(), comparison);
    }
    return curves;
}

} // namespace kareport
