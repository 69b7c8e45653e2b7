#include "InputErrorText.h"
#include "LandXmlContents.h"
#include "LandXmlFile.h"
#include "LandXmlRoad.h"

#include <gtest/gtest.h>

// What was not asked for, what is only compared, and what a file leaves open.

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

/// An alignment of one line to the north, 100 m long. @param more  is after its geometry
QByteArray line(const QByteArray &name, const QByteArray &more = {}, const QByteArray &attributes = "staStart='0'")
{
    return "<Alignment name='" + name + "' " + attributes +
           "><CoordGeom><Line><Start>0 0</Start><End>100 0</End></Line>" + "</CoordGeom>" + more + "</Alignment>";
}

QByteArray inFile(const QByteArray &alignments)
{
    return fileOf("<Alignments>\n" + alignments + "</Alignments>");
}

QStringList notesOf(const QByteArray &content, const LandXmlQuery &query)
{
    LandXmlFile file(content, query);
    file.rows();
    EXPECT_FALSE(file.list->error()) << textOfError(file.list->error()).toStdString();
    return file.notes();
}

TEST(LandXmlOthers, NumbersOfAnotherAlignmentAreNotedWhereTheyCannotBeRead)
{
    const QByteArray wrong[] = {
        "<Alignment name='wrong' staStart='1,5'/>",
        "<Alignment name='wrong' staStart='0'><CoordGeom><Line length='x'/></CoordGeom></Alignment>",
        "<Alignment name='wrong' staStart='0'><CoordGeom><Line length='INF'/></CoordGeom></Alignment>",
        "<Alignment name='wrong' staStart='0'><CoordGeom><Line><Start>1,5 0</Start></Line></CoordGeom></Alignment>",
        "<Alignment name='wrong' staStart='0'><CoordGeom><Line><End>1</End></Line></CoordGeom></Alignment>",
        "<Alignment name='wrong' staStart='0'><StaEquation staInternal='x'/></Alignment>",
        "<Alignment name='wrong' staStart='0'><Profile><ProfAlign><PVI>1</PVI></ProfAlign></Profile></Alignment>",
        "<Alignment name='wrong' staStart='0'><Profile><ProfAlign><PVI>a 1</PVI></ProfAlign></Profile></Alignment>",
    };
    for (const QByteArray &other : wrong) {
        const QByteArray content = inFile(other + line("sound"));
        for (const Kind kind : {Kind::Stations, Kind::Elements, Kind::Alignments, Kind::Profile, Kind::CrossSections}) {
            const QStringList notes = notesOf(content, queryOf(kind, "sound"));
            ASSERT_EQ(notes.size(), 1) << other.constData();
            EXPECT_TRUE(notes.front().startsWith(u"5:")) << "with its place: " << notes.front().toStdString();
            LandXmlFile asked(content, queryOf(kind, "wrong"));
            asked.rows();
            EXPECT_TRUE(asked.list->error()) << "asked for itself it is an error: " << other.constData();
            LandXmlFile all(content, queryOf(kind));
            all.rows();
            EXPECT_TRUE(all.list->error()) << "of all as well: " << other.constData();
        }
        LandXmlQuery offsets = queryOf(Kind::OffsetsOf);
        offsets.alignment = u"sound"_qs;
        EXPECT_EQ(notesOf(content, offsets).size(), 1) << other.constData();
        const auto contents = readLandXmlContents(FileBytes::holding(QStringLiteral("f.xml"), content), {});
        ASSERT_EQ(errorOf(contents), nullptr) << "what is sound can be chosen: " << other.constData();
        EXPECT_EQ(std::get<LandXmlContents>(contents).alignments.back().name, u"sound");
    }
}

TEST(LandXmlOthers, NumbersOfAnotherParcelAreNotedWhereTheyCannotBeRead)
{
    const QByteArray content =
        fileOf("<Parcels>\n<Parcel name='wrong'><CoordGeom><Line><Start>1,5 0</Start></Line></CoordGeom></Parcel>"
               "<Parcel name='sound'/></Parcels>");
    EXPECT_EQ(notesOf(content, queryOf(Kind::Parcels, "sound")),
              QStringList(u"5:39: \"1,5\" does not fit: a number was expected"_qs));
    LandXmlFile asked(content, queryOf(Kind::Parcels, "wrong"));
    EXPECT_EQ(asked.rows(), QStringList());
    EXPECT_EQ(placeText(asked.list->error()), u"5:39"_qs);
}

