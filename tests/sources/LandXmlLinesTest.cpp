#include "LandXmlFile.h"
#include "LandXmlRoad.h"

#include <gtest/gtest.h>

// Which of several grade lines and surfaces along an alignment is taken.

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

QByteArray line(const char *element, const char *name, const char *height)
{
    const QByteArray points = QByteArray(element) == "ProfAlign"
                                  ? QByteArray("<PVI>0 ") + height + "</PVI><PVI>400 " + height + "</PVI>"
                                  : QByteArray("<PntList2D>0 ") + height + " 400 " + height + "</PntList2D>";
    return QByteArray("\n<") + element + " name='" + name + "'>" + points + "</" + element + ">";
}

/// A road with two grade lines and two surfaces.
QByteArray road(const char *second = "second")
{
    return fileOf(alignment(bend(), "name='road' staStart='0'", {},
                            "<Profile>" + line("ProfAlign", "first", "10") + line("ProfAlign", second, "20") +
                                line("ProfSurf", "first", "1") + line("ProfSurf", second, "2") + "</Profile>"));
}

struct Read
{
    QString row;
    QStringList notes;
};

Read read(LandXmlQuery query, const QStringList &variables, const QByteArray &content = road())
{
    LandXmlFile file(content, std::move(query), variables);
    const QStringList rows = file.rows(0);
    return {rows.value(0), file.notes()};
}

TEST(LandXmlLines, TheFirstOfSeveralIsTakenAndSaid)
{
    const QString gradeLine =
        u"9:1: the alignment has 2 grade lines: the first one, \"first\", was taken, as the job names "
        "none"_qs;
    const QString surface =
        u"11:1: the alignment has 2 surfaces: the first one, \"first\", was taken, as the job names "
        "none"_qs;
    const QStringList heights = {QStringLiteral("Design"), QStringLiteral("Ground")};
    const Read both = read(queryOf(Kind::Stations), heights);
    EXPECT_EQ(both.row, u"10|1"_qs);
    EXPECT_EQ(both.notes, QStringList({gradeLine, surface}));
    EXPECT_EQ(read(queryOf(Kind::Stations), {QStringLiteral("Station")}).notes, QStringList()) << "no height is listed";
    LandXmlQuery chosen = queryOf(Kind::Stations);
    chosen.gradeLine = u"second"_qs;
    chosen.surface = u"second"_qs;
    const Read others = read(chosen, heights);
    EXPECT_EQ(others.row, u"20|2"_qs);
    EXPECT_EQ(others.notes, QStringList());
    LandXmlQuery beside = queryOf(Kind::Stations);
    beside.offsets = {{3, 2.5}};
    EXPECT_EQ(read(beside, {QStringLiteral("Elevation1")}).notes, QStringList(gradeLine))
        << "a height beside it is one";
    EXPECT_EQ(read(queryOf(Kind::Profile), {QStringLiteral("GradeLine")}).notes, QStringList())
        << "all are listed there";
}

TEST(LandXmlLines, OneOfSeveralWithOneNameIsSaid)
{
    LandXmlQuery query = queryOf(Kind::Stations);
    query.gradeLine = u"first"_qs;
    query.surface = u"first"_qs;
    const Read result = read(query, {QStringLiteral("Design"), QStringLiteral("CutFill")}, road("first"));
    EXPECT_EQ(result.row, u"10|9"_qs);
    EXPECT_EQ(
        result.notes,
        QStringList({u"9:1: several grade lines of the alignment have the name \"first\": the first one was taken"_qs,
                     u"11:1: several surfaces of the alignment have the name \"first\": the first one was taken"_qs}));
}

TEST(LandXmlLines, OfWhichPointsHaveHeightsAreSaid)
{
    QByteArray content = road();
    content.replace("<Alignments>", "<CgPoints><CgPoint name='p'>1030 504 12</CgPoint></CgPoints><Alignments>");
    const Read result = read(queryOf(Kind::OffsetsOf), {QStringLiteral("HeightDifference")}, content);
    EXPECT_EQ(result.row, u"2"_qs);
    ASSERT_EQ(result.notes.size(), 1);
    EXPECT_TRUE(result.notes[0].startsWith(u"9:1: the alignment has 2 grade lines"));
    EXPECT_EQ(read(queryOf(Kind::OffsetsOf), {QStringLiteral("Offset")}, content).notes, QStringList());
}

} // namespace
