#pragma once

namespace kareport
{

/// What lengths, stations, coordinates and elevations are shown in.
enum class LengthUnit
{
    Metre,             ///< 1 m
    Millimetre,        ///< 0.001 m
    Kilometre,         ///< 1000 m
    InternationalFoot, ///< 0.3048 m
    UsSurveyFoot       ///< 1200/3937 m
};

/// What areas are shown in.
enum class AreaUnit
{
    SquareMetre,     ///< 1 m²
    Hectare,         ///< 10000 m²
    SquareKilometre, ///< 1000000 m²
    SquareFoot,      ///< 0.09290304 m²
    Acre             ///< 4046.8564224 m²
};

/// What angles are shown in.
enum class AngleUnit
{
    Degree, ///< a 360th of a circle
    Gon,    ///< a 400th of a circle
    Radian  ///< the internal unit
};

} // namespace kareport
