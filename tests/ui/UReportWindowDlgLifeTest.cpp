#include "ReportWindowFixture.h"

#include <gtest/gtest.h>

namespace
{

UReportDoc *createWritten(const QString &name = QStringLiteral("Traverse"))
{
    UReportDoc *report = CreateReportWindow(name, false, false);
    for (int i = 0; i < 10; ++i) {
        report->WriteLine(QStringLiteral("line %1").arg(i), 0, 1, 0);
    }
    return report;
}

int docksOf(const UXTPMDIFrameWnd &frame)
{
    return static_cast<int>(frame.findChildren<QDockWidget *>().size());
}

TEST(UReportWindowDlgLife, GoesWithItsReport)
{
    for (const bool shown : {true, false}) {
        const WindowDesk desk;
        UReportDoc *report = createWritten();
        const QPointer<QDockWidget> dock = WindowDesk::windowOf(report).GetDock();
        report->ShowReportBar(report->GetReportWindow(), shown);
        if (shown) {
            WindowDesk::settle(); // otherwise while lines wait to be shown
        }
        report->OnCloseDocument();
        EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
        WindowDesk::settle();
        EXPECT_TRUE(dock.isNull());
        EXPECT_EQ(docksOf(*desk.frame), 0) << "nor is the report's own pane left";
    }
}

TEST(UReportWindowDlgLife, TheReportOutlivesItsClosedWindow)
{
    const WindowDesk desk;
    UReportDoc *report = createWritten();
    UReportWindowDlg &window = WindowDesk::windowOf(report);
    window.ClosePane();
    report->WriteLine(QStringLiteral("before the window has gone"), 0, 1, 0);
    WindowDesk::settle();
    report->WriteLine(QStringLiteral("and after"), 0, 1, 0);
    report->SetReportWindowActive();
    report->ShowReportBar(&window, true);
    EXPECT_FALSE(window.isCreated());
    report->OnCloseDocument();
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
}

TEST(UReportWindowDlgLife, WithoutAutoDeleteOnlyTheWindowCloses)
{
    const WindowDesk desk;
    UReportDoc *report = createWritten();
    report->SetAutoDelete(false);
    report->OnCloseDocument();
    ASSERT_TRUE(UReportDoc::IsReportAvailable(report));
    EXPECT_FALSE(WindowDesk::windowOf(report).isCreated());
    EXPECT_TRUE(report->GetViews().empty());
    WindowDesk::settle();
    EXPECT_EQ(docksOf(*desk.frame), 0);
    report->SetAutoDelete(true);
}

TEST(UReportWindowDlgLife, ADeferredCloseLeavesEverythingOpen)
{
    const WindowDesk desk;
    UReportDoc *report = createWritten();
    report->SetCloseDocument(1);
    report->OnCloseDocument();
    ASSERT_TRUE(UReportDoc::IsReportAvailable(report));
    EXPECT_TRUE(WindowDesk::windowOf(report).IsVisible());
    EXPECT_EQ(report->GetViews().size(), 1U);
    report->CloseReportDocument();
    ASSERT_TRUE(UReportDoc::IsReportAvailable(report)) << "only asked for";
    report->CloseReportDocument();
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
}

TEST(UReportWindowDlgLife, TheFrameMayGoFirst)
{
    for (const bool created : {true, false}) {
        WindowDesk desk;
        UReportDoc *report = createWritten();
        UReportWindowDlg &window = WindowDesk::windowOf(report);
        if (!created) {
            window.ClosePane();
        }
        desk.frame.reset();
        WindowDesk::settle();
        EXPECT_FALSE(window.isCreated());
        EXPECT_EQ(window.GetOwningPane(), nullptr);
        report->WriteLine(QStringLiteral("line"), 0, 1, 0);
        report->SetReportWindowActive();
        UReportDoc::ShowReportBar(&window, true);
        window.OnPressCloseButton();

        // The next frame gets a window again.
        desk.frame.emplace();
        desk.frame->show();
        report->UpdateReportInfo(QStringLiteral("Traverse"), false, false);
        EXPECT_TRUE(window.isCreated());
        EXPECT_EQ(desk.frame->dockWidgetArea(window.GetDock()), Qt::BottomDockWidgetArea);
        report->WriteLine(QStringLiteral("line"), 0, 1, 0);
        EXPECT_EQ(WindowDesk::rowsOf(window), QStringList{QStringLiteral("line")});
    }
}

TEST(UReportWindowDlgLife, TheApplicationMayGoFirst)
{
    WindowDesk desk;
    createWritten();
    createWritten(QStringLiteral("Second"));
    WindowDesk::settle();
    desk.application.reset();
    WindowDesk::settle();
    EXPECT_EQ(docksOf(*desk.frame), 0);
}

TEST(UReportWindowDlgLife, TheApplicationTakesReportsThatDeferTheirClosing)
{
    WindowDesk desk;
    UReportDoc *report = createWritten();
    report->SetCloseDocument(1);
    desk.application.reset();
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
    WindowDesk::settle();
    EXPECT_EQ(docksOf(*desk.frame), 0);
}

TEST(UReportWindowDlgLife, AWindowThatGoesLeavesItsReport)
{
    const WindowDesk desk;
    UReportDoc *report = createWritten();
    delete report->GetReportWindow();
    EXPECT_EQ(report->GetReportWindow(), nullptr);
    report->WriteLine(QStringLiteral("line"), 0, 1, 0);
    WindowDesk::settle();
    EXPECT_EQ(docksOf(*desk.frame), 1) << "the report's own pane";
}

TEST(UReportWindowDlgLife, AWindowOutlivesAReportThatDoesNotOwnIt)
{
    const WindowDesk desk;
    UReportWindowDlg window;
    {
        UReportDoc report;
        window.SetReportDoc(&report);
        EXPECT_EQ(window.GetReportDoc(), &report);
    }
    EXPECT_EQ(window.GetReportDoc(), nullptr);
    ASSERT_TRUE(window.createDocked(QStringLiteral("Traverse"), nullptr));
    window.setActive(true);
    window.UpdateDocumentData();
    window.OnSave();
    window.OnPrint();
    window.ShowReport();
    EXPECT_TRUE(window.isCreated()) << "there is no report to do anything with";
    window.OnPressCloseButton();
    EXPECT_FALSE(window.isCreated());
}

TEST(UReportWindowDlgLife, ItsOwnButtonMayCloseIt)
{
    const WindowDesk desk;
    UReportDoc *report = createWritten();
    UReportWindowDlg &window = WindowDesk::windowOf(report);
    window.setActive(true);
    WindowDesk::settle();
    CReportToolBar *bar = window.GetToolBar();
    QTest::mouseClick(bar->widgetForAction(bar->actions().at(1)), Qt::LeftButton);
    EXPECT_FALSE(window.isCreated());
    report->OnCloseDocument(); // while what was clicked still waits to be deleted
    WindowDesk::settle();
    EXPECT_EQ(docksOf(*desk.frame), 0);
}

TEST(UReportWindowDlgLife, ManyReportsHaveTheirWindowsBesideEachOther)
{
    const WindowDesk desk;
    std::vector<UReportDoc *> reports;
    for (const char *name : {"first", "second", "third"}) {
        reports.push_back(createWritten(QString::fromUtf8(name)));
    }
    WindowDesk::settle();
    for (UReportDoc *report : reports) {
        UReportWindowDlg &window = WindowDesk::windowOf(report);
        EXPECT_TRUE(desk.frame->tabifiedDockWidgets(window.GetDock()).isEmpty());
        EXPECT_FALSE(window.GetList()->visibleRegion().isEmpty()) << window.GetWindowTextW().toStdString();
    }
    reports[1]->OnCloseDocument();
    WindowDesk::settle();
    EXPECT_EQ(WindowDesk::rowsOf(WindowDesk::windowOf(reports[0])).size(), 10);
    EXPECT_EQ(WindowDesk::rowsOf(WindowDesk::windowOf(reports[2])).size(), 10);
}

TEST(UReportWindowDlgLife, HundredsOfThousandsOfLinesAreAllThere)
{
    const WindowDesk desk;
    UReportDoc *report = CreateReportWindow(QStringLiteral("Long"), false, false);
    const UReportList &list = *WindowDesk::windowOf(report).GetList();
    constexpr int count = 300000;
    const auto line = [](int number) {
        const QString text = QStringLiteral("  point %1  N 45°12'30\" E  1234.567").arg(number);
        return number % 1000 == 0 ? text + QStringLiteral(" 測量") : text;
    };
    for (int i = 0; i < count; ++i) {
        report->WriteLine(line(i), 0, 1, 0);
        if (i % 10000 == 0) {
            QCoreApplication::processEvents(); // as a job does that runs with its progress shown
            ASSERT_EQ(list.GetCount(), i + 1);
            ASSERT_EQ(list.GetCurSel(), i);
        }
    }
    ASSERT_TRUE(QTest::qWaitFor([&] { return list.model()->rowCount() == count; }, 5000));
    EXPECT_EQ(list.currentIndex().row(), count - 1);
    EXPECT_TRUE(list.viewport()->rect().contains(list.visualRect(list.currentIndex()).center()));
    const QStringList text = textOf(*report).split(QStringLiteral("\r\n"), Qt::SkipEmptyParts);
    ASSERT_EQ(text.size(), count);
    for (int i = 0; i < count; ++i) {
        ASSERT_EQ(list.GetText(i), text[i]) << i;
    }
}

} // namespace
