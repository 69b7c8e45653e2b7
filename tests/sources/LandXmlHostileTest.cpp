#include "LandXmlFile.h"
#include "LandXmlRoad.h"
#include "RandomRuns.h"
#include "RandomSequence.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

constexpr Kind allKinds[] = {Kind::Points,   Kind::SurfacePoints, Kind::Parcels, Kind::Courses,       Kind::Alignments,
                             Kind::Elements, Kind::Stations,      Kind::Profile, Kind::CrossSections, Kind::OffsetsOf};

/// A file with something of everything that is read.
QByteArray wholeFile()
{
    const PlaneCurve in = curve(TransitionForm::Clothoid, {1200, 650}, std::numbers::pi / 2, 60, 0, -1 / 200.0);
    return fileOf(
        "<CgPoints name='g'><CgPoint name='p1'>1030 504 11</CgPoint><CgPoint name='p2' pntRef='p1'/></CgPoints>"
        "<Surfaces><Surface name='s'><Definition><Pnts><P id='1'>1 2 3</P></Pnts></Definition></Surface></Surfaces>" +
        alignment(bend() + spiral(in, "clothoid"), "name='road' staStart='0'",
                  "<StaEquation staInternal='30' staBack='30' staAhead='50'/>",
                  "<Profile><ProfAlign name='d'><PVI>0 10</PVI><ParaCurve length='40'>100 12</ParaCurve><PVI>300 "
                  "9</PVI></ProfAlign><ProfSurf name='s'><PntList2D>0 10 100 -3</PntList2D></ProfSurf></Profile>"
                  "<CrossSects><CrossSect sta='50'><CrossSectSurf><PntList2D>-5 10 5 11</PntList2D></CrossSectSurf>"
                  "</CrossSect></CrossSects>") +
        "<Parcels><Parcel name='1' area='9'><CoordGeom><Line><Start>0 0</Start><End>1 0</End></Line></CoordGeom>"
        "</Parcel></Parcels><Roadways/>");
}

/// Reads all lists of a file, twice. @return how many end without an error
int readAll(const QByteArray &content)
{
    int sound = 0;
    for (const Kind kind : allKinds) {
        LandXmlQuery query = queryOf(kind);
        query.interval = 50;
        query.offsets = {{-5, -2.5}, {5, std::nullopt}};
        LandXmlFile file(content, query);
        const QStringList rows = file.rows();
        const bool hasError = file.list->error().has_value();
        sound += hasError ? 0 : 1;
        if (hasError) {
            EXPECT_FALSE(file.list->error()->text.isEmpty());
            EXPECT_EQ(file.list->error()->file, file.path());
        } else if (!rows.isEmpty()) {
            EXPECT_EQ(file.row(0), rows.front()) << "read again";
            file.list->Sort({1});
            EXPECT_EQ(file.rows().size(), rows.size());
        }
        file.notes();
    }
    return sound;
}

TEST(LandXmlHostile, TheWholeFileIsSound)
{
    EXPECT_EQ(readAll(wholeFile()), int(std::size(allKinds)));
}

TEST(LandXmlHostile, CutOffAnywhereNothingIsTakenForWhole)
{
    const QByteArray whole = wholeFile();
    for (qsizetype length = 0; length < whole.lastIndexOf('>'); length += 13) {
        EXPECT_EQ(readAll(whole.first(length)), 0) << length;
    }
}

TEST(LandXmlHostile, ChangedAnywhereItIsReadOrRefused)
{
    RandomRuns runs("changed files", 1, 150);
    const QByteArray whole = wholeFile();
    constexpr const char *pieces[] = {"0", "-",    "1e308", "INF",       "'",  "<",          "</",
                                      "&", "\xFF", ",",     "999999999", "cw", "pntRef='p2'"};
    while (runs.next()) {
        RandomNumbers random(runs.seed());
        QByteArray changed = whole;
        for (int i = random.below(4); i >= 0; --i) {
            const int at = random.below(int(changed.size()));
            switch (random.below(3)) {
            case 0: changed.remove(at, random.below(30)); break;
            case 1: changed.insert(at, pieces[random.below(std::size(pieces))]); break;
            default: changed.insert(at, changed.mid(random.below(int(changed.size())), random.below(200))); break;
            }
        }
        readAll(changed);
    }
}

