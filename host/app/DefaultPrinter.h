#pragma once

#include "KaReportExport.h"

#include <QSize>
#include <QString>

namespace kareport
{

/// Which printer a report's page is measured on.
enum class PrinterSource
{
    SystemOrBuiltIn, ///< the system's default printer, or the built-in page device where there is none
    BuiltIn,         ///< the built-in page device, the same on every machine
    None             ///< no printer at all: pages keep the figures they have
};

/// The sheet of the built-in page device.
enum class PaperSize
{
    ByLocale, ///< Letter where the locale measures in inches, else A4
    A4,
    A3,
    Letter,
    Legal
};

/// The printer that the application prints on unless another is given.
struct DefaultPrinter
{
    PrinterSource source = PrinterSource::SystemOrBuiltIn; ///< which printer it is
    PaperSize paper = PaperSize::ByLocale;                 ///< of the built-in page device
    int resolution = 600;                                  ///< of the built-in page device, dots per inch
    QString name = QString(); ///< of the installed printer that the user has selected; empty for the system's
    QSize sheet = QSize();    ///< of the installed printer, upright, in points; empty for the printer's own
    /// Whether reports are previewed, set up and printed also where no printer is installed: on the built-in page device, into
    /// a PDF. `sheet` then counts for that device as well.
    bool replacesPrinter = false;
};

/// The printer that pages are measured on and printed by; the system's, or the built-in page device, until it is set.
KAREPORT_EXPORT const DefaultPrinter &defaultPrinter();
/// Sets that printer. Reports that are there keep the page that they were measured with.
KAREPORT_EXPORT void setDefaultPrinter(const DefaultPrinter &printer);

} // namespace kareport
