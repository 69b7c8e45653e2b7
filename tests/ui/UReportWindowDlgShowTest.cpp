#include "EditorFixture.h"
#include "PrintFixture.h"
#include "ReportWindowFixture.h"
#include "TemporaryFolder.h"

#include <gmock/gmock.h>

namespace
{

using ReportWindowShow = WrittenReportWindow;
using testing::IsEmpty;

TEST_F(ReportWindowShow, ShowingOpensTheReportInAViewOfItsOwn)
{
    window.setActive(true);
    ASSERT_EQ(report->GetViews().size(), 1U) << "the hidden one";
    desk.frame->SetActiveViewForFrameAndPane(nullptr);
    click(11009);
    WindowDesk::settle();
    EXPECT_FALSE(window.isCreated());
    EXPECT_EQ(report->GetReportWindow(), &window) << "the closed window stays the report's";
    ASSERT_EQ(report->GetViews().size(), 1U) << "the hidden one has given way to it";
    auto *view = dynamic_cast<UReportView *>(report->GetViews().back());
    ASSERT_NE(view, nullptr);
    EXPECT_TRUE(view->GetParentPane()->IsVisible());
    EXPECT_EQ(view->GetParentPane()->GetStyle(), 4096U);
    EXPECT_FALSE(view->GetParentPane()->GetRect().has_value()) << "where the frame puts it";
    EXPECT_EQ(view->GetEdit().toPlainText(), QStringLiteral("  first\nsecond\n"));
    EXPECT_EQ(activeView(), view) << "what came to the front last";
    EXPECT_TRUE(view->GetEdit().hasFocus());
    EXPECT_TRUE(report->IsModified());
}

TEST_F(ReportWindowShow, APaneThatTheHostHidesStays)
{
    CViewPane *host = GetReportTemplate()->CreateNewPane(report, nullptr, 0, nullptr);
    GetReportTemplate()->InitialUpdatePane(host, report, 0);
    CViewPane *own = report->GetFrameWindow();
    window.ShowReport();
    EXPECT_TRUE(CViewPane::IsOpen(host)) << "which the host has not shown yet";
    EXPECT_FALSE(host->IsVisible()) << "and which stays hidden";
    ASSERT_NE(activeView(), nullptr);
    EXPECT_EQ(activeView()->GetDocument(), report);
    EXPECT_NE(activeView()->GetParentPane(), host) << "the new one is in front";
    EXPECT_FALSE(CViewPane::IsOpen(own)) << "the report's own hidden one has given way";
    EXPECT_EQ(report->GetViews().size(), 2U);
}

TEST_F(ReportWindowShow, APaneThatTheHostHasShownAndHiddenStays)
{
    CViewPane *own = report->GetFrameWindow();
    own->ShowPane(true);
    own->ShowPane(false);
    window.ShowReport();
    EXPECT_TRUE(CViewPane::IsOpen(own));
}

TEST_F(ReportWindowShow, EveryRunLeavesOnePane)
{
    const AnsweredPrinting printing;
    for (int run = 0; run < 3; ++run) {
        window.ShowReport();
        ASSERT_EQ(report->GetViews().size(), 1U) << run;
        EXPECT_TRUE(report->GetFrameWindow()->IsVisible()) << run;
        report->UpdateReportInfo(QStringLiteral("Traverse"), false, false);
        ASSERT_FALSE(report->GetFrameWindow()->IsVisible()) << run << ": the next run has hidden it";
        window.OnPrint();
        ASSERT_EQ(report->GetViews().size(), 2U) << run;
        ASSERT_TRUE(window.createDocked(QStringLiteral("Traverse"), nullptr));
        report->UpdateReportInfo(QStringLiteral("Traverse"), false, false);
    }
}

TEST_F(ReportWindowShow, AReportForTheUsersEditorOpensNoView)
{
    const TemporaryFolder temporary;
    const RecordedLaunches launches;
    const PreferredEditor editor(QStringLiteral("editor"));
    window.ShowReport();
    EXPECT_THAT(launches.all, IsEmpty()) << "this one is not meant for it";
    EXPECT_EQ(report->GetViews().size(), 1U);
    EXPECT_TRUE(report->GetFrameWindow()->IsVisible());

    UReportDoc *edited = CreateReportWindow(QStringLiteral("Edited"), false, true);
    edited->WriteLine(QStringLiteral("text"), 0, 1, 0);
    UReportWindowDlg &editedWindow = WindowDesk::windowOf(edited);
    UView *previous = editedWindow.GetPreviousView();
    ASSERT_NE(previous, nullptr);
    desk.openReport(QStringLiteral("In front"));
    ASSERT_NE(activeView(), previous);
    editedWindow.ShowReport();
    EXPECT_EQ(activeView(), previous) << "the view that was active before has the keyboard again";
    ASSERT_EQ(launches.all.size(), 1U);
    EXPECT_EQ(launches.all.front().program, editor.path);
    EXPECT_NE(contentOf(launches.all.front().file).find("text"), std::string::npos);
    EXPECT_FALSE(editedWindow.isCreated());
    EXPECT_EQ(edited->GetViews().size(), 1U) << "only the hidden one";
    EXPECT_FALSE(edited->GetFrameWindow()->IsVisible());
    EXPECT_TRUE(edited->GetExternalEditorFlag());
}

TEST_F(ReportWindowShow, AReportMayCloseWhenTheEditorHasIt)
{
    const TemporaryFolder temporary;
    const RecordedLaunches launches;
    const PreferredEditor editor(QStringLiteral("editor"));
    report->SetExternalEditorFlag(true);
    report->SetCloseDocumentFlag(true);
    window.setActive(true);
    click(11009);
    EXPECT_EQ(launches.all.size(), 1U);
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report))
        << "and the window with it, in the middle of its button's click";
    WindowDesk::settle();
}

