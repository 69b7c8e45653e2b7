#include "ActivePaneFixture.h"
#include "EditorFixture.h"
#include "ReportExit.h"

#include <QClipboard>

namespace
{

/// Three reports as tabs of one row; the last one was opened last.
class ActivePane : public testing::Test
{
protected:
    ActivePane()
    {
        for (const char *name : {"First", "Second", "Third"}) {
            reports.push_back(desk.openReport(QString::fromUtf8(name)));
        }
        desk.application->SetCurrentReport(reports.back());
    }

    void expectActive(const UReportDoc &report, const char *reason, std::size_t view = 0) const
    {
        EXPECT_EQ(wrongWithActive(*desk.frame), QString()) << reason;
        EXPECT_EQ(desk.frame->GetActiveView(), report.GetViews().at(view)) << reason;
        EXPECT_EQ(desk.frame->GetCommandDocument(), &report) << reason;
    }
    COneViewPane &pane(std::size_t report) const { return dockPaneOf(*reports.at(report)); }

    WindowDesk desk;
    std::vector<UReportDoc *> reports;
};

TEST_F(ActivePane, ATabThatIsClickedHasKeyboardAndCommandsAtOnce)
{
    for (const std::size_t clicked : {0U, 2U, 1U, 0U, 1U}) {
        ASSERT_TRUE(clickTab(*desk.frame, pane(clicked)));
        ASSERT_TRUE(editOf(*reports[clicked]).hasFocus()) << "before anything else happens";
        expectActive(*reports[clicked], "clicked");
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_X);
        QGuiApplication::clipboard()->setText(QStringLiteral("y"));
        desk.frame->OnCommand(57637);
    }
    EXPECT_EQ(textOf(*reports[0]), QStringLiteral("xyxy")) << "what was typed and what was pasted";
    EXPECT_EQ(textOf(*reports[1]), QStringLiteral("xyxy"));
    EXPECT_EQ(textOf(*reports[2]), QStringLiteral("xy"));
}

TEST_F(ActivePane, ATabThatIsInFrontAlreadyGetsTheKeyboardBack)
{
    UReportWindowDlg window;
    ASSERT_TRUE(window.createDocked(QStringLiteral("Window"), nullptr));
    WindowDesk::settle();
    ASSERT_EQ(desk.frame->GetActivePane(), &window) << "a window that comes has the keyboard";
    ASSERT_TRUE(clickTab(*desk.frame, pane(2)));
    expectActive(*reports[2], "its tab was pressed");
}

TEST_F(ActivePane, WhateverBringsAPaneToTheFrontMakesItTheActiveOne)
{
    struct Row
    {
        std::function<void()> act;
        std::size_t expected;
        const char *reason;
    };
    const Row rows[] = {
        {[this] { pane(0).GetDock()->raise(); }, 0, "raised"},
        {[this] { pane(1).BringToTop(); }, 1, "brought to the top"},
        {[this] { desk.frame->SetActiveViewForFrameAndPane(reports[0]->GetViews().front()); }, 0, "its view activated"},
        {[this] { pane(2).ShowPane(true); }, 2, "shown"},
        {[this] { pane(2).ShowPane(false); }, 0, "that before it is hidden: the one that was used last follows"},
        {[this] { pane(2).GetDock()->toggleViewAction()->trigger(); }, 2, "brought back from the list of panes"},
        {[this] { pane(1).GetDock()->setFloating(true); }, 1, "another one gets a window of its own"},
        {[this] { pane(1).BringToTop(); }, 1, "a window of its own"},
        {[this] { QTest::mouseClick(pane(2).GetDock(), Qt::LeftButton, Qt::NoModifier, QPoint(3, 3)); }, 2,
         "its title"},
        {[this] { pane(1).GetDock()->activateWindow(); }, 1, "the user goes to a window of its own"},
        {[this] {
             pane(1).GetDock()->setFloating(false);
             desk.frame->splitDockWidget(pane(0).GetDock(), pane(1).GetDock(), Qt::Horizontal);
             pane(0).BringToTop();
         },
         0, "docked beside the others"},
        {[this] { QTest::mouseClick(editOf(*reports[1]).viewport(), Qt::LeftButton); }, 1, "pressed in"},
        {[this] { pane(1).GetDock()->close(); }, 0, "the one that is closed is not active any more"},
    };
    for (const Row &row : rows) {
        row.act();
        WindowDesk::settle();
        if (row.expected < reports.size() && UReportDoc::IsReportAvailable(reports[row.expected])) {
            expectActive(*reports[row.expected], row.reason);
        }
    }
    EXPECT_FALSE(UReportDoc::IsReportAvailable(reports[1]));
    reports[0]->OnCloseDocument();
    WindowDesk::settle();
    expectActive(*reports[2], "the last one");
    reports[2]->OnCloseDocument();
    WindowDesk::settle();
    EXPECT_EQ(wrongWithActive(*desk.frame), QString()) << "nothing is left";
    EXPECT_EQ(desk.frame->GetActiveView(), nullptr);
}

