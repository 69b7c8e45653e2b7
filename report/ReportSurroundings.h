#pragma once

#include "DefaultPrinter.h"
#include "PageDefaults.h"

#include <QDateTime>
#include <QMargins>
#include <QString>

namespace kareport
{

/// What a report takes from around it: from the application, the printer, the user's preferences and the clock, unless
/// the code that makes the report says otherwise (`UReportDoc::SetSurroundings`).
struct ReportSurroundings
{
    QString application;                 ///< the name that page headers begin with
    QDateTime time;                      ///< that page headers are dated with
    DefaultPrinter printer;              ///< that the page is measured on
    bool isPortrait = true;              ///< whether the page is upright
    QMargins margins = defaultMargins;   ///< hundredths of a millimetre
    unsigned fontSize = defaultFontSize; ///< points
    bool printHash = false;              ///< whether a value wider than its column prints as "#"
};

} // namespace kareport
