#include "OpenedTemplate.h"

#include "CommandList.h"
#include "HelpWindow.h"
#include "Session.h"
#include "TemplateFindBar.h"

#include <QDragEnterEvent>
#include <QLabel>
#include <QLineEdit>
#include <QMimeData>
#include <QPushButton>
#include <QStatusBar>
#include <QTimer>
#include <QToolBar>
#include <QUrl>

#include <gtest/gtest.h>

namespace
{

using kareport::CommandList;
using kareport::ListedCommand;

QStringList namesOf(const std::vector<ListedCommand> &commands)
{
    QStringList names;
    for (const ListedCommand &command : commands) {
        names.append(command.name);
    }
    return names;
}

/// Answers the list of commands when it opens: types, looks, and presses Enter.
void whenListed(const QString &typed, const std::function<void(CommandList &)> &look)
{
    QTimer::singleShot(0, qApp, [typed, look] {
        auto *list = dynamic_cast<CommandList *>(QApplication::activeModalWidget());
        ASSERT_NE(list, nullptr);
        auto *field = list->findChild<QLineEdit *>();
        QTest::keyClicks(field, typed);
        look(*list);
        QTest::keyClick(field, Qt::Key_Return);
        if (list->isVisible()) {
            list->reject();
        }
    });
}

/// Says of every command that it is either enabled or says why not.
void expectReasons(const OpenedTemplate &opened, const char *when)
{
    opened.window->updateCommands();
    for (const ListedCommand &command : kareport::listedCommands(*opened.window->menuBar())) {
        EXPECT_EQ(command.action->isEnabled(), command.action->statusTip().isEmpty())
            << when << ": " << command.name.toStdString() << ": " << command.action->statusTip().toStdString();
    }
}

TEST(TemplateCommands, AllAreListedWithTheirKeys)
{
    OpenedTemplate opened;
    const std::vector<ListedCommand> commands = kareport::listedCommands(*opened.window->menuBar());
    QStringList names = namesOf(commands);
    qsizetype inMenus = 0;
    for (const QAction *menu : opened.window->menuBar()->actions()) {
        for (const QAction *action : menu->menu()->actions()) {
            inMenus += action->isSeparator() ? 0 : 1;
        }
    }
    EXPECT_EQ(names.size(), inMenus) << names.join(u'\n').toStdString();
    EXPECT_EQ(names.removeDuplicates(), 0);
    EXPECT_TRUE(names.contains(QStringLiteral("Insert › Dictionary")));
    EXPECT_TRUE(names.contains(QStringLiteral("Edit › Rename Variable")));
    QStringList keys;
    for (const ListedCommand &command : commands) {
        EXPECT_FALSE(command.action->shortcut().isEmpty()) << command.name.toStdString();
        keys.append(command.action->shortcut().toString());
    }
    EXPECT_EQ(keys.removeDuplicates(), 0) << "a key means one thing";
}

TEST(TemplateCommands, TheListOpensByItsKeyAndRunsACommand)
{
    OpenedTemplate opened;
    opened.window->activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(opened.window));
    opened.putAfter("<Label>North");
    whenListed(QStringLiteral("insert tab"), [](CommandList &list) {
        EXPECT_EQ(list.findChild<QTreeWidget *>()->currentItem()->text(0), QStringLiteral("Insert › Table"));
        EXPECT_EQ(list.findChild<QTreeWidget *>()->currentItem()->text(1),
                  QKeySequence(QStringLiteral("Ctrl+Shift+T")).toString(QKeySequence::NativeText));
    });
    QTest::keyClick(&opened.window->edit(), Qt::Key_P, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_TRUE(opened.text().contains(QStringLiteral("<Name>Table1</Name>")));
}

TEST(TemplateCommands, WhatCannotActSaysWhyInTheList)
{
    OpenedTemplate opened;
    opened.putAfter("<Title>");
    const QString before = opened.text();
    whenListed(QStringLiteral("insert field"), [](CommandList &list) {
        QStringList texts;
        for (const QLabel *label : list.findChildren<QLabel *>()) {
            texts.append(label->text());
        }
        EXPECT_TRUE(texts.contains(QStringLiteral("A field belongs to a table or a block: put the cursor into one.")))
            << texts.join(u'\n').toStdString();
        QTest::keyClick(list.findChild<QLineEdit *>(), Qt::Key_Return);
        EXPECT_TRUE(list.isVisible()) << "Enter does nothing";
    });
    opened.choose("All Commands...");
    EXPECT_EQ(opened.text(), before);
}

TEST(TemplateCommands, EveryCommandThatIsDisabledSaysWhy)
{
    OpenedTemplate opened;
    const auto isEnabled = [&opened](const char *name) { return opened.command(name)->isEnabled(); };
    opened.putAfter("<Title>");
    expectReasons(opened, "as it was opened");
    for (const char *name : {"Save", "Undo", "Redo", "Cut", "Copy", "Find Next", "Rename Variable...", "Field",
                             "Next Remark", "Previous Remark"})
    {
        EXPECT_FALSE(isEnabled(name)) << name;
    }
    opened.putAfter("<VariableName>North");
    EXPECT_TRUE(isEnabled("Rename Variable..."));
    EXPECT_TRUE(isEnabled("Field"));
    opened.putAfter("<Type>");
    opened.type("Z");
    opened.settle();
    expectReasons(opened, "with a mistake");
    for (const char *name : {"Save", "Undo", "Next Remark", "Previous Remark"}) {
        EXPECT_TRUE(isEnabled(name)) << name;
    }
    opened.window->edit().selectAll();
    expectReasons(opened, "all is selected");
    EXPECT_TRUE(isEnabled("Cut"));
    EXPECT_TRUE(isEnabled("Copy"));
    opened.window->page().setFocus();
    EXPECT_FALSE(isEnabled("Copy")) << "nothing is selected of the pages";
    opened.window->page().selectAll();
    EXPECT_TRUE(isEnabled("Copy"));
}

TEST(TemplateCommands, ATemplateThatCanOnlyBeReadStaysAsItIs)
{
    // A character that the text of a window keeps for itself.
    OpenedTemplate opened(controlTemplates().replace("<Label>North", "<Label>N\xEF\xB7\x90orth"));
    ASSERT_TRUE(opened.window->edit().isReadOnly());
    const QString before = opened.text();
    opened.putAfter("<VariableName>North");
    expectReasons(opened, "it can only be read");
    for (const char *name : {"Cut", "Paste", "Complete", "Rename Variable...", "Field", "Table", "Block", "Dictionary"})
    {
        EXPECT_FALSE(opened.command(name)->isEnabled()) << name;
    }
    opened.choose("Find and Replace...");
    auto &bar = opened.window->findBar();
    bar.field().setText(QStringLiteral("Northing"));
    EXPECT_FALSE(bar.replacement().isEnabled());
    EXPECT_TRUE(bar.findNext());
    bar.replace();
    bar.replaceAll();
    EXPECT_EQ(opened.text(), before);
}

TEST(TemplateCommands, ACommandThatHasBecomePossibleDoesNotMissItsKey)
{
    OpenedTemplate opened;
    opened.window->activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(opened.window));
    opened.putAfter("<Label>North");
    opened.type("2");
    QTest::keyClick(&opened.window->edit(), Qt::Key_S, Qt::ControlModifier);
    EXPECT_FALSE(opened.window->isWindowModified());
    EXPECT_TRUE(opened.folder.bytesOf("t.xml").contains("<Label>North2"));
}

