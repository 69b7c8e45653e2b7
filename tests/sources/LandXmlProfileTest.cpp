#include "InputErrorText.h"
#include "LandXmlFile.h"
#include "LandXmlRoad.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;
using namespace landxml;
using Kind = LandXmlListKind;

QByteArray gradeLine(const QByteArray &points)
{
    return fileOf(alignment(bend(), "name='road' staStart='0'", {},
                            "<Profile><ProfAlign name='design'>\n" + points + "</ProfAlign></Profile>"));
}

const QStringList curveVariables = {
    QStringLiteral("Type"),     QStringLiteral("Station"),     QStringLiteral("Elevation"),  QStringLiteral("GradeIn"),
    QStringLiteral("GradeOut"), QStringLiteral("CurveLength"), QStringLiteral("CurveStart"), QStringLiteral("CurveEnd"),
    QStringLiteral("K"),        QStringLiteral("Radius")};

TEST(LandXmlProfile, PointsHaveTheirGradesAndTheirCurves)
{
    LandXmlFile file(
        gradeLine("<PVI>0 100</PVI><ParaCurve length='100'>200 104</ParaCurve><UnsymParaCurve lengthIn='20' "
                  "lengthOut='30'>300 101</UnsymParaCurve><CircCurve radius='1000'>400 104</CircCurve>"
                  "<PVI>500 104</PVI>"),
        queryOf(Kind::Profile), curveVariables);
    EXPECT_EQ(file.rows(2), QStringList({u"PVI|0.00|100.00|-|2.00|-|-|-|-|-"_qs,
                                         u"ParaCurve|200.00|104.00|2.00|-3.00|100.00|150.00|250.00|20.00|-"_qs,
                                         u"UnsymParaCurve|300.00|101.00|-3.00|3.00|50.00|280.00|330.00|-|-"_qs,
                                         u"CircCurve|400.00|104.00|3.00|0.00|29.99|385.01|415.00|-|1000.00"_qs,
                                         u"PVI|500.00|104.00|0.00|-|-|-|-|-|-"_qs}));
    EXPECT_EQ(file.notes(), QStringList());
}

TEST(LandXmlProfile, CurvesHaveTheirHeightsAndTheirHighPoint)
{
    LandXmlFile file(
        gradeLine("<PVI>0 100</PVI><ParaCurve length='100'>200 104</ParaCurve><PVI>400 98</PVI><PVI>500 99</PVI>"),
        queryOf(Kind::Profile),
        {QStringLiteral("CurveStartElevation"), QStringLiteral("CurveElevation"), QStringLiteral("CurveEndElevation"),
         QStringLiteral("Extreme"), QStringLiteral("ExtremeStation"), QStringLiteral("ExtremeElevation")});
    EXPECT_EQ(file.rows(3), QStringList({u"-|-|-|-|-|-"_qs, u"103.000|103.375|102.500|high point|190.000|103.400"_qs,
                                         u"-|-|-|low point|400.000|98.000"_qs, u"-|-|-|-|-|-"_qs}));
}

