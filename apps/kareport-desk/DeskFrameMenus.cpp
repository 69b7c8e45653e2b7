#include "DeskFrame.h"

#include "DeskCommandIds.h"
#include "DeskSheets.h"
#include "PlainWidgets.h"
#include "ReportMenu.h"
#include "ReportResources.h"
#include "UApplication.h"
#include "Xlate.h"

#include <QMenuBar>
#include <QStatusBar>
#include <QToolBar>

std::vector<kareport::Command> DeskFrame::makeCommands()
{
    using namespace kareport;
    std::vector<Command> commands = sheetCommands(*this);
    const auto hasReport = [this](CommandState &state) { state.enabled = GetCommandDocument() != nullptr; };
    const std::vector<Command> own = {
        {fileNewCommand, [this] { newReport(); }, {}},
        {fileOpenCommand, [this] { open(); }, {}},
        {fileFromTemplateCommand, [this] { fromTemplate(QString()); }, {}},
        {fileExportCommand, [this] { exportValues(); },
         [this](CommandState &state) { state.enabled = runs_.recipeInFront() != nullptr; }},
        {preferencesCommand, [this] { askPreferences(); }, {}},
        {recentFileCommand,
         {},
         [](CommandState &state) { state.enabled = !UApplication::Get()->GetRecentFileList().isEmpty(); }},
        {exitCommand, [this] { close(); }, {}},
        {nextReportCommand, [this] { stepReport(1); }, hasReport},
        {previousReportCommand, [this] { stepReport(-1); }, hasReport},
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
    commands.insert(commands.begin(), own.begin(), own.end());
    const std::vector<Command> ofRuns = runs_.commands();
    commands.insert(commands.end(), ofRuns.begin(), ofRuns.end());
    return commands;
}

void DeskFrame::makeMenus()
{
    using namespace kareport;
    const ReportMenu menu = addReportMenu(*this, *menuBar());
    const auto insert = [this](QMenu &into, unsigned before, unsigned id, const QString &text) {
        into.insertAction(CommandAction(before), AddCommand(into, id, text));
    };
    insert(*menu.file, fileOpenCommand, fileFromTemplateCommand, Xlate("New from &Template...\tCtrl+T"));
    insert(*menu.file, updateTextCommand, fileExportCommand, Xlate("&Export Values...\tCtrl+E"));
    CommandAction(fileCloseCommand)->setShortcut(QKeySequence(QStringLiteral("Ctrl+W")));
    CommandAction(fileSaveAsCommand)->setShortcut(QKeySequence(QStringLiteral("Ctrl+Shift+S")));
    CommandAction(exitCommand)->setShortcut(QKeySequence(QStringLiteral("Ctrl+Q")));
    CommandAction(helpContentsCommand)->setShortcut(QKeySequence(Qt::Key_F1));
    CommandAction(fileSaveCommand)->setIcon(reportIcon(commandSaveReport));
    CommandAction(filePrintCommand)->setIcon(reportIcon(commandPrintReport));
    recentFiles_ = new QMenu(menu.file);
    CommandAction(recentFileCommand)->setMenu(recentFiles_);
    connect(menu.file, &QMenu::aboutToShow, this, [this] { fillRecentFiles(); });

    insert(*menu.edit, cutCommand, redoCommand, Xlate("&Redo\tCtrl+Shift+Z"));
    menu.edit->insertSeparator(CommandAction(cutCommand));
    AddCommand(*menu.edit, selectAllCommand, Xlate("Select &All\tCtrl+A"));
    menu.edit->addSeparator();
    AddCommand(*menu.edit, findCommand, Xlate("&Find...\tCtrl+F"));
    AddCommand(*menu.edit, findNextCommand, Xlate("Find &Next\tF3"));
    AddCommand(*menu.edit, findPreviousCommand, Xlate("Find Pre&vious\tShift+F3"));
    AddCommand(*menu.edit, goToPageCommand, Xlate("&Go to Page...\tCtrl+G"));
    menu.edit->addSeparator();
    AddCommand(*menu.edit, preferencesCommand, Xlate("Pr&eferences...\tCtrl+,"));

    addSheetMenu(*this, menu);
    AddCommand(*menu.view, zoomInCommand, Xlate("Zoom &In\tCtrl++"));
    AddCommand(*menu.view, zoomOutCommand, Xlate("Zoom &Out\tCtrl+-"));
    AddCommand(*menu.view, zoomResetCommand, Xlate("&Usual Size\tCtrl+0"));

    menu.window->addSeparator();
    AddCommand(*menu.window, nextReportCommand, Xlate("Ne&xt Report\tCtrl+Tab"));
    AddCommand(*menu.window, previousReportCommand, Xlate("Pre&vious Report\tCtrl+Shift+Tab"));

    toolBar_ = addToolBar(Xlate("Toolbar"));
    toolBar_->setObjectName(QStringLiteral("toolbar"));
    toolBar_->addAction(CommandAction(fileSaveCommand));
    toolBar_->addAction(CommandAction(filePrintCommand));
    runs_.addTo(menu);
}

void DeskFrame::fillRecentFiles()
{
    recentFiles_->clear();
    const QStringList files = UApplication::Get()->GetRecentFileList();
    int number = 0;
    for (const QString &path : files) {
        recentFiles_->addAction(QStringLiteral("&%1 ").arg(++number % 10) + kareport::plainMenuText(path), this,
                                [this, path] { OpenFile(path); });
    }
}