TEST_F(ActivePane, APaneThatIsAboveItsSiblingsAlreadyComesBeforeTheOtherTabs)
{
    const std::function<void()> acts[] = {
        [this] { pane(0).BringToTop(); },
        [this] { desk.frame->SetActiveViewForFrameAndPane(reports[0]->GetViews().front()); },
        [this] { pane(0).ShowPane(true); },
    };
    for (const auto &act : acts) {
        ASSERT_TRUE(clickTab(*desk.frame, pane(2)));
        WindowDesk::settle();
        putAboveSiblings(*pane(0).GetDock());
        ASSERT_FALSE(pane(0).IsInFront());
        act();
        WindowDesk::settle();
        expectActive(*reports[0], "which raising alone does not bring to the front");
    }
}

TEST_F(ActivePane, ThePaneThatTheKeyboardComesBackToIsSeen)
{
    // The frame remembers the widget that had the keyboard, also when its pane is behind a tab since.
    ASSERT_TRUE(clickTab(*desk.frame, pane(0)));
    pane(2).GetDock()->setFloating(true);
    pane(2).GetDock()->activateWindow();
    WindowDesk::settle();
    ASSERT_TRUE(clickTab(*desk.frame, pane(1)));
    pane(2).GetDock()->activateWindow();
    WindowDesk::settle();
    expectActive(*reports[2], "the window of its own");
    editOf(*reports[0]).setFocus();
    putAboveSiblings(*pane(0).GetDock());
    ASSERT_FALSE(pane(0).IsInFront());
    desk.application->SetCurrentReport(reports[2]);
    desk.frame->activateWindow();
    WindowDesk::settle();
    WindowDesk::settle();
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
}

/// Records the notifications of being active.
class ToldView : public UReportView
{
public:
    void OnActivateView(bool activate, UView *activated, UView *deactivated) override
    {
        told.push_back({activate, activated, deactivated});
        UReportView::OnActivateView(activate, activated, deactivated);
    }
    struct Told
    {
        bool activate;
        UView *activated;
        UView *deactivated;
        bool operator==(const Told &) const = default;
    };
    std::vector<Told> told;
};

