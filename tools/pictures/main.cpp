// Draws every window of the programs into PNG files, to be looked at and for the guides.
#include "AboutDialog.h"
#include "CommandList.h"
#include "DeskApplication.h"
#include "DeskCommandIds.h"
#include "DeskFrame.h"
#include "FilePlace.h"
#include "FindBar.h"
#include "HelpWindow.h"
#include "ImportPanel.h"
#include "NotesPane.h"
#include "OpenTemplate.h"
#include "PageBar.h"
#include "PageDefaults.h"
#include "PageSetupDialog.h"
#include "PreferencesDialog.h"
#include "PrintProgress.h"
#include "Profile.h"
#include "ProgramIcon.h"
#include "Readable.h"
#include "ReportEdit.h"
#include "ReportPrinter.h"
#include "ReportViewWidget.h"
#include "ServerDialog.h"
#include "SheetReportView.h"
#include "TemplateDialog.h"
#include "TemplateFindBar.h"
#include "TemplatePage.h"
#include "TemplateTextEdit.h"
#include "TemplateWindow.h"
#include "UReportDoc.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"

#include <QApplication>
#include <QComboBox>
#include <QCommandLineParser>
#include <QDir>
#include <QEventLoop>
#include <QFile>
#include <QFileInfo>
#include <QLineEdit>
#include <QMenu>
#include <QMenuBar>
#include <QScrollBar>
#include <QStyleFactory>
#include <QTabWidget>
#include <QTableWidget>
#include <QTemporaryDir>
#include <QTimer>
#include <QToolBar>

#include <cstdio>

namespace
{

QPalette darkPalette()
{
    QPalette palette(QColor(53, 53, 53), QColor(42, 42, 42));
    palette.setColor(QPalette::Base, QColor(30, 30, 30));
    palette.setColor(QPalette::AlternateBase, QColor(40, 40, 40));
    palette.setColor(QPalette::Text, Qt::white);
    palette.setColor(QPalette::WindowText, Qt::white);
    palette.setColor(QPalette::ButtonText, Qt::white);
    palette.setColor(QPalette::PlaceholderText, QColor(150, 150, 150));
    palette.setColor(QPalette::Highlight, QColor(61, 142, 201));
    palette.setColor(QPalette::HighlightedText, Qt::white);
    palette.setColor(QPalette::ToolTipBase, QColor(60, 60, 60));
    palette.setColor(QPalette::ToolTipText, Qt::white);
    for (const auto role : {QPalette::Text, QPalette::WindowText, QPalette::ButtonText}) {
        palette.setColor(QPalette::Disabled, role, QColor(130, 130, 130));
    }
    return palette;
}

class Pictures
{
public:
    Pictures(QString folder, QString suffix) : folder_(std::move(folder)), suffix_(std::move(suffix)) {}

