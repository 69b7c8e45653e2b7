#include "PageMeasurement.h"

#include "DefaultPrinter.h"
#include "FixedPitchFont.h"
#include "PageUnits.h"

#include <QFont>
#include <QFontMetricsF>
#include <QLocale>
#include <QPageLayout>
#include <QPageSize>
#include <QPrinter>
#include <QPrinterInfo>

#include <algorithm>
#include <climits>
#include <cmath>

namespace kareport
{

namespace
{

int clampToInt(qint64 value)
{
    return static_cast<int>(std::clamp<qint64>(value, INT_MIN, INT_MAX));
}

QPageSize::PageSizeId sheetOf(PaperSize paper)
{
    switch (paper) {
    case PaperSize::A4: return QPageSize::A4;
    case PaperSize::A3: return QPageSize::A3;
    case PaperSize::Letter: return QPageSize::Letter;
    case PaperSize::Legal: return QPageSize::Legal;
    case PaperSize::ByLocale: break;
    }
    return QLocale::system().measurementSystem() == QLocale::ImperialUSSystem ? QPageSize::Letter : QPageSize::A4;
}

PageDevice builtInDevice(const DefaultPrinter &printer, bool portrait)
{
    // Not QPageSize::sizePixels: it counts in whole points, which is several dots off at a printer's resolution.
    const QSizeF millimetres = builtInSheet(printer).size(QPageSize::Millimeter);
    const QSize upright = (millimetres * printer.resolution / millimetresPerInch).toSize();
    return {portrait ? upright : upright.transposed(), printer.resolution};
}

void setSheet(QPrinter &printer, const QSize &sheet)
{
    if (!sheet.isEmpty()) {
        printer.setPageSize(QPageSize(sheet));
    }
}

/// @return nothing when the printer cannot be opened
std::optional<PageDevice> installedDevice(const QPrinterInfo &info, const QSize &sheet, bool portrait)
{
    QPrinter printer(info, QPrinter::HighResolution);
    if (!printer.isValid()) {
        return std::nullopt;
    }
    setSheet(printer, sheet);
    printer.setPageOrientation(portrait ? QPageLayout::Portrait : QPageLayout::Landscape);
    return PageDevice{printer.pageLayout().fullRectPixels(printer.resolution()).size(), printer.resolution()};
}

QPrinterInfo installedPrinter(const DefaultPrinter &printer)
{
    if (printer.source != PrinterSource::SystemOrBuiltIn) {
        return QPrinterInfo();
    }
    const QPrinterInfo selected = QPrinterInfo::printerInfo(printer.name);
    // A selected printer that is no longer installed leaves the system's.
    return selected.isNull() ? QPrinterInfo::defaultPrinter() : selected;
}

} // namespace

int mulDiv(int a, int b, int c)
{
    const qint64 product = qint64(a) * b;
    const qint64 half = c / 2;
    return clampToInt((product < 0 ? product - half : product + half) / c);
}

PageGeometry measurePage(const PageDevice &device, const QMargins &margins, const FontExtents &font)
{
    const auto dots = [&](int margin) { return qint64(mulDiv(margin, device.resolution, hundredthsPerInch)); };
    PageGeometry geometry;
    geometry.pageSize = device.size;
    geometry.resolution = static_cast<unsigned>(device.resolution);
    geometry.linesPerPage = clampToInt((device.size.height() - dots(margins.bottom()) - dots(margins.top())) /
                                       (qint64(font.height) + font.externalLeading));
    geometry.charsPerRow =
        clampToInt((device.size.width() - dots(margins.right()) - dots(margins.left())) / font.averageWidth);
    return geometry;
}

QPrinterInfo applicationPrinter()
{
    return installedPrinter(defaultPrinter());
}

QPageSize builtInSheet(const DefaultPrinter &printer)
{
    const bool isSelected = printer.replacesPrinter && !printer.sheet.isEmpty();
    return isSelected ? QPageSize(printer.sheet) : QPageSize(sheetOf(printer.paper));
}

QPageSize builtInSheet()
{
    return builtInSheet(defaultPrinter());
}

void setSelectedSheet(QPrinter &printer)
{
    setSheet(printer, defaultPrinter().sheet);
}

std::optional<PageDevice> pageDevice(const DefaultPrinter &printer, bool portrait)
{
    if (printer.source == PrinterSource::None) {
        return std::nullopt;
    }
    const QPrinterInfo info = installedPrinter(printer);
    return info.isNull() ? builtInDevice(printer, portrait) : installedDevice(info, printer.sheet, portrait);
}

FontExtents measureFont(const QString &face, unsigned points, int resolution)
{
    QFont font = fixedPitchFont(face.left(longestFaceName));
    font.setStretch(QFont::Unstretched);
    font.setHintingPreference(QFont::PreferNoHinting);
    font.setPixelSize(mulDiv(static_cast<int>(points), resolution, pointsPerInch));
    const QFontMetricsF metrics(font);
    const auto rounded = [](qreal dots) { return static_cast<int>(std::lround(dots)); };
    return {rounded(metrics.ascent()) + rounded(metrics.descent()), rounded(metrics.leading()),
            rounded(metrics.averageCharWidth())};
}

} // namespace kareport
