#include "ReportWindowFixture.h"

#include "ReportSaveName.h"

WindowDesk::WindowDesk()
{
    application.emplace();
    application->AddDocTemplate(ReportInitialTemplate());
    frame.emplace();
    frame->resize(800, 600);
    frame->show();
    QApplication::setActiveWindow(&*frame);
}

WindowDesk::~WindowDesk()
{
    application.reset();
    frame.reset();
    settle();
}

void WindowDesk::settle()
{
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QCoreApplication::processEvents();
}

UReportDoc *WindowDesk::openReport(const QString &name) const
{
    UReportDoc *report = CreateReport(name, false, false, nullptr, 0, nullptr);
    UXTPMDIFrameWnd::Get()->SetActiveViewForFrameAndPane(report->GetViews().front());
    settle();
    return report;
}

UReportWindowDlg &WindowDesk::windowOf(const UReportDoc *report)
{
    return *dynamic_cast<UReportWindowDlg *>(report->GetReportWindow());
}

QStringList WindowDesk::rowsOf(const UReportWindowDlg &window)
{
    QStringList rows;
    for (int row = 0; window.GetList() != nullptr && row < window.GetList()->GetCount(); ++row) {
        rows += window.GetList()->GetText(row);
    }
    return rows;
}

AnsweredSaving::~AnsweredSaving()
{
    kareport::setSaveDialog({});
    kareport::setSaveFailure({});
}

AnsweredSaving::AnsweredSaving(std::optional<QString> path)
{
    kareport::setSaveFailure(kareport::sayNotSaved);
    kareport::setSaveDialog([this, path](const kareport::SaveRequest &request) {
        requests.push_back(request);
        if (meanwhile) {
            meanwhile();
        }
        return path;
    });
}

AnsweredBoxes::AnsweredBoxes(MessageAnswer answer)
{
    kareport::setMessageBox([this, answer](const kareport::Message &message) {
        boxes.push_back(message);
        if (meanwhile) {
            meanwhile();
        }
        return answer;
    });
}

bool OwnReportWindow::create(const QString &title, UView *previous)
{
    const bool created = window.createDocked(title, previous);
    WindowDesk::settle();
    return created;
}

WrittenReportWindow::WrittenReportWindow()
    : before(desk.openReport(QStringLiteral("Survey"))),
      report(CreateReportWindow(QStringLiteral("Traverse"), false, false)),
      window(WindowDesk::windowOf(report))
{
    report->WriteLine(QStringLiteral("  first"), 0, 1, 0);
    report->WriteLine(QStringLiteral("second"), 0, 1, 0);
    WindowDesk::settle();
}

bool WrittenReportWindow::isEnabled(unsigned command) const
{
    window.GetToolBar()->OnUpdateCmdUI(nullptr, true);
    for (const QAction *button : window.GetToolBar()->actions()) {
        if (button->data().toUInt() == command) {
            return button->isEnabled();
        }
    }
    return false;
}

void WrittenReportWindow::click(unsigned command) const
{
    for (QAction *button : window.GetToolBar()->actions()) {
        if (button->data().toUInt() == command) {
            QTest::mouseClick(window.GetToolBar()->widgetForAction(button), Qt::LeftButton);
            return;
        }
    }
}
