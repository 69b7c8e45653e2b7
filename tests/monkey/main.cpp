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
    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral(
        "Drives the desk at random and checks after each step that nothing is lost. Exit status: 0 all is well, 1 a violation "
        "was found, 2 the command line is wrong."));
    parser.addHelpOption();
    const QCommandLineOption seedOption(QStringLiteral("seed"), QStringLiteral("The first seed."), QStringLiteral("N"),
                                        QStringLiteral("1"));
    const QCommandLineOption stepsOption(QStringLiteral("steps"), QStringLiteral("Steps of a sequence."),
                                         QStringLiteral("N"), QStringLiteral("300"));
    const QCommandLineOption secondsOption(QStringLiteral("seconds"),
                                           QStringLiteral("Goes on with the next seeds for so long."),
                                           QStringLiteral("N"), QStringLiteral("0"));
    const QCommandLineOption runsOption(QStringLiteral("runs"), QStringLiteral("Goes on with the next seeds, so many."),
                                        QStringLiteral("N"), QStringLiteral("1"));
    const QCommandLineOption faultsOption(QStringLiteral("faults"),
                                          QStringLiteral("Lets files, printers and editors fail as well."));
    const QCommandLineOption logOption(QStringLiteral("log"), QStringLiteral("Also writes what is found to a file."),
                                       QStringLiteral("FILE"));
    const QCommandLineOption replayOption(QStringLiteral("replay"),
                                          QStringLiteral("Does the steps of a file, or of each of several."),
                                          QStringLiteral("FILE"));
    QCommandLineOption workerOption(QStringLiteral("worker"), QString(), QStringLiteral("DIR"));
    QCommandLineOption fromOption(QStringLiteral("from"), QString(), QStringLiteral("N"));
    workerOption.setFlags(QCommandLineOption::HiddenFromHelp);
    fromOption.setFlags(QCommandLineOption::HiddenFromHelp);
    parser.addOptions({seedOption, stepsOption, runsOption, secondsOption, faultsOption, logOption, replayOption,
                       workerOption, fromOption});
    parser.process(*application);
    if (isWorker) {
        return work(parser.value(workerOption), parser.value(fromOption).toULongLong());
    }
    Supervisor supervisor(QCoreApplication::applicationFilePath(), parser.value(logOption));
    if (parser.isSet(replayOption)) {
        const QStringList files = parser.values(replayOption);
        return std::accumulate(files.begin(), files.end(), 0, [&supervisor](int status, const QString &file) {
            return std::max(status, drive(supervisor, readSteps(file), file));
        });
    }
    bool isSeed = false;
    bool isCount = false;
    bool isRuns = false;
    bool isSeconds = false;
    quint64 seed = parser.value(seedOption).toULongLong(&isSeed);
    const int count = parser.value(stepsOption).toInt(&isCount);
    const int runs = parser.value(runsOption).toInt(&isRuns);
    const qint64 milliseconds = parser.value(secondsOption).toLongLong(&isSeconds) * 1000;
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
        violations +=
            drive(supervisor, makeSteps(seed, count, parser.isSet(faultsOption)), QStringLiteral("seed %1").arg(seed));
        ++seed;
    } while (++done < runs || time.elapsed() < milliseconds);
    return violations > 0 ? 1 : 0;
}
