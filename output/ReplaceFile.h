#pragma once

#include "KaReportExport.h"
#include "ReportTextCodec.h"

#include <QIODevice>
#include <QString>
#include <QStringView>

#include <functional>

namespace kareport
{

/// Writes a file beside its target and puts it into the target's place in one step, so that a full disk, a failed write
/// or a killed program leaves an earlier file as it was.
/// @param write  writes the content; false, or a failed write, leaves the target alone
/// @param error  receives the system's reason when the answer is false; may be null
/// @return whether the target now holds the content
KAREPORT_EXPORT bool replaceFile(const QString &path, const std::function<bool(QIODevice &)> &write,
                                 QString *error = nullptr);

/// Writes report text to an open device, a piece at a time. @return false as soon as a write fails
KAREPORT_EXPORT bool writeReportText(QIODevice &device, QStringView text, LineEnds lineEnds);
KAREPORT_EXPORT bool writeReportText(QIODevice &device, QLatin1StringView text, LineEnds lineEnds);

} // namespace kareport
