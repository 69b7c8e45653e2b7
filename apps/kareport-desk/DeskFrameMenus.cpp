#include "DeskFrame.h"

#include "DeskCommandIds.h"
#include "PlainWidgets.h"
#include "ReportResources.h"
#include "UApplication.h"
#include "Xlate.h"

#include <QMenuBar>
#include <QStatusBar>
#include <QToolBar>

std::vector<kareport::Command> DeskFrame::makeCommands()
{
    using namespace kareport;
    const auto hasReport = [this](CommandState &state) { state.enabled = activeDocument() != nullptr; };
    return {
        {fileNewCommand, [this] { newReport(); }, {}},
        {fileOpenCommand, [this] { open(); }, {}},
        {fileFromTemplateCommand, [this] { fromTemplate(QString()); }, {}},
        {preferencesCommand, [this] { askPreferences(); }, {}},
        {exitCommand, [this] { close(); }, {}},
        {windowNewCommand, [this] { newWindow(); }, hasReport},
        {windowCascadeCommand, [this] { cascade(); }, hasReport},
        {windowArrangeCommand, [this] { cascade(); }, hasReport},
        {windowTileHorizontallyCommand, [this] { arrange(Qt::Vertical); }, hasReport},
        {windowTileVerticallyCommand, [this] { arrange(Qt::Horizontal); }, hasReport},
        {viewToolBarCommand, [this] { toolBar_->setVisible(!toolBar_->isVisible()); },
         [this](CommandState &state) { state.checked = toolBar_->isVisible(); }},
        {viewStatusBarCommand, [this] { statusBar()->setVisible(!statusBar()->isVisible()); },
         [this](CommandState &state) { state.checked = statusBar()->isVisible(); }},
        {helpAboutCommand, [this] { about(); }, {}},
        {helpContentsCommand, [this] { about(); }, {}},
    };
}

void DeskFrame::makeMenus()
{
    using namespace kareport;
    QMenu *file = menuBar()->addMenu(Xlate("&File"));
    AddCommand(*file, fileNewCommand, Xlate("&New\tCtrl+N"));
    AddCommand(*file, fileFromTemplateCommand, Xlate("New from &Template...\tCtrl+T"));
    AddCommand(*file, fileOpenCommand, Xlate("&Open...\tCtrl+O"));
    AddCommand(*file, fileCloseCommand, Xlate("&Close\tCtrl+W"));
    AddCommand(*file, fileSaveCommand, Xlate("&Save\tCtrl+S"))->setIcon(reportIcon(commandSaveReport));
    AddCommand(*file, fileSaveAsCommand, Xlate("Save &As...\tCtrl+Shift+S"));
    AddCommand(*file, updateTextCommand, Xlate("Update Text"));
    file->addSeparator();
    AddCommand(*file, filePrintCommand, Xlate("&Print...\tCtrl+P"))->setIcon(reportIcon(commandPrintReport));
    AddCommand(*file, printPreviewCommand, Xlate("Print Pre&view"));
    AddCommand(*file, pageSetupCommand, Xlate("Pa&ge Setup..."));
    file->addSeparator();
    recentFiles_ = file->addMenu(Xlate("Recent File"));
    connect(file, &QMenu::aboutToShow, this, [this] { fillRecentFiles(); });
    file->addSeparator();
    AddCommand(*file, exitCommand, Xlate("E&xit\tCtrl+Q"));

    QMenu *edit = menuBar()->addMenu(Xlate("&Edit"));
    AddCommand(*edit, undoCommand, Xlate("&Undo\tCtrl+Z"));
    AddCommand(*edit, redoCommand, Xlate("&Redo\tCtrl+Shift+Z"));
    edit->addSeparator();
    AddCommand(*edit, cutCommand, Xlate("Cu&t\tCtrl+X"));
    AddCommand(*edit, copyCommand, Xlate("&Copy\tCtrl+C"));
    AddCommand(*edit, pasteCommand, Xlate("&Paste\tCtrl+V"));
    AddCommand(*edit, selectAllCommand, Xlate("Select &All\tCtrl+A"));
    edit->addSeparator();
    AddCommand(*edit, findCommand, Xlate("&Find...\tCtrl+F"));
    AddCommand(*edit, findNextCommand, Xlate("Find &Next\tF3"));
    AddCommand(*edit, findPreviousCommand, Xlate("Find Pre&vious\tShift+F3"));
    AddCommand(*edit, goToPageCommand, Xlate("&Go to Page...\tCtrl+G"));
    edit->addSeparator();
    AddCommand(*edit, preferencesCommand, Xlate("Pr&eferences...\tCtrl+,"));

    QMenu *view = menuBar()->addMenu(Xlate("&View"));
    AddCommand(*view, viewToolBarCommand, Xlate("&Toolbar"))->setCheckable(true);
    AddCommand(*view, viewStatusBarCommand, Xlate("&Status Bar"))->setCheckable(true);
    view->addSeparator();
    AddCommand(*view, zoomInCommand, Xlate("Zoom &In\tCtrl++"));
    AddCommand(*view, zoomOutCommand, Xlate("Zoom &Out\tCtrl+-"));
    AddCommand(*view, zoomResetCommand, Xlate("&Usual Size\tCtrl+0"));

    QMenu *window = menuBar()->addMenu(Xlate("&Window"));
    AddCommand(*window, windowNewCommand, Xlate("&New Window"));
    AddCommand(*window, windowCascadeCommand, Xlate("&Cascade"));
    AddCommand(*window, windowTileHorizontallyCommand, Xlate("&Tile Horizontally"));
    AddCommand(*window, windowTileVerticallyCommand, Xlate("Tile Vertically"));
    AddCommand(*window, windowArrangeCommand, Xlate("&Arrange Icons"));

    QMenu *help = menuBar()->addMenu(Xlate("&Help"));
    AddCommand(*help, helpContentsCommand, Xlate("&Help\tF1"));
    AddCommand(*help, helpAboutCommand, Xlate("&About..."));

    toolBar_ = addToolBar(Xlate("Toolbar"));
    toolBar_->setObjectName(QStringLiteral("toolbar"));
    toolBar_->addAction(CommandAction(fileSaveCommand));
    toolBar_->addAction(CommandAction(filePrintCommand));
}

void DeskFrame::fillRecentFiles()
{
    recentFiles_->clear();
    const QStringList files = UApplication::Get()->GetRecentFileList();
    recentFiles_->setEnabled(!files.isEmpty());
    int number = 0;
    for (const QString &path : files) {
        recentFiles_->addAction(QStringLiteral("&%1 ").arg(++number % 10) + kareport::plainMenuText(path), this,
                                [this, path] { OpenFile(path); });
    }
}