TEST(TemplateCommands, TheDailyOnesHaveButtonsThatShowWhatTheyCanDo)
{
    OpenedTemplate opened;
    const auto *bar = opened.window->findChild<QToolBar *>();
    ASSERT_NE(bar, nullptr);
    int buttons = 0;
    for (QAction *action : bar->actions()) {
        if (action->isSeparator()) {
            continue;
        }
        ++buttons;
        EXPECT_FALSE(action->icon().isNull()) << action->text().toStdString();
        EXPECT_FALSE(bar->widgetForAction(action)->accessibleName().isEmpty());
        EXPECT_TRUE(action->toolTip().contains(action->shortcut().toString(QKeySequence::NativeText)))
            << action->toolTip().toStdString();
    }
    EXPECT_GE(buttons, 11);
    const auto isOn = [&](const char *name) {
        for (QAction *action : bar->actions()) {
            const QWidget *button = bar->widgetForAction(action);
            if (button->accessibleName() == QString::fromUtf8(name)) {
                return button->isEnabled();
            }
        }
        ADD_FAILURE() << name;
        return false;
    };
    EXPECT_FALSE(isOn("Save"));
    EXPECT_FALSE(isOn("Undo"));
    opened.putAfter("<Label>North");
    EXPECT_FALSE(isOn("Cut"));
    opened.type("2");
    EXPECT_TRUE(isOn("Save")) << "without any menu";
    EXPECT_TRUE(isOn("Undo"));
    opened.window->edit().selectAll();
    EXPECT_TRUE(isOn("Cut"));
    opened.window->edit().undo();
    EXPECT_FALSE(isOn("Save"));
}