TEST(LandXmlProfile, AGradeLineWithoutHeightsIsListedAsStoredAndSaid)
{
    struct Row
    {
        const char *points;
        int count;
        const char *contains;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"<PVI>0 1</PVI>", 1, "the grade line has fewer than two points", "a point alone"},
        {"<PVI>0 1</PVI><PVI>10 2</PVI>\n<PVI>5 3</PVI>", 3, "ahead of", "back"},
        {"<PVI>0 1</PVI><PVI>10 2</PVI>\n<PVI>10 3</PVI>", 3, "ahead of", "two heights"},
        {"<PVI>0 1</PVI>\n<ParaCurve length='-4'>10 2</ParaCurve><PVI>20 1</PVI>", 3, "above zero",
         "a length below zero"},
        {"<PVI>0 1</PVI>\n<CircCurve>10 2</CircCurve><PVI>20 1</PVI>", 3, "above zero", "no radius"},
        {"<PVI>0 1</PVI>\n<ParaCurve length='30'>10 2</ParaCurve><PVI>20 1</PVI>", 3, "before has ended", "too long"},
        {"<ParaCurve length='4'>0 1</ParaCurve><PVI>20 1</PVI>", 2, "only one grade", "a curve at the start"},
    };
    for (const Row &row : rows) {
        LandXmlFile file(gradeLine(row.points), queryOf(Kind::Profile),
                         {QStringLiteral("Vertex"), QStringLiteral("GradeIn")});
        const QStringList listed = file.rows();
        EXPECT_EQ(listed.size(), row.count) << row.reason;
        for (const QString &vertex : listed) {
            EXPECT_TRUE(vertex.endsWith(u"|-")) << row.reason;
        }
        EXPECT_FALSE(file.list->error()) << row.reason;
        ASSERT_EQ(file.notes().size(), 1) << row.reason;
        EXPECT_TRUE(file.notes().front().contains(QString::fromLatin1(row.contains)))
            << row.reason << ": " << file.notes().front().toStdString();
    }
}

TEST(LandXmlProfile, APointThatOccursTwiceIsOneAndACurveOfNoLengthIsNotOne)
{
    LandXmlFile file(gradeLine("<PVI>0 1</PVI><ParaCurve length='0'>10 2</ParaCurve><PVI>10 2</PVI><PVI>20 1</PVI>"),
                     queryOf(Kind::Profile),
                     {QStringLiteral("Station"), QStringLiteral("GradeIn"), QStringLiteral("GradeOut"),
                      QStringLiteral("CurveLength")});
    EXPECT_EQ(file.rows(0), QStringList({u"0|-|10|-"_qs, u"10|10|-10|-"_qs, u"10|10|-10|-"_qs, u"20|-10|-|-"_qs}));
    EXPECT_EQ(file.notes(), QStringList());
}

TEST(LandXmlProfile, OfOneGradeLineIsListedAlone)
{
    const QByteArray content = fileOf(alignment(
        bend(), "name='road' staStart='0'", {},
        "<Profile><ProfAlign name='left'><PVI>0 1</PVI><PVI>150 2</PVI></ProfAlign><ProfAlign name='right'><PVI>0 3"
        "</PVI><PVI>150 4</PVI></ProfAlign></Profile>"));
    LandXmlQuery query = queryOf(Kind::Profile);
    query.gradeLine = u"right"_qs;
    LandXmlFile file(content, query, {QStringLiteral("GradeLine"), QStringLiteral("Elevation")});
    EXPECT_EQ(file.rows(0), QStringList({u"right|3"_qs, u"right|4"_qs}));
    query.gradeLine = u"middle"_qs;
    LandXmlFile missing(content, query);
    EXPECT_EQ(missing.rows(), QStringList());
    EXPECT_EQ(
        textOfError(missing.list->error()),
        u"the file has no grade line \"middle\" in the alignments that are listed: one of left, right was expected"_qs);
}

TEST(LandXmlProfile, StationsAreNamedByTheEquations)
{
    LandXmlFile file(
        fileOf(alignment(bend(), "name='road' staStart='0'", "<StaEquation staInternal='100' staAhead='1000'/>",
                         "<Profile><ProfAlign><PVI>0 1</PVI><PVI>150 2</PVI></ProfAlign></Profile>")),
        queryOf(Kind::Profile), {QStringLiteral("Station")});
    EXPECT_EQ(file.rows(0), QStringList({u"0"_qs, u"1050"_qs}));
}

TEST(LandXmlProfile, PointsThatAreNotPairsAreErrors)
{
    for (const char *points : {"<PVI>0</PVI>", "<PVI>0 1 2</PVI>", "<PVI>x 1</PVI>", "<PVI/>"}) {
        LandXmlFile file(gradeLine(points), queryOf(Kind::Profile));
        EXPECT_EQ(file.rows(), QStringList()) << points;
        EXPECT_TRUE(file.list->error()) << points;
    }
}

} // namespace
