#include "ReportEditorFixture.h"

#include <gtest/gtest.h>

namespace
{

using UReportDocEditorClose = ReportEditor;

TEST_F(UReportDocEditorClose, AReportMarkedForItClosesWhenAnEditorHasIt)
{
    for (const char *name : {"notepad", "winword"}) {
        const PreferredEditor editor(QLatin1String{name});
        UReportDoc *report = createWritten(QStringLiteral("a"));
        report->SetCloseDocumentFlag(true);
        ShownPane *pane = paneOf(report);
        ToldPane properties;
        int hides = -1;
        launches.meanwhile = [&] {
            EXPECT_TRUE(UReportDoc::IsReportAvailable(report)) << "the editor comes first";
            hides = pane->hides;
        };
        report->UpdateAllViews(nullptr);
        launches.meanwhile = {};
        EXPECT_EQ(hides, 0) << "a pane that is going to close is not hidden before";
        EXPECT_FALSE(UReportDoc::IsReportAvailable(report)) << name;
        EXPECT_FALSE(CViewPane::IsOpen(pane)) << name;
        EXPECT_EQ(properties.told.size(), launches.all.size()) << name;
        EXPECT_EQ(properties.told.back(), nullptr) << "there is nothing left that a pane could look at";
        launches.all.clear();
    }
}

TEST_F(UReportDocEditorClose, ADeferredClosingIsNotForced)
{
    const PreferredEditor editor(QStringLiteral("notepad"));
    UReportDoc *report = createWritten();
    report->SetReportWindow(new TestReportWindow);
    report->SetCloseDocument(1);
    report->SetCloseDocumentFlag(true);
    ToldPane properties;
    report->UpdateAllViews(nullptr);
    EXPECT_TRUE(UReportDoc::IsReportAvailable(report));
    EXPECT_EQ(properties.told, std::vector<UDocument *>{report});
    EXPECT_EQ(paneOf(report)->hides, 0);
    EXPECT_EQ(launches.all.size(), 1U);
}

TEST_F(UReportDocEditorClose, AReportMayCloseWhileTheEditorIsStarted)
{
    for (const char *name : {"notepad", "winword"}) {
        const PreferredEditor editor(QLatin1String{name});
        UReportDoc *report = createWritten();
        ToldPane properties;
        launches.meanwhile = [this] {
            while (!documents().empty()) {
                lastMade()->OnCloseDocument();
            }
        };
        report->UpdateAllViews(nullptr);
        launches.meanwhile = {};
        EXPECT_EQ(documents().size(), 0U) << name;
        EXPECT_EQ(properties.told, std::vector<UDocument *>{nullptr}) << name;
    }
}

/// Closes when it is updated.
class ClosingView : public TestReportView
{
public:
    void OnUpdate(UView *, long, void *) override { GetParentPane()->ClosePane(); }
};

TEST_F(UReportDocEditorClose, AReportMayCloseWithItsViewsUpdate)
{
    auto *report = new UReportDoc;
    showIn<ClosingView>(*new CViewPane, *report);
    ToldPane properties;
    report->UpdateAllViews(nullptr);
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
    EXPECT_EQ(properties.told, std::vector<UDocument *>{nullptr});

    report = new UReportDoc;
    showIn<ClosingView>(*new CViewPane, *report);
    report->ReportRTfData();
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
}

TEST_F(UReportDocEditorClose, AFileThatIsLoadedGoesToTheEditorBeforeItsReportCloses)
{
    putFile(at("in.rep"), "TALVEN\r\r\n");
    const PreferredEditor editor(QStringLiteral("notepad"));
    UReportDoc *report = create();
    report->SetCloseDocumentFlag(true);
    EXPECT_EQ(report->LoadFile(at("in.rep"), false), 1);
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
    EXPECT_EQ(contentOf(at("Report$$$.rep")), "\xEF\xBB\xBFTALVEN\r\r\r\n");

    report = create();
    report->SetCloseDocumentFlag(true);
    EXPECT_TRUE(report->OnOpenDocument(at("in.rep")));
    EXPECT_TRUE(UReportDoc::IsReportAvailable(report)) << "the code that opens it goes on with it";
    EXPECT_EQ(launches.files(), (QStringList{at("Report$$$.rep"), at("Report$$$ 2.rep")}));
}

} // namespace
