#include "CommandLine.h"

#include "CharacterCells.h"
#include "TerminalProgress.h"

#include <csignal>
#include <cstdlib>
#include <fcntl.h>
#include <sys/ioctl.h>
#include <unistd.h>

#include <gtest/gtest.h>

namespace
{

using kareport::progressLine;

TEST(CommandLineProgress, ALineFitsIntoItsTerminal)
{
    struct Row
    {
        const char *what;
        int percent;
        int columns;
        const char *line;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"Reading points.csv", 42, 0, "Reading points.csv 42 %", "no terminal"},
        {"Reading points.csv", -1, 0, "Reading points.csv", "how much it is, is not known"},
        {"", 100, 0, "100 %", "nothing else to say"},
        {"Reading points.csv", 42, 24, "Reading points.csv 42 %", "it just fits: a line of all columns would wrap"},
        {"Reading points.csv", 42, 23, "Readi… points.csv 42 %", "the middle is left out"},
        {"Reading 測量測量.csv", 7, 18, "Read…測量.csv 7 %", "wide characters take two columns"},
        {"Reading points.csv", 42, 6, " 42 %", "no room for more"},
        {"Reading points.csv", 42, 1, " 42 %", "nor for this"},
    };
    for (const Row &row : rows) {
        const QString line = progressLine(QString::fromUtf8(row.what), row.percent, row.columns);
        EXPECT_EQ(line, QString::fromUtf8(row.line)) << row.reason;
        if (row.columns > 6) {
            EXPECT_LT(kareport::cellsOf(line), row.columns) << row.reason;
        }
    }
}

/// The lines that were written over each other on standard error.
QList<QByteArray> shownIn(const QByteArray &err)
{
    QList<QByteArray> shown;
    for (const QByteArray &piece : err.split('\r')) {
        if (!piece.trimmed().isEmpty()) {
            shown.append(piece);
        }
    }
    return shown;
}

TEST(CommandLineProgress, ItEndsAtAllOfItOnce)
{
    struct Row
    {
        const char *line;
        int status;
        const char *last; ///< empty when the line is removed
        const char *reason;
    };
    constexpr Row rows[] = {
        {"render job.json -o a.txt", 0, "100 %\n", "written while it is made"},
        {"render job.json -o a.txt -o a.rep -o a.pdf", 0, "100 %\n", "several pieces of work"},
        {"render job.json", 0, "100 %\n", "standard output"},
        {"render job.json -o old.txt --update", 0, "100 %\nkareport: all is up to date; nothing was written\n",
         "nothing to do"},
        {"render job.json job2.json -o {}.txt", 0, "2/2 100 %\nkareport: 2 of 2 jobs made\n", "several jobs"},
        {"render --jobs none.txt", 0, "100 %\nkareport: there was no job to run\n", "no job"},
        {"render job.json wrong.json -o {}.txt", 2, "2/2 100 %\nkareport: 1 of 2 jobs made, 1 failed\n",
         "what failed is at its end as well"},
        {"render wrong.json -o a.txt", 2, "", "wrong data"},
        {"render job.json -o none/a.pdf", 3, "", "an output that cannot be written"},
        {"check job.json t.xml", 0, "100 %\n", "a check"},
        {"convert saved.rep a.pdf", 0, "100 %\n", "a converted report"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        folder.put("none.txt", "");
        folder.put("saved.rep", jobReport());
        folder.put("job2.json", folder.bytesOf("job.json"));
        folder.put("wrong.json", folder.bytesOf("job.json").replace("points.csv", "wrong.csv"));
        folder.put("wrong.csv", "Number,Northing\n1,x\n");
        if (QByteArray(row.line).contains("--update")) {
            ASSERT_EQ(folder.run("render job.json -o old.txt").status, 0);
        }
        const ProgramRun run = folder.run(words(row.line) << QStringLiteral("--progress"));
        EXPECT_EQ(run.status, row.status) << row.reason << run.all().constData();
        EXPECT_EQ(run.err.count("100 %"), *row.last != 0 ? 1 : 0) << row.reason << run.all().constData();
        const auto shown = shownIn(run.err);
        if (*row.last != 0) {
            // Blanks take the place of the rest of a longer line.
            QByteArray last = shown.isEmpty() ? QByteArray() : shown.last();
            last.replace(last.indexOf('%') + 1, last.indexOf('\n') - last.indexOf('%') - 1, QByteArray());
            EXPECT_EQ(last.toStdString(), row.last) << row.reason << run.err.toPercentEncoding(" %\n").constData();
        }
        int furthest = 0;
        for (const QByteArray &line : shown) {
            const qsizetype sign = line.indexOf(" %");
            if (sign > 0) {
                const int percent = line.left(sign).split(' ').last().toInt();
                EXPECT_GE(percent, furthest) << row.reason << ": it goes on, from piece to piece\n"
                                             << run.err.constData();
                furthest = percent;
            }
        }
    }
}

/// What a program writes to a terminal of some columns that standard error is.
QByteArray onTerminal(const QString &folder, const QStringList &arguments, unsigned short columns)
{
    const int master = posix_openpt(O_RDWR | O_NOCTTY | O_CLOEXEC);
    EXPECT_GE(master, 0);
    EXPECT_EQ(grantpt(master), 0);
    EXPECT_EQ(unlockpt(master), 0);
    const int slave = open(ptsname(master), O_RDWR | O_NOCTTY);
    const winsize size = {24, columns, 0, 0};
    EXPECT_EQ(ioctl(slave, TIOCSWINSZ, &size), 0);
    QProcess process;
    process.setWorkingDirectory(folder);
    process.setChildProcessModifier([slave] { dup2(slave, STDERR_FILENO); });
    process.start(QStringLiteral(KAREPORT_PROGRAM), arguments, QIODevice::ReadOnly);
    EXPECT_TRUE(process.waitForStarted());
    close(slave);
    QByteArray all;
    char buffer[4096];
    // It ends with an error when the program's end is closed.
    for (ssize_t count = 0; (count = read(master, buffer, sizeof buffer)) > 0;) {
        all.append(buffer, count);
    }
    close(master);
    process.waitForFinished();
    return all;
}

TEST(CommandLineProgress, OnANarrowTerminalItIsOneLine)
{
    const CommandLineFolder folder;
    QByteArray csv = "Number,Northing\n";
    for (int i = 0; i < 200'000; ++i) {
        csv += "1,2.5\n";
    }
    folder.put("points-with-a-name-that-is-longer-than-the-terminal-is-wide.csv", csv);
    folder.put("job.json",
               folder.bytesOf("job.json")
                   .replace("points.csv", "points-with-a-name-that-is-longer-than-the-terminal-is-wide.csv"));
    const QByteArray all = onTerminal(
        folder.path(), words("render job.json -o an-output-with-a-name-that-is-long-as-well.rep --progress"), 30);
    EXPECT_EQ(all.count('\n'), 1) << all.constData();
    EXPECT_TRUE(all.trimmed().endsWith("100 %")) << all.constData();
    EXPECT_TRUE(all.contains("…") && all.contains("wide.csv")) << all.constData();
    for (const QByteArray &line : shownIn(all)) {
        EXPECT_LT(kareport::cellsOf(QString::fromUtf8(line).remove(u'\n')), 30) << line.constData();
    }
}

} // namespace
