// The commands of the window of a template, and what keeps each from acting.
#include "CommandButton.h"
#include "CommandList.h"
#include "CommandTips.h"
#include "DeskCommandIds.h"
#include "DeskIcons.h"
#include "HelpWindow.h"
#include "OpenTemplate.h"
#include "TemplateFindBar.h"
#include "TemplatePage.h"
#include "TemplateTextEdit.h"
#include "TemplateWindow.h"
#include "Xlate.h"

#include <QAction>
#include <QApplication>
#include <QLineEdit>
#include <QMenu>
#include <QMenuBar>
#include <QToolBar>
#include <QTreeWidget>

#include <utility>

namespace kareport
{

void TemplateWindow::makeMenus()
{
    toolBar_ = addToolBar(Xlate("Toolbar"));
    toolBar_->setObjectName(QStringLiteral("toolbar"));
    constexpr int side = 16;
    toolBar_->setIconSize(QSize(side, side));
    addFileMenu();
    toolBar_->addSeparator();
    addEditMenu();
    addInsertMenu();
    toolBar_->addSeparator();
    addViewMenu();
    addHelpMenu();
    // Buttons show what they can do at any time.
    for (const QPlainTextEdit *part : {static_cast<QPlainTextEdit *>(edit_), static_cast<QPlainTextEdit *>(page_)}) {
        connect(part, &QPlainTextEdit::selectionChanged, this, [this] { updateCommands(); });
    }
    connect(edit_, &QPlainTextEdit::modificationChanged, this, [this] { updateCommands(); });
    connect(edit_, &QPlainTextEdit::undoAvailable, this, [this] { updateCommands(); });
    connect(edit_, &QPlainTextEdit::redoAvailable, this, [this] { updateCommands(); });
    connect(qApp, &QApplication::focusChanged, this, [this] { updateCommands(); });
    new CommandTips(*this, [this] { updateCommands(); });
    for (const QAction *menu : menuBar()->actions()) {
        connect(menu->menu(), &QMenu::aboutToShow, this, [this] { updateCommands(); });
    }
}

/// Adds a command to a menu. What follows a tab in the text is its key.
/// @param whyNot  says what keeps it from acting, as a sentence, or nothing; without, it can always act
/// @param likeCommand  the command of the desk whose icon it has; it has a button then. 0 for none
void TemplateWindow::addCommand(QMenu &menu, const QString &text, std::function<void()> act,
                                std::function<QString()> whyNot, unsigned likeCommand)
{
    const QStringList parts = text.split(u'\t');
    QAction *action = menu.addAction(parts.first());
    if (parts.size() > 1) {
        action->setShortcut(QKeySequence(parts.last()));
    }
    connect(action, &QAction::triggered, this, [act = std::move(act)] { act(); });
    commands_.push_back({action, std::move(whyNot)});
    action->setData(static_cast<unsigned>(commands_.size())); // entries without a number are none of the commands
    if (likeCommand != 0) {
        action->setIcon(deskIcon(likeCommand));
        action->setIconVisibleInMenu(true);
        addCommandButton(*toolBar_, *action);
    }
}

void TemplateWindow::updateCommands()
{
    for (const WindowCommand &command : commands_) {
        const QString why = command.whyNot ? command.whyNot() : QString();
        command.action->setEnabled(why.isEmpty());
        command.action->setStatusTip(why);
    }
}

void TemplateWindow::chooseCommand()
{
    updateCommands();
    CommandList list(listedCommands(*menuBar()), this);
    if (list.exec() == QDialog::Accepted && list.chosen() != nullptr) {
        updateCommands();
        list.chosen()->trigger();
    }
}

/// The part of the window that text is copied from: the one that has the keyboard, or gets it with the window.
QPlainTextEdit &TemplateWindow::readPart() const
{
    return focusWidget() == page_ ? static_cast<QPlainTextEdit &>(*page_) : *edit_;
}

QString TemplateWindow::whyNoEdit() const
{
    return edit_->isReadOnly() ? Xlate("The template can only be read: it has characters that cannot be shown here.")
                               : QString();
}

void TemplateWindow::addFileMenu()
{
    QMenu &menu = *menuBar()->addMenu(Xlate("&File"));
    addCommand(
        menu, Xlate("&Open...\tCtrl+O"),
        [this] {
            if (const auto path = askOpen()) {
                openAnyFile(*path);
            }
        },
        {}, fileOpenCommand);
    addCommand(
        menu, Xlate("&Save\tCtrl+S"), [this] { save(); },
        [this] {
            return edit_->document()->isModified() ? QString()
                                                   : Xlate("The template has no changes that are not saved.");
        },
        fileSaveCommand);
    addCommand(menu, Xlate("Save &As...\tCtrl+Shift+S"), [this] { saveAs(); });
    menu.addSeparator();
    addCommand(menu, Xlate("Choose &Data...\tCtrl+D"), [this] { browseData(); });
    menu.addSeparator();
    addCommand(menu, Xlate("&Close\tCtrl+W"), [this] { close(); });
}

void TemplateWindow::addEditMenu()
{
    QMenu &menu = *menuBar()->addMenu(Xlate("&Edit"));
    const auto unlessRead = [this](const auto &why) {
        return [this, why] {
            const QString read = whyNoEdit();
            return read.isEmpty() ? why() : read;
        };
    };
    addCommand(
        menu, Xlate("&Undo\tCtrl+Z"), [this] { edit_->undo(); },
        [this] { return edit_->document()->isUndoAvailable() ? QString() : Xlate("There is nothing to undo."); },
        undoCommand);
    addCommand(
        menu, Xlate("&Redo\tCtrl+Shift+Z"), [this] { edit_->redo(); },
        [this] { return edit_->document()->isRedoAvailable() ? QString() : Xlate("There is nothing to redo."); },
        redoCommand);
    menu.addSeparator();
    const auto isSelected = [](const QPlainTextEdit &part) {
        return part.textCursor().hasSelection() ? QString() : Xlate("No text is selected.");
    };
    addCommand(
        menu, Xlate("Cu&t\tCtrl+X"), [this] { edit_->cut(); },
        unlessRead([this, isSelected] { return isSelected(*edit_); }), cutCommand);
    addCommand(
        menu, Xlate("&Copy\tCtrl+C"), [this] { readPart().copy(); },
        [this, isSelected] { return isSelected(readPart()); }, copyCommand);
    addCommand(
        menu, Xlate("&Paste\tCtrl+V"), [this] { edit_->paste(); }, [this] { return whyNoEdit(); }, pasteCommand);
    addCommand(menu, Xlate("Select &All\tCtrl+A"), [this] { readPart().selectAll(); });
    menu.addSeparator();
    addFindCommands(menu);
    menu.addSeparator();
    addCommand(
        menu, Xlate("C&omplete\tCtrl+Space"), [this] { edit_->complete(true); }, [this] { return whyNoEdit(); });
    addCommand(
        menu, Xlate("Rena&me Variable...\tF2"), [this] { renameVariable(); },
        unlessRead([this] { return whyNoVariable(*outline_, edit_->textCursor().position()); }));
}

void TemplateWindow::addFindCommands(QMenu &menu)
{
    const auto isSought = [this] {
        return findBar_->field().text().isEmpty() ? Xlate("No text has been looked for yet.") : QString();
    };
    addCommand(
        menu, Xlate("&Find and Replace...\tCtrl+F"), [this] { findBar_->open(); }, {}, findCommand);
    addCommand(
        menu, Xlate("Find &Next\tF3"), [this] { findBar_->findNext(); }, isSought);
    addCommand(
        menu, Xlate("Find Pre&vious\tShift+F3"), [this] { findBar_->findPrevious(); }, isSought);
}

void TemplateWindow::addInsertMenu()
{
    QMenu &menu = *menuBar()->addMenu(Xlate("&Insert"));
    const auto here = [this] { return static_cast<qsizetype>(edit_->textCursor().position()); };
    const auto canEdit = [this] { return whyNoEdit(); };
    addCommand(
        menu, Xlate("&Field\tCtrl+Shift+F"), [this, here] { carryOut(withField(edit_->wholeText(), here())); },
        [this, here] {
            const QString read = whyNoEdit();
            return read.isEmpty() ? whyNoField(*outline_, here()) : read;
        });
    addCommand(
        menu, Xlate("&Table\tCtrl+Shift+T"), [this, here] { carryOut(withOutput(edit_->wholeText(), here(), true)); },
        canEdit);
    addCommand(
        menu, Xlate("&Block\tCtrl+Shift+B"), [this, here] { carryOut(withOutput(edit_->wholeText(), here(), false)); },
        canEdit);
    addCommand(
        menu, Xlate("&Dictionary\tCtrl+Shift+D"),
        [this, here] { carryOut(withDictionary(edit_->wholeText(), here())); }, canEdit);
}

void TemplateWindow::addViewMenu()
{
    QMenu &menu = *menuBar()->addMenu(Xlate("&View"));
    const auto hasRemarks = [this] {
        return edit_->remarks().empty() ? Xlate("There are no remarks on the template.") : QString();
    };
    addCommand(
        menu, Xlate("&Next Remark\tF8"), [this] { stepRemark(1); }, hasRemarks);
    addCommand(
        menu, Xlate("&Previous Remark\tShift+F8"), [this] { stepRemark(-1); }, hasRemarks);
    menu.addSeparator();
    addCommand(menu, Xlate("Text, &Pages, Remarks\tF6"), [this] { turnFocus(); });
    menu.addSeparator();
    const auto zoom = [this](int step) {
        edit_->zoomIn(step);
        page_->zoomIn(step);
    };
    addCommand(
        menu, Xlate("Zoom &In\tCtrl++"), [zoom] { zoom(1); }, {}, zoomInCommand);
    addCommand(
        menu, Xlate("Zoom &Out\tCtrl+-"), [zoom] { zoom(-1); }, {}, zoomOutCommand);
    menu.addSeparator();
    addCommand(
        menu, Xlate("All &Commands...\tCtrl+Shift+P"), [this] { chooseCommand(); }, {}, commandListCommand);
}

void TemplateWindow::addHelpMenu()
{
    QMenu &menu = *menuBar()->addMenu(Xlate("&Help"));
    addCommand(
        menu, Xlate("&Help") + QStringLiteral("\tF1"),
        [this] { showGuide(*this, QStringLiteral("guide-templates.md#the-editor")); }, {}, helpContentsCommand);
}

/// Gives the keyboard to the next part of the window: a tab is a character of the text.
void TemplateWindow::turnFocus()
{
    QWidget *next = edit_;
    if (edit_->hasFocus()) {
        next = page_;
    } else if (page_->hasFocus()) {
        next = remarkList_;
    }
    next->setFocus(Qt::TabFocusReason);
}

} // namespace kareport
