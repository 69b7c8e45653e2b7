#pragma once

#include "TagScanner.h"

#include <QString>
#include <QStringView>

namespace kareport
{

/// An element's name as a message shows it: "<ReportTemplate>" for REPORTTEMPLATE.
QString bracketedTag(QStringView tag);
/// An element's value as a message shows it: in quotes, shortened to 60 characters.
QString quotedValue(const ScanElement &element);

/// Whether what the scanner noted makes the report come out wrong; otherwise it may be intended.
bool isScanError(const ScanNote &note);
/// One sentence about what the scanner noted, translated.
QString scanNoteText(const ScanNote &note);

} // namespace kareport