TEST_F(ActivePane, ViewsAreToldThatTheyWereActivated)
{
    UApplication told;
    told.AddDocTemplate(
        kareport::makeReportTemplate([] { return new CReportViewPane; }, [] { return std::make_unique<ToldView>(); }));
    const UReportDoc *report = desk.openReport(QStringLiteral("Told"));
    auto *view = dynamic_cast<ToldView *>(report->GetViews().front());
    UView *third = reports[2]->GetViews().front();
    ASSERT_TRUE(clickTab(*desk.frame, pane(2)));
    view->told.clear();
    ASSERT_TRUE(clickTab(*desk.frame, dockPaneOf(*report)));
    ASSERT_FALSE(view->told.empty());
    EXPECT_EQ(view->told.front(), (ToldView::Told{true, view, third}));
    view->told.clear();
    ASSERT_TRUE(clickTab(*desk.frame, pane(2)));
    ASSERT_FALSE(view->told.empty());
    EXPECT_EQ(view->told.front(), (ToldView::Told{false, third, view}));

    view->told.clear();
    view->OnMouseActivate();
    EXPECT_EQ(view->told, (std::vector<ToldView::Told>{{true, view, third}})) << "pressed in, by the view itself";
    desk.frame->setFocus();
    view->told.clear();
    view->OnMouseActivate();
    ASSERT_FALSE(view->told.empty());
    EXPECT_EQ(view->told.front(), (ToldView::Told{true, view, view})) << "it is active, and gets the keyboard back";
    EXPECT_TRUE(view->GetEdit().hasFocus());
    view->told.clear();
    view->OnMouseActivate();
    EXPECT_TRUE(view->told.empty()) << "it has both";
}

TEST_F(ActivePane, EachChangeTellsBothViewsOnce)
{
    UApplication told;
    told.AddDocTemplate(
        kareport::makeReportTemplate([] { return new CReportViewPane; }, [] { return std::make_unique<ToldView>(); }));
    const UReportDoc *first = desk.openReport(QStringLiteral("Told first"));
    const UReportDoc *second = desk.openReport(QStringLiteral("Told second"));
    auto *one = dynamic_cast<ToldView *>(first->GetViews().front());
    auto *two = dynamic_cast<ToldView *>(second->GetViews().front());
    const std::function<void(ToldView *)> ways[] = {
        [this](ToldView *view) { desk.frame->SetActiveViewForFrameAndPane(view); },
        [](ToldView *view) { view->OnMouseActivate(); },
        [this](ToldView *view) { clickTab(*desk.frame, dynamic_cast<COneViewPane &>(*view->GetParentPane())); },
    };
    for (const auto &activate : ways) {
        for (int turn = 0; turn < 2; ++turn) {
            ToldView *next = desk.frame->GetActiveView() == one ? two : one;
            ToldView *before = next == one ? two : one;
            one->told.clear();
            two->told.clear();
            activate(next);
            WindowDesk::settle();
            EXPECT_EQ(before->told, (std::vector<ToldView::Told>{{false, next, before}})) << &activate - ways;
            EXPECT_EQ(next->told, (std::vector<ToldView::Told>{{true, next, before}})) << &activate - ways;
            EXPECT_EQ(wrongWithActive(*desk.frame), QString());
        }
    }
}

TEST_F(ActivePane, AViewThatGoesWhenItIsNoLongerTheActiveOneIsNotPassedOn)
{
    class LeavingView : public ToldView
    {
    public:
        void OnActivateView(bool activate, UView *activated, UView *deactivated) override
        {
            ToldView::OnActivateView(activate, activated, deactivated);
            if (!activate && leaves) {
                GetDocument()->OnCloseDocument();
            }
        }
        bool leaves = false;
    };
    UApplication told;
    told.AddDocTemplate(kareport::makeReportTemplate([] { return new CReportViewPane; },
                                                     [] { return std::make_unique<LeavingView>(); }));
    const UReportDoc *stays = desk.openReport(QStringLiteral("Stays"));
    const UReportDoc *leaves = desk.openReport(QStringLiteral("Leaves"));
    auto *next = dynamic_cast<LeavingView *>(stays->GetViews().front());
    dynamic_cast<LeavingView *>(leaves->GetViews().front())->leaves = true;
    next->told.clear();
    ASSERT_TRUE(clickTab(*desk.frame, dockPaneOf(*stays)));
    WindowDesk::settle();
    EXPECT_FALSE(UReportDoc::IsReportAvailable(leaves));
    EXPECT_EQ(next->told, (std::vector<ToldView::Told>{{true, next, nullptr}}));
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
}

