#include "PlaneCurve.h"
#include "TransitionTable.h"

#include <gtest/gtest.h>

#include <limits>

namespace
{

using namespace kareport;

constexpr double pi = std::numbers::pi;
constexpr TransitionForm allForms[] = {
    TransitionForm::Clothoid, TransitionForm::Bloss,         TransitionForm::Biquadratic, TransitionForm::Cosine,
    TransitionForm::Sinusoid, TransitionForm::CubicParabola, TransitionForm::SineHalfWave};

PlaneCurve curveOf(TransitionForm form, double length, double startCurvature, double endCurvature,
                   PlanePoint start = {}, double bearing = 0)
{
    return std::get<PlaneCurve>(PlaneCurve::make(form, start, bearing, length, startCurvature, endCurvature));
}

TEST(PlaneCurve, TransitionsAreWhereArbitraryPrecisionHasThem)
{
    for (const transitions::TransitionRow &row : transitions::transitionRows) {
        const PlaneCurve curve = curveOf(row.form, row.length, row.startCurvature, row.endCurvature);
        const CurvePlace place = curve.at(row.along);
        const auto where = ::testing::Message()
                           << "form " << static_cast<int>(row.form) << ", length " << row.length << ", curvatures "
                           << row.startCurvature << " to " << row.endCurvature << ", at " << row.along;
        // One micrometre was to be kept over 1000 km; what is left is the rounding of such lengths.
        const double tolerance = 1e-11 + 1e-15 * row.length;
        EXPECT_NEAR(place.point.northing, row.northing, tolerance) << where;
        EXPECT_NEAR(place.point.easting, row.easting, tolerance) << where;
        EXPECT_NEAR(curve.turnTo(row.along), row.turn, 1e-13 + 1e-15 * std::fabs(row.turn)) << where;
        EXPECT_NEAR(place.curvature, row.curvature, 1e-14) << where;
        EXPECT_NEAR(curve.curvatureAt(row.along), row.curvature, 1e-14) << where;
        EXPECT_NEAR(turnBetween(place.bearing, row.turn), 0, 1e-12) << where;
    }
}

TEST(PlaneCurve, ArcsAndLinesAreWhereTheirFormulasHaveThem)
{
    struct Row
    {
        double length, curvature, along;
        double northing, easting;
        const char *reason;
    };
    const Row rows[] = {
        {100, 0, 40, 40, 0, "a line"},
        {1e6, 0, 1e6, 1e6, 0, "a line of 1000 km"},
        {50 * pi, 0.01, 50 * pi, 100, 100, "a quarter to the right"},
        {50 * pi, -0.01, 50 * pi, 100, -100, "a quarter to the left"},
        {200 * pi, 0.01, 100 * pi, 0, 200, "half a circle"},
        {200 * pi, 0.01, 200 * pi, 0, 0, "a full circle"},
        {1e6, 1e-12, 1e6, 1e6 - 1e6 * 1e-12 / 6, 0.5 - 1e-12 / 24, "a radius of a billion kilometres"},
        {100, 0.01, -5, 0, 0, "before the start is the start"},
        {50 * pi, 0.01, 1e9, 100, 100, "after the end is the end"},
    };
    for (const Row &row : rows) {
        const CurvePlace place =
            curveOf(TransitionForm::Clothoid, row.length, row.curvature, row.curvature).at(row.along);
        EXPECT_NEAR(place.point.northing, row.northing, 1e-9) << row.reason;
        EXPECT_NEAR(place.point.easting, row.easting, 1e-9) << row.reason;
        EXPECT_EQ(place.curvature, row.curvature) << row.reason;
    }
}

TEST(PlaneCurve, AnArcWindsRoundForAThousandKilometres)
{
    // 1e6 = 636 turns of this radius and a quarter.
    const double radius = 1e6 / (2 * pi * 636.25);
    const CurvePlace place = curveOf(TransitionForm::Clothoid, 1e6, 1 / radius, 1 / radius).end();
    EXPECT_NEAR(place.point.northing, radius, 1e-9);
    EXPECT_NEAR(place.point.easting, radius, 1e-9);
    EXPECT_NEAR(place.bearing, pi / 2, 1e-11);
}

TEST(PlaneCurve, ALeftCurveIsTheMirrorImageOfARightOne)
{
    for (const TransitionForm form : allForms) {
        const PlaneCurve right = curveOf(form, 80, 0, 1 / 120.0);
        const PlaneCurve left = curveOf(form, 80, 0, -1 / 120.0);
        EXPECT_GT(right.end().point.easting, 1) << "positive curvature is to the right";
        for (double at = 0; at <= 80; at += 5) {
            EXPECT_EQ(right.at(at).point.northing, left.at(at).point.northing) << static_cast<int>(form);
            EXPECT_EQ(right.at(at).point.easting, -left.at(at).point.easting) << static_cast<int>(form);
        }
    }
}

TEST(PlaneCurve, ACurveOutIsTheCurveInWalkedBack)
{
    for (const TransitionForm form : allForms) {
        for (const double radius : {-300.0, 90.0}) {
            const PlaneCurve in = curveOf(form, 60, 0, 1 / radius, {1000, 2000}, 0.7);
            const CurvePlace end = in.end();
            const PlaneCurve out = curveOf(form, 60, -1 / radius, 0, end.point, end.bearing + pi);
            for (double at = 0; at <= 60; at += 4) {
                const CurvePlace there = in.at(at);
                const CurvePlace back = out.at(60 - at);
                EXPECT_LT(distanceBetween(there.point, back.point), 1e-11) << static_cast<int>(form) << " at " << at;
                EXPECT_NEAR(turnBetween(there.bearing + pi, back.bearing), 0, 1e-13) << static_cast<int>(form);
                EXPECT_NEAR(there.curvature, -back.curvature, 1e-15) << static_cast<int>(form);
            }
        }
    }
}

TEST(PlaneCurve, ItsDirectionAndCurvatureAreTheRatesOfItsPoints)
{
    for (const TransitionForm form : allForms) {
        const PlaneCurve curve = curveOf(form, 90, 1 / 150.0, 0, {5500000, 3400000}, 4);
        for (double at = 1; at < 90; at += 7.3) {
            constexpr double step = 1e-3;
            const CurvePlace place = curve.at(at);
            const PlanePoint change = curve.at(at + step).point - curve.at(at - step).point;
            EXPECT_NEAR(std::hypot(change.northing, change.easting), 2 * step, 1e-8) << static_cast<int>(form);
            EXPECT_NEAR(turnBetween(place.bearing, bearingBetween({}, change)), 0, 2e-6) << static_cast<int>(form);
            EXPECT_NEAR((curve.turnTo(at + step) - curve.turnTo(at - step)) / (2 * step), place.curvature, 1e-8)
                << static_cast<int>(form);
        }
    }
}

TEST(PlaneCurve, ItsEndIsAsStraightAsItIsSaidToBe)
{
    // The file's decimals, of which the product and the sum are rounded.
    for (const TransitionForm form : {TransitionForm::Clothoid, TransitionForm::Bloss, TransitionForm::Sinusoid}) {
        for (const double radius : {149.3, -77.7, 31.01}) {
            EXPECT_EQ(curveOf(form, 37.503, 1 / radius, 0).end().curvature, 0) << static_cast<int>(form);
            EXPECT_EQ(curveOf(form, 37.503, 1 / radius, -1 / 99.9).end().curvature, -1 / 99.9);
        }
    }
}

TEST(PlaneCurve, AllItsCurvaturesLieBetweenThoseOfAStretch)
{
    for (const TransitionForm form : allForms) {
        for (const auto &[first, last] : {std::pair(0.0, -0.01), std::pair(0.01, 0.0)}) {
            const PlaneCurve curve = curveOf(form, 90, first, last);
            for (double from = 0; from < 90; from += 7.5) {
                const auto [least, most] = curve.curvaturesBetween(from, from + 7.5);
                for (double at = from; at <= from + 7.5; at += 0.5) {
                    EXPECT_GE(curve.at(at).curvature, least - 1e-16) << static_cast<int>(form) << " at " << at;
                    EXPECT_LE(curve.at(at).curvature, most + 1e-16) << static_cast<int>(form) << " at " << at;
                }
                EXPECT_LT(most - least, 0.003)
                    << static_cast<int>(form) << ": limits far from the curvatures are of no use";
            }
        }
    }
}

TEST(PlaneCurve, IsTheSameInAnotherPlace)
{
    const PlaneCurve curve = curveOf(TransitionForm::Bloss, 90, 0.001, -0.01, {10, 20}, 1);
    const PlaneCurve moved = curve.placed({-500, 700}, 3);
    const PlanePoint from = curve.at(33).point - PlanePoint{10, 20};
    const PlanePoint to = moved.at(33).point - PlanePoint{-500, 700};
    EXPECT_LT(distanceBetween(turned(from, 2), to), 1e-12);
    EXPECT_NEAR(moved.at(33).bearing, normalizedBearing(curve.at(33).bearing + 2), 1e-14);
}

TEST(PlaneCurve, WhatHasNoAnswerIsSaid)
{
    constexpr double nan = std::numeric_limits<double>::quiet_NaN();
    constexpr double infinite = std::numeric_limits<double>::infinity();
    struct Row
    {
        TransitionForm form;
        double northing, bearing, length, startCurvature, endCurvature;
        CurveFault fault;
        const char *reason;
    };
    constexpr auto clothoid = TransitionForm::Clothoid;
    const Row rows[] = {
        {clothoid, nan, 0, 1, 0, 0, CurveFault::NotFinite, "no start"},
        {clothoid, 0, infinite, 1, 0, 0, CurveFault::NotFinite, "no bearing"},
        {clothoid, 0, 0, nan, 0, 0, CurveFault::NotFinite, "no length"},
        {clothoid, 0, 0, 1, infinite, 0, CurveFault::NotFinite, "a radius of 0 at the start"},
        {clothoid, 0, 0, 1, 0, nan, CurveFault::NotFinite, "no radius at the end"},
        {clothoid, 0, 0, 0, 0, 0, CurveFault::NoLength, "no way at all"},
        {clothoid, 0, 0, -1, 0, 0, CurveFault::NoLength, "a way back"},
        {clothoid, 0, 0, 1e9, 1, 1, CurveFault::TooManyTurns, "an arc like a coil"},
        {clothoid, 0, 0, 1e300, 0, 1e300, CurveFault::TooManyTurns, "turns that no number counts"},
        {TransitionForm::CubicParabola, 0, 0, 10, 0.1, 0.2, CurveFault::NoStraightEnd, "no tangent to be over"},
        {TransitionForm::SineHalfWave, 0, 0, 50, 0, 0.1, CurveFault::TooSteep, "it would rise above its tangent"},
        {TransitionForm::CubicParabola, 0, 0, 1000, 0, 50, CurveFault::TooSteep, "it would rise out of sight"},
    };
    for (const Row &row : rows) {
        const auto made = PlaneCurve::make(row.form, {row.northing, 0}, row.bearing, row.length, row.startCurvature,
                                           row.endCurvature);
        const auto *fault = std::get_if<CurveFault>(&made);
        ASSERT_NE(fault, nullptr) << row.reason;
        EXPECT_EQ(*fault, row.fault) << row.reason;
    }
}

TEST(PlaneCurve, ItsAreaIsThatBetweenCurveAndChord)
{
    EXPECT_EQ(curveOf(TransitionForm::Clothoid, 100, 0, 0).areaBesideChord(), 0) << "a line";
    EXPECT_NEAR(curveOf(TransitionForm::Clothoid, 10 * pi, 0.1, 0.1).areaBesideChord(), 50 * pi, 1e-12)
        << "half a circle to the right lies to the left of its chord";
    EXPECT_NEAR(curveOf(TransitionForm::Clothoid, 10 * pi, -0.1, -0.1).areaBesideChord(), -50 * pi, 1e-12);
    // A large circle's segment keeps its digits: length³ curvature / 12.
    EXPECT_NEAR(curveOf(TransitionForm::Clothoid, 100, 1e-7, 1e-7).areaBesideChord(), 1e6 * 1e-7 / 12, 1e-13);
    for (const TransitionForm form : allForms) {
        const PlaneCurve curve = curveOf(form, 100, 0, 0.008, {300, 400}, 2.5);
        double sum = 0; // of the polygon through many of its points
        PlanePoint before = curve.start().point;
        for (int i = 1; i <= 20000; ++i) {
            const PlanePoint next = curve.at(i * 100 / 20000.0).point;
            const PlanePoint a = before - curve.start().point;
            const PlanePoint b = next - curve.start().point;
            sum += (a.northing * b.easting - a.easting * b.northing) / 2;
            before = next;
        }
        EXPECT_NEAR(curve.areaBesideChord(), sum, 1e-5) << static_cast<int>(form);
    }
}

TEST(PlanePoint, BearingsAreFromZeroToBelowAFullCircle)
{
    EXPECT_EQ(normalizedBearing(0), 0);
    EXPECT_NEAR(normalizedBearing(-pi / 2), 1.5 * pi, 1e-15);
    EXPECT_NEAR(normalizedBearing(5 * pi), pi, 1e-14);
    EXPECT_EQ(normalizedBearing(-1e-20), 0) << "it would round to the full circle";
    EXPECT_NEAR(bearingBetween({10, 10}, {9, 10}), pi, 1e-15);
    EXPECT_NEAR(bearingBetween({10, 10}, {10, 9}), 1.5 * pi, 1e-15);
    EXPECT_NEAR(turnBetween(0.1, 2 * pi - 0.1), -0.2, 1e-14);
    EXPECT_NEAR(pointBeside({10, 20}, 0, 3).easting, 23, 1e-15) << "to the right of north is east";
    EXPECT_NEAR(pointBeside({10, 20}, pi / 2, 3).northing, 7, 1e-15) << "to the right of east is south";
}

} // namespace
