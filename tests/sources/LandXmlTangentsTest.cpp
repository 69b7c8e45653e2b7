#include "LandXmlFile.h"
#include "LandXmlRoad.h"

#include <gtest/gtest.h>

#include <cmath>

// What the elements of an alignment say of each other, and of themselves.

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

constexpr double pi = std::numbers::pi;

/// A line to the north, a clothoid, an arc and a clothoid of one side, and a line on. The elements have neither directions
/// nor an intersection of their tangents.
QByteArray road(double side, const char *rotation, const QByteArray &changed = {})
{
    const PlaneCurve in = curve(TransitionForm::Clothoid, {100, 0}, 0, 60, 0, side / 200);
    const PlaneCurve arc =
        curve(TransitionForm::Clothoid, in.end().point, in.end().bearing, 80, side / 200, side / 200);
    const PlaneCurve out = curve(TransitionForm::Clothoid, arc.end().point, arc.end().bearing, 60, side / 200, 0);
    const CurvePlace end = out.end();
    QByteArray content = "<Line><Start>0 0</Start><End>100 0</End></Line>\n" + spiral(in, "clothoid") +
                         "\n<Curve rot='" + rotation + "' radius='200' length='80'>" +
                         point("Start", arc.start().point) + point("End", arc.end().point) + "</Curve>\n" +
                         spiral(out, "clothoid") + "\n<Line>" + point("Start", end.point) +
                         point("End", end.point + turned({50, 0}, end.bearing)) + "</Line>";
    if (!changed.isEmpty()) {
        const qsizetype at = content.indexOf("<Spiral");
        const QByteArray other = changed == "cw" ? QByteArray("ccw") : QByteArray("cw");
        content.replace(content.indexOf("rot='" + other, at), other.size() + 5, "rot='" + changed);
    }
    return fileOf(alignment(content));
}

QStringList notesOf(const QByteArray &content, const LandXmlQuery &query = queryOf(Kind::Elements))
{
    LandXmlFile file(content, query);
    file.rows();
    return file.notes();
}

TEST(LandXmlTangents, OfSoundElementsAreOneAnother)
{
    EXPECT_EQ(notesOf(road(1, "cw")), QStringList());
    EXPECT_EQ(notesOf(road(-1, "ccw")), QStringList());
}

TEST(LandXmlTangents, OfAMirroredElementAreNoted)
{
    const QStringList arc = notesOf(road(1, "ccw"));
    ASSERT_EQ(arc.size(), 2) << arc.join(u'\n').toStdString();
    EXPECT_TRUE(arc[0].startsWith(u"7:1: the element begins at an angle of 22.9")) << arc[0].toStdString();
    EXPECT_TRUE(arc[0].contains(u" after 8.59437: ")) << arc[0].toStdString();
    EXPECT_TRUE(arc[0].endsWith(u"perhaps one of them bends to the other side")) << arc[0].toStdString();
    EXPECT_TRUE(arc[1].startsWith(u"8:1: ")) << "where the one after it begins";
    const QStringList clothoid = notesOf(road(1, "cw", "ccw"));
    ASSERT_EQ(clothoid.size(), 2) << clothoid.join(u'\n').toStdString();
    EXPECT_TRUE(clothoid[0].startsWith(u"6:1: "));
    EXPECT_TRUE(clothoid[1].startsWith(u"7:1: "));
    LandXmlQuery lenient = queryOf(Kind::Elements);
    lenient.tolerance.angle = 1;
    EXPECT_EQ(notesOf(road(1, "ccw"), lenient), QStringList()) << "the tolerance is the job's";
    EXPECT_EQ(notesOf(road(1, "ccw"), queryOf(Kind::Stations)).size(), 2) << "whatever is listed of it";
}

TEST(LandXmlTangents, OfLinesMayHaveAnyAngle)
{
    EXPECT_EQ(notesOf(fileOf(alignment("<Line><Start>0 0</Start><End>10 0</End></Line>"
                                       "<Line><Start>10 0</Start><End>10 5</End></Line>"))),
              QStringList());
}

