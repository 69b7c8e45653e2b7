#include "CurveFeet.h"
#include "RandomAlignment.h"
#include "RandomRuns.h"

#include <gtest/gtest.h>

#include <limits>

namespace
{

using namespace kareport;

constexpr double pi = std::numbers::pi;

PlaneCurve curveOf(TransitionForm form, double length, double first, double last, PlanePoint start = {},
                   double bearing = 0)
{
    return std::get<PlaneCurve>(PlaneCurve::make(form, start, bearing, length, first, last));
}

PlaneCurve arcOf(double length, double curvature)
{
    return curveOf(TransitionForm::Clothoid, length, curvature, curvature);
}

TEST(CurveFeet, FeetOnLinesAndArcsAreThoseOfTheFormulas)
{
    struct Row
    {
        PlaneCurve curve;
        PlanePoint point;
        std::vector<std::pair<double, double>> feet; ///< lengths and offsets
        const char *reason;
    };
    const PlaneCurve line = arcOf(100, 0);
    const PlaneCurve quarter = arcOf(50 * pi, 0.01); // about (0, 100), from its west side to its north side
    const PlaneCurve full = arcOf(200 * pi, -0.01);  // about (0, -100)
    const Row rows[] = {
        {line, {40, 3}, {{40, 3}}, "to the right"},
        {line, {40, -3}, {{40, -3}}, "to the left"},
        {line, {100.001, 3}, {}, "after the end"},
        {line, {-0.001, 3}, {}, "before the start"},
        {line, {100 + 1e-8, 3}, {{100, 3}}, "after the end by the rounding of coordinates"},
        {quarter, {0, 10}, {{0, 10}}, "inside, to the right, at the start"},
        {quarter, {90, 100}, {{50 * pi, 10}}, "inside, at the end"},
        {quarter, {110, 100}, {{50 * pi, -10}}, "outside"},
        {quarter, {-std::sqrt(50), 100 + std::sqrt(50)}, {{25 * pi, 110}}, "on the far side of the centre"},
        {quarter, {-50, 0}, {}, "beside neither half of its circle"},
        {full,
         {0, -90},
         {{0, -90}, {100 * pi, -110}, {200 * pi, -90}},
         "a full circle is met twice, and where it closes"},
        {full, {0, 10}, {{0, 10}, {100 * pi, -210}, {200 * pi, 10}}, "from outside as well"},
    };
    for (const Row &row : rows) {
        const CurveFeet found = feetOn(row.curve, row.point);
        EXPECT_FALSE(found.isUndetermined) << row.reason;
        ASSERT_EQ(found.feet.size(), row.feet.size()) << row.reason;
        for (std::size_t i = 0; i < row.feet.size(); ++i) {
            EXPECT_NEAR(found.feet[i].length, row.feet[i].first, 1e-9) << row.reason;
            EXPECT_NEAR(found.feet[i].offset, row.feet[i].second, 1e-9) << row.reason;
        }
    }
}

TEST(CurveFeet, APointAtACentreBelongsNowhere)
{
    EXPECT_TRUE(feetOn(arcOf(50, 0.01), {0, 100}).isUndetermined);
    EXPECT_TRUE(feetOn(arcOf(50, -0.01), {1e-7, -100}).isUndetermined) << "as good as the centre";
    EXPECT_FALSE(feetOn(arcOf(50, 0.01), {0.001, 100}).isUndetermined) << "a millimetre says where";
    const CurveFeet nearly = feetOn(curveOf(TransitionForm::Clothoid, 400, 0.01, 0.01 + 1e-12), {0, 100});
    EXPECT_TRUE(nearly.isUndetermined || nearly.feet.size() <= 2) << "a transition that is as good as an arc";
    constexpr double nan = std::numeric_limits<double>::quiet_NaN();
    EXPECT_TRUE(feetOn(arcOf(50, 0.01), {nan, 0}).feet.empty());
}

/// The feet as a walk along the curve in many small steps sees them.
std::vector<double> walkedFeet(const PlaneCurve &curve, PlanePoint point, int steps)
{
    std::vector<double> feet;
    double before = 0;
    for (int i = 0; i <= steps; ++i) {
        const double length = curve.length() * i / steps;
        const CurvePlace place = curve.at(length);
        const double ahead = turned(point - place.point, -place.bearing).northing;
        if (i > 0 && before * ahead < 0) {
            feet.push_back(length - curve.length() / steps / 2);
        }
        before = ahead;
    }
    return feet;
}

TEST(CurveFeet, AllFeetOfTransitionsAreFound)
{
    RandomRuns runs("feet", 1, 20);
    while (runs.next()) {
        RandomNumbers random(runs.seed());
        const Alignment alignment = randomAlignment(random, 6, 1);
        for (const auto &element : alignment.elements()) {
            const PlaneCurve &curve = element.curve;
            for (int i = 0; i < 5; ++i) {
                const CurvePlace at = curve.at(curve.length() * random.below(1000) / 1000);
                const PlanePoint point = pointBeside(at.point, at.bearing, random.below(600) - 300 + 0.37);
                constexpr int steps = 500;
                const std::vector<double> walked = walkedFeet(curve, point, steps);
                const CurveFeet found = feetOn(curve, point);
                ASSERT_FALSE(found.isUndetermined) << "seed " << runs.seed();
                for (const double length : walked) {
                    EXPECT_TRUE(std::any_of(found.feet.begin(), found.feet.end(),
                                            [&](const CurveFoot &foot) {
                                                return std::fabs(foot.length - length) <= curve.length() / steps;
                                            }))
                        << "seed " << runs.seed() << ": the foot at " << length << " is missing";
                }
                for (const CurveFoot &foot : found.feet) {
                    const CurvePlace place = curve.at(foot.length);
                    EXPECT_LT(distanceBetween(pointBeside(place.point, place.bearing, foot.offset), point), 1e-6)
                        << "seed " << runs.seed() << ": at " << foot.length << " is not a foot";
                }
            }
        }
    }
}

} // namespace
