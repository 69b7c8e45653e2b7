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

constexpr double pi = std::numbers::pi;

TEST(LandXmlElements, AreListedAsTheyAreStored)
{
    LandXmlFile file(fileOf(alignment(bend(), "name='road' staStart='10'")), queryOf(Kind::Elements),
                     {QStringLiteral("Alignment"), QStringLiteral("Element"), QStringLiteral("Type"),
                      QStringLiteral("StartStation"), QStringLiteral("EndStation"), QStringLiteral("Length"),
                      QStringLiteral("Radius"), QStringLiteral("StartPoint")});
    EXPECT_EQ(file.rows(3), QStringList({u"road|1|Line|10.000|110.000|100.000|inf|A"_qs,
                                         u"road|2|Curve|110.000|267.080|157.080|100.000|B"_qs,
                                         u"road|3|Line|267.080|317.080|50.000|inf|C"_qs}));
    EXPECT_EQ(file.notes(), QStringList());
}

TEST(LandXmlElements, OfACurveHaveItsCentreItsTangentsAndItsDeflection)
{
    LandXmlFile file(fileOf(alignment(bend())), queryOf(Kind::Elements));
    struct Row
    {
        const char *variable;
        double value;
    };
    const Row rows[] = {{"StartBearing", 0},     {"EndBearing", pi / 2},   {"Deflection", pi / 2},
                        {"StartNorthing", 1100}, {"StartEasting", 500},    {"EndNorthing", 1200},
                        {"EndEasting", 600},     {"CentreNorthing", 1100}, {"CentreEasting", 600},
                        {"PINorthing", 1200},    {"PIEasting", 500}};
    for (const Row &row : rows) {
        EXPECT_NEAR(file.number(1, row.variable), row.value, 1e-9) << row.variable;
    }
    EXPECT_TRUE(std::isnan(file.number(0, "CentreNorthing"))) << "a line has none";
    EXPECT_TRUE(std::isnan(file.number(0, "Parameter")));
}

TEST(LandXmlElements, TransitionsOfAllFormsFitTheirPoints)
{
    struct Row
    {
        const char *name;
        TransitionForm form;
    };
    const Row rows[] = {
        {"clothoid", TransitionForm::Clothoid},           {"bloss", TransitionForm::Bloss},
        {"biquadratic", TransitionForm::Biquadratic},     {"cosine", TransitionForm::Cosine},
        {"sinusoid", TransitionForm::Sinusoid},           {"cubicParabola", TransitionForm::CubicParabola},
        {"japaneseCubic", TransitionForm::CubicParabola}, {"sineHalfWave", TransitionForm::SineHalfWave}};
    for (const Row &row : rows) {
        for (const auto &[first, last] :
             {std::pair(0.0, 1 / 250.0), std::pair(0.0, -1 / 250.0), std::pair(1 / 90.0, 0.0),
              std::pair(-1 / 90.0, 0.0), std::pair(1 / 200.0, 1 / 90.0)})
        {
            if (isOverTangent(row.form) && first != 0 && last != 0) {
                continue;
            }
            const PlaneCurve made = curve(row.form, {5516120, 3512822}, 2.3, 62.5, first, last);
            LandXmlFile file(fileOf(alignment(spiral(made, row.name))), queryOf(Kind::Elements));
            EXPECT_NEAR(file.number(0, "StartBearing"), 2.3, 1e-8) << row.name << " " << first << " to " << last;
            EXPECT_NEAR(file.number(0, "EndBearing"), made.end().bearing, 1e-8) << row.name;
            EXPECT_NEAR(file.number(0, "Deflection"), made.turnTo(62.5), 1e-12) << row.name;
            EXPECT_NEAR(file.number(0, "EndNorthing"), made.end().point.northing, 1e-7) << row.name;
            EXPECT_EQ(file.notes(), QStringList()) << row.name << " " << first << " to " << last;
            const double parameter = std::sqrt(62.5 / std::fabs(first - last));
            EXPECT_EQ(file.number(0, "Parameter") > 0, row.form == TransitionForm::Clothoid);
            if (row.form == TransitionForm::Clothoid) {
                EXPECT_NEAR(file.number(0, "Parameter"), parameter, 1e-5);
            }
        }
    }
}

