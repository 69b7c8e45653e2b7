#include "DeskFixture.h"

#include "COneViewPane.h"
#include "CommandLine.h"
#include "DeskCommandIds.h"
#include "DeskPreferences.h"
#include "FrameFixture.h"
#include "NotesPane.h"
#include "SavedReports.h"
#include "UApplication.h"
#include "UReportList.h"
#include "UReportWindowDlg.h"
#include "UView.h"

#include <QDockWidget>
#include <QDropEvent>
#include <QMimeData>
#include <QSignalSpy>
#include <QTimer>
#include <QToolBar>

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

TEST(DeskFrame, OpensWhatItIsGiven)
{
    struct Row
    {
        const char *name;
        QByteArray content;
        const char *text; ///< null where it cannot be opened
        const char *message;
        const char *reason;
    };
    const Row rows[] = {
        {"a.json", lineJob(), "First line\n", "", "a job is run"},
        {"a.rep", "\xEF\xBB\xBFTALVEN - N\r\r\nx\r\r\n", "TALVEN - N\nx\n", "",
         "a saved report is read as it was before it was saved"},
        {"A.REP", "\xEF\xBB\xBFTALVEN - N\r\r\n", "TALVEN - N\n", "", "case of the ending does not matter"},
        {"b.rtf", "{\\rtf1 x}", "{\\rtf1 x}\n", "", "rich text keeps its source in the document"},
        {"empty.rep", "", "", "", "an empty file is an empty report"},
        {"bad.json", "{\"report\": [{\"lin\": 1}]}", nullptr, "bad.json:1:", "a job with a mistake says where"},
        {"no.json", "[1", nullptr, "no.json", "a text that is not JSON"},
        {"bad2.json", R"({"report": [{"table": "T", "data": "d"}], "data": {"d": {"csv": "gone.csv"}},
                          "template": {"file": "gone.xml", "name": "N"}})",
         nullptr, "gone.xml", "a missing template is named"},
    };
    for (const Row &row : rows) {
        Desk desk;
        const JobFolder folder;
        folder.put(row.name, row.content);
        EXPECT_EQ(desk.frame->OpenFile(folder.path(row.name)), row.text != nullptr) << row.reason;
        if (row.text == nullptr) {
            ASSERT_EQ(desk.messages.size(), 1) << row.reason;
            EXPECT_TRUE(desk.messages.front().contains(QString::fromUtf8(row.message)))
                << row.reason << ": " << desk.messages.front().toStdString();
            EXPECT_TRUE(Desk::reports().empty()) << row.reason << ": nothing half made stays";
            continue;
        }
        EXPECT_TRUE(desk.messages.isEmpty()) << row.reason;
        ASSERT_EQ(Desk::reports().size(), 1U) << row.reason;
        UReportDoc *report = Desk::reports().front();
        EXPECT_EQ(Desk::textOf(*report), QString::fromUtf8(row.text)) << row.reason;
        EXPECT_EQ(UApplication::Get()->GetCurrentReport(), report) << row.reason;
        EXPECT_EQ(desk.frame->GetCommandDocument(), report) << row.reason;
        desk.answer = MessageAnswer::No;
        EXPECT_EQ(UApplication::Get()->GetRecentFileList().value(0), folder.path(row.name)) << row.reason;
    }
}

TEST(DeskFrame, SaysTheNotesOnAReportThatWasMade)
{
    Desk desk;
    const JobFolder folder;
    folder.put("t.xml", controlTemplates());
    folder.put("points.csv", "Number,Nort\n1,2\n");
    const QByteArray job = R"({"header": false, "template": {"file": "t.xml", "name": "CONTROL"},
        "data": {"p": {"csv": "points.csv"}}, "report": [{"table": "Points", "data": "p"}], "strict": false})";
    folder.put("job.json", job);
    EXPECT_TRUE(desk.frame->OpenFile(folder.path("job.json")));
    EXPECT_TRUE(desk.messages.isEmpty()) << "they are listed beside the report";
    EXPECT_EQ(desk.frame->runs().notesPane().count(), 2);
    EXPECT_EQ(Desk::reports().size(), 1U);

    desk.messages.clear();
    folder.put("strict.json", QByteArray(job).replace("false}", "true}"));
    EXPECT_FALSE(desk.frame->OpenFile(folder.path("strict.json")));
    ASSERT_EQ(desk.messages.size(), 1);
    EXPECT_TRUE(desk.messages.front().contains(QStringLiteral("points.csv:1:8: error: the column \"Nort\"")));
    EXPECT_EQ(Desk::reports().size(), 1U) << "nothing half made stays";
}

