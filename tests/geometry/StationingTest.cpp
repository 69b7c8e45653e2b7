#include "Stationing.h"

#include <gtest/gtest.h>

#include <limits>

namespace
{

using kareport::Stationing;

/// A gap (100 becomes 200), then an overlap (250 becomes 150), then a count that falls.
Stationing roadStations()
{
    Stationing stations(0);
    EXPECT_TRUE(stations.add({100, 200}));
    EXPECT_TRUE(stations.add({150, 150}));
    EXPECT_TRUE(stations.add({300, 1000, true}));
    return stations;
}

TEST(Stationing, WithoutEquationsAStationIsThePlace)
{
    const Stationing stations(-90);
    EXPECT_EQ(stations.nameOf(-90).station, -90);
    EXPECT_EQ(stations.nameOf(12.5).station, 12.5);
    EXPECT_EQ(stations.nameOf(12.5).region, 0U);
    EXPECT_EQ(stations.placesOf(12.5, 100), std::vector<double>{12.5});
    EXPECT_EQ(stations.placesOf(100.5, 100), std::vector<double>{});
    EXPECT_EQ(stations.placesOf(-90.5, 100), std::vector<double>{});
    EXPECT_EQ(stations.equationAt(0), nullptr);
}

TEST(Stationing, APlaceOnAnEquationHasTwoNames)
{
    const Stationing stations = roadStations();
    struct Row
    {
        double internal;
        bool back;
        double station;
        std::size_t region;
    };
    constexpr double littleMore = 1e-9; // what the sum of lengths misses
    const Row rows[] = {
        {50, false, 50, 0},
        {100, true, 100, 0},
        {100, false, 200, 1},
        {120, false, 220, 1},
        {150, true, 250, 1},
        {150, false, 150, 2},
        {300, true, 300, 2},
        {300, false, 1000, 3},
        {310, false, 990, 3},
        {310, true, 990, 3},
        {-5, false, -5, 0},
        {100 - littleMore, false, 200 - littleMore, 1},
        {100 + littleMore, true, 100 + littleMore, 0},
    };
    for (const Row &row : rows) {
        const Stationing::Name name = stations.nameOf(row.internal, row.back);
        EXPECT_DOUBLE_EQ(name.station, row.station) << row.internal << (row.back ? " back" : " ahead");
        EXPECT_EQ(name.region, row.region) << row.internal << (row.back ? " back" : " ahead");
    }
    EXPECT_EQ(stations.equationAt(150)->ahead, 150);
    EXPECT_EQ(stations.equationAt(100 + littleMore)->ahead, 200);
    EXPECT_EQ(stations.equationAt(101), nullptr);
    EXPECT_EQ(stations.equationAt(301), nullptr);
}

TEST(Stationing, AStationMayStandForSeveralPlacesOrForNone)
{
    const Stationing stations = roadStations();
    struct Row
    {
        double station;
        std::vector<double> places;
        const char *reason;
    };
    const Row rows[] = {
        {50, {50}, "before all equations"},
        {100, {100}, "the name that the first equation ends"},
        {150, {150}, "in the gap for the first region, then ahead of the second equation"},
        {220, {120, 220}, "in the region of the overlap, and again after it"},
        {990, {310}, "on the way down"},
        {1000, {300}, "where the way down begins"},
        {999999, {}, "nowhere"},
        {320, {}, "after the last region's end, and before the way down has come there"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(stations.placesOf(row.station, 400), row.places) << row.reason;
    }
}

TEST(Stationing, GoingThereAndBack)
{
    const Stationing stations = roadStations();
    for (double internal = 0; internal <= 400; internal += 0.25) {
        for (const bool back : {false, true}) {
            const Stationing::Name name = stations.nameOf(internal, back);
            EXPECT_DOUBLE_EQ(stations.internalIn(name.region, name.station), internal);
            const std::vector<double> places = stations.placesOf(name.station, 400);
            EXPECT_NE(std::find(places.begin(), places.end(), internal), places.end()) << internal;
        }
    }
}

TEST(Stationing, EquationsOutOfOrderAreRefused)
{
    Stationing stations(10);
    EXPECT_FALSE(stations.add({5, 20})) << "before the start";
    EXPECT_TRUE(stations.add({30, 20}));
    EXPECT_FALSE(stations.add({30, 40})) << "the same place again";
    EXPECT_FALSE(stations.add({25, 40})) << "back";
    EXPECT_FALSE(stations.add({std::numeric_limits<double>::quiet_NaN(), 40}));
    EXPECT_FALSE(stations.add({40, std::numeric_limits<double>::infinity()}));
    EXPECT_EQ(stations.equations().size(), 1U);
}

TEST(Stationing, AnEquationMayBeAtTheStart)
{
    Stationing stations(10);
    ASSERT_TRUE(stations.add({10, 500}));
    EXPECT_FALSE(stations.add({10, 600})) << "a second one may not";
    EXPECT_EQ(stations.nameOf(10).station, 500);
    EXPECT_EQ(stations.nameOf(10).region, 1U);
    EXPECT_EQ(stations.nameOf(10, true).station, 10);
    EXPECT_EQ(stations.nameOf(12).station, 502);
    EXPECT_EQ(stations.placesOf(10, 100), std::vector<double>{10}) << "the name of the start";
    EXPECT_EQ(stations.placesOf(11, 100), std::vector<double>{});
    EXPECT_EQ(stations.placesOf(501, 100), std::vector<double>{11});
}

} // namespace