    void take(QWidget &window, const char *name)
    {
        window.show();
        // Lines of a report window are shown a moment after they were written.
        constexpr int moment = 150; // milliseconds
        QEventLoop wait;
        QTimer::singleShot(moment, &wait, &QEventLoop::quit);
        wait.exec();
        const QString path = QDir(folder_).filePath(QString::fromLatin1(name) + suffix_ + QStringLiteral(".png"));
        isWritten_ = window.grab().save(path) && isWritten_;
        std::printf("%s\n", qPrintable(path));
    }
    bool isWritten() const { return isWritten_; }

private:
    QString folder_;
    QString suffix_;
    bool isWritten_ = true;
};

void takeSheets(Pictures &pictures, DeskFrame &frame)
{
    auto *view = dynamic_cast<kareport::SheetReportView *>(frame.GetActiveView());
    if (view == nullptr) {
        return;
    }
    frame.OnCommand(kareport::viewPageLinesCommand);
    auto &window = *dynamic_cast<kareport::ReportViewWidget *>(view->GetWidget());
    window.goToPage(2);
    view->GetEdit().verticalScrollBar()->setValue(view->GetEdit().verticalScrollBar()->value() - 12);
    pictures.take(frame, "desk-page-lines");
    frame.OnCommand(kareport::viewPageLinesCommand);
    frame.OnCommand(kareport::viewSheetsBesideCommand);
    pictures.take(frame, "desk-sheets");
    frame.OnCommand(kareport::viewSheetsCommand);
    window.openFindBar();
    window.findBar().field().setText(QStringLiteral("12"));
    pictures.take(frame, "desk-sheets-alone");
    window.findBar().close();
    frame.OnCommand(kareport::fitPageCommand);
    pictures.take(frame, "desk-sheets-page");
    frame.OnCommand(kareport::viewSheetsCommand);
    window.goToPage(1);
}

void takeCommands(Pictures &pictures, DeskFrame &frame)
{
    kareport::CommandList list(kareport::listedCommands(*frame.menuBar()), &frame);
    pictures.take(list, "commands");
    list.findChild<QLineEdit *>()->setText(QStringLiteral("undo"));
    pictures.take(list, "commands-reason");
    kareport::HelpWindow help(&frame);
    help.showPlace(QStringLiteral("guide-desk.md"));
    pictures.take(help, "help");
    help.showPlace(QStringLiteral("guide-desk.md#keys"));
    pictures.take(help, "help-keys");
    kareport::AboutDialog about(&frame);
    pictures.take(about, "about");
}

/// The program's icon in the sizes in which it is installed.
bool writeIcons(const QString &folder)
{
    bool isWritten = true;
    for (const int size : kareport::programIconSizes) {
        const QString place = QStringLiteral("%1/%2x%2").arg(folder).arg(size);
        QDir().mkpath(place);
        isWritten = kareport::programPicture(size).save(place + QStringLiteral("/kareport.png")) && isWritten;
    }
    return isWritten;
}

void takeDesk(Pictures &pictures, const QString &examples)
{
    DeskApplication application;
    DeskFrame frame;
    frame.resize(1000, 760);
    for (const char *name : {"control-metric.json", "traverse-gon.json"}) {
        application.AddToRecentFileList(QDir(examples).filePath(QString::fromLatin1(name)));
    }
    application.AddToRecentFileList(QDir::home().filePath(QStringLiteral("survey/lot 7, as built.rep")));
    frame.hide(); // the files of the start page are looked at when it is shown
    pictures.take(frame, "desk-start");
    takeCommands(pictures, frame);
    frame.OnCommand(kareport::keepReportWindowCommand);
    frame.OpenFile(QDir(examples).filePath(QStringLiteral("stakeout.json")));
    pictures.take(frame, "report-window");
    frame.OnCommand(kareport::keepReportWindowCommand);
    auto *report = dynamic_cast<UReportDoc *>(application.GetCurrentReport());
    if (auto *window = dynamic_cast<UReportWindowDlg *>(report->GetReportWindow())) {
        window->GetDock()->setFloating(true);
        pictures.take(*window->GetDock(), "report-window-floating");
        window->ShowReport();
    }
    frame.SetActiveViewForFrameAndPane(report->GetViews().front());
    pictures.take(frame, "desk-report");
    for (QAction *menu : frame.menuBar()->actions()) {
        menu->menu()->popup(QPoint());
        pictures.take(*menu->menu(), qPrintable(QStringLiteral("desk-menu-") + menu->text().remove(u'&').toLower()));
        menu->menu()->close();
    }
    auto *view = dynamic_cast<UReportView *>(frame.GetActiveView());
    if (view != nullptr) {
        auto &window = *dynamic_cast<kareport::ReportViewWidget *>(view->GetWidget());
        window.openFindBar();
        window.findBar().field().setText(QStringLiteral("12"));
        pictures.take(frame, "desk-find");
        window.findBar().close();
        window.openPageBar();
        pictures.take(frame, "desk-page");
        window.pageBar().close();
    }
    takeSheets(pictures, frame);
    frame.OnCommand(kareport::windowNewCommand);
    frame.OnCommand(kareport::windowTileVerticallyCommand);
    pictures.take(frame, "desk-tiled");
    frame.OnCommand(kareport::windowCascadeCommand);
    frame.OpenFile(QDir(examples).filePath(QStringLiteral("control-metric.json")));
    pictures.take(frame, "desk-tabs");
    for (UDocument *document : application.GetDocTemplates().front()->GetDocuments()) {
        document->SetModifiedFlag(false);
    }
}

/// Several report windows that are kept.
void takeReportWindows(Pictures &pictures, const QString &examples)
{
    DeskApplication application;
    DeskFrame frame;
    frame.resize(1000, 760);
    frame.OnCommand(kareport::keepReportWindowCommand);
    for (const char *name : {"control-metric.json", "traverse-gon.json", "stakeout.json"}) {
        frame.OpenFile(QDir(examples).filePath(QString::fromLatin1(name)));
    }
    pictures.take(frame, "report-windows");
    frame.OnCommand(kareport::keepReportWindowCommand);
    for (UDocument *document : application.GetDocTemplates().front()->GetDocuments()) {
        document->SetModifiedFlag(false);
    }
}

/// The editor of a template: as it is opened, with what can be written, and with a text that is broken.
void takeTemplateEditor(Pictures &pictures, const QString &examples)
{
    kareport::TemplateWindow &window = *new kareport::TemplateWindow;
    window.load(QDir(examples).filePath(QStringLiteral("survey.xml")));
    window.setData({QDir(examples).filePath(QStringLiteral("control-metric.json"))});
    const auto putAfter = [&window](const char *text) {
        const qsizetype at = window.edit().wholeText().indexOf(QString::fromLatin1(text)) + qsizetype(qstrlen(text));
        window.edit().select({at, at});
    };
    pictures.take(window, "template-editor-first");
    putAfter("<Label>Northing");
    pictures.take(window, "template-editor");
    putAfter("<Align>RIGHT");
    window.edit().complete(true);
    pictures.take(window, "template-editor-complete");
    window.edit().insertPlainText(QStringLiteral("S"));
    putAfter("<Use>Point");
    window.edit().insertPlainText(QStringLiteral("s"));
    window.findBar().open();
    window.findBar().field().setText(QStringLiteral("Northing"));
    pictures.take(window, "template-editor-broken");
    window.updateCommands();
    kareport::CommandList list(kareport::listedCommands(*window.menuBar()), &window);
    list.findChild<QLineEdit *>()->setText(QStringLiteral("insert"));
    pictures.take(list, "template-editor-commands");
    window.edit().document()->setModified(false);
    window.close();
}

bool put(const QString &path, const QByteArray &content)
{
    QFile file(path);
    return file.open(QIODevice::WriteOnly) && file.write(content) == content.size();
}

/// A report that there is something to say of, and data some of which does not fit.
void takeNotes(Pictures &pictures, const QString &examples)
{
    const QTemporaryDir folder;
    const QString data = folder.filePath(QStringLiteral("points.csv"));
    const QString job = folder.filePath(QStringLiteral("points.json"));
    const QString survey = QFileInfo(QDir(examples).filePath(QStringLiteral("survey.xml"))).absoluteFilePath();
    put(data, "Number,Northing,Easting,Elev,Description\n"
              "101,5000123.250,400012.5,100.25,nail in kerb\n"
              "102,5000124.750,123456789012345.5,100.5,a description that is much too long for its column\n"
              "103,,400014.5,100.75,bolt\n");
    put(job, R"({"title": "Control points", "template": {"file": ")" + survey.toUtf8() + R"(", "name": "CONTROL"},
        "data": {"p": {"csv": "points.csv"}}, "report": [{"table": "Points", "data": "p"}]})");
    DeskApplication application;
    DeskFrame frame;
    frame.OpenFile(job);
    auto *report = dynamic_cast<UReportDoc *>(application.GetCurrentReport());
    auto *window = report != nullptr ? dynamic_cast<UReportWindowDlg *>(report->GetReportWindow()) : nullptr;
    if (window != nullptr && window->isCreated()) {
        window->ShowReport();
    }
    frame.runs().showFront();
    frame.runs().notesPane().open();
    pictures.take(frame, "desk-notes");
    kareport::showFilePlace(&frame, data, {3, 16});
    if (auto *place = frame.findChild<QDialog *>()) {
        pictures.take(*place, "file-place");
        place->close();
    }
    for (UDocument *document : application.GetDocTemplates().front()->GetDocuments()) {
        document->SetModifiedFlag(false);
    }
    put(data, "Pt;North;East;Height;Remark\n101;5000123,250;400012,5;100,25;nail in kerb\n"
              "102;5000124,750;four;100,5;bolt\n103;5000125,5;400014,5;100,75;bolt\n");
    kareport::TemplateDialog fromTemplate;
    fromTemplate.setTemplateFile(survey);
    fromTemplate.setData(data);
    const QStringList variables = {QStringLiteral("Number"), QStringLiteral("Northing"), QStringLiteral("Easting"),
                                   QStringLiteral("Elevation")};
    auto *import = fromTemplate.findChild<kareport::ImportPanel *>();
    for (int column = 0; column < import->table().columnCount() && column < variables.size(); ++column) {
        if (auto *box = qobject_cast<QComboBox *>(import->table().cellWidget(0, column))) {
            box->setCurrentIndex(box->findData(variables[column]));
        }
    }
    pictures.take(fromTemplate, "template-cells");
}

