#include "CommaLocale.h"
#include "CommandLine.h"

#include <QDir>
#include <QFile>

#include <gmock/gmock.h>

namespace
{

using testing::HasSubstr;

TEST(CommandLineResults, OutputsAreWrittenBesideTheReport)
{
    const CommandLineFolder folder;
    const ProgramRun run = folder.run("render job.json -o a.txt -o a.csv -o a.jsonl -o b.dat --as csv");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(run.err.toStdString(), "");
    EXPECT_EQ(folder.bytesOf("a.txt"), jobText()) << "the report is as it is without them";
    EXPECT_EQ(folder.bytesOf("a.csv"), "Number,Northing\n1,12.5\n2A,0\n") << "the data that was read";
    EXPECT_EQ(folder.bytesOf("a.jsonl"), "{\"Number\":\"1\",\"Northing\":12.5}\n{\"Number\":\"2A\",\"Northing\":0}\n");
    EXPECT_EQ(folder.bytesOf("b.dat"), folder.bytesOf("a.csv"));
}

TEST(CommandLineResults, StandardOutputTakesThem)
{
    const CommandLineFolder folder;
    const ProgramRun run = folder.run("render job.json -o - --as csv");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(run.out, "Number,Northing\n1,12.5\n2A,0\n");
    const ProgramRun brief = folder.run("render -t t.xml -n CONTROL --table Points -d points.csv --as jsonl -o -");
    EXPECT_EQ(brief.out, "{\"Number\":\"1\",\"Northing\":12.5}\n{\"Number\":\"2A\",\"Northing\":0}\n");
}

TEST(CommandLineResults, TheSchemaIsAnOutputOfItsOwn)
{
    const CommandLineFolder folder;
    folder.put("s.json",
               folder.bytesOf("job.json").replace("\"report\"", R"("output": [{"file": "a.csv", "schema": "a.types"}],
        "report")"));
    const ProgramRun run = folder.run("render s.json");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_THAT(folder.bytesOf("a.types").toStdString(), HasSubstr(R"("type": "COORDINATE", "unit": "m")"));
    folder.put("s.json", folder.bytesOf("s.json").replace("a.types", "points.csv"));
    const ProgramRun clash = folder.run("render s.json");
    EXPECT_EQ(clash.status, 2) << "it never replaces what the report is made of";
    EXPECT_THAT(clash.err.toStdString(), HasSubstr("is data of the job"));
    EXPECT_THAT(clash.err.toStdString(), HasSubstr("s.json:4:13: error: ")) << "at the output";
}

TEST(CommandLineResults, FurtherPagesAreFilesOfTheirOwn)
{
    const CommandLineFolder folder;
    const QByteArray job = folder.bytesOf("job.json");
    const auto withOutputs = [&job](const char *more) {
        return QByteArray(job).replace("\"report\"", R"("output": [{"file": "a.html", "rowsPerPage": 1})" +
                                                         QByteArray(more) + R"(], "report")");
    };
    folder.put("pages.json", withOutputs(""));
    const ProgramRun run = folder.run("render pages.json");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_THAT(folder.bytesOf("a.html").toStdString(), HasSubstr("href=\"a-2.html\""));
    EXPECT_THAT(folder.bytesOf("a-2.html").toStdString(), HasSubstr("href=\"a.html\""));
    EXPECT_THAT(folder.bytesOf("a-2.html").toStdString(), HasSubstr("<td>2A</td>"));
    EXPECT_EQ(folder.names(), words("a-2.html a.html job.json pages.json points.csv t.xml"));

    ASSERT_TRUE(QFile::remove(folder.path("a.html")) && QFile::remove(folder.path("a-2.html")));
    folder.put("pages.json", withOutputs(R"(, "a-2.html")"));
    const ProgramRun clash = folder.run("render pages.json");
    EXPECT_EQ(clash.status, 2) << clash.all().constData();
    EXPECT_THAT(clash.err.toStdString(), HasSubstr("a-2.html\" is the file of the output"));
    EXPECT_EQ(folder.names(), words("job.json pages.json points.csv t.xml")) << "nothing is written";

    const ProgramRun one = folder.run("render pages.json -o - --as html");
    EXPECT_EQ(one.out.count("<!DOCTYPE html>"), 1) << "standard output has one page";
}

TEST(CommandLineResults, NothingIsWrittenWhereTheInputIsWrong)
{
    const CommandLineFolder folder;
    folder.put("points.csv", "Number,Northing\n1,12.5\n2A,zero\n");
    folder.put("a.csv", "earlier");
    const ProgramRun run = folder.run("render job.json -o a.csv -o a.rep -o a.jsonl");
    EXPECT_EQ(run.status, 2) << run.all().constData();
    EXPECT_EQ(folder.bytesOf("a.csv"), "earlier");
    EXPECT_EQ(folder.names(), words("a.csv job.json points.csv t.xml"));
}

TEST(CommandLineResults, AJobThatDoesNotSayWhichRowsIsRefused)
{
    const CommandLineFolder folder;
    folder.put("two.json",
               folder.bytesOf("job.json").replace("{\"table\"", R"({"table": "Points", "data": "p"}, {"table")"));
    const ProgramRun run = folder.run("render two.json -o a.csv");
    EXPECT_EQ(run.status, 2) << run.all().constData();
    EXPECT_THAT(run.err.toStdString(), HasSubstr("\"a.csv\" has the rows of one step, and 2 steps may be meant"));
    EXPECT_FALSE(QFile::exists(folder.path("a.csv")));
    folder.put("two.json", folder.bytesOf("two.json").replace("\"report\"", R"("output": ["a.csv"], "report")"));
    const ProgramRun check = folder.run("check two.json");
    EXPECT_EQ(check.status, 2);
    EXPECT_THAT(check.out.toStdString(), HasSubstr("error: \"")) << "check says it as well";
    EXPECT_THAT(check.out.toStdString(), HasSubstr("2 steps may be meant"));
}

TEST(CommandLineResults, AnOutputBeyondTheLimitIsNotWritten)
{
    CommandLineFolder folder;
    QByteArray points = "Number,Northing\n";
    for (int i = 0; i < 200; ++i) {
        points += QByteArray::number(i) + ",123456.789\n";
    }
    folder.put("points.csv", points);
    // The text has half as many bytes: it is the output that is too large.
    const ProgramRun run = folder.run("render job.json -o a.jsonl --limit 5000");
    EXPECT_EQ(run.status, 3) << run.all().constData();
    EXPECT_THAT(run.err.toStdString(), HasSubstr("\"a.jsonl\" was not written: it would have more than 4.9 kB"));
    EXPECT_FALSE(QFile::exists(folder.path("a.jsonl")));
}

TEST(CommandLineResults, AnOutputThatCannotBeWrittenLeavesTheOthers)
{
    const CommandLineFolder folder;
    ASSERT_TRUE(QDir(folder.path()).mkdir(QStringLiteral("folder.csv")));
    const ProgramRun run = folder.run("render job.json -o folder.csv -o a.jsonl");
    EXPECT_EQ(run.status, 3) << run.all().constData();
    EXPECT_TRUE(QFile::exists(folder.path("a.jsonl")));
}

TEST(CommandLineResults, ASavedReportHasNoValues)
{
    const CommandLineFolder folder;
    ASSERT_EQ(folder.run("render job.json -o a.rep").status, 0);
    const ProgramRun run = folder.run("convert a.rep a.csv");
    EXPECT_EQ(run.status, 1) << run.all().constData();
    EXPECT_THAT(run.err.toStdString(), HasSubstr("cannot be made from a saved report"));
}

TEST(CommandLineResults, NumbersDoNotDependOnTheLocale)
{
    const CommaLocale comma;
    if (!comma.isThere()) {
        GTEST_SKIP() << "no locale with a decimal comma can be made";
    }
    const CommandLineFolder folder;
    folder.put("points.csv", "Number,Northing\n1,1234.5\n2,0.1\n3,-1e-7\n");
    folder.put("job.json", R"({"now": "2024-03-05T14:07:00", "page": {"linesPerPage": 72, "charsPerRow": 80}, "pdf": {},
        "template": {"file": "t.xml", "name": "CONTROL"}, "data": {"p": {"csv": "points.csv"}},
        "report": [{"table": "Points", "data": "p", "where": [{"of": "Northing", "below": "2000.5"}],
                    "totals": [{"label": "{mean:Northing}", "sum": "Northing"}]}]})");
    const QStringList names = words("a.rep a.txt a.pdf a.xlsx a.html a.csv a.jsonl");
    const auto outputs = [&](const QByteArray &locale) {
        QStringList arguments = words("render job.json");
        for (const QString &name : names) {
            arguments << QStringLiteral("-o") << name;
        }
        const ProgramRun run = runProgram(folder.path(), arguments,
                                          {{"LC_ALL", ""}, {"LANG", "C.UTF-8"}, {"LC_NUMERIC", locale.constData()}});
        EXPECT_EQ(run.status, 0) << run.all().constData();
        std::vector<QByteArray> bytes;
        for (const QString &name : names) {
            bytes.push_back(folder.bytesOf(name.toUtf8().constData()));
            EXPECT_FALSE(bytes.back().isEmpty()) << name.toStdString();
            EXPECT_TRUE(QFile::remove(folder.path(name.toUtf8().constData())));
        }
        return bytes;
    };
    // Programs find the locale.
    QProcess other;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("LC_ALL"), QString::fromUtf8(comma.name()));
    other.setProcessEnvironment(environment);
    other.start(QStringLiteral("printf"), words("%.1f 0"));
    EXPECT_EQ(endOf(other).out, "0,0");
    const std::vector<QByteArray> plain = outputs("C");
    const std::vector<QByteArray> withComma = outputs(comma.name());
    for (std::size_t i = 0; i < plain.size(); ++i) {
        EXPECT_TRUE(withComma[i] == plain[i]) << names[static_cast<qsizetype>(i)].toStdString();
    }
}

} // namespace
