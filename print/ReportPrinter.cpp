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

bool replacesPrinter()
{
    const DefaultPrinter &printer = defaultPrinter();
    return printer.replacesPrinter && printer.source == PrinterSource::SystemOrBuiltIn && applicationPrinter().isNull();
}

bool isBuiltIn()
{
    return defaultPrinter().source == PrinterSource::BuiltIn || replacesPrinter();
}

QString fileFor(const QString &title)
{
    static const QRegularExpression notInNames(QStringLiteral("[\\x00-\\x1F/\\\\:*?\"<>|]"));
    QString name = title;
    name.replace(notInNames, QStringLiteral("_"));
    const QString documents = QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation);
    const QDir folder(QDir(documents).exists() ? documents : QDir::homePath());
    return folder.filePath((name.trimmed().isEmpty() ? QStringLiteral("report") : name.trimmed()) +
                           QStringLiteral(".pdf"));
}

/// Those of the page device that takes the place of a printer.
std::vector<PageSheet> builtInSheets()
{
    DefaultPrinter own = defaultPrinter();
    own.sheet = QSize();
    return usualSheets(builtInSheet(own));
}

} // namespace

PageSheet pageSheet(const QPageSize &size)
{
    return {size.name(), size.sizePoints(), size.size(QPageSize::Millimeter)};
}

std::vector<PageSheet> usualSheets(const QPageSize &first)
{
    std::vector<PageSheet> sheets;
    sheets.push_back(pageSheet(first));
    for (const auto id : {QPageSize::A4, QPageSize::A3, QPageSize::Letter, QPageSize::Legal}) {
        if (id != first.id()) {
            sheets.push_back(pageSheet(QPageSize(id)));
        }
    }
    return sheets;
}

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
        setSelectedSheet(*printer);
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
    if (replacesPrinter()) {
        setup.sheet = defaultPrinter().sheet;
        setup.sheetsOf = [](const QString &) { return builtInSheets(); };
        return;
    }
    if (isBuiltIn()) {
        setup.sheetsOf = [](const QString &) { return std::vector{pageSheet(builtInSheet())}; };
        return;
    }
    setup.printer = applicationPrinter().printerName();
    setup.printers = QPrinterInfo::availablePrinterNames();
    setup.sheet = defaultPrinter().sheet;
    setup.sheetsOf = [](const QString &name) {
        const QPrinterInfo info = QPrinterInfo::printerInfo(name);
        std::vector<PageSheet> sheets;
        if (info.isNull()) {
            sheets.push_back(pageSheet(builtInSheet())); // which takes the place of a printer
        } else {
            sheets.push_back(pageSheet(info.defaultPageSize()));
            for (const QPageSize &size : info.supportedPageSizes()) {
                if (!size.isEquivalentTo(info.defaultPageSize())) {
                    sheets.push_back(pageSheet(size));
                }
            }
        }
        return sheets;
    };
}

void selectPrinter(const QString &name, const QSize &sheet)
{
    DefaultPrinter printer = defaultPrinter();
    printer.name = name;
    printer.sheet = sheet;
    setDefaultPrinter(printer);
}

} // namespace kareport
