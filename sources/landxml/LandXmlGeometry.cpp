#include "LandXmlGeometry.h"

#include "LandXmlCurveParts.h"
#include "Xlate.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

namespace
{

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

LandXmlCurves lineOf(const LandXmlElement &element, const LandXmlEnds &ends)
{
    return resultOf(element, lineBetween(ends.start, ends.end));
}

LandXmlCurves irregularLineOf(const LandXmlElement &element, const LandXmlEnds &ends, LandXmlComparison &comparison)
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

LandXmlCurves spiralOf(const LandXmlElement &element, const LandXmlEnds &ends)
{
    const auto form = formOf(element.form);
    if (!form) {
        return LandXmlFault{Xlate("not supported: a transition of the form \"%1\"").arg(shortText(element.form)),
                            element.byte};
    }
    const auto isRight = isToTheRight(element);
    if (!isRight) {
        return LandXmlFault{missingGeometry("rot=\"cw\" or rot=\"ccw\""), element.byte};
    }
    for (const auto &[radius, name] :
         {std::pair(element.radiusStart, "radiusStart"), std::pair(element.radiusEnd, "radiusEnd")})
    {
        if (!(radius > 0)) { // one that is not given as well
            return LandXmlFault{missingGeometry(name), element.byte};
        }
    }
    if (std::isinf(element.radiusStart) && std::isinf(element.radiusEnd)) {
        return LandXmlFault{missingGeometry("radiusStart"), element.byte};
    }
    if (!isGiven(element.length)) {
        return LandXmlFault{missingGeometry("length"), element.byte};
    }
    const double side = *isRight ? 1 : -1;
    return resultOf(element, curveTowards(*form, ends.start, ends.end, element.length, side / element.radiusStart,
                                          side / element.radiusEnd));
}

/// Whether the file says which of the two arcs of a radius and a side a curve is. Half a circle is both.
bool isWayStated(const LandXmlElement &element, const LandXmlEnds &ends, double tolerance)
{
    return element.centre.isGiven() || isGiven(element.length) || isGiven(element.delta) ||
           element.intersection.position ||
           std::fabs(distanceBetween(ends.start, ends.end) - 2 * element.radius) <= tolerance;
}

void compareWithStated(const LandXmlElement &element, const LandXmlEnds &ends, const PlaneCurve &curve,
                       LandXmlComparison &comparison)
{
    comparison.end(element.byte, ends.end, curve.end().point);
    if (element.kind != LandXmlElement::Kind::Spiral) {
        comparison.length(element.byte, "length", element.length, curve.length());
    }
    if (element.kind == LandXmlElement::Kind::Curve) {
        comparison.length(element.byte, "radius", element.radius, std::fabs(1 / curve.startCurvature()));
        if (!isWayStated(element, ends, comparison.tolerance().length)) {
            comparison.shortWay(element.byte);
        }
    }
    comparison.direction(element.byte, element.kind == LandXmlElement::Kind::Line ? "dir" : "dirStart",
                         element.direction, curve.start().bearing, curve);
    comparison.direction(element.byte, "dirEnd", element.directionEnd, curve.end().bearing, curve);
    if (element.intersection.position) {
        comparison.intersection(element.byte, *element.intersection.position, curve);
    }
}

} // namespace

LandXmlCurves curvesOf(const LandXmlElement &element, LandXmlComparison &comparison)
{
    if (element.kind == LandXmlElement::Kind::Other) {
        return LandXmlFault{
            Xlate("not supported: an element \"%1\" of an alignment or a border").arg(shortText(element.form)),
            element.byte};
    }
    if (!element.start.isGiven() || !element.end.isGiven()) {
        return LandXmlFault{missingGeometry(element.start.isGiven() ? "End" : "Start"), element.byte};
    }
    const auto start = positionOf(element.start);
    const auto end = positionOf(element.end);
    for (const auto *position : {&start, &end}) {
        if (const auto *fault = std::get_if<LandXmlFault>(position)) {
            return *fault;
        }
    }
    const LandXmlEnds ends{std::get<PlanePoint>(start), std::get<PlanePoint>(end)};
    LandXmlCurves curves;
    switch (element.kind) {
    case LandXmlElement::Kind::Line: curves = lineOf(element, ends); break;
    case LandXmlElement::Kind::IrregularLine: return irregularLineOf(element, ends, comparison);
    case LandXmlElement::Kind::Curve: curves = arcOf(element, ends, comparison.tolerance().length); break;
    case LandXmlElement::Kind::Spiral: curves = spiralOf(element, ends); break;
    case LandXmlElement::Kind::Other: break; // it has no ends
    }
    if (const auto *made = std::get_if<std::vector<PlaneCurve>>(&curves)) {
        compareWithStated(element, ends, made->front(), comparison);
    }
    return curves;
}

} // namespace kareport