TEST(LandXmlElements, CurvesWithoutACentreHaveTheirRadius)
{
    const QByteArray ends = "<Start>0 0</Start><End>6 0</End></Curve>";
    struct Row
    {
        const char *attributes;
        double centre;
        bool isNoted; // that the file does not say which way
        const char *reason;
    };
    const Row rows[] = {{"rot='cw' radius='5'>", 4, true, "the short way"},
                        {"rot='ccw' radius='5'>", -4, true, "to the left"},
                        {"rot='ccw' radius='3'>", 0, false, "half a circle has no other way"},
                        {"rot='cw' radius='5'><PI>3 -2.25</PI>", 4, false, "by its tangents"},
                        {"rot='cw' radius='5' length='24.9809'>", -4, false, "the long way, by its length"},
                        {"rot='cw' radius='5' length='6.435'>", 4, false, "the short way, by its length"},
                        {"rot='cw' radius='5' delta='286.26'>", -4, false, "by its angle"}};
    const QString note = u"5:1: the curve has no Center, length, delta or PI that says which way round it goes: "
                         "the shorter arc of its radius was taken"_qs;
    for (const Row &row : rows) {
        LandXmlFile file(fileOf(alignment(QByteArray("<Curve ") + row.attributes + ends)), queryOf(Kind::Elements),
                         {QStringLiteral("CentreEasting")});
        EXPECT_NEAR(file.number(0, "CentreEasting"), row.centre, 1e-9) << row.reason;
        EXPECT_EQ(file.notes(), row.isNoted ? QStringList(note) : QStringList()) << row.reason;
    }
}

TEST(LandXmlElements, AFullCircleIsToldFromNothingByItsLength)
{
    struct Row
    {
        const char *attributes;
        const char *end;
        const char *row;
        bool hasParallelTangents;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"length='628.319'", "1100 500", "628.319", true, "a circle"},
        {"delta='360'", "1100 500", "628.319", true, "by its angle"},
        {"length='0.0001'", "1099.9999 500", "0.000", true, "an end that its digits put before the start"},
        {"length='628.3184'", "1099.9999 500", "628.318", false, "nearly a circle"},
    };
    const QStringList parallel = {u"5:1: the tangents of the element are parallel: it has no PI"_qs};
    for (const Row &row : rows) {
        LandXmlFile file(
            fileOf(alignment(QByteArray("<Curve rot='cw' ") + row.attributes +
                             "><Start>1100 500</Start><Center>1100 600</Center><End>" + row.end + "</End></Curve>")),
            queryOf(Kind::Elements), {QStringLiteral("Length"), QStringLiteral("PIEasting")});
        EXPECT_EQ(file.rows(3).value(0).section(u'|', 0, 0), QString::fromLatin1(row.row)) << row.reason;
        EXPECT_EQ(file.notes(), row.hasParallelTangents ? parallel : QStringList()) << row.reason;
    }
    for (const char *nothing : {"", "length='0'", "delta='0'"}) {
        LandXmlFile file(
            fileOf(alignment(QByteArray("<Curve rot='cw' ") + nothing +
                             "><Start>1100 500</Start><Center>1100 600</Center><End>1100 500</End></Curve>")),
            queryOf(Kind::Elements));
        EXPECT_EQ(file.rows(), QStringList()) << nothing;
        EXPECT_EQ(file.notes(), QStringList(u"5:1: the element has no length and was left out"_qs)) << nothing;
    }
}

