#include "DeskFrame.h"

#include "CommandButton.h"
#include "DeskCommandIds.h"
#include "DeskIcons.h"
#include "DeskPreferences.h"
#include "DeskSheets.h"
#include "PlainWidgets.h"
#include "ReportMenu.h"
#include "UApplication.h"
#include "WindowList.h"
#include "Xlate.h"

#include <QMenuBar>
#include <QStatusBar>
#include <QToolBar>

std::vector<kareport::Command> DeskFrame::makeCommands()
{
    using namespace kareport;
    std::vector<Command> commands = sheetCommands(*this);
    const auto hasReport = [this](CommandState &state) { state.enabled = GetCommandDocument() != nullptr; };
    const auto isWritten = [this](CommandState &state) {
        state.enabled = GetCommandDocument() != nullptr && state_.isWritten;
    };
    const std::vector<Command> own = {
        {fileNewCommand, [this] { newReport(); }, {}},
        {fileOpenCommand, [this] { open(); }, {}},
        {fileFromTemplateCommand, [this] { fromTemplate(QString()); }, {}},
        {fileExportCommand, [this] { exportValues(); },
         [this](CommandState &state) { state.enabled = runs_.recipeInFront() != nullptr; }},
        {exportPdfCommand, [this] { exportAs(OutputKind::Pdf); }, isWritten},
        {exportRichTextCommand, [this] { exportAs(OutputKind::RichText); }, isWritten},
        {exportTextCommand, [this] { exportAs(OutputKind::Text); }, isWritten},
        {commandListCommand, [this] { chooseCommand(); }, {}},
        {keepReportWindowCommand, [this] { keepReportWindow(); },
         [this](CommandState &state) { state.checked = keepsReportWindows_; }},
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
        {helpContentsCommand, [this] { ShowHelp(); }, {}},
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
    makeFileMenu(*menu.file);
    makeEditMenu(*menu.edit);

    addSheetMenu(*this, menu);
    AddCommand(*menu.view, zoomInCommand, Xlate("Zoom &In\tCtrl++"));
    AddCommand(*menu.view, zoomOutCommand, Xlate("Zoom &Out\tCtrl+-"));
    AddCommand(*menu.view, zoomResetCommand, Xlate("&Usual Size\tCtrl+0"));
    menu.view->addSeparator();
    AddCommand(*menu.view, commandListCommand, Xlate("All &Commands...\tCtrl+Shift+P"));

    AddCommand(*menu.window, keepReportWindowCommand, Xlate("&Keep Report Windows"))->setCheckable(true);
    menu.window->addSeparator();
    AddCommand(*menu.window, nextReportCommand, Xlate("Ne&xt Report\tCtrl+Tab"));
    AddCommand(*menu.window, previousReportCommand, Xlate("Pre&vious Report\tCtrl+Shift+Tab"));
    windows_ = std::make_unique<WindowList>(*menu.window, [this](UDocument *report) { activate(report); });
    connect(menu.window, &QMenu::aboutToShow, this, [this] { windows_->fill(GetCommandDocument()); });

    CommandAction(helpContentsCommand)->setShortcut(QKeySequence(Qt::Key_F1));
    for (QAction *action : findChildren<QAction *>(QString(), Qt::FindDirectChildrenOnly)) {
        if (const QIcon icon = deskIcon(action->data().toUInt()); !icon.isNull()) {
            action->setIcon(icon);
            action->setIconVisibleInMenu(true);
        }
    }
    makeToolBar();
    runs_.addTo(menu);
}

void DeskFrame::makeFileMenu(QMenu &file)
{
    using namespace kareport;
    const auto insert = [this, &file](unsigned before, unsigned id, const QString &text) {
        file.insertAction(CommandAction(before), AddCommand(file, id, text));
    };
    insert(fileOpenCommand, fileFromTemplateCommand, Xlate("New from &Template...\tCtrl+T"));
    auto *exports = new QMenu(Xlate("Expo&rt"), &file);
    AddCommand(*exports, exportPdfCommand, Xlate("&PDF..."));
    AddCommand(*exports, exportRichTextCommand, Xlate("&Rich Text..."));
    AddCommand(*exports, exportTextCommand, Xlate("Plain &Text..."));
    exports->addSeparator();
    AddCommand(*exports, fileExportCommand, Xlate("&Values...\tCtrl+E"));
    file.insertMenu(CommandAction(updateTextCommand), exports);
    CommandAction(fileCloseCommand)->setShortcut(QKeySequence(QStringLiteral("Ctrl+W")));
    CommandAction(fileSaveAsCommand)->setShortcut(QKeySequence(QStringLiteral("Ctrl+Shift+S")));
    CommandAction(exitCommand)->setShortcut(QKeySequence(QStringLiteral("Ctrl+Q")));
    recentFiles_ = new QMenu(&file);
    CommandAction(recentFileCommand)->setMenu(recentFiles_);
    connect(&file, &QMenu::aboutToShow, this, [this] { fillRecentFiles(); });
}

void DeskFrame::makeEditMenu(QMenu &edit)
{
    using namespace kareport;
    edit.insertAction(CommandAction(cutCommand), AddCommand(edit, redoCommand, Xlate("&Redo\tCtrl+Shift+Z")));
    edit.insertSeparator(CommandAction(cutCommand));
    AddCommand(edit, selectAllCommand, Xlate("Select &All\tCtrl+A"));
    edit.addSeparator();
    AddCommand(edit, findCommand, Xlate("&Find...\tCtrl+F"));
    AddCommand(edit, findNextCommand, Xlate("Find &Next\tF3"));
    AddCommand(edit, findPreviousCommand, Xlate("Find Pre&vious\tShift+F3"));
    AddCommand(edit, goToPageCommand, Xlate("&Go to Page...\tCtrl+G"));
    edit.addSeparator();
    AddCommand(edit, preferencesCommand, Xlate("Pr&eferences...\tCtrl+,"));
}

void DeskFrame::makeToolBar()
{
    using namespace kareport;
    toolBar_ = addToolBar(Xlate("Toolbar"));
    toolBar_->setObjectName(QStringLiteral("toolbar"));
    constexpr int side = 16;
    toolBar_->setIconSize(QSize(side, side));
    constexpr unsigned separator = 0;
    for (const unsigned id :
         {unsigned(fileOpenCommand), unsigned(fileFromTemplateCommand), separator, unsigned(fileSaveCommand),
          unsigned(exportPdfCommand), unsigned(filePrintCommand), separator, unsigned(undoCommand),
          unsigned(redoCommand), separator, unsigned(findCommand), unsigned(goToPageCommand), separator,
          unsigned(zoomOutCommand), unsigned(zoomResetCommand), unsigned(zoomInCommand)})
    {
        if (id == separator) {
            toolBar_->addSeparator();
            continue;
        }
        addCommandButton(*toolBar_, *CommandAction(id));
    }
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

void DeskFrame::keepReportWindow()
{
    keepsReportWindows_ = !keepsReportWindows_;
    kareport::saveKeepsReportWindows(keepsReportWindows_);
}
