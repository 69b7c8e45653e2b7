#include "InputErrorText.h"
#include "LandXmlFile.h"
#include "LandXmlRoad.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

QByteArray points(const QByteArray &coordinates)
{
    return "<CgPoints name='g'><CgPoint name='p'>" + coordinates + "</CgPoint></CgPoints>";
}

const QByteArray profile = "<Profile><ProfAlign><PVI>10 10</PVI><PVI>400 10</PVI></ProfAlign></Profile>";

TEST(LandXmlOffsets, PointsHaveTheirStationTheirOffsetAndTheirHeightAboveTheGradeLine)
{
    struct Row
    {
        const char *coordinates;
        const char *row;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"1030 504 11.5", "p|40.000|4.000|4.000|-|10.000|1.500", "beside the first line, to its right"},
        {"1030 496", "p|40.000|-4.000|4.000|-|10.000|-", "to its left, without a height"},
        {"1199 640 9", "p|307.080|1.000|1.000|-|10.000|-1.000", "beside the last line"},
        {"997 504 1", "p|10.000|5.000|5.000|before the start|10.000|-9.000", "back from the start"},
        {"1203 654 1", "p|317.080|-5.000|5.000|after the end|10.000|-9.000", "ahead of the end"},
    };
    for (const Row &row : rows) {
        LandXmlFile file(fileOf(alignment(bend(), "name='road' staStart='10'", {}, profile) + points(row.coordinates)),
                         queryOf(Kind::OffsetsOf),
                         {QStringLiteral("Name"), QStringLiteral("Station"), QStringLiteral("Offset"),
                          QStringLiteral("Distance"), QStringLiteral("Place"), QStringLiteral("Design"),
                          QStringLiteral("HeightDifference")});
        EXPECT_EQ(file.rows(3), QStringList(QString::fromLatin1(row.row))) << row.reason;
        EXPECT_FALSE(file.list->error()) << row.reason;
    }
}

TEST(LandXmlOffsets, ACentreIsSaid)
{
    LandXmlFile file(
        fileOf(points("1100 600") + alignment("<Curve rot='cw'><Start>1100 500</Start><Center>1100 600</Center>"
                                              "<End>1200 600</End></Curve>")),
        queryOf(Kind::OffsetsOf), {QStringLiteral("Station"), QStringLiteral("Place"), QStringLiteral("Distance")});
    EXPECT_EQ(file.rows(0), QStringList(u"-|at a centre|100"_qs)) << "points may come before the alignment";
}

TEST(LandXmlOffsets, OfAGroupAndOfAnAlignmentAreListedAlone)
{
    const QByteArray content =
        fileOf(points("1030 504") + "<CgPoints name='h'><CgPoint name='q'>1020 500</CgPoint></CgPoints>" +
               alignment(bend()) + alignment("<Line><Start>1000 0</Start><End>1100 0</End></Line>", "name='lane'"));
    LandXmlQuery query = queryOf(Kind::OffsetsOf, "h");
    query.alignment = u"lane"_qs;
    const QStringList variables = {QStringLiteral("Name"), QStringLiteral("Alignment"), QStringLiteral("Offset")};
    EXPECT_EQ(LandXmlFile(content, query, variables).rows(0), QStringList(u"q|lane|500"_qs));

    query.alignment = u"street"_qs;
    LandXmlFile missing(content, query, variables);
    EXPECT_EQ(missing.rows(), QStringList());
    EXPECT_TRUE(textOfError(missing.list->error()).contains(u"the file has no alignment \"street\""));

    query.alignment.clear();
    LandXmlFile several(content, query, variables);
    EXPECT_EQ(several.rows(), QStringList());
    EXPECT_TRUE(textOfError(several.list->error()).contains(u"several alignments"));
}

TEST(LandXmlOffsets, AreSortedAndReadAgain)
{
    LandXmlFile file(fileOf(alignment(bend()) +
                            "<CgPoints><CgPoint name='1'>1090 500</CgPoint><CgPoint name='2'>1010 500</CgPoint>"
                            "<CgPoint name='3'>1050 500</CgPoint></CgPoints><Roadways/>"),
                     queryOf(Kind::OffsetsOf), {QStringLiteral("Name"), QStringLiteral("Station")});
    EXPECT_EQ(file.rows(0), QStringList({u"1|90"_qs, u"2|10"_qs, u"3|50"_qs}));
    EXPECT_EQ(file.row(0, 0), u"1|90"_qs);
    file.list->Sort({file.id("Station")});
    EXPECT_EQ(file.rows(0), QStringList({u"2|10"_qs, u"3|50"_qs, u"1|90"_qs}));
    EXPECT_EQ(file.notes(), QStringList(u"Roadways: 1 in the file, which no list reads"_qs)) << "each is counted once";
}

TEST(LandXmlOffsets, AreSortedBeforeAnyIsRead)
{
    LandXmlFile file(
        fileOf(alignment(bend()) +
               "<CgPoints><CgPoint name='1'>1090 500</CgPoint><CgPoint name='2'>1010 500</CgPoint></CgPoints>"),
        queryOf(Kind::OffsetsOf), {QStringLiteral("Name"), QStringLiteral("Station")});
    file.list->Sort({file.id("Station")});
    EXPECT_EQ(file.rows(0), QStringList({u"2|10"_qs, u"1|90"_qs}));
    EXPECT_EQ(file.row(0, 0), u"2|10"_qs);
}

TEST(LandXmlOffsets, AnAlignmentWithoutGeometryIsAnError)
{
    LandXmlFile file(fileOf("\n<Alignments><Alignment name='x'/></Alignments>" + points("1 2")),
                     queryOf(Kind::OffsetsOf));
    EXPECT_EQ(file.rows(), QStringList());
    EXPECT_EQ(placeText(file.list->error()), u"5:13"_qs);
    EXPECT_TRUE(textOfError(file.list->error()).contains(u"no elements"));
    LandXmlFile none(fileOf(points("1 2")), queryOf(Kind::OffsetsOf));
    EXPECT_EQ(none.rows(), QStringList());
    EXPECT_TRUE(none.list->error());
}

TEST(LandXmlOffsets, AtACentreThereIsNoPlaceAlongTheAlignment)
{
    LandXmlFile file(
        fileOf(points("1100 600") + alignment("<Curve rot='cw'><Start>1100 500</Start><Center>1100 600</Center>"
                                              "<End>1200 600</End></Curve>")),
        queryOf(Kind::OffsetsOf),
        {QStringLiteral("Station"), QStringLiteral("Region"), QStringLiteral("Along"), QStringLiteral("Place")});
    EXPECT_EQ(file.rows(0), QStringList(u"-|-|-|at a centre"_qs));
}

TEST(LandXmlOffsets, APointThatNoNumberReachesHasNoPlace)
{
    for (const char *far : {"<Start>-1.7e308 -1.7e308</Start><End>-1.6e308 -1.6e308</End>",
                            "<Start>-1.7e308 1.7e308</Start><End>-1.6e308 1.79e308</End>"})
    {
        for (const char *point : {"1.7e308 1.7e308", "1.7e308 -1.7e308"}) {
            LandXmlFile file(fileOf(alignment(QByteArray("<Line>") + far + "</Line>") + points(point)),
                             queryOf(Kind::OffsetsOf),
                             {QStringLiteral("Name"), QStringLiteral("Station"), QStringLiteral("Region"),
                              QStringLiteral("Offset"), QStringLiteral("Place")});
            EXPECT_EQ(file.rows(), QStringList(u"p|-|-|-|too far away"_qs)) << far << " and " << point;
        }
    }
}

} // namespace