TEST(DeskFrame, AJobRunsIntoAReportWindowThatIsKept)
{
    Desk desk;
    desk.keepReportWindows();
    desk.answer = MessageAnswer::No;
    const JobFolder folder;
    folder.put("a.json", lineJob());
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
    UReportDoc *report = Desk::reports().front();
    auto *window = dynamic_cast<UReportWindowDlg *>(report->GetReportWindow());
    ASSERT_NE(window, nullptr);
    EXPECT_TRUE(window->IsVisible());
    EXPECT_TRUE(window->IsActive()) << "it can be saved, printed and opened";
    EXPECT_EQ(window->GetWindowTextW(), QStringLiteral("Lines"));
    EXPECT_EQ(report->GetTitle(), QStringLiteral("Lines"));
    EXPECT_EQ(window->GetList()->GetText(0), QStringLiteral("First line"));

    window->ShowReport();
    const auto docks = desk.frame->findChildren<QDockWidget *>(QString(), Qt::FindDirectChildrenOnly);
    EXPECT_EQ(std::count_if(docks.begin(), docks.end(), [](const QDockWidget *dock) { return !dock->isHidden(); }), 1)
        << "the report is shown in one pane";
    EXPECT_FALSE(window->isCreated());
    ASSERT_TRUE(QTest::qWaitFor([&desk] { return desk.frame->GetActiveView() != nullptr; }))
        << "commands are for what is there";
    EXPECT_EQ(desk.frame->GetActiveView()->GetDocument(), report);
    // Closing that pane closes the report.
    dynamic_cast<COneViewPane *>(report->GetViews().front()->GetParentPane())->OnSysCommand(COneViewPane::scClose, 0);
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
}

TEST(DeskFrame, AReportWhoseWindowIsClosedCloses)
{
    Desk desk;
    desk.keepReportWindows();
    desk.answer = MessageAnswer::No; // it is not to be saved
    const JobFolder folder;
    folder.put("a.json", lineJob());
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
    UReportDoc *report = Desk::reports().front();
    auto *look = desk.frame->findChild<QTimer *>(DeskFrame::unseenTimerName);
    ASSERT_NE(look, nullptr);
    QSignalSpy looks(look, &QTimer::timeout);
    ASSERT_TRUE(QTest::qWaitFor([&looks] { return looks.count() >= 1; })) << "what is shown stays open";
    ASSERT_TRUE(UReportDoc::IsReportAvailable(report));
    dynamic_cast<UReportWindowDlg *>(report->GetReportWindow())->OnPressCloseButton();
    EXPECT_TRUE(QTest::qWaitFor([report] { return !UReportDoc::IsReportAvailable(report); }))
        << "it could never be seen again";
    EXPECT_EQ(desk.messages.size(), 1) << "asked once";
}

TEST(DeskFrame, AReportThatCouldNotBeSavedIsNotThrownAwayWithItsWindow)
{
    Desk desk;
    desk.keepReportWindows();
    const JobFolder folder;
    folder.put("a.json", lineJob());
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
    UReportDoc *report = Desk::reports().front();
    desk.answer = MessageAnswer::Yes; // but no name is given
    dynamic_cast<UReportWindowDlg *>(report->GetReportWindow())->OnPressCloseButton();
    EXPECT_TRUE(QTest::qWaitFor([report] { return !UReportDoc::IsReportAvailable(report) || report->IsShown(); }));
    ASSERT_TRUE(UReportDoc::IsReportAvailable(report)) << "it comes back in its pane";
    EXPECT_TRUE(report->IsModified());
    desk.answer = MessageAnswer::No;
}

TEST(DeskFrame, AFileThatIsOpenIsNotOpenedTwice)
{
    Desk desk;
    const JobFolder folder;
    folder.put("a.rep", savedText("TALVEN"));
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("./a.rep")));
    EXPECT_EQ(Desk::reports().size(), 1U) << "two of them would overwrite each other";
}

