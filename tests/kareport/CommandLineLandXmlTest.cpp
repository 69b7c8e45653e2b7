#include "CommandLine.h"

#include <QDir>

#include <gtest/gtest.h>

// What the program makes of LandXML files: its own examples, files from standard input, and files that are wrong.

namespace
{

/// A job that lists points, or something else, of a file.
QByteArray jobOf(const QByteArray &file, const QByteArray &list = "points")
{
    return R"({"template": {"file": "road-t.xml", "name": "CONTROL"}, "data": {"p": {"landxml": ")" + file +
           R"(", "list": ")" + list + R"("}}, "report": [{"table": "Points", "data": "p"}], "output": ["-"]})";
}

QByteArray fileOf(const QByteArray &content)
{
    return "<LandXML version=\"1.2\">\n<Units><Metric linearUnit=\"meter\"/></Units>\n" + content + "\n</LandXML>\n";
}

class CommandLineLandXml : public testing::Test
{
protected:
    CommandLineLandXml() { folder.put("road-t.xml", controlTemplates().replace("Number", "Name")); }

    CommandLineFolder folder;
};

TEST_F(CommandLineLandXml, NothingIsWrongWithTheExamplesInAStrictJob)
{
    const QDir examples(QStringLiteral(KAREPORT_EXAMPLES_DIR));
    const QStringList jobs = examples.entryList({QStringLiteral("road-*.json")});
    EXPECT_EQ(jobs.size(), 10);
    for (const QString &job : jobs) {
        const ProgramRun run = folder.run({QStringLiteral("render"), examples.filePath(job), QStringLiteral("--strict"),
                                           QStringLiteral("-o"), folder.path("out.txt")});
        EXPECT_EQ(run.status, 0) << job.toStdString() << "\n" << run.all().constData();
        EXPECT_FALSE(run.err.contains("error")) << run.err.constData();
    }
}

TEST_F(CommandLineLandXml, ALineHasAnInfiniteRadiusAndAMissingStationIsBlank)
{
    const QDir examples(QStringLiteral(KAREPORT_EXAMPLES_DIR));
    const ProgramRun elements = folder.run({QStringLiteral("render"), examples.filePath(u"road-elements.json"_qs),
                                            QStringLiteral("-o"), QStringLiteral("-")});
    EXPECT_TRUE(elements.out.contains("|      INF|  600.000| 360.000|")) << elements.all().constData();
    EXPECT_TRUE(elements.out.contains("| ccw |")) << "which a column of four characters is too narrow for";
    const ProgramRun stations = folder.run({QStringLiteral("render"), examples.filePath(u"road-stations.json"_qs),
                                            QStringLiteral("-o"), QStringLiteral("-")});
    EXPECT_TRUE(stations.out.contains("|  1+000.000|  0+700.000|")) << stations.all().constData();
    EXPECT_TRUE(stations.out.contains("|  1+020.000|           |"));
    folder.put("road.xml",
               fileOf("<CgPoints><CgPoint name=\"c\">0 50</CgPoint></CgPoints><Alignments><Alignment name=\"a\" "
                      "staStart=\"0\"><CoordGeom><Curve rot=\"cw\"><Start>0 0</Start><Center>0 50</Center><End>50 50"
                      "</End></Curve></CoordGeom></Alignment></Alignments>"));
    QByteArray job =
        "{\"template\": {\"file\": \"" + examples.filePath(u"landxml.xml"_qs).toUtf8() +
        "\", \"name\": \"OFFSETS\"}, \"data\": {\"p\": {\"landxml\": \"road.xml\", \"list\": \"offsetsOf\"}},"
        " \"report\": [{\"table\": \"Points\", \"data\": \"p\"}], \"output\": [\"-\"]}";
    folder.put("job.json", job);
    const ProgramRun centre = folder.run("render job.json");
    EXPECT_EQ(centre.status, 0) << centre.all().constData();
    EXPECT_TRUE(centre.out.contains("at a centre")) << centre.all().constData();
    EXPECT_FALSE(centre.out.contains("0+000.000")) << "the point has no station";
}

