#include "VerticalProfile.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace
{

using namespace kareport;
using Rounding = ProfilePoint::Rounding;

VerticalProfile profileOf(const std::vector<ProfilePoint> &points)
{
    return std::get<VerticalProfile>(VerticalProfile::make(points));
}

ProfilePoint parabola(double station, double height, double in, double out)
{
    return {station, height, Rounding::Parabola, in, out, 0};
}

ProfilePoint circle(double station, double height, double radius)
{
    return {station, height, Rounding::Circle, 0, 0, radius};
}

/// Up by 2 percent, down by 3 over a crest of 100 m, and level from a break on.
VerticalProfile crest()
{
    return profileOf({{0, 100}, parabola(200, 104, 50, 50), {400, 98}, {500, 98}});
}

TEST(VerticalProfile, HeightsAndGradesAreThoseOfTheFormulas)
{
    struct Row
    {
        double station, height, grade;
        const char *reason;
    };
    // The grade changes by 5 percent in 100 m: y = g x - 0.00025 x².
    const Row rows[] = {
        {0, 100, 0.02, "the start"},
        {100, 102, 0.02, "on the grade"},
        {150, 103, 0.02, "where the crest begins"},
        {190, 103.4, 0, "its top"},
        {200, 103.375, -0.005, "104 less 5 percent of an eighth of the length"},
        {250, 102.5, -0.03, "where it ends"},
        {399, 98.03, -0.03, "down"},
        {400, 98, 0, "a break has the grade ahead"},
        {500, 98, 0, "the end"},
    };
    const VerticalProfile profile = crest();
    for (const Row &row : rows) {
        EXPECT_NEAR(profile.heightAt(row.station).value(), row.height, 1e-12) << row.reason;
        EXPECT_NEAR(profile.gradeAt(row.station).value(), row.grade, 1e-12) << row.reason;
    }
    EXPECT_NEAR(profile.gradeAt(400, true).value(), -0.03, 1e-12) << "the grade that leads to the break";
    EXPECT_FALSE(profile.heightAt(-0.001));
    EXPECT_FALSE(profile.gradeAt(500.001));
    EXPECT_FALSE(profile.heightAt(std::numeric_limits<double>::quiet_NaN()));
}

TEST(VerticalProfile, TheVertexSaysWhereItsCurveIs)
{
    const VerticalProfile profile = crest();
    const auto &vertex = profile.vertices()[1];
    EXPECT_EQ(vertex.start, 150);
    EXPECT_EQ(vertex.end, 250);
    EXPECT_DOUBLE_EQ(vertex.gradeIn, 0.02);
    EXPECT_DOUBLE_EQ(vertex.gradeOut, -0.03);
    EXPECT_DOUBLE_EQ(VerticalProfile::kValue(vertex).value(), 20) << "100 m for 5 percent";
    EXPECT_TRUE(std::isnan(crest().vertices().front().gradeIn));
    EXPECT_TRUE(std::isnan(crest().vertices().back().gradeOut));
    EXPECT_FALSE(VerticalProfile::kValue(crest().vertices()[2])) << "a break";
    EXPECT_FALSE(VerticalProfile::kValue(profileOf({{0, 0}, parabola(100, 1, 20, 40), {200, 0}}).vertices()[1]))
        << "a parabola of two lengths changes its rate";
    EXPECT_FALSE(VerticalProfile::kValue(profileOf({{0, 0}, parabola(100, 1, 20, 20), {200, 2}}).vertices()[1]))
        << "no grade changes";
}

TEST(VerticalProfile, AParabolaOfTwoLengthsTouchesBothGrades)
{
    const VerticalProfile profile = profileOf({{0, 10}, parabola(100, 12, 20, 60), {300, 4}});
    // Below the point by the product of the lengths times the change of grade over twice their sum.
    EXPECT_NEAR(profile.heightAt(100).value(), 12 - 20.0 * 60 * 0.06 / (2 * 80), 1e-12);
    EXPECT_NEAR(profile.heightAt(80).value(), 11.6, 1e-12);
    EXPECT_NEAR(profile.gradeAt(80).value(), 0.02, 1e-12);
    EXPECT_NEAR(profile.heightAt(160).value(), 9.6, 1e-12);
    EXPECT_NEAR(profile.gradeAt(160, true).value(), -0.04, 1e-12);
    EXPECT_NEAR(profile.gradeAt(100).value(), profile.gradeAt(100, true).value(), 1e-12) << "no break at the point";
}

TEST(VerticalProfile, ACircleTouchesBothGradesAndKeepsItsRadius)
{
    for (const double side : {1.0, -1.0}) {
        for (const double radius : {50.0, 2500.0, 1e7}) {
            // Grades of 3 to 4, whose tangents are easily computed.
            const double reach = radius * 2;
            const VerticalProfile profile =
                profileOf({{-reach, -side * reach * 0.75}, circle(0, 0, radius), {reach, -side * reach * 0.75}});
            const auto &vertex = profile.vertices()[1];
            EXPECT_NEAR(vertex.start, -0.6 * radius, 1e-9 * radius);
            EXPECT_NEAR(vertex.end, 0.6 * radius, 1e-9 * radius);
            const double centre = -side * 1.25 * radius;
            for (double part = -0.6; part <= 0.6; part += 0.05) {
                const double station = part * radius;
                EXPECT_NEAR(profile.heightAt(station).value(), centre + side * radius * std::sqrt(1 - part * part),
                            1e-14 * radius)
                    << radius << " at " << part;
                EXPECT_NEAR(profile.gradeAt(station).value(), -side * part / std::sqrt(1 - part * part), 1e-13);
            }
        }
    }
}

TEST(VerticalProfile, HighAndLowPointsAreWhereTheGradeChangesItsSign)
{
    struct Row
    {
        std::vector<ProfilePoint> points;
        std::vector<double> stations;
        std::vector<bool> high;
        const char *reason;
    };
    const Row rows[] = {
        {{{0, 100}, parabola(200, 104, 50, 50), {400, 98}, {500, 98}}, {190}, {true}, "a crest"},
        {{{0, 0}, {100, 5}, {200, 1}}, {100}, {true}, "a break"},
        {{{0, 0}, parabola(100, -1, 40, 40), {200, 0}}, {100}, {false}, "a sag whose lowest place is at the point"},
        {{{0, 0}, parabola(100, -1, 40, 40), parabola(300, 3, 20, 60), {400, 1}},
         {60 + 80 / 3.0, 280 + 40 / 3.0},
         {false, true},
         "a sag, and a crest of two lengths"},
        {{{0, 0}, circle(100, 2, 1000), {300, -2}}, {100}, {true}, "a circle of equal grades"},
        {{{0, 0}, {100, 2}, {200, 2}, {300, 4}}, {}, {}, "level, but up before and after"},
        {{{0, 0}, {100, 2}, {200, 2}, {300, 0}}, {}, {}, "a level top has no one place"},
        {{{0, 0}, {100, 2}}, {}, {}, "the ends are not turning points"},
    };
    for (const Row &row : rows) {
        const VerticalProfile profile = profileOf(row.points);
        const auto found = profile.extremes(profile.start(), profile.end());
        ASSERT_EQ(found.size(), row.stations.size()) << row.reason;
        for (std::size_t i = 0; i < found.size(); ++i) {
            EXPECT_NEAR(found[i].station, row.stations[i], 1e-9) << row.reason;
            EXPECT_EQ(found[i].isHigh, row.high[i]) << row.reason;
            EXPECT_NEAR(found[i].height, profile.heightAt(found[i].station).value(), 1e-12) << row.reason;
        }
    }
}

TEST(VerticalProfile, HighAndLowPointsAreSearchedForBetweenStations)
{
    EXPECT_EQ(crest().extremes(190, 500).size(), 1U);
    EXPECT_EQ(crest().extremes(190.1, 500).size(), 0U);
    EXPECT_EQ(crest().extremes(0, 189.9).size(), 0U);
}

TEST(VerticalProfile, HeightsAreTheSumOfGrades)
{
    const VerticalProfile profile = profileOf({{-53.048, 124.49},
                                               parabola(0, 126.7, 19.06025, 19.06025),
                                               circle(41.2, 124.49, 300),
                                               parabola(94.248, 126.7, 10, 15),
                                               {135.448, 124.49}});
    constexpr double step = 0.001;
    for (double station = profile.start(); station + step < profile.end(); station += 1.7) {
        const double rise = profile.heightAt(station + step).value() - profile.heightAt(station).value();
        const double mean = (profile.gradeAt(station).value() + profile.gradeAt(station + step).value()) / 2;
        EXPECT_NEAR(rise, mean * step, 1e-10) << station;
    }
}

TEST(VerticalProfile, WhatHasNoAnswerIsSaid)
{
    using Kind = ProfileFault::Kind;
    constexpr double nan = std::numeric_limits<double>::quiet_NaN();
    struct Row
    {
        std::vector<ProfilePoint> points;
        Kind kind;
        std::size_t point;
        const char *reason;
    };
    const Row rows[] = {
        {{}, Kind::TooFew, 0, "nothing"},
        {{{0, 1}}, Kind::TooFew, 0, "a point has no grade"},
        {{{0, 1}, {10, nan}}, Kind::NotFinite, 1, "no height"},
        {{{-1e308, 1}, {1e308, 2}, {1.1e308, -1e308}}, Kind::NotFinite, 1, "a grade that no number says"},
        {{{0, 1}, {10, 2}, {10, 3}}, Kind::NotAhead, 2, "two heights at one station"},
        {{{0, 1}, {10, 2}, {5, 3}}, Kind::NotAhead, 2, "a way back"},
        {{parabola(0, 1, 5, 5), {10, 2}}, Kind::CurveAtEnd, 0, "a curve with one grade"},
        {{{0, 1}, circle(10, 2, 100)}, Kind::CurveAtEnd, 1, "a curve with one grade"},
        {{{0, 1}, circle(10, 2, -5), {20, 1}}, Kind::NoCurve, 1, "a radius below zero"},
        {{{0, 1}, parabola(10, 2, 0, 0), {20, 1}}, Kind::NoCurve, 1, "no length"},
        {{{0, 1}, parabola(10, 2, 10.1, 5), {20, 1}}, Kind::Overlap, 1, "it begins before the first point"},
        {{{0, 1}, parabola(10, 2, 5, 5), parabola(18, 1, 5, 5), {30, 4}}, Kind::Overlap, 2, "two curves overlap"},
        {{{0, 1}, parabola(10, 2, 5, 11), {20, 1}}, Kind::Overlap, 2, "it goes on after the last point"},
    };
    for (const Row &row : rows) {
        const auto made = VerticalProfile::make(row.points);
        const auto *fault = std::get_if<ProfileFault>(&made);
        ASSERT_NE(fault, nullptr) << row.reason;
        EXPECT_EQ(fault->kind, row.kind) << row.reason;
        EXPECT_EQ(fault->point, row.point) << row.reason;
    }
}

TEST(VerticalProfile, CurvesThatTouchMayOverlapByTheirRounding)
{
    const VerticalProfile profile =
        profileOf({{0, 0}, parabola(100, 2, 50.0004, 50.0004), parabola(200, 0, 50.0004, 50.0004), {300, 4}});
    EXPECT_NEAR(profile.heightAt(150).value(), 1, 1e-4);
    EXPECT_NEAR(profile.heightAt(150.0008).value(), profile.heightAt(150).value(), 1e-4);
}

} // namespace
