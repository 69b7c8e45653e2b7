#include "LandXmlComparison.h"

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
            note(direction.byte, direction.what,
                 landXmlAngleText(normalizedBearing(direction.stated), units_.direction),
                 landXmlAngleText(normalizedBearing(best(direction.bearing)), units_.direction));
        }
    }
    directions_.clear();
}

void LandXmlComparison::end(std::size_t byte, PlanePoint stated, PlanePoint computed)
{
    if (!(distanceBetween(stated, computed) <= tolerance_.length)) {
        const auto text = [this](PlanePoint point) {
            return lengthText(point.northing) + u' ' + lengthText(point.easting);
        };
        note(byte, "End", text(stated), text(computed));
    }
}

void LandXmlComparison::gap(std::size_t byte, double width)
{
    if (!(width <= tolerance_.length)) {
        notes_.add(byte, Xlate("the element begins %1 from the end of the element before").arg(lengthText(width)));
    }
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
    const QString angle = landXmlAngleText(turnBetween(end, start), units_.angle);
    if (fits(end, mirrored(curve, start)) || fits(mirrored(before, end), start)) {
        notes_.add(byte,
                   Xlate("the element begins at an angle of %1 to the end of the element before: perhaps one of them "
                         "bends to the other side")
                       .arg(angle));
    } else if (isTransition(before) || isTransition(curve)) {
        notes_.add(byte, Xlate("the element begins at an angle of %1 to the end of the element before").arg(angle));
    }
}

void LandXmlComparison::intersection(std::size_t byte, PlanePoint stated, const PlaneCurve &curve)
{
    const double start = seenFrom(curve.start(), stated).easting;
    const double end = seenFrom(curve.end(), stated).easting;
    const double off = std::max(std::fabs(start), std::fabs(end));
    if (!(off <= tolerance_.length)) {
        notes_.add(byte,
                   Xlate("%1 is %2 beside the tangents of the element: perhaps the element bends to the other side")
                       .arg(QStringLiteral("PI"), lengthText(off)));
    }
}

} // namespace kareport
