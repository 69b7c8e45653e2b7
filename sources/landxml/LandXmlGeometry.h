#pragma once

#include "LandXmlComparison.h"
#include "LandXmlModel.h"
#include "PlaneCurve.h"

#include <QString>

#include <cstddef>
#include <variant>
#include <vector>

namespace kareport
{

/// Why an element has no geometry, and its place in the file.
struct LandXmlFault
{
    QString text;
    std::size_t byte;
};

/// The curves of an element, one after the other. An irregular line has several.
using LandXmlCurves = std::variant<std::vector<PlaneCurve>, LandXmlFault>;

/// The curves of an element whose references are resolved, or why there are none. What the file states of it besides is
/// compared with them.
LandXmlCurves curvesOf(const LandXmlElement &element, LandXmlComparison &comparison);

} // namespace kareport
