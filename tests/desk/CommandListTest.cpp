#include "CommandList.h"

#include "CommandReasons.h"
#include "DeskCommandIds.h"
#include "DeskFixture.h"
#include "DeskIcons.h"
#include "ReportEdit.h"
#include "UReportView.h"

#include <QAction>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QMenuBar>
#include <QStatusBar>
#include <QTimer>
#include <QToolBar>
#include <QToolButton>
#include <QTreeWidget>

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

void settle()
{
    QCoreApplication::processEvents();
    QCoreApplication::processEvents();
}

QStringList shownRows(const QTreeWidget &list)
{
    QStringList rows;
    for (int row = 0; row < list.topLevelItemCount(); ++row) {
        if (!list.topLevelItem(row)->isHidden()) {
            rows.append(list.topLevelItem(row)->text(0));
        }
    }
    return rows;
}

/// Answers the list of commands when it opens: types, and presses Enter.
void whenListed(const QString &typed, const std::function<void(CommandList &)> &look)
{
    QTimer::singleShot(0, qApp, [typed, look] {
        auto *list = dynamic_cast<CommandList *>(QApplication::activeModalWidget());
        ASSERT_NE(list, nullptr);
        QTest::keyClicks(list->findChild<QLineEdit *>(), typed);
        look(*list);
        QTest::keyClick(list->findChild<QLineEdit *>(), Qt::Key_Return);
        if (list->isVisible()) {
            list->reject();
        }
    });
}

TEST(CommandList, HasEveryCommandOfTheMenusWithItsKeys)
{
    Desk desk;
    const std::vector<ListedCommand> commands = listedCommands(*desk.frame->menuBar());
    QStringList names;
    for (const ListedCommand &command : commands) {
        names.append(command.name);
    }
    EXPECT_TRUE(names.contains(QStringLiteral("File › Save As"))) << names.join(u'\n').toStdString();
    EXPECT_TRUE(names.contains(QStringLiteral("File › Export › PDF")));
    EXPECT_TRUE(names.contains(QStringLiteral("Edit › Go to Page")));
    EXPECT_EQ(names.removeDuplicates(), 0);
    for (const QAction *action : desk.frame->findChildren<QAction *>(QString(), Qt::FindDirectChildrenOnly)) {
        if (action->data().toUInt() != 0 && action->menu() == nullptr && !action->text().isEmpty()) {
            EXPECT_TRUE(std::any_of(commands.begin(), commands.end(), [action](const ListedCommand &listed) {
                return listed.action == action;
            })) << action->text().toStdString();
        }
    }
}

TEST(CommandList, OpensByItsKeyFindsByWordsAndRunsTheCommand)
{
    Desk desk;
    desk.answer = MessageAnswer::No;
    desk.frame->activateWindow();
    ASSERT_TRUE(QTest::qWaitFor([] { return QApplication::focusWidget() != nullptr; }));
    whenListed(QStringLiteral("FILE new"), [](CommandList &list) {
        EXPECT_EQ(shownRows(*list.findChild<QTreeWidget *>()),
                  QStringList({QStringLiteral("File › New"), QStringLiteral("File › New from Template")}));
    });
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_P, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(Desk::reports().size(), 1U) << "the first of the list";
    whenListed(QStringLiteral("ctrl+w"), [](CommandList &list) {
        EXPECT_EQ(shownRows(*list.findChild<QTreeWidget *>()), QStringList(QStringLiteral("File › Close")))
            << "by its key";
    });
    ASSERT_TRUE(desk.frame->OnCommand(commandListCommand));
    EXPECT_TRUE(Desk::reports().empty());
    whenListed(QStringLiteral("no such thing"),
               [](CommandList &list) { EXPECT_TRUE(shownRows(*list.findChild<QTreeWidget *>()).isEmpty()); });
    ASSERT_TRUE(desk.frame->OnCommand(commandListCommand));
}

TEST(CommandList, WhatCannotActIsGreyAndSaysWhy)
{
    Desk desk;
    whenListed(QStringLiteral("undo"), [](CommandList &list) {
        const auto *tree = list.findChild<QTreeWidget *>();
        const QTreeWidgetItem *item = tree->currentItem();
        ASSERT_NE(item, nullptr);
        EXPECT_EQ(item->text(0), QStringLiteral("Edit › Undo"));
        EXPECT_NE(item->foreground(0).color(), list.palette().color(QPalette::Text));
        QStringList texts;
        for (const QLabel *label : list.findChildren<QLabel *>()) {
            texts.append(label->text());
        }
        EXPECT_TRUE(texts.contains(QStringLiteral("No report is open."))) << texts.join(u'\n').toStdString();
        QTest::keyClick(list.findChild<QLineEdit *>(), Qt::Key_Return);
        EXPECT_TRUE(list.isVisible()) << "Enter does nothing";
    });
    ASSERT_TRUE(desk.frame->OnCommand(commandListCommand));
}

