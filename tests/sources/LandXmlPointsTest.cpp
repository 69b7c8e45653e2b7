#include "InputErrorText.h"
#include "LandXmlFile.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

const QStringList pointVariables = {
    QStringLiteral("Name"),    QStringLiteral("Code"),     QStringLiteral("Description"), QStringLiteral("Group"),
    QStringLiteral("Surface"), QStringLiteral("Northing"), QStringLiteral("Easting"),     QStringLiteral("Elevation")};

TEST(LandXmlPoints, HaveTheirNamesGroupsAndCoordinates)
{
    LandXmlFile file(
        fileOf("<CgPoints name='control'><CgPoint name='12A' code='IP' desc='iron pipe'>100.5 200.25 3</CgPoint>"
               "<CgPoint oID='7'>\n 1 \t 2\n</CgPoint></CgPoints>"
               "<CgPoints><CgPoint name='x'>-1e2 +.5 -0.25<Feature/></CgPoint></CgPoints>"),
        queryOf(Kind::Points), pointVariables);
    EXPECT_EQ(file.rows(2), QStringList({QStringLiteral("12A|IP|iron pipe|control|-|100.50|200.25|3.00"),
                                         QStringLiteral("7|-|-|control|-|1.00|2.00|-"),
                                         QStringLiteral("x|-|-|-|-|-100.00|0.50|-0.25")}));
    EXPECT_FALSE(file.list->error());
    EXPECT_EQ(file.notes(), QStringList(QStringLiteral("Feature: 1 in the file, which no list reads")));
}

TEST(LandXmlPoints, AreInMetresWhateverTheFileIsIn)
{
    const QByteArray content =
        "<LandXML><Units><Imperial linearUnit='USSurveyFoot'/></Units><CgPoints><CgPoint>3937 7874 "
        "39.37</CgPoint></CgPoints></LandXML>";
    LandXmlFile file(content, queryOf(Kind::Points));
    EXPECT_NEAR(file.number(0, "Northing"), 1200, 1e-12);
    EXPECT_NEAR(file.number(0, "Easting"), 2400, 1e-12);
    EXPECT_NEAR(file.number(0, "Elevation"), 12, 1e-13);
}

TEST(LandXmlPoints, OfAGroupAreListedAlone)
{
    const QByteArray content = fileOf("<CgPoints name='a'><CgPoint name='1'>1 1</CgPoint></CgPoints>"
                                      "<CgPoints name='b'><CgPoint name='2'>2 2</CgPoint></CgPoints>");
    EXPECT_EQ(LandXmlFile(content, queryOf(Kind::Points, "b"), {QStringLiteral("Name")}).rows(), QStringList(u"2"_qs));
    for (const auto &[wrong, nearest] : {std::pair("c", ""), std::pair("A", "; did you mean \"a\"?")}) {
        LandXmlFile file(content, queryOf(Kind::Points, wrong), {QStringLiteral("Name")});
        EXPECT_EQ(file.rows(), QStringList()) << wrong;
        EXPECT_EQ(textOfError(file.list->error()),
                  QStringLiteral("the file has no group of points \"%1\": one of a, b was expected%2")
                      .arg(QLatin1StringView(wrong), QLatin1StringView(nearest)));
    }
    LandXmlFile none(fileOf("<CgPoints><CgPoint name='1'>1 1</CgPoint></CgPoints>"), queryOf(Kind::Points, "c"));
    EXPECT_EQ(none.rows(), QStringList());
    EXPECT_EQ(textOfError(none.list->error()),
              u"the file has no group of points \"c\"; there are no names to choose from"_qs);
}

TEST(LandXmlPoints, AnErrorNamesAFewOfManyGroups)
{
    QByteArray groups;
    for (int i = 1; i <= 12; ++i) {
        groups += "<CgPoints name='g" + QByteArray::number(i) + "'/>";
    }
    LandXmlFile file(fileOf(groups), queryOf(Kind::Points, "g"));
    EXPECT_EQ(file.rows(), QStringList());
    EXPECT_EQ(
        textOfError(file.list->error()),
        u"the file has no group of points \"g\": one of g1, g2, g3, g4, g5, g6, g7, g8, g9, g10, … was expected; did you "
        "mean \"g1\"?"_qs);
}

TEST(LandXmlPoints, AfterAGroupInAGroupBelongToTheOuterOne)
{
    LandXmlFile file(fileOf("<CgPoints name='a'><CgPoint name='1'>1 1</CgPoint><CgPoints name='b'><CgPoint name='2'>2 2"
                            "</CgPoint></CgPoints><CgPoint name='3'>3 3</CgPoint></CgPoints>"),
                     queryOf(Kind::Points), {QStringLiteral("Name"), QStringLiteral("Group")});
    EXPECT_EQ(file.rows(), QStringList({u"1|a"_qs, u"2|b"_qs, u"3|a"_qs}));
}

