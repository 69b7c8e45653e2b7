// Drives the desk as a user does, at random, and checks after each step that nothing of the user's work is lost and that
// windows, reports and files agree.

#include "Steps.h"
#include "Supervisor.h"
#include "WorkerExit.h"
#include "World.h"

#include <QApplication>
#include <QCommandLineParser>
#include <QElapsedTimer>
#include <QFile>

#include <algorithm>
#include <iostream>
#include <numeric>

namespace
{

using namespace monkey;

/// What the driver itself writes does not fail.
void writeWithoutLimit(QFile &file, const QByteArray &text)
{
    const qint64 limit = fileLimit();
    limitFiles(-1);
    file.write(text);
    file.flush();
    limitFiles(limit);
}

int work(const QString &folder, std::size_t from)
{
    const QDir dir(folder);
    const Steps steps = readSteps(dir.filePath(stepsName));
    QFile done(dir.filePath(doneName));
    done.open(QIODevice::WriteOnly | QIODevice::Append | QIODevice::Text);
    const auto found = [&dir](const QString &what) {
        QFile violation(dir.filePath(violationName));
        violation.open(QIODevice::WriteOnly);
        violation.write(what.toUtf8());
        violation.close();
        endEditors(dir);
        return workerHasFound;
    };
    World world(folder);
    if (const QString wrong = world.checkRecovered(); !wrong.isEmpty()) {
        return found(wrong);
    }
    for (std::size_t i = from; i < steps.size(); ++i) {
        world.note();
        // Written before the step, in which the program may die.
        writeWithoutLimit(done, QStringLiteral("\n%1 %2").arg(steps[i].action).arg(steps[i].seed).toUtf8());
        world.run(steps[i]);
        writeWithoutLimit(done, ' ' + world.did.toUtf8().replace('\n', ' ').left(80));
        if (const QString wrong = world.check(); !wrong.isEmpty()) {
            limitFiles(-1);
            return found(wrong);
        }
    }
    limitFiles(-1);
    endEditors(dir);
    std::cout.flush();
    std::_Exit(workerIsDone); // reports with changes are not asked for
}

int drive(Supervisor &supervisor, const Steps &steps, const QString &named)
{
    const Outcome outcome = supervisor.run(steps);
    if (!outcome.isViolated) {
        supervisor.say(named + QStringLiteral(": %1 steps, all is well").arg(steps.size()));
        return 0;
    }
    supervisor.say(named + QStringLiteral(", step %1: %2\n%3").arg(outcome.step).arg(outcome.what, outcome.done));
    const Steps shortest = supervisor.shorten(steps, outcome);
    const Outcome again = supervisor.run(shortest);
    supervisor.say(QStringLiteral("In %1 steps%2:")
                       .arg(shortest.size())
                       .arg(again.isViolated ? QString() : QStringLiteral(" (not every time)")));
    for (const Step &step : shortest) {
        supervisor.say(QStringLiteral("%1 %2").arg(step.action).arg(step.seed));
    }
    supervisor.say(again.what + u'\n' + again.done);
    return 1;
}

/// What the command line asks for.
struct Options
{
    const QCommandLineOption seed{QStringLiteral("seed"), QStringLiteral("The first seed."), QStringLiteral("N"),
                                  QStringLiteral("1")};
    const QCommandLineOption steps{QStringLiteral("steps"), QStringLiteral("Steps of a sequence."), QStringLiteral("N"),
                                   QStringLiteral("300")};
    const QCommandLineOption seconds{QStringLiteral("seconds"),
                                     QStringLiteral("Goes on with the next seeds for so long."), QStringLiteral("N"),
                                     QStringLiteral("0")};
    const QCommandLineOption runs{QStringLiteral("runs"), QStringLiteral("Goes on with the next seeds, so many."),
                                  QStringLiteral("N"), QStringLiteral("1")};
    const QCommandLineOption faults{QStringLiteral("faults"),
                                    QStringLiteral("Lets files, printers and editors fail as well.")};
    const QCommandLineOption log{QStringLiteral("log"), QStringLiteral("Also writes what is found to a file."),
                                 QStringLiteral("FILE")};
    const QCommandLineOption replay{QStringLiteral("replay"),
                                    QStringLiteral("Does the steps of a file, or of each of several."),
                                    QStringLiteral("FILE")};
    QCommandLineOption worker{QStringLiteral("worker"), QString(), QStringLiteral("DIR")};
    QCommandLineOption from{QStringLiteral("from"), QString(), QStringLiteral("N")};
    QCommandLineParser parser;

    explicit Options(const QCoreApplication &application)
    {
        worker.setFlags(QCommandLineOption::HiddenFromHelp);
        from.setFlags(QCommandLineOption::HiddenFromHelp);
        parser.setApplicationDescription(QStringLiteral(
            "Drives the desk at random and checks after each step that nothing is lost. Exit status: 0 all is "
            "well, 1 a violation was found, 2 the command line is wrong."));
        parser.addHelpOption();
        parser.addOptions({seed, steps, runs, seconds, faults, log, replay, worker, from});
        parser.process(application);
    }
};

int replay(Supervisor &supervisor, const QStringList &files)
{
    return std::accumulate(files.begin(), files.end(), 0, [&supervisor](int status, const QString &file) {
        return std::max(status, drive(supervisor, readSteps(file), file));
    });
}

/// Drives sequences of several seeds, one after the other.
int search(Supervisor &supervisor, const Options &options)
{
    bool isSeed = false;
    bool isCount = false;
    bool isRuns = false;
    bool isSeconds = false;
    quint64 seed = options.parser.value(options.seed).toULongLong(&isSeed);
    const int count = options.parser.value(options.steps).toInt(&isCount);
    const int runs = options.parser.value(options.runs).toInt(&isRuns);
    const qint64 milliseconds = options.parser.value(options.seconds).toLongLong(&isSeconds) * 1000;
    if (!isSeed || !isCount || !isRuns || !isSeconds || count < 1) {
        std::cerr
            << "kareport-monkey: --seed, --steps, --runs and --seconds are followed by numbers, as in --seed 7 --steps 300\n";
        return 2;
    }
    QElapsedTimer time;
    time.start();
    int violations = 0;
    int done = 0;
    do {
        violations += drive(supervisor, makeSteps(seed, count, options.parser.isSet(options.faults)),
                            QStringLiteral("seed %1").arg(seed));
        ++seed;
    } while (++done < runs || time.elapsed() < milliseconds);
    return violations > 0 ? 1 : 0;
}

} // namespace

int main(int argc, char **argv)
{
    const bool isWorker = argc > 1 && QByteArray(argv[1]) == "--worker";
    std::unique_ptr<QCoreApplication> application;
    if (isWorker) {
        application = std::make_unique<QApplication>(argc, argv);
        QApplication::setQuitOnLastWindowClosed(false);
    } else {
        application = std::make_unique<QCoreApplication>(argc, argv);
    }
    QCoreApplication::setApplicationName(QStringLiteral("kareport-monkey"));
    const Options options(*application);
    if (isWorker) {
        return work(options.parser.value(options.worker), options.parser.value(options.from).toULongLong());
    }
    Supervisor supervisor(QCoreApplication::applicationFilePath(), options.parser.value(options.log));
    return options.parser.isSet(options.replay) ? replay(supervisor, options.parser.values(options.replay))
                                                : search(supervisor, options);
}
