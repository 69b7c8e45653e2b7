#include "LandXmlFile.h"
#include "LandXmlRoad.h"

#include <gtest/gtest.h>

#include <cmath>

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

QByteArray line(double n1, double e1, double n2, double e2)
{
    return "<Line>" + point("Start", {n1, e1}) + point("End", {n2, e2}) + "</Line>";
}

/// A square of 10 with half a circle of radius 5 beyond its east side.
QByteArray parcel(const QByteArray &attributes, const QByteArray &more = {})
{
    return "<Parcel " + attributes + "><Center>5 5</Center><CoordGeom>" + line(0, 0, 10, 0) + line(10, 0, 10, 10) +
           "<Curve rot='cw'><Start>10 10</Start><Center>5 10</Center><End>0 10</End></Curve>" + line(0, 10, 0, 0) +
           "</CoordGeom>" + more + "</Parcel>";
}

TEST(LandXmlParcels, HaveTheirAreaAndTheirPerimeter)
{
    LandXmlFile file(
        fileOf("<Parcels>" + parcel("name='1' desc='lot' area='139.27'") + "</Parcels>"), queryOf(Kind::Parcels),
        {QStringLiteral("Parcel"), QStringLiteral("Description"), QStringLiteral("Area"), QStringLiteral("StatedArea"),
         QStringLiteral("Perimeter"), QStringLiteral("Courses"), QStringLiteral("CentreNorthing")});
    EXPECT_EQ(file.rows(3), QStringList(u"1|lot|139.270|139.270|45.708|4|5.000"_qs));
    EXPECT_EQ(file.notes(), QStringList());
}

TEST(LandXmlParcels, TheirAreaIsTheSameWalkedRoundTheOtherWay)
{
    const QByteArray back = "<Parcel><CoordGeom>" + line(0, 0, 0, 10) +
                            "<Curve rot='ccw'><Start>0 10</Start><Center>5 10</Center><End>10 10</End></Curve>" +
                            line(10, 10, 10, 0) + line(10, 0, 0, 0) + "</CoordGeom></Parcel>";
    LandXmlFile file(fileOf("<Parcels>" + back + "</Parcels>"), queryOf(Kind::Parcels));
    EXPECT_NEAR(file.number(0, "Area"), 100 + 12.5 * std::numbers::pi, 1e-10);
}

TEST(LandXmlParcels, CoursesAreTheSidesInTurn)
{
    LandXmlFile file(fileOf("<Parcels>" + parcel("name='1'") + "</Parcels>"), queryOf(Kind::Courses),
                     {QStringLiteral("Parcel"), QStringLiteral("Course"), QStringLiteral("Bearing"),
                      QStringLiteral("Distance"), QStringLiteral("Length"), QStringLiteral("Radius"),
                      QStringLiteral("Deflection")});
    EXPECT_EQ(file.rows(3),
              QStringList({u"1|1|0.000|10.000|10.000|inf|-"_qs, u"1|2|1.571|10.000|10.000|inf|-"_qs,
                           u"1|3|3.142|10.000|15.708|5.000|3.142"_qs, u"1|4|4.712|10.000|10.000|inf|-"_qs}));
}

TEST(LandXmlParcels, MayBePartsOfOthers)
{
    const QByteArray content = fileOf(
        "<Parcels>" + parcel("name='block'", "<Parcels>" + parcel("name='1'") + parcel("name='2'") + "</Parcels>") +
        parcel("name='other'") + "</Parcels>" + alignment(bend()));
    const QStringList variables = {QStringLiteral("Parcel"), QStringLiteral("PartOf")};
    EXPECT_EQ(LandXmlFile(content, queryOf(Kind::Parcels), variables).rows(),
              QStringList({u"block|-"_qs, u"1|block"_qs, u"2|block"_qs, u"other|-"_qs}));
    EXPECT_EQ(LandXmlFile(content, queryOf(Kind::Parcels, "2"), variables).rows(), QStringList(u"2|block"_qs));
    EXPECT_EQ(LandXmlFile(content, queryOf(Kind::Elements)).rows().size(), 3)
        << "their sides do not belong to an alignment";
}

