#pragma once

#include "InputError.h"

#include <QByteArrayView>
#include <QString>
#include <QStringList>
#include <QStringView>

#include <optional>

class UReportDoc;

namespace kareport
{

/// The content of a saved report.
struct SavedText
{
    QString text;         ///< lines ended by CR LF
    QStringList warnings; ///< sentences about what the text does not have of it
};

/// Reads the bytes of a saved report: of a report file, of rich text or of plain text. @param path  names the file in errors
Expected<SavedText> readSavedText(const QString &path, QByteArrayView bytes);

/// The lines of a page by a report's header lines, in whatever language they were written; nothing without any.
std::optional<int> linesOfPages(QStringView text);
/// Writes the lines of a text into a report as they are, counting them. Page headers that it has are lines like others.
void writeLines(UReportDoc &report, QStringView text);

} // namespace kareport
