#pragma once

#include "CommandLine.h"

#include <QStringList>

/// A folder in which command lines are completed by shells. `kareport` is found by its name there.
class CompletionFolder : public CommandLineFolder
{
public:
    CompletionFolder();

    /// Runs a shell in the folder. @return what it printed
    ProgramRun runShell(const QString &shell, const QStringList &arguments) const;
};

/// What `kareport completion` prints for a shell.
QByteArray completionScript(const char *shell);