TEST(LandXmlElements, IrregularLinesAreTheirPieces)
{
    LandXmlFile file(fileOf(alignment("<IrregularLine><Start>0 0</Start><End>10 10</End><PntList2D>0 0 10 0 10 5 10 "
                                      "5</PntList2D></IrregularLine>")),
                     queryOf(Kind::Elements),
                     {QStringLiteral("Type"), QStringLiteral("Length"), QStringLiteral("EndBearing")});
    EXPECT_EQ(file.rows(3), QStringList(u"IrregularLine|20.000|1.571"_qs))
        << "points that are there twice make no line";
}

TEST(LandXmlElements, WhatDiffersFromTheGeometryIsNotedWithBothValues)
{
    const PlaneCurve made = curve(TransitionForm::Clothoid, {100, 200}, 0, 62.5, 0, 1 / 250.0);
    QByteArray moved = spiral(made, "clothoid");
    moved.replace(number(made.end().point.northing), number(made.end().point.northing + 0.5));
    QByteArray mirrored = spiral(made, "clothoid");
    mirrored.replace("<End>", "<PI>141.6873 200</PI><End>").replace("'cw'", "'ccw'");
    struct Row
    {
        QByteArray elements;
        const char *note;
        const char *reason;
    };
    const Row rows[] = {
        {"<Line length='10.003'><Start>0 0</Start><End>10 0</End></Line>",
         "5:1: length is 10.0030 in the file, but 10.0000 by its geometry", "a length"},
        {"<Line dir='90.002'><Start>0 0</Start><End>0 100</End></Line>",
         "5:1: dir is 90.00200 in the file, but 90.00000 by its geometry", "a direction"},
        {"<Curve rot='cw' radius='100.01'><Start>1100 500</Start><Center>1100 600</Center><End>1200 600</End></Curve>",
         "5:1: radius is 100.0100 in the file, but 100.0000 by its geometry", "a radius"},
        {"<Curve rot='cw'><Start>1100 500</Start><Center>1100 600</Center><End>1200.01 600</End></Curve>",
         "5:1: End is 1200.0100 600.0000 in the file, but 1200.0000 600.0000 by its geometry", "an end"},
        {moved, "5:1: End is 162.9024 202.6013 in the file, but 162.4033 202.5806 by its geometry",
         "the end of a transition, which was laid towards it"},
        {mirrored,
         "5:1: PI is 141.6873 200.0000 in the file, but 141.5561 203.4706 by its geometry: 3.4695 beside the tangents of "
         "the element, which perhaps bends to the other side",
         "a transition to the wrong side"},
        {"<Line><Start>0 0</Start><PI>5 1</PI><End>10 0</End></Line>",
         "5:1: PI is 5.0000 1.0000 in the file, but the tangents of the element are parallel", "a line has no PI"},
        {"<Line staStart='5'><Start>0 0</Start><End>10 0</End></Line>",
         "5:1: staStart is 5.0000 in the file, but 0.0000 by its geometry", "a station"},
        {"<Line><Start>0 0</Start><End>10 0</End></Line>\n<Line><Start>10.5 0</Start><End>20 0</End></Line>",
         "6:1: the element begins 0.5000 from the end of the element before: at 10.5000 0.0000, but that ends at 10.0000 "
         "0.0000",
         "a gap"},
        {"<Line><Start>0 0</Start><End>10 0</End></Line>\n<Line><Start>10 0</Start><End>10 0</End></Line>",
         "6:1: the element has no length and was left out", "nothing"},
    };
    for (const Row &row : rows) {
        LandXmlFile file(fileOf(alignment(row.elements)), queryOf(Kind::Elements));
        EXPECT_NE(file.list->GetAt(0), nullptr) << row.reason;
        file.rows();
        EXPECT_EQ(file.notes(), QStringList(QString::fromLatin1(row.note))) << row.reason;
    }
}

TEST(LandXmlElements, TheToleranceIsTheJobs)
{
    LandXmlQuery query = queryOf(Kind::Elements);
    query.tolerance.length = 0.01;
    LandXmlFile file(fileOf(alignment("<Line length='10.003'><Start>0 0</Start><End>10 0</End></Line>")), query);
    file.rows();
    EXPECT_EQ(file.notes(), QStringList());
}

