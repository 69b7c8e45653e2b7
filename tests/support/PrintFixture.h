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
    AnsweredPrinting();
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
void writeLines(UReportDoc &report, int count);
