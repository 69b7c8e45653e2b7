#include "LandXmlQueryReader.h"

#include "JobFolder.h"

#include <gtest/gtest.h>

#include <numbers>

namespace
{

using namespace kareport;
using Kind = LandXmlListKind;

/// Reads the data set of a text. @param error  receives what is wrong with it
LandXmlQuery queryOf(const QByteArray &json, std::optional<InputError> &error)
{
    const auto source = JsonSource::fromBytes(QStringLiteral("job.json"), json);
    EXPECT_EQ(errorOf(source), nullptr) << json.toStdString();
    return readLandXmlQuery(JsonNode(std::get<JsonSource>(source), error));
}

LandXmlQuery queryOf(const QByteArray &json)
{
    std::optional<InputError> error;
    LandXmlQuery query = queryOf(json, error);
    EXPECT_FALSE(error) << json.toStdString();
    return query;
}

TEST(LandXmlQueryReader, NamesBelongToTheirLists)
{
    struct Row
    {
        const char *json;
        Kind kind;
        const char *name, *alignment, *gradeLine, *surface;
    };
    constexpr Row rows[] = {
        {R"({"landxml": "a.xml", "list": "points"})", Kind::Points, "", "", "", ""},
        {R"({"list": "points", "group": "g"})", Kind::Points, "g", "", "", ""},
        {R"({"list": "surfacePoints", "surface": "s"})", Kind::SurfacePoints, "s", "", "", ""},
        {R"({"list": "parcels", "parcel": "p"})", Kind::Parcels, "p", "", "", ""},
        {R"({"list": "courses", "parcel": "p"})", Kind::Courses, "p", "", "", ""},
        {R"({"list": "alignments", "alignment": "a"})", Kind::Alignments, "a", "", "", ""},
        {R"({"list": "elements", "alignment": "a"})", Kind::Elements, "a", "", "", ""},
        {R"({"list": "stations", "alignment": "a", "gradeLine": "d", "surface": "s"})", Kind::Stations, "a", "", "d",
         "s"},
        {R"({"list": "profile", "alignment": "a", "gradeLine": "d"})", Kind::Profile, "a", "", "d", ""},
        {R"({"list": "crossSections", "alignment": "a", "surface": "s"})", Kind::CrossSections, "a", "", "", "s"},
        {R"({"list": "offsetsOf", "group": "g", "alignment": "a", "gradeLine": "d"})", Kind::OffsetsOf, "g", "a", "d",
         ""},
    };
    for (const Row &row : rows) {
        const LandXmlQuery query = queryOf(row.json);
        EXPECT_EQ(query.kind, row.kind) << row.json;
        EXPECT_EQ(query.name, QString::fromLatin1(row.name)) << row.json;
        EXPECT_EQ(query.alignment, QString::fromLatin1(row.alignment)) << row.json;
        EXPECT_EQ(query.gradeLine, QString::fromLatin1(row.gradeLine)) << row.json;
        EXPECT_EQ(query.surface, QString::fromLatin1(row.surface)) << row.json;
        EXPECT_FALSE(query.unit) << row.json;
    }
}

TEST(LandXmlQueryReader, StationsHaveTheirPlaces)
{
    const LandXmlQuery query = queryOf(R"({"list": "stations", "interval": 12.5, "from": "round", "atElements": false,
        "stations": [10, "1+052.5", "-0+010", "-3"], "offsets": [-3.5, {"offset": 5}, {"offset": 7, "crossfall": -2.5}]})");
    EXPECT_EQ(query.interval, 12.5);
    EXPECT_TRUE(query.fromRound);
    EXPECT_FALSE(query.atElements);
    EXPECT_EQ(query.stations, (std::vector<double>{10, 1052.5, -10, -3}));
    ASSERT_EQ(query.offsets.size(), 3U);
    EXPECT_EQ(query.offsets[0].offset, -3.5);
    EXPECT_FALSE(query.offsets[0].crossfall);
    EXPECT_EQ(query.offsets[1].offset, 5);
    EXPECT_FALSE(query.offsets[1].crossfall);
    EXPECT_EQ(query.offsets[2].offset, 7);
    EXPECT_EQ(query.offsets[2].crossfall, -2.5);