TEST(LandXmlElements, TheToleranceOfDirectionsIsTheJobs)
{
    struct Row
    {
        const char *direction;
        double cc;
        qsizetype notes;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"90.0006", 10, 0, "6.7 cc, as it is without the job's"},
        {"90.0006", 5, 1, "a tighter one"},
        {"90.002", 10, 1, "22 cc, as it is without the job's"},
        {"90.002", 30, 0, "a looser one"},
    };
    for (const Row &row : rows) {
        LandXmlQuery query = queryOf(Kind::Elements);
        query.tolerance.angle = row.cc * pi / 2e6;
        LandXmlFile file(fileOf(alignment(QByteArray("<Line dir='") + row.direction +
                                          "'><Start>0 0</Start><End>0 2000</End></Line>")),
                         query);
        file.rows();
        EXPECT_EQ(file.notes().size(), row.notes) << row.reason;
    }
}

TEST(LandXmlElements, HaveTheValuesThatTheFileStatesWhereTheyDiffer)
{
    const QStringList names = {QStringLiteral("Radius"),        QStringLiteral("EndNorthing"),
                               QStringLiteral("EndEasting"),    QStringLiteral("CentreNorthing"),
                               QStringLiteral("CentreEasting"), QStringLiteral("PINorthing"),
                               QStringLiteral("PIEasting")};
    struct Row
    {
        const char *curve;
        const char *row;
        qsizetype notes;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"radius='100.01'><Start>1100 500</Start><Center>1100 600</Center><End>1200.02 600</End><PI>1200 500.03</PI>",
         "100.010|1200.020|600.000|1100.000|600.000|1200.000|500.030", 3, "all of them are stated"},
        {"length='157.08'><Start>1100 500</Start><Center>1100 600</Center><End>1200 600</End>",
         "100.000|1200.000|600.000|1100.000|600.000|1200.000|500.000", 0, "the radius and the PI are computed"},
        {"radius='100' length='157.08'><Start>1100 500</Start><End>1200 600</End>",
         "100.000|1200.000|600.000|1100.000|600.000|1200.000|500.000", 0, "and the centre"},
        {"radius='100'><Start>1100 500</Start><Center>1100 600</Center><End>1100 700</End><PI>9000 600</PI>",
         "100.000|1100.000|700.000|1100.000|600.000|9000.000|600.000", 1, "the PI of half a circle"},
    };
    for (const Row &row : rows) {
        LandXmlFile file(fileOf(alignment(QByteArray("<Curve rot='cw' ") + row.curve + "</Curve>")),
                         queryOf(Kind::Elements), names);
        EXPECT_EQ(file.rows(3), QStringList(QLatin1StringView(row.row))) << row.reason;
        EXPECT_EQ(file.notes().size(), row.notes) << row.reason << file.notes().join(u'\n').toStdString();
    }
    const PlaneCurve made = curve(TransitionForm::Clothoid, {100, 200}, 0, 62.5, 0, 1 / 250.0);
    QByteArray moved = spiral(made, "clothoid");
    moved.replace(number(made.end().point.northing), number(made.end().point.northing + 0.5));
    LandXmlFile transition(fileOf(alignment(moved)), queryOf(Kind::Elements), {QStringLiteral("EndNorthing")});
    EXPECT_NEAR(transition.number(0, "EndNorthing"), made.end().point.northing + 0.5, 1e-7);
}

TEST(LandXmlElements, DirectionsMayBeMeasuredInEachOfTheWaysThatProgramsKnow)
{
    // Towards south-east.
    for (const char *direction : {"135", "225", "-45", "315"}) {
        LandXmlFile file(
            fileOf(alignment(QByteArray("<Line dir='") + direction + "'><Start>0 0</Start><End>-10 10</End></Line>")),
            queryOf(Kind::Elements));
        file.rows();
        EXPECT_EQ(file.notes(), QStringList()) << direction;
    }
}

