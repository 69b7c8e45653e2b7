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
    case CurveFault::TooManyTurns: return Xlate("the element winds round too often");
    case CurveFault::TooSteep:
        return Xlate("the element leaves its tangent by more than 45 degrees, which its form cannot");
    case CurveFault::NoStraightEnd:
        return Xlate("the element is curved at both ends, which its form cannot be: a straight end was expected");
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

} // namespace

std::variant<PlanePoint, LandXmlFault> LandXmlGeometry::positionOf(const LandXmlCoordinates &at) const
{
    if (at.position) {
        return *at.position;
    }
    const auto found = points_ != nullptr ? points_->find(at.reference) : std::nullopt;
    if (!found) {
        return LandXmlFault{Xlate("the point \"%1\" is not in the file").arg(utf8(at.reference)), at.byte};
    }
    return found->position;
}

LandXmlCurves LandXmlGeometry::curvesOf(const LandXmlElement &element) const
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
    case LandXmlElement::Kind::IrregularLine: return irregularLineOf(element, ends);
    case LandXmlElement::Kind::Curve: curves = curveOf(element, ends); break;
    case LandXmlElement::Kind::Spiral: curves = spiralOf(element, ends); break;
    case LandXmlElement::Kind::Other: break; // it has no ends
    }
    if (const auto *made = std::get_if<std::vector<PlaneCurve>>(&curves)) {
        compareWithStated(element, ends, made->front());
    }
    return curves;
}

LandXmlCurves LandXmlGeometry::lineOf(const LandXmlElement &element, const Ends &ends) const
{
    return resultOf(element, lineBetween(ends.start, ends.end));
}

LandXmlCurves LandXmlGeometry::irregularLineOf(const LandXmlElement &element, const Ends &ends) const
{
    std::vector<PlaneCurve> curves;
    PlanePoint at = ends.start;
    double length = 0;
    const auto addLine = [&](PlanePoint to) {
        const FittedCurve line = lineBetween(at, to);
        if (const auto *curve = std::get_if<PlaneCurve>(&line)) { // points that stand twice make no line
            curves.push_back(*curve);
            length += curve->length();
        }
        at = to;
    };
    for (const LandXmlCoordinates &point : element.between) {
        addLine(*point.position);
    }
    addLine(ends.end);
    if (curves.empty()) {
        return LandXmlFault{textOf(CurveFault::NoLength), element.byte};
    }
    compareLength(element.byte, "length", element.length, length);
    return curves;
}

std::variant<PlanePoint, LandXmlFault> LandXmlGeometry::centreOfCurve(const LandXmlElement &element, const Ends &ends,
                                                                      bool isRight) const
{
    if (element.centre.isGiven()) {
        return positionOf(element.centre);
    }
    if (!isGiven(element.radius)) {
        return LandXmlFault{missing("Center"), element.byte};
    }
    const double half = std::numbers::pi;
    const bool isLong = isGiven(element.delta) ? element.delta > half : element.length > half * element.radius;
    const auto centre = centreOfArc(ends.start, ends.end, element.radius, isRight, isLong);
    if (!centre) {
        return LandXmlFault{Xlate("the element has no geometry: its radius does not reach from its start to its end"),
                            element.byte};
    }
    return *centre;
}

LandXmlCurves LandXmlGeometry::curveOf(const LandXmlElement &element, const Ends &ends) const
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
    const double stated = isGiven(element.length) ? element.length : element.delta * radius;
    const FittedCurve fitted = arcAbout(middle, ends.start, ends.end, *isRight);
    const auto *curve = std::get_if<PlaneCurve>(&fitted);
    // Where start and end are one point, or so near to each other that their digits decide which comes first, a full circle
    // is told from nothing by the length alone.
    const bool isDoubtful = distanceBetween(ends.start, ends.end) == 0 && !isGiven(stated);
    if (isDoubtful || (curve != nullptr && std::fabs(curve->length() - stated) > std::numbers::pi * radius)) {
        return resultOf(element, arcAbout(middle, ends.start, isDoubtful ? 0 : stated, *isRight));
    }
    return resultOf(element, fitted);
}

LandXmlCurves LandXmlGeometry::spiralOf(const LandXmlElement &element, const Ends &ends) const
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

void LandXmlGeometry::say(std::size_t byte, const char *what, double stated, double computed, double unit,
                          int decimals) const
{
    if (notes_ != nullptr) {
        notes_->add(byte, Xlate("%1 is %2 in the file, but %3 by its geometry")
                              .arg(QString::fromUtf8(what), QString::number(stated / unit, 'f', decimals),
                                   QString::number(computed / unit, 'f', decimals)));
    }
}

void LandXmlGeometry::compareLength(std::size_t byte, const char *what, double stated, double computed) const
{
    if (isGiven(stated) && !(std::fabs(stated - computed) <= tolerance_.length)) {
        say(byte, what, stated, computed, units_.metres, 4);
    }
}

/// Directions are measured clockwise from north, or the other way round, from north or from east: the format's words and
/// its programs differ. What fits in one of these ways is no difference.
void LandXmlGeometry::compareDirection(std::size_t byte, const char *what, double stated, double bearing) const
{
    if (!isGiven(stated)) {
        return;
    }
    const double quarter = std::numbers::pi / 2;
    for (const double candidate : {stated, -stated, quarter - stated}) {
        if (std::fabs(turnBetween(candidate, bearing)) <= tolerance_.angle) {
            return;
        }
    }
    say(byte, what, normalizedBearing(stated), bearing, std::numbers::pi / 180, 5);
}

