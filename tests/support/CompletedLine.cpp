#include "CompletedLine.h"

#include <QDir>
#include <QFileInfo>

CompletionFolder::CompletionFolder()
{
    for (const char *shell : {"bash", "zsh", "fish"}) {
        put((QByteArray("_kareport.") + shell).constData(), completionScript(shell));
    }
    put("My job.json", bytesOf("job.json"));
    QDir(path()).mkdir(QStringLiteral("sub"));
}

ProgramRun CompletionFolder::runShell(const QString &shell, const QStringList &arguments) const
{
    QProcess process;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    const QString programs = QFileInfo(QStringLiteral(KAREPORT_PROGRAM)).path();
    environment.insert(QStringLiteral("PATH"), programs + u':' + environment.value(QStringLiteral("PATH")));
    environment.insert(QStringLiteral("HOME"), path());
    environment.insert(QStringLiteral("LC_ALL"), QStringLiteral("C.UTF-8"));
    process.setProcessEnvironment(environment);
    process.setWorkingDirectory(path());
    process.start(shell, arguments, QIODevice::ReadOnly);
    return endOf(process);
}

QByteArray completionScript(const char *shell)
{
    const ProgramRun run = runProgram(QDir::tempPath(), {QStringLiteral("completion"), QString::fromLatin1(shell)});
    EXPECT_EQ(run.status, 0) << run.all().constData();
    return run.out;
}