TEST(LandXmlElements, WithoutGeometryAreListedAndSaid)
{
    const QByteArray ends = "<Start>0 0</Start><End>10 5</End>";
    struct Row
    {
        QByteArray element;
        const char *contains;
        const char *reason;
    };
    const Row rows[] = {
        {"<Spiral length='10' rot='cw' spiType='revBloss' radiusStart='INF' radiusEnd='50'>" + ends + "</Spiral>",
         "not supported: a transition of the form \"revBloss\"", "a form without a description"},
        {"<Spiral length='10' rot='cw' spiType='clothoid' radiusStart='INF'>" + ends + "</Spiral>", "radiusEnd",
         "a radius that is missing"},
        {"<Spiral length='10' rot='cw' spiType='clothoid' radiusStart='INF' radiusEnd='0'>" + ends + "</Spiral>",
         "radiusEnd", "a radius of 0"},
        {"<Spiral length='10' rot='cw' spiType='clothoid' radiusStart='INF' radiusEnd='INF'>" + ends + "</Spiral>",
         "radiusStart", "no radius at all"},
        {"<Spiral length='10' spiType='clothoid' radiusStart='INF' radiusEnd='50'>" + ends + "</Spiral>", "rot",
         "no side"},
        {"<Spiral rot='cw' spiType='clothoid' radiusStart='INF' radiusEnd='50'>" + ends + "</Spiral>", "length",
         "no length"},
        {"<Spiral length='1e9' rot='cw' spiType='clothoid' radiusStart='INF' radiusEnd='0.001'>" + ends + "</Spiral>",
         "turns too many times", "a coil"},
        {"<Spiral length='10' rot='cw' spiType='cubicParabola' radiusStart='10' radiusEnd='5'>" + ends + "</Spiral>",
         "curved at both ends", "a form that begins at a tangent"},
        {"<Spiral length='100' rot='cw' spiType='cubicParabola' radiusStart='INF' radiusEnd='5'>" + ends + "</Spiral>",
         "45 degrees", "a form that is given over its tangent"},
        {"<Curve rot='cw'>" + ends + "</Curve>", "Center", "no centre and no radius"},
        {"<Curve rot='cw' radius='2'>" + ends + "</Curve>", "does not reach", "a radius that is too short"},
        {"<Curve radius='20'>" + ends + "</Curve>", "rot", "no side"},
        {"<Line length='3'><Start>0 0</Start></Line>", "End", "no end"},
        {"<Line length='3'><End>0 0</End></Line>", "Start", "no start"},
        {"<Line length='3'><Start pntRef='x'/><End>0 0</End></Line>", "\"x\" is not in the file",
         "a point that is missing"},
    };
    for (const Row &row : rows) {
        const QByteArray content = fileOf(alignment(row.element));
        LandXmlFile file(content, queryOf(Kind::Elements), {QStringLiteral("Element"), QStringLiteral("StartBearing")});
        EXPECT_EQ(file.rows(), QStringList(u"1|-"_qs)) << row.reason;
        EXPECT_FALSE(file.list->error()) << row.reason;
        ASSERT_GE(file.notes().size(), 1) << row.reason;
        EXPECT_TRUE(file.notes().front().startsWith(u"5:") &&
                    file.notes().front().contains(QString::fromLatin1(row.contains)))
            << row.reason << ": " << file.notes().front().toStdString();

        LandXmlQuery stations = queryOf(Kind::Stations);
        LandXmlFile places(content, stations);
        EXPECT_EQ(places.rows(), QStringList()) << row.reason << ": no place is guessed";
        EXPECT_TRUE(textOfError(places.list->error()).contains(QString::fromLatin1(row.contains))) << row.reason;
        EXPECT_TRUE(placeText(places.list->error()).startsWith(u"5:")) << row.reason;
    }
}

