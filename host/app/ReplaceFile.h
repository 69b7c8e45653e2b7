#pragma once

#include <QIODevice>
#include <QString>

#include <functional>

namespace kareport
{

/// Writes a file next to its target and replaces the target with it in one step, so that a full disk, a failed write
/// or a killed program leaves an earlier file as it was. What is not a file (a pipe, a device) is written to instead.
/// @param write  writes the content; false, or a failed write, leaves the target alone
/// @param error  receives the system's reason when the answer is false; may be null
/// @return whether the target now holds the content
bool replaceFile(const QString &path, const std::function<bool(QIODevice &)> &write, QString *error = nullptr);

} // namespace kareport
