#include "ReportWindowFixture.h"

#include <gtest/gtest.h>

namespace
{

TEST(ReportWindowEntry, AReportGetsAWindowAtTheBottom)
{
    const WindowDesk desk;
    for (const bool header : {false, true}) {
        for (const bool editor : {false, true}) {
            UReportDoc *report = CreateReportWindow(QStringLiteral("Traverse"), header, editor);
            ASSERT_NE(report, nullptr);
            EXPECT_EQ(report->GetTitle(), QStringLiteral("Traverse"));
            EXPECT_EQ(report->GetReportFileName(), QStringLiteral("Traverse"));
            EXPECT_EQ(report->GetHeaderFlag(), header);
            EXPECT_EQ(report->GetExternalEditorFlag(), editor);
            EXPECT_FALSE(report->IsModified());
            ASSERT_NE(report->GetReportWindow(), nullptr);
            UReportWindowDlg &window = WindowDesk::windowOf(report);
            EXPECT_EQ(window.GetReportDoc(), report) << "linked both ways";
            EXPECT_TRUE(window.IsVisible());
            EXPECT_FALSE(window.IsActive());
            EXPECT_EQ(window.GetWindowTextW(), QStringLiteral("Traverse"));
            EXPECT_EQ(desk.frame->dockWidgetArea(window.GetDock()), Qt::BottomDockWidgetArea);
            ASSERT_NE(report->GetFrameWindow(), nullptr);
            EXPECT_FALSE(report->GetFrameWindow()->IsVisible()) << "the window shows the text";
            EXPECT_EQ(report->GetFrameWindow()->GetStyle(), 4096U);
            EXPECT_FALSE(report->GetFrameWindow()->GetRect().has_value());
            report->OnCloseDocument();
        }
    }
}

TEST(ReportWindowEntry, TheListReceivesEachPieceAsItIsWritten)
{
    const WindowDesk desk;
    UReportDoc *report = CreateReportWindow(QStringLiteral("Traverse"), true, false);
    report->FixPage(72, 80);
    report->SetHeader();
    report->SetHeading(QStringLiteral("Heading"), 0, 1);
    report->WriteLine(QStringLiteral("  indented"), 1, 2, 0);
    report->Write(QStringLiteral("open "), 0);
    report->Write(QString(), 0);
    report->Write(QStringLiteral("line\r\n"), 0);
    report->LineFeed(3);
    report->WriteLine(QStringLiteral("last"), 0, 1, 0);
    EXPECT_EQ(
        WindowDesk::rowsOf(WindowDesk::windowOf(report)),
        (QStringList{headerOf(QStringLiteral("Traverse"), 1), QStringLiteral("Heading"), QStringLiteral("  indented"),
                     QStringLiteral("open "), QStringLiteral("line\r\n"), QStringLiteral("last")}))
        << "the page's header too; line ends and empty pieces are not rows";
}

TEST(ReportWindowEntry, TheWorkingViewKeepsTheKeyboard)
{
    const WindowDesk desk;
    const UReportDoc *before = desk.openReport(QStringLiteral("Survey"));
    auto *view = dynamic_cast<UReportView *>(before->GetViews().front());
    view->GetEdit().setFocus();
    ASSERT_TRUE(view->GetEdit().hasFocus());
    const UReportDoc *report = CreateReportWindow(QStringLiteral("Traverse"), false, false);
    WindowDesk::settle();
    EXPECT_EQ(desk.frame->GetActiveView(), view);
    EXPECT_TRUE(view->GetEdit().hasFocus());
    EXPECT_EQ(WindowDesk::windowOf(report).GetPreviousView(), view);
    EXPECT_FALSE(view->GetWidget()->visibleRegion().isEmpty());
}

TEST(ReportWindowEntry, WithoutAnActiveViewThereIsNoneToGoBackTo)
{
    const WindowDesk desk;
    const UReportDoc *report = CreateReportWindow(QStringLiteral("Traverse"), false, false);
    EXPECT_EQ(WindowDesk::windowOf(report).GetPreviousView(), nullptr);
    EXPECT_EQ(desk.frame->GetActiveView(), nullptr);
}

TEST(ReportWindowEntry, ReportsOfOneNameAreNumbered)
{
    const WindowDesk desk;
    const QString name = QStringLiteral("Traverse");
    const UReportDoc *first = CreateReportWindow(name, false, false);
    const UReportDoc *second = CreateReportWindow(name, false, false);
    EXPECT_EQ(first->GetTitle(), QStringLiteral("Traverse"));
    EXPECT_EQ(second->GetTitle(), QStringLiteral("Traverse 2"));
    EXPECT_EQ(second->GetReportFileName(), name);
    EXPECT_EQ(WindowDesk::windowOf(second).GetWindowTextW(), name) << "the window has the name as given";
}

TEST(ReportWindowEntry, ANameThatIsNullOrEmptyLeavesTheCaptionEmpty)
{
    const WindowDesk desk;
    const UReportDoc *report = CreateReportWindow(QString(), false, false);
    ASSERT_NE(report, nullptr);
    EXPECT_EQ(report->GetTitle(), QString());
    EXPECT_EQ(report->GetReportFileName(), QString());
    EXPECT_EQ(WindowDesk::windowOf(report).GetDock()->windowTitle(), QString());
    EXPECT_TRUE(WindowDesk::windowOf(report).IsVisible());
}

TEST(ReportWindowEntry, WithoutAFrameTheReportHasNoWindow)
{
    WindowDesk desk;
    desk.frame.reset();
    UReportDoc *report = CreateReportWindow(QStringLiteral("Traverse"), true, false);
    ASSERT_NE(report, nullptr);
    EXPECT_EQ(report->GetReportWindow(), nullptr);
    EXPECT_EQ(report->GetTitle(), QStringLiteral("Traverse"));
    report->WriteLine(QStringLiteral("text"), 0, 1, 0);
    report->SetReportWindowActive();
    EXPECT_TRUE(textOf(*report).contains(QStringLiteral("text")));
}

TEST(ReportWindowEntry, WithoutPanesTheReportHasAWindowAndNoView)
{
    WindowDesk desk;
    desk.application.reset();
    desk.application.emplace();
    desk.application->AddDocTemplate(kareport::makeReportTemplate());
    const UReportDoc *report = CreateReportWindow(QStringLiteral("Traverse"), false, false);
    ASSERT_NE(report, nullptr);
    EXPECT_TRUE(report->GetViews().empty());
    EXPECT_TRUE(WindowDesk::windowOf(report).IsVisible());
}

TEST(ReportWindowEntry, WithoutATemplateOrADocumentNothingIsMade)
{
    WindowDesk desk;
    desk.application.reset();
    EXPECT_EQ(CreateReportWindow(QStringLiteral("N"), true, true), nullptr) << "no application";
    desk.application.emplace();
    EXPECT_EQ(CreateReportWindow(QStringLiteral("N"), true, true), nullptr) << "no template";
    desk.application->AddDocTemplate(std::make_unique<UDocTemplate>(
        1, [] { return std::unique_ptr<UDocument>(); }, UDocTemplate::PaneFactory(), UDocTemplate::ViewFactory(),
        QStringLiteral("REPORTDOCTEMPLATE"), 1, 1));
    EXPECT_EQ(CreateReportWindow(QStringLiteral("N"), true, true), nullptr) << "a template that makes no document";
    WindowDesk::settle();
    EXPECT_TRUE(desk.frame->findChildren<QDockWidget *>().isEmpty()) << "and no window either";
}

} // namespace