    const LandXmlQuery plain = queryOf(R"({"list": "stations", "from": "start"})");
    EXPECT_EQ(plain.interval, 0);
    EXPECT_FALSE(plain.fromRound);
    EXPECT_TRUE(plain.atElements);
    EXPECT_TRUE(plain.stations.empty() && plain.offsets.empty());
}

TEST(LandXmlQueryReader, ToleranceIsInMillimetresAndTenThousandthsOfAGon)
{
    const LandXmlQuery query = queryOf(R"({"list": "elements", "tolerance": {"mm": 5, "cc": 20}})");
    EXPECT_DOUBLE_EQ(query.tolerance.length, 0.005);
    EXPECT_DOUBLE_EQ(query.tolerance.angle, 0.002 * std::numbers::pi / 200);
    const LandXmlQuery plain = queryOf(R"({"list": "elements"})");
    EXPECT_DOUBLE_EQ(plain.tolerance.length, 0.002);
    EXPECT_DOUBLE_EQ(plain.tolerance.angle, 0.001 * std::numbers::pi / 200);
}

TEST(LandXmlQueryReader, MistakesHaveTheirPlace)
{
    struct Row
    {
        const char *json; ///< with "@" before the mistake
        const char *contains;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"(@{"landxml": "a.xml"})", "\"list\" with one of points, surfacePoints", "no list"},
        {R"({"list": @"Points"})", "one of points, surfacePoints", "case matters"},
        {R"({"list": @5})", "a text was expected", "no text"},
        {R"({"list": "points", "alignment": @"a"})", "the list \"points\" does not use the key \"alignment\"",
         "a key of another list"},
        {R"({"list": "elements", "interval": @20})", "does not use the key \"interval\"", "a key of stations"},
        {R"({"list": "stations", "interval": @0})", "a number from 0.001", "no interval"},
        {R"({"list": "stations", "interval": @"20"})", "a number from 0.001", "a text"},
        {R"({"list": "stations", "from": @"end"})", "one of start, round", "no such place"},
        {R"({"list": "stations", "stations": @5})", "a list was expected", "one station alone"},
        {R"({"list": "stations", "stations": [5, @"abc"]})", "12+345.678", "no station"},
        {R"({"list": "stations", "stations": [@"1+2+3"]})", "12+345.678", "two signs"},
        {R"({"list": "stations", "stations": [@"inf"]})", "12+345.678", "no place"},
        {R"({"list": "stations", "stations": [@null]})", "a number", "nothing"},
        {R"({"list": "stations", "offsets": [@"5"]})", "a number", "a text"},
        {R"({"list": "stations", "offsets": [@{"crossfall": 5}]})", "\"offset\"", "a height nowhere"},
        {R"({"list": "stations", "offsets": [{"offset": 5, @"fall": 5}]})", "\"fall\"", "a key that is not known"},
        {R"({"list": "stations", "offsets": [{"offset": 5, "crossfall": @5000}]})", "-1000 to 1000", "a wall"},
        {R"({"list": "elements", "tolerance": @5})", "an object", "a number"},
        {R"({"list": "elements", "tolerance": {"mm": @-1}})", "a number from 0", "below zero"},
        {R"({"list": "elements", "tolerance": {@"m": 1}})", "\"m\"", "another unit"},
    };
    for (const Row &row : rows) {
        const MarkedText marked(row.json);
        std::optional<InputError> error;
        queryOf(marked.text, error);
        ASSERT_TRUE(error) << row.reason;
        EXPECT_TRUE(error->message().startsWith(QStringLiteral("job.json:%1: error: ").arg(marked.place)))
            << row.reason << ": " << error->message().toStdString();
        EXPECT_TRUE(error->text.contains(QString::fromLatin1(row.contains)))
            << row.reason << ": " << error->message().toStdString();
    }
}

} // namespace