TEST(TemplateCommands, HelpIsTheGuideOfTemplates)
{
    OpenedTemplate opened;
    opened.choose("Help");
    auto *help = dynamic_cast<kareport::HelpWindow *>(opened.window->findChild<QDialog *>());
    ASSERT_NE(help, nullptr);
    EXPECT_TRUE(help->isVisible());
    EXPECT_EQ(help->browser().source().fileName(), QStringLiteral("guide-templates.md"));
}

TEST(TemplateCommands, ReasonsAreSaidInTheirOwnWindow)
{
    OpenedTemplate opened;
    QMenu *edit = opened.window->menuBar()->actions().at(1)->menu();
    edit->popup(QPoint(50, 50));
    QCoreApplication::processEvents();
    QAction *undo = opened.command("Undo");
    ASSERT_FALSE(undo->isEnabled());
    QTest::mouseMove(edit, edit->actionGeometry(undo).center());
    QCoreApplication::processEvents();
    EXPECT_EQ(opened.window->statusBar()->currentMessage(), QStringLiteral("There is nothing to undo."));
    EXPECT_EQ(opened.desk.frame->statusBar()->currentMessage(), QString());
    edit->close();
}

QStringList windowEntries(const Desk &desk)
{
    QMenu *menu = desk.frame->menuBar()->actions().at(3)->menu();
    Q_EMIT menu->aboutToShow();
    QStringList texts;
    for (const QAction *action : menu->actions()) {
        texts.append(action->text());
    }
    return texts;
}

TEST(TemplateEditors, AreInTheListOfWindows)
{
    OpenedTemplate opened;
    opened.desk.answer = MessageAnswer::No;
    opened.folder.put("a.rep", savedText("TALVEN"));
    ASSERT_TRUE(opened.desk.frame->OpenFile(opened.folder.path("a.rep")));
    EXPECT_TRUE(windowEntries(opened.desk).contains(QStringLiteral("&2 t.xml")))
        << windowEntries(opened.desk).join(u'\n').toStdString();
    opened.putAfter("<Label>North");
    opened.type("2");
    EXPECT_TRUE(windowEntries(opened.desk).contains(QStringLiteral("&2 t.xml *")));
    opened.desk.frame->activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&*opened.desk.frame));
    opened.desk.frame->menuBar()->actions().at(3)->menu()->actions().back()->trigger();
    EXPECT_TRUE(QTest::qWaitForWindowActive(opened.window)) << "its entry brings it to the front";
    opened.window->close();
    EXPECT_FALSE(windowEntries(opened.desk).join(u' ').contains(QStringLiteral("t.xml")));
}

TEST(TemplateEditors, AreOpenedAgainWithTheReports)
{
    OpenedTemplate opened;
    opened.desk.answer = MessageAnswer::No;
    opened.folder.put("a.rep", savedText("TALVEN"));
    ASSERT_TRUE(opened.desk.frame->OpenFile(opened.folder.path("a.rep")));
    opened.desk.frame->close();
    ASSERT_TRUE(opened.desk.frame->isHidden());
    EXPECT_EQ(kareport::lastSession(), QStringList({opened.folder.path("t.xml"), opened.folder.path("a.rep")}));
    opened.desk.frame.reset();
    opened.desk.application.reset();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    opened.desk.application.emplace();
    opened.desk.frame.emplace();
    opened.desk.frame->show();
    opened.desk.frame->RestoreSession();
    ASSERT_NE(windowOf(opened.folder.path("t.xml")), nullptr);
    EXPECT_EQ(Desk::reports().size(), 1U);
}

TEST(TemplateEditors, TakeFilesThatAreDropped)
{
    OpenedTemplate opened;
    opened.desk.answer = MessageAnswer::No;
    opened.folder.put("a.rep", savedText("TALVEN"));
    const QString before = opened.text();
    const auto drop = [&opened](const char *name) {
        QMimeData dropped;
        dropped.setUrls({QUrl::fromLocalFile(opened.folder.path(name))});
        dropped.setText(opened.folder.path(name)); // which a text would take
        QWidget *text = opened.window->edit().viewport();
        QDragEnterEvent enter(QPoint(9, 9), Qt::CopyAction, &dropped, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(text, &enter);
        QDropEvent event(QPointF(9, 9), Qt::CopyAction, &dropped, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(text, &event);
    };
    opened.putAfter("<Label>North");
    drop("points.csv");
    EXPECT_EQ(opened.window->data().file, opened.folder.path("points.csv"));
    EXPECT_EQ(opened.window->data().table, QStringLiteral("Points")) << "through the table of the cursor";
    drop("a.rep");
    EXPECT_EQ(Desk::reports().size(), 1U);
    EXPECT_EQ(opened.text(), before) << "no name of a file is written into the template";
}

} // namespace
