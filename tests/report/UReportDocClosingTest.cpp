#include "FrameFixture.h"
#include "ReportFixture.h"
#include "TemporaryFolder.h"

#include <gtest/gtest.h>

#include <memory>
#include <vector>

namespace
{

class WatchedReport : public UReportDoc
{
public:
    WatchedReport(QString &log, UDocument *owner, bool handler = false)
        : UReportDoc(QStringLiteral("Watched"), false, false, owner), log_(log), handler_(handler)
    {}
    ~WatchedReport() override { log_ += QStringLiteral("gone "); }
    void OnDocumentEvent(DocumentEvent event) override
    {
        if (event == DocumentEvent::AfterCloseDocument) {
            log_ += QStringLiteral("closed ");
        }
    }
    bool IsSearchAndOrganizeHandler() const override { return handler_; }

private:
    QString &log_;
    bool handler_;
};

class Owner : public UDocument
{
public:
    explicit Owner(QString &log) : log_(log) {}
    void OnReportClosed(UDocument *) override { log_ += QStringLiteral("told "); }

private:
    QString &log_;
};

/// Counts how often panes of this kind have gone.
class MortalPane : public CViewPane
{
public:
    explicit MortalPane(int &gone) : gone_(gone) {}
    ~MortalPane() override { ++gone_; }

private:
    int &gone_;
};

TEST(UReportDocClosing, TheWindowsPaneMayHaveBeenClosedBefore)
{
    const FixedSurroundings surroundings;
    QString log;
    int gone = 0;
    auto *report = new WatchedReport(log, nullptr);
    auto *pane = new MortalPane(gone);
    report->SetReportWindow(new TestReportWindow(pane));
    pane->ClosePane();
    ASSERT_EQ(gone, 1);
    report->OnCloseDocument();
    EXPECT_EQ(log, QStringLiteral("closed gone "));
    EXPECT_EQ(gone, 1);
}

TEST(UReportDocClosing, TheWindowsPaneThatShowsTheReportIsClosedOnce)
{
    const FixedSurroundings surroundings;
    QString log;
    int gone = 0;
    auto *report = new WatchedReport(log, nullptr);
    auto *pane = new MortalPane(gone);
    showIn<TestReportView>(*pane, *report);
    report->SetReportWindow(new TestReportWindow(pane));
    report->OnCloseDocument();
    EXPECT_EQ(log, QStringLiteral("closed gone "));
    EXPECT_EQ(gone, 1);
}

/// A window that looks at its report when it is destroyed.
class LastLookWindow : public TestReportWindow
{
public:
    LastLookWindow(const UReportDoc &report, QString &log) : report_(report), log_(log) {}
    ~LastLookWindow() override
    {
        log_ += UReportDoc::IsReportAvailable(&report_) ? QStringLiteral("available ") : QStringLiteral("unavailable ");
        log_ += report_.GetReportWindow() == nullptr ? QStringLiteral("unlinked") : QStringLiteral("linked");
    }

private:
    const UReportDoc &report_;
    QString &log_;
};

TEST(UReportDocClosing, AWindowThatGoesFindsNoReportAndNoLink)
{
    const FixedSurroundings surroundings;
    QString log;
    {
        UReportDoc report;
        report.SetReportWindow(new LastLookWindow(report, log));
    }
    EXPECT_EQ(log, QStringLiteral("unavailable unlinked"));
}

TEST(UReportDocClosing, ASearchThatStaysStillClosesItsWindowsPane)
{
    const FixedSurroundings surroundings;
    QString log;
    int gone = 0;
    {
        WatchedReport report(log, nullptr, true);
        report.SetAutoDelete(false);
        report.SetReportWindow(new TestReportWindow(new MortalPane(gone)));
        report.OnCloseDocument();
        EXPECT_EQ(log, QString()) << "neither closed nor gone";
        EXPECT_TRUE(UReportDoc::IsReportAvailable(&report));
        EXPECT_EQ(gone, 1);
    }
    EXPECT_EQ(gone, 1);
}

TEST(UReportDocClosing, DocumentsCloseWithTheirApplication)
{
    const FixedSurroundings surroundings;
    QString log;
    int gone = 0;
    Owner owner(log);
    {
        UApplication application;
        UDocTemplate *reports = application.AddDocTemplate(std::make_unique<UDocTemplate>(
            1, [&] { return std::make_unique<WatchedReport>(log, &owner); }, [&] { return new MortalPane(gone); },
            [] { return std::make_unique<TestReportView>(); }, QStringLiteral("REPORTDOCTEMPLATE"), 1, 1));
        for (int i = 0; i < 2; ++i) {
            ASSERT_NE(reports->OpenReportDocumentFile(QString(), 1, 1, nullptr, 0, nullptr), nullptr);
        }
        static_cast<UReportDoc *>(reports->GetDocuments().front())->SetModifiedFlag(true);
        EXPECT_EQ(log, QString());
    }
    EXPECT_EQ(log, QStringLiteral("closed told gone closed told gone ")) << "without asking";
    EXPECT_EQ(gone, 2) << "and their panes with them";
}

TEST(UReportDocClosing, AnOwnerIsToldOfAReportThatGoesWithTheApplicationWhileItsClosingIsDeferred)
{
    const FixedSurroundings surroundings;
    QString log;
    Owner owner(log);
    UApplication application;
    UDocTemplate *reports = application.AddDocTemplate(std::make_unique<UDocTemplate>(
        1, [&] { return std::make_unique<WatchedReport>(log, &owner); }, nullptr, nullptr,
        QStringLiteral("REPORTDOCTEMPLATE"), 1, 1));
    auto *report = dynamic_cast<UReportDoc *>(reports->OpenReportDocumentFile(QString(), 0, 0, nullptr, 0, nullptr));
    ASSERT_NE(report, nullptr);
    report->SetReportWindow(new TestReportWindow);
    report->SetCloseDocument(1);
    reports->CloseAllDocuments();
    EXPECT_EQ(log, QStringLiteral("closed told gone "));
}

/// Closes the report when it is updated.
class ClosingView : public UView
{
public:
    void OnUpdate(UView *, long, void *) override { GetDocument()->OnCloseDocument(); }
};

TEST(UReportDocClosing, AViewMayCloseAReportThatIsBeingOpened)
{
    const FixedSurroundings surroundings;
    const TemporaryFolder folder;
    putFile(folder.at(QStringLiteral("a.rep")), "TALVEN\r\r\n");
    QString log;
    auto *report = new WatchedReport(log, nullptr);
    showIn<ClosingView>(*new CViewPane, *report);
    EXPECT_FALSE(report->OnOpenDocument(folder.at(QStringLiteral("a.rep"))));
    EXPECT_EQ(log, QStringLiteral("closed gone "));
}

TEST(UReportDocClosing, ATitleThatIsGivenAgainIsNumberedFromTheSameTitle)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetTitle(QStringLiteral("N"));
    CViewPane panes[2];
    panes[0].SetWindowTextW(QStringLiteral("N"));
    panes[1].SetWindowTextW(QStringLiteral("N 2"));
    report.SetTitle(report.GetTitle());
    EXPECT_EQ(report.GetTitle(), QStringLiteral("N 3"));
}

