#pragma once

#include <QtGlobal>

namespace kareport
{

/// Whether a process is running. @param process  as `QProcess::startDetached` gives it
bool isProcessRunning(qint64 process);

} // namespace kareport
