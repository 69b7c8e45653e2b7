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

/// Lines that are too wide for a page.
struct PdfWideLines
{
    qint64 count = 0;
    qint64 firstLine = 0; ///< from 1
    double points = 0;    ///< the type size that they led to
};

/// What there is to say about a PDF.
struct KAREPORT_EXPORT PdfNotes
{
    PdfWideLines reduced;                  ///< lines that made the type of the whole PDF smaller
    PdfWideLines broken;                   ///< lines that had to be broken all the same
    std::vector<MissingCharacter> missing; ///< in the order in which they occur; U+FFFD or "?" stands in their places
    QString problem;                       ///< one sentence, when the PDF could not be made

    /// Sentences about wide lines and missing characters, for a person.
    QStringList warnings() const;
};

/// What a PDF is made of besides its text.
struct PdfOptions
{
    PdfPageSetup page;
    std::vector<qint64> pageStarts;         ///< where its pages begin, for `reportPages`
    std::optional<QStringList> fontFolders; ///< where the preferred faces are looked for; nothing for the system's
    std::function<bool(qint64, qint64)> progress; ///< is told the pages done and all pages; false stops. May be empty
};

/// Writes report text as a PDF to an open device, in a fixed-pitch face that is embedded: each page on a sheet of its own.
/// Characters stand on the grid of that face; one that it lacks is taken from another face and put into its cell, or into
/// its two cells when it is a wide one. The widest line decides the type size of all pages, and a page with more lines than
/// a sheet takes is set smaller; type gets no smaller than `smallestType`. Wider lines are broken at the edge of the box, and
/// longer pages go on on further sheets. The same text gives the same bytes. Tabs lead to every eighth cell; other control
/// characters are not shown.
/// @param notes  receives what is missing or went wrong; may be null
/// @return false when the page has not been measured, no face can be used, the library fails, or a write fails
KAREPORT_EXPORT bool writePdf(QIODevice &device, QStringView text, const PdfOptions &options,
                              PdfNotes *notes = nullptr);
KAREPORT_EXPORT bool writePdf(QIODevice &device, QLatin1StringView text, const PdfOptions &options,
                              PdfNotes *notes = nullptr);

} // namespace kareport