TEST_F(ActivePane, AViewThatIsHiddenLeavesTheKeyboardItsCommands)
{
    UView *hidden = reports[0]->GetViews().front();
    pane(0).ShowPane(false);
    WindowDesk::settle();
    ASSERT_EQ(wrongWithActive(*desk.frame), QString());
    const COneViewPane *shown = desk.frame->GetActivePane();
    desk.frame->SetActiveViewForFrameAndPane(hidden); // as a host may do
    WindowDesk::settle();
    EXPECT_EQ(desk.frame->GetActivePane(), shown);
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
    QGuiApplication::clipboard()->setText(QStringLiteral("pasted"));
    EXPECT_TRUE(desk.frame->OnCommand(57637));
}

TEST_F(ActivePane, NoCommandReachesAViewThatIsHidden)
{
    QGuiApplication::clipboard()->setText(QStringLiteral("pasted"));
    reports[0]->SetData(QStringLiteral("kept"));
    UView *hidden = reports[0]->GetViews().front();
    pane(0).ShowPane(false);
    desk.frame->SetActiveViewForFrameAndPane(hidden); // as a host may do
    desk.frame->OnCommand(57637);
    const QAction *paste = desk.frame->CommandAction(57637);
    desk.frame->UpdateCommands();
    EXPECT_FALSE(paste->isEnabled());
    EXPECT_EQ(textOf(*reports[0]), QStringLiteral("kept"));
}

TEST_F(ActivePane, APaneThatWasHiddenWhileItsReportWasWrittenShowsTheReport)
{
    reports[0]->WriteLine(QStringLiteral("one"), 0, 1, 0);
    reports[0]->UpdateAllViews(nullptr);
    pane(0).ShowPane(false);
    reports[0]->WriteLine(QStringLiteral("two"), 0, 1, 0);
    pane(0).ShowPane(true);
    WindowDesk::settle();
    EXPECT_EQ(editOf(*reports[0]).toPlainText(), QStringLiteral("one\ntwo\n"));
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_X);
    EXPECT_EQ(textOf(*reports[0]), QStringLiteral("xone\r\ntwo\r\n")) << "an edit of less would take its place";
}

TEST_F(ActivePane, AHiddenPaneDoesNotKeepAReport)
{
    UReportDoc *report = reports[0];
    report->Activate(true);
    ASSERT_EQ(dockPaneOf(*report, 1).GetWindowNumber(), 2);
    report->UpdateReportInfo(QString(), false, false); // hides the first pane
    ASSERT_FALSE(dockPaneOf(*report).IsVisible());
    EXPECT_EQ(dockPaneOf(*report).GetWindowNumber(), 0);
    EXPECT_EQ(dockPaneOf(*report, 1).GetWindowNumber(), 0) << "an only pane again";
    report->SetModifiedFlag(true);
    const AnsweredBoxes boxes(MessageAnswer::Cancel);
    dockPaneOf(*report, 1).GetDock()->close();
    EXPECT_EQ(boxes.boxes.size(), 1U);
    EXPECT_TRUE(UReportDoc::IsReportAvailable(report)) << "cancelled";
    dockPaneOf(*report).ShowPane(true);
    EXPECT_EQ(dockPaneOf(*report).GetWindowNumber(), 1) << "counted again";
    EXPECT_EQ(dockPaneOf(*report, 1).GetWindowNumber(), 2);
}

TEST_F(ActivePane, AnEditorThatHidesAPaneDoesNotKeepAReport)
{
    UReportDoc *report = reports[0];
    report->Activate(true);
    const PreferredEditor editor(QStringLiteral("notepad.exe"));
    const RecordedLaunches launches;
    report->SetExternalEditorFlag(true);
    report->UpdateAllViews(nullptr); // the editor gets the report, and the first pane closes
    ASSERT_EQ(launches.all.size(), 1U);
    ASSERT_FALSE(dockPaneOf(*report).IsVisible());
    EXPECT_EQ(dockPaneOf(*report).GetWindowNumber(), 0);
    report->SetExternalEditorFlag(false);
    report->SetModifiedFlag(true);
    const AnsweredBoxes boxes(MessageAnswer::Cancel);
    dockPaneOf(*report, 1).GetDock()->close();
    EXPECT_EQ(boxes.boxes.size(), 1U) << "the only pane that is left is not closed without a question";
    EXPECT_TRUE(UReportDoc::IsReportAvailable(report));
}

