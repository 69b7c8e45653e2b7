#include "CommandLine.h"
#include "TestSize.h"

#include <QDateTime>
#include <QFileInfo>
#include <QHash>
#include <QStandardPaths>

#include <algorithm>
#include <csignal>
#include <sys/types.h>
#include <unistd.h>

#include <gtest/gtest.h>

#include <vector>

// A batch that several processes share, as a distributor starts them, and what is left when they are killed.

namespace
{

constexpr int jobs = 48;

QByteArray nameOf(int job)
{
    return QByteArray::number(1000 + job);
}

/// Jobs that make reports of some 200 or 400 KB each, so that some are being written at any moment.
class SharedBatch : public CommandLineFolder
{
public:
    SharedBatch()
    {
        QByteArray csv = "Number,Northing\n";
        for (int i = 0; i < testSize(10'000, 20'000); ++i) {
            csv += QByteArray::number(i) + ',' + QByteArray::number(i * 0.125) + '\n';
        }
        put("points.csv", csv);
        QByteArray list;
        for (int job = 0; job < jobs; ++job) {
            const QByteArray name = nameOf(job);
            // Half of them have two outputs, which are written when the report is there, the others one.
            const QByteArray outputs = '"' + name + ".rep\"" + (job % 2 == 0 ? ", \"" + name + ".txt\"" : QByteArray());
            put(name + ".json", "{\"header\": false, \"page\": {\"linesPerPage\": 72, \"charsPerRow\": 80},\n"
                                " \"template\": {\"file\": \"t.xml\", \"name\": \"CONTROL\"},\n"
                                " \"data\": {\"p\": {\"csv\": \"points.csv\"}},\n"
                                " \"report\": [{\"line\": \"Job " +
                                    name + "\"}, {\"table\": \"Points\", \"data\": \"p\"}], \"output\": [" + outputs +
                                    "]}");
            list += name + ".json\n";
        }
        put("jobs.txt", list);
        // Older than anything that is written from now on.
        for (const QString &name : names()) {
            QFile file(path(qPrintable(name)));
            EXPECT_TRUE(file.open(QIODevice::ReadWrite) &&
                        file.setFileTime(QDateTime::fromSecsSinceEpoch(1'700'000'000), QFile::FileModificationTime));
        }
        sources_ = names();
    }

    QStringList outputs() const
    {
        QStringList all;
        for (int job = 0; job < jobs; ++job) {
            all.append(QString::fromUtf8(nameOf(job) + ".rep"));
            if (job % 2 == 0) {
                all.append(QString::fromUtf8(nameOf(job) + ".txt"));
            }
        }
        return all;
    }
    const QStringList &sources() const { return sources_; }

    using CommandLineFolder::put;
    void put(const QByteArray &name, const QByteArray &content) const { put(name.constData(), content); }

private:
    QStringList sources_;
};

/// The reports of the batch, made in one process that is not disturbed.
const QHash<QString, QByteArray> &wholeReports()
{
    static const QHash<QString, QByteArray> whole = [] {
        const SharedBatch batch;
        const ProgramRun run = batch.run("render --quiet --jobs jobs.txt");
        EXPECT_EQ(run.status, 0) << run.all().constData();
        QHash<QString, QByteArray> reports;
        for (const QString &name : batch.outputs()) {
            reports.insert(name, batch.bytesOf(qPrintable(name)));
        }
        return reports;
    }();
    return whole;
}

/// Starts a command in a process group of its own, which can be killed as a whole.
void startGroup(QProcess &process, const QString &folder, const QString &program, const QStringList &arguments)
{
    process.setWorkingDirectory(folder);
    process.setChildProcessModifier([] {
        setpgid(0, 0);
        std::signal(SIGINT, SIG_DFL); // a background job has it switched off
    });
    process.start(program, arguments, QIODevice::ReadOnly);
    ASSERT_TRUE(process.waitForStarted(30'000));
}

/// Every output that is there must be whole. @return how many there are
int expectWholeOutputs(const SharedBatch &batch, const QHash<QString, QByteArray> &whole)
{
    int found = 0;
    for (const QString &name : batch.outputs()) {
        if (QFileInfo::exists(batch.path(qPrintable(name)))) {
            ++found;
            EXPECT_TRUE(batch.bytesOf(qPrintable(name)) == whole.value(name)) << qPrintable(name) << " is not whole";
        }
    }
    return found;
}

struct Distributor
{
    const char *name;
    QString program;
    QStringList arguments;
};

std::vector<Distributor> distributors()
{
    const QString program = QStringLiteral(KAREPORT_PROGRAM);
    // A Slurm array starts its script once for each task, with the task's number in the environment. Three of them at a time
    // stand for three machines.
    const QString array = QStringLiteral("export PATH=\"%1:$PATH\" SLURM_ARRAY_TASK_COUNT=6\n"
                                         "for task in 1 2 3 4 5 6; do\n"
                                         "  SLURM_ARRAY_TASK_ID=$task \"%2/batch/render.sbatch\" jobs.txt &\n"
                                         "  [ $((task % 3)) -ne 0 ] || wait\n"
                                         "done\n"
                                         "wait")
                              .arg(QFileInfo(program).path(), QStringLiteral(KAREPORT_EXAMPLES_DIR));
    return {
        {"GNU parallel with slices", QStringLiteral("parallel"),
         QStringList{QStringLiteral("--will-cite"), QStringLiteral("-j3"), program} +
             words("render --jobs jobs.txt --slice {}/8 --update ::: 1 2 3 4 5 6 7 8")},
        {"GNU parallel with names", QStringLiteral("parallel"),
         QStringList{QStringLiteral("--will-cite"), QStringLiteral("-j3"), QStringLiteral("-n5"), QStringLiteral("-a"),
                     QStringLiteral("jobs.txt"), program} +
             words("render --update")},
        {"a Slurm array", QStringLiteral("bash"), {QStringLiteral("-c"), array}},
    };
}

TEST(CommandLineBatch, ADistributorSpreadsIt)
{
    if (QStandardPaths::findExecutable(QStringLiteral("parallel")).isEmpty()) {
        GTEST_SKIP() << "GNU parallel is not installed";
    }
    const QHash<QString, QByteArray> &whole = wholeReports();
    for (const Distributor &distributor : distributors()) {
        const SharedBatch batch;
        QProcess process;
        startGroup(process, batch.path(), distributor.program, distributor.arguments);
        ASSERT_TRUE(process.waitForFinished(110'000)) << distributor.name;
        EXPECT_EQ(process.exitCode(), 0) << distributor.name << process.readAllStandardError().constData();
        EXPECT_EQ(expectWholeOutputs(batch, whole), whole.size()) << distributor.name;
    }
}

/// How many of the outputs of a batch are there.
int madeOutputs(const SharedBatch &batch)
{
    const QStringList outputs = batch.outputs();
    return static_cast<int>(std::count_if(outputs.begin(), outputs.end(), [&batch](const QString &name) {
        return QFileInfo::exists(batch.path(qPrintable(name)));
    }));
}

/// Runs a batch and kills it, without a warning, as soon as so many outputs are there.
void killAfter(const SharedBatch &batch, const Distributor &distributor, int target)
{
    QProcess process;
    startGroup(process, batch.path(), distributor.program, distributor.arguments);
    for (int turn = 0; turn < 6000 && process.state() == QProcess::Running && madeOutputs(batch) < target; ++turn) {
        process.waitForFinished(2);
    }
    if (process.processId() > 0) {
        kill(-static_cast<pid_t>(process.processId()), SIGKILL);
    }
    ASSERT_TRUE(process.waitForFinished(30'000)) << distributor.name;
}

/// The outputs that are there, with their times.
QHash<QString, QDateTime> timesOfOutputs(const SharedBatch &batch)
{
    QHash<QString, QDateTime> times;
    for (const QString &name : batch.outputs()) {
        const QFileInfo info(batch.path(qPrintable(name)));
        if (info.exists()) {
            times.insert(name, info.lastModified());
        }
    }
    return times;
}

TEST(CommandLineBatch, KilledAndRunAgainItIsWhole)
{
    if (QStandardPaths::findExecutable(QStringLiteral("parallel")).isEmpty()) {
        GTEST_SKIP() << "GNU parallel is not installed";
    }
    const QHash<QString, QByteArray> &whole = wholeReports();
    for (const Distributor &distributor : distributors()) {
        const SharedBatch batch;
        int before = 0;
        // Killed again and again, at moments that come as they come.
        for (int round = 0; round < 6 && before < whole.size(); ++round) {
            killAfter(batch, distributor, std::min<int>(before + 5, static_cast<int>(whole.size())));
            const int now = expectWholeOutputs(batch, whole);
            EXPECT_GE(now, before) << distributor.name;
            before = now;
        }
        // What is there already is not made again, and what is missing is.
        const QHash<QString, QDateTime> made = timesOfOutputs(batch);
        QProcess process;
        startGroup(process, batch.path(), distributor.program, distributor.arguments);
        ASSERT_TRUE(process.waitForFinished(110'000)) << distributor.name;
        EXPECT_EQ(process.exitCode(), 0) << distributor.name << process.readAllStandardError().constData();
        EXPECT_EQ(expectWholeOutputs(batch, whole), whole.size()) << distributor.name;
        for (auto file = made.constBegin(); file != made.constEnd(); ++file) {
            // A job with two outputs of which one was missing is made as a whole.
            const bool isAlone = QFileInfo(file.key()).completeBaseName().toInt() % 2 == 1;
            if (isAlone) {
                EXPECT_EQ(QFileInfo(batch.path(qPrintable(file.key()))).lastModified(), file.value())
                    << distributor.name << ": " << qPrintable(file.key()) << " was made twice";
            }
        }
        // A whole file that was about to take the place of an older one may be left with a name of its own: that moment is
        // a few microseconds long.
        for (const QString &name : batch.names()) {
            EXPECT_TRUE(batch.sources().contains(name) || batch.outputs().contains(name) ||
                        batch.outputs().contains(QFileInfo(name).completeBaseName()))
                << distributor.name << ": " << qPrintable(name) << " is left";
        }
    }
}

TEST(CommandLineBatch, StoppedItTellsWhatIsLeft)
{
    const SharedBatch batch;
    const QHash<QString, QByteArray> &whole = wholeReports();
    QProcess process;
    startGroup(process, batch.path(), QStringLiteral(KAREPORT_PROGRAM), words("render --jobs jobs.txt"));
    while (!QFileInfo::exists(batch.path((nameOf(3) + ".rep").constData())) && process.state() == QProcess::Running) {
        process.waitForFinished(1);
    }
    ASSERT_GT(process.processId(), 0);
    kill(static_cast<pid_t>(process.processId()), SIGINT);
    const ProgramRun run = endOf(process);
    EXPECT_EQ(run.signal, SIGINT);
    const QByteArray err = run.err;
    EXPECT_TRUE(err.contains(" of 48 jobs made, ") && err.contains(" not made when stopped")) << err.constData();
    const int found = expectWholeOutputs(batch, whole);
    EXPECT_GE(found, 4);
    EXPECT_LT(found, whole.size()) << "it ended before its end";
}

} // namespace
