#include "InputErrorText.h"
#include "LandXmlFile.h"
#include "LandXmlRoad.h"

#include <gtest/gtest.h>

#include <cmath>

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

const QByteArray straight = "<Line><Start name='A'>0 0</Start><End name='E'>100 0</End></Line>";
const QByteArray equations = "<StaEquation staInternal='30' staBack='30' staAhead='50'/>"
                             "<StaEquation staBack='80' staAhead='70'/>";
const QByteArray profile = "<Profile><ProfAlign name='design'><PVI>0 10</PVI><PVI>100 12</PVI></ProfAlign>"
                           "<ProfAlign name='other'><PVI>0 0</PVI><PVI>100 0</PVI></ProfAlign>"
                           "<ProfSurf name='ground'><PntList2D>0 11 50 9 100 11</PntList2D></ProfSurf></Profile>";

LandXmlQuery everyTenth()
{
    LandXmlQuery query = queryOf(Kind::Stations);
    query.interval = 25;
    return query;
}

QStringList stationsOf(const QByteArray &content, const LandXmlQuery &query)
{
    LandXmlFile file(content, query, {QStringLiteral("Station")});
    QStringList stations = file.rows(3);
    EXPECT_FALSE(file.list->error());
    return stations;
}

TEST(LandXmlStations, AreEveryIntervalAndWhereElementsBegin)
{
    const QByteArray content = fileOf(alignment(bend(), "name='road' staStart='-10'"));
    LandXmlQuery query = everyTenth();
    query.interval = 100;
    EXPECT_EQ(stationsOf(content, query),
              QStringList({u"-10.000"_qs, u"90.000"_qs, u"190.000"_qs, u"247.080"_qs, u"290.000"_qs, u"297.080"_qs}))
        << "from the start on; a border at an interval is one station";
    query.fromRound = true;
    EXPECT_EQ(stationsOf(content, query), QStringList({u"-10.000"_qs, u"0.000"_qs, u"90.000"_qs, u"100.000"_qs,
                                                       u"200.000"_qs, u"247.080"_qs, u"297.080"_qs}))
        << "round ones";
    query.atElements = false;
    EXPECT_EQ(stationsOf(content, query), QStringList({u"0.000"_qs, u"100.000"_qs, u"200.000"_qs}));
    query.interval = 0;
    query.stations = {33.25, 12};
    EXPECT_EQ(stationsOf(content, query), QStringList({u"12.000"_qs, u"33.250"_qs}));
}

TEST(LandXmlStations, HaveTheirPlaceTheirBearingAndTheirRadius)
{
    LandXmlQuery query = queryOf(Kind::Stations);
    query.stations = {100 + 25 * std::numbers::pi};
    LandXmlFile file(fileOf(alignment(bend())), query,
                     {QStringLiteral("Point"), QStringLiteral("Northing"), QStringLiteral("Easting"),
                      QStringLiteral("Bearing"), QStringLiteral("Radius")});
    EXPECT_EQ(file.rows(3), QStringList({u"A|1000.000|500.000|0.000|inf"_qs, u"B|1100.000|500.000|0.000|100.000"_qs,
                                         u"-|1170.711|529.289|0.785|100.000"_qs, u"C|1200.000|600.000|1.571|inf"_qs,
                                         u"D|1200.000|650.000|1.571|inf"_qs}));
}

TEST(LandXmlStations, OnAnEquationHaveBothNames)
{
    LandXmlQuery query = everyTenth();
    LandXmlFile file(
        fileOf(alignment(straight, "name='road' staStart='0'", equations)), query,
        {QStringLiteral("Station"), QStringLiteral("StationBack"), QStringLiteral("Region"), QStringLiteral("Along")});
    EXPECT_EQ(file.rows(0), QStringList({u"0|-|0|0"_qs, u"25|-|0|25"_qs, u"50|30|1|30"_qs, u"70|-|1|50"_qs,
                                         u"70|80|2|60"_qs, u"85|-|2|75"_qs, u"110|-|2|100"_qs}));
    EXPECT_EQ(file.notes(), QStringList());
}