TEST(DeskFrame, AFileThatCannotBeReadAgainLeavesTheReportAsItIs)
{
    Desk desk;
    const JobFolder folder;
    folder.put("a.rep", savedText("TALVEN"));
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    QFile::remove(folder.path("a.rep"));
    EXPECT_FALSE(kareport::reloadSavedReport(*Desk::reports().front()));
    EXPECT_EQ(Desk::textOf(*Desk::reports().front()), QStringLiteral("TALVEN\n"));
}

TEST(DeskFrame, TwoJobsOfOneTitleHaveTitlesOfTheirOwn)
{
    Desk desk;
    desk.answer = MessageAnswer::No;
    const JobFolder folder;
    folder.put("a.json", QByteArray(lineJob()).replace("\"header\": false", "\"header\": true"));
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
    ASSERT_EQ(Desk::reports().size(), 2U);
    EXPECT_EQ(Desk::reports()[0]->GetTitle(), QStringLiteral("Lines"));
    EXPECT_EQ(Desk::reports()[1]->GetTitle(), QStringLiteral("Lines 2"));
    EXPECT_TRUE(Desk::textOf(*Desk::reports()[1]).startsWith(QStringLiteral("TALVEN - Lines  ")))
        << "the page header has the title as given";
}

TEST(DeskFrame, AFileThatIsNotThereIsSaid)
{
    Desk desk;
    const JobFolder folder;
    for (const char *name : {"gone.rep", "gone.json", "."}) {
        desk.messages.clear();
        EXPECT_FALSE(desk.frame->OpenFile(folder.path(name))) << name;
        EXPECT_EQ(desk.messages.size(), 1) << name;
        EXPECT_TRUE(Desk::reports().empty()) << name;
    }
    EXPECT_TRUE(UApplication::Get()->GetRecentFileList().isEmpty()) << "what could not be opened is not offered again";
}

TEST(DeskFrame, JobsAreMadeWithThePreferencesUnlessTheySayOtherwise)
{
    Desk desk;
    DeskPreferences preferences = loadPreferences();
    preferences.settings.lengthUnit = LengthUnit::InternationalFoot;
    preferences.fontSize = 11;
    preferences.margins = QMargins(500, 600, 700, 800);
    preferences.portrait = false;
    savePreferences(preferences);
    const JobFolder folder;
    folder.put("a.json", R"({"report": [{"line": "x"}]})");
    folder.put("b.json", R"({"report": [{"line": "x"}], "settings": {"lengthUnit": "km"},
                             "page": {"fontSize": 7, "margins": [1, 2, 3, 4], "orientation": "portrait"}})");
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("b.json")));
    const auto reports = Desk::reports();
    ASSERT_EQ(reports.size(), 2U);
    EXPECT_EQ(reports[0]->GetJobSettings().lengthUnit, LengthUnit::InternationalFoot);
    EXPECT_EQ(reports[0]->GetFontSize(), 11U);
    EXPECT_EQ(reports[0]->GetMargins(), QMargins(500, 600, 700, 800));
    EXPECT_GT(reports[0]->GetPageSize().width(), reports[0]->GetPageSize().height()) << "landscape";
    EXPECT_EQ(reports[1]->GetJobSettings().lengthUnit, LengthUnit::Kilometre);
    EXPECT_EQ(reports[1]->GetFontSize(), 7U);
    EXPECT_EQ(reports[1]->GetMargins(), QMargins(1, 2, 3, 4));
    EXPECT_LT(reports[1]->GetPageSize().width(), reports[1]->GetPageSize().height());
    EXPECT_EQ(loadPreferences().fontSize, 11U) << "a job does not change what the user has chosen";
    EXPECT_FALSE(loadPreferences().portrait);
}

