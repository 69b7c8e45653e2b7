// A plain Qt program: reports are in the tabs of its own main window, beside what else it shows. With --once it closes its
// window again at once, which shows that it ends.
#include <KaReport/AppMessageBox.h>
#include <KaReport/CViewPane.h>
#include <KaReport/Language.h>
#include <KaReport/PlainWidgets.h>
#include <KaReport/Profile.h>
#include <KaReport/ReportEntry.h>
#include <KaReport/UApplication.h>
#include <KaReport/UReportDoc.h>
#include <KaReport/UReportView.h>

#include <QApplication>
#include <QCloseEvent>
#include <QMainWindow>
#include <QMenuBar>
#include <QTabWidget>

/// A pane of the program's own: a tab. As every pane it owns itself until it is closed.
class TabPane : public CViewPane
{
public:
    explicit TabPane(QTabWidget &tabs) : tabs_(tabs) {}

    void AddView(std::unique_ptr<UView> view) override
    {
        widget_ = view->GetWidget(); // the view deletes it
        CViewPane::AddView(std::move(view));
        QObject::connect(&tabs_, &QTabWidget::tabCloseRequested, widget_, [this](int tab) {
            // The user may be asked whether to save, and what happens meanwhile may close the pane.
            if (tabs_.widget(tab) == widget_ && CanClosePane() && IsOpen(this)) {
                ClosePane();
            }
        });
    }

    void ShowPane(bool show) override
    {
        if (!show) {
            tabs_.removeTab(tabs_.indexOf(widget_));
        } else if (tabs_.indexOf(widget_) < 0) {
            tabs_.addTab(widget_, kareport::plainMenuText(GetCaption()));
        }
        CViewPane::ShowPane(show);
        BringToTop();
    }

    void UpdateTitle() override { tabs_.setTabText(tabs_.indexOf(widget_), kareport::plainMenuText(GetCaption())); }
    bool IsInFront() const override { return IsVisible() && tabs_.currentWidget() == widget_; }
    void BringToTop() override
    {
        if (IsVisible()) {
            tabs_.setCurrentWidget(widget_);
            widget_->setFocus();
        }
    }

private:
    QTabWidget &tabs_;
    QWidget *widget_ = nullptr;
};

class MainWindow : public QMainWindow
{
public:
    MainWindow()
    {
        tabs_.setTabsClosable(true);
        setCentralWidget(&tabs_);
        QMenu *file = menuBar()->addMenu(QStringLiteral("&File"));
        file->addAction(QStringLiteral("&Save"), this, [this] { run(57603); });
        file->addAction(QStringLiteral("&Print..."), this, [this] { run(57607); });
        file->addAction(QStringLiteral("E&xit"), this, &QWidget::close);
        kareport::setMessageBox(
            [this](const kareport::Message &message) { return kareport::showMessageBox(this, message); });
        resize(1000, 700);
        show();
    }
    ~MainWindow() override { kareport::setMessageBox({}); }

    QTabWidget &tabs() { return tabs_; }

protected:
    void closeEvent(QCloseEvent *event) override
    {
        for (UDocument *report : UApplication::Get()->GetDocuments()) {
            // What the answer to a question does may have closed another report.
            if (event->isAccepted() && UApplication::Get()->IsOpen(report)) {
                event->setAccepted(report->SaveModified() || !UApplication::Get()->IsOpen(report));
            }
        }
    }

private:
    /// Runs a command of the report in the front tab.
    void run(unsigned command)
    {
        for (UDocument *report : UApplication::Get()->GetDocuments()) {
            for (UView *view : report->GetViews()) {
                auto *reportView = dynamic_cast<UReportView *>(view);
                if (reportView != nullptr && reportView->GetWidget() == tabs_.currentWidget()) {
                    reportView->runCommand(command);
                    return;
                }
            }
        }
    }

    QTabWidget tabs_;
};

int main(int argc, char **argv)
{
    QApplication qt(argc, argv);
    kareport::setLanguage(QString()); // the system's
    kareport::setProfileStore(kareport::makeMemoryProfile());
    MainWindow window; // goes after the application, whose end closes the panes in it
    UApplication application;
    application.AddDocTemplate(kareport::makeReportTemplate([&window] { return new TabPane(window.tabs()); },
                                                            [] { return std::make_unique<UReportView>(); }));
    UReportDoc *report = CreateReport(QStringLiteral("Levelling"), true, false, nullptr, 0, nullptr);
    if (report == nullptr) {
        return 1;
    }
    report->WriteLine(QStringLiteral("Bench mark 1   143.225"), 0, 1, 0);
    report->UpdateAllViews(nullptr); // shows what was written
    if (argc == 2 && qstrcmp(argv[1], "--once") == 0) {
        report->SetModifiedFlag(false); // nothing is asked
        QMetaObject::invokeMethod(&window, &QWidget::close, Qt::QueuedConnection);
    }
    return QApplication::exec(); // ends when the window has been closed
}
