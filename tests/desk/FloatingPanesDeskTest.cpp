#include "ActivePaneFixture.h"
#include "DeskCommandIds.h"
#include "DeskFixture.h"

// Panes that float together: in a frame that drags rows of tabs as one, such a row is in a window of its own.

namespace
{

void settle()
{
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QCoreApplication::processEvents();
}

void drag(QDockWidget *dock, QPoint way)
{
    const QPoint title(40, 8);
    QTest::mousePress(dock, Qt::LeftButton, Qt::NoModifier, title);
    for (int part = 1; part <= 4; ++part) {
        QTest::mouseMove(dock, title + way * part / 4);
    }
    QTest::mouseRelease(dock, Qt::LeftButton, Qt::NoModifier, title + way);
    settle();
    settle();
}

/// A desk with reports whose panes were dragged out of the frame by the title of the one in front.
class FloatingPanes : public testing::Test
{
protected:
    FloatingPanes()
    {
        desk.answer = MessageAnswer::No;
        desk.frame->setDockOptions(desk.frame->dockOptions() | QMainWindow::GroupedDragging);
    }

    UReportDoc *open(const char *name)
    {
        folder.put(name, "a line\n");
        EXPECT_TRUE(desk.frame->OpenFile(folder.path(name)));
        settle();
        return Desk::reports().back();
    }

    void dragOut(const UReportDoc &report, std::size_t view = 0)
    {
        QDockWidget *dock = dockPaneOf(report, view).GetDock();
        drag(dock, QPoint(1500, 190)); // beyond the frame
        EXPECT_NE(dock->window(), desk.frame.operator->());
    }

    JobFolder folder;
    Desk desk;
};

TEST_F(FloatingPanes, HaveTheKeyboardInTheTextOfTheOneThatWasDragged)
{
    folder.put("a.json", lineJob());
    desk.keepReportWindows();
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
    const UReportDoc *report = Desk::reports().back();
    ASSERT_TRUE(desk.frame->OnCommand(kareport::windowNewCommand)) << "beside the hidden pane, as a tab";
    settle();
    dragOut(*report, 1);
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
    EXPECT_EQ(desk.frame->GetActiveView(), report->GetViews().at(1));
    EXPECT_TRUE(editOf(*report, 1).hasFocus());
}

TEST_F(FloatingPanes, WhatIsLeftInTheirWindowIsActiveWhenTheOneInFrontIsClosed)
{
    const UReportDoc *first = open("first.rep");
    const UReportDoc *second = open("second.rep");
    dragOut(*second);
    ASSERT_FALSE(dockPaneOf(*first).IsInFront());
    ASSERT_TRUE(desk.frame->OnCommand(kareport::fileCloseCommand));
    settle();
    ASSERT_FALSE(UReportDoc::IsReportAvailable(second));
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
    EXPECT_EQ(desk.frame->GetCommandDocument(), first);
}

TEST_F(FloatingPanes, AReportWhoseFileIsOpenComesBeforeTheOtherTabs)
{
    const UReportDoc *first = open("first.rep");
    const UReportDoc *second = open("second.rep");
    dragOut(*second);
    for (const UReportDoc *report : {first, second}) {
        ASSERT_TRUE(desk.frame->OpenFile(report->GetPathName()));
        settle();
        EXPECT_EQ(wrongWithActive(*desk.frame), QString());
        EXPECT_TRUE(dockPaneOf(*report).IsInFront());
        EXPECT_EQ(desk.frame->GetCommandDocument(), report);
    }
}

TEST_F(FloatingPanes, DoNotComeBackAtTheNextStartWithoutTheirReports)
{
    open("first.rep");
    dragOut(*open("second.rep"));
    ASSERT_TRUE(desk.frame->close());
    desk.frame.reset();
    desk.application.reset();
    desk.application.emplace();
    desk.frame.emplace();
    desk.frame->setDockOptions(desk.frame->dockOptions() | QMainWindow::GroupedDragging);
    desk.frame->show();
    settle();
    for (const QObject *child : desk.frame->children()) {
        EXPECT_FALSE(child->inherits("QDockWidgetGroupWindow"));
    }
    const UReportDoc *third = open("third.rep");
    dragOut(*third);
    dockPaneOf(*third).GetDock()->close();
    settle();
    EXPECT_TRUE(Desk::reports().empty());
    desk.frame->repaint();
}

TEST(DraggedPanes, AreWhereTheyWereDroppedAtOnce)
{
    for (int x = -200; x <= 200; x += 100) {
        for (int y = -200; y <= 200; y += 100) {
            Desk desk;
            desk.answer = MessageAnswer::No;
            desk.keepReportWindows();
            const JobFolder folder;
            ASSERT_TRUE(desk.frame->OnCommand(kareport::fileNewCommand));
            for (const char *name : {"a.json", "b.json", "c.json"}) {
                folder.put(name, lineJob(name));
                ASSERT_TRUE(desk.frame->OpenFile(folder.path(name)));
            }
            settle();
            const auto windowOf = [](std::size_t job) {
                return dynamic_cast<COneViewPane *>(Desk::reports().at(job)->GetReportWindow()->GetOwningPane())
                    ->GetDock();
            };
            QDockWidget *dragged = windowOf(2);
            drag(dragged, QPoint(x, y));
            const bool floats = dragged->isFloating();
            const QRect place = dragged->geometry();
            QTest::qWait(20); // a step of an animation
            EXPECT_EQ(dragged->isFloating(), floats);
            EXPECT_EQ(dragged->geometry(), place) << x << ' ' << y;
            windowOf(3)->close();
            if (QApplication::activeWindow() == nullptr) {
                desk.frame->activateWindow(); // as a window manager does
            }
            settle();
            ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
            ASSERT_TRUE(desk.frame->OnCommand(kareport::windowNewCommand));
            settle();
            EXPECT_EQ(wrongWithActive(*desk.frame), QString()) << x << ' ' << y;
        }
    }
}

} // namespace
