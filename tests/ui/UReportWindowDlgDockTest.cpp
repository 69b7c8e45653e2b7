#include "ReportWindowFixture.h"

namespace
{

using ReportWindowDock = OwnReportWindow;

TEST_F(ReportWindowDock, TheActiveMarkShowsOnTheCaption)
{
    ASSERT_TRUE(create());
    QDockWidget &dock = *window.GetDock();
    const auto caption = [&] { return dock.grab(QRect(0, 0, dock.width(), 10)).toImage(); };
    const auto plain = caption();
    EXPECT_EQ(window.GetCaptionState(), COneViewPane::captionPlain);
    window.setActive(true);
    EXPECT_EQ(window.GetCaptionState(), COneViewPane::captionHighlighted);
    EXPECT_EQ(caption().pixelColor(dock.width() / 2, 5), dock.palette().color(QPalette::Highlight));
    EXPECT_EQ(dock.windowTitle(), QStringLiteral("Traverse"));
    dock.setFloating(true);
    WindowDesk::settle();
    EXPECT_EQ(dock.windowTitle(), QStringLiteral("● Traverse")) << "its caption is the window system's";
    EXPECT_EQ(dock.accessibleName(), QStringLiteral("Traverse")) << "a mark is nothing to be read out";
    window.setActive(false);
    EXPECT_EQ(dock.windowTitle(), QStringLiteral("Traverse"));
    dock.setFloating(false);
    WindowDesk::settle();
    EXPECT_EQ(caption(), plain);
}

TEST_F(ReportWindowDock, IsNeverATabAmongTheDocuments)
{
    UReportDoc *report = desk.openReport(QStringLiteral("Survey"));
    QDockWidget *document = dynamic_cast<COneViewPane *>(report->GetFrameWindow())->GetDock();
    ASSERT_TRUE(create());
    QDockWidget *dock = window.GetDock();
    const auto isAlone = [&] {
        return QTest::qWaitFor([&] { return desk.frame->tabifiedDockWidgets(dock).isEmpty(); }, 5000);
    };
    desk.frame->tabifyDockWidget(document, dock);
    ASSERT_FALSE(desk.frame->tabifiedDockWidgets(dock).isEmpty());
    EXPECT_TRUE(isAlone()) << "put among the documents";
    EXPECT_TRUE(dock->isVisible());
    EXPECT_TRUE(document->isVisible()) << "beside it";
    EXPECT_EQ(desk.frame->dockWidgetArea(dock), Qt::TopDockWidgetArea) << "where the user wanted it";

    desk.frame->addDockWidget(Qt::BottomDockWidgetArea, dock);
    WindowDesk::settle();
    desk.frame->tabifyDockWidget(dock, document);
    EXPECT_TRUE(isAlone()) << "a document put to it";

    desk.frame->addDockWidget(Qt::TopDockWidgetArea, document);
    desk.frame->addDockWidget(Qt::TopDockWidgetArea, dock);
    WindowDesk::settle();
    dock->raise();
    UReportDoc *second = desk.openReport(QStringLiteral("Second"));
    EXPECT_TRUE(desk.frame->tabifiedDockWidgets(dock).isEmpty());
    QDockWidget *secondDocument = dynamic_cast<COneViewPane *>(second->GetFrameWindow())->GetDock();
    EXPECT_TRUE(desk.frame->tabifiedDockWidgets(document).contains(secondDocument))
        << "a new document goes to the documents";

    desk.frame->tabifyDockWidget(secondDocument, dock);
    EXPECT_TRUE(isAlone()) << "put among several";
    desk.frame->removeDockWidget(dock);
    desk.frame->tabifyDockWidget(document, dock);
    dock->show();
    EXPECT_TRUE(isAlone()) << "put among the tabs of a whole area";
    EXPECT_TRUE(desk.frame->tabifiedDockWidgets(document).contains(secondDocument)) << "the documents stay together";
}

TEST_F(ReportWindowDock, MayBeATabAmongReportWindows)
{
    UReportDoc *report = desk.openReport(QStringLiteral("Survey"));
    QDockWidget *document = dynamic_cast<COneViewPane *>(report->GetFrameWindow())->GetDock();
    ASSERT_TRUE(create());
    UReportWindowDlg other;
    ASSERT_TRUE(other.createDocked(QStringLiteral("Other"), nullptr));
    WindowDesk::settle();
    EXPECT_TRUE(desk.frame->tabifiedDockWidgets(window.GetDock()).isEmpty()) << "as the frame docks them";
    desk.frame->tabifyDockWidget(window.GetDock(), other.GetDock());
    WindowDesk::settle();
    WindowDesk::settle();
    EXPECT_EQ(desk.frame->tabifiedDockWidgets(window.GetDock()), QList<QDockWidget *>{other.GetDock()});

    desk.frame->tabifyDockWidget(window.GetDock(), document);
    EXPECT_TRUE(QTest::qWaitFor([&] { return desk.frame->tabifiedDockWidgets(document).isEmpty(); }, 5000))
        << "a document put to them";
    EXPECT_TRUE(window.IsVisible());
    EXPECT_TRUE(other.IsVisible());
}

TEST_F(ReportWindowDock, AFrameThatMakesTabsOfEverythingIsObeyed)
{
    UReportDoc *report = desk.openReport(QStringLiteral("Survey"));
    QDockWidget *document = dynamic_cast<COneViewPane *>(report->GetFrameWindow())->GetDock();
    ASSERT_TRUE(create());
    desk.frame->setDockOptions(desk.frame->dockOptions() | QMainWindow::ForceTabbedDocks);
    desk.frame->tabifyDockWidget(document, window.GetDock());
    WindowDesk::settle();
    EXPECT_EQ(desk.frame->tabifiedDockWidgets(window.GetDock()), QList<QDockWidget *>{document});
    EXPECT_TRUE(window.IsVisible());
}

TEST_F(ReportWindowDock, ADocumentThatFloatsIsNotATab)
{
    UReportDoc *report = desk.openReport(QStringLiteral("Survey"));
    QDockWidget *document = dynamic_cast<COneViewPane *>(report->GetFrameWindow())->GetDock();
    ASSERT_TRUE(create());
    desk.frame->addDockWidget(Qt::RightDockWidgetArea, window.GetDock());
    document->setFloating(true);
    desk.frame->tabifyDockWidget(window.GetDock(), document);
    document->setFloating(true);
    WindowDesk::settle();
    EXPECT_TRUE(document->isFloating());
    EXPECT_FALSE(window.GetDock()->isFloating());
    EXPECT_EQ(desk.frame->dockWidgetArea(window.GetDock()), Qt::RightDockWidgetArea);
}

TEST_F(ReportWindowDock, ItsCaptionIsNotADocumentsTitle)
{
    ASSERT_TRUE(create());
    EXPECT_FALSE(paneCaptions().contains(QStringLiteral("Traverse")));
    EXPECT_EQ(desk.openReport(QStringLiteral("Traverse"))->GetTitle(), QStringLiteral("Traverse"));
}

TEST_F(ReportWindowDock, BringsThePaneOfThePreviousViewToTheFront)
{
    UReportDoc *report = desk.openReport(QStringLiteral("Survey"));
    ASSERT_TRUE(create(QStringLiteral("Traverse"), report->GetViews().front()));
    auto *view = dynamic_cast<UReportView *>(report->GetViews().front());
    desk.openReport(QStringLiteral("Other"));
    const auto isSeen = [view] { return !view->GetWidget()->visibleRegion().isEmpty(); };
    ASSERT_FALSE(isSeen()) << "behind the other's tab";
    window.ActivatePreviousView();
    WindowDesk::settle();
    EXPECT_TRUE(isSeen());
    EXPECT_EQ(desk.frame->GetActiveView(), view) << "what is in front is active";
    EXPECT_TRUE(view->GetEdit().hasFocus());

    view->GetParentPane()->ClosePane();
    EXPECT_EQ(window.GetPreviousView(), nullptr);
    window.ActivatePreviousView();
}

} // namespace
