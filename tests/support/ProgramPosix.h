#pragma once

#include "CommandLine.h"

#include <QFile>

#include <csignal>
#include <functional>

/// Runs the program in a folder, with what a caller in the system's own terms prepares in the new process.
inline ProgramRun runPrepared(const QString &folder, const char *line, const std::function<void()> &prepare)
{
    QProcess process;
    process.setWorkingDirectory(folder);
    process.setChildProcessModifier(prepare);
    process.start(QStringLiteral(KAREPORT_PROGRAM), words(line), QIODevice::ReadOnly);
    return endOf(process);
}