TEST(LandXmlHostile, ElementsThatWindRoundWithoutEndAreRefused)
{
    QByteArray elements;
    for (int i = 0; i < 200; ++i) {
        elements +=
            "<Spiral length='60000' rot='cw' spiType='clothoid' radiusStart='INF' radiusEnd='1'><Start>0 0</Start>"
            "<End>1 1</End></Spiral>";
    }
    for (const Kind kind : {Kind::Elements, Kind::Stations}) {
        LandXmlFile file(fileOf(alignment(elements)), queryOf(kind));
        EXPECT_EQ(file.rows(), QStringList());
        ASSERT_TRUE(file.list->error());
        EXPECT_TRUE(file.list->error()->text.contains(u"turn too many times"));
    }
    LandXmlFile parcels(fileOf("<Parcels><Parcel><CoordGeom>" + elements + "</CoordGeom></Parcel></Parcels>"),
                        queryOf(Kind::Parcels));
    EXPECT_EQ(parcels.rows(), QStringList());
    EXPECT_TRUE(parcels.list->error());
}

TEST(LandXmlHostile, NotesAreBounded)
{
    const QByteArray line = "<Line length='9'><Start>0 0</Start><End>1 0</End></Line>";
    QByteArray kinds;
    for (int i = 0; i < 1000; ++i) {
        kinds += "<K" + QByteArray::number(i) + "/>";
    }
    LandXmlFile file(fileOf(alignment(line.repeated(1000)) + kinds), queryOf(Kind::Elements));
    file.rows();
    const QStringList notes = file.notes();
    EXPECT_EQ(notes.size(), 202);
    EXPECT_TRUE(notes.contains(u"elements of other kinds: 900 in the file, which no list reads"_qs));
    EXPECT_TRUE(notes[100].startsWith(u"and "));
}

TEST(LandXmlHostile, NoElementIsDroppedWhereTheLastPieceOfACurveIsTheLastThatIsAllowed)
{
    // 500000 pieces and 16 for each of nine elements: what eight spirals of 62518 pieces take.
    const QByteArray spiral = "<Spiral length='62517.5' rot='cw' spiType='clothoid' radiusStart='INF' radiusEnd='1'>"
                              "<Start>0 0</Start><End>1 1</End></Spiral>";
    const QByteArray line = "<Line><Start>1 1</Start><End>2 2</End></Line>";
    LandXmlFile file(fileOf(alignment(spiral.repeated(8) + line)), queryOf(Kind::Elements));
    EXPECT_EQ(file.rows(), QStringList());
    EXPECT_TRUE(file.list->error()) << "eight rows would lack the last one";
}

