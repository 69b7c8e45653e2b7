#include "InputErrorText.h"
#include "LandXmlFile.h"
#include "LandXmlRoad.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

const QByteArray points = "<CgPoints><CgPoint name='a' code='IP' desc='pipe'>0 0 7</CgPoint>"
                          "<CgPoint name='b'>10 0</CgPoint><CgPoint oID='9'>10 10</CgPoint>"
                          "<CgPoint name='c'>5 5</CgPoint></CgPoints>";

TEST(LandXmlReferences, CoordinatesHaveTheNameOfThePointThatTheyReferTo)
{
    const QByteArray line = "<Line><Start pntRef='a'/><End pntRef='9' name='own'/></Line>";
    LandXmlFile elements(fileOf(alignment(line) + points), queryOf(Kind::Elements),
                         {QStringLiteral("StartPoint"), QStringLiteral("EndPoint"), QStringLiteral("EndEasting")});
    EXPECT_EQ(elements.rows(0), QStringList(u"a|own|10"_qs)) << "unless they have one of their own";
    LandXmlFile stations(fileOf(alignment(line) + points), queryOf(Kind::Stations), {QStringLiteral("Point")});
    EXPECT_EQ(stations.rows(), QStringList({u"a"_qs, u"own"_qs}));
}

TEST(LandXmlReferences, APointWithoutANameHasTheTextsOfTheOneThatItRefersTo)
{
    LandXmlFile file(fileOf(points + "<CgPoints name='group'><CgPoint pntRef='a'/>"
                                     "<CgPoint name='x' code='C' pntRef='a'/></CgPoints>"),
                     queryOf(Kind::Points, "group"),
                     {QStringLiteral("Name"), QStringLiteral("Code"), QStringLiteral("Description"),
                      QStringLiteral("Group"), QStringLiteral("Northing"), QStringLiteral("Elevation")});
    EXPECT_EQ(file.rows(0), QStringList({u"a|IP|pipe|group|0|7"_qs, u"x|C|pipe|group|0|7"_qs}));
    EXPECT_EQ(file.notes(), QStringList());
    file.list->Sort({file.id("Name")});
    EXPECT_EQ(file.rows(0), QStringList({u"a|IP|pipe|group|0|7"_qs, u"x|C|pipe|group|0|7"_qs})) << "sorted as well";
}

TEST(LandXmlReferences, APointThatRefersToItsOwnNameIsTheSamePoint)
{
    LandXmlFile file(fileOf("<CgPoints name='group'><CgPoint name='a' pntRef='a'/></CgPoints>" + points),
                     queryOf(Kind::Points), {QStringLiteral("Name"), QStringLiteral("Group"), QStringLiteral("Code")});
    EXPECT_EQ(file.rows().value(0), u"a|group|IP"_qs) << "in another group, before it";
    EXPECT_EQ(file.rows().size(), 5);
    EXPECT_EQ(file.notes(), QStringList());
}

TEST(LandXmlReferences, ANameThatSeveralPointsHaveIsNotedWhereItIsReferredTo)
{
    const QByteArray twice = "\n<CgPoints name='g'><CgPoint name='a'>1 1</CgPoint></CgPoints>";
    const QString note = u"several points have the name \"a\" that is referred to: the first one was taken"_qs;
    LandXmlFile elements(fileOf(points + twice + "\n" + alignment("<Line><Start pntRef='a'/><End pntRef='b'/></Line>")),
                         queryOf(Kind::Elements), {QStringLiteral("StartNorthing")});
    EXPECT_EQ(elements.rows(0), QStringList(u"0"_qs));
    EXPECT_EQ(elements.notes(), QStringList(u"7:7: "_qs + note));
    LandXmlFile others(fileOf(points + twice + "\n<CgPoints name='h'><CgPoint pntRef='a'/></CgPoints>"),
                       queryOf(Kind::Points, "h"), {QStringLiteral("Northing")});
    EXPECT_EQ(others.rows(0), QStringList(u"0"_qs));
    EXPECT_EQ(others.notes(), QStringList(u"6:20: "_qs + note));
    others.list->Sort({1});
    others.rows();
    EXPECT_EQ(others.notes().size(), 1) << "once, and of a sorted list too";
    LandXmlFile parcels(fileOf(points + twice + "\n<Parcels><Parcel><Center pntRef='a'/></Parcel></Parcels>"),
                        queryOf(Kind::Parcels));
    parcels.rows();
    EXPECT_EQ(parcels.notes(), QStringList(u"6:18: "_qs + note));
}

