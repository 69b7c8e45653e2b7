#include "LandXmlFile.h"
#include "LandXmlRoad.h"

#include <gtest/gtest.h>

#include <cmath>

// Where elements meet, small radii, and half circles.

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

QStringList notesOf(const QByteArray &content, const QStringList &variables = {QStringLiteral("Type")})
{
    LandXmlFile file(content, queryOf(Kind::Elements), variables);
    file.rows();
    return file.notes();
}

QByteArray line(const char *start, const char *end)
{
    return QByteArray("<Line><Start>") + start + "</Start><End>" + end + "</End></Line>\n";
}

TEST(LandXmlCorners, OfALineAndAnArcAreSoundUnlessTheArcIsMirrored)
{
    // A kerb: a line to the north, then a quarter of a circle that begins to the east.
    const QByteArray kerb = "<Curve rot='%'><Start>100 0</Start><Center>90 0</Center><End>90 10</End></Curve>";
    const QByteArray east = QByteArray(kerb).replace("%", "cw");
    EXPECT_EQ(notesOf(fileOf(alignment(line("0 0", "100 0") + east))), QStringList());
    // One to the right would begin to the north, as the line leads.
    const QByteArray wrong =
        "<Curve rot='ccw' radius='10' length='15.708'><Start>100 0</Start><End>110 10</End></Curve>";
    const QStringList notes = notesOf(fileOf(alignment(line("0 0", "100 0") + wrong)));
    ASSERT_EQ(notes.size(), 1);
    EXPECT_EQ(notes[0],
              u"6:1: the element begins at an angle of 90.00000 to the end of the element before, with bearing "
              "90.00000 after 0.00000: perhaps one of them bends to the other side"_qs);
    // A transition begins where the one before leads, or one of both is wrong.
    const PlaneCurve in = curve(TransitionForm::Clothoid, {100, 0}, 0.3, 60, 0, 1 / 200.0);
    const QStringList bent = notesOf(fileOf(alignment(line("0 0", "100 0") + spiral(in, "clothoid"))));
    ASSERT_EQ(bent.size(), 1);
    EXPECT_EQ(bent[0],
              u"6:1: the element begins at an angle of 17.18873 to the end of the element before, with bearing "
              "17.18873 after 0.00000"_qs);
}

TEST(LandXmlCorners, TheDirectionsOfASmallRadiusDependOnTheDigitsOfItsCentre)
{
    // Nearly a full circle of 0.5 m: a millimetre at its centre turns the tangent by 2 mrad.
    const double turn = 6;
    const PlaneCurve small = curve(TransitionForm::Clothoid, {0, 0}, 0, 0.5 * turn, 2, 2);
    const auto content = [&](double degrees) {
        return fileOf(alignment("<Curve rot='cw' dirStart='" + number(degrees) + "'>" + point("Start", {0, 0}) +
                                point("Center", {0, 0.5}) + point("End", small.end().point) + "</Curve>"));
    };
    EXPECT_EQ(notesOf(content(0.1)), QStringList()) << "1.7 mrad";
    EXPECT_EQ(notesOf(content(1)).size(), 1) << "17 mrad are more than two millimetres give";
}

TEST(LandXmlCorners, OfAHalfCircleAreNotedWhereTheyAreListed)
{
    const QByteArray content =
        fileOf(alignment("<Curve rot='cw'><Start>0 0</Start><Center>0 50</Center><End>0 100</End></Curve>"));
    EXPECT_EQ(notesOf(content), QStringList()) << "a sheet without PI has nothing to say of it";
    EXPECT_EQ(notesOf(content, {QStringLiteral("PIEasting")}),
              QStringList(u"5:1: the tangents of the element are parallel: it has no PI"_qs));
}

TEST(LandXmlCorners, AHalfCircleOfRoundedPointsIsOne)
{
    struct Row
    {
        const char *attributes;
        const char *end;
        const char *expected; ///< length and deflection
        const char *reason;
    };
    constexpr Row rows[] = {
        {"radius='50'", "0 100.001", "157.080|3.142", "its points are a millimetre too far from each other"},
        {"radius='50' length='157.0796'", "0 99.999", "157.080|3.142", "or too near: the length says how far it turns"},
        {"radius='50' delta='180'", "0 99.999", "157.080|3.142", "or the angle does"},
        {"radius='50' length='156.6'", "0 99.999", "156.600|3.132", "nearly half of it"},
        {"radius='50' length='140'", "0 99.999", "156.632|3.133", "a length that leads elsewhere does not count"},
        {"radius='5'", "0 10.0015", "15.708|3.142", "a small one"},
    };
    for (const Row &row : rows) {
        LandXmlFile file(fileOf(alignment(QByteArray("<Curve rot='cw' ") + row.attributes + "><Start>0 0</Start><End>" +
                                          row.end + "</End></Curve>")),
                         queryOf(Kind::Elements), {QStringLiteral("Length"), QStringLiteral("Deflection")});
        EXPECT_EQ(file.rows(3), QStringList(QLatin1StringView(row.expected))) << row.reason;
        const bool isWrong = QByteArray(row.attributes).contains("140");
        EXPECT_EQ(file.notes().size(), isWrong ? 1 : 0) << row.reason << file.notes().join(u'\n').toStdString();
    }
    LandXmlFile far(fileOf(alignment("<Curve rot='cw' radius='50'><Start>0 0</Start><End>0 100.01</End></Curve>")),
                    queryOf(Kind::Elements), {QStringLiteral("Length")});
    far.rows();
    ASSERT_EQ(far.notes().size(), 1);
    EXPECT_TRUE(far.notes()[0].contains(u"its radius does not reach")) << far.notes()[0].toStdString();
}

} // namespace
