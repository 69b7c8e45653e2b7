#pragma once

#include "CurveFit.h"
#include "LandXmlGeometry.h"

#include <cmath>

namespace kareport
{

// What the geometry of all kinds of elements has in common.

/// The ends of an element, as they are stored.
struct LandXmlEnds
{
    PlanePoint start;
    PlanePoint end;
};

/// Whether a file states a number.
inline bool isGiven(double number)
{
    return !std::isnan(number);
}

/// Whether an element bends to the right; nothing where the file does not say.
std::optional<bool> isToTheRight(const LandXmlElement &element);
/// Where coordinates are, or why that is not known.
std::variant<PlanePoint, LandXmlFault> positionOf(const LandXmlCoordinates &at);
/// The geometry of an element that is one curve.
LandXmlCurves resultOf(const LandXmlElement &element, const FittedCurve &fitted);
/// Why there is no curve.
QString textOf(CurveFault fault);
/// Says that an element has no geometry because something is missing. @param what  its name in the file
QString missingGeometry(const char *what);
/// A text of the file for a message, cut short.
QString shortText(const std::string &text);

/// The arc of a curve. @param tolerance  of lengths, in metres
LandXmlCurves arcOf(const LandXmlElement &element, const LandXmlEnds &ends, double tolerance);

} // namespace kareport
