#include "CommandLine.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QRegularExpression>

#include <gtest/gtest.h>

namespace
{

/// Every line of the check's output is file:line:column: warning|error: text.
void expectCheckLines(const QByteArray &out)
{
    static const QRegularExpression form(QStringLiteral(R"(\At\.xml:[1-9]\d*:[1-9]\d*: (warning|error): \S.*\z)"));
    EXPECT_TRUE(out.isEmpty() || out.endsWith('\n')) << out.constData();
    for (const QByteArray &line : out.split('\n')) {
        EXPECT_TRUE(line.isEmpty() || form.match(QString::fromUtf8(line)).hasMatch()) << line.constData();
    }
}

TEST(CommandLineCheck, SaysNothingOfAGoodFile)
{
    const CommandLineFolder folder;
    const ProgramRun run = folder.run("check t.xml");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(run.out, "");
    EXPECT_EQ(run.err, "");
}

TEST(CommandLineCheck, SaysWhatIsPassedOverInSilence)
{
    struct Row
    {
        const char *before;
        const char *after;
        const char *remark; ///< begins a line of the output, with the place and what it is
        int status;         ///< -1 for either
        const char *reason;
    };
    constexpr Row rows[] = {
        {"<Label>Pt</Label>", "<Label >Pt</Label>", "t.xml:5:43: error: ", 2, "a tag with a blank"},
        {"<Tables>", "<Tables id=\"1\">", "t.xml:4:1: error: ", 2, "a tag with an attribute"},
        {"<Title>Control points</Title>", "<Title>Control <Title>all</Title> points</Title>", "t.xml:3:", -1,
         "an element that is cut short at the first closing tag"},
        {"<OutputList>\n<Field>", "<OutputList>\n<Field></Field><Field>", "t.xml:5:1: error: ", 2,
         "an empty element that ends its list"},
        {"<ReportTemplate><Name>SITE", "<ReportTemplate><Tables></Tables><Name>SITE", "t.xml:17:34: error: ", 2,
         "a name after the tables"},
        {"<Name>CONTROL</Name><Title>Control points</Title>\n", "\n", "t.xml:", 2, "no name of its own"},
        {"<Type>COORDINATE</Type>", "<Type>COORD</Type>", "t.xml:10:58: error: ", 2, "an unknown type"},
        {"<VariableName>Northing</VariableName><Label>", "<VariableName>Height</VariableName><Label>",
         "t.xml:6:8: error: ", 2, "a variable that the dictionary lacks"},
        {"<Use>Survey</Use><Sort>", "<Use>Site</Use><Sort>", "t.xml:4:35: error: ", 2,
         "a table whose dictionary is missing"},
        {"<Label>Pt</Label><Format>5</Format>", "<Label>Point no.</Label><Format>5</Format>",
         "t.xml:5:43: warning: ", 0, "a label wider than its column"},
        {"<Separator>124</Separator>", "", "t.xml:", -1, "a missing separator"},
        {"<Name>SITE</Name>", "<Name>control</Name>", "t.xml:17:17: warning: ", 0, "two templates of one name"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        QByteArray content = controlTemplates();
        ASSERT_TRUE(content.contains(row.before)) << row.reason;
        const qsizetype at = content.indexOf(row.before);
        content.replace(at, qsizetype(qstrlen(row.before)), row.after);
        folder.put("t.xml", content);
        const ProgramRun run = folder.run("check t.xml");
        expectCheckLines(run.out);
        EXPECT_TRUE(('\n' + run.out).contains(QByteArray("\n") + row.remark)) << row.reason << "\n"
                                                                              << run.all().constData();
        EXPECT_EQ(run.status, run.out.contains(": error: ") ? 2 : 0) << row.reason << ": 2 with errors only";
        if (row.status >= 0) {
            EXPECT_EQ(run.status, row.status) << row.reason << "\n" << run.all().constData();
        }
        EXPECT_EQ(run.err, "") << row.reason;
    }
}

TEST(CommandLineCheck, AFileThatIsNoTemplateIsStatus2)
{
    for (const QByteArray &content :
         {QByteArray(), QByteArray(5000, '\0'), QByteArray("text"), QByteArray("\xFF\xFE<")}) {
        const CommandLineFolder folder;
        folder.put("t.xml", content);
        const ProgramRun run = folder.run("check t.xml");
        EXPECT_EQ(run.status, 2) << run.all().constData();
        expectCheckLines(run.out);
        EXPECT_TRUE(run.out.startsWith("t.xml:1:1: error: ")) << run.all().constData();
    }
    const CommandLineFolder folder;
    const ProgramRun run = folder.run("check none.xml");
    EXPECT_EQ(run.status, 2);
    EXPECT_TRUE((run.out + run.err).startsWith("none.xml")) << run.all().constData();
}

TEST(CommandLineCheck, TakesTemplatesAndJobsInAnyOrder)
{
    const CommandLineFolder folder;
    folder.put("good.tpl", controlTemplates());
    folder.put("job.txt", folder.bytesOf("job.json"));
    QByteArray wrong = controlTemplates();
    wrong.replace("<Separator>124</Separator>", "<Seperator>124</Seperator>");
    folder.put("wrong.xml", wrong);
    const ProgramRun run = folder.run("check job.json wrong.xml good.tpl job.txt none.xml");
    EXPECT_EQ(run.status, 2) << run.all().constData();
    EXPECT_EQ(run.err, "");
    EXPECT_TRUE(run.out.startsWith("job.json:3:1")) << "a job that is right is listed alone: " << run.out.constData();
    const qsizetype second = run.out.indexOf("wrong.xml:");
    EXPECT_GT(second, 0);
    EXPECT_TRUE(run.out.contains("error: unknown element <Seperator>: did you mean \"Separator\"?\n"));
    EXPECT_FALSE(run.out.contains("good.tpl")) << run.out.constData();
    EXPECT_GT(run.out.indexOf("job.txt: table"), second) << run.out.constData();
    EXPECT_TRUE(run.out.endsWith("none.xml: error: the template file cannot be read: there is no such file\n"))
        << run.out.constData();

    EXPECT_EQ(folder.run("check t.xml good.tpl job.json").status, 0);
    EXPECT_EQ(folder.run("check").status, 1);
    EXPECT_EQ(folder.run("check - -").status, 1);
    const ProgramRun input = runWithInput(folder.path(), words("check -"), folder.bytesOf("job.json"));
    EXPECT_EQ(input.status, 0) << input.all().constData();
    EXPECT_TRUE(input.out.contains("table \"Points\", 2 rows of the data \"p\"\n")) << input.out.constData();
}

TEST(CommandLineCheck, ListsTheFieldsOfAJobWithTheirWidestValues)
{
    const CommandLineFolder folder;
    folder.put("points.csv", "Number,Northing\n1,12.5\nP1234567,0\n3,-1234567.8\n");
    folder.put("job.json",
               folder.bytesOf("job.json")
                   .replace("\"csv\": \"points.csv\"", "\"csv\": \"points.csv\", \"units\": {\"length\": \"m\"}"));
    const ProgramRun run = folder.run("check job.json");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(run.out.toStdString(),
              "job.json:4:38: warning: 1 value is wider than the field \"Number\" of the table \"Points\", in "
              "row 2, line 5 of the report\n"
              "job.json:4:38: warning: 1 value is wider than the field \"Northing\" of the table \"Points\", "
              "in row 3, line 6 of the report\n"
              "job.json: table \"Points\", 3 rows of the data \"p\"\n"
              "  field     label  width  widest  row              value\n"
              "  Number    Pt         5       8    2  1 too wide  \"P1234567\"\n"
              "  Northing  North      9      12    3  1 too wide  \"-1234567.800\"\n");
    EXPECT_EQ(run.err, "");
    EXPECT_EQ(folder.names(), (QStringList{"job.json", "points.csv", "t.xml"})) << "nothing is written";

    const ProgramRun usft = folder.run("check job.json --set settings.lengthUnit=km");
    EXPECT_TRUE(usft.out.contains("  Northing  North      9       9    3  fits        \"-1234.568\"\n"))
        << usft.out.constData();
}

TEST(CommandLineCheck, ALabelOfAJobIsMeasuredAsItIsShown)
{
    const CommandLineFolder folder;
    folder.put("t.xml", controlTemplates().replace("<Label>North</Label>", "<Label>North in {lengthUnit}</Label>"));
    folder.put(
        "job.json",
        folder.bytesOf("job.json").replace("\"template\"", "\"options\": {\"placeholders\": true}, \"template\""));
    const ProgramRun run = folder.run("check job.json");
    EXPECT_TRUE(run.out.contains("  Northing  North in m     10       6    1  label too wide  \"12.500\"\n"))
        << run.out.constData();
    const ProgramRun usft = folder.run("check job.json --set settings.lengthUnit=usft");
    EXPECT_TRUE(usft.out.contains("North in US ft     14")) << usft.out.constData();
    EXPECT_FALSE(usft.out.contains("is wider than its column of")) << "the template does not say what is shown";
}

TEST(CommandLineCheck, SaysWhatIsWrongWithAJobItsTemplateOrItsData)
{
    struct Row
    {
        const char *file;
        const char *was;
        const char *now;
        const char *line; ///< a part of the output
        int status;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"job.json", "\"report\"", "\"reprot\"", "job.json:4:2: error: unknown key \"reprot\"", 2, "the job"},
        {"job.json", "\"data\": \"p\"", "\"data\": \"q\"",
         "job.json:4:56: error: there is no data set named \"q\" in the job: one of p was expected\n", 2, "a data set"},
        {"job.json", "\"Points\"", "\"Point\"",
         "job.json:4:38: error: the template has no table named \"Point\": one of Points was expected; did you mean "
         "\"Points\"?",
         2, "a table"},
        {"job.json", "\"CONTROL\"", "\"CONTRL\"",
         "t.xml:1:1: error: there is no template named \"CONTRL\": one of CONTROL, SITE was expected; did you mean "
         "\"CONTROL\"?",
         2, "a template"},
        {"job.json", "\"t.xml\"", "\"u.xml\"", "job.json:2:23: error: there is no template file", 2, "a template file"},
        {"points.csv", "12.5", "12,5", "points.csv:2:6: error: the row has 3 cells", 2, "the data"},
        {"points.csv", "Northing", "North", "points.csv:1:8: warning: the column \"North\" is not a variable", 0,
         "a column"},
        {"t.xml", "<Format>9.3</Format>", "<Format>9,3</Format>",
         "t.xml:6:65: warning: the format \"9,3\" counts as 9.0", 0, "a format of its template"},
        {"t.xml", "Site \xC3\xA4", "&amp;", "", 0, "another template of the file is not of the job"},
        {"points.csv", "2A,0", "2A,", "job.json:4:38: warning: 1 value of the field \"Northing\"", 0, "a value"},
        {"job.json", "\"report\"", "\"output\": [{\"file\": \"points.csv\", \"as\": \"text\"}], \"report\"",
         "job.json:4:", 2, "an output that is the data"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        QByteArray content = folder.bytesOf(row.file);
        ASSERT_TRUE(content.contains(row.was)) << row.reason;
        folder.put(row.file, content.replace(row.was, row.now));
        const ProgramRun run = folder.run("check job.json");
        EXPECT_EQ(run.status, row.status) << row.reason << "\n" << run.all().constData();
        EXPECT_TRUE(run.out.contains(row.line)) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(run.err, "") << row.reason;
        EXPECT_FALSE(run.out.contains("&amp;")) << row.reason;
    }
}

TEST(CommandLineCheck, StrictMakesNotesErrors)
{
    const CommandLineFolder folder;
    folder.put("points.csv", "Number,North\nP12345,12.5\n");
    const ProgramRun run = folder.run("check job.json --strict");
    EXPECT_EQ(run.status, 2);
    EXPECT_EQ(run.out.count(": error: "), 3) << "all of them, not the first alone\n" << run.all().constData();
    EXPECT_TRUE(run.out.contains("table \"Points\"")) << "and the fields";
    folder.put("job.json", "{\"strict\": true, " + folder.bytesOf("job.json").sliced(1));
    EXPECT_EQ(folder.run("check job.json").status, 2) << "the job says so";
    const ProgramRun quiet = folder.run("check job.json --quiet");
    EXPECT_EQ(quiet.out.count('\n'), 3) << "errors alone: " << quiet.out.constData();
}

TEST(CommandLineCheck, ListsThemForPrograms)
{
    const CommandLineFolder folder;
    folder.put("points.csv", "Number,Northing,Elev\nP12345,12.5,1\n");
    const ProgramRun run = folder.run("check job.json t.xml --json");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    const QJsonArray files = QJsonDocument::fromJson(run.out).array();
    ASSERT_EQ(files.size(), 2) << run.out.constData();
    const QJsonObject job = files[0].toObject();
    EXPECT_EQ(job[u"file"].toString(), u"job.json");
    EXPECT_EQ(job[u"kind"].toString(), u"job");
    const QJsonObject remark = job[u"remarks"].toArray()[0].toObject();
    EXPECT_EQ(remark[u"severity"].toString(), u"warning");
    EXPECT_TRUE(remark[u"file"].toString().endsWith(u"points.csv"));
    EXPECT_EQ(remark[u"line"].toInt(), 1);
    EXPECT_EQ(remark[u"column"].toInt(), 17);
    EXPECT_TRUE(remark[u"text"].toString().contains(u"\"Elev\""));
    ASSERT_EQ(job[u"steps"].toArray().size(), 1);
    const QJsonObject step = job[u"steps"].toArray()[0].toObject();
    EXPECT_EQ(step[u"table"].toString(), u"Points");
    EXPECT_EQ(step[u"data"].toString(), u"p");
    EXPECT_EQ(step[u"rows"].toInt(), 1);
    EXPECT_EQ(step[u"line"].toInt(), 4);
    const QJsonObject field = step[u"fields"].toArray()[0].toObject();
    EXPECT_EQ(field[u"variable"].toString(), u"Number");
    EXPECT_EQ(field[u"label"].toString(), u"Pt");
    EXPECT_EQ(field[u"type"].toString(), u"NUMBER");
    EXPECT_EQ(field[u"width"].toInt(), 5);
    EXPECT_EQ(field[u"labelFits"].toBool(), true);
    EXPECT_EQ(field[u"fits"].toBool(true), false);
    EXPECT_EQ(field[u"tooWide"].toInt(), 1);
    const QJsonObject widest = field[u"widest"].toObject();
    EXPECT_EQ(widest[u"width"].toInt(), 6);
    EXPECT_EQ(widest[u"text"].toString(), u"P12345");
    EXPECT_EQ(widest[u"row"].toInt(), 1);
    EXPECT_EQ(widest[u"reportLine"].toInt(), 4);
    EXPECT_EQ(files[1].toObject()[u"kind"].toString(), u"template");
    EXPECT_TRUE(files[1].toObject()[u"remarks"].toArray().isEmpty());
}

TEST(CommandLineCheck, WritesTheNotesAsRenderDoes)
{
    const CommandLineFolder folder;
    folder.put("points.csv", "Number,North\nP12345,12.5\n");
    EXPECT_EQ(folder.run("check t.xml job.json --notes check-notes.json").status, 0);
    EXPECT_EQ(folder.run("render job.json -o out.txt --notes render-notes.json").status, 0);
    EXPECT_EQ(folder.bytesOf("check-notes.json"), folder.bytesOf("render-notes.json"));
    folder.put("b.json", folder.bytesOf("job.json"));
    EXPECT_EQ(folder.run("check b.json job.json --notes notes.json").status, 1);
    EXPECT_EQ(folder.run("check b.json job.json --notes {}-notes.json").status, 0);
    EXPECT_TRUE(folder.names().contains(u"b-notes.json"_qs));
    EXPECT_EQ(folder.run("check job.json --notes none/notes.json").status, 3);
}

TEST(CommandLineCheck, NotesReplaceNothingThatIsNeeded)
{
    struct Row
    {
        const char *line;
        const char *contains;
    };
    constexpr Row rows[] = {
        {"check job.json --notes job.json", "is the job itself"},
        {"check job.json b.json --notes {}.json", "is the job itself"},
        {"check job.json --notes points.csv", "is data of the job"},
        {"check job.json --notes t.xml", "is the template"},
        {"check other.xml job.json --notes other.xml", "is the template"},
        {"check job.json sub/job.json --notes {}-notes.json", "already"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        folder.put("b.json", folder.bytesOf("job.json"));
        folder.put("other.xml", folder.bytesOf("t.xml"));
        const QStringList before = folder.names();
        const QByteArray kept[] = {folder.bytesOf("job.json"), folder.bytesOf("points.csv"), folder.bytesOf("t.xml")};
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, 2) << row.line << run.all().constData();
        EXPECT_TRUE(run.all().contains(row.contains)) << row.line << run.all().constData();
        EXPECT_EQ(folder.names(), before) << row.line;
        EXPECT_EQ(folder.bytesOf("job.json"), kept[0]) << row.line;
        EXPECT_EQ(folder.bytesOf("b.json"), kept[0]) << row.line;
        EXPECT_EQ(folder.bytesOf("points.csv"), kept[1]) << row.line;
        EXPECT_EQ(folder.bytesOf("t.xml"), kept[2]) << row.line;
        EXPECT_EQ(folder.bytesOf("other.xml"), kept[2]) << row.line;
    }
}

TEST(CommandLineCheck, WhatIsWrongOnTheCommandLineIsStatus1)
{
    const CommandLineFolder folder;
    for (const char *line : {"check job.json --set nothing", "check job.json --notes -", "check job.json --what"}) {
        const ProgramRun run = folder.run(line);
        EXPECT_EQ(run.status, 1) << line << run.all().constData();
        EXPECT_EQ(run.out, "") << line;
        EXPECT_FALSE(run.err.isEmpty()) << line;
    }
}

} // namespace
