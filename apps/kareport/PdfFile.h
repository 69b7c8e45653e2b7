#pragma once

#include <QString>

namespace kareport
{

/// Whether a name is that of a PDF.
bool isPdfName(const QString &path);
/// Whether a file is a PDF, by its name or by its first bytes. What is no file is not looked into.
bool isPdfFile(const QString &path);

} // namespace kareport
