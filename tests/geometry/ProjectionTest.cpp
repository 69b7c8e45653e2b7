#include "Projection.h"
#include "RandomAlignment.h"
#include "RandomRuns.h"

#include <gtest/gtest.h>

#include <limits>

namespace
{

using namespace kareport;
using Kind = AlignmentFoot::Kind;

constexpr double pi = std::numbers::pi;

PlaneCurve curveOf(TransitionForm form, double length, double first, double last, PlanePoint start = {},
                   double bearing = 0)
{
    return std::get<PlaneCurve>(PlaneCurve::make(form, start, bearing, length, first, last));
}

TEST(Projection, StationToPointToStation)
{
    RandomRuns runs("there and back", 1, 60);
    while (runs.next()) {
        RandomNumbers random(runs.seed());
        // Up to thirty kilometres an element: a thousand in all.
        const Alignment alignment = randomAlignment(random, 20, std::pow(10.0, random.below(25) / 10.0));
        for (int i = 0; i < 20; ++i) {
            const double distance = alignment.length() * random.below(100000) / 100000;
            const double offset = random.below(40) - 20;
            const CurvePlace place = *alignment.at(distance);
            const PlanePoint point = pointBeside(place.point, place.bearing, offset);
            const auto feet = feetOn(alignment, point);
            EXPECT_TRUE(std::any_of(feet.begin(), feet.end(),
                                    [&](const AlignmentFoot &foot) {
                                        return foot.kind == Kind::Perpendicular &&
                                               std::fabs(foot.distance - distance) < 1e-6 &&
                                               std::fabs(foot.offset - offset) < 1e-6;
                                    }))
                << "seed " << runs.seed() << ", distance " << distance << ", offset " << offset;
            const auto nearest = nearestFoot(alignment, point);
            ASSERT_TRUE(nearest) << "seed " << runs.seed();
            EXPECT_NEAR(std::fabs(nearest->offset), std::fabs(feet.front().offset), 1e-7) << "seed " << runs.seed();
            EXPECT_LE(std::fabs(nearest->offset), std::fabs(offset) + 1e-7) << "seed " << runs.seed();
        }
    }
}

/// 100 to the north, 100 to the east, 30 to the south.
Alignment hook()
{
    Alignment alignment;
    alignment.add(curveOf(TransitionForm::Clothoid, 100, 0, 0));
    alignment.add(curveOf(TransitionForm::Clothoid, 100, 0, 0, {100, 0}, pi / 2));
    alignment.add(curveOf(TransitionForm::Clothoid, 30, 0, 0, {100, 100}, pi));
    return alignment;
}

TEST(Projection, OutsideOfCornersAndEndsThePlaceIsTheCornerOrTheEnd)
{
    struct Row
    {
        PlanePoint point;
        Kind kind;
        double distance, offset;
        const char *reason;
    };
    const Row rows[] = {
        {{50, 10}, Kind::Perpendicular, 50, 10, "the nearest of several"},
        {{90, 30}, Kind::Perpendicular, 130, 10, "nearer to the second line"},
        {{103, -4}, Kind::Corner, 100, -5, "outside of the first corner, which is to its left"},
        {{104, 103}, Kind::Corner, 200, -5, "outside of the second corner"},
        {{-3, 4}, Kind::BeforeStart, 0, 5, "back from the start, on its right side"},
        {{-3, -4}, Kind::BeforeStart, 0, -5, "on its left side"},
        {{67, 96}, Kind::AfterEnd, 230, 5, "ahead of the end"},
        {{67, 104}, Kind::AfterEnd, 230, -5, "on its left side"},
    };
    const Alignment alignment = hook();
    for (const Row &row : rows) {
        const auto feet = feetOn(alignment, row.point);
        const auto nearest = nearestFoot(alignment, row.point);
        ASSERT_TRUE(nearest) << row.reason;
        for (const AlignmentFoot &foot : {feet.front(), *nearest}) {
            EXPECT_EQ(foot.kind, row.kind) << row.reason;
            EXPECT_NEAR(foot.distance, row.distance, 1e-9) << row.reason;
            EXPECT_NEAR(foot.offset, row.offset, 1e-9) << row.reason;
        }
    }
}

TEST(Projection, AllPlacesAreToldTheNearestFirst)
{
    const auto feet = feetOn(hook(), {80, 40});
    ASSERT_EQ(feet.size(), 3U);
    EXPECT_NEAR(feet[0].distance, 140, 1e-9);
    EXPECT_NEAR(feet[0].offset, 20, 1e-9);
    EXPECT_NEAR(feet[1].distance, 80, 1e-9);
    EXPECT_NEAR(feet[1].offset, 40, 1e-9);
    EXPECT_NEAR(feet[2].distance, 220, 1e-9);
    EXPECT_NEAR(feet[2].offset, 60, 1e-9);
}

TEST(Projection, ABorderThatIsSmoothIsOnePlace)
{
    Alignment alignment;
    alignment.add(curveOf(TransitionForm::Clothoid, 100, 0, 0));
    alignment.add(curveOf(TransitionForm::Clothoid, 50, 0, 0.01, {100, 0}, 0));
    for (const double offset : {-7.0, 7.0}) {
        const auto feet = feetOn(alignment, {100, offset});
        ASSERT_EQ(feet.size(), 1U) << offset;
        EXPECT_EQ(feet[0].kind, Kind::Perpendicular);
        EXPECT_NEAR(feet[0].distance, 100, 1e-9);
    }
}

TEST(Projection, ACentreIsSaidWhereItIsNearest)
{
    Alignment alignment;
    alignment.add(curveOf(TransitionForm::Clothoid, 50 * pi, 0.02, 0.02));
    const auto nearest = nearestFoot(alignment, {0, 50});
    ASSERT_TRUE(nearest);
    EXPECT_EQ(nearest->kind, Kind::Undetermined);
    EXPECT_NEAR(nearest->offset, 50, 1e-9);
    EXPECT_NEAR(nearest->distance, 25 * pi, 1e-9);
    alignment.add(curveOf(TransitionForm::Clothoid, 300, 0, 0, {-100, 40}, 0));
    EXPECT_EQ(nearestFoot(alignment, {0, 50})->kind, Kind::Perpendicular) << "another element is nearer";
    EXPECT_FALSE(nearestFoot(Alignment(), {0, 0})) << "there is nothing to belong to";
}

TEST(Projection, TheNearestPlaceOfManyPointsIsTheFirstOfAll)
{
    RandomRuns runs("nearest", 1, 10);
    while (runs.next()) {
        RandomNumbers random(runs.seed());
        const Alignment alignment = randomAlignment(random, 1 + random.below(150), 1);
        const NearestFoot tree(alignment);
        const PlanePoint middle = alignment.at(alignment.length() / 2)->point;
        for (int i = 0; i < 50; ++i) {
            const PlanePoint point =
                middle + PlanePoint{double(random.below(20000) - 10000), double(random.below(20000) - 10000)};
            const auto nearest = tree.of(point);
            ASSERT_TRUE(nearest) << "seed " << runs.seed();
            EXPECT_NEAR(std::fabs(nearest->offset), std::fabs(feetOn(alignment, point).front().offset), 1e-7)
                << "seed " << runs.seed();
        }
    }
}

TEST(Projection, NumbersThatAreTooLargeHaveNoPlace)
{
    Alignment alignment;
    alignment.add(curveOf(TransitionForm::Clothoid, 100, 0, 0, {-1.7e308, 1.7e308}, pi / 4));
    EXPECT_FALSE(nearestFoot(alignment, {1.7e308, -1.7e308})) << "neither ahead nor back can be told";
    EXPECT_FALSE(nearestFoot(hook(), {std::numeric_limits<double>::quiet_NaN(), 0}));
}

} // namespace