TEST(LandXmlOthers, AnglesAndAreasThatCannotBeReadAreNoted)
{
    const QByteArray curve = "<Alignment name='a' staStart='0'><CoordGeom><Curve rot='cw' radius='100' delta='9x'>"
                             "<Start>0 0</Start><End>100 100</End></Curve></CoordGeom></Alignment>";
    LandXmlFile elements(inFile(curve), queryOf(Kind::Elements), {QStringLiteral("Length")});
    EXPECT_EQ(elements.rows(3), QStringList(u"157.080"_qs));
    ASSERT_EQ(elements.notes().size(), 2) << "and which way round the curve goes is not known without it";
    EXPECT_TRUE(elements.notes().front().contains(u"delta=\"9x\""));

    const QByteArray section =
        "<CrossSects><CrossSect sta='5' angleSkew='?' areaCut='1,5'><CrossSectSurf><PntList2D>1 2"
        "</PntList2D></CrossSectSurf></CrossSect></CrossSects>";
    LandXmlFile sections(inFile(line("a", section)), queryOf(Kind::CrossSections),
                         {QStringLiteral("Offset"), QStringLiteral("Northing"), QStringLiteral("CutArea")});
    EXPECT_EQ(sections.rows(0), QStringList(u"1|-|-"_qs)) << "an unknown skew gives no coordinates";
    const QString notes = sections.notes().join(u'\n');
    EXPECT_TRUE(notes.contains(u"areaCut=\"1,5\"")) << notes.toStdString();
    EXPECT_TRUE(notes.contains(u"angleSkew=\"?\"")) << notes.toStdString();

    LandXmlFile parcels(fileOf("<Parcels><Parcel name='1' area='12 m2'/></Parcels>"), queryOf(Kind::Parcels),
                        {QStringLiteral("Parcel"), QStringLiteral("StatedArea")});
    EXPECT_EQ(parcels.rows(0), QStringList(u"1|-"_qs));
    EXPECT_EQ(parcels.notes(),
              QStringList(u"4:10: the attribute area=\"12 m2\" does not fit: a number was expected"_qs));
}