TEST(UReportDocClosing, TheCaptionOfANumberedPaneIsNotItsTitle)
{
    const FixedSurroundings surroundings;
    ReportApplication application;
    UReportDoc *first = application.create(QStringLiteral("N"));
    first->Activate(true);
    ASSERT_EQ(first->GetViews().size(), 2U);
    EXPECT_EQ(first->GetViews()[0]->GetParentPane()->GetCaption(), QStringLiteral("N:1"));
    EXPECT_EQ(first->GetViews()[1]->GetParentPane()->GetCaption(), QStringLiteral("N:2"))
        << "the new pane has the report's title";
    EXPECT_EQ(application.create(QStringLiteral("N"))->GetTitle(), QStringLiteral("N")) << "no caption is N";
    EXPECT_EQ(application.create(QStringLiteral("N:2"))->GetTitle(), QStringLiteral("N:2 2")) << "but one is N:2";
}

TEST(UReportDocClosing, AFileThatCannotBeOpenedLeavesTheGivenPaneAsItWas)
{
    const FixedSurroundings surroundings;
    const ReportApplication application;
    CViewPane pane;
    const QString missing = QStringLiteral("/no/such/folder/a.rep");
    EXPECT_EQ(application.reportTemplate()->OpenReportDocumentFile(missing, 1, 1, &pane, 0, nullptr), nullptr);
    EXPECT_TRUE(pane.GetViews().empty());
    EXPECT_TRUE(CViewPane::IsOpen(&pane));
    EXPECT_TRUE(application.reportTemplate()->GetDocuments().empty());
    EXPECT_NE(CreateReport(QStringLiteral("N"), false, false, &pane, 0, nullptr), nullptr) << "and it can be used";
    EXPECT_EQ(pane.GetViews().size(), 1U);
}

TEST(UReportDocClosing, StyleAndPlaceReachANewPane)
{
    const FixedSurroundings surroundings;
    const ReportApplication application;
    const QRect place(10, -20, 300, 400);
    const UReportDoc *placed = CreateReport(QStringLiteral("A"), false, false, nullptr, 0x80001000U, &place);
    ASSERT_NE(placed, nullptr);
    EXPECT_EQ(placed->GetFrameWindow()->GetStyle(), 0x80001000U);
    EXPECT_EQ(placed->GetFrameWindow()->GetRect(), std::optional(place));
    UReportDoc *usual = CreateReport(QStringLiteral("B"), false, false, nullptr, 0, nullptr);
    ASSERT_NE(usual, nullptr);
    EXPECT_EQ(usual->GetFrameWindow()->GetStyle(), 0U);
    EXPECT_EQ(usual->GetFrameWindow()->GetRect(), std::nullopt);
    usual->Activate(true);
    EXPECT_EQ(usual->GetViews()[1]->GetParentPane()->GetStyle(), 4096U);
}

} // namespace
