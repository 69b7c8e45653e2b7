#pragma once

#include <QString>

class UReportDoc;

namespace kareport
{

/// Whether a name is that of a PDF.
bool isPdfName(const QString &path);
/// Whether a file is a PDF, by its name or by its first bytes. What is no file is not looked into.
bool isPdfFile(const QString &path);

/// Whether a report would give a PDF without a page, which readers refuse: it is empty, or rich text that shows nothing.
bool makesNoPage(const UReportDoc &report);

} // namespace kareport