TEST_F(ActivePane, AnExitThatIsRefusedLeavesWhatTheHostHasDeferred)
{
    for (const int mode : {0, 1, 2}) {
        UReportDoc *report = CreateReportWindow(QStringLiteral("Written %1").arg(mode), false, false);
        report->SetCloseDocument(mode);
        kareport::deferCloseForExit(*report);
        EXPECT_EQ(report->GetCloseDocument(), 1);
        kareport::deferCloseForExit(*report); // the user tries again
        kareport::noteExitCancelled();
        EXPECT_EQ(report->GetCloseDocument(), mode);
        report->SetCloseDocument(0);
    }
}

class RefusingFrame : public UXTPMDIFrameWnd
{
public:
    std::function<void()> meanwhile;

protected:
    void closeEvent(QCloseEvent *event) override
    {
        event->ignore();
        if (meanwhile) {
            meanwhile();
        }
    }
};

TEST_F(ActivePane, AnExitThatIsRefusedClosesNoReportLater)
{
    desk.frame.reset();
    RefusingFrame frame;
    frame.show();
    UReportDoc *report = CreateReportWindow(QStringLiteral("Written"), false, false);
    UReportDoc *other = CreateReportWindow(QStringLiteral("Other"), false, false);
    report->Activate(true);
    other->SetCloseDocument(1);
    dynamic_cast<UReportView *>(report->GetViews().front())->OnReportExit();
    report->OnCloseDocument();
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
    other->OnCloseDocument();
    ASSERT_TRUE(UReportDoc::IsReportAvailable(other)) << "the host itself has deferred it";
    kareport::noteExitCancelled();
    other->CloseReportDocument();
    ASSERT_TRUE(UReportDoc::IsReportAvailable(other)) << "only asked for";
    kareport::noteExitCancelled();
    ASSERT_TRUE(UReportDoc::IsReportAvailable(other)) << "by the host, that closes it when it likes";
    other->CloseReportDocument();
    EXPECT_FALSE(UReportDoc::IsReportAvailable(other));
    desk.application.reset();
}

TEST_F(ActivePane, AReportThatTheHostHasDeferredIsOnlyAskedToCloseDuringAnExitThatIsRefused)
{
    UReportDoc *report = CreateReportWindow(QStringLiteral("Written"), false, false);
    report->SetCloseDocument(1);
    kareport::deferCloseForExit(*report);
    report->CloseReportDocument();
    EXPECT_TRUE(UReportDoc::IsReportAvailable(report));
    kareport::noteExitCancelled();
    ASSERT_TRUE(UReportDoc::IsReportAvailable(report)) << "the first request of a deferred report does not close it";
    EXPECT_EQ(report->GetCloseDocument(), 2);
    report->CloseReportDocument();
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
}

TEST_F(ActivePane, AReportThatIsAskedToCloseDuringAnExitThatIsRefusedIsClosedThen)
{
    desk.frame.reset();
    RefusingFrame frame;
    frame.show();
    UReportDoc *report = CreateReportWindow(QStringLiteral("Written"), false, false);
    report->Activate(true);
    frame.meanwhile = [report] {
        report->CloseReportDocument();
        EXPECT_TRUE(UReportDoc::IsReportAvailable(report)) << "not before the exit is decided";
    };
    dynamic_cast<UReportView *>(report->GetViews().front())->OnReportExit();
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));

    UReportDoc *gone = CreateReportWindow(QStringLiteral("Gone"), false, false);
    gone->Activate(true);
    frame.meanwhile = [gone] {
        gone->CloseReportDocument();
        gone->CloseReportDocument();
        EXPECT_FALSE(UReportDoc::IsReportAvailable(gone)) << "the second call closes";
    };
    dynamic_cast<UReportView *>(gone->GetViews().front())->OnReportExit();
    desk.application.reset();
}

} // namespace
