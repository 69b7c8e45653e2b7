#include "ViewFixture.h"

ShownReport::ShownReport(const QString &text)
{
    report.SetAutoDelete(false);
    report.SetData(text);
    report.SetModifiedFlag(false);
}

ShownReport::~ShownReport()
{
    while (!panes_.empty()) {
        close(panes_.size() - 1);
    }
}

UReportView &ShownReport::open(bool inPieces)
{
    auto *pane = new CViewPane;
    panes_.push_back(pane);
    UReportView *view = showIn<UReportView>(*pane, report);
    view->SetLoadsInPieces(inPieces);
    view->OnInitialUpdate();
    view->GetWidget()->resize(640, 400);
    view->GetWidget()->show();
    return *view;
}

void ShownReport::close(std::size_t index)
{
    if (CViewPane::IsOpen(panes_.at(index))) {
        panes_.at(index)->ClosePane();
    }
    panes_.erase(panes_.begin() + static_cast<std::ptrdiff_t>(index));
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

void putCursor(QPlainTextEdit &edit, int position, int anchor)
{
    QTextCursor cursor(edit.document());
    cursor.setPosition(anchor >= 0 ? anchor : position);
    cursor.setPosition(position, QTextCursor::KeepAnchor);
    edit.setTextCursor(cursor);
}

kareport::ReportViewWidget &widgetOf(UReportView &view)
{
    return *static_cast<kareport::ReportViewWidget *>(view.GetWidget());
}
