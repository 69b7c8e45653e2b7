#include "DeskFixture.h"

#include "COneViewPane.h"
#include "DeskCommandIds.h"
#include "FrameFixture.h"
#include "UView.h"

#include <QAction>
#include <QDockWidget>
#include <QMenu>
#include <QMenuBar>

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

/// All entries of the menus and their menus, with their keys.
void collect(const QMenu &menu, QStringList &entries)
{
    for (const QAction *action : menu.actions()) {
        if (action->menu() != nullptr) {
            collect(*action->menu(), entries);
        }
        if (!action->isSeparator()) {
            entries.append(action->text());
        }
    }
}

TEST(DeskFrameWindows, EveryMenuEntryHasTextAndNoTwoTheSameKey)
{
    Desk desk;
    QStringList entries;
    QStringList keys;
    for (const QAction *action : desk.frame->menuBar()->actions()) {
        collect(*action->menu(), entries);
    }
    for (const char *entry : {"&New",
                              "&Open...",
                              "&Close",
                              "&Save",
                              "Save &As...",
                              "Update Text",
                              "&Print...",
                              "Print Pre&view",
                              "Pa&ge Setup...",
                              "Recent File",
                              "E&xit",
                              "&Undo",
                              "Cu&t",
                              "&Copy",
                              "&Paste",
                              "&Toolbar",
                              "&Status Bar",
                              "&New Window",
                              "&Cascade",
                              "&Tile Horizontally",
                              "Tile Vertically",
                              "&Arrange Icons",
                              "&Help",
                              "&About..."})
    {
        EXPECT_TRUE(entries.contains(QString::fromUtf8(entry))) << entry;
    }
    for (const QAction *action : desk.frame->findChildren<QAction *>()) {
        for (const QKeySequence &key : action->shortcuts()) {
            EXPECT_FALSE(keys.contains(key.toString())) << key.toString().toStdString();
            keys.append(key.toString());
        }
    }
    const std::pair<unsigned, const char *> given[] = {{fileNewCommand, "Ctrl+N"},  {fileOpenCommand, "Ctrl+O"},
                                                       {fileSaveCommand, "Ctrl+S"}, {filePrintCommand, "Ctrl+P"},
                                                       {undoCommand, "Ctrl+Z"},     {cutCommand, "Ctrl+X"},
                                                       {copyCommand, "Ctrl+C"},     {pasteCommand, "Ctrl+V"}};
    for (const auto &[id, key] : given) {
        EXPECT_EQ(desk.frame->CommandAction(id)->shortcut().toString(), QString::fromUtf8(key));
    }
}

TEST(DeskFrameWindows, CommandsFollowWhetherAReportIsOpen)
{
    Desk desk;
    desk.frame->UpdateCommands();
    const unsigned needing[] = {fileSaveCommand,  fileSaveAsCommand, filePrintCommand, printPreviewCommand,
                                pageSetupCommand, findCommand,       windowNewCommand, exportPdfCommand};
    for (const unsigned id : needing) {
        EXPECT_FALSE(desk.frame->CommandAction(id)->isEnabled()) << id;
    }
    for (const unsigned id :
         {unsigned(fileNewCommand), unsigned(fileOpenCommand), unsigned(exitCommand), unsigned(preferencesCommand)})
    {
        EXPECT_TRUE(desk.frame->CommandAction(id)->isEnabled()) << id;
    }
    ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
    desk.frame->UpdateCommands();
    for (const unsigned id : needing) {
        EXPECT_TRUE(desk.frame->CommandAction(id)->isEnabled()) << id;
    }
    EXPECT_FALSE(desk.frame->CommandAction(updateTextCommand)->isEnabled()) << "the report has no object";
    EXPECT_TRUE(desk.frame->CommandAction(viewToolBarCommand)->isChecked());
    ASSERT_TRUE(desk.frame->OnCommand(viewToolBarCommand));
    desk.frame->UpdateCommands();
    EXPECT_FALSE(desk.frame->CommandAction(viewToolBarCommand)->isChecked());
}

