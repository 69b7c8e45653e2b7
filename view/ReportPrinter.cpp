#include "ReportPrinter.h"

#include "DefaultPrinter.h"
#include "PageMeasurement.h"
#include "PrintGeometry.h"

#include <QDir>
#include <QPageLayout>
#include <QPageSize>
#include <QPrinter>
#include <QPrinterInfo>
#include <QRegularExpression>
#include <QStandardPaths>

namespace kareport
{

namespace
{

bool isBuiltIn()
{
    return defaultPrinter().source == PrinterSource::BuiltIn;
}

QString fileFor(const QString &title)
{
    static const QRegularExpression notInNames(QStringLiteral("[\\x00-\\x1F/\\\\:*?\"<>|]"));
    QString name = title;
    name.replace(notInNames, QStringLiteral("_"));
    const QDir folder(QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation));
    return folder.filePath((name.trimmed().isEmpty() ? QStringLiteral("report") : name.trimmed()) +
                           QStringLiteral(".pdf"));
}

} // namespace

bool hasReportPrinter()
{
    return isBuiltIn() || !applicationPrinter().isNull();
}

std::shared_ptr<QPrinter> makeReportPrinter(bool portrait, const QString &title)
{
    std::shared_ptr<QPrinter> printer;
    if (isBuiltIn()) {
        printer = std::make_shared<QPrinter>(QPrinter::HighResolution);
        printer->setOutputFormat(QPrinter::PdfFormat);
        printer->setOutputFileName(fileFor(title));
        printer->setResolution(defaultPrinter().resolution);
        printer->setPageSize(builtInSheet());
    } else {
        printer = std::make_shared<QPrinter>(applicationPrinter(), QPrinter::HighResolution);
    }
    if (!printer->isValid()) {
        return nullptr;
    }
    printer->setPageOrientation(portrait ? QPageLayout::Portrait : QPageLayout::Landscape);
    printer->setFullPage(true);
    printer->setDocName(title);
    return printer;
}

QSize sheetInTwips(const QPrinter &printer)
{
    return twipsOfDots(printer.pageLayout().fullRectPixels(printer.resolution()).size(),
                       static_cast<unsigned>(printer.resolution()));
}

void fillPrinters(PageSetup &setup)
{
    if (isBuiltIn()) {
        setup.sheetOf = [](const QString &) { return builtInSheet().size(QPageSize::Millimeter); };
        return;
    }
    setup.printer = applicationPrinter().printerName();
    setup.printers = QPrinterInfo::availablePrinterNames();
    setup.sheetOf = [](const QString &name) {
        const QPrinterInfo info = QPrinterInfo::printerInfo(name);
        return info.isNull() ? QSizeF() : info.defaultPageSize().size(QPageSize::Millimeter);
    };
}

void selectPrinter(const QString &name)
{
    DefaultPrinter printer = defaultPrinter();
    printer.name = name;
    setDefaultPrinter(printer);
}

} // namespace kareport
