#include "JobRunnerFixture.h"

#include <gtest/gtest.h>

namespace
{

using jobs::TestJob;

QByteArray fieldOf(const char *variable, const char *format)
{
    return QByteArray("<Field><VariableName>") + variable + "</VariableName><Label>" + variable + "</Label><Format>" +
           format + "</Format><Align>RIGHT</Align></Field>";
}

QByteArray landXmlTemplate()
{
    QByteArray variables;
    int id = 0;
    for (const auto &[name, type] :
         {std::pair("Name", "NUMBER"), std::pair("Northing", "COORDINATE"), std::pair("Station", "STATION"),
          std::pair("Easting1", "COORDINATE"), std::pair("PINorthing", "COORDINATE")})
    {
        variables += "<Variable><ID>" + QByteArray::number(++id) + "</ID><VariableName>" + name +
                     "</VariableName><Type>" + type + "</Type></Variable>";
    }
    const auto table = [](const char *name, const QByteArray &fields) {
        return QByteArray("<Table><Name>") + name + "</Name><Use>D</Use><OutputList>" + fields +
               "</OutputList></Table>";
    };
    return "<ReportTemplate><Name>T</Name><Title>T</Title><Tables>" +
           table("Points", fieldOf("Name", "4") + fieldOf("Northing", "9.3")) +
           table("Places", fieldOf("Station", "9.3") + fieldOf("Easting1", "9.3")) +
           table("Elements", fieldOf("Name", "4")) +
           table("Intersections", fieldOf("Name", "4") + fieldOf("PINorthing", "9.3")) +
           "</Tables><Dictionaries><Dictionary><DictionaryName>D</DictionaryName><VariableList>" + variables +
           "</VariableList></Dictionary></Dictionaries><Blocks><Block><Name>First</Name><Use>D</Use><OutputList>" +
           fieldOf("Name", "4") +
           "</OutputList></Block></Blocks><Options><Separator>124</Separator></Options></ReportTemplate>";
}

/// A road of 1200 m to the north in US survey feet.
QByteArray road(const QByteArray &more = {})
{
    return "<LandXML version='1.2'><Units><Imperial linearUnit='USSurveyFoot'/></Units>\n<CgPoints name='g'>"
           "<CgPoint name='A1'>3937 0</CgPoint></CgPoints><Alignments><Alignment name='road' staStart='0'><CoordGeom>"
           "<Line><Start>0 0</Start><End>3937 0</End></Line></CoordGeom></Alignment></Alignments>" +
           more + "</LandXML>";
}

/// Runs a job of one data set. @param more  keys of the job
void run(TestJob &job, const QByteArray &set, const QByteArray &step, const QByteArray &content,
         const QByteArray &more = {})
{
    job.folder.put("t.xml", landXmlTemplate());
    job.folder.put("road.xml", content);
    job.run(jobs::templateJob("\"d\": {" + set + "}", step, more));
}

const char *const points = R"("landxml": "road.xml", "list": "points")";
const char *const pointsStep = R"({"table": "Points", "data": "d"})";
const char *const stations = R"("landxml": "road.xml", "list": "stations", "atElements": false)";
const char *const placesStep = R"({"table": "Places", "data": "d"})";

TEST(LandXmlData, IsShownInTheUnitsOfTheReport)
{
    TestJob job;
    run(job, points, pointsStep, road());
    EXPECT_TRUE(job.text().endsWith(u"  A1| 1200.000\n")) << job.text().toStdString();
    run(job, points, pointsStep, road(), R"("settings": {"lengthUnit": "usft"}, )");
    EXPECT_TRUE(job.text().endsWith(u"  A1| 3937.000\n")) << job.text().toStdString();
    EXPECT_TRUE(job.notes.all().empty()) << "the file says its units";
    run(job, points, R"({"block": "First", "data": "d"})", road());
    EXPECT_TRUE(job.text().contains(u"A1\n")) << job.text().toStdString();
}

TEST(LandXmlData, LengthsOfTheJobAreInTheUnitOfTheFileOrInThatOfTheDataSet)
{
    TestJob job;
    const QByteArray settings = R"("settings": {"stationFormat": "plain"}, )";
    run(job, QByteArray(stations) + R"(, "stations": [39.37], "offsets": [78.74])", placesStep, road(), settings);
    EXPECT_TRUE(job.text().endsWith(u"   12.000|   24.000\n")) << job.text().toStdString();
    run(job, QByteArray(stations) + R"(, "stations": [12], "offsets": [24], "units": {"length": "m"})", placesStep,
        road(), settings);
    EXPECT_TRUE(job.text().endsWith(u"   12.000|   24.000\n")) << job.text().toStdString();
}

TEST(LandXmlData, WhatIsSaidOfTheFileIsNoted)
{
    TestJob job;
    const QByteArray strict = R"("strict": true, )";
    run(job, points, pointsStep, road("<Roadways/>"));
    ASSERT_EQ(job.notes.said().size(), 1U);
    EXPECT_TRUE(
        job.notes.said().front().message().endsWith(u"road.xml: note: Roadways: 1 in the file, which no list reads"));
    EXPECT_TRUE(job.notes.toJson().contains("\"kind\": \"passed-over\""));
    run(job, points, pointsStep, road("<Roadways/>"), strict);
    EXPECT_FALSE(job.error) << "nothing can be done about it";

    const QByteArray twice = "\n<CgPoints><CgPoint name='A1'>1 2</CgPoint></CgPoints>";
    run(job, points, pointsStep, road(twice));
    EXPECT_FALSE(job.error);
    ASSERT_EQ(job.notes.said().size(), 1U);
    EXPECT_TRUE(
        job.notes.said().front().message().endsWith(u"road.xml:3:11: note: several points have the name \"A1\""));
    EXPECT_TRUE(job.notes.toJson().contains("\"kind\": \"difference\""));
    run(job, points, pointsStep, road(twice), strict);
    ASSERT_TRUE(job.error);
    EXPECT_TRUE(job.error->message().endsWith(u"road.xml:3:11: error: several points have the name \"A1\""));
    const QByteArray block = R"({"block": "First", "data": "d"})";
    run(job, points, block, road(twice), strict);
    EXPECT_TRUE(job.error) << "of a block as well";
    run(job, points, QByteArray(pointsStep) + ", " + pointsStep, road(twice));
    EXPECT_EQ(job.notes.said().size(), 1U) << "each is said once";
}

TEST(LandXmlData, WhatATableDoesNotShowIsNotNoted)
{
    const QByteArray halfCircle =
        "<LandXML version='1.2'><Units><Metric linearUnit='meter'/></Units>\n<Alignments><Alignment name='road' "
        "staStart='0'><CoordGeom>\n  <Curve name='7' rot='cw'><Start>0 0</Start><Center>0 50</Center><End>0 100</End>"
        "</Curve></CoordGeom></Alignment></Alignments></LandXML>";
    const char *elements = R"("landxml": "road.xml", "list": "elements")";
    TestJob job;
    run(job, elements, R"({"table": "Elements", "data": "d"})", halfCircle, R"("strict": true, )");
    EXPECT_FALSE(job.error) << job.text().toStdString();
    EXPECT_TRUE(job.notes.all().empty()) << "the dictionary has the PI, but the table does not show it";
    run(job, elements, R"({"table": "Intersections", "data": "d"})", halfCircle);
    ASSERT_EQ(job.notes.said().size(), 2U);
    EXPECT_TRUE(job.notes.said()[0].message().endsWith(
        u"road.xml:3:3: note: the tangents of the element are parallel: it has no PI"));
    const kareport::JobNote missing = job.notes.said()[1];
    EXPECT_EQ(missing.kind, kareport::JobNote::Kind::MissingValue);
    EXPECT_TRUE(missing.dataFile.endsWith(u"road.xml")) << "the place of a value is that of its element";
    ASSERT_TRUE(missing.dataPlace);
    EXPECT_EQ(missing.dataPlace->line, 3);
    EXPECT_EQ(missing.dataPlace->column, 3);
}

TEST(LandXmlData, MistakesHaveTheirPlace)
{
    struct Row
    {
        const char *set;
        const char *file;
        const char *contains;
        const char *reason;
    };
    constexpr Row rows[] = {
        {R"("landxml": "no.xml", "list": "points")", "job.json", "cannot be read", "no file"},
        {R"("landxml": "t.xml", "list": "points")", "t.xml", "LandXML was expected", "another file"},
        {R"("landxml": "road.xml")", "job.json", "\"list\"", "no list"},
        {R"("landxml": "road.xml", "list": "points", "group": "h")", "road.xml", "one of g was expected", "no group"},
        {R"("landxml": "road.xml", "list": "points", "delimiter": ";")", "job.json", "\"delimiter\"",
         "a key of another kind"},
        {R"("landxml": "road.xml", "list": "points", "units": {"angle": "gon"})", "job.json", "only \"length\"",
         "a unit that the file says"},
        {R"("landxml": "road.xml", "list": "parcels")", "road.xml", "the dictionary has none of the variables",
         "a list of another dictionary"},
    };
    for (const Row &row : rows) {
        TestJob job;
        run(job, row.set, pointsStep, road());
        ASSERT_TRUE(job.error) << row.reason;
        EXPECT_TRUE(job.error->file.endsWith(QLatin1StringView(row.file))) << job.error->message().toStdString();
        EXPECT_TRUE(job.error->text.contains(QLatin1StringView(row.contains))) << job.error->message().toStdString();
    }
}

} // namespace