TEST(LandXmlStations, RoundOnesAreRoundInEachRegion)
{
    LandXmlQuery query = everyTenth();
    query.fromRound = true;
    query.atElements = false;
    EXPECT_EQ(
        stationsOf(fileOf(alignment(straight, "name='road' staStart='0'", equations)), query),
        QStringList({u"0.000"_qs, u"25.000"_qs, u"50.000"_qs, u"75.000"_qs, u"70.000"_qs, u"75.000"_qs, u"100.000"_qs}))
        << "the station 70 is where the second equation is";
    const QByteArray falling = "<StaEquation staInternal='30' staAhead='90' staIncrement='decreasing'/>";
    EXPECT_EQ(stationsOf(fileOf(alignment(straight, "name='road' staStart='0'", falling)), query),
              QStringList({u"0.000"_qs, u"25.000"_qs, u"90.000"_qs, u"75.000"_qs, u"50.000"_qs, u"25.000"_qs}));
}

TEST(LandXmlStations, RoundOnesEndWhereverTheyBegin)
{
    LandXmlQuery query = everyTenth();
    query.fromRound = true;
    // Beyond 2 to the power of 53 the next multiple is the same number.
    for (const char *start : {"name='road' staStart='1e18'", "name='road' staStart='-1e18'"}) {
        EXPECT_LT(stationsOf(fileOf(alignment(straight, start)), query).size(), 100) << start;
    }
    LandXmlFile infinite(fileOf(alignment(straight, "name='road' staStart='INF'")), query);
    EXPECT_EQ(infinite.rows(), QStringList());
    EXPECT_TRUE(infinite.list->error()) << "there are no stations to count";
}

TEST(LandXmlStations, ThatAreListedAreWhereverTheirNumberIs)
{
    LandXmlQuery query = queryOf(Kind::Stations);
    query.atElements = false;
    query.stations = {75, 40, 10};
    LandXmlFile file(fileOf(alignment(straight, "name='road' staStart='0'", equations)), query,
                     {QStringLiteral("Station"), QStringLiteral("Along"), QStringLiteral("Region")});
    const QStringList rows = file.rows(0);
    EXPECT_TRUE(rows.contains(u"10|10|0"_qs));
    EXPECT_TRUE(rows.contains(u"75|55|1"_qs) && rows.contains(u"75|65|2"_qs)) << "both places of the overlap";
    EXPECT_EQ(file.notes(), QStringList({u"4:13: the alignment has the station 75.000 at several places"_qs,
                                         u"4:13: the alignment has no station 40.000"_qs}));
}

TEST(LandXmlStations, HaveHeightsOfTheGradeLineAndTheSurface)
{
    const QByteArray content = fileOf(alignment(straight, "name='road'", {}, profile));
    LandXmlQuery query = everyTenth();
    const QStringList variables = {QStringLiteral("Design"), QStringLiteral("Grade"), QStringLiteral("Ground"),
                                   QStringLiteral("CutFill")};
    EXPECT_EQ(LandXmlFile(content, query, variables).rows(2),
              QStringList({u"10.00|2.00|11.00|-1.00"_qs, u"10.50|2.00|10.00|0.50"_qs, u"11.00|2.00|9.00|2.00"_qs,
                           u"11.50|2.00|10.00|1.50"_qs, u"12.00|2.00|11.00|1.00"_qs}));
    query.gradeLine = u"other"_qs;
    EXPECT_EQ(LandXmlFile(content, query, variables).row(1, 2), u"0.00|0.00|10.00|-10.00"_qs);
    query.surface = u"rock"_qs;
    LandXmlFile rock(content, query, variables);
    EXPECT_EQ(rock.rows(), QStringList());
    EXPECT_EQ(textOfError(rock.list->error()), u"\"rock\" is not in the file: one of ground was expected"_qs);
    query.surface.clear();
    query.gradeLine = u"old"_qs;
    LandXmlFile old(content, query, variables);
    EXPECT_EQ(old.rows(), QStringList());
    EXPECT_EQ(textOfError(old.list->error()), u"\"old\" is not in the file: one of design, other was expected"_qs);
    LandXmlFile lane(content, queryOf(Kind::Stations, "lane"), variables);
    EXPECT_EQ(lane.rows(), QStringList());
    EXPECT_EQ(textOfError(lane.list->error()), u"\"lane\" is not in the file: one of road was expected"_qs);
}

TEST(LandXmlStations, MayBeAskedForInTheUnitOfTheFile)
{
    const QByteArray feet = "<LandXML><Units><Imperial linearUnit='USSurveyFoot'/></Units>" +
                            alignment("<Line><Start>0 0</Start><End>3937 0</End></Line>") + "</LandXML>";
    LandXmlQuery query = queryOf(Kind::Stations);
    query.unit.reset();
    query.interval = 1968.5;
    query.stations = {39.37, 4000};
    query.offsets = {{-78.74, std::nullopt}};
    LandXmlFile file(feet, query, {QStringLiteral("Station"), QStringLiteral("Easting1")});
    EXPECT_EQ(file.rows(6), QStringList({u"0.000000|-24.000000"_qs, u"12.000000|-24.000000"_qs,
                                         u"600.000000|-24.000000"_qs, u"1200.000000|-24.000000"_qs}))
        << "3937 feet are 1200 metres";
    EXPECT_TRUE(file.notes().value(0).contains(u"the alignment has no station 4000.000")) << "as it was asked for";
}

