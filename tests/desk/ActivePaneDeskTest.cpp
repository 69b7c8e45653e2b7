#include "ActivePaneFixture.h"
#include "DeskCommandIds.h"
#include "DeskFixture.h"
#include "DeskPreferences.h"
#include "UReportWindowDlg.h"

#include <QClipboard>
#include <QDialog>

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

UReportDoc *runJob(Desk &desk, const JobFolder &folder, const char *name, const char *line)
{
    folder.put(name, lineJob(line));
    desk.keepReportWindows();
    desk.frame->OpenFile(folder.path(name));
    settle();
    return Desk::reports().back();
}

TEST(ActivePaneDesk, AfterAJobNothingReachesTheHiddenView)
{
    Desk desk;
    desk.answer = MessageAnswer::No;
    const JobFolder folder;
    const UReportDoc *report = runJob(desk, folder, "a.json", "First line");
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
    EXPECT_EQ(desk.frame->GetActiveView(), nullptr) << "no view is seen";
    EXPECT_EQ(desk.frame->GetCommandDocument(), report);
    QGuiApplication::clipboard()->setText(QStringLiteral("pasted"));
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_V, Qt::ControlModifier);
    for (const unsigned id : {pasteCommand, cutCommand, selectAllCommand, undoCommand, findCommand, goToPageCommand}) {
        EXPECT_FALSE(desk.frame->CommandAction(id)->isEnabled()) << id;
        desk.frame->OnCommand(id);
    }
    EXPECT_EQ(Desk::textOf(*report), QStringLiteral("First line\n"));
    for (const unsigned id :
         {fileSaveCommand, fileSaveAsCommand, filePrintCommand, printPreviewCommand, fileCloseCommand}) {
        EXPECT_TRUE(desk.frame->CommandAction(id)->isEnabled()) << id;
    }
    ASSERT_TRUE(desk.frame->OnCommand(windowNewCommand)) << "a window that shows its view";
    settle();
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
    ASSERT_NE(desk.frame->GetActiveView(), nullptr);
    EXPECT_EQ(dynamic_cast<UReportView *>(desk.frame->GetActiveView())->GetEdit().toPlainText(),
              QStringLiteral("First line\n"));
}

TEST(ActivePaneDesk, ACancelledExitLeavesEveryReportAsItWas)
{
    for (const int cancelledAt : {1, 2, 3}) {
        for (const bool byView : {true, false}) {
            Desk desk;
            const JobFolder folder;
            std::vector<UReportDoc *> reports;
            for (const char *name : {"a.json", "b.json", "c.json"}) {
                reports.push_back(runJob(desk, folder, name, name));
            }
            reports[1]->Activate(true);
            settle();
            int asked = 0;
            setMessageBox([&asked, cancelledAt](const Message &) {
                return ++asked == cancelledAt ? MessageAnswer::Cancel : MessageAnswer::No;
            });
            if (byView) {
                desk.frame->OnCommand(exitCommand); // goes through the view of the second report, which has a window
            } else {
                reports[1]->SetCloseDocument(1);
                desk.frame->close();
            }
            settle();
            EXPECT_TRUE(desk.frame->isVisible());
            EXPECT_EQ(asked, cancelledAt);
            if (!byView) {
                reports[1]->OnCloseDocument();
                ASSERT_TRUE(UReportDoc::IsReportAvailable(reports[1])) << "deferred by its host, not by the exit";
                reports[1]->SetCloseDocument(0);
            }
            for (UReportDoc *report : reports) {
                ASSERT_TRUE(UReportDoc::IsReportAvailable(report));
                report->OnCloseDocument();
                EXPECT_FALSE(UReportDoc::IsReportAvailable(report)) << cancelledAt << ": and can be closed";
            }
        }
    }
}

