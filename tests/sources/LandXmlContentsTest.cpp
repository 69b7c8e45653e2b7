#include "LandXmlContents.h"
#include "InputErrorText.h"
#include "LandXmlFile.h"
#include "LandXmlRoad.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;
using namespace landxml;

QString textOf(const std::vector<LandXmlNamed> &names)
{
    QStringList texts;
    for (const LandXmlNamed &named : names) {
        texts.append(QStringLiteral("%1 %2").arg(named.name).arg(named.count));
    }
    return texts.join(u'|');
}

const QByteArray content = fileOf(
    "<CgPoints name='control'><CgPoint>1 2</CgPoint><CgPoint>3 4</CgPoint></CgPoints>"
    "<Surfaces><Surface name='ground'><Definition><Pnts><P id='1'>1 2 3</P></Pnts></Definition></Surface></Surfaces>" +
    alignment(bend(), "name='road' staStart='0'", {},
              "<Profile><ProfAlign name='design'><PVI>0 1</PVI><PVI>9 1</PVI></ProfAlign><ProfSurf name='ground'>"
              "<PntList2D>0 1 2 3</PntList2D></ProfSurf></Profile><CrossSects><CrossSect sta='5'><CrossSectSurf "
              "name='ground'><PntList2D>0 1</PntList2D></CrossSectSurf><CrossSectSurf name='rock'><PntList2D>0 1"
              "</PntList2D></CrossSectSurf></CrossSect></CrossSects>") +
    "<Parcels><Parcel name='7'><CoordGeom><Line><Start>0 0</Start><End>1 0</End></Line></CoordGeom></Parcel></Parcels>");

TEST(LandXmlContents, AreTheNamesInTheFileWithTheNumberOfWhatIsInThem)
{
    const auto read = readLandXmlContents(FileBytes::holding(QStringLiteral("f.xml"), content), {});
    ASSERT_EQ(errorOf(read), nullptr);
    const auto &contents = std::get<LandXmlContents>(read);
    EXPECT_EQ(contents.version, QStringLiteral("1.2"));
    EXPECT_EQ(textOf(contents.groups), QStringLiteral("control 2"));
    EXPECT_EQ(textOf(contents.surfaces), QStringLiteral("ground 1"));
    ASSERT_EQ(contents.alignments.size(), 1U);
    const LandXmlContents::Alignment &road = contents.alignments.front();
    EXPECT_EQ(road.name, u"road");
    EXPECT_EQ(road.elements, 3U);
    EXPECT_EQ(road.sections, 1U);
    EXPECT_EQ(textOf(road.gradeLines), QStringLiteral("design 2"));
    EXPECT_EQ(textOf(road.surfacesAlong), QStringLiteral("ground 2"));
    EXPECT_EQ(textOf(road.surfacesAcross), QStringLiteral("ground 1|rock 1"));
    EXPECT_EQ(textOf(contents.parcels), QStringLiteral("7 1"));
}

TEST(LandXmlContents, OfAFileThatIsWrongAreAnError)
{
    const auto read = readLandXmlContents(FileBytes::holding(QStringLiteral("f.xml"), content.left(600)), {});
    const InputError *error = errorOf(read);
    ASSERT_NE(error, nullptr);
    EXPECT_EQ(error->file, QStringLiteral("f.xml"));
    EXPECT_NE(errorOf(readLandXmlContents(FileBytes::holding(QString(), "<svg/>"), {})), nullptr);
}

TEST(LandXmlContents, ReadingThemCanBeStopped)
{
    const QByteArray longer =
        QByteArray(content).replace("<CgPoint>3 4</CgPoint>", QByteArray("<CgPoint>3 4</CgPoint>").repeated(50000));
    int calls = 0;
    const auto read =
        readLandXmlContents(FileBytes::holding(QString(), longer), [&](std::size_t) { return ++calls < 2; });
    ASSERT_EQ(errorOf(read), nullptr);
    EXPECT_EQ(calls, 2);
    EXPECT_TRUE(std::get<LandXmlContents>(read).alignments.empty());
}

} // namespace
