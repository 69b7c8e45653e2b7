#include "DeskFixture.h"

#include "ActivePaneFixture.h"
#include "COneViewPane.h"
#include "DeskCommandIds.h"
#include "DeskPreferences.h"
#include "Session.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"
#include "UView.h"

#include <QMenu>
#include <QMenuBar>
#include <QTabBar>

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

void settle()
{
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QCoreApplication::processEvents();
}

QTabBar *tabsOf(const Desk &desk)
{
    for (QTabBar *tabs : desk.frame->findChildren<QTabBar *>()) {
        if (tabs->isVisible() && tabs->count() > 1) {
            return tabs;
        }
    }
    return nullptr;
}

TEST(DeskTabs, JobsAreTabsWithTheirText)
{
    Desk desk;
    desk.answer = MessageAnswer::No;
    const JobFolder folder;
    for (const char *name : {"a.json", "b.json", "c.json"}) {
        folder.put(name, lineJob(name));
        ASSERT_TRUE(desk.frame->OpenFile(folder.path(name)));
        settle();
    }
    const QTabBar *tabs = tabsOf(desk);
    ASSERT_NE(tabs, nullptr);
    EXPECT_EQ(tabs->count(), 3) << "not columns";
    for (const UReportDoc *report : Desk::reports()) {
        ASSERT_EQ(report->GetViews().size(), 1U);
        EXPECT_TRUE(report->GetViews().front()->IsVisible());
        const auto *window = dynamic_cast<const UReportWindowDlg *>(report->GetReportWindow());
        EXPECT_TRUE(window == nullptr || !window->isCreated()) << "the report window has given way";
    }
    EXPECT_EQ(desk.frame->GetCommandDocument(), Desk::reports().back());
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
    const auto *view = dynamic_cast<const UReportView *>(desk.frame->GetActiveView());
    ASSERT_NE(view, nullptr);
    EXPECT_EQ(view->GetEdit().toPlainText(), QStringLiteral("c.json\n"));
}

TEST(DeskTabs, AReportWindowThatIsKeptStaysAndIsKeptAtTheNextStart)
{
    const JobFolder folder;
    folder.put("a.json", lineJob());
    Desk desk;
    desk.answer = MessageAnswer::No;
    desk.frame->CommandAction(keepReportWindowCommand)->trigger();
    EXPECT_TRUE(desk.frame->CommandAction(keepReportWindowCommand)->isChecked());
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
    settle();
    EXPECT_TRUE(dynamic_cast<UReportWindowDlg *>(Desk::reports().front()->GetReportWindow())->isCreated());
    EXPECT_TRUE(loadPreferences().keepsReportWindows);
    desk.frame->CommandAction(keepReportWindowCommand)->trigger();
    EXPECT_FALSE(loadPreferences().keepsReportWindows);
}

