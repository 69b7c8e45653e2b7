#include "CompletedLine.h"

#include <QStandardPaths>

#include <gtest/gtest.h>

// Completion in shells that are not on every machine. They complete for themselves: nothing of them is replaced here.

namespace
{

struct Row
{
    const char *line;
    const char *found; ///< words that must be offered, with blanks between them
    const char *absent;
};

constexpr Row rows[] = {
    {"kareport re", "render", "watch"},
    {"kareport render --pro", "--progress", "--quiet"},
    {"kareport check --js", "--json", "--jobs"},
    {"kareport render --as rt", "rtf rtf-image", "pdf"},
    {"kareport render j", "job.json", "points.csv"},
    {"kareport render -t t", "t.xml", "job.json"},
    {"kareport render -t t.xml -n ", "CONTROL SITE", "Points"},
    {"kareport templates t.xml --name ", "CONTROL SITE", "Points"},
    {"kareport render -t t.xml -n CONTROL --table ", "Points", "CONTROL"},
    {"kareport render -t t.xml -n CONTROL --block ", "Point", "Points"},
    {"kareport render --set settings.lengthUnit=u", "settings.lengthUnit=usft", "settings.lengthUnit=km"},
    {"kareport convert a.rep b.pdf --set page.or", "page.orientation=portrait page.orientation=landscape",
     "settings.lengthUnit=m"},
    {"kareport new s", "sub", "t.xml"},
    {"kareport help con", "convert", "check"},
    {"kareport completion ", "bash zsh fish", "render"},
};

void expectOffered(const char *shell, const Row &row, const QByteArray &offered)
{
    const QList<QByteArray> lines = offered.split('\n');
    for (const QByteArray &word : QByteArray(row.found).split(' ')) {
        EXPECT_TRUE(lines.contains(word)) << shell << ": " << row.line << ": " << word.constData() << "\n"
                                          << offered.constData();
    }
    EXPECT_FALSE(lines.contains(row.absent)) << shell << ": " << row.line << "\n" << offered.constData();
}

TEST(CommandLineOtherShells, FishCompletes)
{
    if (QStandardPaths::findExecutable(QStringLiteral("fish")).isEmpty()) {
        GTEST_SKIP() << "fish is not installed";
    }
    const CompletionFolder folder;
    const ProgramRun syntax = folder.runShell(QStringLiteral("fish"), words("--no-config --no-execute _kareport.fish"));
    EXPECT_EQ(syntax.all(), "status 0\nout: \nerr: ");
    for (const Row &row : rows) {
        const ProgramRun run =
            folder.runShell(QStringLiteral("fish"),
                            {QStringLiteral("--no-config"), QStringLiteral("-c"),
                             QStringLiteral("source _kareport.fish; complete -C \"%1\" | string replace -r '\\t.*' ''")
                                 .arg(QLatin1StringView(row.line))});
        EXPECT_EQ(run.err, "") << row.line;
        QByteArray offered = run.out;
        expectOffered("fish", row, offered.replace("sub/\n", "sub\n"));
    }
}

TEST(CommandLineOtherShells, ZshCompletes)
{
    if (QStandardPaths::findExecutable(QStringLiteral("zsh")).isEmpty()) {
        GTEST_SKIP() << "zsh is not installed";
    }
    const CompletionFolder folder;
    const ProgramRun syntax = folder.runShell(QStringLiteral("zsh"), words("-f -n _kareport.zsh"));
    EXPECT_EQ(syntax.all(), "status 0\nout: \nerr: ");
    // A zsh that has a terminal of its own. What it offers is printed as well.
    folder.put("capture.zsh", R"sh(
zmodload zsh/zpty || exit 3
zpty z zsh -f -i
zpty -w z 'stty -echo; PS1= PS2= RPS1=; unset zle_bracketed_paste'
zpty -w z 'autoload -Uz compinit && compinit -u -D; source ./_kareport.zsh'
# Completion goes on as it is: what is added is printed as well.
zpty -w z 'compadd() { local -a _hits; builtin compadd -A _hits "$@"; print -r; print -rl -- "<"${^_hits}; builtin compadd "$@" }'
zpty -w z 'finish() { compstate[insert]=; compstate[list]=; print -r -- "==""end==" }; comppostfuncs=(finish)'
zpty -w z 'bindkey "^I" complete-word; print -r -- "==""ready=="'
zpty -r -m z ready '*==ready==*'
zpty -w -n z "$1"$'\t'
zpty -r -m z all '*==end==*'
print -r -- ${all//$'\r'/}
zpty -d z
)sh");
    for (const Row &row : rows) {
        const ProgramRun run =
            folder.runShell(QStringLiteral("zsh"),
                            {QStringLiteral("-f"), QStringLiteral("capture.zsh"), QString::fromLatin1(row.line)});
        QByteArray offered = run.out;
        EXPECT_TRUE(offered.contains("==end==")) << row.line << run.all().constData();
        offered.replace("\n<", "\n");
        expectOffered("zsh", row, offered);
    }
}

} // namespace