TEST(LandXmlElements, OfOtherKindsKeepTheirPlaceAndHaveNoGeometry)
{
    const QByteArray line = "<Line><Start>0 0</Start><End>10 0</End></Line>";
    const QByteArray content =
        fileOf(alignment(line + "\n<Chain>a b c</Chain>\n<Line><Start>30 0</Start><End>40 0</End></Line>"));
    LandXmlFile file(content, queryOf(Kind::Elements),
                     {QStringLiteral("Element"), QStringLiteral("Type"), QStringLiteral("Form"),
                      QStringLiteral("StartStation"), QStringLiteral("EndStation"), QStringLiteral("Length"),
                      QStringLiteral("StartRadius")});
    EXPECT_EQ(file.rows(0),
              QStringList({u"1|Line|-|0|10|10|inf"_qs, u"2|Chain|-|10|-|-|-"_qs, u"3|Line|-|-|-|10|inf"_qs}))
        << "it is not known where the third one begins";
    EXPECT_EQ(file.notes(), QStringList(u"6:1: not supported: an element \"Chain\" of an alignment or a border"_qs));

    LandXmlFile lengths(content, queryOf(Kind::Alignments), {QStringLiteral("Length"), QStringLiteral("EndStation")});
    EXPECT_EQ(lengths.rows(), QStringList(u"-|-"_qs));
    LandXmlFile places(content, queryOf(Kind::Stations));
    EXPECT_EQ(places.rows(), QStringList());
    EXPECT_EQ(placeText(places.list->error()), u"6:1"_qs);
    LandXmlFile feature(fileOf(alignment(line + "<Feature/>")), queryOf(Kind::Elements), {QStringLiteral("Type")});
    EXPECT_EQ(feature.rows(), QStringList(u"Line"_qs)) << "what says more of an element is not one itself";
    EXPECT_EQ(feature.notes(), QStringList(u"Feature: 1 in the file, which no list reads"_qs));
}

TEST(LandXmlElements, WithoutGeometryButWithALengthLeaveTheStationsAfterThem)
{
    LandXmlFile file(fileOf(alignment("<Curve length='10'><Start>0 0</Start><End>10 0</End></Curve>"
                                      "<Line><Start>10 0</Start><End>15 0</End></Line>")),
                     queryOf(Kind::Elements),
                     {QStringLiteral("StartStation"), QStringLiteral("EndStation"), QStringLiteral("Length")});
    EXPECT_EQ(file.rows(0), QStringList({u"0|10|10"_qs, u"10|15|5"_qs}));
}

TEST(LandXmlElements, TheirPointsMayBeReferred)
{
    LandXmlFile file(fileOf(alignment("<Line><Start pntRef='a'/><End pntRef='b'/></Line>") +
                            "<CgPoints><CgPoint name='a'>1 2</CgPoint><CgPoint name='b'>1 7</CgPoint></CgPoints>"),
                     queryOf(Kind::Elements), {QStringLiteral("StartNorthing"), QStringLiteral("EndEasting")});
    EXPECT_EQ(file.rows(0), QStringList(u"1|7"_qs)) << "points that come after the alignment";
}

TEST(LandXmlElements, AttributesThatAreNotNumbersAreErrors)
{
    for (const char *attribute : {"length='1,5'", "staStart='x'", "length='nan'", "length='INF'", "staStart='INF'"}) {
        LandXmlFile file(
            fileOf(alignment(QByteArray("<Line ") + attribute + "><Start>0 0</Start><End>10 0</End></Line>")),
            queryOf(Kind::Elements));
        EXPECT_EQ(file.rows(), QStringList()) << attribute;
        ASSERT_TRUE(file.list->error()) << attribute;
        EXPECT_EQ(placeText(file.list->error()), u"5:1"_qs) << attribute;
    }
}

