#pragma once

#include "Alignment.h"

#include <cstddef>
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
/// The nearest of them; nothing where the numbers are too large to have one, and on an alignment without elements. For many
/// points, `NearestFoot` is faster.
std::optional<AlignmentFoot> nearestFoot(const Alignment &alignment, PlanePoint point);

/// Finds the nearest places of many points. What a point costs grows with the logarithm of the number of elements.
class NearestFoot
{
public:
    /// @param alignment  must outlive this object, unchanged
    explicit NearestFoot(const Alignment &alignment);

    std::optional<AlignmentFoot> of(PlanePoint point) const;

private:
    /// What an element, or those under a node, lie in.
    struct Box
    {
        PlanePoint low;
        PlanePoint high;
    };
    class Search;

    static Box boxOf(const Alignment::Element &element);
    static Box boxAround(const Box &left, const Box &right);

    const Alignment &alignment_;
    std::size_t leaves_;     ///< the elements and empty ones up to a power of two
    std::vector<Box> boxes_; ///< of a binary tree: the root at 1, the two below a node at twice its index
};

} // namespace kareport
