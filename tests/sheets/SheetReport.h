#pragma once

#include "PrintFixture.h"
#include "ReportViewWidget.h"
#include "SheetPane.h"
#include "SheetReportView.h"
#include "SheetThumbnails.h"
#include "SheetView.h"

/// A report with a view that can show its sheets.
class SheetReport
{
public:
    explicit SheetReport(int width = 900, int height = 700)
    {
        report.SetAutoDelete(false);
        report.SetPageSize();
        pane_ = new CViewPane;
        view_ = showIn<kareport::SheetReportView>(*pane_, report);
        view_->OnInitialUpdate();
        view_->GetWidget()->resize(width, height);
        view_->GetWidget()->show();
    }
    ~SheetReport()
    {
        if (CViewPane::IsOpen(pane_)) {
            pane_->ClosePane();
        }
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }
    SheetReport(const SheetReport &) = delete;
    SheetReport &operator=(const SheetReport &) = delete;

    kareport::SheetReportView &view() { return *view_; }
    kareport::SheetView &sheets() { return view_->sheets().pane().view(); }
    kareport::SheetThumbnails &thumbnails() { return view_->sheets().pane().thumbnails(); }
    kareport::ReportEdit &edit() { return view_->GetEdit(); }
    kareport::ReportViewWidget &window() { return *static_cast<kareport::ReportViewWidget *>(view_->GetWidget()); }

    /// Pages of numbered lines on a page that was given, shown in the view.
    void writePages(int pages, int linesOfPage)
    {
        report.FixPage(linesOfPage, 80);
        report.SetHeaderFlag(false);
        for (int page = 1; page <= pages; ++page) {
            if (report.GetPageNumber() != page) {
                report.NewPage(-1);
            }
            for (int line = 1; line < linesOfPage; ++line) {
                report.WriteLine(QStringLiteral("line %1 of page %2").arg(line).arg(page), 0, 1, 0);
            }
        }
        report.UpdateAllViews(nullptr, 0, nullptr);
    }
    void show(kareport::SheetReportView::Shows shows)
    {
        view_->setShows(shows);
        view_->sheets().finish();
        QCoreApplication::processEvents();
    }
    /// Waits until the sheets are those of the text.
    bool settle()
    {
        return waitUntil([this] {
            const kareport::SheetLayout *layout = view_->sheets().layout();
            return layout != nullptr && layout->isDone() && sheets().count() == layout->count();
        });
    }

private:
    FixedSurroundings surroundings_;

public:
    UReportDoc report;

private:
    CViewPane *pane_;
    kareport::SheetReportView *view_;
};