TEST(ActivePaneDesk, AfterARefusedExitTheActiveViewIsSeen)
{
    for (const bool isAbove : {false, true}) {
        Desk desk;
        const JobFolder folder;
        std::vector<UReportDoc *> reports;
        for (const char *name : {"a.rep", "b.rep", "c.rep"}) {
            folder.put(name, savedText(name));
            ASSERT_TRUE(desk.frame->OpenFile(folder.path(name)));
            settle();
            reports.push_back(Desk::reports().back());
        }
        // The last one floats and has the keyboard; in the frame, the first one had it, and the second one is in front.
        dockPaneOf(*reports[2]).GetDock()->setFloating(true);
        ASSERT_TRUE(clickTab(*desk.frame, dockPaneOf(*reports[1])));
        dockPaneOf(*reports[2]).GetDock()->activateWindow();
        settle();
        editOf(*reports[0]).setFocus();
        ASSERT_FALSE(dockPaneOf(*reports[0]).IsInFront());
        ASSERT_EQ(desk.frame->GetCommandDocument(), reports[2]);
        reports[2]->SetModifiedFlag(true);
        setMessageBox([&](const Message &) {
            {
                QDialog question(&*desk.frame);
                question.show();
                settle();
            }
            settle();
            if (isAbove) {
                putAboveSiblings(*dockPaneOf(*reports[0]).GetDock());
            }
            desk.frame->activateWindow(); // as a window manager does when the question has gone
            settle();
            return MessageAnswer::Cancel;
        });
        desk.frame->close();
        settle();
        ASSERT_TRUE(desk.frame->isVisible());
        EXPECT_EQ(wrongWithActive(*desk.frame), QString()) << isAbove;
        setMessageBox([](const Message &) { return MessageAnswer::No; });
    }
}

TEST(ActivePaneDesk, AReportWhoseFileIsOpenComesToTheFrontWhereItIsShown)
{
    Desk desk;
    desk.answer = MessageAnswer::No;
    const JobFolder folder;
    UReportDoc *report = runJob(desk, folder, "a.json", "First line");
    ASSERT_TRUE(report->OnSaveDocument(folder.path("a.rep")));
    report->SetPathName(folder.path("a.rep"), false);
    ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
    settle();
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    settle();
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
    EXPECT_EQ(desk.frame->GetCommandDocument(), report);
    EXPECT_FALSE(report->GetFrameWindow()->IsVisible()) << "its window shows it already";
}

TEST(ActivePaneDesk, AJobThatIsRunAgainHasItsTitleAgain)
{
    Desk desk;
    desk.answer = MessageAnswer::No;
    const JobFolder folder;
    for (int run = 1; run <= 3; ++run) {
        UReportDoc *report = runJob(desk, folder, "a.json", "First line");
        EXPECT_EQ(report->GetTitle(), QStringLiteral("Lines")) << "run " << run;
        report->SetTitle(QStringLiteral("Lines"));
        EXPECT_EQ(report->GetTitle(), QStringLiteral("Lines")) << "run " << run;
        report->OnCloseDocument();
        settle();
    }
}

/// Waits until no report is open that is neither seen nor held, at most five seconds.
bool everyReportIsSeen()
{
    return QTest::qWaitFor([] {
        const std::vector<UReportDoc *> reports = Desk::reports();
        return std::all_of(reports.begin(), reports.end(), [](const UReportDoc *report) { return report->IsShown(); });
    });
}

TEST(ActivePaneDesk, AReportComesBackWhenItsEditorIsClosed)
{
    for (const bool keeps : {true, false}) {
        Desk desk;
        desk.answer = MessageAnswer::No;
        DeskPreferences preferences = loadPreferences();
        preferences.usesEditor = true;
        preferences.editor = QStringLiteral("/bin/true");
        preferences.keepsForEditor = keeps;
        savePreferences(preferences);
        UReportDoc *report = CreateReport(QStringLiteral("R"), false, true, nullptr, 0, nullptr);
        report->WriteLine(QStringLiteral("x"), 0, 1, 0);
        report->UpdateAllViews(nullptr);
        settle();
        EXPECT_TRUE(everyReportIsSeen()) << keeps;
        ASSERT_TRUE(UReportDoc::IsReportAvailable(report)) << keeps;
        settle();
        EXPECT_EQ(wrongWithActive(*desk.frame), QString()) << keeps;
        EXPECT_EQ(editOf(*report).toPlainText(), QStringLiteral("x\n")) << keeps;
    }
}

TEST(ActivePaneDesk, TheTabKeyDoesNotLeadToARowWithoutTabs)
{
    Desk desk;
    desk.answer = MessageAnswer::No;
    const JobFolder folder;
    runJob(desk, folder, "a.json", "First line");
    runJob(desk, folder, "b.json", "First line");
    settle();
    // Side by side they have no tabs; the row in which they were is still there.
    auto &window = dynamic_cast<UReportWindowDlg &>(*Desk::reports().back()->GetReportWindow());
    desk.frame->addDockWidget(Qt::RightDockWidgetArea, window.GetDock());
    settle();
    for (int press = 1; press <= 4; ++press) {
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
        settle();
        const auto *tabs = qobject_cast<const QTabBar *>(QApplication::focusWidget());
        EXPECT_EQ(tabs, nullptr) << "after " << press << ": its tabs are " << (tabs != nullptr ? tabs->count() : 0);
    }
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
}

} // namespace