TEST_F(CommandLineLandXml, IsReadFromStandardInput)
{
    folder.put("job.json", jobOf("-"));
    const ProgramRun run = runWithInput(folder.path(), words("render job.json"),
                                        fileOf("<CgPoints><CgPoint name=\"7\">12.5 1</CgPoint></CgPoints>"));
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_TRUE(run.out.contains("7    |   12.500")) << run.all().constData();
    const ProgramRun wrong = runWithInput(folder.path(), words("render job.json"),
                                          fileOf("<CgPoints>\n<CgPoint name=\"7\">12,5 1</CgPoint></CgPoints>"));
    EXPECT_EQ(wrong.status, 2) << wrong.all().constData();
    EXPECT_TRUE(wrong.err.startsWith("-:4:")) << wrong.err.constData();
    const ProgramRun nothing = runWithInput(folder.path(), words("render job.json"), "");
    EXPECT_EQ(nothing.status, 2) << nothing.all().constData();
}

TEST_F(CommandLineLandXml, AFileThatIsWrongEndsWithStatusTwoAndOneSentence)
{
    struct Row
    {
        QByteArray content;
        const char *list;
        const char *place;
        const char *says;
    };
    const QByteArray points = "<CgPoints>\n<CgPoint name=\"1\">1 2</CgPoint></CgPoints>";
    const Row rows[] = {
        {fileOf(points).left(90), "points", "4:", "not well-formed"},
        {"<LandXML>" + QByteArray("<a>").repeated(1000000), "points", "1:", "deep"},
        {"<!DOCTYPE a [<!ENTITY b \"bb\"><!ENTITY c \"&b;&b;\">]>\n" + fileOf(points), "points", "1:", "entity"},
        {"<!DOCTYPE LandXML SYSTEM \"/etc/passwd\">\n" + fileOf(points), "points", "1:", "another file"},
        {"<?xml version=\"1.0\" encoding=\"KOI8-R\"?>\n" + fileOf(points), "points", "1:", "encoding"},
        {fileOf("<CgPoints>\n<CgPoint name=\"\xFF\">1 2</CgPoint></CgPoints>"), "points", "4:", "not well-formed"},
        {fileOf("<CgPoints>\n<CgPoint>1,5 2</CgPoint></CgPoints>"), "points", "4:", "\"1,5\" does not fit"},
        {fileOf("<CgPoints>\n<CgPoint pntRef=\"x\"/></CgPoints>"), "points",
         "4:", "the point \"x\" is not in the file"},
        {fileOf("<Alignments>\n<Alignment name=\"a\" staStart=\"0\"><StaEquation staInternal=\"9\" staAhead=\"1\"/>\n"
                "<StaEquation staInternal=\"5\" staAhead=\"1\"/></Alignment></Alignments>"),
         "elements", "5:", "station equation"},
        {fileOf(QByteArray("<CgPoints/>").repeated(100000)), "points", "3:", "too many elements"},
        {"", "points", "", "error: "},
        {fileOf(points).replace("\"meter\"", "\"ell\""), "points", "2:", "linearUnit=\"ell\""},
    };
    for (const Row &row : rows) {
        folder.put("road.xml", row.content);
        folder.put("job.json", jobOf("road.xml", row.list));
        const ProgramRun run = folder.run("render job.json");
        EXPECT_EQ(run.status, 2) << row.says << "\n" << run.all().left(2000).constData();
        EXPECT_EQ(run.out, "") << row.says;
        EXPECT_EQ(run.err.count("error: "), 1) << row.says << "\n" << run.err.left(2000).constData();
        const QByteArray place = QByteArray("road.xml:") + row.place;
        EXPECT_TRUE(run.err.contains(place)) << row.says << "\n" << run.err.left(2000).constData();
        EXPECT_TRUE(run.err.contains(row.says)) << run.err.left(2000).constData();
    }
}

} // namespace
