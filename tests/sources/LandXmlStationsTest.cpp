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
    const QByteArray content = fileOf(alignment(straight, "name='road' staStart='0'", {}, profile));
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
    EXPECT_EQ(textOfError(rock.list->error()),
              u"the file has no surface \"rock\" for this list: one of ground was expected"_qs);
    query.surface.clear();
    query.gradeLine = u"old"_qs;
    LandXmlFile old(content, query, variables);
    EXPECT_EQ(old.rows(), QStringList());
    EXPECT_EQ(
        textOfError(old.list->error()),
        u"the file has no grade line \"old\" in the alignments that are listed: one of design, other was expected"_qs);
    LandXmlFile lane(content, queryOf(Kind::Stations, "lane"), variables);
    EXPECT_EQ(lane.rows(), QStringList());
    EXPECT_EQ(textOfError(lane.list->error()), u"the file has no alignment \"lane\": one of road was expected"_qs);
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
    LandXmlFile file(fileOf(alignment(straight, "name='road' staStart='0'", {}, profile)), query,
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
    LandXmlFile file(fileOf(alignment(straight, "name='road' staStart='0'", {}, profile)), query,
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
            LandXmlFile file(fileOf(alignment(straight, "name='road' staStart='0'", row.equations)), queryOf(kind));
            EXPECT_EQ(file.rows(), QStringList()) << row.reason;
            ASSERT_TRUE(file.list->error()) << row.reason;
            EXPECT_EQ(placeText(file.list->error()), u"5:1"_qs) << row.reason;
            EXPECT_TRUE(file.list->error()->text.contains(u"station equation")) << row.reason;
        }
    }
    LandXmlFile differs(fileOf(alignment(straight, "name='road' staStart='0'",
                                         "<StaEquation staInternal='50' staBack='51' staAhead='1'/>")),
                        queryOf(Kind::Stations));
    differs.rows();
    EXPECT_EQ(differs.notes().size(), 1);
    EXPECT_TRUE(differs.notes().value(0).contains(u"staBack is 51.0000 in the file, but 50.0000 by its geometry"));
}

TEST(LandXmlStations, AnIntervalWithoutASenseIsAnError)
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
    EXPECT_TRUE(file.notes().contains(u"4:13: the alignment has no elements, and therefore no stations"_qs));
}

TEST(LandXmlStations, AnEquationKeepsItsNamesBesideABorder)
{
    // The border is at 50, and the equations are nearer to it than places that are one row.
    const QByteArray elements = "<Line><Start>0 0</Start><End>50 0</End></Line>"
                                "<Line><Start name='B'>50 0</Start><End>100 0</End></Line>";
    struct Row
    {
        const char *internal;
        const char *row;
    };
    for (const Row &row : {Row{"50.00005", "500.00000|50.00005|1|B"}, Row{"49.99995", "500.00000|49.99995|1|B"}}) {
        LandXmlQuery query = everyTenth();
        query.stations = {50.00001};
        LandXmlFile file(
            fileOf(alignment(elements, "name='road' staStart='0'",
                             QByteArray("<StaEquation staInternal='") + row.internal + "' staAhead='500'/>")),
            query,
            {QStringLiteral("Station"), QStringLiteral("StationBack"), QStringLiteral("Region"),
             QStringLiteral("Point")});
        const QStringList rows = file.rows(5);
        EXPECT_EQ(rows.value(2), QString::fromLatin1(row.row));
        EXPECT_EQ(rows.size(), 5) << "0, 25, 50, 75 and 100 in all";
    }
    LandXmlFile two(fileOf(alignment(straight, "name='road' staStart='0'",
                                     "<StaEquation staInternal='50' staAhead='500'/>"
                                     "<StaEquation staInternal='50.00005' staAhead='900'/>")),
                    queryOf(Kind::Stations), {QStringLiteral("Station")});
    EXPECT_EQ(two.rows(2), QStringList({u"0.00"_qs, u"500.00"_qs, u"900.00"_qs, u"950.00"_qs})) << "each has names";
}