TEST(LandXmlTangents, OfShortElementsDependOnTheDigitsOfTheirEnds)
{
    const auto line = [](const char *end, const char *attributes) {
        return fileOf(
            alignment(QByteArray("<Line ") + attributes + "><Start>0 0</Start><End>" + end + "</End></Line>"));
    };
    EXPECT_EQ(notesOf(line("0.5 0.001", "dir='0'")), QStringList()) << "a millimetre of half a metre";
    EXPECT_EQ(notesOf(line("0.5 0.01", "dir='0'")).size(), 1) << "a centimetre";
    EXPECT_EQ(notesOf(line("500 0.1", "dir='0'")).size(), 1) << "a long one is held to the angle";
    const QByteArray ends = "<Start>0 0</Start><End>0.3 0.001</End></Line>";
    const QByteArray arc = "<Curve rot='cw' radius='100'><Start>0.3 0.001</Start><Center>0.3 100.001</Center>";
    EXPECT_EQ(notesOf(fileOf(alignment("<Line>" + ends + arc + "<End>100.3 100.001</End></Curve>"))), QStringList())
        << "neither is a corner noted";
}

TEST(LandXmlTangents, AStationBeforeASpiralToTheLeftIsStraightOnNeitherSide)
{
    const PlaneCurve left = curve(TransitionForm::Clothoid, {1000, 500}, 0, 60, 0, -1 / 200.0);
    LandXmlFile file(fileOf(alignment(spiral(left, "clothoid"))), queryOf(Kind::Stations), {QStringLiteral("Radius")});
    EXPECT_EQ(file.rows(3), QStringList({u"inf"_qs, u"-200.000"_qs}));
}

TEST(LandXmlTangents, ALengthThatIsFarOffDoesNotWindACurve)
{
    const QByteArray arc =
        "<Curve rot='cw' length='%'><Start>1100 500</Start><Center>1100 600</Center><End>1200 600</End></Curve>";
    LandXmlFile file(fileOf(alignment(QByteArray(arc).replace("%", "1000"))), queryOf(Kind::Elements),
                     {QStringLiteral("Length"), QStringLiteral("EndEasting"), QStringLiteral("Deflection")});
    EXPECT_EQ(file.rows(3), QStringList(u"157.080|600.000|1.571"_qs));
    EXPECT_EQ(file.notes(), QStringList(u"5:1: length is 1000.0000 in the file, but 157.0796 by its geometry"_qs));
    LandXmlFile ramp(fileOf(alignment(QByteArray(arc).replace("%", "1413.717"))), queryOf(Kind::Elements),
                     {QStringLiteral("Length"), QStringLiteral("Deflection")});
    EXPECT_EQ(ramp.rows(3), QStringList(u"1413.717|14.137"_qs)) << "two turns more lead to the same end";
    EXPECT_EQ(ramp.notes(), QStringList());
}

TEST(LandXmlTangents, StationsCountByStatedLengthsUnlessTheyAreFarOff)
{
    const auto endOf = [](const char *length) {
        LandXmlFile file(
            fileOf(alignment(QByteArray("<Line length='") + length + "'><Start>0 0</Start><End>100 0</End></Line>")),
            queryOf(Kind::Stations), {QStringLiteral("Station")});
        return file.rows(3).value(1);
    };
    EXPECT_EQ(endOf("100.04"), u"100.040"_qs) << "the scale of a map";
    EXPECT_EQ(endOf("1000"), u"100.000"_qs) << "a mistake";
    EXPECT_EQ(endOf("-100"), u"100.000"_qs);
}

TEST(LandXmlTangents, OfAHalfCircleDoNotMeet)
{
    const auto half = [](const char *end) {
        return fileOf(alignment(QByteArray("<Curve rot='cw'><Start>0 0</Start><Center>0 50</Center><End>") + end +
                                "</End></Curve>"));
    };
    for (const char *end : {"0 100", "0.00001 100"}) {
        LandXmlFile file(half(end), queryOf(Kind::Elements),
                         {QStringLiteral("PINorthing"), QStringLiteral("PIEasting")});
        EXPECT_EQ(file.rows(), QStringList(u"-|-"_qs)) << end;
        EXPECT_EQ(file.notes(), QStringList(u"5:1: the tangents of the element are parallel: it has no PI"_qs)) << end;
    }
    LandXmlFile less(half("25 93.30127"), queryOf(Kind::Elements), {QStringLiteral("PINorthing")});
    EXPECT_NE(less.rows(), QStringList(u"-"_qs));
    EXPECT_EQ(less.notes(), QStringList());
}