/// The point where the tangents meet has to lie on both, as far as its digits say.
void LandXmlGeometry::compareIntersection(const LandXmlElement &element, const PlaneCurve &curve) const
{
    if (!element.intersection.isGiven()) {
        return;
    }
    const auto stated = positionOf(element.intersection);
    if (const auto *position = std::get_if<PlanePoint>(&stated)) {
        const double start = seenFrom(curve.start(), *position).easting;
        const double end = seenFrom(curve.end(), *position).easting;
        const double off = std::max(std::fabs(start), std::fabs(end));
        if (off > tolerance_.length && notes_ != nullptr) {
            notes_->add(element.byte,
                        Xlate("%1 is %2 beside the tangents of the element: perhaps the element bends to the "
                              "other side")
                            .arg(QStringLiteral("PI"), QString::number(off / units_.metres, 'f', 4)));
        }
    }
}

void LandXmlGeometry::compareWithStated(const LandXmlElement &element, const Ends &ends, const PlaneCurve &curve) const
{
    const double off = distanceBetween(curve.end().point, ends.end);
    if (off > tolerance_.length && notes_ != nullptr) {
        const PlanePoint at = curve.end().point;
        const auto text = [this](PlanePoint point) {
            return QString::number(point.northing / units_.metres, 'f', 4) + u' ' +
                   QString::number(point.easting / units_.metres, 'f', 4);
        };
        notes_->add(
            element.byte,
            Xlate("%1 is %2 in the file, but %3 by its geometry").arg(QStringLiteral("End"), text(ends.end), text(at)));
    }
    if (element.kind != LandXmlElement::Kind::Spiral) {
        compareLength(element.byte, "length", element.length, curve.length());
    }
    if (element.kind == LandXmlElement::Kind::Curve) {
        compareLength(element.byte, "radius", element.radius, std::fabs(1 / curve.startCurvature()));
    }
    compareDirection(element.byte, element.kind == LandXmlElement::Kind::Line ? "dir" : "dirStart", element.direction,
                     curve.start().bearing);
    compareDirection(element.byte, "dirEnd", element.directionEnd, curve.end().bearing);
    compareIntersection(element, curve);
}

namespace
{

ProfilePoint profilePointOf(const LandXmlGradePoint &stored)
{
    using Kind = LandXmlGradePoint::Kind;
    ProfilePoint point{stored.station, stored.height};
    if (stored.kind == Kind::Circle && stored.radius != 0) {
        point.rounding = ProfilePoint::Rounding::Circle;
        point.radius = std::fabs(stored.radius); // some write it below zero for a crest
    } else if (stored.kind == Kind::Parabola && stored.length != 0) {
        point.rounding = ProfilePoint::Rounding::Parabola;
        point.lengthIn = point.lengthOut = stored.length / 2;
    } else if (stored.kind == Kind::UnsymmetricParabola) {
        point.rounding = ProfilePoint::Rounding::Parabola;
        point.lengthIn = stored.lengthIn;
        point.lengthOut = stored.lengthOut;
    }
    return point;
}

} // namespace

std::variant<LandXmlProfile, LandXmlFault> LandXmlGeometry::profileOf(const LandXmlGradeLine &line) const
{
    std::vector<ProfilePoint> points;
    std::vector<std::size_t> bytes;
    std::vector<std::size_t> vertices;
    for (const LandXmlGradePoint &stored : line.points) {
        const bool isRepeated = !points.empty() && stored.kind == LandXmlGradePoint::Kind::Point &&
                                stored.station == points.back().station && stored.height == points.back().height;
        if (!isRepeated) { // what stands twice is one point
            points.push_back(profilePointOf(stored));
            bytes.push_back(stored.byte);
        }
        vertices.push_back(points.size() - 1);
    }
    auto made = VerticalProfile::make(points);
    if (auto *heights = std::get_if<VerticalProfile>(&made)) {
        return LandXmlProfile{std::move(*heights), std::move(vertices)};
    }
    const ProfileFault fault = std::get<ProfileFault>(made);
    const std::size_t byte = fault.point < bytes.size() ? bytes[fault.point] : line.byte;
    switch (fault.kind) {
    case ProfileFault::Kind::TooFew: return LandXmlFault{Xlate("the grade line has fewer than two points"), byte};
    case ProfileFault::Kind::NotFinite:
    case ProfileFault::Kind::NoCurve:
        return LandXmlFault{Xlate("the grade line has no heights: a length or a radius above zero was expected"), byte};
    case ProfileFault::Kind::NotAhead:
        return LandXmlFault{
            Xlate("the grade line has no heights: a station ahead of that of the point before was expected"), byte};
    case ProfileFault::Kind::CurveAtEnd:
        return LandXmlFault{
            Xlate("the first or the last point of the grade line has a curve, where only one grade meets"), byte};
    case ProfileFault::Kind::Overlap: break;
    }
    return LandXmlFault{Xlate("the vertical curve begins before the curve of the point before has ended"), byte};
}

} // namespace kareport