TEST_F(ReportWindowShow, AReportForTheUsersEditorIsPrintedFromTheApplication)
{
    const RecordedLaunches launches;
    const PreferredEditor editor(QStringLiteral("editor"));
    const AnsweredPrinting printing;
    report->SetExternalEditorFlag(true);
    window.OnPrint();
    EXPECT_EQ(printing.printedPages(), 1);
    EXPECT_THAT(launches.all, IsEmpty());
    EXPECT_TRUE(report->GetExternalEditorFlag());
}

TEST_F(ReportWindowShow, PrintingOpensAHiddenViewAndPrints)
{
    const AnsweredPrinting printing;
    window.setActive(true);
    desk.frame->SetActiveViewForFrameAndPane(nullptr);
    click(11011);
    WindowDesk::settle();
    EXPECT_FALSE(window.isCreated());
    EXPECT_EQ(printing.prints, 1);
    EXPECT_EQ(printing.printedPages(), 1);
    ASSERT_EQ(report->GetViews().size(), 2U);
    const CViewPane &made = *report->GetViews().back()->GetParentPane();
    EXPECT_FALSE(made.IsVisible()) << "the view that was made for it";
    EXPECT_EQ(made.GetStyle(), 4096U);
    EXPECT_FALSE(made.GetRect().has_value());
    EXPECT_EQ(activeView(), report->GetViews().front()) << "its views were updated, which shows its own pane";
    EXPECT_EQ(dynamic_cast<UReportView *>(report->GetViews().front())->GetEdit().toPlainText(),
              QStringLiteral("  first\nsecond\n"))
        << "printed from the first view, which holds the text then";
}

TEST_F(ReportWindowShow, PrintingPutsTheEditorFlagBack)
{
    AnsweredPrinting printing;
    for (const bool flag : {true, false}) {
        report->SetExternalEditorFlag(flag);
        bool meanwhile = true;
        printing.changePrinter = [&](QPrinter &) { meanwhile = report->GetExternalEditorFlag(); };
        window.OnPrint();
        EXPECT_FALSE(meanwhile) << "it is to open in the application";
        EXPECT_EQ(report->GetExternalEditorFlag(), flag);
    }
    EXPECT_EQ(printing.prints, 2) << "a closed window prints as well";
}

TEST_F(ReportWindowShow, WithoutATemplateTheWindowClosesAndNothingMore)
{
    const AnsweredPrinting printing;
    report->SetExternalEditorFlag(true);
    UView *previous = before->GetViews().front();
    ASSERT_EQ(window.GetPreviousView(), previous);
    const UReportDoc *other = desk.openReport(QStringLiteral("In front"));
    ASSERT_NE(activeView(), previous);
    {
        const UApplication hidesTheTemplate;
        window.OnPrint();
    }
    EXPECT_FALSE(window.isCreated());
    EXPECT_EQ(activeView(), previous) << "the view that was active before has the keyboard again";
    EXPECT_FALSE(report->GetExternalEditorFlag()) << "left cleared";
    EXPECT_EQ(printing.prints, 0);
    EXPECT_EQ(report->GetViews().size(), 1U);

    ASSERT_TRUE(window.createDocked(QStringLiteral("Traverse"), previous));
    other->GetFrameWindow()->BringToTop();
    ASSERT_NE(activeView(), previous);
    {
        const UApplication hidesTheTemplate;
        window.ShowReport();
    }
    EXPECT_FALSE(window.isCreated());
    EXPECT_EQ(activeView(), previous);
    EXPECT_EQ(report->GetViews().size(), 1U);
}

TEST_F(ReportWindowShow, WithoutPanesTheReportIsPrintedFromTheViewThatItHas)
{
    UApplication withoutPanes;
    withoutPanes.AddDocTemplate(kareport::makeReportTemplate());
    const AnsweredPrinting printing;
    window.OnPrint();
    EXPECT_EQ(printing.prints, 1);
    EXPECT_EQ(report->GetViews().size(), 1U);
    window.ShowReport();
    EXPECT_EQ(report->GetViews().size(), 1U);
}

/// A view that takes nothing over from its report by itself.
class LazyView : public UReportView
{
public:
    void OnUpdate(UView *, long, void *) override {}
};

TEST_F(ReportWindowShow, TheViewHoldsTheReportWhenItIsPrinted)
{
    UApplication lazy;
    lazy.AddDocTemplate(
        kareport::makeReportTemplate([] { return new CReportViewPane; }, [] { return std::make_unique<LazyView>(); }));
    UReportDoc *unseen = CreateReportWindow(QStringLiteral("Unseen"), false, false);
    writeLines(*unseen, 100);
    const AnsweredPrinting printing;
    WindowDesk::windowOf(unseen).OnPrint();
    EXPECT_EQ(printing.printedPages(), 2);
}

TEST_F(ReportWindowShow, TheReportMayBeClosedWhileItIsPrinted)
{
    AnsweredPrinting printing;
    printing.accept = false;
    printing.changePrinter = [this](QPrinter &) { report->OnCloseDocument(); };
    window.OnPrint();
    EXPECT_EQ(printing.prints, 1);
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
}

} // namespace
