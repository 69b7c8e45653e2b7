#pragma once

#include "PdfDetails.h"
#include "PdfGeometry.h"
#include "PdfNotes.h"
#include "ReportOutline.h"

#include <QLatin1StringView>
#include <QStringList>
#include <QStringView>

#include <functional>
#include <optional>
#include <vector>

class QIODevice;

namespace kareport
{

/// What a PDF is made from besides its text.
struct PdfOptions
{
    PdfPageSetup page;
    std::vector<qint64> pageStarts;         ///< where its pages begin, for `reportPages`
    std::optional<QStringList> fontFolders; ///< where the preferred faces are looked for; nothing for the system's
    const PdfDetails *details = nullptr;    ///< null for a PDF that has its pages alone
    std::vector<OutlineEntry> outline;      ///< for `details`, in the order of their places
    std::function<bool(qint64, qint64)> progress; ///< receives the pages done and all pages; false stops. May be empty
};

/// Writes report text as a PDF to an open device, in a fixed-pitch face that is embedded: each page on a sheet of its own.
/// Characters are on the grid of that face; one that it lacks is taken from another face and put into its cell, or into
/// its two cells when it is a wide one. The widest line decides the type size of all pages, and a page with more lines than
/// a sheet takes is set smaller; type gets no smaller than `smallestType`. Wider lines are broken at the edge of the box, and
/// longer pages continue on further sheets. The same text gives the same bytes. Tabs lead to every eighth cell; other control
/// characters are not shown.
/// @param notes  receives what is missing or went wrong; may be null
/// @return false when the page has not been measured, no face can be used, the library fails, memory ends, or a write fails
bool writePdf(QIODevice &device, QStringView text, const PdfOptions &options, PdfNotes *notes = nullptr);
bool writePdf(QIODevice &device, QLatin1StringView text, const PdfOptions &options, PdfNotes *notes = nullptr);

} // namespace kareport