TEST(LandXmlElements, OfOneAlignmentAreListedAlone)
{
    const QByteArray content =
        fileOf(alignment(bend()) + alignment("<Line><Start>0 0</Start><End>1 0</End></Line>", "name='lane'"));
    EXPECT_EQ(LandXmlFile(content, queryOf(Kind::Elements, "lane")).rows().size(), 1);
    EXPECT_EQ(LandXmlFile(content, queryOf(Kind::Elements)).rows().size(), 4);
    LandXmlFile all(content, queryOf(Kind::Alignments),
                    {QStringLiteral("Alignment"), QStringLiteral("Length"), QStringLiteral("Elements"),
                     QStringLiteral("EndEasting")});
    EXPECT_EQ(all.rows(2), QStringList({u"road|307.08|3|650.00"_qs, u"lane|1.00|1|0.00"_qs}));
}

TEST(LandXmlElements, WithoutGeometryHaveTheirCoordinatesAsStored)
{
    LandXmlFile file(fileOf(alignment("<Curve radius='20'><Start name='A'>1 2</Start><Center>3 4</Center><End>5 6</End>"
                                      "<PI>7 8</PI></Curve><Line length='3'><Start>5 6</Start></Line>")),
                     queryOf(Kind::Elements),
                     {QStringLiteral("StartNorthing"), QStringLiteral("StartEasting"), QStringLiteral("EndNorthing"),
                      QStringLiteral("EndEasting"), QStringLiteral("CentreNorthing"), QStringLiteral("CentreEasting"),
                      QStringLiteral("PINorthing"), QStringLiteral("PIEasting"), QStringLiteral("StartBearing")});
    EXPECT_EQ(file.rows(0), QStringList({u"1|2|5|6|3|4|7|8|-"_qs, u"5|6|-|-|-|-|-|-|-"_qs}));
}

TEST(LandXmlElements, DirectionsOfAFileAreAllMeasuredInOneWay)
{
    // Towards north-east, south-east, south-west: clockwise from north.
    const auto line = [](const char *direction, const char *end) {
        return QByteArray("<Line dir='") + direction + "'><Start>0 0</Start><End>" + end + "</End></Line>\n";
    };
    const auto notesOf = [&](const QByteArray &elements) {
        LandXmlFile file(fileOf(alignment(elements)), queryOf(Kind::Elements));
        file.rows();
        return file.notes().filter(u"dir"_qs);
    };
    const QByteArray sound = line("45", "10 10") + line("135", "-10 10") + line("225", "-10 -10");
    EXPECT_EQ(notesOf(sound), QStringList());
    EXPECT_EQ(notesOf(sound + line("315", "-10 10")),
              QStringList(u"8:1: dir is 315.00000 in the file, but 135.00000 by its geometry"_qs))
        << "it would fit if it alone were measured from east";
    EXPECT_EQ(notesOf(line("30", "10 17.3205081") + line("330", "10 -17.3205081") + line("60", "17.3205081 10")),
              QStringList({u"6:1: dir is 330.00000 in the file, but 150.00000 by its geometry"_qs}))
        << "counterclockwise from east, as most are";
}

TEST(LandXmlElements, NotesOfDirectionsAreInTheUnitOfTheFile)
{
    struct Row
    {
        const char *unit;
        const char *direction;
        const char *note;
    };
    constexpr Row rows[] = {
        {"grads", "100.01", "dir is 100.01000 in the file, but 100.00000 by its geometry"},
        {"radians", "1.58", "dir is 1.5800000 in the file, but 1.5707963 by its geometry"},
        {"decimal degrees", "90.5", "dir is 90.50000 in the file, but 90.00000 by its geometry"},
        {"decimal dd.mm.ss", "90.3015", "dir is 90.301500 in the file, but 90.000000 by its geometry"},
    };
    for (const Row &row : rows) {
        QByteArray content = fileOf(
            alignment(QByteArray("<Line dir='") + row.direction + "'><Start>0 0</Start><End>0 100</End></Line>"));
        content.replace("directionUnit=\"decimal degrees\"", QByteArray("directionUnit=\"") + row.unit + "\"");
        LandXmlFile file(content, queryOf(Kind::Elements));
        file.rows();
        EXPECT_EQ(file.notes(), QStringList(u"5:1: "_qs + QLatin1StringView(row.note))) << row.unit;
    }
}