TEST(LandXmlPoints, TheNameOfASurfaceIsNotAGroup)
{
    const QByteArray content =
        fileOf("<CgPoints name='a'><CgPoint name='1'>1 1</CgPoint></CgPoints><Surfaces><Surface name='s'><Definition>"
               "<Pnts><P id='1'>1 2 3</P></Pnts></Definition></Surface></Surfaces>");
    LandXmlFile points(content, queryOf(Kind::Points, "s"), {QStringLiteral("Name")});
    EXPECT_EQ(points.rows(), QStringList());
    EXPECT_TRUE(textOfError(points.list->error()).contains(u"one of a was expected"));
    LandXmlFile surface(content, queryOf(Kind::SurfacePoints, "a"), {QStringLiteral("Name")});
    EXPECT_EQ(surface.rows(), QStringList());
    EXPECT_TRUE(textOfError(surface.list->error()).contains(u"one of s was expected"));
}

TEST(LandXmlPoints, OfSurfacesHaveTheirSurface)
{
    LandXmlFile file(
        fileOf("<Surfaces><Surface name='ground'><SourceData><DataPoints/></SourceData><Definition><Pnts>"
               "<P id='1'>1 2 3</P><P id='2'>4 5 6</P></Pnts><Faces><F>1 2 3</F></Faces></Definition></Surface>"
               "<Surface name='rock'><Definition><Pnts><P id='1'>7 8 9</P></Pnts></Definition></Surface></Surfaces>"
               "<CgPoints><CgPoint name='no surface'>0 0</CgPoint></CgPoints>"),
        queryOf(Kind::SurfacePoints), pointVariables);
    EXPECT_EQ(file.rows(0), QStringList({QStringLiteral("1|-|-|-|ground|1|2|3"), QStringLiteral("2|-|-|-|ground|4|5|6"),
                                         QStringLiteral("1|-|-|-|rock|7|8|9")}));
    EXPECT_EQ(file.notes(), QStringList({QStringLiteral("DataPoints: 1 in the file, which no list reads"),
                                         QStringLiteral("F: 1 in the file, which no list reads"),
                                         QStringLiteral("Faces: 1 in the file, which no list reads"),
                                         QStringLiteral("SourceData: 1 in the file, which no list reads")}))
        << "points of two surfaces may have one name";
}

TEST(LandXmlPoints, MayReferToOthers)
{
    const QByteArray content = fileOf("<CgPoints><CgPoint name='a' pntRef='c'/><CgPoint name='b' pntRef='a'></CgPoint>"
                                      "<CgPoint name='c'>1 2 3</CgPoint></CgPoints>");
    LandXmlFile file(content, queryOf(Kind::Points),
                     {QStringLiteral("Name"), QStringLiteral("Northing"), QStringLiteral("Elevation")});
    EXPECT_EQ(file.rows(0), QStringList({u"a|1|3"_qs, u"b|1|3"_qs, u"c|1|3"_qs})) << "forwards, and by another one";
    LandXmlFile byId(
        fileOf("<CgPoints><CgPoint name='a' pntRef='7'/><CgPoint name='b' oID='7'>5 6</CgPoint></CgPoints>"),
        queryOf(Kind::Points), {QStringLiteral("Name"), QStringLiteral("Northing")});
    EXPECT_EQ(byId.rows(0), QStringList({u"a|5"_qs, u"b|5"_qs}));
    LandXmlFile numbered(
        fileOf("<CgPoints><CgPoint name='2' oID='1'>10 10</CgPoint><CgPoint name='1' oID='2'>20 20</CgPoint>"
               "<CgPoint name='a' pntRef='1'/></CgPoints>"),
        queryOf(Kind::Points), {QStringLiteral("Name"), QStringLiteral("Northing")});
    EXPECT_EQ(numbered.rows(0), QStringList({u"2|10"_qs, u"1|20"_qs, u"a|20"_qs}))
        << "a name counts before an identifier";
    for (const char *wrong : {"<CgPoint name='a' pntRef='x'/>", "<CgPoint name='a' pntRef='a'/>",
                              "<CgPoint name='a' pntRef='b'/><CgPoint name='b' pntRef='a'/>"})
    {
        LandXmlFile missing(fileOf(QByteArray("<CgPoints>") + wrong + "</CgPoints>"), queryOf(Kind::Points));
        EXPECT_EQ(missing.rows(), QStringList()) << wrong;
        ASSERT_TRUE(missing.list->error()) << wrong;
        EXPECT_EQ(placeText(missing.list->error()), u"4:11"_qs) << wrong;
        EXPECT_TRUE(missing.list->error()->text.contains(u"is not in the file")) << wrong;
    }
}

