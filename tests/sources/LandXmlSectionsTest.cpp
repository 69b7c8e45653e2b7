#include "InputErrorText.h"
#include "LandXmlFile.h"
#include "LandXmlRoad.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

QByteArray withSections(const QByteArray &sections)
{
    return fileOf(alignment(bend(), "name='road' staStart='0'", "<StaEquation staInternal='10' staAhead='1000'/>",
                            "\n<CrossSects>" + sections + "</CrossSects>"));
}

TEST(LandXmlSections, PointsHaveTheirSectionTheirSurfaceAndTheirPlace)
{
    LandXmlFile file(
        withSections(
            "<CrossSect sta='50' name='S1' areaCut='3'><CrossSectSurf name='ground'><PntList2D>-5 10 0 11</PntList2D>"
            "</CrossSectSurf><DesignCrossSectSurf name='road' side='right' material='asphalt' typicalWidth='3.5' "
            "typicalThickness='0.2'><CrossSectPnt code='edge'>3 10.5</CrossSectPnt></DesignCrossSectSurf></CrossSect>"),
        queryOf(Kind::CrossSections),
        {QStringLiteral("Station"), QStringLiteral("Section"), QStringLiteral("Surface"), QStringLiteral("IsDesign"),
         QStringLiteral("Point"), QStringLiteral("Code"), QStringLiteral("Offset"), QStringLiteral("Elevation"),
         QStringLiteral("Northing"), QStringLiteral("Easting"), QStringLiteral("Width"), QStringLiteral("CutArea")});
    EXPECT_EQ(file.rows(1), QStringList({u"1040.0|S1|ground|no|1|-|-5.0|10.0|1050.0|495.0|-|3.0"_qs,
                                         u"1040.0|S1|ground|no|2|-|0.0|11.0|1050.0|500.0|-|3.0"_qs,
                                         u"1040.0|S1|road|yes|1|edge|3.0|10.5|1050.0|503.0|3.5|3.0"_qs}));
    EXPECT_EQ(file.notes(), QStringList());
}

TEST(LandXmlSections, OfASurfaceAreListedAlone)
{
    LandXmlQuery query = queryOf(Kind::CrossSections);
    query.surface = u"b"_qs;
    LandXmlFile file(
        withSections("<CrossSect sta='5'><CrossSectSurf name='a'><PntList2D>1 2</PntList2D></CrossSectSurf>"
                     "<CrossSectSurf name='b'><PntList2D>3 4</PntList2D></CrossSectSurf></CrossSect>"),
        query, {QStringLiteral("Surface"), QStringLiteral("Offset")});
    EXPECT_EQ(file.rows(0), QStringList(u"b|3"_qs));
}

TEST(LandXmlSections, WhatIsOddIsNoted)
{
    LandXmlFile file(
        withSections(
            "<CrossSect sta='5'><CrossSectSurf>\n<PntList2D>1 2 3</PntList2D></CrossSectSurf>"
            "<DesignCrossSectSurf><CrossSectPnt dataFormat='Slope Distance'>1 2</CrossSectPnt>"
            "<CrossSectPnt dataFormat='Offset Elevation'>7 8</CrossSectPnt></DesignCrossSectSurf></CrossSect>"),
        queryOf(Kind::CrossSections), {QStringLiteral("Offset")});
    EXPECT_EQ(file.rows(0), QStringList({u"1"_qs, u"7"_qs}));
    EXPECT_EQ(file.notes(),
              QStringList({u"9:1: the list of numbers ends in the middle of a point, which was left out"_qs,
                           u"CrossSectPnt Slope Distance: 1 in the file, which no list reads"_qs}));
}

TEST(LandXmlSections, BesideAnAlignmentWithoutGeometryHaveNoCoordinates)
{
    LandXmlFile file(
        fileOf("<Alignments><Alignment name='x'><CrossSects><CrossSect sta='5'><CrossSectSurf><PntList2D>1 2"
               "</PntList2D></CrossSectSurf></CrossSect></CrossSects></Alignment></Alignments>"),
        queryOf(Kind::CrossSections),
        {QStringLiteral("Station"), QStringLiteral("Offset"), QStringLiteral("Northing")});
    EXPECT_EQ(file.rows(0), QStringList(u"5|1|-"_qs));
}

TEST(LandXmlSections, AtAnEndThatIsRoundedHaveItsCoordinates)
{
    // The road is 307.0796 m long. A file with two decimals has its end at 307.08, and one that is off by more is not there.
    const QByteArray surface = "<CrossSectSurf><PntList2D>1 2</PntList2D></CrossSectSurf></CrossSect>";
    LandXmlFile file(withSections("<CrossSect sta='-0.001'>" + surface + "<CrossSect sta='307.081'>" + surface +
                                  "\n<CrossSect sta='307.09'>" + surface + "\n<CrossSect sta='-0.01'>" + surface),
                     queryOf(Kind::CrossSections), {QStringLiteral("Northing"), QStringLiteral("Easting")});
    EXPECT_EQ(file.rows(2), QStringList({u"1000.00|501.00"_qs, u"1199.00|650.00"_qs, u"-|-"_qs, u"-|-"_qs}));
    ASSERT_EQ(file.notes().size(), 2) << file.notes().join(u'\n').toStdString();
    EXPECT_TRUE(file.notes()[0].startsWith(u"9:1: the cross section is before the start or after the end"));
    EXPECT_TRUE(file.notes()[1].startsWith(u"10:1: "));
}

TEST(LandXmlSections, AtASkewHaveNoCoordinates)
{
    const QByteArray surface = "<CrossSectSurf><PntList2D>1 2</PntList2D></CrossSectSurf></CrossSect>";
    LandXmlFile file(withSections("<CrossSect sta='5' angleSkew='0'>" + surface +
                                  "\n<CrossSect sta='6' angleSkew='10'>" + surface + "<CrossSect sta='7'>" + surface),
                     queryOf(Kind::CrossSections), {QStringLiteral("Offset"), QStringLiteral("Northing")});
    EXPECT_EQ(file.rows(0), QStringList({u"1|1005"_qs, u"1|-"_qs, u"1|1007"_qs}));
    ASSERT_EQ(file.notes().size(), 1);
    EXPECT_TRUE(file.notes().front().startsWith(u"9:1: not supported: coordinates of a cross section"));
}

TEST(LandXmlSections, OfASurfaceThatIsNotThereAreAnError)
{
    LandXmlQuery query = queryOf(Kind::CrossSections);
    query.surface = u"rock"_qs;
    LandXmlFile file(withSections("<CrossSect sta='5'><CrossSectSurf name='ground'><PntList2D>1 2</PntList2D>"
                                  "</CrossSectSurf></CrossSect>"),
                     query);
    EXPECT_EQ(file.rows(), QStringList());
    EXPECT_EQ(textOfError(file.list->error()),
              u"the file has no surface \"rock\" for this list: one of ground was expected"_qs);
}

TEST(LandXmlSections, WithoutAStationAreErrors)
{
    LandXmlFile file(withSections("\n<CrossSect name='S1'/>"), queryOf(Kind::CrossSections));
    EXPECT_EQ(file.rows(), QStringList());
    EXPECT_EQ(placeText(file.list->error()), u"9:1"_qs);
    EXPECT_TRUE(textOfError(file.list->error()).contains(u"sta"));
}

} // namespace
