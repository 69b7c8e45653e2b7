#include "CommandLine.h"

#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QFileInfo>

#include <gtest/gtest.h>

#include <vector>

// Many jobs in one process.

namespace
{

QByteArray lineJob(const char *line, const char *output, const char *more = "")
{
    return QByteArray("{\"header\": false, ") + more + "\"report\": [{\"line\": \"" + line + "\"}], \"output\": [\"" +
           output + "\"]}";
}

/// A folder with the jobs a, b and c, which write a line each to a.txt, b.txt and c.txt.
class BatchFolder : public CommandLineFolder
{
public:
    BatchFolder()
    {
        put("a.json", lineJob("A", "a.txt"));
        put("b.json", lineJob("B", "b.txt"));
        put("c.json", lineJob("C", "c.txt"));
    }

    /// What the jobs wrote, as "a.txt=A\n", with a blank between two.
    QByteArray written() const
    {
        QByteArray all;
        for (const QString &name : names()) {
            if (name.endsWith(QStringLiteral(".txt"))) {
                all += (all.isEmpty() ? "" : " ") + name.toUtf8() + '=' + bytesOf(qPrintable(name)).trimmed();
            }
        }
        return all;
    }
};

TEST(CommandLineBatch, EveryJobIsMade)
{
    struct Row
    {
        const char *line;
        const char *written;
        const char *err;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"render a.json b.json", "a.txt=A b.txt=B", "kareport: 2 of 2 jobs made\n", "two names"},
        {"render --quiet a.json b.json", "a.txt=A b.txt=B", "", "and nothing said"},
        {"render --jobs list", "a.txt=A c.txt=C", "kareport: 2 of 2 jobs made\n", "names in a list"},
        {"render b.json --jobs list", "a.txt=A b.txt=B c.txt=C", "kareport: 3 of 3 jobs made\n", "both"},
        {"render a.json b.json c.json --slice 2/2", "b.txt=B", "kareport: 1 of 1 jobs made\n", "a slice"},
        {"render --jobs list --slice 1/2", "a.txt=A", "kareport: 1 of 1 jobs made\n", "a slice of the list"},
        {"render a.json --slice 2/2", "", "kareport: there was no job to run\n", "a slice without a job"},
        {"render --jobs empty", "", "kareport: there was no job to run\n", "a list without a job"},
        {"render a.json b.json --set report.0.line=x", "a.txt=x b.txt=x", "kareport: 2 of 2 jobs made\n",
         "a key that is set counts for all"},
    };
    for (const Row &row : rows) {
        const BatchFolder folder;
        folder.put("list", "a.json\nc.json\n");
        folder.put("empty", "\n");
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, 0) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(folder.written(), row.written) << row.reason;
        EXPECT_EQ(run.out, "") << row.reason;
        EXPECT_EQ(run.err, row.err) << row.reason;
    }
}

TEST(CommandLineBatch, TheListMayComeFromAPipe)
{
    const BatchFolder folder;
    const ProgramRun run = runWithInput(folder.path(), words("render --jobs -"), "a.json\nb.json\n");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(folder.written(), "a.txt=A b.txt=B");
}

/// A batch of which jobs fail.
struct FailedBatch
{
    const char *line;
    int status;
    const char *written;
    std::vector<const char *> err;
    const char *reason;
};

void expectFailures(const std::vector<FailedBatch> &rows)
{
    for (const FailedBatch &row : rows) {
        const BatchFolder folder;
        folder.put("bad.json", "{\"report\": ]");
        folder.put("unwritable.json", lineJob("U", "missing-folder/u.txt"));
        folder.put("again.json", lineJob("A2", "./a.txt"));
        folder.put("nodata.json", folder.bytesOf("job.json").replace("points.csv", "none.csv"));
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, row.status) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(folder.written(), row.written) << row.reason;
        for (const char *text : row.err) {
            EXPECT_TRUE(run.err.contains(text)) << row.reason << ": " << text << "\n" << run.all().constData();
        }
    }
}