TEST(DeskTabs, ReportWindowsThatAreKeptAreTabsOfARowOfTheirOwn)
{
    const JobFolder folder;
    folder.put("saved.rep", savedText("TALVEN"));
    Desk desk;
    desk.answer = MessageAnswer::No;
    desk.keepReportWindows();
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("saved.rep")));
    for (const char *name : {"a.json", "b.json", "c.json"}) {
        folder.put(name, lineJob(name));
        ASSERT_TRUE(desk.frame->OpenFile(folder.path(name)));
        settle();
    }
    std::vector<UReportWindowDlg *> windows;
    for (const UReportDoc *report : Desk::reports()) {
        if (auto *window = dynamic_cast<UReportWindowDlg *>(report->GetReportWindow())) {
            windows.push_back(window);
        }
    }
    ASSERT_EQ(windows.size(), 3U);
    QTabBar *tabs = tabsOf(desk);
    ASSERT_NE(tabs, nullptr) << "columns";
    EXPECT_EQ(tabs->count(), 3) << "the report with its text is not among them";
    EXPECT_EQ(desk.frame->dockWidgetArea(windows[0]->GetDock()), Qt::BottomDockWidgetArea);
    EXPECT_GT(windows[2]->GetDock()->width(), desk.frame->width() * 9 / 10);
    EXPECT_TRUE(windows[2]->IsInFront()) << "the last one that was opened";
    EXPECT_FALSE(windows[0]->IsInFront());
    EXPECT_EQ(desk.frame->GetCommandDocument(), windows[2]->GetReportDoc());
    QTest::mouseClick(tabs, Qt::LeftButton, Qt::NoModifier, tabs->tabRect(0).center());
    settle();
    EXPECT_TRUE(windows[0]->IsInFront());
    EXPECT_EQ(desk.frame->GetCommandDocument(), windows[0]->GetReportDoc());
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());

    // The one of the middle is opened with its text; the others stay together.
    windows[1]->ShowReport();
    settle();
    EXPECT_EQ(desk.frame->tabifiedDockWidgets(windows[0]->GetDock()), QList<QDockWidget *>{windows[2]->GetDock()});
    EXPECT_TRUE(desk.frame->GetActiveView() != nullptr);

    // One that the user has put elsewhere takes the next one along.
    desk.frame->addDockWidget(Qt::RightDockWidgetArea, windows[0]->GetDock());
    windows[2]->ClosePane();
    settle();
    folder.put("d.json", lineJob("d"));
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("d.json")));
    settle();
    auto *last = dynamic_cast<UReportWindowDlg *>(Desk::reports().back()->GetReportWindow());
    ASSERT_NE(last, nullptr);
    EXPECT_EQ(desk.frame->dockWidgetArea(last->GetDock()), Qt::RightDockWidgetArea);
    EXPECT_EQ(desk.frame->tabifiedDockWidgets(last->GetDock()), QList<QDockWidget *>{windows[0]->GetDock()});
}

TEST(DeskTabs, ChangesThatAreNotSavedAreMarkedInTabAndTitle)
{
    const JobFolder folder;
    folder.put("plan [*] & co.rep", savedText("TALVEN"));
    Desk desk;
    desk.answer = MessageAnswer::No;
    EXPECT_EQ(desk.frame->windowTitle(), QStringLiteral("KaReport"));
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("plan [*] & co.rep")));
    settle();
    UReportDoc *report = Desk::reports().front();
    auto *pane = dynamic_cast<COneViewPane *>(report->GetViews().front()->GetParentPane());
    desk.frame->UpdateCommands();
    EXPECT_EQ(desk.frame->windowTitle(), QStringLiteral("plan [*][*] & co.rep[*] — KaReport"));
    EXPECT_FALSE(desk.frame->isWindowModified());
    EXPECT_EQ(pane->GetDock()->windowTitle(), QStringLiteral("plan [*] && co.rep"));
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_X);
    desk.frame->UpdateCommands();
    EXPECT_TRUE(desk.frame->isWindowModified());
    EXPECT_EQ(pane->GetDock()->windowTitle(), QStringLiteral("plan [*] && co.rep *"));
    EXPECT_EQ(pane->GetDock()->accessibleName(), QStringLiteral("plan [*] & co.rep, not saved"));
    // The key comes at once after the letter: nothing has looked at the commands since.
    ASSERT_TRUE(desk.frame->CommandAction(fileSaveCommand)->isEnabled());
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_S, Qt::ControlModifier);
    EXPECT_FALSE(report->IsModified()) << "saved";
    desk.frame->UpdateCommands();
    EXPECT_FALSE(desk.frame->isWindowModified());
    EXPECT_FALSE(desk.frame->CommandAction(fileSaveCommand)->isEnabled());
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Y);
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_S, Qt::ControlModifier);
    EXPECT_FALSE(report->IsModified()) << "a command that has become possible a moment ago does not miss its key";
}

