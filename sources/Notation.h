#pragma once

#include <optional>
#include <string_view>

namespace kareport
{

/// A station as a number, or with a plus before its last two or three whole digits, as 12+345.678, -0+075.000 or 123+45.67:
/// the plus is dropped.
bool parseStation(std::string_view text, double &number);

/// An offset as a number, or with its side after it, as 12.5R or 3.2 L, in any case; to the left is below 0.
bool parseOffset(std::string_view text, double &number);

/// An angle such as -45-30-15.5 or 45°30'15", in degrees. Minutes and seconds may be missing.
bool parseSexagesimal(std::string_view text, double &degrees);

/// An angle that is more than a number.
struct NotedAngle
{
    enum class Unit
    {
        Data, ///< that of the data's numbers
        Degree,
        Gon
    };
    double value;
    Unit unit;
};

/// An angle with marks: 45°30'15.5", 45.504°, 50.56g. The letter d is a degree mark, and so is º; ′ and ″ for those of
/// minutes and seconds. A number without a mark is none.
std::optional<NotedAngle> parseMarkedAngle(std::string_view text);

/// A bearing with marks, or one of a quadrant, clockwise from north: N 45°30'15.5" E, N45-30-15E, S 45.5 W, N 50.5g E, in
/// any case. The angle in the quadrant is a quarter of a circle at most.
/// @param quarterOfData  a quarter of a circle in the unit of the data's numbers, which one without a mark is in
std::optional<NotedAngle> parseBearing(std::string_view text, double quarterOfData);

} // namespace kareport