TEST(LandXmlReferences, AnIdentifierThatSeveralPointsHaveIsNotedWhereItIsReferredTo)
{
    const QByteArray twice = "<CgPoints><CgPoint name='x' oID='7'>1 1</CgPoint><CgPoint name='y' oID='7'>2 2</CgPoint>"
                             "</CgPoints>\n";
    LandXmlFile elements(fileOf(twice + alignment("<Line><Start pntRef='7'/><End>9 9</End></Line>")),
                         queryOf(Kind::Elements), {QStringLiteral("StartPoint"), QStringLiteral("StartNorthing")});
    EXPECT_EQ(elements.rows(0), QStringList(u"x|1"_qs));
    EXPECT_EQ(elements.notes(),
              QStringList(u"6:7: several points have the name \"7\" that is referred to: the first one was taken"_qs));
    LandXmlFile listed(fileOf(twice), queryOf(Kind::Points), {QStringLiteral("Name")});
    EXPECT_EQ(listed.rows(), QStringList({u"x"_qs, u"y"_qs}));
    EXPECT_EQ(listed.notes(), QStringList()) << "nothing depends on it";
}

TEST(LandXmlReferences, PointsWithoutContentDoNotFillTheMemory)
{
    const QByteArray road = alignment("<Line><Start pntRef='1'/><End pntRef='2'/></Line>");
    QByteArray named = "<CgPoints>";
    for (int i = 0; i < 60000; ++i) {
        named += "<CgPoint name='" + QByteArray::number(i) + "'>" + QByteArray::number(i) + " 0</CgPoint>";
    }
    named += "</CgPoints>";
    struct Row
    {
        QByteArray points;
        bool isRead;
        const char *reason;
    };
    const QByteArray two = "<CgPoints><CgPoint name='1'>1 0</CgPoint><CgPoint name='2'>2 0</CgPoint></CgPoints>";
    const Row rows[] = {
        {two + "<CgPoints>" + QByteArray("<CgPoint name='a'/>").repeated(150000) + "</CgPoints>", false,
         "each would take twenty times its bytes"},
        {two + "<CgPoints>" + QByteArray("<CgPoint name='a'/>").repeated(50000) + "</CgPoints>", true,
         "some are no harm"},
        {two + "<CgPoints>" + QByteArray("<CgPoint/>").repeated(150000) + "</CgPoints>", true,
         "nothing refers to one without a name, and it is not kept"},
        {named, true, "what a program writes at the least"},
    };
    for (const Row &row : rows) {
        LandXmlFile file(fileOf(road + row.points), queryOf(Kind::Elements), {QStringLiteral("EndNorthing")});
        EXPECT_EQ(file.rows(0), row.isRead ? QStringList(u"2"_qs) : QStringList()) << row.reason;
        ASSERT_EQ(file.list->error().has_value(), !row.isRead) << row.reason;
        if (!row.isRead) {
            EXPECT_TRUE(file.list->error()->text.contains(u"too many elements without content")) << row.reason;
        }
    }
}

TEST(LandXmlReferences, TheCentreOfAParcelMayBeAPoint)
{
    const QStringList variables = {QStringLiteral("CentreNorthing"), QStringLiteral("CentreEasting")};
    const auto parcel = [](const char *centre) {
        return QByteArray("<Parcels><Parcel><Center pntRef='") + centre + "'/></Parcel></Parcels>";
    };
    LandXmlFile file(fileOf(parcel("c") + points), queryOf(Kind::Parcels), variables);
    EXPECT_EQ(file.rows(0), QStringList(u"5|5"_qs));
    LandXmlFile missing(fileOf(parcel("x") + points), queryOf(Kind::Parcels), variables);
    EXPECT_EQ(missing.rows(0), QStringList(u"-|-"_qs));
    EXPECT_EQ(missing.notes(), QStringList(u"4:18: the point \"x\" is not in the file"_qs));
}

