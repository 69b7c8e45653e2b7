#pragma once

#include "JobFolder.h"

#include <QElapsedTimer>
#include <QProcess>
#include <QProcessEnvironment>

#include <gtest/gtest.h>

#include <utility>

/// What the program did.
struct ProgramRun
{
    int status = -1; ///< the exit status; -1 when a signal ended the program, or it did not end
    int signal = 0;  ///< that ended it
    QByteArray out;
    QByteArray err;

    QByteArray all() const { return "status " + QByteArray::number(status) + "\nout: " + out + "\nerr: " + err; }
};

/// What a program that was started did, when it has ended.
ProgramRun endOf(QProcess &process);

/// Runs the program in a folder.
ProgramRun runProgram(const QString &folder, const QStringList &arguments,
                      const std::initializer_list<std::pair<const char *, const char *>> &variables = {});

/// The same with bytes on standard input.
ProgramRun runWithInput(const QString &folder, const QStringList &arguments, const QByteArray &input);

/// The words of a command line.
QStringList words(const char *line);

/// The template file of the command line's tests: the templates CONTROL and SITE.
QByteArray controlTemplates();

/// A folder with the template file t.xml, the data points.csv and the job job.json, which writes its report to standard
/// output.
class CommandLineFolder : public JobFolder
{
public:
    CommandLineFolder();

    ProgramRun run(const QStringList &arguments) const { return runProgram(path(), arguments); }
    ProgramRun run(const char *line) const { return runProgram(path(), words(line)); }
};

/// The report of that job, as text and as a report file.
QByteArray jobText();

QByteArray jobReport();
