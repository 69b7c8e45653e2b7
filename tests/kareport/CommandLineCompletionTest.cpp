#include "CompletedLine.h"

#include <QRegularExpression>

#include <gtest/gtest.h>

namespace
{

QStringList commands()
{
    return words("render watch convert templates check new view help completion");
}

/// The long options that the help of a command shows.
QStringList optionsOf(const CommandLineFolder &folder, const QString &command)
{
    static const QRegularExpression option(QStringLiteral("^  (?:-\\w,)?(--[a-z-]+)"),
                                           QRegularExpression::MultilineOption);
    QStringList options;
    const QString help = QString::fromUtf8(folder.run({command, QStringLiteral("--help")}).out);
    for (auto match = option.globalMatch(help); match.hasNext();) {
        options.append(match.next().captured(1));
    }
    return options;
}

TEST(CommandLineCompletion, EveryCommandAndOptionIsInEveryScript)
{
    const CommandLineFolder folder;
    const QString bash = QString::fromUtf8(completionScript("bash"));
    const QString zsh = QString::fromUtf8(completionScript("zsh"));
    const QString fish = QString::fromUtf8(completionScript("fish"));
    int count = 0;
    for (const QString &command : commands()) {
        const QString ofZsh =
            zsh.section(QStringLiteral("    %1)\n").arg(command), 1).section(QStringLiteral(";;"), 0, 0);
        const QString ofBash =
            bash.section(QStringLiteral("    %1) _kareport_words '").arg(command), 1).section(u'\'', 0, 0);
        EXPECT_TRUE(fish.contains(QStringLiteral("-n __kareport_command_is -a %1 -d '").arg(command)))
            << qPrintable(command);
        EXPECT_TRUE(zsh.contains(QStringLiteral("'%1:").arg(command))) << qPrintable(command);
        const QStringList options = optionsOf(folder, command);
        EXPECT_TRUE(options.contains(QStringLiteral("--help"))) << qPrintable(command);
        for (const QString &option : options) {
            ++count;
            EXPECT_TRUE(ofBash.split(u' ').contains(option)) << qPrintable(command) << qPrintable(option);
            EXPECT_TRUE(ofZsh.contains(QRegularExpression(QStringLiteral("[,'{*]%1[=\\[},]").arg(option))))
                << qPrintable(command) << qPrintable(option) << qPrintable(ofZsh);
            EXPECT_TRUE(fish.contains(QRegularExpression(
                QStringLiteral("'__kareport_command_is %1'( -s \\w)? -l %2[ \n]").arg(command, option.mid(2)))))
                << qPrintable(command) << qPrintable(option);
        }
    }
    EXPECT_GT(count, 50);
    EXPECT_TRUE(folder.run("render --help").out.contains("--skip-blank-lines")) << "the last one is found as well";
    EXPECT_TRUE(optionsOf(folder, QStringLiteral("render")).contains(QStringLiteral("--skip-blank-lines")));
}

/// What bash makes of a command line; a blank at its end begins a new word.
QStringList completedByBash(const CompletionFolder &folder, const char *line)
{
    // As readline calls it: a "=" is a word of its own.
    const QString script =
        QStringLiteral("source ./_kareport.bash; COMP_WORDS=(\"$@\"); COMP_CWORD=$(($# - 1)); _kareport; "
                       "[[ ${#COMPREPLY[@]} -eq 0 ]] || printf '%s\\n' \"${COMPREPLY[@]}\"");
    QStringList words = QString::fromUtf8(line).split(u' ');
    words.replaceInStrings(QStringLiteral("~"), QStringLiteral("\\ "));
    const ProgramRun run = folder.runShell(
        QStringLiteral("bash"),
        QStringList{QStringLiteral("--norc"), QStringLiteral("-c"), script, QStringLiteral("bash")} + words);
    EXPECT_EQ(run.err, "") << line;
    QStringList found = QString::fromUtf8(run.out).split(u'\n', Qt::SkipEmptyParts);
    found.sort();
    return found;
}

TEST(CommandLineCompletion, BashCompletes)
{
    struct Row
    {
        const char *line;  ///< "~" for a blank within a word
        const char *found; ///< with "|" between them
        const char *reason;
    };
    constexpr Row rows[] = {
        {"kareport ", "check|completion|convert|help|new|render|templates|view|watch", "commands"},
        {"kareport c", "check|completion|convert", "that begin so"},
        {"kareport --v", "--version", "options of the program"},
        {"kareport render --pr", "--progress", "an option"},
        {"kareport check --js", "--json", "of its command"},
        {"kareport view --js", "", "not of another"},
        {"kareport render --as ", "csv|html|jsonl|pdf|rep|rtf|rtf-image|text|xlsx", "kinds"},
        {"kareport render job.json --as rt", "rtf|rtf-image", "after other words"},
        {"kareport render --as = rt", "rtf|rtf-image", "after an equals sign"},
        {"kareport render j", "job.json", "jobs"},
        {"kareport render ", "My job.json|job.json|sub", "jobs and folders, no other files"},
        {"kareport render My~", "My job.json", "a blank in the name"},
        {"kareport render p", "points.csv", "any file where no job is"},
        {"kareport check ", "My job.json|job.json|sub|t.xml", "jobs and templates"},
        {"kareport render -t ", "sub|t.xml", "templates"},
        {"kareport render --template = ", "sub|t.xml", "with an equals sign alone"},
        {"kareport render -t t.xml -n ", "CONTROL|SITE", "templates of the file"},
        {"kareport render --template = t.xml --name C", "CONTROL", "the same"},
        {"kareport templates t.xml --name ", "CONTROL|SITE", "of the argument"},
        {"kareport render -n CONTROL -t t.xml --table ", "Points", "tables of the template"},
        {"kareport render -n CONTROL -t t.xml --block ", "Point", "blocks of the template"},
        {"kareport render -t none.xml -n ", "", "a file that is not there"},
        {"kareport render -n ", "", "no file"},
        {"kareport render --set settings.lengthU", "settings.lengthUnit=", "a key, once"},
        {"kareport render --set settings.lengthUnit = ", "ft|km|m|mm|usft", "its values"},
        {"kareport render --set = settings.lengthUnit = u", "usft", "with two equals signs"},
        {"kareport convert a b --set page.p", "page.paper=|page.printer=", "keys of the page"},
        {"kareport convert a b --set settings", "", "alone"},
        {"kareport render --set title = ", "", "what only the user knows"},
        {"kareport render --limit ", "", "the same"},
        {"kareport render --encoding w", "windows-1252", "encodings"},
        {"kareport new ", "sub", "folders"},
        {"kareport help con", "convert", "commands again"},
        {"kareport completion ", "bash|fish|zsh", "shells"},
        {"kareport help render", "render", "a word that is whole"},
        {"kareport none ", "", "no such command"},
    };
    const CompletionFolder folder;
    for (const Row &row : rows) {
        EXPECT_EQ(completedByBash(folder, row.line).join(u'|').toStdString(), row.found)
            << row.line << ": " << row.reason;
    }
}

TEST(CommandLineCompletion, EveryKeyThatIsOfferedIsOneOfAJob)
{
    const CompletionFolder folder;
    int count = 0;
    for (const QString &key : completedByBash(folder, "kareport render --set ")) {
        const QByteArray line = "kareport render --set " + key.chopped(1).toUtf8() + " = ";
        QStringList values = completedByBash(folder, line.constData());
        const bool areKnown = !values.isEmpty();
        if (!areKnown) {
            values.append(QStringLiteral("1"));
        }
        for (const QString &value : values) {
            ++count;
            const ProgramRun run =
                folder.run({QStringLiteral("render"), QStringLiteral("job.json"), QStringLiteral("-o"),
                            QStringLiteral("-"), QStringLiteral("--set"), key + value});
            EXPECT_NE(run.status, 1) << qPrintable(key + value) << run.all().constData();
            EXPECT_FALSE(run.err.contains("unknown key") || (areKnown && run.err.contains("was expected")))
                << qPrintable(key + value) << run.all().constData();
        }
    }
    EXPECT_GT(count, 60);
}

} // namespace