TEST(LandXmlPoints, NamesThatOccurTwiceAreNoted)
{
    LandXmlFile file(
        fileOf("<CgPoints><CgPoint name='1'>1 1</CgPoint>\n<CgPoint name='1'>2 2</CgPoint><CgPoint>3 3</CgPoint>"
               "<CgPoint>4 4</CgPoint></CgPoints>"),
        queryOf(Kind::Points));
    for (int round = 0; round < 2; ++round) {
        EXPECT_EQ(file.rows().size(), 4) << "each is a row";
        EXPECT_EQ(file.notes(), QStringList(QStringLiteral("5:1: several points have the name \"1\""))) << round;
    }
    LandXmlFile surface(
        fileOf("<Surfaces><Surface name='ground'><Definition><Pnts><P id='1'>1 2 3</P>\n<P id='1'>4 5 6</P></Pnts>"
               "</Definition></Surface></Surfaces>"),
        queryOf(Kind::SurfacePoints), {QStringLiteral("Name"), QStringLiteral("Northing")});
    EXPECT_EQ(surface.rows(0), QStringList({u"1|1"_qs, u"1|4"_qs}));
    EXPECT_EQ(surface.notes(), QStringList(u"5:1: several points have the name \"1\""_qs));
    LandXmlFile identifiers(
        fileOf("<CgPoints><CgPoint oID='7'>1 1</CgPoint>\n<CgPoint oID='7'>2 2</CgPoint></CgPoints>"),
        queryOf(Kind::Points), {QStringLiteral("Name"), QStringLiteral("Northing")});
    EXPECT_EQ(identifiers.rows(0), QStringList({u"7|1"_qs, u"7|2"_qs}));
    EXPECT_EQ(identifiers.notes(), QStringList(u"5:1: several points have the name \"7\""_qs));
}

TEST(LandXmlPoints, MistakesHaveTheirPlaceAndRowsBeforeThemAreRead)
{
    struct Row
    {
        const char *point;
        const char *contains;
    };
    constexpr Row rows[] = {
        {"1,5 2", "\"1,5\""},     {"1", "\"1\" do not fit"}, {"1 2 3 4", "\"1 2 3 4\""}, {"", "northing, easting"},
        {"1 x", "\"x\""},         {"1 INF", "\"INF\""},      {"1 nan", "\"nan\""},       {"1 --2", "\"--2\""},
        {"1 1e999", "\"1e999\""}, {"1 2-3", "\"2-3\""},      {"0x10 2", "\"0x10\""},     {"1 -", "\"-\""},
    };
    for (const Row &row : rows) {
        LandXmlFile file(fileOf("<CgPoints><CgPoint name='1'>1 1</CgPoint>\n  <CgPoint name='2'>" +
                                QByteArray(row.point) + "</CgPoint><CgPoint name='3'>1 1</CgPoint></CgPoints>"),
                         queryOf(Kind::Points), {QStringLiteral("Name")});
        EXPECT_EQ(file.rows(), QStringList(u"1"_qs)) << row.point;
        ASSERT_TRUE(file.list->error()) << row.point;
        EXPECT_EQ(placeText(file.list->error()), u"5:3"_qs) << row.point;
        EXPECT_TRUE(file.list->error()->text.contains(QString::fromLatin1(row.contains)))
            << row.point << ": " << file.list->error()->text.toStdString();
        EXPECT_EQ(file.list->error()->file, file.path());
    }
}

TEST(LandXmlPoints, ASignThatALineEndHasPartedBelongsToItsNumber)
{
    LandXmlFile file(fileOf("<CgPoints><CgPoint>1 -\n 2</CgPoint></CgPoints>"), queryOf(Kind::Points));
    EXPECT_EQ(file.number(0, "Easting"), -2);
    EXPECT_EQ(file.row(1), u"null"_qs);
    ASSERT_EQ(file.notes().size(), 1);
    EXPECT_TRUE(file.notes().front().contains(u"signs are separated"));
}

