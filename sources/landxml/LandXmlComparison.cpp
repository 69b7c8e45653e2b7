#include "LandXmlComparison.h"

#include "CurveFit.h"
#include "Xlate.h"

#include <algorithm>
#include <cmath>
#include <iterator>

namespace kareport
{

namespace
{

/// The ways in which directions are measured. Each turns a direction into a bearing, and a bearing into a direction.
constexpr double (*readings[])(double) = {
    [](double angle) { return angle; },                        // clockwise from north
    [](double angle) { return -angle; },                       // counterclockwise from north
    [](double angle) { return std::numbers::pi / 2 - angle; }, // counterclockwise from east
};

/// What a bearing at an end of a curve would be, if the curve bent to the other side of its chord.
double mirrored(const PlaneCurve &curve, double bearing)
{
    return 2 * bearingBetween(curve.start().point, curve.end().point) - bearing;
}

bool isTransition(const PlaneCurve &curve)
{
    return !curve.isLine() && !curve.isArc();
}

} // namespace

void LandXmlComparison::note(std::size_t byte, const char *what, const QString &stated, const QString &computed)
{
    notes_.add(byte,
               Xlate("%1 is %2 in the file, but %3 by its geometry").arg(QString::fromUtf8(what), stated, computed));
}

QString LandXmlComparison::lengthText(double metres) const
{
    return QString::number(metres / units_.metres, 'f', 4);
}

QString LandXmlComparison::pointText(PlanePoint point) const
{
    return lengthText(point.northing) + u' ' + lengthText(point.easting);
}

QString LandXmlComparison::bearingText(double bearing) const
{
    return landXmlAngleText(normalizedBearing(bearing), units_.direction);
}

void LandXmlComparison::length(std::size_t byte, const char *what, double stated, double computed)
{
    if (!std::isnan(stated) && !(std::fabs(stated - computed) <= tolerance_.length)) {
        note(byte, what, lengthText(stated), lengthText(computed));
    }
}

void LandXmlComparison::area(std::size_t byte, const char *what, double stated, double computed)
{
    const double allowed = std::max(0.1, 0.001 * stated) * (tolerance_.length / LandXmlTolerance().length);
    if (!std::isnan(stated) && !(std::fabs(stated - computed) <= allowed)) {
        note(byte, what, QString::number(stated / units_.squareMetres, 'f', 4),
             QString::number(computed / units_.squareMetres, 'f', 4));
    }
}

/// How far the direction of an element may be off, when its points are by the tolerance of lengths: its ends, or the centre that
/// it turns about.
double LandXmlComparison::allowedTurn(const PlaneCurve &curve) const
{
    const double bend = std::max(std::fabs(curve.startCurvature()), std::fabs(curve.endCurvature()));
    return std::max(tolerance_.angle, tolerance_.length * std::max(1 / curve.length(), bend));
}

void LandXmlComparison::direction(std::size_t byte, const char *what, double stated, double bearing,
                                  const PlaneCurve &curve)
{
    if (!std::isnan(stated)) {
        directions_.push_back({byte, what, stated, bearing, allowedTurn(curve)});
    }
}

void LandXmlComparison::noteDirections()
{
    const auto fits = [](const Direction &direction, double (*reading)(double)) {
        return std::fabs(turnBetween(reading(direction.stated), direction.bearing)) <= direction.allowed;
    };
    std::ptrdiff_t most = -1;
    double (*best)(double) = nullptr;
    for (const auto reading : readings) {
        const auto count = std::count_if(directions_.begin(), directions_.end(),
                                         [&](const Direction &direction) { return fits(direction, reading); });
        if (count > most) {
            most = count;
            best = reading;
        }
    }
    for (const Direction &direction : directions_) {
        if (!fits(direction, best)) {
            note(direction.byte, direction.what, bearingText(direction.stated), bearingText(best(direction.bearing)));
        }
    }
    directions_.clear();
}

void LandXmlComparison::end(std::size_t byte, PlanePoint stated, PlanePoint computed)
{
    if (!(distanceBetween(stated, computed) <= tolerance_.length)) {
        note(byte, "End", pointText(stated), pointText(computed));
    }
}

void LandXmlComparison::gap(std::size_t byte, PlanePoint before, PlanePoint start)
{
    const double width = distanceBetween(before, start);
    if (!(width <= tolerance_.length)) {
        notes_.add(byte, Xlate("the element begins %1 from the end of the element before: at %2, but that ends at %3")
                             .arg(lengthText(width), pointText(start), pointText(before)));
    }
}

void LandXmlComparison::shortWay(std::size_t byte)
{
    notes_.add(byte,
               Xlate("the curve has no Center, length, delta or PI that says which way round it goes: the shorter "
                     "arc of its radius was taken"));
}

void LandXmlComparison::corner(std::size_t byte, const PlaneCurve &before, const PlaneCurve &curve)
{
    if (before.isLine() && curve.isLine()) {
        return; // lines may meet at any angle
    }
    const double end = before.end().bearing;
    const double start = curve.start().bearing;
    const double allowed = allowedTurn(before) + allowedTurn(curve);
    const auto fits = [allowed](double from, double to) { return std::fabs(turnBetween(from, to)) <= allowed; };
    if (fits(end, start)) {
        return;
    }
    const auto add = [&](const QString &text) {
        notes_.add(byte, text.arg(landXmlAngleText(turnBetween(end, start), units_.angle), bearingText(start),
                                  bearingText(end)));
    };
    if (fits(end, mirrored(curve, start)) || fits(mirrored(before, end), start)) {
        add(Xlate("the element begins at an angle of %1 to the end of the element before, with bearing %2 after %3: "
                  "perhaps one of them bends to the other side"));
    } else if (isTransition(before) || isTransition(curve)) {
        add(Xlate("the element begins at an angle of %1 to the end of the element before, with bearing %2 after %3"));
    }
}

void LandXmlComparison::intersection(std::size_t byte, PlanePoint stated, const PlaneCurve &curve)
{
    const double start = seenFrom(curve.start(), stated).easting;
    const double end = seenFrom(curve.end(), stated).easting;
    const double off = std::max(std::fabs(start), std::fabs(end));
    if (off <= tolerance_.length) {
        return;
    }
    const auto computed = tangentIntersection(curve);
    const QString text =
        computed ? Xlate("PI is %1 in the file, but %2 by its geometry: %3 beside the tangents of the element, which "
                         "perhaps bends to the other side")
                       .arg(pointText(stated), pointText(*computed), lengthText(off))
                 : Xlate("PI is %1 in the file, but the tangents of the element are parallel").arg(pointText(stated));
    notes_.add(byte, text);
}

} // namespace kareport
