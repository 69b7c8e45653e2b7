#include "Alignment.h"
#include "RandomAlignment.h"
#include "RandomRuns.h"

#include <gtest/gtest.h>

#include <limits>

namespace
{

using namespace kareport;

constexpr double pi = std::numbers::pi;

PlaneCurve curveOf(PlanePoint start, double bearing, double length, double curvature)
{
    return std::get<PlaneCurve>(
        PlaneCurve::make(TransitionForm::Clothoid, start, bearing, length, curvature, curvature));
}

/// 100 to the north, then with a corner 50 to the east.
Alignment corner()
{
    Alignment alignment;
    alignment.add(curveOf({0, 0}, 0, 100, 0));
    alignment.add(curveOf({100, 0}, pi / 2, 50, 0));
    return alignment;
}

TEST(Alignment, ADistanceIsAPlace)
{
    const Alignment alignment = corner();
    EXPECT_EQ(alignment.length(), 150);
    EXPECT_NEAR(alignment.at(30)->point.northing, 30, 1e-12);
    EXPECT_NEAR(alignment.at(120)->point.easting, 20, 1e-12);
    EXPECT_NEAR(alignment.at(100)->bearing, pi / 2, 1e-12) << "a border belongs to the element after it";
    EXPECT_NEAR(alignment.at(100, true)->bearing, 0, 1e-12) << "unless the element before it is asked for";
    EXPECT_NEAR(alignment.at(100 - 1e-9)->bearing, pi / 2, 1e-12) << "what misses it by its last digits is on it";
    EXPECT_NEAR(alignment.at(100 + 1e-9, true)->bearing, 0, 1e-12);
    EXPECT_NEAR(alignment.at(100 - 1e-6)->bearing, 0, 1e-12);
    EXPECT_NEAR(alignment.at(0, true)->bearing, 0, 1e-12) << "there is none before the start";
    EXPECT_NEAR(alignment.at(150)->point.easting, 50, 1e-12);
    EXPECT_TRUE(alignment.at(-1e-8)) << "by its last digits";
    EXPECT_TRUE(alignment.at(150 + 1e-8));
    EXPECT_FALSE(alignment.at(-0.001));
    EXPECT_FALSE(alignment.at(150.001));
    EXPECT_FALSE(alignment.at(std::numeric_limits<double>::quiet_NaN()));
    EXPECT_FALSE(Alignment().at(0)) << "there is nothing to be on";
}

TEST(Alignment, AnElementMayCountForAnotherLengthThanItsOwn)
{
    Alignment alignment;
    alignment.add(curveOf({0, 0}, 0, 100.02, 0), 100);
    alignment.add(curveOf({100.02, 0}, 0, 50, 0));
    EXPECT_EQ(alignment.length(), 150);
    EXPECT_NEAR(alignment.at(100)->point.northing, 100.02, 1e-12) << "borders are where the curves meet";
    EXPECT_NEAR(alignment.at(100, true)->point.northing, 100.02, 1e-12);
    EXPECT_NEAR(alignment.at(50)->point.northing, 50.01, 1e-12) << "the difference is spread over the element";
    EXPECT_NEAR(alignment.at(150)->point.northing, 150.02, 1e-12);
}

TEST(Alignment, ElementsAreFoundByTheirDistance)
{
    const Alignment alignment = corner();
    struct Row
    {
        double distance;
        std::size_t element;
    };
    for (const Row &row : {Row{-5, 0}, Row{0, 0}, Row{99.9, 0}, Row{100, 1}, Row{150, 1}, Row{999, 1}}) {
        EXPECT_EQ(alignment.elementAt(row.distance), row.element) << row.distance;
    }
}

TEST(Alignment, RandomElementsGoOnWithoutBreaks)
{
    RandomRuns runs("alignments", 1, 40);
    while (runs.next()) {
        RandomNumbers random(runs.seed());
        const Alignment alignment = randomAlignment(random, 30, 1 + random.below(20));
        CurvePlace before = *alignment.at(0);
        const double step = alignment.length() / 1000;
        for (int i = 1; i <= 1000; ++i) {
            const CurvePlace next = *alignment.at(step * i);
            ASSERT_LE(distanceBetween(before.point, next.point), step * (1 + 1e-6)) << "seed " << runs.seed();
            before = next;
        }
        for (const auto &element : alignment.elements()) {
            const CurvePlace ahead = *alignment.at(element.start);
            const CurvePlace back = *alignment.at(element.start, true);
            ASSERT_LT(distanceBetween(ahead.point, back.point), 1e-8) << "seed " << runs.seed();
            ASSERT_NEAR(turnBetween(ahead.bearing, back.bearing), 0, 1e-10) << "seed " << runs.seed();
        }
    }
}

} // namespace
