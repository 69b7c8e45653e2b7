#include "ReportFixture.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <memory>
#include <new>
#include <vector>

namespace
{

/// A document that writes down its end.
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
            log_ += GetViews().empty() ? QStringLiteral("closed ") : QStringLiteral("closed with views ");
        }
    }
    void DeleteContents() override { log_ += QStringLiteral("emptied "); }
    bool IsSearchAndOrganizeHandler() const override { return handler_; }

private:
    QString &log_;
    bool handler_;
};

/// A host document that is notified when its report is deleted.
class Owner : public UDocument
{
public:
    explicit Owner(QString &log) : log_(log) {}
    void OnReportClosed(UDocument *report) override
    {
        log_ += UReportDoc::IsReportAvailable(static_cast<UReportDoc *>(report)) ? QStringLiteral("told ")
                                                                                 : QStringLiteral("told too late ");
    }

private:
    QString &log_;
};

bool isOpen(const QString &caption)
{
    QStringList captions;
    CViewPane::GetPaneCaptions(captions);
    return captions.contains(caption);
}

TEST(UReportDocLife, AReportIsAvailableWhileItLives)
{
    const FixedSurroundings surroundings;
    EXPECT_FALSE(UReportDoc::IsReportAvailable(nullptr));
    alignas(UReportDoc) std::byte places[2][sizeof(UReportDoc)];
    const auto at = [&places](int i) { return reinterpret_cast<UReportDoc *>(places[i]); };
    EXPECT_FALSE(UReportDoc::IsReportAvailable(at(0))) << "not made yet";
    new (places[0]) UReportDoc;
    new (places[1]) UReportDoc(QStringLiteral("x"), false, false, nullptr);
    EXPECT_TRUE(UReportDoc::IsReportAvailable(at(0)));
    EXPECT_TRUE(UReportDoc::IsReportAvailable(at(1)));
    std::destroy_at(at(0));
    EXPECT_FALSE(UReportDoc::IsReportAvailable(at(0)));
    EXPECT_TRUE(UReportDoc::IsReportAvailable(at(1)));
    std::destroy_at(at(1));
    EXPECT_FALSE(UReportDoc::IsReportAvailable(at(1)));

    const ReportApplication application;
    UReportDoc *report = CreateReport(QStringLiteral("N"), false, false, nullptr, 0, nullptr);
    ASSERT_NE(report, nullptr);
    EXPECT_TRUE(UReportDoc::IsReportAvailable(report));
    report->OnCloseDocument();
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report)) << "closed and deleted";
}

TEST(UReportDocLife, ClosingEndsPanesContentsOwnerAndReportInThisOrder)
{
    struct Row
    {
        bool handler;
        bool autoDelete;
        QString expected;
        bool paneStays;
        const char *reason;
    };
    const Row rows[] = {
        {false, true, QStringLiteral("closed emptied told gone "), false, "the usual end"},
        {false, false, QStringLiteral("closed emptied "), false, "without auto-delete the report stays, its panes go"},
        {true, true, QStringLiteral("closed emptied told gone "), false, "a search that deletes itself"},
        {true, false, QString(), true, "a search that stays keeps its panes as well"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        QString log;
        Owner owner(log);
        auto *report = new WatchedReport(log, &owner, row.handler);
        auto *pane = new CViewPane;
        pane->SetWindowTextW(QStringLiteral("pane"));
        showIn<TestReportView>(*pane, *report);
        report->SetAutoDelete(row.autoDelete);
        report->OnCloseDocument();
        EXPECT_EQ(log, row.expected) << row.reason;
        EXPECT_EQ(isOpen(QStringLiteral("pane")), row.paneStays) << row.reason;
        if (!row.autoDelete) {
            EXPECT_FALSE(report->IsAutoDelete()) << row.reason;
            if (row.paneStays) {
                pane->ClosePane();
            }
            delete report;
        }
    }
}

TEST(UReportDocLife, ClosingEndsEveryPaneOfTheReport)
{
    const FixedSurroundings surroundings;
    QString log;
    auto *report = new WatchedReport(log, nullptr);
    for (int i = 0; i < 3; ++i) {
        auto *pane = new CViewPane;
        pane->SetWindowTextW(QStringLiteral("pane"));
        showIn<TestReportView>(*pane, *report);
        showIn<UView>(*pane, *report);
    }
    report->OnCloseDocument();
    EXPECT_EQ(log, QStringLiteral("closed emptied gone ")) << "without an owner nothing is told";
    EXPECT_FALSE(isOpen(QStringLiteral("pane")));
}

TEST(UReportDocLife, WithAReportWindowTheCloseModeDecides)
{
    struct Row
    {
        int mode;
        bool gone;
        bool windowPaneStays;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, true, false, "closes with the pane of its window"},
        {1, false, true, "deferred: everything stays open"},
        {2, true, true, "asked for: the window's pane is the asker's own business"},
        {3, false, true, "any other mode stays open"},
        {-1, false, true, "any other mode stays open"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        QString log;
        Owner owner(log);
        bool windowDestroyed = false;
        auto *report = new WatchedReport(log, &owner);
        auto *windowPane = new CViewPane;
        windowPane->SetWindowTextW(QStringLiteral("window"));
        auto *pane = new CViewPane;
        pane->SetWindowTextW(QStringLiteral("pane"));
        showIn<TestReportView>(*pane, *report);
        report->SetReportWindow(new TestReportWindow(windowPane, &windowDestroyed));
        report->SetCloseDocument(row.mode);
        report->OnCloseDocument();
        EXPECT_EQ(log, row.gone ? QStringLiteral("closed emptied told gone ") : QString()) << row.reason;
        EXPECT_EQ(windowDestroyed, row.gone) << row.reason << ": the window goes with its report";
        EXPECT_EQ(isOpen(QStringLiteral("pane")), !row.gone) << row.reason;
        EXPECT_EQ(isOpen(QStringLiteral("window")), row.windowPaneStays) << row.reason;
        if (row.windowPaneStays) {
            windowPane->ClosePane();
        }
        if (!row.gone) {
            report->SetCloseDocument(2);
            report->OnCloseDocument();
        }
    }
}

TEST(UReportDocLife, AWindowWithoutAPaneClosesWithItsReport)
{
    const FixedSurroundings surroundings;
    QString log;
    bool windowDestroyed = false;
    auto *report = new WatchedReport(log, nullptr);
    report->SetReportWindow(new TestReportWindow(nullptr, &windowDestroyed));
    report->OnCloseDocument();
    EXPECT_EQ(log, QStringLiteral("closed emptied gone "));
    EXPECT_TRUE(windowDestroyed);
}

TEST(UReportDocLife, AskingToCloseADeferredReportClosesItTheSecondTime)
{
    struct Row
    {
        int mode;
        int calls;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, 1, "closes at once"},
        {1, 2, "the first call only asks"},
        {2, 1, "asked for before"},
        {7, 1, "any other mode closes at once"},
    };
    for (const bool withWindow : {false, true}) {
        for (const Row &row : rows) {
            const FixedSurroundings surroundings;
            QString log;
            auto *report = new WatchedReport(log, nullptr);
            CViewPane windowPane;
            windowPane.SetWindowTextW(QStringLiteral("window"));
            if (withWindow) {
                report->SetReportWindow(new TestReportWindow(&windowPane));
            }
            report->SetCloseDocument(row.mode);
            for (int call = 1; call <= row.calls; ++call) {
                EXPECT_EQ(log, QString()) << row.reason << ", before call " << call;
                report->CloseReportDocument();
            }
            EXPECT_EQ(log, QStringLiteral("closed emptied gone ")) << row.reason;
            EXPECT_TRUE(isOpen(QStringLiteral("window")))
                << row.reason << ": a requested close leaves the window's pane";
        }
    }
}

