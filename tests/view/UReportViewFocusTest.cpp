#include "FindBar.h"
#include "ViewFixture.h"

#include "COneViewPane.h"
#include "UXTPMDIFrameWnd.h"

#include <QLineEdit>

namespace
{

/// A frame in front with two reports in it.
struct Desk
{
    Desk()
    {
        for (UReportDoc *report : {&first, &second}) {
            report->SetAutoDelete(false);
            auto *pane = new COneViewPane;
            pane->SetPlace(nullptr, 0, nullptr);
            UReportView *view = showIn<UReportView>(*pane, *report);
            view->OnInitialUpdate();
            pane->ShowPane(true);
            views.push_back(view);
            panes.push_back(pane);
        }
        frame.splitDockWidget(panes[0]->GetDock(), panes[1]->GetDock(), Qt::Horizontal);
        frame.resize(900, 500);
        frame.show();
        QApplication::setActiveWindow(&frame);
        application.SetCurrentReport(nullptr);
        application.SetCompanionView(nullptr);
        frame.SetActiveViewForFrameAndPane(nullptr);
    }
    ~Desk()
    {
        for (COneViewPane *pane : panes) {
            pane->ClosePane();
        }
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }

    FixedSurroundings surroundings;
    UApplication application;
    UXTPMDIFrameWnd frame;
    UReportDoc first;
    UReportDoc second;
    std::vector<UReportView *> views;
    std::vector<COneViewPane *> panes;
};

TEST(UReportViewFocus, TheKeyboardMakesAReportTheCurrentOne)
{
    enum Report
    {
        None,
        First,
        Second
    };
    struct Row
    {
        Report current;
        Report expected;
        bool activated;
        bool companionStays;
        const char *reason;
    };
    constexpr Row rows[] = {
        {None, None, false, false, "reports are not in use: only the companion goes"},
        {First, First, false, true, "it is the current one already"},
        {Second, First, true, true, "it takes the place of the other"},
    };
    Desk desk;
    UDocument *const reports[] = {nullptr, &desk.first, &desk.second};
    UView companion;
    for (const Row &row : rows) {
        desk.application.SetCurrentReport(reports[row.current]);
        desk.application.SetCompanionView(&companion);
        desk.frame.SetActiveViewForFrameAndPane(nullptr);
        desk.views[0]->OnSetFocus();
        EXPECT_EQ(desk.application.GetCurrentReport(), reports[row.expected]) << row.reason;
        EXPECT_EQ(desk.frame.GetActiveView(), row.activated ? desk.views[0] : nullptr) << row.reason;
        EXPECT_EQ(desk.application.GetCompanionView(), row.companionStays ? &companion : nullptr) << row.reason;
    }
}

TEST(UReportViewFocus, TheControlTellsThatItHasGotTheKeyboard)
{
    Desk desk;
    desk.application.SetCurrentReport(&desk.second);
    desk.views[1]->GetEdit().setFocus();
    desk.views[0]->GetEdit().setFocus();
    EXPECT_EQ(desk.application.GetCurrentReport(), &desk.first);
    EXPECT_EQ(desk.frame.GetActiveView(), desk.views[0]);
    desk.views[1]->GetWidget()->setFocus();
    EXPECT_EQ(desk.application.GetCurrentReport(), &desk.second) << "the window hands the keyboard to its text";
}

TEST(UReportViewFocus, AMousePressMakesAViewTheActiveOne)
{
    Desk desk;
    QTest::mouseClick(desk.views[1]->GetEdit().viewport(), Qt::LeftButton);
    EXPECT_EQ(desk.frame.GetActiveView(), desk.views[1]);
    EXPECT_TRUE(desk.views[1]->GetEdit().hasFocus());
    QTest::mouseClick(desk.views[0]->GetEdit().viewport(), Qt::LeftButton);
    EXPECT_EQ(desk.frame.GetActiveView(), desk.views[0]) << "in place of the other";
    EXPECT_TRUE(desk.views[0]->GetEdit().hasFocus());

    desk.views[1]->GetEdit().setFocus();
    desk.views[0]->OnMouseActivate();
    EXPECT_EQ(desk.frame.GetActiveView(), desk.views[0]);
    EXPECT_TRUE(desk.views[0]->GetEdit().hasFocus()) << "the active view gets the keyboard back";
}

TEST(UReportViewFocus, APressInTheFindBarLeavesTheKeyboardThere)
{
    Desk desk;
    kareport::ReportViewWidget &widget = widgetOf(*desk.views[0]);
    desk.views[0]->GetEdit().setFocus();
    widget.openFindBar();
    desk.frame.SetActiveViewForFrameAndPane(desk.views[1]);
    QTest::mouseClick(&widget.findBar().field(), Qt::LeftButton);
    EXPECT_EQ(desk.frame.GetActiveView(), desk.views[0]);
    EXPECT_TRUE(widget.findBar().field().hasFocus());
}

TEST(UReportViewFocus, WithoutAFrameOrAnApplicationNothingHappens)
{
    ShownReport t(QStringLiteral("a"));
    UReportView &view = t.open();
    view.OnSetFocus();
    view.OnMouseActivate();
    view.OnDestroy();
    QTest::mouseClick(view.GetEdit().viewport(), Qt::LeftButton);
    EXPECT_EQ(view.GetEdit().toPlainText(), QStringLiteral("a"));
}

TEST(UReportViewFocus, DestroyingTakesTheActiveViewAwayOnlyWhenItIsThisOne)
{
    Desk desk;
    desk.frame.SetActiveViewForFrameAndPane(desk.views[1]);
    desk.views[0]->OnDestroy();
    EXPECT_EQ(desk.frame.GetActiveView(), desk.views[1]);
    desk.views[1]->OnDestroy();
    EXPECT_EQ(desk.frame.GetActiveView(), nullptr);
}

} // namespace
