#include "DeskFixture.h"

#include "COneViewPane.h"
#include "CommandLine.h"
#include "DeskCommandIds.h"
#include "DeskPreferences.h"
#include "FrameFixture.h"
#include "ReportEdit.h"
#include "SaveDialog.h"
#include "SavedReports.h"
#include "UApplication.h"
#include "UReportList.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"
#include "UView.h"

#include <QAction>
#include <QDockWidget>
#include <QDropEvent>
#include <QMenu>
#include <QMenuBar>
#include <QMimeData>
#include <QToolBar>

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

/// A report file of one line.
QByteArray savedText(const char *line)
{
    return "\xEF\xBB\xBF" + QByteArray(line) + "\r\r\n";
}

/// All entries of the menus and their menus, with their keys.
void collect(const QMenu &menu, QStringList &entries)
{
    for (const QAction *action : menu.actions()) {
        if (action->menu() != nullptr) {
            collect(*action->menu(), entries);
        }
        if (!action->isSeparator()) {
            entries.append(action->text());
        }
    }
}

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
        {"no.json", "[1", nullptr, "no.json", "a text that is no JSON"},
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
    ASSERT_EQ(desk.messages.size(), 1);
    EXPECT_TRUE(desk.messages.front().startsWith(QStringLiteral("The report was made. Notes on its data: 2\n\n")))
        << desk.messages.front().toStdString();
    EXPECT_TRUE(desk.messages.front().contains(QStringLiteral("points.csv:1:8: note: the column \"Nort\"")))
        << desk.messages.front().toStdString();
    EXPECT_EQ(Desk::reports().size(), 1U);

    desk.messages.clear();
    folder.put("strict.json", QByteArray(job).replace("false}", "true}"));
    EXPECT_FALSE(desk.frame->OpenFile(folder.path("strict.json")));
    ASSERT_EQ(desk.messages.size(), 1);
    EXPECT_TRUE(desk.messages.front().contains(QStringLiteral("points.csv:1:8: error: the column \"Nort\"")));
    EXPECT_EQ(Desk::reports().size(), 1U) << "nothing half made stays";
}

TEST(DeskFrame, AJobRunsIntoAReportWindow)
{
    Desk desk;
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
        << "the report stands in one pane";
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
    desk.answer = MessageAnswer::No; // it is not to be saved
    const JobFolder folder;
    folder.put("a.json", lineJob());
    ASSERT_TRUE(desk.frame->OpenFile(folder.path("a.json")));
    UReportDoc *report = Desk::reports().front();
    QTest::qWait(600); // what is shown stays open
    ASSERT_TRUE(UReportDoc::IsReportAvailable(report));
    dynamic_cast<UReportWindowDlg *>(report->GetReportWindow())->OnPressCloseButton();
    EXPECT_TRUE(QTest::qWaitFor([report] { return !UReportDoc::IsReportAvailable(report); }))
        << "nobody could ever see it again";
    EXPECT_EQ(desk.messages.size(), 1) << "asked once";
}

TEST(DeskFrame, AReportThatCouldNotBeSavedIsNotThrownAwayWithItsWindow)
{
    Desk desk;
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
    EXPECT_TRUE(desk.frame->OpenFile(folder.path("t.xml")));
    EXPECT_TRUE(desk.frame->OnCommand(fileFromTemplateCommand));
    EXPECT_EQ(asked, QStringList({folder.path("t.xml"), QString()})) << "a template that is opened is the one proposed";
    ASSERT_EQ(Desk::reports().size(), 2U);
    EXPECT_EQ(Desk::textOf(*Desk::reports().front()), Desk::textOf(*Desk::reports().back()));
    EXPECT_FALSE(Desk::reports().front()->IsEmpty());
    desk.frame->askTemplate = [](const QString &) { return std::nullopt; };
    EXPECT_TRUE(desk.frame->OnCommand(fileFromTemplateCommand));
    EXPECT_EQ(Desk::reports().size(), 2U) << "cancelled";
    EXPECT_TRUE(desk.messages.isEmpty());
}

