#pragma once

#include "PlaneCurve.h"

#include <QString>

#include <cmath>
#include <cstddef>
#include <limits>
#include <optional>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace kareport
{

/// A value of a row: none, a number in metres, square metres or radians, or a text in UTF-8.
using LandXmlValue = std::variant<std::monostate, double, std::string_view>;

/// A number that may be missing.
inline LandXmlValue valueOf(double number)
{
    return std::isnan(number) ? LandXmlValue() : LandXmlValue(number);
}
inline LandXmlValue valueOf(const std::optional<double> &number)
{
    return number ? LandXmlValue(*number) : LandXmlValue();
}
inline LandXmlValue valueOf(const std::string &text)
{
    return text.empty() ? LandXmlValue() : LandXmlValue(std::string_view(text));
}
inline LandXmlValue countOf(std::size_t number)
{
    return static_cast<double>(number);
}

// Parts of a place that may be missing.
inline LandXmlValue northingOf(const std::optional<PlanePoint> &point)
{
    return point ? valueOf(point->northing) : LandXmlValue();
}
inline LandXmlValue eastingOf(const std::optional<PlanePoint> &point)
{
    return point ? valueOf(point->easting) : LandXmlValue();
}
inline LandXmlValue northingOf(const std::optional<CurvePlace> &place)
{
    return place ? valueOf(place->point.northing) : LandXmlValue();
}
inline LandXmlValue eastingOf(const std::optional<CurvePlace> &place)
{
    return place ? valueOf(place->point.easting) : LandXmlValue();
}
inline LandXmlValue bearingOf(const std::optional<CurvePlace> &place)
{
    return place ? valueOf(place->bearing) : LandXmlValue();
}
/// The radius of a curvature, without its side; infinite where it is straight.
inline double radiusOf(double curvature)
{
    return curvature == 0 ? std::numeric_limits<double>::infinity() : std::fabs(1 / curvature);
}

/// The radius of a curvature, positive to the right; infinite where it is straight, which is on neither side.
inline double signedRadiusOf(double curvature)
{
    return std::copysign(radiusOf(curvature), curvature == 0 ? 1 : curvature);
}

/// A variable that rows have.
struct LandXmlVariable
{
    QString name;
    int type; ///< the value type that suits it
};

/// A variable of rows of one class, and what gives its value.
template <typename Rows>
struct LandXmlGetter
{
    const char *name;
    int type;
    LandXmlValue (*get)(const Rows &rows);
};

/// The variables of rows by their getters.
template <typename Rows, std::size_t count>
std::vector<LandXmlVariable> variablesOf(const LandXmlGetter<Rows> (&getters)[count])
{
    std::vector<LandXmlVariable> variables;
    for (const LandXmlGetter<Rows> &getter : getters) {
        variables.push_back({QString::fromLatin1(getter.name), getter.type});
    }
    return variables;
}

} // namespace kareport