TEST(LandXmlStations, AnEquationMayBeAtTheStart)
{
    LandXmlQuery query = everyTenth();
    query.fromRound = true;
    LandXmlFile file(fileOf(alignment(straight, "name='road' staStart='10'",
                                      "<StaEquation staInternal='10' staBack='10' staAhead='510'/>")),
                     query, {QStringLiteral("Station"), QStringLiteral("StationBack"), QStringLiteral("Along")});
    EXPECT_EQ(file.rows(0), QStringList({u"510|10|0"_qs, u"525|-|15"_qs, u"550|-|40"_qs, u"575|-|65"_qs, u"600|-|90"_qs,
                                         u"610|-|100"_qs}));
    EXPECT_EQ(file.notes(), QStringList());
}

TEST(LandXmlStations, IntervalsEndWithTheAlignmentWhateverItsLastDigitsAre)
{
    // An end that misses the interval by less than places that are one row.
    for (const char *end : {"99.99995 0", "100.00005 0", "100 0"}) {
        LandXmlQuery query = everyTenth();
        query.atElements = false;
        for (const bool isRound : {false, true}) {
            query.fromRound = isRound;
            const QByteArray line = QByteArray("<Line><Start>0 0</Start><End>") + end + "</End></Line>";
            EXPECT_EQ(stationsOf(fileOf(alignment(line, "name='road' staStart='0'")), query).size(), 5) << end;
        }
    }
    LandXmlQuery query = everyTenth();
    query.atElements = false;
    query.fromRound = true;
    EXPECT_EQ(stationsOf(fileOf(alignment(straight, "name='road' staStart='25.00005'")), query).value(0), u"25.000"_qs)
        << "and begin with it";
}

TEST(LandXmlStations, TheEndOfManyCurvesHasCoordinates)
{
    // The sum of the elements' lengths and the sum of their pieces' differ by the last digits.
    QByteArray elements;
    const auto at = [](int i) { return QByteArray::number(i * 1e6 + i % 7 * 0.1, 'f', 3) + " 0"; };
    for (int i = 0; i < 900; ++i) {
        elements += "<IrregularLine><Start>" + at(i) + "</Start><End>" + at(i + 1) + "</End><PntList2D>" +
                    QByteArray::number(i * 1e6 + 333333.3, 'f', 3) + " 0.1 " +
                    QByteArray::number(i * 1e6 + 777777.7, 'f', 3) + " 0.1</PntList2D></IrregularLine>";
    }
    LandXmlFile file(fileOf(alignment(elements)), queryOf(Kind::Stations), {QStringLiteral("Northing")});
    const QStringList rows = file.rows(1);
    ASSERT_EQ(rows.size(), 901);
    EXPECT_EQ(rows.back(), u"900000000.4"_qs);
    EXPECT_FALSE(rows.contains(u"0.0"_qs) && rows.lastIndexOf(u"0.0"_qs) > 0);
}

TEST(LandXmlStations, OfAnAlignmentAreListedWhateverIsWrongWithOthers)
{
    const QByteArray sound = alignment(straight, "name='sound'");
    const QByteArray wrong[] = {
        alignment(straight, "name='wrong'", "<StaEquation staInternal='-5' staAhead='1'/>"),
        alignment("<Line><Start>0 0</Start></Line>", "name='wrong'"),
        alignment("<Line><Start pntRef='gone'/><End>0 0</End></Line>", "name='wrong'"),
        alignment(
            "<Spiral length='65000' rot='cw' spiType='clothoid' radiusStart='INF' radiusEnd='1'><Start>0 0</Start>"
            "<End>1 1</End></Spiral>",
            "name='wrong'")
            .repeated(9),
    };
    for (const QByteArray &other : wrong) {
        for (const Kind kind : {Kind::Stations, Kind::Elements, Kind::Alignments, Kind::Profile, Kind::CrossSections}) {
            LandXmlFile file(fileOf(other + sound), queryOf(kind, "sound"));
            file.rows();
            EXPECT_FALSE(file.list->error())
                << other.left(120).constData() << textOfError(file.list->error()).toStdString();
        }
        LandXmlQuery offsets = queryOf(Kind::OffsetsOf);
        offsets.alignment = u"sound"_qs;
        LandXmlFile file(fileOf(other + sound), offsets);
        file.rows();
        EXPECT_FALSE(file.list->error()) << other.left(120).constData();
        LandXmlFile stations(fileOf(other + sound), queryOf(Kind::Stations, "wrong"));
        stations.rows();
        EXPECT_TRUE(stations.list->error()) << "asked for itself it is an error: " << other.left(120).constData();
    }
}