TEST(DeskFrame, EveryMenuEntryHasTextAndNoTwoTheSameKey)
{
    Desk desk;
    QStringList entries;
    QStringList keys;
    for (const QAction *action : desk.frame->menuBar()->actions()) {
        collect(*action->menu(), entries);
    }
    for (const char *entry : {"&New",
                              "&Open...",
                              "&Close",
                              "&Save",
                              "Save &As...",
                              "Update Text",
                              "&Print...",
                              "Print Pre&view",
                              "Pa&ge Setup...",
                              "Recent File",
                              "E&xit",
                              "&Undo",
                              "Cu&t",
                              "&Copy",
                              "&Paste",
                              "&Toolbar",
                              "&Status Bar",
                              "&New Window",
                              "&Cascade",
                              "&Tile Horizontally",
                              "Tile Vertically",
                              "&Arrange Icons",
                              "&Help",
                              "&About..."})
    {
        EXPECT_TRUE(entries.contains(QString::fromUtf8(entry))) << entry;
    }
    for (const QAction *action : desk.frame->findChildren<QAction *>()) {
        for (const QKeySequence &key : action->shortcuts()) {
            EXPECT_FALSE(keys.contains(key.toString())) << key.toString().toStdString();
            keys.append(key.toString());
        }
    }
    const std::pair<unsigned, const char *> given[] = {{fileNewCommand, "Ctrl+N"},  {fileOpenCommand, "Ctrl+O"},
                                                       {fileSaveCommand, "Ctrl+S"}, {filePrintCommand, "Ctrl+P"},
                                                       {undoCommand, "Ctrl+Z"},     {cutCommand, "Ctrl+X"},
                                                       {copyCommand, "Ctrl+C"},     {pasteCommand, "Ctrl+V"}};
    for (const auto &[id, key] : given) {
        EXPECT_EQ(desk.frame->CommandAction(id)->shortcut().toString(), QString::fromUtf8(key));
    }
}

TEST(DeskFrame, CommandsFollowWhetherAReportIsOpen)
{
    Desk desk;
    desk.frame->UpdateCommands();
    const unsigned needing[] = {fileSaveCommand,     fileSaveAsCommand, filePrintCommand,
                                printPreviewCommand, pageSetupCommand,  copyCommand,
                                findCommand,         windowNewCommand,  windowCascadeCommand};
    for (const unsigned id : needing) {
        EXPECT_FALSE(desk.frame->CommandAction(id)->isEnabled()) << id;
    }
    for (const unsigned id :
         {unsigned(fileNewCommand), unsigned(fileOpenCommand), unsigned(exitCommand), unsigned(preferencesCommand)})
    {
        EXPECT_TRUE(desk.frame->CommandAction(id)->isEnabled()) << id;
    }
    ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
    desk.frame->UpdateCommands();
    for (const unsigned id : needing) {
        EXPECT_TRUE(desk.frame->CommandAction(id)->isEnabled()) << id;
    }
    EXPECT_FALSE(desk.frame->CommandAction(updateTextCommand)->isEnabled()) << "the report is nobody's object";
    EXPECT_TRUE(desk.frame->CommandAction(viewToolBarCommand)->isChecked());
    ASSERT_TRUE(desk.frame->OnCommand(viewToolBarCommand));
    desk.frame->UpdateCommands();
    EXPECT_FALSE(desk.frame->CommandAction(viewToolBarCommand)->isChecked());
}

TEST(DeskFrame, WindowsOfAReportAreTiledAndJoined)
{
    Desk desk;
    ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
    ASSERT_TRUE(desk.frame->OnCommand(windowNewCommand));
    ASSERT_TRUE(desk.frame->OnCommand(windowNewCommand));
    const auto docks = desk.frame->findChildren<QDockWidget *>(QString(), Qt::FindDirectChildrenOnly);
    ASSERT_EQ(docks.size(), 3);
    EXPECT_EQ(docks[2]->windowTitle(), QStringLiteral("Report:3")) << "panes of one report are numbered";
    docks[1]->setFloating(true);
    ASSERT_TRUE(desk.frame->OnCommand(windowTileHorizontallyCommand));
    QCoreApplication::processEvents();
    EXPECT_FALSE(docks[1]->isFloating());
    for (qsizetype i = 1; i < docks.size(); ++i) {
        EXPECT_GT(docks[i]->y(), docks[i - 1]->y()) << "one above the other";
        EXPECT_EQ(docks[i]->x(), docks[0]->x());
    }
    ASSERT_TRUE(desk.frame->OnCommand(windowTileVerticallyCommand));
    QCoreApplication::processEvents();
    for (qsizetype i = 1; i < docks.size(); ++i) {
        EXPECT_GT(docks[i]->x(), docks[i - 1]->x()) << "side by side";
    }
    ASSERT_TRUE(desk.frame->OnCommand(windowCascadeCommand));
    EXPECT_EQ(desk.frame->tabifiedDockWidgets(docks[0]).size(), 2);
    desk.answer = MessageAnswer::No;
}

/// Counts how often widgets get another place or size.
class PlacesCounted : public QObject
{
public:
    bool eventFilter(QObject * /*watched*/, QEvent *event) override
    {
        count += event->type() == QEvent::Resize || event->type() == QEvent::Move ? 1 : 0;
        return false;
    }
    int count = 0;
};

