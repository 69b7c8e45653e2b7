#include "PrintFixture.h"

AnsweredPrinting::AnsweredPrinting()
{
    kareport::PrintDialogs dialogs;
    dialogs.print = [this](QPrinter &printer, int maxPage, QWidget *) {
        ++prints;
        maxPages.push_back(maxPage);
        portraitMeanwhile = UPreviewDlg::IsModulePrinterOrientationPortrait();
        orientation = printer.pageLayout().orientation();
        printer.setOutputFileName(file());
        if (changePrinter) {
            changePrinter(printer);
        }
        return accept;
    };
    dialogs.preview = [this](QPrinter &printer, QWidget *, const std::function<void(QPrinter &)> &paint) {
        ++previews;
        portraitMeanwhile = UPreviewDlg::IsModulePrinterOrientationPortrait();
        printer.setOutputFileName(file());
        paint(printer);
    };
    dialogs.pageSetup = [this](kareport::PageSetup &setup, QWidget *) {
        setups.push_back(setup);
        portraitMeanwhile = UPreviewDlg::IsModulePrinterOrientationPortrait();
        if (accept && changeSetup) {
            changeSetup(setup);
        }
        return accept;
    };
    kareport::setPrintDialogs(dialogs);
}

void writeLines(UReportDoc &report, int count)
{
    report.SetHeaderFlag(false);
    for (int i = 1; i <= count; ++i) {
        report.Write(QStringLiteral("line %1\r\n").arg(i), 0);
    }
}
