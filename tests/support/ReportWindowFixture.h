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
    WindowDesk()
    {
        application.emplace();
        application->AddDocTemplate(ReportInitialTemplate());
        frame.emplace();
        frame->resize(800, 600);
        frame->show();
        QApplication::setActiveWindow(&*frame);
    }
    ~WindowDesk()
    {
        application.reset();
        frame.reset();
        settle();
    }
    WindowDesk(const WindowDesk &) = delete;
    WindowDesk &operator=(const WindowDesk &) = delete;

    /// Lets everything happen that waits, deferred deletions as well.
    static void settle()
    {
        QCoreApplication::processEvents();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        QCoreApplication::processEvents();
    }
    /// A report in a pane of its own, whose view is the active one.
    UReportDoc *openReport(const QString &name) const
    {
        UReportDoc *report = CreateReport(name, false, false, nullptr, 0, nullptr);
        UXTPMDIFrameWnd::Get()->SetActiveViewForFrameAndPane(report->GetViews().front());
        settle();
        return report;
    }
    static UReportWindowDlg &windowOf(const UReportDoc *report)
    {
        return *dynamic_cast<UReportWindowDlg *>(report->GetReportWindow());
    }
    static QStringList rowsOf(const UReportWindowDlg &window)
    {
        QStringList rows;
        for (int row = 0; window.GetList() != nullptr && row < window.GetList()->GetCount(); ++row) {
            rows += window.GetList()->GetText(row);
        }
        return rows;
    }

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
    explicit AnsweredSaving(std::optional<QString> path)
    {
        kareport::setSaveDialog([this, path](const kareport::SaveRequest &request) {
            requests.push_back(request);
            if (meanwhile) {
                meanwhile();
            }
            return path;
        });
    }
    ~AnsweredSaving() { kareport::setSaveDialog({}); }
    AnsweredSaving(const AnsweredSaving &) = delete;
    AnsweredSaving &operator=(const AnsweredSaving &) = delete;

    std::vector<kareport::SaveRequest> requests;
    std::function<void()> meanwhile; ///< runs while the dialog is open
};

/// Answers every message box and keeps what was asked.
class AnsweredBoxes
{
public:
    explicit AnsweredBoxes(MessageAnswer answer)
    {
        kareport::setMessageBox([this, answer](const kareport::Message &message) {
            boxes.push_back(message);
            if (meanwhile) {
                meanwhile();
            }
            return answer;
        });
    }
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
    bool create(const QString &title = QStringLiteral("Traverse"), UView *previous = nullptr)
    {
        const bool created = window.createDocked(title, previous);
        WindowDesk::settle();
        return created;
    }
    QStringList rows() const { return WindowDesk::rowsOf(window); }

    WindowDesk desk;
    UReportWindowDlg window;
};

/// A report with a window, and another one that the user worked with before.
class WrittenReportWindow : public testing::Test
{
protected:
    WrittenReportWindow()
        : before(desk.openReport(QStringLiteral("Survey"))),
          report(CreateReportWindow(QStringLiteral("Traverse"), false, false)),
          window(WindowDesk::windowOf(report))
    {
        report->WriteLine(QStringLiteral("  first"), 0, 1, 0);
        report->WriteLine(QStringLiteral("second"), 0, 1, 0);
        WindowDesk::settle();
    }

    bool isEnabled(unsigned command) const
    {
        window.GetToolBar()->OnUpdateCmdUI(nullptr, true);
        for (const QAction *button : window.GetToolBar()->actions()) {
            if (button->data().toUInt() == command) {
                return button->isEnabled();
            }
        }
        return false;
    }
    void click(unsigned command) const
    {
        for (QAction *button : window.GetToolBar()->actions()) {
            if (button->data().toUInt() == command) {
                QTest::mouseClick(window.GetToolBar()->widgetForAction(button), Qt::LeftButton);
                return;
            }
        }
    }
    UView *activeView() const { return desk.frame->GetActiveView(); }
    std::size_t reports() const { return GetReportTemplate()->GetDocuments().size(); }

    WindowDesk desk;
    UReportDoc *before;
    UReportDoc *report;
    UReportWindowDlg &window;
    QTemporaryDir folder;
};
