#pragma once

#include <QStringList>

namespace kareport
{

/// What was open when the program ended, in the order in which it is opened again: saved reports, and the jobs of reports that
/// were not saved. The one in front is the last.
QStringList lastSession();
/// Keeps that for the next start.
void keepSession(const QStringList &files);

} // namespace kareport
