#pragma once

#include "LandXmlGeometry.h"
#include "VerticalProfile.h"

#include <cstddef>
#include <variant>
#include <vector>

namespace kareport
{

/// A grade line with its heights.
struct LandXmlProfile
{
    VerticalProfile heights;
    std::vector<std::size_t> vertices; ///< of the stored points: which vertex each is
};

/// The heights of a grade line, or why there are none.
std::variant<LandXmlProfile, LandXmlFault> profileOf(const LandXmlGradeLine &line);

} // namespace kareport