/// Points whose numbers are told by their names, in lines of changing length, so that the file's pieces part each of them
/// somewhere.
QByteArray manyPoints(int count)
{
    QByteArray content = "<CgPoints name='g'>";
    for (int i = 0; i < count; ++i) {
        const QByteArray n = QByteArray::number(i);
        content += "<CgPoint name='" + n + "'" +
                   (i % 3 == 0 ? " code='" + QByteArray(i % 50, 'c') + "'" : QByteArray()) + ">" + n + ".5 -" + n +
                   " " + (i % 2 == 0 ? n : QByteArray()) + "</CgPoint>\n";
    }
    return fileOf(content + "</CgPoints>");
}

QString manyPoint(std::size_t i)
{
    const QString n = QString::number(i);
    const QString code = i % 3 == 0 && i % 50 != 0 ? QString(static_cast<qsizetype>(i % 50), u'c') : u"-"_qs;
    return QStringLiteral("%1|%2|%1.5|-%1.0|%3").arg(n, code, i % 2 == 0 ? n + u".0"_qs : u"-"_qs);
}

const QStringList manyVariables = {QStringLiteral("Name"), QStringLiteral("Code"), QStringLiteral("Northing"),
                                   QStringLiteral("Easting"), QStringLiteral("Elevation")};

TEST(LandXmlPoints, AreReadInTurnBackAndForth)
{
    constexpr std::size_t count = 9000;
    LandXmlFile file(manyPoints(count), queryOf(Kind::Points), manyVariables);
    for (std::size_t i = 1; i < count; ++i) {
        ASSERT_EQ(file.row(i, 1), manyPoint(i));
    }
    EXPECT_EQ(file.row(count), u"null"_qs);
    for (const std::size_t i : {count - 1, std::size_t(1), std::size_t(2047), std::size_t(2048), std::size_t(2047)}) {
        EXPECT_EQ(file.row(i, 1), manyPoint(i));
    }
    EXPECT_FALSE(file.list->error());
}

TEST(LandXmlPoints, AreReadWhileTheyAreAskedFor)
{
    const QByteArray content = manyPoints(60000);
    std::size_t read = 0;
    LandXmlFile file(content, queryOf(Kind::Points), manyVariables, [&](std::size_t bytes) {
        read = bytes;
        return true;
    });
    EXPECT_NE(file.list->GetAt(0), nullptr);
    EXPECT_GT(read, 0U);
    EXPECT_LT(read, static_cast<std::size_t>(content.size()) / 5);
    EXPECT_NE(file.list->GetAt(59999), nullptr);
    EXPECT_EQ(file.list->GetAt(60000), nullptr);
    EXPECT_EQ(read, static_cast<std::size_t>(content.size()));
}

TEST(LandXmlPoints, EndWhereTheyAreStopped)
{
    int calls = 0;
    LandXmlFile file(manyPoints(60000), queryOf(Kind::Points), manyVariables, [&](std::size_t) { return ++calls < 3; });
    EXPECT_LT(file.rows().size(), 10000);
    EXPECT_FALSE(file.list->error());
    EXPECT_EQ(file.list->GetAt(0), nullptr) << "it stays stopped";
}

TEST(LandXmlPoints, AreSortedByTheirValues)
{
    LandXmlFile file(fileOf("<CgPoints name='g'><CgPoint name='10'>3 0</CgPoint><CgPoint name='9'>1 0</CgPoint>"
                            "<CgPoint name='8A' pntRef='9'/><CgPoint name='7'>2 0</CgPoint></CgPoints>"),
                     queryOf(Kind::Points),
                     {QStringLiteral("Name"), QStringLiteral("Northing"), QStringLiteral("Group")});
    file.list->Sort({file.id("Northing"), file.id("Name")});
    EXPECT_EQ(file.rows(0), QStringList({u"8A|1|g"_qs, u"9|1|g"_qs, u"7|2|g"_qs, u"10|3|g"_qs}));
    EXPECT_EQ(file.row(0, 0), u"8A|1|g"_qs) << "and back";
    file.list->Sort({file.id("Name")});
    EXPECT_EQ(file.rows(0), QStringList({u"7|2|g"_qs, u"8A|1|g"_qs, u"9|1|g"_qs, u"10|3|g"_qs}))
        << "sorted again, by numbers in the names";
}

TEST(LandXmlPoints, ADictionaryWithoutTheVariablesIsSaid)
{
    LandXmlFile file(fileOf("<CgPoints/>"), queryOf(Kind::Points), {QStringLiteral("Offset")});
    EXPECT_EQ(file.list->GetAt(0), nullptr);
    EXPECT_TRUE(textOfError(file.list->error()).contains(u"Northing, Easting, Elevation"));
}