TEST(LandXmlReferences, PointsOfASurveyAreReadLikeOthers)
{
    LandXmlFile file(fileOf("<Survey><SurveyHeader/><CgPoints name='s'><CgPoint name='1'>1 2</CgPoint></CgPoints>"
                            "<InstrumentSetup/></Survey>"),
                     queryOf(Kind::Points), {QStringLiteral("Name"), QStringLiteral("Group")});
    EXPECT_EQ(file.rows(), QStringList(u"1|s"_qs));
    EXPECT_EQ(file.notes(), QStringList({u"InstrumentSetup: 1 in the file, which no list reads"_qs,
                                         u"SurveyHeader: 1 in the file, which no list reads"_qs}));
}

TEST(LandXmlReferences, APointThatIsNotReferredToMayBeWrong)
{
    const QByteArray spoiled = "\n<CgPoints name='other'><CgPoint name='p'>1,5 2</CgPoint>"
                               "<CgPoint name='alias' pntRef='p'/></CgPoints>";
    const auto line = [](const char *end) {
        return alignment(QByteArray("<Line><Start>0 0</Start><End pntRef='") + end + "'/></Line>");
    };
    const QStringList variables = {QStringLiteral("EndNorthing"), QStringLiteral("EndEasting")};
    LandXmlFile sound(fileOf(points + line("c") + spoiled), queryOf(Kind::Elements), variables);
    EXPECT_EQ(sound.rows(0), QStringList(u"5|5"_qs));
    EXPECT_FALSE(sound.list->error());
    EXPECT_EQ(sound.notes(), QStringList());
    for (const char *name : {"p", "alias"}) {
        LandXmlFile wrong(fileOf(points + line(name) + spoiled), queryOf(Kind::Elements), variables);
        EXPECT_EQ(wrong.rows(0), QStringList(u"-|-"_qs));
        ASSERT_EQ(wrong.notes().size(), 1) << name;
        EXPECT_TRUE(wrong.notes()[0].endsWith(
            u": the coordinates of the point \"%1\" cannot be read"_qs.arg(QLatin1StringView(name))))
            << wrong.notes()[0].toStdString();
    }
}

TEST(LandXmlReferences, APointOfAnotherGroupMayBeWrong)
{
    const QByteArray content = fileOf("<CgPoints name='good'><CgPoint name='1'>1 2</CgPoint></CgPoints>"
                                      "\n<CgPoints name='bad'><CgPoint name='2'>1,5 2</CgPoint></CgPoints>");
    LandXmlFile good(content, queryOf(Kind::Points, "good"), {QStringLiteral("Name")});
    EXPECT_EQ(good.rows(), QStringList(u"1"_qs));
    EXPECT_FALSE(good.list->error());
    ASSERT_EQ(good.notes().size(), 1);
    EXPECT_TRUE(good.notes()[0].startsWith(u"5:22: \"1,5\" does not fit")) << good.notes()[0].toStdString();
    for (const char *group : {"bad", ""}) {
        LandXmlFile bad(content, queryOf(Kind::Points, group), {QStringLiteral("Name")});
        bad.rows();
        ASSERT_TRUE(bad.list->error()) << group;
        EXPECT_EQ(placeText(bad.list->error()), u"5:22"_qs) << group;
    }
}

TEST(LandXmlReferences, ReadingThePointsCanBeStopped)
{
    QByteArray many = "<CgPoints>";
    for (int i = 0; i < 50000; ++i) {
        many += "<CgPoint name='" + QByteArray::number(i) + "'>1 2</CgPoint>";
    }
    std::size_t read = 0;
    bool isSecondPass = false;
    LandXmlFile file(fileOf(alignment("<Line><Start pntRef='1'/><End pntRef='2'/></Line>") + many + "</CgPoints>"),
                     queryOf(Kind::Elements), {}, [&](std::size_t bytes) {
                         isSecondPass = isSecondPass || bytes < read;
                         read = bytes;
                         return !isSecondPass;
                     });
    EXPECT_EQ(file.rows(), QStringList());
    EXPECT_TRUE(isSecondPass) << "the points are read after the alignment";
    EXPECT_FALSE(file.list->error()) << "to stop is not a mistake";
}

} // namespace
