#pragma once

#include "PageDefaults.h"

#include <QMargins>
#include <QSize>
#include <QString>

#include <optional>

class QPageSize;
class QPrinter;
class QPrinterInfo;

namespace kareport
{

struct DefaultPrinter;

/// The sheet that a printer prints on.
struct PageDevice
{
    QSize size;         ///< whole sheet, printer dots
    int resolution = 0; ///< vertical dots per inch
};

/// A font as a printer has it, in printer dots.
struct FontExtents
{
    int height = 0;          ///< ascent and descent
    int externalLeading = 0; ///< between two lines
    int averageWidth = 0;    ///< of a character
};

/// Printed page of a report, measured once from a printer and a font.
struct PageGeometry
{
    QSize pageSize = {0, 0};                ///< whole sheet, printer dots; (0, 0) until measured
    unsigned resolution = 0;                ///< vertical dots per inch; 0 until measured
    int linesPerPage = defaultLinesPerPage; ///< lines between the margins
    int charsPerRow = defaultCharsPerRow;   ///< characters of average width between the margins
};

/// a × b / c, rounded to the nearest whole number, halves away from 0.
int mulDiv(int a, int b, int c);

/// How many lines and characters fit between the margins (hundredths of a millimetre). The whole sheet counts, not its
/// printable part.
PageGeometry measurePage(const PageDevice &device, const QMargins &margins, const FontExtents &font);

/// A printer, upright or not; nothing when there is none.
std::optional<PageDevice> pageDevice(const DefaultPrinter &printer, bool portrait);

/// The installed printer that the application prints on: the one that the user has selected, or the system's default. Null
/// when there is none, or when the host has not chosen the system's printers.
QPrinterInfo applicationPrinter();
/// Sets an installed printer to the sheet that the user has selected, if one is.
void setSelectedSheet(QPrinter &printer);
/// The sheet of the built-in page device.
QPageSize builtInSheet();
QPageSize builtInSheet(const DefaultPrinter &printer);

/// The extents of a fixed-pitch face at a size in points on a device. A face that is not installed is replaced by the
/// nearest fixed-pitch face. Needs a running QGuiApplication.
FontExtents measureFont(const QString &face, unsigned points, int resolution);

} // namespace kareport