TEST(LandXmlParcels, WhatDoesNotFitIsNoted)
{
    struct Row
    {
        QByteArray parcel;
        const char *note;
        const char *area;
    };
    const Row rows[] = {
        {parcel("name='1' area='150'"), "4:10: area is 150.0000 in the file, but 139.2699 by its geometry", "139.270"},
        {"<Parcel><CoordGeom>" + line(0, 0, 10, 0) + line(10, 0, 10, 10) + "</CoordGeom></Parcel>",
         "4:10: the border of the parcel does not close: there is a gap of 14.142 metres", "-"},
        {"<Parcel><CoordGeom>" + line(0, 0, 10, 0) + line(10, 0, 10, 10) +
             "<Line><Start>10 10</Start></Line></CoordGeom></Parcel>",
         "End was expected", "-"},
        {"<Parcel><CoordGeom>" + line(0, 0, 10, 0) + line(10, 0, 10, 10) + "<Chain>a b</Chain>" + line(10, 10, 0, 0) +
             "</CoordGeom></Parcel>",
         "not supported: an element \"Chain\"", "-"},
    };
    for (const Row &row : rows) {
        LandXmlFile file(fileOf("<Parcels>" + row.parcel + "</Parcels>"), queryOf(Kind::Parcels),
                         {QStringLiteral("Area")});
        EXPECT_EQ(file.rows(3), QStringList(QString::fromLatin1(row.area))) << row.note;
        ASSERT_EQ(file.notes().size(), 1) << row.note;
        EXPECT_TRUE(file.notes().front().contains(QString::fromLatin1(row.note))) << file.notes().front().toStdString();
    }
    LandXmlFile empty(fileOf("<Parcels><Parcel name='1'/></Parcels>"), queryOf(Kind::Parcels),
                      {QStringLiteral("Area")});
    EXPECT_EQ(empty.rows(), QStringList(u"-"_qs));
}

TEST(LandXmlParcels, AreasOfAcresAreSquareMetres)
{
    const QByteArray content = "<LandXML><Units><Imperial linearUnit='foot' areaUnit='acre'/></Units><Parcels><Parcel "
                               "area='1'><CoordGeom>" +
                               line(0, 0, 208.7103, 0) + line(208.7103, 0, 208.7103, 208.7103) +
                               line(208.7103, 208.7103, 0, 208.7103) + line(0, 208.7103, 0, 0) +
                               "</CoordGeom></Parcel></Parcels></LandXML>";
    LandXmlFile file(content, queryOf(Kind::Parcels));
    EXPECT_NEAR(file.number(0, "StatedArea"), 4046.8564224, 1e-9);
    EXPECT_NEAR(file.number(0, "Area"), 4046.856, 0.002);
    EXPECT_EQ(file.notes(), QStringList());
}

TEST(LandXmlParcels, TheToleranceOfAreasIsInProportionToThatOfTheJob)
{
    for (const auto &[tolerance, notes] : {std::pair(0.002, 1), std::pair(0.02, 0)}) {
        LandXmlQuery query = queryOf(Kind::Parcels);
        query.tolerance.length = tolerance;
        LandXmlFile file(fileOf("<Parcels>" + parcel("name='1' area='140'") + "</Parcels>"), query);
        file.rows();
        EXPECT_EQ(file.notes().size(), notes) << tolerance;
    }
    LandXmlQuery strict = queryOf(Kind::Parcels);
    strict.tolerance.length = 0;
    LandXmlFile file(fileOf("<Parcels>" + parcel("name='1' area='139.27'") + "</Parcels>"), strict);
    file.rows();
    EXPECT_EQ(file.notes().filter(u"area is"_qs).size(), 1) << "no tolerance at all";
}

} // namespace
