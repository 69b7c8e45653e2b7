#pragma once

#include "NumberedPages.h"
#include "Preferences.h"
#include "PrintDialogs.h"
#include "UPreviewDlg.h"
#include "ViewFixture.h"

#include <QPainter>
#include <QPrinter>
#include <QTemporaryDir>

/// Answers the windows of print commands and keeps what they were asked. The answers can be changed.
class AnsweredPrinting
{
public:
    AnsweredPrinting()
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
    ~AnsweredPrinting() { kareport::setPrintDialogs({}); }
    AnsweredPrinting(const AnsweredPrinting &) = delete;
    AnsweredPrinting &operator=(const AnsweredPrinting &) = delete;

    QString file() const { return folder_.filePath(QStringLiteral("printed.pdf")); }
    int printedPages() const { return pagesIn(file()); }

    bool accept = true;
    std::function<void(QPrinter &)> changePrinter;
    std::function<void(kareport::PageSetup &)> changeSetup;
    int prints = 0;
    int previews = 0;
    std::vector<int> maxPages;
    std::vector<kareport::PageSetup> setups;
    bool portraitMeanwhile = true;
    QPageLayout::Orientation orientation = QPageLayout::Portrait;

private:
    QTemporaryDir folder_;
};

/// Numbered lines, each ended.
inline void writeLines(UReportDoc &report, int count)
{
    report.SetHeaderFlag(false);
    for (int i = 1; i <= count; ++i) {
        report.Write(QStringLiteral("line %1\r\n").arg(i), 0);
    }
}
