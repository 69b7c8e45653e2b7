#pragma once

#include "Steps.h"

#include <QFile>
#include <QString>
#include <QTextStream>

namespace monkey
{

/// What came of a sequence of steps.
struct Outcome
{
    bool isViolated = false;
    std::size_t step = 0; ///< the last that was done, from 1
    QString what;         ///< is wrong
    QString done;         ///< the last steps in words
};

/// Runs sequences in programs of their own, so that one that dies is a finding like others.
class Supervisor
{
public:
    /// @param log  receives what is found; empty for none
    Supervisor(QString program, const QString &log);

    Outcome run(const Steps &steps);
    /// The shortest sequence that is found to end in the same way, within so many tries.
    Steps shorten(const Steps &steps, const Outcome &outcome);
    void say(const QString &line);

private:
    QString program_;
    QFile log_;
};

} // namespace monkey
