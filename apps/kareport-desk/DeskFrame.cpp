#include "DeskFrame.h"

#include "AppMessageBox.h"
#include "COneViewPane.h"
#include "Folders.h"
#include "JobLauncher.h"
#include "Profile.h"
#include "ReportEntry.h"
#include "ReportResources.h"
#include "UApplication.h"
#include "UReportDoc.h"
#include "UView.h"
#include "Xlate.h"

#include <QCloseEvent>
#include <QDockWidget>
#include <QDragEnterEvent>
#include <QFileDialog>
#include <QFileInfo>
#include <QMenuBar>
#include <QMessageBox>
#include <QMimeData>
#include <QStatusBar>
#include <QToolBar>

namespace
{

enum CommandId : unsigned
{
    fileNew = 57600,
    fileOpen = 57601,
    fileClose = 57602,
    fileSave = 57603,
    fileSaveAs = 57604,
    filePageSetup = 57606,
    filePrint = 57607,
    filePrintPreview = 57609,
    editCopy = 57634,
    editCut = 57635,
    editFind = 57636,
    editPaste = 57637,
    editSelectAll = 57642,
    editUndo = 57643,
    windowNew = 57648,
    windowArrange = 57649,
    windowCascade = 57650,
    windowTileHorizontally = 57651,
    windowTileVertically = 57652,
    helpAbout = 57664,
    appExit = 57665,
    helpContents = 57670,
    viewToolBar = 59392,
    viewStatusBar = 59393,
    updateText = 32771
};

const QString lastFolderEntry = QStringLiteral("LastOpenDirectoryReport");
const QString layoutEntry = QStringLiteral("Window Layout");
const QString geometryEntry = QStringLiteral("Window Geometry");

} // namespace

DeskFrame::DeskFrame()
{
    commands_ = makeCommands();
    setWindowTitle(Xlate("KaReport"));
    setAcceptDrops(true);
    resize(1000, 760);
    makeMenus();
    statusBar()->showMessage(Xlate("Open a job or a saved report, or drop it here."));
    askFile = [this]() -> std::optional<QString> {
        const QString path = QFileDialog::getOpenFileName(this, Xlate("Open"), GetInitialOpenDir(lastFolderEntry),
                                                          Xlate("Reports and jobs (*.rep *.rtf *.json)") +
                                                              QStringLiteral(";;") + Xlate("All files (*)"));
        return path.isEmpty() ? std::nullopt : std::optional(path);
    };
    loadLayout();
    UpdateCommands();
}

DeskFrame::~DeskFrame() = default;

std::vector<kareport::Command> DeskFrame::makeCommands()
{
    const auto hasReport = [this](kareport::CommandState &state) { state.enabled = activeDocument() != nullptr; };
    return {
        {fileNew, [this] { newReport(); }, {}},
        {fileOpen, [this] { open(); }, {}},
        {appExit, [this] { close(); }, {}},
        {windowNew, [this] { newWindow(); }, hasReport},
        {windowCascade, [this] { cascade(); }, hasReport},
        {windowArrange, [this] { cascade(); }, hasReport},
        {windowTileHorizontally, [this] { arrange(Qt::Vertical); }, hasReport},
        {windowTileVertically, [this] { arrange(Qt::Horizontal); }, hasReport},
        {viewToolBar, [this] { toolBar_->setVisible(!toolBar_->isVisible()); },
         [this](kareport::CommandState &state) { state.checked = toolBar_->isVisible(); }},
        {viewStatusBar, [this] { statusBar()->setVisible(!statusBar()->isVisible()); },
         [this](kareport::CommandState &state) { state.checked = statusBar()->isVisible(); }},
        {helpAbout, [this] { about(); }, {}},
        {helpContents, [this] { about(); }, {}},
    };
}

