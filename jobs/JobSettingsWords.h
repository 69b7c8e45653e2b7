#pragma once

#include <QStringView>

#include <array>

namespace kareport
{

// The words of settings in a job, in the order of the values that they mean.
inline constexpr std::array<QStringView, 3> stationFormats = {u"plain", u"0+00", u"0+000"};
inline constexpr std::array<QStringView, 2> northEastOrders = {u"EN", u"NE"};
inline constexpr std::array<QStringView, 3> bearingUnits = {u"dms", u"deg", u"gon"};
inline constexpr std::array<QStringView, 2> bearingStyles = {u"circle", u"quadrant"};
inline constexpr std::array<QStringView, 2> bearingReferences = {u"north", u"south"};

} // namespace kareport