TEST(DeskFrameWindows, WindowsOfAReportAreTiledAndJoined)
{
    Desk desk;
    ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
    ASSERT_TRUE(desk.frame->OnCommand(windowNewCommand));
    ASSERT_TRUE(desk.frame->OnCommand(windowNewCommand));
    const auto docks = desk.frame->findChildren<QDockWidget *>(QString(), Qt::FindDirectChildrenOnly);
    ASSERT_EQ(docks.size(), 3);
    EXPECT_EQ(docks[2]->windowTitle(), QStringLiteral("Report:3")) << "panes of one report are numbered";
    docks[1]->setFloating(true);
    ASSERT_TRUE(desk.frame->OnCommand(windowTileHorizontallyCommand));
    QCoreApplication::processEvents();
    EXPECT_FALSE(docks[1]->isFloating());
    for (qsizetype i = 1; i < docks.size(); ++i) {
        EXPECT_GT(docks[i]->y(), docks[i - 1]->y()) << "one above the other";
        EXPECT_EQ(docks[i]->x(), docks[0]->x());
    }
    ASSERT_TRUE(desk.frame->OnCommand(windowTileVerticallyCommand));
    QCoreApplication::processEvents();
    for (qsizetype i = 1; i < docks.size(); ++i) {
        EXPECT_GT(docks[i]->x(), docks[i - 1]->x()) << "side by side";
    }
    ASSERT_TRUE(desk.frame->OnCommand(windowCascadeCommand));
    EXPECT_EQ(desk.frame->tabifiedDockWidgets(docks[0]).size(), 2);
    desk.answer = MessageAnswer::No;
}

/// Counts how often widgets get another place or size.
class PlacesCounted : public QObject
{
public:
    bool eventFilter(QObject * /*watched*/, QEvent *event) override
    {
        count += event->type() == QEvent::Resize || event->type() == QEvent::Move ? 1 : 0;
        return false;
    }
    int count = 0;
};

TEST(DeskFrameWindows, TilingLaysThePanesOutOnce)
{
    Desk desk;
    for (int i = 0; i < 24; ++i) {
        ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
    }
    const auto docks = desk.frame->findChildren<QDockWidget *>(QString(), Qt::FindDirectChildrenOnly);
    for (const unsigned command : {windowTileHorizontallyCommand, windowTileVerticallyCommand, windowCascadeCommand}) {
        for (qsizetype i = 0; i < docks.size(); i += 2) {
            docks[i]->setFloating(true);
        }
        QCoreApplication::processEvents();
        PlacesCounted places;
        for (QDockWidget *dock : docks) {
            dock->installEventFilter(&places);
        }
        ASSERT_TRUE(desk.frame->OnCommand(command));
        // One that floats is moved once more. Were all laid out for each of them, a hundred panes would take a minute.
        EXPECT_LE(places.count, 6 * docks.size()) << command;
        for (const QDockWidget *dock : docks) {
            EXPECT_FALSE(dock->isFloating()) << command;
            EXPECT_TRUE(dock->isVisible()) << command;
        }
    }
    desk.answer = MessageAnswer::No;
}

TEST(DeskFrameWindows, AKeyGoesFromReportToReport)
{
    Desk desk;
    for (int i = 0; i < 3; ++i) {
        ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
    }
    const auto reports = Desk::reports();
    const auto press = [&desk](Qt::KeyboardModifiers modifiers) {
        desk.frame->activateWindow();
        EXPECT_TRUE(QTest::qWaitFor([] { return QApplication::focusWidget() != nullptr; }));
        desk.frame->UpdateCommands();
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab, modifiers);
        return desk.frame->GetActiveView() != nullptr ? desk.frame->GetActiveView()->GetDocument() : nullptr;
    };
    constexpr Qt::KeyboardModifiers forward = Qt::ControlModifier;
    constexpr Qt::KeyboardModifiers back = Qt::ControlModifier | Qt::ShiftModifier;
    EXPECT_EQ(press(forward), reports[0]) << "the first comes after the last";
    EXPECT_EQ(press(forward), reports[1]);
    EXPECT_EQ(press(back), reports[0]);
    EXPECT_EQ(press(back), reports[2]);
    EXPECT_TRUE(desk.frame->GetActiveView()->GetWidget()->isAncestorOf(QApplication::focusWidget()))
        << "with the keyboard";
    EXPECT_TRUE(reports[2]->IsEmpty()) << "and nothing is typed";
    reports[0]->GetViews().front()->GetParentPane()->ShowPane(false); // as while an editor has it
    EXPECT_EQ(press(forward), reports[1]) << "what cannot be seen is skipped";
    desk.answer = MessageAnswer::No;
}

} // namespace