void takeDialogs(Pictures &pictures, const QString &examples)
{
    kareport::PreferencesDialog preferences(kareport::loadPreferences());
    auto *tabs = preferences.findChild<QTabWidget *>();
    const char *const names[] = {"preferences-units", "preferences-page", "preferences-editor", "preferences-program"};
    for (int i = 0; i < tabs->count(); ++i) {
        tabs->setCurrentIndex(i);
        pictures.take(preferences, names[i]);
    }
    kareport::TemplateDialog fromTemplate;
    fromTemplate.setTemplateFile(QDir(examples).filePath(QStringLiteral("survey.xml")));
    fromTemplate.setData(QDir(examples).filePath(QStringLiteral("data/control.csv")));
    pictures.take(fromTemplate, "template");
    fromTemplate.setTemplateFile(QDir(examples).filePath(QStringLiteral("data/control.csv")));
    pictures.take(fromTemplate, "template-wrong");
    fromTemplate.setTemplateFile(QDir(examples).filePath(QStringLiteral("landxml.xml")));
    fromTemplate.setData(QDir(examples).filePath(QStringLiteral("data/road.xml")));
    const auto choose = [&](const char *name, const char *value) {
        for (auto *box : fromTemplate.findChildren<QComboBox *>()) {
            if (box->accessibleName() == QString::fromLatin1(name)) {
                box->setCurrentIndex(box->findData(QString::fromLatin1(value)));
            }
        }
    };
    choose("Template", "STATIONS");
    choose("List", "stations");
    choose("Alignment", "RR-1");
    choose("Surface", "ground");
    pictures.take(fromTemplate, "template-landxml");
    kareport::ServerDialog server(QStringLiteral("host=data.example dbname=survey user=anna sslmode=require"));
    pictures.take(server, "server");
    kareport::PageSetup setup;
    setup.margins = kareport::defaultMargins;
    kareport::fillPrinters(setup);
    setup.printers = {QStringLiteral("Office"), QStringLiteral("Plotter")};
    kareport::PageSetupDialog pageSetup(setup);
    pictures.take(pageSetup, "page-setup");
}

} // namespace

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication application(argc, argv);
    QApplication::setApplicationName(QStringLiteral("KaReport"));
    QCommandLineParser parser;
    parser.addPositionalArgument(QStringLiteral("FOLDER"), QStringLiteral("where the pictures go"));
    const QCommandLineOption dark(QStringLiteral("dark"), QStringLiteral("light text on a dark background"));
    const QCommandLineOption examples(QStringLiteral("examples"), QStringLiteral("folder of the examples"),
                                      QStringLiteral("FOLDER"), QStringLiteral("examples"));
    const QCommandLineOption suffix(QStringLiteral("suffix"), QStringLiteral("of the files' names"),
                                    QStringLiteral("TEXT"));
    const QCommandLineOption icons(QStringLiteral("icons"), QStringLiteral("writes the program's icons alone"));
    parser.addOptions({dark, examples, suffix, icons});
    parser.process(application);
    QApplication::setStyle(QStyleFactory::create(QStringLiteral("Fusion")));
    if (parser.isSet(dark)) {
        QApplication::setPalette(darkPalette());
    }
    QApplication::setPalette(kareport::readablePalette(QApplication::palette()));
    kareport::setProfileStore(kareport::makeMemoryProfile());
    const QString folder = parser.positionalArguments().value(0, QStringLiteral("."));
    if (parser.isSet(icons)) {
        return writeIcons(folder) ? 0 : 1;
    }
    QDir().mkpath(folder);
    Pictures pictures(folder, parser.value(suffix));
    takeDesk(pictures, parser.value(examples));
    takeReportWindows(pictures, parser.value(examples));
    takeTemplateEditor(pictures, parser.value(examples));
    takeNotes(pictures, parser.value(examples));
    takeDialogs(pictures, parser.value(examples));
    return pictures.isWritten() ? 0 : 1;
}