TEST(LandXmlElements, ADirectionThatCannotBeReadIsNoted)
{
    for (const char *attribute : {"dir='1.2.3'", "dir='N 45 E'"}) {
        LandXmlFile file(
            fileOf(alignment(QByteArray("<Line ") + attribute + "><Start>0 0</Start><End>10 0</End></Line>")),
            queryOf(Kind::Elements));
        EXPECT_EQ(file.rows().size(), 1) << attribute << ": no geometry depends on it";
        EXPECT_FALSE(file.list->error()) << attribute;
        ASSERT_EQ(file.notes().size(), 1) << attribute;
        EXPECT_TRUE(file.notes().front().contains(u"an angle in the file's unit was expected"));
    }
}

TEST(LandXmlElements, AngleOfACurveToTheLeftMayBeBelowZero)
{
    LandXmlFile file(
        fileOf(alignment("<Curve rot='ccw' radius='5' delta='-286.26'><Start>0 0</Start><End>6 0</End></Curve>")),
        queryOf(Kind::Elements));
    EXPECT_NEAR(file.number(0, "CentreEasting"), 4, 1e-9) << "the long way";
    LandXmlFile circle(fileOf(alignment("<Curve rot='ccw' delta='-360'><Start>1100 500</Start><Center>1100 600</Center>"
                                        "<End>1100 500</End></Curve>")),
                       queryOf(Kind::Elements), {QStringLiteral("Length")});
    EXPECT_EQ(circle.rows(3), QStringList(u"628.319"_qs));
}

TEST(LandXmlElements, ThatEndWhereTheyStartAndAreShorterThanTheToleranceAreLeftOut)
{
    const QByteArray ends = "<Start>10 0</Start><End>10 0</End>";
    const QByteArray line = "<Line><Start>0 0</Start><End>10 0</End></Line>\n";
    for (const QByteArray &element :
         {"<Line length='0.0004'>" + ends + "</Line>",
          "<Curve rot='cw' radius='5' length='0.0004'>" + ends + "</Curve>",
          "<Spiral length='0.0004' rot='cw' spiType='clothoid' radiusStart='INF' radiusEnd='50'>" + ends + "</Spiral>"})
    {
        LandXmlFile file(fileOf(alignment(line + element)), queryOf(Kind::Stations), {QStringLiteral("Station")});
        EXPECT_EQ(file.rows(3), QStringList({u"0.000"_qs, u"10.000"_qs})) << element.constData();
        EXPECT_FALSE(file.list->error()) << element.constData();
        EXPECT_EQ(file.notes(), QStringList(u"6:1: the element has no length and was left out"_qs))
            << element.constData();
    }
    LandXmlFile longer(fileOf(alignment(line + "<Line length='9'>" + ends + "</Line>")), queryOf(Kind::Stations));
    EXPECT_EQ(longer.rows(), QStringList());
    EXPECT_TRUE(longer.list->error()) << "nine metres that lead nowhere are wrong";
}

TEST(LandXmlElements, RadiiAloneMayBeInfinite)
{
    LandXmlFile file(
        fileOf(alignment("<Spiral length='10' rot='cw' spiType='clothoid' radiusStart='INF' radiusEnd='50'>"
                         "<Start>0 0</Start><End>10 0.3</End></Spiral>")),
        queryOf(Kind::Elements), {QStringLiteral("StartRadius")});
    EXPECT_EQ(file.rows(), QStringList(u"inf"_qs));
    for (const char *element : {"<Line length='INF'/>", "<Line length='1e308'/>"}) {
        QByteArray content = fileOf(alignment(element));
        content.replace("\"meter\"", "\"kilometer\"");
        LandXmlFile wrong(content, queryOf(Kind::Elements));
        EXPECT_EQ(wrong.rows(), QStringList()) << element;
        EXPECT_EQ(placeText(wrong.list->error()), u"5:1"_qs) << element;
    }
}

} // namespace