TEST(DeskTabs, TheMiddleButtonClosesATabAsItsButtonDoes)
{
    const JobFolder folder;
    Desk desk;
    for (const char *name : {"a.rep", "b.rep", "c.rep"}) {
        folder.put(name, savedText(name));
        ASSERT_TRUE(desk.frame->OpenFile(folder.path(name)));
        settle();
    }
    QTabBar *tabs = tabsOf(desk);
    ASSERT_NE(tabs, nullptr);
    const auto tabOf = [&tabs](const char *name) {
        for (int tab = 0; tab < tabs->count(); ++tab) {
            if (tabs->tabText(tab).startsWith(QString::fromUtf8(name))) {
                return tab;
            }
        }
        return -1;
    };
    const auto click = [&](const char *name) {
        QTest::mouseClick(tabs, Qt::MiddleButton, Qt::NoModifier, tabs->tabRect(tabOf(name)).center());
        settle();
    };
    UReportDoc *first = Desk::reports()[0];
    click("a.rep");
    EXPECT_EQ(Desk::reports().size(), 2U);
    EXPECT_FALSE(UReportDoc::IsReportAvailable(first));
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
    // One with changes asks, and stays when the user says so.
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_X);
    desk.answer = MessageAnswer::Cancel;
    click("c.rep");
    EXPECT_EQ(Desk::reports().size(), 2U);
    EXPECT_EQ(desk.messages.size(), 1);
    // A press in one tab and a release in another is not a click.
    QTest::mousePress(tabs, Qt::MiddleButton, Qt::NoModifier, tabs->tabRect(0).center());
    QTest::mouseRelease(tabs, Qt::MiddleButton, Qt::NoModifier, tabs->tabRect(1).center());
    settle();
    EXPECT_EQ(Desk::reports().size(), 2U);
    desk.answer = MessageAnswer::No;
}

TEST(DeskTabs, TheWindowMenuListsTheReports)
{
    const JobFolder folder;
    Desk desk;
    for (const char *name : {"a & b.rep", "c.rep"}) {
        folder.put(name, savedText(name));
        ASSERT_TRUE(desk.frame->OpenFile(folder.path(name)));
        settle();
    }
    QMenu *menu = desk.frame->menuBar()->actions().at(3)->menu();
    const qsizetype before = menu->actions().size();
    for (int time = 0; time < 2; ++time) {
        Q_EMIT menu->aboutToShow();
        ASSERT_EQ(menu->actions().size(), before + 3) << "a line and two reports, each time";
    }
    QAction *entry = menu->actions().at(before + 1);
    EXPECT_EQ(entry->text(), QStringLiteral("&1 a && b.rep"));
    EXPECT_FALSE(entry->isChecked());
    EXPECT_TRUE(menu->actions().at(before + 2)->isChecked()) << "the one in front";
    entry->trigger();
    settle();
    EXPECT_EQ(desk.frame->GetCommandDocument(), Desk::reports().front());
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
}

TEST(DeskTabs, WhatWasOpenIsOpenedAgainWhereThatIsWanted)
{
    const JobFolder folder;
    for (const char *name : {"a.rep", "b.rep", "gone.rep"}) {
        folder.put(name, savedText(name));
    }
    folder.put("job.json", lineJob());
    Desk desk;
    desk.answer = MessageAnswer::No;
    for (const char *name : {"a.rep", "gone.rep", "job.json", "b.rep"}) {
        ASSERT_TRUE(desk.frame->OpenFile(folder.path(name)));
    }
    ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand)); // which has not been saved
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    settle();
    desk.frame->close();
    ASSERT_TRUE(desk.frame->isHidden());
    desk.frame.reset();
    desk.application.reset();
    QFile::remove(folder.path("gone.rep"));
    desk.messages.clear();
    EXPECT_EQ(lastSession().back(), folder.path("a.rep")) << "the one in front is the last";
    desk.application.emplace();
    desk.frame.emplace();
    desk.frame->show();
    desk.frame->RestoreSession();
    settle();
    EXPECT_TRUE(desk.messages.isEmpty()) << desk.messages.join(u'\n').toStdString();
    QStringList titles;
    for (const UReportDoc *report : Desk::reports()) {
        titles.append(report->GetPathName().isEmpty() ? report->GetTitle()
                                                      : QFileInfo(report->GetPathName()).fileName());
    }
    titles.sort();
    EXPECT_EQ(titles, QStringList({QStringLiteral("Lines"), QStringLiteral("a.rep"), QStringLiteral("b.rep")}));
    EXPECT_EQ(desk.frame->GetCommandDocument()->GetPathName(), folder.path("a.rep"));
}

} // namespace
