#include "CommandLine.h"

#include <gtest/gtest.h>

// What the program says to someone who does not know its words, or has misspelt one.

namespace
{

QStringList commands()
{
    return words("render watch convert templates check new view help completion");
}

TEST(CommandLineHelp, HelpOfACommandIsWhatItsOptionShows)
{
    const CommandLineFolder folder;
    for (const QString &command : commands()) {
        const ProgramRun option = folder.run({command, QStringLiteral("--help")});
        const ProgramRun help = folder.run({QStringLiteral("help"), command});
        EXPECT_EQ(help.status, 0) << qPrintable(command) << help.all().constData();
        EXPECT_TRUE(option.out.contains("kareport " + command.toUtf8())) << option.all().constData();
        EXPECT_EQ(help.out.toStdString(), option.out.toStdString()) << qPrintable(command);
        EXPECT_EQ(help.err, "");
    }
    const ProgramRun all = folder.run("help");
    EXPECT_EQ(all.status, 0);
    EXPECT_EQ(all.out.toStdString(), folder.run("--help").out.toStdString());
    for (const QString &command : commands()) {
        EXPECT_TRUE(all.out.contains("\n  " + command.toUtf8() + ' ')) << qPrintable(command);
    }
}

TEST(CommandLineHelp, AWordThatIsNotKnownGetsTheNearest)
{
    struct Row
    {
        const char *line;
        const char *said;
        const char *see;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"rendr job.json", "\"rendr\" is not a command: one of render, watch, convert, ", "kareport", "all of them"},
        {"rendr job.json", "; did you mean \"render\"?", "kareport", "and the nearest"},
        {"covert a.rep a.pdf", "did you mean \"convert\"?", "kareport", "another"},
        {"print job.json", "\"print\" is not a command: one of render,", "kareport", "none is near"},
        {"job.json", "\"job.json\" is not a command: did you mean \"kareport render job.json\"?", "kareport", "a job"},
        {"t.xml", "\"t.xml\" is not a command: did you mean \"kareport check t.xml\"?", "kareport", "a template"},
        {"none.json", "\"none.json\" is not a command: one of", "kareport", "no file"},
        {"help rendr", "\"rendr\" is not a command: one of render,", "kareport", "in place of a command"},
        {"", "a command was expected: render, watch,", "kareport", "nothing"},
        {"--hepl", "kareport has no option \"--hepl\": did you mean \"--help\"?", "kareport", "of the program"},
        {"render job.json --ouput=a.txt", "render has no option \"--ouput\": did you mean \"--output\"?",
         "kareport render", "without its value"},
        {"render job.json --OUTPUT a.txt", "render has no option \"--OUTPUT\": did you mean \"--output\"?",
         "kareport render", "in capitals"},
        {"render job.json --colour", "render has no option \"--colour\"", "kareport render", "whatever is near"},
        {"check job.json --jsn", "check has no option \"--jsn\": did you mean \"--json\"?", "kareport check",
         "of this command"},
        {"check --jsn", "check has no option \"--jsn\"", "kareport check", "before what else is missing"},
        {"render job.json -quiet", "render has no option \"-quiet\": did you mean \"--quiet\"?", "kareport render",
         "one dash"},
        {"--quiet render job.json", "\"--quiet\" was expected after \"render\"", "kareport render",
         "at the wrong place"},
        {"render job.json --as pfd", "did you mean \"pdf\"?", "kareport render", "a kind"},
        {"completion fisch", "\"fisch\": one of bash, zsh, fish was expected; did you mean \"fish\"?",
         "kareport completion", "a shell"},
        {"render job.json -o", "--output: FILE was expected", "kareport render", "no value"},
        {"render job.json --as", "--as: KIND was expected", "kareport render", "no value"},
        {"render job.json --as text --as rep", "--as was given more than once", "kareport render", "twice"},
        {"check", "check: FILE was expected", "kareport check", "no argument"},
        {"convert a.rep", "convert: OUT was expected", "kareport convert", "one of two"},
        {"templates t.xml u.xml", "templates: \"u.xml\" was not expected", "kareport templates", "one too many"},
        {"watch job.json other.json", "watch: \"other.json\" was not expected", "kareport watch", "one too many"},
        {"render -t t.xml -n CONTROL --table Points -d points.csv --skip x",
         "--skip \"x\": a whole number was expected", "kareport render", "no number"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, 1) << row.line << "\n" << run.all().constData();
        EXPECT_TRUE(run.err.startsWith("kareport: ")) << run.all().constData();
        EXPECT_TRUE(run.err.contains(row.said)) << row.line << ": " << row.reason << "\n" << run.all().constData();
        EXPECT_TRUE(run.err.endsWith(QByteArray("\nSee ") + row.see + " --help.\n"))
            << row.line << run.all().constData();
        EXPECT_EQ(run.err.count('\n'), 2) << row.line << run.all().constData();
        EXPECT_EQ(run.out, "") << row.line;
    }
}

TEST(CommandLineHelp, ANameThatIsNotKnownGetsTheNearest)
{
    struct Row
    {
        const char *line;
        const char *said;
    };
    constexpr Row rows[] = {
        {"render -t t.xml -n CONTROLL --table Points -d points.csv", "did you mean \"CONTROL\"?"},
        {"render -t t.xml -n CONTROL --table Point -d points.csv", "did you mean \"Points\"?"},
        {"render -t t.xml -n CONTROL --block Pont -d points.csv", "did you mean \"Point\"?"},
        {"render -t t.xml -n CONTROL --table Points -d points.csv --units lenght=ft", "did you mean \"length\"?"},
        {"render -t t.xml -n CONTROL --table Points -d points.csv --encoding utf8", "did you mean \"utf-8\"?"},
        {"render job.json --set settings.lengthUnits=ft", "did you mean \"lengthUnit\"?"},
        {"templates t.xml --name CNTROL", "did you mean \"CONTROL\"?"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, 2) << row.line << "\n" << run.all().constData();
        EXPECT_TRUE(run.err.contains(row.said)) << row.line << "\n" << run.all().constData();
    }
}

} // namespace