TEST(LandXmlHostile, ElementsWithoutContentDoNotFillTheMemory)
{
    const QByteArray geometry = alignment(QByteArray("<Line/>").repeated(300000));
    const QByteArray list = "<IrregularLine><Start>0 0</Start><End>1 1</End><PntList2D>" +
                            QByteArray("0 0 ").repeated(400000) + "</PntList2D></IrregularLine>";
    for (const auto &[kind, content] :
         {std::pair(Kind::Elements, geometry), std::pair(Kind::Elements, alignment(list)),
          std::pair(Kind::Parcels, "<Parcels>" + QByteArray("<Parcel/>").repeated(300000) + "</Parcels>"),
          std::pair(Kind::Alignments, "<Alignments>" + QByteArray("<Alignment/>").repeated(300000) + "</Alignments>"),
          std::pair(Kind::CrossSections, "<Alignments><Alignment><CrossSects>" +
                                             QByteArray("<CrossSect sta='1'/>").repeated(300000) +
                                             "</CrossSects></Alignment></Alignments>")})
    {
        LandXmlFile file(fileOf(content), queryOf(kind));
        EXPECT_EQ(file.rows(), QStringList());
        ASSERT_TRUE(file.list->error()) << keyOf(kind).toString().toStdString();
        EXPECT_TRUE(file.list->error()->text.contains(u"too many elements without content"));
    }
    const auto inAlignment = [](const QByteArray &content) {
        return "<Alignments><Alignment>" + content + "</Alignment></Alignments>";
    };
    const QByteArray pairs = "<PntList2D>" + QByteArray("0 0 ").repeated(400000) + "</PntList2D>";
    for (const auto &[kind, content] :
         {std::pair(Kind::Stations, inAlignment("<Profile><ProfSurf>" + pairs + "</ProfSurf></Profile>")),
          std::pair(Kind::CrossSections, inAlignment("<CrossSects><CrossSect sta='1'><CrossSectSurf>" + pairs +
                                                     "</CrossSectSurf></CrossSect></CrossSects>")),
          std::pair(Kind::Profile, inAlignment("<Profile><ProfAlign>" + QByteArray("<PVI>0 1</PVI>").repeated(300000) +
                                               "</ProfAlign></Profile>")),
          std::pair(Kind::Alignments, inAlignment(QByteArray("<StaEquation/>").repeated(100000))),
          std::pair(Kind::Points, QByteArray("<CgPoints/>").repeated(100000)),
          std::pair(Kind::CrossSections, inAlignment("<CrossSects><CrossSect sta='1'><DesignCrossSectSurf>" +
                                                     QByteArray("<CrossSectPnt/>").repeated(100000) +
                                                     "</DesignCrossSectSurf></CrossSect></CrossSects>"))})
    {
        // Of an alignment that is not asked for: there an empty element is not an error in itself.
        LandXmlFile file(fileOf(content), queryOf(kind, kind == Kind::Points ? "" : "another"));
        EXPECT_EQ(file.rows(), QStringList());
        ASSERT_TRUE(file.list->error()) << keyOf(kind).toString().toStdString();
        EXPECT_TRUE(file.list->error()->text.contains(u"too many elements without content"))
            << keyOf(kind).toString().toStdString() << file.list->error()->text.toStdString();
    }
    // The name of a parcel is a part of each parcel in it.
    LandXmlFile named(fileOf("<Parcels><Parcel name='" + QByteArray(100000, 'n') + "'><Parcels>" +
                             QByteArray("<Parcel/>").repeated(1000) + "</Parcels></Parcel></Parcels>"),
                      queryOf(Kind::Parcels));
    named.rows();
    EXPECT_TRUE(named.list->error());
    // What a program writes at the least, many times.
    QByteArray sound;
    for (int i = 0; i < 60000; ++i) {
        const QByteArray n = QByteArray::number(i % 10);
        sound += "<Line><Start>" + n + " 0</Start><End>" + n + " 1</End></Line>";
    }
    LandXmlFile file(fileOf(alignment(sound)), queryOf(Kind::Elements), {QStringLiteral("Element")});
    EXPECT_EQ(file.rows().size(), 60000);
    EXPECT_FALSE(file.list->error());
}

TEST(LandXmlHostile, PointsAreNotProjectedOntoCoils)
{
    QByteArray points = "<CgPoints>";
    for (int i = 0; i < 20000; ++i) {
        points += "<CgPoint>" + QByteArray::number(i % 100) + " 3</CgPoint>";
    }
    points += "</CgPoints>";
    const QByteArray spiral = "<Spiral length='60000' rot='cw' spiType='clothoid' radiusStart='INF' radiusEnd='1'>"
                              "<Start>0 0</Start><End>1 1</End></Spiral>";
    LandXmlFile coil(fileOf(points + alignment(spiral)), queryOf(Kind::OffsetsOf));
    EXPECT_EQ(coil.rows(), QStringList());
    EXPECT_TRUE(coil.list->error() && coil.list->error()->text.contains(u"turn too many times"));
    const QByteArray ramp =
        "<Curve rot='cw' length='1884.957'><Start>0 0</Start><Center>0 50</Center><End>0.001 0</End></Curve>";
    LandXmlFile turns(fileOf(points + alignment(ramp)), queryOf(Kind::OffsetsOf), {QStringLiteral("Offset")});
    EXPECT_EQ(turns.rows().size(), 20000) << "a ramp of a few turns is not a coil";
}

} // namespace