TEST(DeskFrame, TilingLaysThePanesOutOnce)
{
    Desk desk;
    for (int i = 0; i < 24; ++i) {
        ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
    }
    const auto docks = desk.frame->findChildren<QDockWidget *>(QString(), Qt::FindDirectChildrenOnly);
    for (const unsigned command : {windowTileHorizontallyCommand, windowTileVerticallyCommand, windowCascadeCommand}) {
        for (qsizetype i = 0; i < docks.size(); i += 2) {
            docks[i]->setFloating(true);
        }
        QCoreApplication::processEvents();
        PlacesCounted places;
        for (QDockWidget *dock : docks) {
            dock->installEventFilter(&places);
        }
        ASSERT_TRUE(desk.frame->OnCommand(command));
        // One that floats is moved once more. Were all laid out for each of them, a hundred panes would take a minute.
        EXPECT_LE(places.count, 6 * docks.size()) << command;
        for (const QDockWidget *dock : docks) {
            EXPECT_FALSE(dock->isFloating()) << command;
            EXPECT_TRUE(dock->isVisible()) << command;
        }
    }
    desk.answer = MessageAnswer::No;
}

TEST(DeskFrame, AKeyGoesFromReportToReport)
{
    Desk desk;
    for (int i = 0; i < 3; ++i) {
        ASSERT_TRUE(desk.frame->OnCommand(fileNewCommand));
    }
    const auto reports = Desk::reports();
    const auto press = [&desk](Qt::KeyboardModifiers modifiers) {
        desk.frame->activateWindow();
        EXPECT_TRUE(QTest::qWaitFor([] { return QApplication::focusWidget() != nullptr; }));
        desk.frame->UpdateCommands();
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab, modifiers);
        return desk.frame->GetActiveView() != nullptr ? desk.frame->GetActiveView()->GetDocument() : nullptr;
    };
    constexpr Qt::KeyboardModifiers forward = Qt::ControlModifier;
    constexpr Qt::KeyboardModifiers back = Qt::ControlModifier | Qt::ShiftModifier;
    EXPECT_EQ(press(forward), reports[0]) << "the first comes after the last";
    EXPECT_EQ(press(forward), reports[1]);
    EXPECT_EQ(press(back), reports[0]);
    EXPECT_EQ(press(back), reports[2]);
    EXPECT_TRUE(desk.frame->GetActiveView()->GetWidget()->isAncestorOf(QApplication::focusWidget()))
        << "with the keyboard";
    EXPECT_TRUE(reports[2]->IsEmpty()) << "and nothing is typed";
    reports[0]->GetViews().front()->GetParentPane()->ShowPane(false); // as while an editor has it
    EXPECT_EQ(press(forward), reports[1]) << "what nobody can see is passed over";
    desk.answer = MessageAnswer::No;
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

TEST(DeskFrame, AFileThatChangesOnTheDiskIsOfferedAgain)
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
        QTest::qWait(1); // the watch begins behind the opening
        desk.answer = row.answer;
        folder.put("a.rep", savedText("TALVEN new"));
        EXPECT_TRUE(QTest::qWaitFor([&desk] { return !desk.messages.isEmpty(); })) << row.reason;
        EXPECT_EQ(desk.messages.value(0).contains(QStringLiteral("not saved")), row.isEdited) << row.reason;
        EXPECT_EQ(Desk::textOf(*report), QString::fromUtf8(row.text)) << row.reason;
        EXPECT_EQ(report->IsModified(), row.isEdited && row.answer == MessageAnswer::No) << row.reason;
        desk.answer = MessageAnswer::No;
    }
}

TEST(DeskFrame, ItsOwnSavesAreNoChangesOfOthers)
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
    // A change of the other file that is told shows that this one would have been told by then.
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

TEST(DeskFrame, AReportOfAJobWithARichTextImageIsEditedSavedAndLoadedAgainAsAnyOther)
{
    const JobFolder folder;
    folder.put("a.json", R"({"title": "Lines", "header": false, "page": {"linesPerPage": 60, "charsPerRow": 80},
                             "report": [{"line": "First line"}],
                             "output": [{"file": "word.rtf", "as": "rtf-image"}]})");
    Desk desk;
    desk.answer = MessageAnswer::No;
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

TEST(DeskFrame, WhatIsTypedAfterAReportWasGivenUpIsNotThrownAway)
{
    struct Row
    {
        bool isTyped;
        const char *reason;
    };
    for (const Row &row :
         {Row{false, "not to be saved, and nobody can see it"}, Row{true, "the answer was about what there was then"}})
    {
        Desk desk;
        desk.answer = MessageAnswer::No;
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