TEST(LandXmlOthers, WhatAFileLeavesOpenIsNoted)
{
    struct Row
    {
        Kind kind;
        QByteArray alignments;
        const char *note;
        const char *reason;
    };
    const Row rows[] = {
        {Kind::Elements, line("a", {}, {}), "5:1: the alignment has no staStart: its stations count from 0",
         "no start"},
        {Kind::Stations, "<Alignment name='a' staStart='0'/>",
         "5:1: the alignment has no elements, and therefore no stations", "no elements"},
        {Kind::Stations, line("a", "\n<StaEquation staInternal='150' staAhead='1'/>"),
         "6:1: the station equation is after the end of the alignment, where no station counts by it", "an equation"},
        {Kind::CrossSections,
         line("a", "\n<CrossSects><CrossSect sta='150'><CrossSectSurf><PntList2D>1 2</PntList2D>"
                   "</CrossSectSurf></CrossSect></CrossSects>"),
         "6:13: the cross section is before the start or after the end of the alignment: its points have no coordinates",
         "a section"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(notesOf(inFile(row.alignments), queryOf(row.kind)), QStringList(QString::fromUtf8(row.note)))
            << row.reason;
    }
    EXPECT_EQ(notesOf(inFile(line("a", "<StaEquation staInternal='100' staAhead='1'/>")), queryOf(Kind::Stations)),
              QStringList())
        << "an equation may be at the end";
    LandXmlQuery offsets = queryOf(Kind::OffsetsOf);
    offsets.alignment = u"a"_qs;
    EXPECT_EQ(notesOf(inFile(line("a") + "\n" + line("a")), offsets),
              QStringList(u"6:1: several alignments have the name \"a\": the first one was taken"_qs));
}

TEST(LandXmlOthers, ANameThatIsNotThereIsToldWithTheNearest)
{
    struct Row
    {
        Kind kind;
        const char *name;
        const char *error;
    };
    const Row rows[] = {
        {Kind::Elements, "RR1",
         "the file has no alignment \"RR1\": one of RR-1, RR-2 was expected; did you mean \"RR-1\"?"},
        {Kind::Elements, "zzz", "the file has no alignment \"zzz\": one of RR-1, RR-2 was expected"},
        {Kind::Points, "contrl",
         "the file has no group of points \"contrl\": one of control was expected; did you mean \"control\"?"},
        {Kind::Parcels, "7", "the file has no parcel \"7\"; there are no names to choose from"},
        {Kind::SurfacePoints, "ground",
         "the file has no surface \"ground\" for this list; there are no names to choose from"},
    };
    const QByteArray content =
        fileOf("<CgPoints name='control'/><Alignments>" + line("RR-1") + line("RR-2") + "</Alignments>");
    for (const Row &row : rows) {
        LandXmlFile file(content, queryOf(row.kind, row.name));
        EXPECT_EQ(file.rows(), QStringList());
        EXPECT_EQ(textOfError(file.list->error()), QString::fromUtf8(row.error));
    }
    LandXmlQuery profile = queryOf(Kind::Profile);
    profile.gradeLine = u"axis"_qs;
    LandXmlFile file(content, profile);
    file.rows();
    EXPECT_EQ(
        textOfError(file.list->error()),
        u"the file has no grade line \"axis\" in the alignments that are listed; there are no names to choose from"_qs);
}

TEST(LandXmlOthers, ElementsThatNoListReadsAreCountedHoweverDeepTheyAre)
{
    const QByteArray content = fileOf(
        "<Surfaces><Surface name='s'><Definition><Pnts><P id='1'>1 2 3</P></Pnts><Faces><F>1 1 1</F><F>1 1 1</F></Faces>"
        "</Definition></Surface></Surfaces><PipeNetworks><PipeNetwork><Structs><Struct/><Struct><CircStruct/></Struct>"
        "</Structs></PipeNetwork></PipeNetworks><x:Other xmlns:x='urn:x'><x:Part/><F/></x:Other>");
    EXPECT_EQ(
        notesOf(content, queryOf(Kind::SurfacePoints)),
        QStringList(
            {u"CircStruct: 1 in the file, which no list reads"_qs, u"F: 3 in the file, which no list reads"_qs,
             u"Faces: 1 in the file, which no list reads"_qs, u"PipeNetwork: 1 in the file, which no list reads"_qs,
             u"PipeNetworks: 1 in the file, which no list reads"_qs, u"Struct: 2 in the file, which no list reads"_qs,
             u"Structs: 1 in the file, which no list reads"_qs, u"x:Other: 1 in the file, which no list reads"_qs,
             u"x:Part: 1 in the file, which no list reads"_qs}));
    EXPECT_EQ(notesOf(fileOf("<Project name='p'><Feature/></Project><Application><Author/></Application>"),
                      queryOf(Kind::Points)),
              QStringList())
        << "what says who made the file is not data";
}

TEST(LandXmlOthers, APointThatRefersToAnIdentifierOfItsOwnNameIsTheSamePoint)
{
    const QByteArray points = "<CgPoints name='all'><CgPoint name='1' oID='77'>10 20</CgPoint></CgPoints>";
    const QByteArray alias = "<CgPoints name='group'><CgPoint name='1' pntRef='77'/></CgPoints>";
    for (const QByteArray &content : {points + alias, alias + points}) {
        EXPECT_EQ(notesOf(fileOf(content), queryOf(Kind::Points)), QStringList());
        EXPECT_EQ(notesOf(fileOf(content +
                                 "<Alignments><Alignment name='a' staStart='0'><CoordGeom><Line>"
                                 "<Start pntRef='1'/><End>100 20</End></Line></CoordGeom></Alignment></Alignments>"),
                          queryOf(Kind::Elements)),
                  QStringList())
            << "the name is that of one point";
    }
    const QByteArray other =
        "<CgPoints name='group'><CgPoint name='1' pntRef='2'/><CgPoint name='2'>1 1</CgPoint></CgPoints>";
    EXPECT_EQ(notesOf(fileOf(points + other), queryOf(Kind::Points)).size(), 1) << "this one is another point";
}

} // namespace
