#include "Projection.h"

#include "CurveFeet.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace kareport
{

namespace
{

/// Gathers the places of an alignment, or the nearest alone.
class FootSearch
{
public:
    FootSearch(const Alignment &alignment, PlanePoint point, bool nearestOnly)
        : alignment_(alignment), point_(point), nearestOnly_(nearestOnly)
    {}

    std::vector<AlignmentFoot> run()
    {
        const auto &elements = alignment_.elements();
        if (nearestOnly_ && !elements.empty()) {
            const auto nearest = std::min_element(elements.begin(), elements.end(), [this](auto &left, auto &right) {
                return leastDistance(left) < leastDistance(right);
            });
            searchElement(static_cast<std::size_t>(nearest - elements.begin()));
        }
        for (std::size_t i = 0; i < elements.size(); ++i) {
            if (!nearestOnly_ || leastDistance(elements[i]) <= nearest_) {
                searchElement(i);
            }
        }
        std::stable_sort(found_.begin(), found_.end(), [](const AlignmentFoot &left, const AlignmentFoot &right) {
            return std::fabs(left.offset) < std::fabs(right.offset);
        });
        dropRepeated();
        return std::move(found_);
    }

private:
    using Kind = AlignmentFoot::Kind;

    /// What no point of an element is nearer than.
    double leastDistance(const Alignment::Element &element) const
    {
        return distanceBetween(element.middle, point_) - element.curve.length() / 2 - placeRounding;
    }

    void add(Kind kind, std::size_t index, double distance, double offset)
    {
        nearest_ = std::min(nearest_, std::fabs(offset));
        found_.push_back({kind, index, distance, offset});
    }

    void searchElement(std::size_t index)
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

    void searchStart(std::size_t index)
    {
        const Alignment::Element &element = alignment_.elements()[index];
        const CurvePlace start = element.curve.start();
        const PlanePoint seen = seenFrom(start, point_);
        if (seen.northing >= -placeRounding) {
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
        if (seen.northing <= placeRounding) {
            return;
        }
        if (index + 1 == elements.size()) {
            const double side = seen.easting < 0 ? -1 : 1;
            add(Kind::AfterEnd, index, alignment_.length(), side * distanceBetween(end.point, point_));
        } else if (nearestOnly_) {
            searchStart(index + 1); // the element after the corner may have been passed over
        }
    }

    /// The end of an element and the start of the next one are one place.
    void dropRepeated()
    {
        constexpr double same = 1e-6;
        std::vector<AlignmentFoot> kept;
        for (const AlignmentFoot &foot : found_) {
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
        found_ = std::move(kept);
    }

    const Alignment &alignment_;
    PlanePoint point_;
    bool nearestOnly_;
    double nearest_ = std::numeric_limits<double>::infinity();
    std::vector<AlignmentFoot> found_;
};

} // namespace

std::vector<AlignmentFoot> feetOn(const Alignment &alignment, PlanePoint point)
{
    return FootSearch(alignment, point, false).run();
}

std::optional<AlignmentFoot> nearestFoot(const Alignment &alignment, PlanePoint point)
{
    const std::vector<AlignmentFoot> found = FootSearch(alignment, point, true).run();
    return found.empty() ? std::nullopt : std::optional(found.front());
}

} // namespace kareport
