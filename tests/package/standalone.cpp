// A program without a main window: its reports are windows on the desktop, and it ends with the last of them.
#include <KaReport/COneViewPane.h>
#include <KaReport/DefaultPrinter.h>
#include <KaReport/Profile.h>
#include <KaReport/ReportEntry.h>
#include <KaReport/ReportInitialTemplate.h>
#include <KaReport/UApplication.h>
#include <KaReport/UReportDoc.h>

#include <QApplication>
#include <QTimer>

#include <cstdio>

namespace
{

class Application : public UApplication
{
public:
    void OnDocumentEvent(UDocument & /*document*/, UDocument::DocumentEvent event) override
    {
        // The document that is closed is still counted here.
        if (event == UDocument::DocumentEvent::AfterCloseDocument && GetDocuments().size() == 1) {
            QMetaObject::invokeMethod(qApp, &QCoreApplication::quit, Qt::QueuedConnection);
        }
    }
};

/// Closes a report's pane as its close box does.
void closePane(const UReportDoc *report)
{
    if (auto *pane = dynamic_cast<COneViewPane *>(report->GetFrameWindow())) {
        pane->GetDock()->close();
    }
}

} // namespace

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication qt(argc, argv);
    kareport::setProfileStore(kareport::makeMemoryProfile());
    kareport::setDefaultPrinter({kareport::PrinterSource::BuiltIn});
    Application application;
    application.AddDocTemplate(ReportInitialTemplate());
    UReportDoc *first = CreateReport(QStringLiteral("First"), true, false, nullptr, 0, nullptr);
    UReportDoc *second = CreateReport(QStringLiteral("Second"), true, false, nullptr, 0, nullptr);
    if (first == nullptr || second == nullptr) {
        return 1;
    }
    bool isClosed = false;
    QTimer::singleShot(0, [&] {
        closePane(first);
        QTimer::singleShot(200, [&] {
            isClosed = true; // with one of two, the program has gone on
            closePane(second);
        });
    });
    QTimer::singleShot(60'000, [] { QCoreApplication::exit(2); });
    const int status = QApplication::exec();
    std::printf("status %d, both closed by hand: %d\n", status, int(isClosed));
    return status == 0 && isClosed ? 0 : 1;
}
