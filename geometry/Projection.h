#pragma once

#include "Alignment.h"

#include <optional>
#include <vector>

namespace kareport
{

/// A place on an alignment to which a point may belong.
struct AlignmentFoot
{
    enum class Kind
    {
        Perpendicular,
        Corner,      ///< the point is outside of a corner, where the alignment has no one direction
        BeforeStart, ///< nearest is the start, from which the point lies back
        AfterEnd,    ///< nearest is the end, from which the point lies ahead
        Undetermined ///< the point is at the centre of an element, all of which lies around it
    };

    Kind kind;
    std::size_t element; ///< index; of a corner, the element after it
    double distance;     ///< along the alignment; of an undetermined one, the middle of the element
    double offset;       ///< of the point from there, positive to the right; but at a right angle, the distance to the
                         ///< place, of the sign of the side that the point is on
};

/// All places of an alignment to which a point may belong, the nearest first.
std::vector<AlignmentFoot> feetOn(const Alignment &alignment, PlanePoint point);
/// The nearest of them. Elements that are farther away cost next to nothing.
std::optional<AlignmentFoot> nearestFoot(const Alignment &alignment, PlanePoint point);

} // namespace kareport
