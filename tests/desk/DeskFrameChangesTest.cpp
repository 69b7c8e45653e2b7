#include "DeskFixture.h"

#include "COneViewPane.h"
#include "DeskCommandIds.h"
#include "FrameFixture.h"
#include "ReportEdit.h"
#include "SaveDialog.h"
#include "SavedReports.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"
#include "UView.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

TEST(DeskFrameChanges, AFileThatChangesOnTheDiskIsOfferedAgain)
{
    struct Row
    {
        MessageAnswer answer;
        bool isEdited;
        const char *text;
        const char *reason;
    };
    for (const Row &row : {Row{MessageAnswer::Yes, false, "TALVEN new\n", "loaded again"},
                           Row{MessageAnswer::No, false, "TALVEN\n", "left as it was read"},
                           Row{MessageAnswer::Yes, true, "TALVEN new\n", "also over changes, when the user says so"},
                           Row{MessageAnswer::No, true, "xTALVEN\n", "the user's changes stay"}})
    {
        const JobFolder folder;
        folder.put("a.rep", savedText("TALVEN"));
        Desk desk;
        ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
        UReportDoc *report = Desk::reports().front();
        if (row.isEdited) {
            QTest::keyClick(&dynamic_cast<UReportView *>(desk.frame->GetActiveView())->GetEdit(), Qt::Key_X);
        }
        QTest::qWait(1); // the watch begins after the opening
        desk.answer = row.answer;
        folder.put("a.rep", savedText("TALVEN new"));
        EXPECT_TRUE(QTest::qWaitFor([&desk] { return !desk.messages.isEmpty(); })) << row.reason;
        EXPECT_EQ(desk.messages.value(0).contains(QStringLiteral("unsaved")), row.isEdited) << row.reason;
        EXPECT_EQ(Desk::textOf(*report), QString::fromUtf8(row.text)) << row.reason;
        EXPECT_EQ(report->IsModified(), row.isEdited && row.answer == MessageAnswer::No) << row.reason;
        desk.answer = MessageAnswer::No;
    }
}

TEST(DeskFrameChanges, ItsOwnSavesAreNotChangesOfOthers)
{
    const JobFolder folder;
    folder.put("a.rep", savedText("TALVEN"));
    folder.put("other.rep", savedText("TALVEN"));
    Desk desk;
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("other.rep")));
    QTest::qWait(1);
    Desk::reports().front()->WriteLine(QStringLiteral("more"), 0, 1, 0);
    ASSERT_TRUE(Desk::reports().front()->DoFileSave());
    QTest::qWait(1);
    // A change of the other file that is reported shows that this one would have been reported by then.
    folder.put("other.rep", savedText("TALVEN changed"));
    EXPECT_TRUE(QTest::qWaitFor([&desk] { return !desk.messages.isEmpty(); }));
    EXPECT_EQ(desk.messages.size(), 1);
    EXPECT_TRUE(desk.messages.value(0).contains(QStringLiteral("other.rep")));
}

/// The view of a report that the user sees.
UReportView *visibleView(const UReportDoc &report)
{
    for (UView *view : report.GetViews()) {
        if (view->IsVisible()) {
            return dynamic_cast<UReportView *>(view);
        }
    }
    return nullptr;
}

TEST(DeskFrameChanges, AReportOfAJobWithARichTextImageIsEditedSavedAndLoadedAgainAsAnyOther)
{
    const JobFolder folder;
    folder.put("a.json", R"({"title": "Lines", "header": false, "page": {"linesPerPage": 60, "charsPerRow": 80},
                             "report": [{"line": "First line"}],
                             "output": [{"file": "word.rtf", "as": "rtf-image"}]})");
    Desk desk;
    desk.answer = MessageAnswer::No;
    desk.keepReportWindows();
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
    UReportDoc *report = Desk::reports().front();
    EXPECT_FALSE(report->GetRTFDataFlag()) << "the view shows the text";
    dynamic_cast<UReportWindowDlg *>(report->GetReportWindow())->ShowReport();
    QCoreApplication::processEvents();
    ASSERT_NE(visibleView(*report), nullptr);
    QTest::keyClick(&visibleView(*report)->GetEdit(), Qt::Key_X);
    setSaveDialog([&folder](const SaveRequest &) { return folder.path("x.rtf"); });
    EXPECT_TRUE(report->DoSave(QString(), true));
    setSaveDialog({});
    EXPECT_NE(contentOf(folder.path("x.rtf")).find("xFirst line"), std::string::npos) << "what was typed is saved";
    EXPECT_EQ(Desk::textOf(*report), QStringLiteral("xFirst line\n")) << "and stays";
    for (const bool isOn : {false, true}) {
        report->SetRTFDataFlag(isOn);
        folder.put("x.rtf", "{\\rtf1 new}");
        ASSERT_TRUE(reloadSavedReport(*report));
        EXPECT_EQ(Desk::textOf(*report), QStringLiteral("{\\rtf1 new}\n")) << "whatever the mode was: " << isOn;
    }
}

TEST(DeskFrameChanges, WhatIsTypedAfterAReportWasGivenUpIsNotThrownAway)
{
    struct Row
    {
        bool isTyped;
        const char *reason;
    };
    for (const Row &row :
         {Row{false, "not to be saved, and not to be seen"}, Row{true, "the answer was about what there was then"}})
    {
        Desk desk;
        desk.answer = MessageAnswer::No;
        desk.keepReportWindows();
        const JobFolder folder;
        folder.put("a.json", lineJob());
        ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
        UReportDoc *report = Desk::reports().front();
        ASSERT_TRUE(desk.frame->OnCommand(windowNewCommand));
        dynamic_cast<UReportWindowDlg *>(report->GetReportWindow())->OnPressCloseButton();
        QCoreApplication::processEvents();
        ASSERT_TRUE(UReportDoc::IsReportAvailable(report)) << "its second pane shows it";
        UReportView *view = visibleView(*report);
        ASSERT_NE(view, nullptr);
        if (row.isTyped) {
            QTest::keyClick(&view->GetEdit(), Qt::Key_X);
        }
        for (UView *each : report->GetViews()) {
            each->GetParentPane()->ShowPane(false);
        }
        EXPECT_TRUE(QTest::qWaitFor([report] { return !UReportDoc::IsReportAvailable(report) || report->IsShown(); }))
            << row.reason;
        EXPECT_EQ(UReportDoc::IsReportAvailable(report), row.isTyped) << row.reason;
    }
}

} // namespace
