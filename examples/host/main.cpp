// A small host: makes a report of its own lines and one through a template, and saves both into a folder. With --window it
// does so in a window, and makes one more report that is shown while it is written; without, it needs no display.
#include <KaReport/AppMessageBox.h>
#include <KaReport/COneViewPane.h>
#include <KaReport/DefaultPrinter.h>
#include <KaReport/Folders.h>
#include <KaReport/Language.h>
#include <KaReport/PlainWidgets.h>
#include <KaReport/Profile.h>
#include <KaReport/ReportEntry.h>
#include <KaReport/ReportInitialTemplate.h>
#include <KaReport/ReportMenu.h>
#include <KaReport/ReportWindowEntry.h>
#include <KaReport/SaveDialog.h>
#include <KaReport/UApplication.h>
#include <KaReport/UDataObjectList.h>
#include <KaReport/UJobSettings.h>
#include <KaReport/UPointNumber.h>
#include <KaReport/UReportDoc.h>
#include <KaReport/UView.h>
#include <KaReport/UXTPMDIFrameWnd.h>

#include <QApplication>
#include <QCloseEvent>
#include <QFileDialog>
#include <QMenuBar>
#include <QPlainTextEdit>
#include <QPointer>

#include <cstdio>

UReportDoc *writeByLines()
{
    UReportDoc *report = CreateReport(QStringLiteral("Traverse"), true, false, nullptr, 0, nullptr);
    if (report != nullptr) {
        report->SetHeading(QStringLiteral("From  To     Distance"), 0, 2); // under the header of every page
        report->WriteLine(QStringLiteral("1     2       152.438"), 0, 1, 0);
        report->NewPage(4); // a new page unless more than four lines are left
        report->WriteLine(QStringLiteral("Closed on point 1"), 1, 1, 1);
        report->UpdateAllViews(nullptr); // shows what was written
    }
    return report;
}

void addPoint(UDataObjectList &points, const char *number, double station, double offset, bool isDone)
{
    UDataObject &point = points.Add();
    point.Set(1, UPointNumber(QString::fromLatin1(number))); // by the identifiers of the template's dictionary
    point.Set(2, station);                                   // metres
    point.Set(3, offset);
    point.Set(9, isDone);
}

UReportDoc *writeByTemplate()
{
    UReportDoc *report = CreateReport(QString(), true, false, nullptr, 0, nullptr);
    if (report == nullptr ||
        !report->LoadTemplateXml(QStringLiteral("survey.xml"), QStringLiteral("STAKEOUT"), QString(), QString()))
    {
        return nullptr;
    }
    UJobSettings settings;
    settings.stationDecimals = 2;
    report->SetJobSettings(settings);
    report->SetZeroBlank(true); // a number that is not there counts as 0
    UDataObject site;
    site.Set(1, QStringLiteral("Harbour road"));
    report->WriteDataBlock(QStringLiteral("Site"), &site, 0, 1);
    UDataObjectList points;
    addPoint(points, "12", 140.0, 3.75, false);
    addPoint(points, "11", 120.5, -3.75, true);
    report->WriteDataTable(QStringLiteral("Points"), &points, 1, 1, -1); // sorted as the table says
    report->UpdateAllViews(nullptr);
    return report;
}

void writeInWindow()
{
    UReportDoc *report = CreateReportWindow(QStringLiteral("Levelling"), true, false);
    for (int station = 1; station <= 500 && UReportDoc::IsReportAvailable(report); ++station) {
        report->WriteLine(QStringLiteral("Station %1").arg(station), 0, 1, 0);
        QApplication::processEvents(); // the lines appear; the user may close the report
    }
    if (UReportDoc::IsReportAvailable(report)) {
        report->SetReportWindowActive(); // it can be saved, opened and printed now
    }
}

bool save(UReportDoc *report, const QString &path)
{
    const bool isSaved = report != nullptr && report->OnSaveDocument(path + QStringLiteral(".pdf")) &&
                         report->OnSaveDocument(path + QStringLiteral(".rep"));
    std::printf("%s %s\n", qUtf8Printable(path), isSaved ? "saved" : "not saved");
    return isSaved;
}