TEST(CommandReasons, EveryCommandThatIsDisabledSaysWhy)
{
    const JobFolder folder;
    folder.put("a.rep", savedText("TALVEN"));
    folder.put("a.json", lineJob());
    Desk desk;
    desk.answer = MessageAnswer::No;
    const auto check = [&desk](const char *when) {
        desk.frame->UpdateCommands();
        for (const ListedCommand &command : listedCommands(*desk.frame->menuBar())) {
            EXPECT_EQ(command.action->isEnabled(), command.action->statusTip().isEmpty())
                << when << ": " << command.name.toStdString() << ": " << command.action->statusTip().toStdString();
        }
    };
    check("nothing is open");
    ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
    settle();
    check("a new report");
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    settle();
    check("a report that is saved");
    EXPECT_EQ(desk.frame->CommandAction(fileSaveCommand)->statusTip(),
              QStringLiteral("The report has no changes that are not saved."));
    EXPECT_EQ(desk.frame->CommandAction(copyCommand)->statusTip(), QStringLiteral("No text is selected."));
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_A, Qt::ControlModifier);
    check("a text is selected");
    EXPECT_TRUE(desk.frame->CommandAction(copyCommand)->isEnabled());
    desk.keepReportWindows();
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
    settle();
    check("a report window");
    EXPECT_TRUE(desk.frame->CommandAction(findCommand)->statusTip().contains(QStringLiteral("View\\Edit Report")));
}

TEST(CommandReasons, AreSaidInTheStatusBarWhileTheMouseIsOnAMenusEntry)
{
    Desk desk;
    QMenu *edit = desk.frame->menuBar()->actions().at(1)->menu();
    edit->popup(QPoint(50, 50));
    settle();
    QAction *undo = desk.frame->CommandAction(undoCommand);
    ASSERT_FALSE(undo->isEnabled());
    QTest::mouseMove(edit, edit->actionGeometry(undo).center());
    settle();
    EXPECT_EQ(desk.frame->statusBar()->currentMessage(), QStringLiteral("No report is open."));
    edit->close();
}

TEST(CommandReasons, AreSaidForButtonsOfTheToolBar)
{
    Desk desk;
    const auto *bar = desk.frame->findChild<QToolBar *>();
    auto *button = qobject_cast<QToolButton *>(bar->widgetForAction(desk.frame->CommandAction(filePrintCommand)));
    ASSERT_NE(button, nullptr);
    desk.frame->UpdateCommands();
    EXPECT_FALSE(button->isEnabled());
    QEnterEvent enter(QPointF(3, 3), QPointF(3, 3), QPointF(3, 3));
    QCoreApplication::sendEvent(button, &enter);
    EXPECT_EQ(desk.frame->statusBar()->currentMessage(), QStringLiteral("No report is open."));
}

TEST(DeskToolBar, HasTheDozenDailyCommandsWithIconsNamesAndKeys)
{
    Desk desk;
    const auto *bar = desk.frame->findChild<QToolBar *>();
    int buttons = 0;
    for (const QAction *action : bar->actions()) {
        if (action->isSeparator()) {
            continue;
        }
        ++buttons;
        EXPECT_FALSE(action->icon().isNull()) << action->text().toStdString();
        const QWidget *button = bar->widgetForAction(const_cast<QAction *>(action));
        EXPECT_FALSE(button->accessibleName().isEmpty());
        EXPECT_FALSE(button->accessibleName().contains(u'&'));
        if (!action->shortcut().isEmpty()) {
            EXPECT_TRUE(action->toolTip().contains(action->shortcut().toString())) << action->toolTip().toStdString();
        }
    }
    EXPECT_GE(buttons, 11);
}

TEST(DeskIcons, ReadOnLightAndDark)
{
    const QPalette before = QApplication::palette();
    for (const QColor &background : {QColor(Qt::white), QColor(40, 40, 40)}) {
        QApplication::setPalette(QPalette(background));
        for (const unsigned command :
             {unsigned(fileOpenCommand), unsigned(exportPdfCommand), unsigned(undoCommand), unsigned(zoomInCommand),
              unsigned(commandListCommand), unsigned(helpContentsCommand), unsigned(fileSaveCommand)})
        {
            const QImage drawn = deskIcon(command).pixmap(32, 32).toImage();
            int marked = 0;
            for (int y = 0; y < drawn.height(); ++y) {
                for (int x = 0; x < drawn.width(); ++x) {
                    marked += qAlpha(drawn.pixel(x, y)) > 128 ? 1 : 0;
                }
            }
            EXPECT_GT(marked, 60) << command;
            EXPECT_LT(marked, 900) << command;
        }
    }
    QApplication::setPalette(before);
    EXPECT_TRUE(deskIcon(1).isNull());
}

} // namespace
