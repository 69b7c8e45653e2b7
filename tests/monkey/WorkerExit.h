#pragma once

#include <QString>

namespace monkey
{

/// How a worker says what came of its steps: by its status, and by files in its folder. None of these is what a program
/// that could not be started, or was ended from outside, ends with.
constexpr int workerIsDone = 11;
constexpr int workerHasFound = 10;
inline const QString stepsName = QStringLiteral("steps");
inline const QString doneName = QStringLiteral("done");
inline const QString violationName = QStringLiteral("violation");

/// Whether a worker that did not end by itself died as the step "crash" lets it: any other signal is a finding.
bool isDeathAtOnce(int exitCode);

} // namespace monkey