TEST(CommandLineBatch, AJobThatFailsDoesNotKeepTheOthersFromBeingMade)
{
    expectFailures({
        {"render a.json none.json b.json",
         2,
         "a.txt=A b.txt=B",
         {"none.json: error: the file cannot be read", "kareport: 2 of 3 jobs made, 1 failed\n"},
         "no such job"},
        {"render bad.json b.json",
         2,
         "b.txt=B",
         {"bad.json:1:13: error:", "kareport: 1 of 2 jobs made, 1 failed\n"},
         "no JSON"},
        {"render unwritable.json b.json",
         3,
         "b.txt=B",
         {"could not be written", "1 of 2 jobs made, 1 failed\n"},
         "an output that cannot be written"},
        {"render bad.json unwritable.json bad.json",
         3,
         "",
         {"0 of 3 jobs made, 3 failed\n"},
         "the greatest status, whatever comes last"},
    });
}

TEST(CommandLineBatch, AJobThatRepeatsAnotherOrIsWrongForAKeyFailsAlone)
{
    expectFailures({
        {"render a.json again.json b.json",
         2,
         "a.txt=A b.txt=B",
         {"again.json: error: ", "a.txt\" is written by the job \"a.json\" already", "2 of 3 jobs made, 1 failed"},
         "one file for two reports: the first one stays"},
        {"render a.json a.json", 2, "a.txt=A", {"1 of 2 jobs made, 1 failed"}, "a job that is named twice"},
        {"render nodata.json a.json", 2, "a.txt=A", {"none.csv", "1 of 2 jobs made, 1 failed"}, "no data"},
        {"render a.json b.json --set report.0.x=1",
         2,
         "",
         {"unknown key \"x\"", "0 of 2 jobs made, 2 failed"},
         "a key that no job knows"},
        {"render a.json b.json --set report.7.line=x",
         1,
         "",
         {"\"report.7.line\"", "0 of 2 jobs made, 2 failed"},
         "a key that leads nowhere"},
    });
}

TEST(CommandLineBatch, NoTwoJobsWriteOneFile)
{
    struct Row
    {
        const char *first;  ///< output of the first job
        const char *second; ///< output of the second
        int status;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"one.txt", "two.txt", 0, "two files"},
        {"one.txt", "one.txt", 2, "one file"},
        {"one.txt", "./one.txt", 2, "by another way"},
        {"one.txt", "folder/../one.txt", 2, "by another folder"},
        {"link.txt", "target.txt", 2, "a link to the other's file"},
        {"target.txt", "link.txt", 2, "the other way round"},
        {"folder/new.txt", "linked/new.txt", 2, "a folder with two names"},
        {"folder/one.txt", "one.txt", 0, "one name in two folders"},
    };
    for (const Row &row : rows) {
        const BatchFolder folder;
        ASSERT_TRUE(QDir(folder.path()).mkdir(QStringLiteral("folder")));
        folder.put("target.txt", "old");
        ASSERT_TRUE(QFile::link(QStringLiteral("target.txt"), folder.path("link.txt")));
        ASSERT_TRUE(QFile::link(QStringLiteral("folder"), folder.path("linked")));
        folder.put("1.json", lineJob("first", row.first));
        folder.put("2.json", lineJob("second", row.second));
        const ProgramRun run = folder.run("render 1.json 2.json");
        EXPECT_EQ(run.status, row.status) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(folder.bytesOf(row.first), "first\n") << row.reason;
        EXPECT_EQ(folder.bytesOf(row.second), row.status == 0 ? "second\n" : "first\n") << row.reason;
    }
    // A job that has written nothing does not keep its file from others, and a device may be written twice.
    const BatchFolder folder;
    folder.put("bad.json", lineJob("x", "one.txt", "\"template\": {\"file\": \"none.xml\", \"name\": \"N\"}, "));
    folder.put("good.json", lineJob("good", "one.txt"));
    EXPECT_EQ(folder.run("render bad.json good.json").status, 2);
    EXPECT_EQ(folder.bytesOf("one.txt"), "good\n");
    EXPECT_EQ(folder.run("render a.json b.json -o /dev/null --as text -o {}.txt").status, 1) << "one name for two jobs";
    folder.put("1.json",
               lineJob("x", "/dev/null").replace("\"/dev/null\"", "{\"file\": \"/dev/null\", \"as\": \"text\"}"));
    folder.put("2.json", folder.bytesOf("1.json"));
    EXPECT_EQ(folder.run("render 1.json 2.json").status, 0);
}

