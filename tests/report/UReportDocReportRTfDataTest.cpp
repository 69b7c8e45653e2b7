#include "ReportEditorFixture.h"

#include <gtest/gtest.h>

namespace
{

using UReportDocReportRTfData = ReportEditor;

TEST_F(UReportDocReportRTfData, AReportWithoutAnEditorIsShownInOneView)
{
    for (const bool marked : {false, true}) {
        UReportDoc report;
        report.SetAutoDelete(false);
        report.SetExternalEditorFlag(marked);
        CViewPane other;
        showIn<RecordingView>(other, report);
        ToldPane properties;
        report.ReportRTfData();
        ASSERT_EQ(report.GetViews().size(), 2U) << "one that shows reports beside the other kind";
        ShownPane *pane = paneOf(&report);
        ASSERT_NE(pane, nullptr);
        EXPECT_EQ(pane->GetStyle(), 4096U);
        EXPECT_TRUE(pane->IsVisible());
        EXPECT_EQ(pane->tops, 1);
        EXPECT_TRUE(report.IsModified());
        EXPECT_EQ(properties.told, std::vector<UDocument *>{&report});

        report.SetModifiedFlag(false);
        const int updates = static_cast<TestReportView *>(report.GetViews().at(1))->updates;
        report.ReportRTfData();
        EXPECT_EQ(report.GetViews().size(), 2U) << "no second one";
        EXPECT_EQ(static_cast<TestReportView *>(report.GetViews().at(1))->updates, updates + 1);
        EXPECT_EQ(pane->tops, 2);
        EXPECT_TRUE(report.IsModified());
        pane->ClosePane();
    }
    EXPECT_EQ(launches.files(), QStringList());
}

TEST_F(UReportDocReportRTfData, AnEditorThatIsThereIsOnlyForMarkedReports)
{
    const PreferredEditor editor(QStringLiteral("winword"));
    UReportDoc *report = create(QString(), false);
    report->ReportRTfData();
    EXPECT_EQ(launches.files(), QStringList());
    EXPECT_TRUE(paneOf(report)->IsVisible());
    EXPECT_EQ(paneOf(report)->tops, 1);
}

TEST_F(UReportDocReportRTfData, TheFirstViewInAPaneComesToTheTop)
{
    UReportDoc report;
    report.SetAutoDelete(false);
    TestReportView alone;
    report.AddView(&alone);
    CViewPane other;
    showIn<RecordingView>(other, report);
    ShownPane first;
    ShownPane second;
    showIn<TestReportView>(first, report);
    showIn<TestReportView>(second, report);
    report.ReportRTfData();
    EXPECT_EQ(first.tops, 1);
    EXPECT_EQ(second.tops, 0);
    EXPECT_EQ(report.GetViews().size(), 4U);
}

TEST_F(UReportDocReportRTfData, WithoutATemplateNoViewIsMade)
{
    UReportDoc report;
    const auto hidden = hideTemplate();
    report.ReportRTfData();
    EXPECT_TRUE(report.GetViews().empty());
    EXPECT_TRUE(report.IsModified());
}

TEST_F(UReportDocReportRTfData, TheKindOfTheEditorChoosesTheFile)
{
    struct Row
    {
        const char *editor;
        bool excelOption;
        bool externalExcel;
        const char *name;
        std::string content;
        const char *reason;
    };
    const Row rows[] = {
        {"winword", false, false, "a.rtf", richTextOf({"text"}), "a word processor: the rich-text image"},
        {"notepad", false, false, "a 2.rep", "\xEF\xBB\xBFtext\r\r\n", "a plain one: the text"},
        {"excel", false, false, "a 3.rep", "\xEF\xBB\xBFtext\r\r\n", "a spreadsheet that the report does not allow"},
        {"excel", true, true, "a 4.rtf", "text", "one that it allows: the texts"},
        {"excel", true, false, "a 5.rtf", richTextOf({"text"}), "the report was not written for it"},
    };
    for (const Row &row : rows) {
        const PreferredEditor editor(QLatin1String(row.editor));
        UReportDoc report(QStringLiteral("a"), true, false, nullptr);
        if (row.excelOption) {
            report.SetOptionExcel();
        }
        if (row.externalExcel) {
            report.SetExternalExcel();
        }
        report.SetRTFDataFlag(true);
        report.WriteLine(QStringLiteral("text"), 0, 1, 0);
        launches.all.clear();
        report.ReportRTfData();
        ASSERT_EQ(launches.all.size(), 1U) << row.reason;
        EXPECT_EQ(launches.all[0].program, editor.path) << row.reason;
        EXPECT_EQ(launches.all[0].file, at(row.name)) << row.reason;
        EXPECT_EQ(launches.all[0].folder, QDir::tempPath()) << row.reason;
        EXPECT_EQ(contentOf(at(row.name)), row.content) << row.reason;
        EXPECT_EQ(report.IsExternalExcel(), row.externalExcel) << row.reason;
        EXPECT_TRUE(report.GetViews().empty()) << row.reason;
    }
}

} // namespace
