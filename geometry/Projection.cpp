#include "Projection.h"

#include "CurveFeet.h"

#include <algorithm>
#include <bit>
#include <cmath>
#include <limits>
#include <utility>

namespace kareport
{

namespace
{

/// What no point of an element is nearer than.
double leastDistance(const Alignment::Element &element, PlanePoint point)
{
    return distanceBetween(element.middle, point) - element.curve.length() / 2 - placeRounding;
}

/// Gathers the places that elements have for a point.
class FootSearch
{
public:
    FootSearch(const Alignment &alignment, PlanePoint point) : alignment_(alignment), point_(point) {}

    const std::vector<AlignmentFoot> &found() const { return found_; }
    /// The distance of the nearest place that was found.
    double nearest() const { return nearest_; }

    /// Searches an element, and the corners at its ends.
    void search(std::size_t index)
    {
        const Alignment::Element &element = alignment_.elements()[index];
        const CurveFeet feet = feetOn(element.curve, point_);
        const double scale = element.length / element.curve.length();
        for (const CurveFoot &foot : feet.feet) {
            add(Kind::Perpendicular, index, element.start + foot.length * scale, foot.offset);
        }
        if (feet.isUndetermined) {
            add(Kind::Undetermined, index, element.start + element.length / 2,
                seenFrom(element.curve.at(element.curve.length() / 2), point_).easting);
        }
        searchStart(index);
        searchEnd(index);
    }

private:
    using Kind = AlignmentFoot::Kind;

    void add(Kind kind, std::size_t index, double distance, double offset)
    {
        nearest_ = std::min(nearest_, std::fabs(offset));
        found_.push_back({kind, index, distance, offset});
    }

    void searchStart(std::size_t index)
    {
        const Alignment::Element &element = alignment_.elements()[index];
        const CurvePlace start = element.curve.start();
        const PlanePoint seen = seenFrom(start, point_);
        if (!(seen.northing < -placeRounding)) {
            return;
        }
        const double side = seen.easting < 0 ? -1 : 1;
        const double offset = side * distanceBetween(start.point, point_);
        if (index == 0) {
            add(Kind::BeforeStart, index, element.start, offset);
            return;
        }
        const CurvePlace before = alignment_.elements()[index - 1].curve.end();
        if (seenFrom(before, point_).northing > placeRounding) {
            add(Kind::Corner, index, element.start, offset);
        }
    }

    void searchEnd(std::size_t index)
    {
        const auto &elements = alignment_.elements();
        const CurvePlace end = elements[index].curve.end();
        const PlanePoint seen = seenFrom(end, point_);
        if (!(seen.northing > placeRounding)) {
            return;
        }
        if (index + 1 < elements.size()) {
            searchStart(index + 1); // the element after the corner may be left out as farther away
            return;
        }
        const double side = seen.easting < 0 ? -1 : 1;
        add(Kind::AfterEnd, index, alignment_.length(), side * distanceBetween(end.point, point_));
    }

