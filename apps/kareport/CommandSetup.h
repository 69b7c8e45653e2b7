#pragma once

#include "Commands.h"
#include "JsonSource.h"

#include <QCoreApplication>

#include <memory>
#include <optional>

namespace kareport
{

/// What the commands that make reports have in common. Functions that answer a text say what is wrong with the command
/// line; nothing when it is right.

std::optional<QString> wrongKindName(const QString &as);
std::optional<QString> wrongOutput(const QString &file, const QString &as);
/// Sets the keys that were given on the command line.
std::optional<QString> applySets(JsonSource &source, const QStringList &sets);

/// Says what is wrong with the command line.
ExitStatus usageExit(const QString &text);

/// Starts Qt without a screen and catches interrupts. @param withFonts  whether fonts are needed: most jobs need none
/// @return null, with nothing done, where the process has an application already
std::unique_ptr<QCoreApplication> startQt(int &argc, char **argv, bool withFonts);

} // namespace kareport