TEST(LandXmlTangents, OfAVastRadiusMeetInTheMiddle)
{
    const PlaneCurve flat = curve(TransitionForm::Clothoid, {0, 0}, 0.5, 200, 1 / 5e12, 1 / 5e12);
    const CurvePlace end = flat.end();
    const QByteArray content = fileOf(alignment("<Curve rot='cw' radius='5000000000000' length='200'>" +
                                                point("Start", {0, 0}) + point("End", end.point) + "</Curve>"));
    LandXmlFile file(content, queryOf(Kind::Elements));
    EXPECT_EQ(file.rows().size(), 1);
    EXPECT_DOUBLE_EQ(file.number(0, "Radius"), 5e12);
    EXPECT_NEAR(file.number(0, "Length"), 200, 1e-6);
    EXPECT_NEAR(file.number(0, "Deflection"), 4e-11, 1e-18);
    EXPECT_NEAR(std::hypot(file.number(0, "PINorthing"), file.number(0, "PIEasting")), 100, 1e-3);
    EXPECT_EQ(file.notes(), QStringList());
    LandXmlQuery query = queryOf(Kind::Stations);
    query.interval = 100;
    LandXmlFile stations(content, query);
    EXPECT_EQ(stations.rows().size(), 3);
    EXPECT_NEAR(stations.number(1, "Northing"), 100 * std::cos(0.5), 1e-5);
    EXPECT_NEAR(stations.number(1, "Easting"), 100 * std::sin(0.5), 1e-5);
    LandXmlQuery offsets = queryOf(Kind::OffsetsOf);
    QByteArray withPoint = content;
    withPoint.replace("<Alignments>", "<CgPoints><CgPoint name='p'>" + number(100 * std::cos(0.5) - 3 * std::sin(0.5)) +
                                          ' ' + number(100 * std::sin(0.5) + 3 * std::cos(0.5)) +
                                          "</CgPoint></CgPoints><Alignments>");
    LandXmlFile projected(withPoint, offsets);
    EXPECT_NEAR(projected.number(0, "Along"), 100, 1e-5);
    EXPECT_NEAR(projected.number(0, "Offset"), 3, 1e-5);
}

TEST(LandXmlTangents, OfAnAlignmentThatIsWalkedBackwardsAreItsOwn)
{
    // Stations fall from 500 along the alignment: a decreasing equation at its start.
    const QByteArray content =
        fileOf(alignment(bend(), "name='road' staStart='0'",
                         "<StaEquation staInternal='0' staBack='0' staAhead='500' staIncrement='decreasing'/>"));
    LandXmlQuery query = queryOf(Kind::Stations);
    query.atElements = false;
    query.interval = 100;
    query.fromRound = true;
    LandXmlFile file(
        content, query,
        {QStringLiteral("Station"), QStringLiteral("Along"), QStringLiteral("Northing"), QStringLiteral("Easting")});
    EXPECT_EQ(file.rows(1).value(1), u"400.0|100.0|1100.0|500.0"_qs);
    LandXmlQuery listed = queryOf(Kind::Stations);
    listed.atElements = false;
    listed.stations = {450};
    LandXmlFile one(content, listed, {QStringLiteral("Station"), QStringLiteral("Along"), QStringLiteral("Northing")});
    EXPECT_EQ(one.rows(1), QStringList({u"500.0|0.0|1000.0"_qs, u"450.0|50.0|1050.0"_qs}));
    LandXmlFile elements(content, queryOf(Kind::Elements),
                         {QStringLiteral("StartStation"), QStringLiteral("EndStation")});
    EXPECT_EQ(elements.rows(3), QStringList({u"500.000|400.000"_qs, u"400.000|242.920"_qs, u"242.920|192.920"_qs}));
    LandXmlQuery offsets = queryOf(Kind::OffsetsOf);
    QByteArray withPoint = content;
    withPoint.replace("<Alignments>", "<CgPoints><CgPoint name='p'>1030 504</CgPoint></CgPoints><Alignments>");
    LandXmlFile projected(withPoint, offsets,
                          {QStringLiteral("Station"), QStringLiteral("Along"), QStringLiteral("Offset")});
    EXPECT_EQ(projected.rows(1), QStringList(u"470.0|30.0|4.0"_qs)) << "right is where the elements lead to";
    EXPECT_EQ(projected.notes(), QStringList());
}

} // namespace