TEST(LandXmlStations, TheGroundHasGapsBetweenItsPieces)
{
    const auto ground = [](const QByteArray &lists) {
        return fileOf(alignment(straight, "name='road' staStart='0'", {},
                                "\n<Profile><ProfSurf name='g'>" + lists + "</ProfSurf></Profile>"));
    };
    LandXmlQuery query = queryOf(Kind::Stations);
    query.interval = 20;
    query.atElements = false;
    LandXmlFile file(ground("<PntList2D>0 1 20 3 30 3</PntList2D><PntList2D>70 9 80 5 100 5</PntList2D>"), query,
                     {QStringLiteral("Station"), QStringLiteral("Ground")});
    EXPECT_EQ(file.rows(0), QStringList({u"0|1"_qs, u"20|3"_qs, u"40|-"_qs, u"60|-"_qs, u"80|5"_qs, u"100|5"_qs}));
    EXPECT_EQ(file.notes(), QStringList());
    query.interval = 10;
    LandXmlFile ends(ground("<PntList2D>0 1 20 3 30 3</PntList2D><PntList2D>70 9 80 5 100 5</PntList2D>"), query,
                     {QStringLiteral("Ground")});
    EXPECT_EQ(ends.rows(0).value(3), u"3"_qs) << "the end of a piece";
    EXPECT_EQ(ends.rows(0).value(7), u"9"_qs) << "the beginning of the next one";
    LandXmlFile joined(ground("<PntList2D>0 1 20 3</PntList2D><PntList2D>20 3 100 3</PntList2D>"), query,
                       {QStringLiteral("Ground")});
    EXPECT_EQ(joined.rows(0).value(1), u"2"_qs);
    EXPECT_EQ(joined.rows(0).value(5), u"3"_qs) << "pieces that meet have no gap";
    LandXmlFile unordered(ground("<PntList2D>0 1 30 3 20 3 100 5</PntList2D>"), query, {QStringLiteral("Ground")});
    EXPECT_EQ(unordered.rows(0).value(1), u"-"_qs);
    EXPECT_EQ(unordered.notes(),
              QStringList(u"6:10: the stations of the surface \"g\" do not ascend: no heights are taken from it"_qs));
}

TEST(LandXmlStations, ALineThatReachesTheCentreOfAnElementIsNoted)
{
    LandXmlQuery query = queryOf(Kind::Stations);
    query.offsets = {{99.9, std::nullopt}, {100, std::nullopt}, {150, std::nullopt}, {-150, std::nullopt}};
    LandXmlFile file(fileOf(alignment(bend())), query, {QStringLiteral("Station")});
    EXPECT_EQ(file.rows().size(), 4);
    EXPECT_EQ(
        file.notes(),
        QStringList({u"6:1: the line at the offset 100.000 does not run forward here: the radius of the element is "
                     "100.000"_qs,
                     u"6:1: the line at the offset 150.000 does not run forward here: the radius of the element is "
                     "100.000"_qs}))
        << "on the inner side alone";
    const PlaneCurve left = curve(TransitionForm::Clothoid, {0, 0}, 0, 60, 0, -1 / 50.0);
    query.offsets = {{-60, std::nullopt}, {60, std::nullopt}};
    LandXmlFile spirals(fileOf(alignment(spiral(left, "clothoid"))), query, {QStringLiteral("Station")});
    spirals.rows();
    ASSERT_EQ(spirals.notes().size(), 1);
    EXPECT_TRUE(spirals.notes().front().contains(u"offset -60.000")) << spirals.notes().front().toStdString();
}

} // namespace
