#pragma once

namespace kareport
{

/// What the values of a type measure. Only values of one measure are added to and compared with each other.
enum class Measure
{
    Number, ///< without a unit
    Length,
    Area,
    Angle,
    Thickness, ///< some of its numbers are codes, such as "the layer's own"
    Truth,
    Text
};

Measure measureOf(int type);
/// Whether values of a type have an order of numbers.
bool isNumeric(int type);
/// Whether values of a type can be added up: a sum of directions says nothing.
bool isAdded(int type);

} // namespace kareport
