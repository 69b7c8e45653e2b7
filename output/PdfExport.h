#pragma once

#include "KaReportExport.h"
#include "PdfFaces.h"
#include "PdfGeometry.h"

#include <QLatin1StringView>
#include <QStringList>
#include <QStringView>

#include <functional>
#include <optional>
#include <vector>

class QIODevice;

namespace kareport
{

/// A character that no face of the system has.
struct MissingCharacter
{
    char32_t character = 0;
    qint64 count = 0;
    qint64 firstLine = 0; ///< from 1
};

/// What there is to say about a PDF.
struct KAREPORT_EXPORT PdfNotes
{
    std::vector<MissingCharacter> missing; ///< in the order in which they occur; U+FFFD or "?" stands in their places
    QString problem;                       ///< one sentence, when the PDF could not be made

    /// Sentences about the missing characters, for a person.
    QStringList warnings() const;
};

/// What a PDF is made of besides its text.
struct PdfOptions
{
    PdfPageSetup page;
    qint64 lineCount = 0;                   ///< lines of the report, which say how many pages there are at least
    std::optional<QStringList> fontFolders; ///< where the preferred faces are looked for; nothing for the system's
    std::function<bool(qint64, qint64)> progress; ///< is told the pages done and all pages; false stops. May be empty
};

/// Writes report text as a PDF to an open device: a page for each `linesPerPage` lines of the text, in a fixed-pitch face
/// that is embedded. The same text gives the same bytes. Tabs lead to every eighth column; other control characters are not
/// shown.
/// @param notes  receives what is missing or went wrong; may be null
/// @return false when the page has not been measured, no face can be used, the library fails, or a write fails
KAREPORT_EXPORT bool writePdf(QIODevice &device, QStringView text, const PdfOptions &options,
                              PdfNotes *notes = nullptr);
KAREPORT_EXPORT bool writePdf(QIODevice &device, QLatin1StringView text, const PdfOptions &options,
                              PdfNotes *notes = nullptr);

} // namespace kareport