TEST(CommandLineBatch, AListThatCannotBeReadIsNotAnEmptyList)
{
    const BatchFolder folder;
    QProcess process;
    process.setWorkingDirectory(folder.path());
    // A folder opens, and cannot be read.
    process.start(QStringLiteral("sh"), {QStringLiteral("-c"), QStringLiteral("exec \"$0\" render --jobs - < ."),
                                         QStringLiteral(KAREPORT_PROGRAM)});
    ASSERT_TRUE(process.waitForFinished(60'000));
    const QByteArray err = process.readAllStandardError();
    EXPECT_EQ(process.exitCode(), 2) << err.constData();
    EXPECT_TRUE(err.contains("standard input cannot be read")) << err.constData();
    EXPECT_EQ(folder.run("render --jobs none.txt").status, 2);
}

TEST(CommandLineBatch, OutputsOfTheCommandLineTellTheJobsApart)
{
    struct Row
    {
        const char *line;
        int status;
        const char *written;
        const char *out;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"render a.json b.json -o x-{}.txt", 0, "x-a.txt=A x-b.txt=B", "", "the names of the jobs"},
        {"render a.json -o {}-{}.txt", 0, "a-a.txt=A", "", "twice in a name, and for one job as well"},
        {"render a.json b.json -o -", 0, "", "A\nB\n", "standard output, one after the other"},
        {"render a.json b.json -o {}.txt -o -", 0, "a.txt=A b.txt=B", "A\nB\n", "both"},
        {"render a.json b.json -o x.txt", 1, "", "", "one file for two jobs"},
        {"render --jobs list -o x.txt", 1, "", "", "a list may hold any number of jobs"},
        {"render a.json --slice 1/1 -o x.txt", 1, "", "", "so may a slice"},
        {"render a.json -o x.txt", 0, "x.txt=A", "", "one job"},
    };
    for (const Row &row : rows) {
        const BatchFolder folder;
        folder.put("list", "a.json\n");
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, row.status) << row.reason << "\n" << run.all().constData();
        EXPECT_EQ(folder.written(), row.written) << row.reason;
        EXPECT_EQ(run.out, row.out) << row.reason;
    }
}

TEST(CommandLineBatch, AWrongCommandLineIsStatus1)
{
    struct Row
    {
        const char *line;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"render a.json --slice 3", "no count"},
        {"render a.json --slice 3/2", "beyond the count"},
        {"render a.json --slice 1/", "a variable that is not set"},
        {"render a.json --slice=", "nothing at all, as of a variable that is not set"},
        {"render --slice 1/2", "a slice of nothing"},
        {"render --jobs list --template t.xml --name CONTROL --table Points --data points.csv",
         "a list and the short form"},
        {"render --slice 1/2 --template t.xml --name CONTROL --table Points --data points.csv",
         "one job has no slices"},
    };
    for (const Row &row : rows) {
        const BatchFolder folder;
        folder.put("list", "a.json\n");
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, 1) << row.reason << "\n" << run.all().constData();
        EXPECT_NE(run.err, "") << row.reason;
        EXPECT_EQ(folder.written(), "") << row.reason;
    }
}

