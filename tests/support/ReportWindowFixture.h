#pragma once

#include "CReportToolBar.h"
#include "CReportViewPane.h"
#include "FrameFixture.h"
#include "ReportEdit.h"
#include "ReportFixture.h"
#include "ReportInitialTemplate.h"
#include "ReportWindowEntry.h"
#include "SaveDialog.h"
#include "UReportList.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"
#include "UXTPMDIFrameWnd.h"

#include <QAction>
#include <QApplication>
#include <QDockWidget>
#include <QTemporaryDir>
#include <QTest>

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <optional>
#include <vector>

/// A main frame on the screen, in an application that shows reports.
class WindowDesk
{
public:
    WindowDesk();
    ~WindowDesk();
    WindowDesk(const WindowDesk &) = delete;
    WindowDesk &operator=(const WindowDesk &) = delete;

    /// Lets everything happen that waits, deferred deletions as well.
    static void settle();
    /// A report in a pane of its own, whose view is the active one.
    UReportDoc *openReport(const QString &name) const;
    static UReportWindowDlg &windowOf(const UReportDoc *report);
    static QStringList rowsOf(const UReportWindowDlg &window);

private:
    FixedSurroundings surroundings_;

public:
    std::optional<UApplication> application;
    std::optional<UXTPMDIFrameWnd> frame;
};

/// Answers every question for a file name and keeps what was asked.
class AnsweredSaving
{
public:
    explicit AnsweredSaving(std::optional<QString> path);
    ~AnsweredSaving();
    AnsweredSaving(const AnsweredSaving &) = delete;
    AnsweredSaving &operator=(const AnsweredSaving &) = delete;

    std::vector<kareport::SaveRequest> requests;
    std::function<void()> meanwhile; ///< runs while the dialog is open
};

/// Answers every message box and keeps what was asked.
class AnsweredBoxes
{
public:
    explicit AnsweredBoxes(MessageAnswer answer);
    ~AnsweredBoxes() { kareport::setMessageBox({}); }
    AnsweredBoxes(const AnsweredBoxes &) = delete;
    AnsweredBoxes &operator=(const AnsweredBoxes &) = delete;

    std::vector<kareport::Message> boxes;
    std::function<void()> meanwhile; ///< runs while the box is open
};

/// A window of its own, linked to no report, which the test owns.
class OwnReportWindow : public testing::Test
{
protected:
    bool create(const QString &title = QStringLiteral("Traverse"), UView *previous = nullptr);
    QStringList rows() const { return WindowDesk::rowsOf(window); }

    WindowDesk desk;
    UReportWindowDlg window;
};

/// A report with a window, and another one that the user worked with before.
class WrittenReportWindow : public testing::Test
{
protected:
    WrittenReportWindow();

    bool isEnabled(unsigned command) const;
    void click(unsigned command) const;
    UView *activeView() const { return desk.frame->GetActiveView(); }
    std::size_t reports() const { return GetReportTemplate()->GetDocuments().size(); }

    WindowDesk desk;
    UReportDoc *before;
    UReportDoc *report;
    UReportWindowDlg &window;
    QTemporaryDir folder;
};
