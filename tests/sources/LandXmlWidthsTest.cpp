#include "LandXmlFile.h"
#include "LandXmlRoad.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

/// A road of 100 m with the widths of its zones. @param zones  of its grade surface
QByteArray road(const QByteArray &zones, const QByteArray &after = {})
{
    return fileOf(
        alignment("<Line><Start>0 0</Start><End>100 0</End></Line>", "name='road' staStart='1000'", {},
                  "<CrossSects><CrossSect sta='1050'><CrossSectSurf name='ground'><PntList2D>-5 10</PntList2D>"
                  "</CrossSectSurf></CrossSect></CrossSects>") +
        "\n<GradeModel><GradeSurface alignmentRef='road'>" + zones + "</GradeSurface></GradeModel>" + after);
}

const QByteArray lanes =
    "<Zones side='left'><Zone staStart='1000' staEnd='1100' startWidth='9' endWidth='9' name='lane'>"
    "<ZoneWidth staStart='1000' staEnd='1040' startWidth='3' endWidth='3.5'/>"
    "<ZoneWidth staStart='1040' staEnd='1080' startWidth='4' endWidth='4'/></Zone></Zones>"
    "<Zones side='right'><Zone staStart='1000' staEnd='1100' startWidth='3' endWidth='5'/>"
    "<Zone staStart='1050' staEnd='1100' startWidth='1.5' endWidth='1.5'/></Zones>";

TEST(LandXmlWidths, OfTheZonesBesideAnAlignmentAreListedAtItsStations)
{
    LandXmlQuery query = queryOf(Kind::Stations);
    query.interval = 20;
    LandXmlFile file(road(lanes), query,
                     {QStringLiteral("Station"), QStringLiteral("LeftWidth"), QStringLiteral("RightWidth")});
    EXPECT_EQ(file.rows(2), QStringList({u"1000.00|3.00|3.00"_qs, u"1020.00|3.25|3.40"_qs, u"1040.00|4.00|3.80"_qs,
                                         u"1060.00|4.00|5.70"_qs, u"1080.00|4.00|6.10"_qs, u"1100.00|-|6.50"_qs}))
        << "of all zones together; where two pieces meet, that of the one ahead";
    EXPECT_EQ(file.notes(), QStringList());
}

TEST(LandXmlWidths, AreListedWithTheCrossSections)
{
    LandXmlFile file(road(lanes), queryOf(Kind::CrossSections),
                     {QStringLiteral("Offset"), QStringLiteral("LeftWidth"), QStringLiteral("RightWidth")});
    EXPECT_EQ(file.rows(2), QStringList(u"-5.00|4.00|5.50"_qs));
    EXPECT_EQ(file.notes(), QStringList());
}

TEST(LandXmlWidths, ThatAreWrongAreNoError)
{
    LandXmlFile file(road("<Zones side='left'><Zone><ZoneWidth staStart='1000' staEnd='x' startWidth='1' endWidth='1'/>"
                          "<ZoneWidth staStart='1000' staEnd='900' startWidth='2' endWidth='2'/></Zone></Zones>",
                          "\n<GradeModel><GradeSurface alignmentRef='gone'/></GradeModel>"),
                     queryOf(Kind::Stations), {QStringLiteral("LeftWidth")});
    EXPECT_EQ(file.rows(), QStringList({u"-"_qs, u"-"_qs}));
    EXPECT_FALSE(file.list->error());
    ASSERT_EQ(file.notes().size(), 3);
    EXPECT_TRUE(file.notes()[0].startsWith(u"6:") && file.notes()[0].contains(u"staEnd=\"x\""));
    EXPECT_TRUE(file.notes()[1].endsWith(u": the width is left out: staStart, a larger staEnd, startWidth and endWidth "
                                         u"were expected"))
        << file.notes()[1].toStdString();
    EXPECT_EQ(file.notes()[2], u"7:13: the widths belong to the alignment \"gone\", which is not in the file"_qs);
}

TEST(LandXmlWidths, WithoutAnEndAreNotedAndNotListed)
{
    LandXmlFile file(road("<Zones side='left'>\n<Zone staStart='1000' staEnd='1100' startWidth='3'/>"
                          "\n<Zone staStart='1000' staEnd='1100' category='Verge'/></Zones>"),
                     queryOf(Kind::Stations), {QStringLiteral("LeftWidth")});
    EXPECT_EQ(file.rows(), QStringList({u"-"_qs, u"-"_qs}));
    EXPECT_EQ(file.notes(), QStringList(u"7:1: the width is left out: staStart, a larger staEnd, startWidth and "
                                        "endWidth were expected"_qs))
        << "a zone that has no width at all is sound";
}

TEST(LandXmlWidths, OfSeveralGradeSurfacesAreNotAddedTogether)
{
    const auto zones = [](const char *side, const char *width) {
        return QByteArray("<Zones side='") + side + "'><Zone staStart='1000' staEnd='1100' startWidth='" + width +
               "' endWidth='" + width + "'/></Zones>";
    };
    const QByteArray others = "<GradeModel><GradeSurface name='base' alignmentRef='road'>" + zones("left", "5") +
                              zones("right", "6") + "</GradeSurface><GradeSurface name='frost' alignmentRef='road'>" +
                              zones("right", "7") + "</GradeSurface></GradeModel>";
    const QStringList widths = {QStringLiteral("LeftWidth"), QStringLiteral("RightWidth")};
    LandXmlFile file(road(zones("left", "3"), others), queryOf(Kind::Stations), widths);
    EXPECT_EQ(file.rows(1).value(0), u"3.0|6.0"_qs) << "each side has those of the first surface that has some";
    EXPECT_EQ(file.notes(),
              QStringList(u"the alignment \"road\" has 2 more grade surfaces, whose widths are not listed"_qs))
        << "which is not a mistake of the file: it has no place";
    LandXmlFile one(road(zones("left", "3"), "<GradeModel><GradeSurface alignmentRef='road'>" + zones("left", "4") +
                                                 "</GradeSurface></GradeModel>"),
                    queryOf(Kind::Stations), widths);
    one.rows();
    EXPECT_EQ(one.notes(),
              QStringList(u"the alignment \"road\" has 1 more grade surface, whose widths are not listed"_qs));
    LandXmlFile without(road(zones("left", "3"), others), queryOf(Kind::Stations), {QStringLiteral("Station")});
    without.rows();
    EXPECT_EQ(without.notes(), QStringList()) << "no width is listed";
}

TEST(LandXmlWidths, OfMoreZonesThanARoadHasAreLeftOut)
{
    const QByteArray zone = "<Zone staStart='1000' staEnd='1100' startWidth='1' endWidth='1'/>";
    LandXmlFile file(road("<Zones side='right'>" + zone.repeated(101) + "</Zones>"), queryOf(Kind::Stations),
                     {QStringLiteral("RightWidth")});
    EXPECT_EQ(file.rows(0).value(0), u"100"_qs);
    EXPECT_EQ(file.notes(),
              QStringList(u"6:13: the alignment has too many zones: the widths of the last ones are not listed"_qs));
}

TEST(LandXmlWidths, DoNotFillTheMemory)
{
    LandXmlFile file(
        road("<Zones side='right'><Zone>" + QByteArray("<ZoneWidth/>").repeated(100000) + "</Zone></Zones>"),
        queryOf(Kind::Stations));
    file.rows();
    ASSERT_TRUE(file.list->error());
    EXPECT_TRUE(file.list->error()->text.contains(u"too many elements without content"));
}

} // namespace
