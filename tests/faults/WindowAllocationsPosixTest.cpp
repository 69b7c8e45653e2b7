#include "ReportSubject.h"

#include "NewReport.h"
#include "ReportWindowEntry.h"

#include <gtest/gtest.h>

namespace
{

/// The requests for memory that a report of a hidden pane takes.
qint64 allocationsOfReport(const QString &name)
{
    return failingEachAllocation([&name](qint64 number) {
        UReportDoc *report = nullptr;
        bool hasFailed = false;
        {
            const FailingAllocation failing(number);
            report = kareport::openNewReport({name, true, false}, false, nullptr, UReportDoc::ownPaneStyle, nullptr);
            hasFailed = failing.hasFailed();
        }
        if (report != nullptr) {
            report->OnCloseDocument();
        }
        return hasFailed;
    });
}

TEST(WindowAllocations, AReportWindowWithoutMemoryForItsReportIsNotMade)
{
    const Surroundings around;
    const auto &documents = around.application.reportTemplate()->GetDocuments();
    const QString name = QStringLiteral("a name of a report");
    const qint64 allocations = allocationsOfReport(name);
    ASSERT_GT(allocations, 5);
    // No further: a window of the screen, which comes then, does not survive it.
    for (qint64 number = 1; number <= allocations && !HasFailure(); ++number) {
        UReportDoc *report = nullptr;
        {
            const FailingAllocation failing(number);
            EXPECT_NO_THROW(report = CreateReportWindow(name, true, false)) << number;
        }
        EXPECT_EQ(documents.size(), report != nullptr ? 1U : 0U) << number;
        if (report != nullptr) {
            EXPECT_FALSE(report->HasLostText()) << number;
            EXPECT_EQ(report->GetReportFileName(), name) << number;
            documents.back()->OnCloseDocument();
        }
    }
    UReportDoc *report = CreateReportWindow(name, true, false);
    ASSERT_NE(report, nullptr) << "another try";
    EXPECT_TRUE(report->Write(QStringLiteral("line"), 0));
    report->OnCloseDocument();
}

} // namespace