TEST(CommandLineBatch, AReportIsTheOneThatItsJobMakesAlone)
{
    // What one job sets must not reach the next one: title, application, time, page, settings, options, template.
    const QByteArray first =
        "{\"title\": \"Same\", \"application\": \"TALVEN One\", \"now\": \"2024-03-05T14:07:00\",\n"
        " \"page\": {\"linesPerPage\": 20, \"charsPerRow\": 100, \"margins\": [2000, 3000, 2000, 3000], \"fontSize\": 12},\n"
        " \"settings\": {\"lengthUnit\": \"ft\", \"lengthDecimals\": 1},\n"
        " \"template\": {\"file\": \"t.xml\", \"name\": \"CONTROL\"},\n"
        " \"options\": {\"zeroBlank\": true, \"writeTableName\": true, \"printHash\": true, \"separator\": 59},\n"
        " \"data\": {\"p\": {\"csv\": \"points.csv\"}},\n"
        " \"report\": [{\"heading\": \"H\"}, {\"table\": \"Points\", \"data\": \"p\"}], \"output\": [\"1.rep\", "
        "\"1.pdf\", {\"file\": \"1.rtf\", \"as\": \"rtf-image\"}]}";
    const QByteArray second =
        "{\"title\": \"Same\", \"now\": \"2024-03-05T14:08:00\", \"template\": {\"file\": \"t.xml\", \"name\": "
        "\"CONTROL\"},\n \"data\": {\"p\": {\"csv\": \"points.csv\"}},\n"
        " \"report\": [{\"line\": \"x\"}, {\"table\": \"Points\", \"data\": \"p\"}], \"output\": [\"2.rep\", \"2.pdf\", "
        "\"2.rtf\"]}";
    const QByteArray third = "{\"now\": \"2024-03-05T14:09:00\", \"report\": [{\"line\": \"y\"}], \"output\": "
                             "[\"3.rep\", \"3.rtf\"]}";
    constexpr const char *outputs[] = {"1.rep", "1.pdf", "1.rtf", "2.rep", "2.pdf", "2.rtf", "3.rep", "3.rtf"};
    const CommandLineFolder alone;
    const CommandLineFolder batch;
    for (const CommandLineFolder *folder : {&alone, &batch}) {
        folder->put("1.json", first);
        folder->put("2.json", second);
        folder->put("3.json", third);
    }
    for (const char *job : {"render 1.json", "render 2.json", "render 3.json"}) {
        const ProgramRun run = alone.run(job);
        EXPECT_EQ(run.status, 0) << run.all().constData();
    }
    for (const char *line : {"render 1.json 2.json 3.json", "render 3.json 2.json 1.json"}) {
        const ProgramRun run = batch.run(line);
        EXPECT_EQ(run.status, 0) << run.all().constData();
        for (const char *output : outputs) {
            EXPECT_EQ(batch.bytesOf(output), alone.bytesOf(output)) << line << ": " << output;
        }
    }
    EXPECT_TRUE(alone.bytesOf("2.rep").contains("TALVEN - Same ")) << alone.bytesOf("2.rep").constData();
}