    const Alignment &alignment_;
    PlanePoint point_;
    double nearest_ = std::numeric_limits<double>::infinity();
    std::vector<AlignmentFoot> found_;
};

bool isNearer(const AlignmentFoot &left, const AlignmentFoot &right)
{
    const double leftOffset = std::fabs(left.offset);
    const double rightOffset = std::fabs(right.offset);
    return leftOffset < rightOffset || (leftOffset == rightOffset && left.distance < right.distance);
}

/// The end of an element and the start of the next one are one place.
std::vector<AlignmentFoot> withoutRepeated(const std::vector<AlignmentFoot> &found)
{
    constexpr double same = 1e-6;
    std::vector<AlignmentFoot> kept;
    for (const AlignmentFoot &foot : found) {
        bool isNew = true;
        for (auto other = kept.rbegin(); isNew && other != kept.rend(); ++other) {
            if (std::fabs(other->offset) < std::fabs(foot.offset) - same) {
                break;
            }
            isNew = other->kind != foot.kind || std::fabs(other->distance - foot.distance) > same;
        }
        if (isNew) {
            kept.push_back(foot);
        }
    }
    return kept;
}

} // namespace

std::vector<AlignmentFoot> feetOn(const Alignment &alignment, PlanePoint point)
{
    FootSearch search(alignment, point);
    for (std::size_t i = 0; i < alignment.elements().size(); ++i) {
        search.search(i);
    }
    std::vector<AlignmentFoot> found = search.found();
    std::sort(found.begin(), found.end(), isNearer);
    return withoutRepeated(found);
}

std::optional<AlignmentFoot> nearestFoot(const Alignment &alignment, PlanePoint point)
{
    return NearestFoot(alignment).of(point);
}

/// Walks down the tree, the nearer box first, and leaves out what is farther away than a place that was found.
class NearestFoot::Search
{
public:
    Search(const NearestFoot &tree, PlanePoint point) : tree_(tree), point_(point), feet_(tree.alignment_, point) {}

    void visit(std::size_t node)
    {
        if (node >= tree_.leaves_) {
            const std::size_t index = node - tree_.leaves_;
            const auto &elements = tree_.alignment_.elements();
            if (index < elements.size() && leastDistance(elements[index], point_) <= feet_.nearest()) {
                feet_.search(index);
            }
            return;
        }
        std::size_t first = 2 * node;
        std::size_t second = first + 1;
        double nearer = distanceTo(first);
        double farther = distanceTo(second);
        if (farther < nearer) {
            std::swap(first, second);
            std::swap(nearer, farther);
        }
        if (nearer <= feet_.nearest()) {
            visit(first);
        }
        if (farther <= feet_.nearest()) {
            visit(second);
        }
    }

    const std::vector<AlignmentFoot> &found() const { return feet_.found(); }

private:
    double distanceTo(std::size_t node) const
    {
        const Box &box = tree_.boxes_[node];
        const double northing =
            std::max({box.low.northing - point_.northing, point_.northing - box.high.northing, 0.0});
        const double easting = std::max({box.low.easting - point_.easting, point_.easting - box.high.easting, 0.0});
        return std::hypot(northing, easting) - placeRounding;
    }

    const NearestFoot &tree_;
    PlanePoint point_;
    FootSearch feet_;
};

NearestFoot::NearestFoot(const Alignment &alignment)
    : alignment_(alignment), leaves_(std::bit_ceil(alignment.elements().size()))
{
    constexpr double infinite = std::numeric_limits<double>::infinity();
    boxes_.assign(2 * leaves_, Box{{infinite, infinite}, {-infinite, -infinite}});
    for (std::size_t i = 0; i < alignment.elements().size(); ++i) {
        boxes_[leaves_ + i] = boxOf(alignment.elements()[i]);
    }
    for (std::size_t node = leaves_ - 1; node > 0; --node) {
        boxes_[node] = boxAround(boxes_[2 * node], boxes_[2 * node + 1]);
    }
}

NearestFoot::Box NearestFoot::boxOf(const Alignment::Element &element)
{
    const double half = element.curve.length() / 2;
    return {element.middle - PlanePoint{half, half}, element.middle + PlanePoint{half, half}};
}

NearestFoot::Box NearestFoot::boxAround(const Box &left, const Box &right)
{
    return {{std::min(left.low.northing, right.low.northing), std::min(left.low.easting, right.low.easting)},
            {std::max(left.high.northing, right.high.northing), std::max(left.high.easting, right.high.easting)}};
}

std::optional<AlignmentFoot> NearestFoot::of(PlanePoint point) const
{
    Search search(*this, point);
    search.visit(1);
    const auto &found = search.found();
    const auto nearest = std::min_element(found.begin(), found.end(), isNearer);
    return nearest == found.end() ? std::nullopt : std::optional(*nearest);
}

} // namespace kareport
