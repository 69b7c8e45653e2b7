#pragma once

#include "PlaneCurve.h"

#include <cstddef>
#include <optional>
#include <vector>

namespace kareport
{

/// Curves one after the other, walked through from start to end. Places on it are given by the distance along it from its
/// start.
class Alignment
{
public:
    /// A curve and the length that it counts for. A file may state a length that differs from the curve's by what its
    /// points are rounded to; distances then follow the file.
    struct Element
    {
        PlaneCurve curve;
        double length;
        double start;      ///< the distance of its start
        PlanePoint middle; ///< half way along the curve: no point of it is farther from there than half its length
    };

    /// Adds a curve at the end. @param length  above zero
    void add(const PlaneCurve &curve, double length);
    void add(const PlaneCurve &curve) { add(curve, curve.length()); }

    const std::vector<Element> &elements() const { return elements_; }
    double length() const { return length_; }

    /// The index of the element at a distance. A border belongs to the element after it, the end to the last one; what is
    /// outside belongs to the first or the last. The alignment must have an element.
    std::size_t elementAt(double distance) const;
    /// The place at a distance; nothing outside the alignment, beyond the rounding of a distance's last digits, and of an
    /// alignment without elements.
    /// @param before  at a border, the place on the element before it
    std::optional<CurvePlace> at(double distance, bool before = false) const;

private:
    std::vector<Element> elements_;
    double length_ = 0;
};

} // namespace kareport
