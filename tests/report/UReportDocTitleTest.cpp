#include "ReportFixture.h"

#include <gtest/gtest.h>

#include <vector>

namespace
{

TEST(UReportDocTitle, ReportsOfOneNameAreNumberedWhileTheirPanesAreOpen)
{
    const FixedSurroundings surroundings;
    ReportApplication application;
    const QString name = QStringLiteral("Traverse");
    UReportDoc *first = application.create(name);
    UReportDoc *second = application.create(name);
    UReportDoc *third = application.create(name);
    ASSERT_NE(third, nullptr);
    EXPECT_EQ(first->GetTitle(), QStringLiteral("Traverse"));
    EXPECT_EQ(second->GetTitle(), QStringLiteral("Traverse 2"));
    EXPECT_EQ(third->GetTitle(), QStringLiteral("Traverse 3"));
    for (UReportDoc *report : {first, second, third}) {
        EXPECT_EQ(report->UDocument::GetTitle(), report->GetTitle());
        EXPECT_EQ(report->GetFrameWindow()->GetWindowTextW(), report->GetTitle());
        EXPECT_EQ(report->GetReportFileName(), name) << "the file name is not numbered";
    }
    second->OnCloseDocument();
    EXPECT_EQ(application.create(name)->GetTitle(), QStringLiteral("Traverse 2")) << "the number is free again";
}

TEST(UReportDocTitle, TheHeaderKeepsTheTitleAsGiven)
{
    const FixedSurroundings surroundings;
    CViewPane pane;
    pane.SetWindowTextW(QStringLiteral("Traverse"));
    UReportDoc report;
    report.FixPage(72, 80);
    report.SetTitle(QStringLiteral("Traverse"));
    EXPECT_EQ(report.GetTitle(), QStringLiteral("Traverse 2"));
    report.SetHeaderFlag(true);
    report.NewPage(0);
    EXPECT_EQ(textOf(report), reportLines(headerOf(QStringLiteral("Traverse"), 1) + QStringLiteral("\n\n\n\n")));
}

TEST(UReportDocTitle, TheFirstFreeNumberFrom2IsTaken)
{
    struct Row
    {
        QStringList captions;
        QString title;
        QString expected;
        const char *reason;
        int number = 0; ///< of the first pane among those of its document, the next one counting on; 0 for none
    };
    const QString n = QStringLiteral("N");
    const QString n2 = QStringLiteral("N 2");
    const QString n3 = QStringLiteral("N 3");
    const Row rows[] = {
        {{}, n, n, "no pane is open"},
        {{QStringLiteral("other")}, n, n, "no pane of that caption"},
        {{n}, n, n2, "one blank and the number"},
        {{QStringLiteral("n")}, n, n2, "case does not matter"},
        {{n2}, n, n, "only the numbered one is open"},
        {{n3, n2, n}, n, QStringLiteral("N 4"), "searched again from the first caption"},
        {{n, n3}, n, n2, "a gap is filled"},
        {{n, n}, n, n2, "a caption that is open twice counts once"},
        {{n, n2}, n2, QStringLiteral("N 2 2"), "a given number is part of the title"},
        {{QStringLiteral("N ")}, n, n, "a blank makes another caption"},
        {{n + QStringLiteral(" long")}, n, n, "the whole caption counts"},
        {{QString::fromUtf8("\xC3\x9C")},
         QString::fromUtf8("\xC3\xBC"),
         QString::fromUtf8("\xC3\xBC 2"),
         "case does not matter beyond ASCII"},
        {{n}, n, n, "the only pane left of several shows its number: it is another caption", 2},
        {{n, n}, n, n, "likewise of two panes that are open", 1},
        {{n2, n2}, n2, n2, "or of a document that has a number already", 1},
        {{n}, QStringLiteral("N:1"), QStringLiteral("N:1 2"), "a caption with its number counts as it is shown", 1},
        {{n, n}, QStringLiteral("n:2"), QStringLiteral("n:2 2"), "of the second pane as well", 1},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        std::vector<std::unique_ptr<CViewPane>> panes;
        for (const QString &caption : row.captions) {
            panes.push_back(std::make_unique<CViewPane>());
            panes.back()->SetWindowTextW(caption);
            panes.back()->SetWindowNumber(row.number > 0 ? row.number + static_cast<int>(panes.size()) - 1 : 0);
        }
        UReportDoc report;
        report.SetTitle(row.title);
        EXPECT_EQ(report.GetTitle(), row.expected) << row.reason;
        EXPECT_EQ(report.UDocument::GetTitle(), row.expected) << row.reason;
    }
}

TEST(UReportDocTitle, AReportsOwnPanesDoNotCount)
{
    const FixedSurroundings surroundings;
    ReportApplication application;
    UReportDoc *report = application.create(QStringLiteral("N"));
    report->SetTitle(QStringLiteral("N"));
    EXPECT_EQ(report->GetTitle(), QStringLiteral("N"));
    report->Activate(true);
    report->SetTitle(QStringLiteral("N"));
    EXPECT_EQ(report->GetTitle(), QStringLiteral("N")) << "nor do several";
    for (int run = 1; run <= 3; ++run) {
        report->UpdateReportInfo(QStringLiteral("N"), true, false);
        EXPECT_EQ(report->GetTitle(), QStringLiteral("N")) << "run " << run;
    }
    CViewPane other;
    other.SetWindowTextW(QStringLiteral("N"));
    report->SetTitle(QStringLiteral("N"));
    EXPECT_EQ(report->GetTitle(), QStringLiteral("N 2")) << "another document's pane";
    report->SetTitle(QStringLiteral("N"));
    EXPECT_EQ(report->GetTitle(), QStringLiteral("N 2")) << "and the same again";
}

TEST(UReportDocTitle, AReportInNumberedPanesLeavesItsTitleToOthers)
{
    const FixedSurroundings surroundings;
    ReportApplication application;
    UReportDoc *first = application.create(QStringLiteral("Traverse"));
    first->Activate(true);
    ASSERT_EQ(first->GetViews().size(), 2U);
    for (const UView *view : first->GetViews()) {
        view->GetParentPane()->ShowPane(true);
    }
    ASSERT_EQ(first->GetFrameWindow()->GetCaption(), QStringLiteral("Traverse:1"));
    const UReportDoc *second = application.create(QStringLiteral("Traverse"));
    EXPECT_EQ(second->GetTitle(), QStringLiteral("Traverse")) << "no pane shows that";
    EXPECT_EQ(application.create(QStringLiteral("Traverse"))->GetTitle(), QStringLiteral("Traverse 2"));
    first->GetViews().back()->GetParentPane()->ClosePane();
    ASSERT_EQ(first->GetFrameWindow()->GetCaption(), QStringLiteral("Traverse"));
    EXPECT_EQ(application.create(QStringLiteral("Traverse 2"))->GetTitle(), QStringLiteral("Traverse 2 2"));
}

TEST(UReportDocTitle, AnEmptyTitleIsNeverNumbered)
{
    const FixedSurroundings surroundings;
    ReportApplication application;
    for (int i = 0; i < 3; ++i) {
        UReportDoc *report = application.create(QString());
        report->SetTitle(QLatin1String(""));
        EXPECT_EQ(report->GetTitle(), QString()) << i;
    }
}

TEST(UReportDocTitle, TheFrameWindowIsThePaneOfTheFirstReportView)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetAutoDelete(false);
    EXPECT_EQ(report.GetFrameWindow(), nullptr) << "no view";
    CViewPane plain;
    CViewPane first;
    CViewPane second;
    showIn<UView>(plain, report);
    EXPECT_EQ(report.GetFrameWindow(), nullptr) << "no view that shows the report";
    showIn<TestReportView>(first, report);
    showIn<TestReportView>(second, report);
    EXPECT_EQ(report.GetFrameWindow(), &first);
}