void DeskFrame::makeMenus()
{
    QMenu *file = menuBar()->addMenu(Xlate("&File"));
    AddCommand(*file, fileNew, Xlate("&New\tCtrl+N"));
    AddCommand(*file, fileOpen, Xlate("&Open...\tCtrl+O"));
    AddCommand(*file, fileClose, Xlate("&Close\tCtrl+W"));
    AddCommand(*file, fileSave, Xlate("&Save\tCtrl+S"))->setIcon(kareport::reportIcon(kareport::commandSaveReport));
    AddCommand(*file, fileSaveAs, Xlate("Save &As...\tCtrl+Shift+S"));
    AddCommand(*file, updateText, Xlate("Update Text"));
    file->addSeparator();
    AddCommand(*file, filePrint, Xlate("&Print...\tCtrl+P"))
        ->setIcon(kareport::reportIcon(kareport::commandPrintReport));
    AddCommand(*file, filePrintPreview, Xlate("Print Pre&view"));
    AddCommand(*file, filePageSetup, Xlate("Pa&ge Setup..."));
    file->addSeparator();
    recentFiles_ = file->addMenu(Xlate("Recent File"));
    connect(file, &QMenu::aboutToShow, this, [this] { fillRecentFiles(); });
    file->addSeparator();
    AddCommand(*file, appExit, Xlate("E&xit\tCtrl+Q"));

    QMenu *edit = menuBar()->addMenu(Xlate("&Edit"));
    AddCommand(*edit, editUndo, Xlate("&Undo\tCtrl+Z"));
    edit->addSeparator();
    AddCommand(*edit, editCut, Xlate("Cu&t\tCtrl+X"));
    AddCommand(*edit, editCopy, Xlate("&Copy\tCtrl+C"));
    AddCommand(*edit, editPaste, Xlate("&Paste\tCtrl+V"));
    AddCommand(*edit, editSelectAll, Xlate("Select &All\tCtrl+A"));
    edit->addSeparator();
    AddCommand(*edit, editFind, Xlate("&Find...\tCtrl+F"));

    QMenu *view = menuBar()->addMenu(Xlate("&View"));
    AddCommand(*view, viewToolBar, Xlate("&Toolbar"))->setCheckable(true);
    AddCommand(*view, viewStatusBar, Xlate("&Status Bar"))->setCheckable(true);

    QMenu *window = menuBar()->addMenu(Xlate("&Window"));
    AddCommand(*window, windowNew, Xlate("&New Window"));
    AddCommand(*window, windowCascade, Xlate("&Cascade"));
    AddCommand(*window, windowTileHorizontally, Xlate("&Tile Horizontally"));
    AddCommand(*window, windowTileVertically, Xlate("Tile &Vertically"));
    AddCommand(*window, windowArrange, Xlate("&Arrange Icons"));

    QMenu *help = menuBar()->addMenu(Xlate("&Help"));
    AddCommand(*help, helpContents, Xlate("&Help\tF1"));
    AddCommand(*help, helpAbout, Xlate("&About..."));

    toolBar_ = addToolBar(Xlate("Toolbar"));
    toolBar_->setObjectName(QStringLiteral("toolbar"));
    toolBar_->addAction(CommandAction(fileSave));
    toolBar_->addAction(CommandAction(filePrint));
}

void DeskFrame::fillRecentFiles()
{
    recentFiles_->clear();
    const QStringList files = UApplication::Get()->GetRecentFileList();
    recentFiles_->setEnabled(!files.isEmpty());
    int number = 0;
    for (const QString &path : files) {
        recentFiles_->addAction(QStringLiteral("&%1 %2").arg(++number % 10).arg(path), this,
                                [this, path] { OpenFile(path); });
    }
}

UDocument *DeskFrame::activeDocument() const
{
    return GetActiveView() != nullptr ? GetActiveView()->GetDocument() : nullptr;
}

void DeskFrame::newReport()
{
    if (UReportDoc *report = CreateReport(Xlate("Report"), true, false, nullptr, 0, nullptr)) {
        activate(report);
    }
}

void DeskFrame::activate(UDocument *report)
{
    UApplication::Get()->SetCurrentReport(report);
    if (!report->GetViews().empty()) {
        SetActiveViewForFrameAndPane(report->GetViews().front());
    }
}

