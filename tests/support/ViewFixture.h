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
    explicit ShownReport(const QString &text = QString());
    ~ShownReport();
    ShownReport(const ShownReport &) = delete;
    ShownReport &operator=(const ShownReport &) = delete;

    /// Opens another view of the report. @param inPieces  whether it loads long texts in pieces
    UReportView &open(bool inPieces = false);
    void close(std::size_t index);
    /// The report's text, its lines ended by LF.
    QString lines() const { return textOf(report).replace(QStringLiteral("\r\n"), QStringLiteral("\n")); }

private:
    FixedSurroundings surroundings_;

public:
    UReportDoc report;

private:
    std::vector<CViewPane *> panes_;
};

void putCursor(QPlainTextEdit &edit, int position, int anchor = -1);

kareport::ReportViewWidget &widgetOf(UReportView &view);

/// Lets the event loop run until something holds, at most five seconds. @return whether it does
template <typename Condition>
bool waitUntil(Condition condition)
{
    return QTest::qWaitFor(condition, 5000);
}