TEST(LandXmlStations, HavePointsBesideThem)
{
    LandXmlQuery query = queryOf(Kind::Stations);
    query.offsets = {{-5, -2.5}, {7, std::nullopt}};
    LandXmlFile file(fileOf(alignment(straight, "name='road'", {}, profile)), query,
                     {QStringLiteral("Offset1"), QStringLiteral("Northing1"), QStringLiteral("Easting1"),
                      QStringLiteral("Elevation1"), QStringLiteral("Offset2"), QStringLiteral("Easting2"),
                      QStringLiteral("Elevation2")});
    EXPECT_EQ(file.row(1, 3), u"-5.000|100.000|-5.000|11.875|7.000|7.000|-"_qs) << "left is west of a way to the north";
    LandXmlFile bent(fileOf(alignment(bend())), query, {QStringLiteral("Northing2"), QStringLiteral("Easting2")});
    EXPECT_EQ(bent.row(3, 3), u"1193.000|650.000"_qs) << "right of a way to the east is south";
}

TEST(LandXmlStations, AreSortedAndGoneBackTo)
{
    LandXmlQuery query = everyTenth();
    LandXmlFile file(fileOf(alignment(straight, "name='road'", {}, profile)), query,
                     {QStringLiteral("Station"), QStringLiteral("Ground")});
    EXPECT_EQ(file.row(4, 0), u"100|11"_qs);
    EXPECT_EQ(file.row(0, 0), u"0|11"_qs);
    file.list->Sort({file.id("Ground"), file.id("Station")});
    EXPECT_EQ(file.rows(0), QStringList({u"50|9"_qs, u"25|10"_qs, u"75|10"_qs, u"0|11"_qs, u"100|11"_qs}));
}

TEST(LandXmlStations, EquationsThatDoNotFitAreErrors)
{
    struct Row
    {
        const char *equations;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"<StaEquation staInternal='50' staAhead='1'/>\n<StaEquation staInternal='30' staAhead='1'/>", "out of order"},
        {"\n<StaEquation staInternal='-5' staAhead='1'/>", "before the start"},
        {"\n<StaEquation staAhead='1'/>", "nowhere"},
        {"\n<StaEquation staInternal='50'/>", "without a station"},
    };
    for (const Row &row : rows) {
        for (const Kind kind : {Kind::Stations, Kind::Elements, Kind::Alignments}) {
            LandXmlFile file(fileOf(alignment(straight, "name='road'", row.equations)), queryOf(kind));
            EXPECT_EQ(file.rows(), QStringList()) << row.reason;
            ASSERT_TRUE(file.list->error()) << row.reason;
            EXPECT_EQ(placeText(file.list->error()), u"5:1"_qs) << row.reason;
            EXPECT_TRUE(file.list->error()->text.contains(u"station equation")) << row.reason;
        }
    }
    LandXmlFile differs(
        fileOf(alignment(straight, "name='road'", "<StaEquation staInternal='50' staBack='51' staAhead='1'/>")),
        queryOf(Kind::Stations));
    differs.rows();
    EXPECT_EQ(differs.notes().size(), 1);
    EXPECT_TRUE(differs.notes().value(0).contains(u"staBack is 51.0000 in the file, but 50.0000 by its geometry"));
}

TEST(LandXmlStations, AnIntervalThatNobodyMeansIsAnError)
{
    LandXmlQuery query = queryOf(Kind::Stations);
    query.interval = 1e-9;
    LandXmlFile file(fileOf(alignment(straight)), query);
    EXPECT_EQ(file.list->GetAt(0), nullptr);
    EXPECT_TRUE(textOfError(file.list->error()).contains(u"more than 5000000 stations"));
}

TEST(LandXmlStations, AnAlignmentWithoutElementsHasNone)
{
    LandXmlFile file(fileOf("<Alignments><Alignment name='x'/></Alignments>"), everyTenth());
    EXPECT_EQ(file.rows(), QStringList());
    EXPECT_FALSE(file.list->error());
}

} // namespace