void DeskFrame::open()
{
    if (const auto path = askFile()) {
        SetLastOpenDir(*path, lastFolderEntry);
        OpenFile(*path);
    }
}

bool DeskFrame::OpenFile(const QString &path)
{
    UDocument *report = nullptr;
    QString error;
    if (path.endsWith(u".json", Qt::CaseInsensitive)) {
        report = kareport::launchJob(path, this, error);
        if (report != nullptr) {
            UApplication::Get()->AddToRecentFileList(path);
        }
    } else if (!QFileInfo(path).isFile()) {
        error = Xlate("There is no file \"%1\".").arg(path);
    } else {
        report = GetReportTemplate()->OpenReportDocumentFile(path, 1, 1, nullptr, 0, nullptr);
        error = report == nullptr ? Xlate("\"%1\" could not be opened.").arg(path) : QString();
    }
    if (!error.isEmpty()) {
        kareport::showMessage({error, QString(), MessageButtons::Ok, kareport::MessageIcon::None});
    }
    if (report != nullptr) {
        activate(report);
        statusBar()->clearMessage();
    }
    return report != nullptr;
}

void DeskFrame::newWindow()
{
    UDocument *document = activeDocument();
    if (CViewPane *pane = GetReportTemplate()->CreateNewPane(document, nullptr, 0, nullptr)) {
        GetReportTemplate()->InitialUpdatePane(pane, document, 1);
    }
}

void DeskFrame::arrange(Qt::Orientation orientation)
{
    QDockWidget *last = nullptr;
    for (QDockWidget *dock : findChildren<QDockWidget *>(QString(), Qt::FindDirectChildrenOnly)) {
        dock->setFloating(false);
        if (last == nullptr) {
            addDockWidget(Qt::TopDockWidgetArea, dock);
        } else {
            splitDockWidget(last, dock, orientation);
        }
        last = dock;
    }
}

void DeskFrame::cascade()
{
    QDockWidget *last = nullptr;
    for (QDockWidget *dock : findChildren<QDockWidget *>(QString(), Qt::FindDirectChildrenOnly)) {
        dock->setFloating(false);
        if (last != nullptr) {
            tabifyDockWidget(last, dock);
        }
        last = dock;
    }
}

void DeskFrame::about()
{
    QMessageBox::about(this, Xlate("About KaReport"),
                       Xlate("KaReport: fixed-pitch reports for civil engineering and surveying.\n\n"
                             "Open a job (.json) to run it, or a saved report (.rep, .rtf) to read, edit and print it. "
                             "Ctrl+F finds text, Ctrl+G goes to a page, Ctrl+wheel zooms."));
}

void DeskFrame::closeEvent(QCloseEvent *event)
{
    for (const auto &docTemplate : UApplication::Get()->GetDocTemplates()) {
        for (UDocument *document : docTemplate->GetDocuments()) {
            if (!document->SaveModified()) {
                event->ignore();
                return;
            }
        }
    }
    saveLayout();
    for (const auto &docTemplate : UApplication::Get()->GetDocTemplates()) {
        docTemplate->CloseAllDocuments();
    }
    event->accept();
}

void DeskFrame::dragEnterEvent(QDragEnterEvent *event)
{
    if (event->mimeData()->hasUrls()) {
        event->acceptProposedAction();
    }
}

void DeskFrame::dropEvent(QDropEvent *event)
{
    event->acceptProposedAction();
    for (const QUrl &url : event->mimeData()->urls()) {
        if (url.isLocalFile()) {
            OpenFile(url.toLocalFile());
        }
    }
}

void DeskFrame::loadLayout()
{
    restoreGeometry(QByteArray::fromBase64(GetProfileString(QString(), geometryEntry).toLatin1()));
    restoreState(QByteArray::fromBase64(GetProfileString(QString(), layoutEntry).toLatin1()));
}

void DeskFrame::saveLayout() const
{
    WriteProfileString(QString(), geometryEntry, QString::fromLatin1(saveGeometry().toBase64()));
    WriteProfileString(QString(), layoutEntry, QString::fromLatin1(saveState().toBase64()));
}
