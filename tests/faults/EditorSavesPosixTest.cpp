#include "FailEachCall.h"

#include "ReportSubject.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <set>

namespace
{

/// How a report goes to an editor.
struct Way
{
    const char *name;
    const char *editor;
    void (*go)(UReportDoc &report);
};

constexpr Way ways[] = {
    {"ReportRTfData", "editor", [](UReportDoc &report) { report.ReportRTfData(); }},
    {"ReportRTfData", "winword", [](UReportDoc &report) { report.ReportRTfData(); }},
    {"ConvertAndOpenInWord", "winword", [](UReportDoc &report) { report.ConvertAndOpenInWord(); }},
    {"UpdateAllViews", "editor", [](UReportDoc &report) { report.UpdateAllViews(nullptr); }},
    {"UpdateAllViews", "winword", [](UReportDoc &report) { report.UpdateAllViews(nullptr); }},
};

bool isWholeReportFile(const std::string &content)
{
    return content.starts_with("\xEF\xBB\xBF") && std::count(content.begin(), content.end(), '\n') >= longTextLines();
}

class EditorSaves : public testing::Test
{
protected:
    /// Lets a new report go to the editor. @return what the editor was given: the content of each file
    std::set<std::string> send(const Way &way, FailingFiles::Call call, qint64 number, bool &hasFailed)
    {
        around_.launches.all.clear();
        UReportDoc *report = CreateReport(QStringLiteral("edited%1").arg(++reports_), false, true, nullptr, 0, nullptr);
        report->SetRTFDataFlag(std::string(way.editor) == "winword");
        report->Write(longText(), 0);
        report->SetModifiedFlag(true);
        report->SetCloseDocumentFlag(true);
        const QString text = report->CopyText();
        bool isWritten = true;
        {
            const FailingFiles failing(call, number);
            way.go(*report);
            hasFailed = failing.hasFailed();
        }
        std::set<std::string> given;
        for (const QString &file : around_.launches.files()) {
            EXPECT_TRUE(QFile::exists(file)) << file.toStdString();
            given.insert(contentOf(file));
            isWritten = isWritten && !contentOf(file).empty();
        }
        if (!isWritten || given.empty()) {
            EXPECT_TRUE(UReportDoc::IsReportAvailable(report)) << "what the editor did not get is nowhere else";
        }
        if (UReportDoc::IsReportAvailable(report)) {
            EXPECT_TRUE(report->CopyText() == text);
            EXPECT_FALSE(report->HasLostText());
            EXPECT_TRUE(isWritten || report->IsModified());
        }
        const auto &documents = around_.application.reportTemplate()->GetDocuments();
        while (!documents.empty()) {
            documents.back()->SetAutoDelete(true);
            documents.back()->OnCloseDocument();
        }
        return given;
    }

    Surroundings around_;

private:
    int reports_ = 0;
};

TEST_F(EditorSaves, AnEditorGetsAWholeReportOrAnEmptyFileAndTheReportStays)
{
    for (const Way &way : ways) {
        SCOPED_TRACE(std::string(way.name) + " to " + way.editor);
        const PreferredEditor editor(QString::fromUtf8(way.editor));
        bool hasFailed = false;
        const auto whole = send(way, FailingFiles::Call::Write, 0, hasFailed);
        ASSERT_EQ(whole.size(), 1U);
        ASSERT_GT(whole.begin()->size(), std::size_t(longTextLines()) * 20);
        int failed = 0;
        for (const FailingFiles::Call call : failingCalls) {
            qint64 number = 1;
            for (hasFailed = true; hasFailed && number <= 1000; ++number) {
                SCOPED_TRACE(std::string(failingCallNames[static_cast<int>(call)]) + " " + std::to_string(number));
                for (const std::string &given : send(way, call, number, hasFailed)) {
                    // Where rich text cannot be written, the report text may still be.
                    EXPECT_TRUE(given.empty() || given == *whole.begin() || isWholeReportFile(given))
                        << given.size() << " of " << whole.begin()->size();
                    EXPECT_TRUE(hasFailed || given == *whole.begin());
                }
                failed += hasFailed ? 1 : 0;
                if (HasFailure()) {
                    return;
                }
            }
        }
        EXPECT_GT(failed, 1);
    }
}

} // namespace
