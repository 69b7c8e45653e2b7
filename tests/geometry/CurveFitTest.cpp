#include "CurveFit.h"

#include <gtest/gtest.h>

#include <limits>

namespace
{

using namespace kareport;

constexpr double pi = std::numbers::pi;

const PlaneCurve &curveIn(const FittedCurve &fitted)
{
    return std::get<PlaneCurve>(fitted);
}

TEST(CurveFit, LinesAreLaidBetweenTheirPoints)
{
    const FittedCurve line = lineBetween({10, 20}, {13, 16});
    EXPECT_DOUBLE_EQ(curveIn(line).length(), 5);
    EXPECT_LT(distanceBetween(curveIn(line).end().point, {13, 16}), 1e-14);
    EXPECT_EQ(std::get<CurveFault>(lineBetween({1, 2}, {1, 2})), CurveFault::NoLength);
}

TEST(CurveFit, ArcsGoRoundTheirCentreToTheSideThatIsSaid)
{
    struct Row
    {
        PlanePoint start, end;
        bool isRight;
        double length;
        const char *reason;
    };
    const Row rows[] = {
        {{10, 0}, {0, 10}, true, 5 * pi, "from north of the centre to east of it"},
        {{10, 0}, {0, 10}, false, 15 * pi, "the same the other way round"},
        {{10, 0}, {-10, 0}, true, 10 * pi, "half a circle"},
        {{10, 0}, {10, 0}, false, 20 * pi, "back to where it began"},
    };
    for (const Row &row : rows) {
        const PlaneCurve curve = curveIn(arcAbout({0, 0}, row.start, row.end, row.isRight));
        EXPECT_NEAR(curve.length(), row.length, 1e-13) << row.reason;
        EXPECT_LT(distanceBetween(curve.end().point, row.end), 1e-13) << row.reason;
        EXPECT_EQ(curve.startCurvature() > 0, row.isRight) << row.reason;
        EXPECT_LT(distanceBetween(*centreOf(curve), {0, 0}), 1e-13) << row.reason;
        const PlaneCurve same = curveIn(arcAbout({0, 0}, row.start, row.length, row.isRight));
        EXPECT_LT(distanceBetween(same.end().point, row.end), 1e-13) << row.reason;
    }
    EXPECT_EQ(std::get<CurveFault>(arcAbout({5, 5}, {5, 5}, {6, 6}, true)), CurveFault::NotFinite)
        << "it begins at its centre";
}

TEST(CurveFit, ACentreIsOnTheSideThatTheArcBendsTo)
{
    // A chord of 6 towards north and a radius of 5: the centre is 4 beside its middle.
    struct Row
    {
        bool isRight, isLong;
        double easting;
    };
    for (const Row &row : {Row{true, false, 4}, Row{false, false, -4}, Row{true, true, -4}, Row{false, true, 4}}) {
        const auto centre = centreOfArc({0, 0}, {6, 0}, 5, row.isRight, row.isLong);
        ASSERT_TRUE(centre);
        EXPECT_LT(distanceBetween(*centre, {3, row.easting}), 1e-14);
        const PlaneCurve curve = curveIn(arcAbout(*centre, {0, 0}, PlanePoint{6, 0}, row.isRight));
        EXPECT_EQ(curve.length() > 5 * pi, row.isLong);
    }
    EXPECT_FALSE(centreOfArc({0, 0}, {6, 0}, 2.9, true, false)) << "the points are too far away from each other";
    EXPECT_FALSE(centreOfArc({1, 1}, {1, 1}, 5, true, false)) << "any circle leads through one point";
    EXPECT_FALSE(centreOfArc({0, 0}, {6, 0}, 0, true, false));
    EXPECT_TRUE(centreOfArc({0, 0}, {6.000001, 0}, 3, true, false)) << "half a circle of rounded points";
}

TEST(CurveFit, TransitionsAreLaidThroughTheirEnds)
{
    for (const double bearing : {0.3, 2.0, 5.9}) {
        for (const double radius : {250.0, -80.0}) {
            const PlanePoint start{5516120.2982, 3512822.4984};
            const auto laid = PlaneCurve::make(TransitionForm::Clothoid, start, bearing, 62.5, 1 / radius, 0);
            const PlaneCurve fitted =
                curveIn(curveTowards(TransitionForm::Clothoid, start, curveIn(laid).end().point, 62.5, 1 / radius, 0));
            EXPECT_NEAR(turnBetween(fitted.start().bearing, bearing), 0, 1e-10);
            EXPECT_LT(distanceBetween(fitted.end().point, curveIn(laid).end().point), 5e-9);
        }
    }
    EXPECT_EQ(std::get<CurveFault>(curveTowards(TransitionForm::Clothoid, {0, 0}, {1, 1}, 0, 0, 1)),
              CurveFault::NoLength);
}

TEST(CurveFit, TangentsMeetWhereTheyShould)
{
    // The tangents of a quarter circle meet at the corner of the square around it.
    const FittedCurve quarter = arcAbout({0, 0}, {10, 0}, PlanePoint{0, 10}, true);
    EXPECT_LT(distanceBetween(*tangentIntersection(curveIn(quarter)), {10, 10}), 1e-13);
    const FittedCurve left = arcAbout({0, 0}, {0, 10}, PlanePoint{10, 0}, false);
    EXPECT_LT(distanceBetween(*tangentIntersection(curveIn(left)), {10, 10}), 1e-13);
    EXPECT_FALSE(tangentIntersection(curveIn(lineBetween({0, 0}, {1, 0}))));
    EXPECT_FALSE(tangentIntersection(curveIn(arcAbout({0, 0}, {10, 0}, PlanePoint{-10, 0}, true))));
}

TEST(CurveFit, OnlyArcsHaveACentre)
{
    EXPECT_FALSE(centreOf(curveIn(lineBetween({0, 0}, {1, 0}))));
    EXPECT_FALSE(centreOf(curveIn(PlaneCurve::make(TransitionForm::Bloss, {}, 0, 10, 0, 0.1))));
}

TEST(CurveFit, AnArcOverItsEndsNeedsNoCentre)
{
    struct Row
    {
        bool isRight;
        bool isLong;
    };
    for (const Row row : {Row{true, false}, Row{false, false}, Row{true, true}, Row{false, true}}) {
        const PlanePoint start{1000, 2000};
        const PlanePoint end{1006, 2000};
        const auto centre = centreOfArc(start, end, 5, row.isRight, row.isLong);
        ASSERT_TRUE(centre);
        const auto expected = std::get<PlaneCurve>(arcAbout(*centre, start, end, row.isRight));
        const auto arc = std::get<PlaneCurve>(arcOver(start, end, 5, row.isRight, row.isLong));
        EXPECT_NEAR(arc.length(), expected.length(), 1e-9);
        EXPECT_NEAR(turnBetween(arc.start().bearing, expected.start().bearing), 0, 1e-9);
        EXPECT_NEAR(arc.startCurvature(), expected.startCurvature(), 1e-12);
        EXPECT_LT(distanceBetween(arc.end().point, end), 1e-9);
    }
    // Far away, a centre has too few digits to tell the angle.
    for (const double radius : {3e9, 1e12, 1e15}) {
        const auto arc = std::get<PlaneCurve>(arcOver({5516000, 3512000}, {5516300, 3512400}, radius, true, false));
        EXPECT_NEAR(arc.length(), 500, 1e-9) << radius;
        EXPECT_LT(distanceBetween(arc.end().point, {5516300, 3512400}), 1e-8) << radius;
        EXPECT_NEAR(arc.turnTo(arc.length()), 500 / radius, 1e-15 * 500 / radius * 10) << radius;
    }
    EXPECT_TRUE(std::holds_alternative<CurveFault>(arcOver({0, 0}, {6, 0}, 2.9, true, false)));
    EXPECT_TRUE(std::holds_alternative<CurveFault>(arcOver({1, 1}, {1, 1}, 5, true, false)));
    EXPECT_TRUE(std::holds_alternative<CurveFault>(
        arcOver({0, 0}, {6, 0}, std::numeric_limits<double>::infinity(), true, false)));
    EXPECT_TRUE(std::holds_alternative<CurveFault>(arcOver({0, 0}, {6.001, 0}, 3, true, false)));
    EXPECT_TRUE(std::holds_alternative<PlaneCurve>(arcOver({0, 0}, {6.001, 0}, 3, true, false, 0.002)));
    EXPECT_TRUE(centreOfArc({0, 0}, {6.001, 0}, 3, true, false, 0.002));
    EXPECT_FALSE(centreOfArc({0, 0}, {6.003, 0}, 3, true, false, 0.002));
    EXPECT_TRUE(std::holds_alternative<PlaneCurve>(arcOver({0, 0}, {6.000001, 0}, 3, true, false)))
        << "half a circle of rounded points";
}

} // namespace