/// Sets when a file was changed, in seconds after some moment.
void setTime(const CommandLineFolder &folder, const char *name, int seconds)
{
    QFile file(folder.path(name));
    ASSERT_TRUE(file.open(QIODevice::ReadWrite)) << name;
    ASSERT_TRUE(file.setFileTime(QDateTime::fromSecsSinceEpoch(1'700'000'000 + seconds), QFile::FileModificationTime));
}

TEST(CommandLineBatch, UpdateMakesWhatIsOlderThanItsSources)
{
    struct Row
    {
        std::vector<std::pair<const char *, int>> times; ///< of files, in seconds; what is not named has 0
        const char *missing;                             ///< an output; empty for none
        bool isMade;
        const char *reason;
    };
    const Row rows[] = {
        {{{"out.rep", 10}, {"out.txt", 10}}, "", false, "newer than all"},
        {{{"out.rep", 10}, {"out.txt", 10}, {"job.json", 11}}, "", true, "the job was changed"},
        {{{"out.rep", 10}, {"out.txt", 10}, {"t.xml", 11}}, "", true, "the template was changed"},
        {{{"out.rep", 10}, {"out.txt", 10}, {"points.csv", 11}}, "", true, "the data was changed"},
        {{{"out.rep", 10}, {"out.txt", 10}, {"points.csv", 10}},
         "",
         true,
         "in the same moment: it may have been after"},
        {{{"out.rep", 10}, {"out.txt", 5}, {"points.csv", 7}}, "", true, "one output is old"},
        {{{"out.rep", 10}, {"out.txt", 10}}, "out.txt", true, "one output is missing"},
        {{{"out.rep", 10}, {"out.txt", 10}}, "out.rep", true, "the other one is missing"},
    };
    for (const Row &row : rows) {
        for (const char *line : {"render --update job.json", "render --update --jobs list"}) {
            const CommandLineFolder folder;
            folder.put("list", "job.json\n");
            folder.put("job.json",
                       folder.bytesOf("job.json").replace("]}\n", "], \"output\": [\"out.rep\", \"out.txt\"]}"));
            for (const char *name : {"job.json", "t.xml", "points.csv"}) {
                setTime(folder, name, 0);
            }
            for (const char *name : {"out.rep", "out.txt"}) {
                folder.put(name, "old");
            }
            for (const auto &[name, seconds] : row.times) {
                setTime(folder, name, seconds);
            }
            if (*row.missing != '\0') {
                QFile::remove(folder.path(row.missing));
            }
            const ProgramRun run = folder.run(line);
            EXPECT_EQ(run.status, 0) << row.reason << "\n" << run.all().constData();
            EXPECT_EQ(folder.bytesOf("out.rep"), row.isMade ? jobReport() : QByteArray("old")) << row.reason;
            EXPECT_EQ(folder.bytesOf("out.txt"), row.isMade ? jobText() : QByteArray("old")) << row.reason;
        }
    }
}

TEST(CommandLineBatch, UpdateSaysWhatIsUpToDate)
{
    const BatchFolder folder;
    EXPECT_EQ(folder.run("render --update a.json b.json").err, "kareport: 2 of 2 jobs made\n");
    for (const char *name : {"a.json", "b.json", "c.json"}) {
        setTime(folder, name, 0);
    }
    EXPECT_EQ(folder.run("render --update a.json b.json c.json").err, "kareport: 1 of 3 jobs made, 2 up to date\n");
    EXPECT_EQ(folder.run("render --update a.json").err, "kareport: all is up to date; nothing was written\n");
    EXPECT_EQ(folder.run("render --update --quiet a.json").err, "");
    const ProgramRun toTerminal = folder.run("render --update a.json -o -");
    EXPECT_EQ(toTerminal.out, "A\n") << "standard output is never up to date";
    folder.put("short.txt", "old");
    const ProgramRun shortForm =
        folder.run("render -t t.xml -n CONTROL --table Points -d gone.csv -o short.txt --update");
    EXPECT_EQ(shortForm.status, 2) << "missing data is an error, not up to date";
}

TEST(CommandLineBatch, ProgressTellsTheJobs)
{
    const BatchFolder folder;
    const ProgramRun run = folder.run("render --progress --quiet a.json b.json");
    EXPECT_EQ(run.status, 0);
    EXPECT_TRUE(run.err.contains("1/2 a.json")) << run.err.constData();
    EXPECT_TRUE(run.err.trimmed().endsWith("2/2 100 %")) << run.err.constData();
}

TEST(CommandLineBatch, ALaterPdfHasTheBytesOfAProcessOfItsOwn)
{
    const CommandLineFolder folder;
    const char *const names[] = {"a", "b", "c"};
    for (const char *name : names) {
        // The second one needs other faces, the third one those of the first.
        const char *line = *name == 'b' ? "\xE6\xB8\xAC \xE2\x88\x9E" : "P1 100.25";
        folder.put((QByteArray(name) + ".json").constData(), lineJob(line, (QByteArray(name) + ".pdf").constData()));
    }
    QByteArrayList alone;
    for (const char *name : names) {
        ASSERT_EQ(
            folder.run(QStringList{QStringLiteral("render"), QLatin1StringView(name) + QStringLiteral(".json")}).status,
            0);
        alone.append(folder.bytesOf((QByteArray(name) + ".pdf").constData()));
    }
    ASSERT_EQ(folder.run("render a.json b.json c.json").status, 0);
    for (qsizetype i = 0; i < alone.size(); ++i) {
        EXPECT_TRUE(alone[i].startsWith("%PDF-"));
        EXPECT_TRUE(folder.bytesOf((QByteArray(names[i]) + ".pdf").constData()) == alone[i]) << names[i];
    }
}

} // namespace
