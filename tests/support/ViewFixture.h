#pragma once

#include "FrameFixture.h"
#include "ReportEdit.h"
#include "ReportFixture.h"
#include "ReportViewWidget.h"
#include "UReportView.h"

#include <QApplication>
#include <QBuffer>
#include <QTest>
#include <QTextDocument>

#include <gtest/gtest.h>

/// A report with views of it, shown on the screen.
class ShownReport
{
public:
    explicit ShownReport(const QString &text = QString())
    {
        report.SetAutoDelete(false);
        report.SetData(text);
        report.SetModifiedFlag(false);
    }
    ~ShownReport()
    {
        while (!panes_.empty()) {
            close(panes_.size() - 1);
        }
    }
    ShownReport(const ShownReport &) = delete;
    ShownReport &operator=(const ShownReport &) = delete;

    /// Opens another view of the report. @param inPieces  whether it loads long texts in pieces
    UReportView &open(bool inPieces = false)
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
    void close(std::size_t index)
    {
        if (CViewPane::IsOpen(panes_.at(index))) {
            panes_.at(index)->ClosePane();
        }
        panes_.erase(panes_.begin() + static_cast<std::ptrdiff_t>(index));
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }
    /// The report's text, its lines ended by LF.
    QString lines() const { return textOf(report).replace(QStringLiteral("\r\n"), QStringLiteral("\n")); }

private:
    FixedSurroundings surroundings_;

public:
    UReportDoc report;

private:
    std::vector<CViewPane *> panes_;
};

inline void putCursor(QPlainTextEdit &edit, int position, int anchor = -1)
{
    QTextCursor cursor(edit.document());
    cursor.setPosition(anchor >= 0 ? anchor : position);
    cursor.setPosition(position, QTextCursor::KeepAnchor);
    edit.setTextCursor(cursor);
}

inline kareport::ReportViewWidget &widgetOf(UReportView &view)
{
    return *static_cast<kareport::ReportViewWidget *>(view.GetWidget());
}

/// Lets the event loop run until something holds, at most five seconds. @return whether it does
template <typename Condition>
bool waitUntil(Condition condition)
{
    return QTest::qWaitFor(condition, 5000);
}
