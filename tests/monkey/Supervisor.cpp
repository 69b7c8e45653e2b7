#include "Supervisor.h"

#include "WorkerExit.h"

#include <QDir>
#include <QProcess>
#include <QProcessEnvironment>
#include <QRegularExpression>
#include <QTemporaryDir>

#include <algorithm>
#include <iostream>

namespace monkey
{

namespace
{

constexpr int mostTries = 60;
constexpr int longestStep = 60'000; // milliseconds, under sanitizers on a busy machine

QString readAll(const QString &path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

QProcessEnvironment environmentIn(const QString &home)
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("HOME"), home);
    for (const char *name : {"XDG_CONFIG_HOME", "XDG_DATA_HOME", "XDG_CACHE_HOME", "XDG_STATE_HOME"}) {
        environment.insert(QLatin1String(name), home + u'/' + QLatin1String(name));
    }
    environment.insert(QStringLiteral("QT_QPA_PLATFORM"), QStringLiteral("offscreen"));
    environment.insert(QStringLiteral("LC_ALL"), QStringLiteral("C.UTF-8"));
    environment.insert(QStringLiteral("CUPS_SERVER"), home + QStringLiteral("/no-cups.sock"));
    return environment;
}

/// What went wrong, without what differs from run to run: numbers and names.
QString kindOf(const QString &what)
{
    QString kind;
    bool isQuoted = false;
    for (const QChar character : what) {
        if (character == u'"') {
            isQuoted = !isQuoted;
        } else if (!isQuoted && !character.isDigit()) {
            kind += character;
        }
    }
    return kind.section(u'\n', 0, 0);
}

} // namespace

Supervisor::Supervisor(QString program, const QString &log) : program_(std::move(program)), log_(log)
{
    if (!log.isEmpty()) {
        log_.open(QIODevice::WriteOnly | QIODevice::Append | QIODevice::Text);
    }
}

void Supervisor::say(const QString &line)
{
    std::cout << line.toStdString() << std::endl;
    if (log_.isOpen()) {
        log_.write(line.toUtf8() + '\n');
        log_.flush();
    }
}

Outcome Supervisor::run(const Steps &steps)
{
    const QTemporaryDir folder;
    QDir(folder.path()).mkpath(QStringLiteral("home"));
    writeSteps(folder.filePath(stepsName), steps);
    Outcome outcome;
    QString from = QStringLiteral("0");
    while (true) {
        QProcess worker;
        worker.setProcessEnvironment(environmentIn(folder.filePath(QStringLiteral("home"))));
        worker.setProcessChannelMode(QProcess::MergedChannels);
        worker.start(program_, {QStringLiteral("--worker"), folder.path(), QStringLiteral("--from"), from});
        QString said;
        QString reached;
        bool isStuck = false;
        while (worker.state() != QProcess::NotRunning && !worker.waitForFinished(longestStep)) {
            const QString now = readAll(folder.filePath(doneName));
            isStuck = now == reached;
            reached = now;
            if (isStuck) {
                worker.kill();
            }
        }
        said = QString::fromUtf8(worker.readAll());
        said.remove(QRegularExpression(QStringLiteral("This plugin does not support [^\n]*\n")));
        const QString done = readAll(folder.filePath(doneName));
        const QStringList lines = done.split(u'\n', Qt::SkipEmptyParts);
        outcome.step = static_cast<std::size_t>(lines.size());
        outcome.done = lines.mid(std::max<qsizetype>(0, lines.size() - 40)).join(u'\n');
        const bool hasEnded = worker.error() != QProcess::FailedToStart;
        if (hasEnded && worker.exitStatus() == QProcess::NormalExit && worker.exitCode() == workerIsDone) {
            return outcome;
        }
        if (!isStuck && worker.exitStatus() == QProcess::CrashExit && isDeathAtOnce(worker.exitCode()) &&
            lines.value(lines.size() - 1).startsWith(u"crash "))
        {
            from = QString::number(outcome.step); // as it was asked to
            continue;
        }
        outcome.isViolated = true;
        const QString violation = readAll(folder.filePath(violationName));
        outcome.what = !hasEnded ? QStringLiteral("the program cannot be started")
                       : isStuck ? QStringLiteral("the program hangs")
                       : !violation.isEmpty()
                           ? violation
                           : QStringLiteral("the program died (%1)\n%2").arg(worker.exitCode()).arg(said.right(6000));
        return outcome;
    }
}

Steps Supervisor::shorten(const Steps &steps, const Outcome &outcome)
{
    Steps shortest(steps.begin(), steps.begin() + static_cast<std::ptrdiff_t>(std::min(outcome.step, steps.size())));
    const QString kind = kindOf(outcome.what);
    int tries = 0;
    for (std::size_t piece = std::max<std::size_t>(shortest.size() / 2, 1); tries < mostTries; piece /= 2) {
        for (std::size_t at = 0; at < shortest.size() && tries < mostTries;) {
            Steps shorter = shortest;
            const auto first = shorter.begin() + static_cast<std::ptrdiff_t>(at);
            shorter.erase(first, first + static_cast<std::ptrdiff_t>(std::min(piece, shorter.size() - at)));
            ++tries;
            const Outcome now = run(shorter);
            if (now.isViolated && kindOf(now.what) == kind) {
                shortest.assign(shorter.begin(),
                                shorter.begin() + static_cast<std::ptrdiff_t>(std::min(now.step, shorter.size())));
            } else {
                at += piece;
            }
        }
        if (piece <= 1) {
            break;
        }
    }
    return shortest;
}

} // namespace monkey