TEST(UReportDocTitle, TheWindowTextReachesTheFirstViewOnlyAndOnlyAReportView)
{
    const FixedSurroundings surroundings;
    const QString text = QStringLiteral("text");
    UReportDoc report;
    report.SetAutoDelete(false);
    report.SetWindowTextW(text); // without a view there is nothing to tell
    {
        CViewPane plain;
        CViewPane shows;
        showIn<UView>(plain, report);
        showIn<TestReportView>(shows, report);
        report.SetWindowTextW(text);
        EXPECT_EQ(plain.GetWindowTextW(), QString()) << "not a report view";
        EXPECT_EQ(shows.GetWindowTextW(), QString()) << "not the first view";
    }
    {
        CViewPane first;
        CViewPane second;
        showIn<TestReportView>(first, report);
        showIn<TestReportView>(second, report);
        report.SetWindowTextW(text);
        EXPECT_EQ(first.GetWindowTextW(), text);
        EXPECT_EQ(second.GetWindowTextW(), QString());
        EXPECT_EQ(report.GetTitle(), QString()) << "the title stays";
    }
    TestReportView withoutPane;
    report.AddView(&withoutPane);
    report.SetWindowTextW(text);
    EXPECT_EQ(report.GetFrameWindow(), nullptr);
}

TEST(UReportDocTitle, VisiblePanesAreNumberedFrom1AndAnOnlyOneHasNoNumber)
{
    struct Row
    {
        std::vector<int> views;    // the pane of each view
        std::vector<bool> visible; // by pane
        std::vector<int> expected; // by pane; 9 before
        const char *reason;
    };
    const Row rows[] = {
        {{0}, {true}, {0}, "an only pane"},
        {{0}, {false}, {0}, "a hidden pane has none"},
        {{0, 1}, {true, true}, {1, 2}, "two panes in the order of their views"},
        {{1, 0}, {true, true}, {2, 1}, "two panes in the order of their views"},
        {{0, 1}, {true, false}, {0, 0}, "one of two can be seen"},
        {{0, 1}, {false, true}, {0, 0}, "one of two can be seen"},
        {{0, 0}, {true}, {0}, "two views in one pane"},
        {{0, 1, 0, 2}, {true, true, true}, {1, 2, 3}, "a pane counts once"},
        {{2, 1, 0}, {true, false, true}, {2, 0, 1}, "the hidden one takes no number"},
        {{}, {true}, {9}, "a pane of another document"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        UReportDoc report;
        report.SetAutoDelete(false);
        CountingPane panes[3];
        for (const int pane : row.views) {
            showIn<TestReportView>(panes[pane], report);
        }
        for (std::size_t i = 0; i < row.visible.size(); ++i) {
            panes[i].ShowPane(row.visible[i]);
        }
        for (std::size_t i = 0; i < row.visible.size(); ++i) {
            panes[i].SetWindowNumber(9);
            panes[i].titleUpdates = 0;
        }
        report.UpdateFrameCounts();
        for (std::size_t i = 0; i < row.expected.size(); ++i) {
            EXPECT_EQ(panes[i].GetWindowNumber(), row.expected[i]) << row.reason << ", pane " << i;
            EXPECT_EQ(panes[i].titleUpdates, row.expected[i] == 9 ? 0 : 1) << row.reason << ", pane " << i;
        }
    }
}

TEST(UReportDocTitle, ActivatingOpensANewPaneAndUpdatesAllViews)
{
    const FixedSurroundings surroundings;
    UReportDoc alone;
    alone.Activate(true); // no application: no pane, and nothing to update
    EXPECT_TRUE(alone.GetViews().empty());

    ReportApplication application;
    UReportDoc *report = application.create(QStringLiteral("N"));
    ASSERT_EQ(report->GetViews().size(), 1U);
    auto *first = static_cast<TestReportView *>(report->GetViews().front());
    for (const bool reserved : {false, true}) {
        first->updates = 0;
        report->Activate(reserved);
        EXPECT_EQ(first->updates, 1) << reserved;
    }
    ASSERT_EQ(report->GetViews().size(), 3U);
    for (std::size_t i = 0; i < 3; ++i) {
        EXPECT_TRUE(report->GetViews()[i]->IsVisible());
        EXPECT_EQ(report->GetViews()[i]->GetParentPane()->GetWindowNumber(), static_cast<int>(i + 1));
    }
    EXPECT_EQ(static_cast<TestReportView *>(report->GetViews()[2])->updates, 2) << "shown first, then updated with all";
}

} // namespace