/// A view of the program's own.
class NotesView : public UView
{
public:
    ~NotesView() override
    {
        if (edit_ != nullptr) {
            edit_->deleteLater(); // it may be in the middle of the key that closes its pane
        }
    }
    QWidget *GetWidget() override { return edit_; }

private:
    QPointer<QPlainTextEdit> edit_ = new QPlainTextEdit; // goes with a frame that goes first
};

COneViewPane *showNotes()
{
    auto *pane = new COneViewPane;
    pane->SetPlace(nullptr, 0, nullptr); // docks it, as a tab beside the reports
    pane->AddView(std::make_unique<NotesView>());
    pane->SetWindowTextW(QStringLiteral("Notes"));
    pane->ShowPane(true);
    return pane; // it owns itself until it is closed
}

class Frame : public UXTPMDIFrameWnd
{
public:
    Frame()
    {
        const kareport::ReportMenu menu = kareport::addReportMenu(*this, *menuBar()); // handled by the report's view
        AddCommand(*menu.edit, 57636, QStringLiteral("&Find...\tCtrl+F"));
        kareport::setMessageBox(
            [this](const kareport::Message &message) { return kareport::showMessageBox(this, message); });
        kareport::setSaveDialog([this](const kareport::SaveRequest &request) -> std::optional<QString> {
            const QString path = QFileDialog::getSaveFileName(this, QString(), request.initialFolder);
            return path.isEmpty() ? std::nullopt : std::optional(path);
        });
        resize(1000, 700);
        show();
        notes_ = showNotes();
    }
    ~Frame() override
    {
        if (CViewPane::IsOpen(notes_)) { // not if the user has closed it
            notes_->ClosePane();
        }
    }

protected:
    void closeEvent(QCloseEvent *event) override
    {
        for (UDocument *report : std::vector(GetReportTemplate()->GetDocuments())) {
            if (!event->isAccepted() || !UApplication::Get()->IsOpen(report)) {
                continue; // cancelled, or it was closed while the user was asked about another one
            }
            // The user may cancel. A report that is closed while he is asked keeps nothing open.
            event->setAccepted(report->SaveModified() || !UApplication::Get()->IsOpen(report));
        }
        if (!event->isAccepted()) {
            kareport::noteExitCancelled();
        }
    }

private:
    COneViewPane *notes_;
};

int main(int argc, char **argv)
{
    const bool hasWindow = argc == 3 && qstrcmp(argv[1], "--window") == 0;
    if (argc != 2 && !hasWindow) {
        return std::fputs("host [--window] FOLDER\n", stderr), 1;
    }
    if (!hasWindow) {
        qputenv("QT_QPA_PLATFORM", "offscreen"); // a page is measured with a font, which needs no screen
        kareport::setDefaultPrinter({kareport::PrinterSource::BuiltIn, kareport::PaperSize::A4});
    }
    QApplication qt(argc, argv);
    kareport::setLanguage(QString()); // the system's
    kareport::setProfileStore(kareport::makeMemoryProfile());
    kareport::setLibraryDir(QStringLiteral(HOST_TEMPLATES));
    UApplication application;
    application.AddDocTemplate(hasWindow ? ReportInitialTemplate() : kareport::makeReportTemplate());
    const auto frame = hasWindow ? std::make_unique<Frame>() : nullptr;
    const QString folder = QString::fromLocal8Bit(argv[argc - 1]);
    bool isSaved = save(writeByLines(), folder + QStringLiteral("/traverse"));
    isSaved = save(writeByTemplate(), folder + QStringLiteral("/stakeout")) && isSaved;
    if (hasWindow) {
        QMetaObject::invokeMethod(&qt, writeInWindow, Qt::QueuedConnection);
        QApplication::exec();
    }
    return isSaved ? 0 : 1;
}