TEST(UReportDocLife, PanesMayCloseWhenAnotherKeepsTheReportOrTheUserAgrees)
{
    struct Row
    {
        int canClose;
        bool modified;
        std::vector<int> paneNumbers;
        MessageAnswer answer;
        bool expected;
        int questions;
        const char *reason;
    };
    const Row rows[] = {
        {1, false, {}, MessageAnswer::Cancel, true, 0, "nothing to save"},
        {0, false, {}, MessageAnswer::No, false, 0, "closing is forbidden"},
        {0, true, {1, 2}, MessageAnswer::No, false, 0, "forbidden for numbered panes as well"},
        {-1, false, {}, MessageAnswer::Cancel, true, 0, "only 0 forbids"},
        {1, true, {}, MessageAnswer::No, true, 1, "not saved, as the user wants it"},
        {1, true, {}, MessageAnswer::Cancel, false, 1, "cancelled"},
        {1, true, {0}, MessageAnswer::Cancel, false, 1, "an only pane has no number"},
        {1, true, {-1}, MessageAnswer::Cancel, false, 1, "a pane that is being counted"},
        {1, true, {1}, MessageAnswer::Cancel, true, 0, "a numbered pane is one of several"},
        {1, true, {0, 2}, MessageAnswer::Cancel, true, 0, "any of its panes is enough"},
    };
    for (const Row &row : rows) {
        const FixedSurroundings surroundings;
        int questions = 0;
        kareport::setMessageHandler([&](const QString &, MessageButtons) {
            ++questions;
            return row.answer;
        });
        UReportDoc report;
        report.SetAutoDelete(false);
        CViewPane panes[2];
        std::size_t count = 0;
        for (std::size_t i = 0; i < row.paneNumbers.size(); ++i) {
            showIn<UView>(panes[count++], report);
        }
        UView withoutPane;
        report.AddView(&withoutPane);
        for (std::size_t i = 0; i < count; ++i) {
            panes[i].SetWindowNumber(row.paneNumbers[i]); // whatever the panes were counted to
        }
        report.SetCanClose(row.canClose);
        report.SetModifiedFlag(row.modified);
        EXPECT_EQ(report.CanCloseFrame(nullptr), row.expected) << row.reason;
        EXPECT_EQ(questions, row.questions) << row.reason;
    }
}

TEST(UReportDocLife, ANewReportIsMeasuredAndUnmodified)
{
    const FixedSurroundings surroundings;
    UReportDoc report;
    report.SetModifiedFlag(true);
    EXPECT_TRUE(report.OnNewDocument());
    EXPECT_FALSE(report.IsModified());
    EXPECT_EQ(report.GetPrintResolution(), 600U);
    kareport::setDefaultPrinter({kareport::PrinterSource::None, kareport::PaperSize::A4, 600});
    UReportDoc unmeasured;
    EXPECT_TRUE(unmeasured.OnNewDocument()) << "no printer is not a failure";
    EXPECT_EQ(unmeasured.GetLinesPerPage(), 72);
}

TEST(UReportDocLife, ANewReportThatCannotBeEmptiedIsNotMeasured)
{
    /// Has no memory for being emptied.
    class FullReport : public UReportDoc
    {
    public:
        void DeleteContents() override { throw std::bad_alloc(); }
    };
    const FixedSurroundings surroundings;
    FullReport report;
    const unsigned resolution = report.GetPrintResolution();
    ASSERT_NE(resolution, 600U);
    report.SetModifiedFlag(true);
    EXPECT_FALSE(report.OnNewDocument());
    EXPECT_EQ(report.GetPrintResolution(), resolution);
    EXPECT_TRUE(report.IsModified()) << "it is what it was";
}

} // namespace