TEST(DeskFrame, ATemplateAndADataFileMakeAReport)
{
    const CommandLineFolder folder;
    Desk desk;
    QStringList asked;
    desk.frame->askTemplate = [&](const QString &templateFile) -> std::optional<TemplateJob> {
        asked.append(templateFile);
        return TemplateJob{folder.path("t.xml"), QStringLiteral("CONTROL"), QStringLiteral("Points"), QString(),
                           folder.path("points.csv")};
    };
    EXPECT_TRUE(desk.frame->OnCommand(fileFromTemplateCommand));
    EXPECT_TRUE(desk.frame->OnCommand(fileFromTemplateCommand));
    EXPECT_EQ(asked, QStringList({QString(), QString()}));
    ASSERT_EQ(Desk::reports().size(), 2U);
    EXPECT_EQ(Desk::textOf(*Desk::reports().front()), Desk::textOf(*Desk::reports().back()));
    EXPECT_FALSE(Desk::reports().front()->IsEmpty());
    desk.frame->askTemplate = [](const QString &) { return std::nullopt; };
    EXPECT_TRUE(desk.frame->OnCommand(fileFromTemplateCommand));
    EXPECT_EQ(Desk::reports().size(), 2U) << "cancelled";
    EXPECT_TRUE(desk.messages.isEmpty());
}

TEST(DeskFrame, ClosingAsksForEveryReportThatHasChanged)
{
    struct Row
    {
        MessageAnswer answer;
        bool closes;
        const char *reason;
    };
    for (const Row &row : {Row{MessageAnswer::No, true, "the changes are given up"},
                           Row{MessageAnswer::Cancel, false, "cancelled: everything stays"},
                           Row{MessageAnswer::Yes, false, "the name is asked for and not given: everything stays"}})
    {
        Desk desk;
        ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
        ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
        Desk::reports().back()->WriteLine(QStringLiteral("x"), 0, 1, 0);
        desk.answer = row.answer;
        desk.frame->close();
        EXPECT_EQ(desk.frame->isHidden(), row.closes) << row.reason;
        EXPECT_EQ(desk.messages.size(), 1) << row.reason << ": the other report has not changed";
        EXPECT_EQ(Desk::reports().size(), row.closes ? 0U : 2U) << row.reason;
        desk.answer = MessageAnswer::No;
    }
}

TEST(DeskFrame, AReportThatClosesWhileItsQuestionIsOpenKeepsNothingOpen)
{
    for (const MessageAnswer answer : {MessageAnswer::Yes, MessageAnswer::No, MessageAnswer::Cancel}) {
        Desk desk;
        ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
        UReportDoc *report = Desk::reports().back();
        report->WriteLine(QStringLiteral("x"), 0, 1, 0);
        int questions = 0;
        kareport::setMessageBox([&](const kareport::Message &) {
            ++questions;
            report->OnCloseDocument();
            return answer;
        });
        desk.frame->close();
        EXPECT_EQ(questions, 1);
        EXPECT_FALSE(desk.frame->isVisible());
    }
}

TEST(DeskFrame, LayoutAndRecentFilesComeBack)
{
    const JobFolder folder;
    folder.put("a.rep", savedText("TALVEN"));
    folder.put("b.rep", savedText("TALVEN"));
    Desk desk;
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.rep")));
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("b.rep")));
    ASSERT_TRUE(desk.frame->OnCommand(viewToolBarCommand));
    desk.frame->resize(700, 500);
    desk.frame->close();
    desk.frame.reset();
    desk.application.reset();
    desk.application.emplace();
    desk.frame.emplace();
    desk.frame->show();
    EXPECT_EQ(desk.frame->size(), QSize(700, 500));
    EXPECT_FALSE(desk.frame->findChild<QToolBar *>()->isVisible());
    EXPECT_EQ(UApplication::Get()->GetRecentFileList(), QStringList({folder.path("b.rep"), folder.path("a.rep")}));
}

TEST(DeskFrame, WhatIsDroppedIsOpened)
{
    const JobFolder folder;
    folder.put("a.rep", savedText("TALVEN"));
    folder.put("b.json", lineJob());
    Desk desk;
    QMimeData dropped;
    dropped.setUrls({QUrl::fromLocalFile(folder.path("a.rep")), QUrl(QStringLiteral("https://example.org/x.rep")),
                     QUrl::fromLocalFile(folder.path("b.json"))});
    QDragEnterEvent enter(QPoint(9, 9), Qt::CopyAction, &dropped, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(&*desk.frame, &enter);
    EXPECT_TRUE(enter.isAccepted());
    QDropEvent drop(QPointF(9, 9), Qt::CopyAction, &dropped, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(&*desk.frame, &drop);
    EXPECT_EQ(Desk::reports().size(), 2U) << "files of this machine only";
    desk.answer = MessageAnswer::No;
}

} // namespace