TEST(LandXmlPoints, AValueThatDoesNotFitItsVariableIsAnError)
{
    JobFolder folder;
    folder.put("road.xml", fileOf("<CgPoints>\n<CgPoint name='12A'>1 1</CgPoint></CgPoints>"));
    auto opened = FileBytes::open(folder.path("road.xml"));
    const auto find = [](const QString &name) -> std::optional<ValueParser> {
        return name == u"Name" ? std::optional(ValueParser(0, 1, LandXmlList::units())) : std::nullopt;
    };
    LandXmlList list(std::get<std::shared_ptr<const FileBytes>>(opened), queryOf(Kind::Points), find, {});
    EXPECT_EQ(list.GetAt(0), nullptr);
    ASSERT_TRUE(list.error());
    EXPECT_EQ(placeText(list.error()), u"5:1"_qs);
    EXPECT_TRUE(list.error()->text.contains(u"\"Name\""));
    EXPECT_TRUE(list.error()->text.contains(u"a whole number"));
}

TEST(LandXmlPoints, AllVersionsAndPrefixesAreRead)
{
    const QByteArray inner =
        "<Units><Metric linearUnit='meter'/></Units><CgPoints><CgPoint name='1'>1 2</CgPoint></CgPoints>";
    QByteArray prefixed = inner;
    prefixed.replace("</", "<\x01").replace("<", "<x:").replace("<x:\x01", "</x:");
    for (const QByteArray &content :
         {"<LandXML>" + inner + "</LandXML>",
          "<LandXML xmlns='http://www.landxml.org/schema/LandXML-1.0'>" + inner + "</LandXML>",
          "<LandXML xmlns='http://www.landxml.org/schema/LandXML-2.0' version='2.0'>" + inner + "</LandXML>",
          "<x:LandXML xmlns:x='http://www.landxml.org/schema/LandXML-1.2'>" + prefixed + "</x:LandXML>"})
    {
        LandXmlFile file(content, queryOf(Kind::Points), {QStringLiteral("Name"), QStringLiteral("Easting")});
        EXPECT_EQ(file.rows(0), QStringList(u"1|2"_qs)) << content.constData();
    }
}

TEST(LandXmlPoints, AVersionThatIsNotKnownIsNoted)
{
    const QByteArray content =
        "<LandXML version='3.1'><Units><Metric linearUnit='meter'/></Units><CgPoints/></LandXML>";
    LandXmlFile file(content, queryOf(Kind::Points));
    EXPECT_EQ(file.rows(), QStringList());
    EXPECT_EQ(file.notes(), QStringList(u"1:1: the file is of version 3.1: versions 1.0 to 2.0 are known"_qs));
}

TEST(LandXmlPoints, ListsHaveKeys)
{
    for (const char *key : {"points", "surfacePoints", "parcels", "courses", "alignments", "elements", "stations",
                            "profile", "crossSections", "offsetsOf"})
    {
        const auto kind = landXmlListFromKey(QString::fromLatin1(key));
        ASSERT_TRUE(kind) << key;
        EXPECT_EQ(keyOf(*kind), QString::fromLatin1(key));
        EXPECT_FALSE(LandXmlList::variables(queryOf(*kind)).empty()) << key;
    }
    EXPECT_FALSE(landXmlListFromKey(u"Points"));
}

TEST(LandXmlPoints, NumbersAfterAnElementCount)
{
    LandXmlFile file(fileOf("<CgPoints><CgPoint name='1'>10 20<Feature/>30</CgPoint>"
                            "<CgPoint name='2'>1<x:a xmlns:x='v'/>2 3</CgPoint></CgPoints>"),
                     queryOf(Kind::Points),
                     {QStringLiteral("Northing"), QStringLiteral("Easting"), QStringLiteral("Elevation")});
    EXPECT_EQ(file.rows(0), QStringList({u"10|20|30"_qs, u"1|2|3"_qs})) << "and an element parts two of them";
}

TEST(LandXmlPoints, NotesAreThoseOfASortedListToo)
{
    LandXmlFile file(
        fileOf("<CgPoints><CgPoint name='1'>1 1</CgPoint>\n<CgPoint name='1'>0 0</CgPoint></CgPoints><Roadways/>"),
        queryOf(Kind::Points), {QStringLiteral("Northing")});
    file.list->Sort({file.id("Northing")});
    for (int round = 0; round < 2; ++round) {
        EXPECT_EQ(file.rows(0), QStringList({u"0"_qs, u"1"_qs}));
        EXPECT_EQ(file.notes(), QStringList({u"5:1: several points have the name \"1\""_qs,
                                             u"Roadways: 1 in the file, which no list reads"_qs}))
            << round;
    }
}

} // namespace
