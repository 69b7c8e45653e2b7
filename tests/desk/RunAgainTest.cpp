#include "TableDesk.h"

#include "DeskCommandIds.h"
#include "FileWatch.h"
#include "Interrupt.h"
#include "NotesPane.h"
#include "UReportList.h"
#include "UReportWindowDlg.h"

#include <QScrollBar>
#include <QStatusBar>
#include <QTextBlock>
#include <QTimer>
#include <QTreeWidget>

#include <gtest/gtest.h>

#include <functional>

namespace
{

using kareport::runAgainCommand;

/// Waits until a watch that begins now has reported a change: those that began earlier have reported what changed before.
void waitForWatches(const QString &folder)
{
    QFile witness(folder + QStringLiteral("/witness"));
    ASSERT_TRUE(witness.open(QIODevice::WriteOnly));
    int reports = 0;
    kareport::FileWatch watch([&reports](const QString & /*path*/) { ++reports; });
    watch.watch(witness.fileName());
    for (int change = 1; change <= 2; ++change) { // the moments of two watches may differ a little
        witness.write("changed");
        witness.flush();
        EXPECT_TRUE(QTest::qWaitFor([&reports, change] { return reports == change; }));
    }
}

/// Puts the cursor into a line, with a selection that begins in another one.
void select(kareport::ReportEdit &edit, int fromLine, int fromColumn, int line, int column)
{
    QTextCursor cursor(edit.document());
    cursor.setPosition(edit.document()->findBlockByNumber(fromLine).position() + fromColumn);
    cursor.setPosition(edit.document()->findBlockByNumber(line).position() + column, QTextCursor::KeepAnchor);
    edit.setTextCursor(cursor);
}

/// "line:column-line:column" of the selection, anchor first.
QString selected(const kareport::ReportEdit &edit)
{
    const QTextCursor cursor = edit.textCursor();
    const QTextBlock anchor = edit.document()->findBlock(cursor.anchor());
    return QStringLiteral("%1:%2-%3:%4")
        .arg(anchor.blockNumber())
        .arg(cursor.anchor() - anchor.position())
        .arg(cursor.blockNumber())
        .arg(cursor.positionInBlock());
}

/// Does something while the next job runs: when it begins to read.
void duringRun(const std::function<void()> &act)
{
    QTimer::singleShot(0, act);
}

TEST(RunAgain, TheReportIsMadeOfTheFilesAsTheyAre)
{
    TableDesk desk;
    EXPECT_FALSE(desk.isEnabled(runAgainCommand)) << "there is no report";
    UReportDoc *report = desk.open();
    ASSERT_NE(report, nullptr);
    EXPECT_TRUE(desk.isEnabled(runAgainCommand));
    EXPECT_EQ(desk.frame->CommandAction(runAgainCommand)->shortcut(), QKeySequence(Qt::Key_F5));
    const QString title = report->GetTitle();
    desk.putRows(2, 10);
    EXPECT_TRUE(desk.frame->OnCommand(runAgainCommand));
    EXPECT_EQ(TableDesk::northings(*report), (QStringList{"10.000", "11.000"}));
    EXPECT_EQ(TableDesk::viewOf(*report)->GetEdit().toPlainText(), Desk::textOf(*report)) << "the view shows it";
    EXPECT_EQ(report->GetTitle(), title) << "its own pane has that caption already";
    EXPECT_TRUE(Desk::textOf(*report).contains(QStringLiteral("TALVEN - Points")));
    EXPECT_TRUE(report->IsModified());
    EXPECT_EQ(Desk::reports().size(), 1U);
    EXPECT_TRUE(desk.messages.isEmpty()) << "nothing was lost, and nothing is asked";
    EXPECT_EQ(report->GetPages().size(), 1U);

    UReportDoc *other = CreateReport(QStringLiteral("Other"), true, false, nullptr, 0, nullptr);
    desk.frame->SetActiveViewForFrameAndPane(other->GetViews().front());
    EXPECT_FALSE(desk.isEnabled(runAgainCommand)) << "no job made this one";
}

TEST(RunAgain, PlaceSelectionAndZoomStay)
{
    for (const int rows : {300, 40'000}) { // the longer one is loaded in pieces
        TableDesk desk;
        desk.putRows(rows);
        UReportDoc *report = desk.open();
        ASSERT_NE(report, nullptr);
        kareport::ReportEdit &edit = TableDesk::viewOf(*report)->GetEdit();
        edit.finishLoading();
        select(edit, rows - 30, 2, rows - 28, 5);
        edit.setZoomPercent(150);
        edit.verticalScrollBar()->setValue(rows - 35);
        const int top = edit.firstVisibleLine();
        desk.putRows(rows, 1'000'000); // with longer numbers
        EXPECT_TRUE(desk.frame->runs().runAgain());
        EXPECT_EQ(selected(edit), QStringLiteral("%1:2-%2:5").arg(rows - 30).arg(rows - 28)) << rows;
        EXPECT_EQ(edit.firstVisibleLine(), top) << rows;
        EXPECT_EQ(edit.zoomPercent(), 150) << rows;
        edit.finishLoading();
        EXPECT_EQ(selected(edit), QStringLiteral("%1:2-%2:5").arg(rows - 30).arg(rows - 28)) << rows << ": loaded";
        EXPECT_EQ(edit.firstVisibleLine(), top) << rows << ": loaded";

        desk.putRows(5);
        EXPECT_TRUE(desk.frame->runs().runAgain());
        const int last = edit.document()->blockCount() - 1;
        EXPECT_EQ(selected(edit), QStringLiteral("%1:0-%1:0").arg(last)) << "as far as there is text";
        EXPECT_EQ(edit.toPlainText(), Desk::textOf(*report));
    }
}

TEST(RunAgain, WhatFailsLeavesTheReportAsItIs)
{
    struct Row
    {
        std::function<void(const JobFolder &)> change;
        const char *message;
        const char *reason;
    };
    const Row rows[] = {
        {[](const JobFolder &folder) { QFile::remove(folder.path("p.csv")); }, "p.csv", "the data is gone"},
        {[](const JobFolder &folder) { QFile::resize(folder.path("p.csv"), 3); }, "p.csv:1:", "the data is cut off"},
        {[](const JobFolder &folder) { folder.put("p.csv", "Number,North\n1,x\n"); }, "p.csv:2:3", "a cell is wrong"},
        {[](const JobFolder &folder) { QFile::remove(folder.path("t.xml")); }, "t.xml", "the template is gone"},
        {[](const JobFolder &folder) { folder.put("job.json", "{"); }, "job.json:1:", "the job is being written"},
    };
    for (const Row &row : rows) {
        TableDesk desk;
        UReportDoc *report = desk.open();
        ASSERT_NE(report, nullptr);
        const QString before = Desk::textOf(*report);
        row.change(desk.folder);
        EXPECT_FALSE(desk.frame->runs().runAgain()) << row.reason;
        ASSERT_EQ(desk.messages.size(), 1) << row.reason;
        EXPECT_TRUE(desk.messages.front().contains(QString::fromUtf8(row.message)))
            << row.reason << ": " << desk.messages.front().toStdString();
        EXPECT_EQ(Desk::textOf(*report), before) << row.reason;
        EXPECT_EQ(TableDesk::viewOf(*report)->GetEdit().toPlainText(), before) << row.reason;
        EXPECT_TRUE(desk.isEnabled(runAgainCommand)) << row.reason << ": it can be tried again";
    }
}

TEST(RunAgain, ChangesByHandAreGivenUpAfterAQuestionAlone)
{
    TableDesk desk;
    UReportDoc *report = desk.open();
    ASSERT_NE(report, nullptr);
    kareport::ReportEdit &edit = TableDesk::viewOf(*report)->GetEdit();
    QTest::keyClicks(&edit, QStringLiteral("mine"));
    const QString mine = Desk::textOf(*report);
    ASSERT_TRUE(mine.startsWith(QStringLiteral("mine")));
    desk.putRows(1, 7);
    desk.answer = MessageAnswer::No;
    EXPECT_FALSE(desk.frame->runs().runAgain());
    ASSERT_EQ(desk.messages.size(), 1);
    EXPECT_TRUE(desk.messages.front().contains(QStringLiteral("made by hand")));
    EXPECT_EQ(Desk::textOf(*report), mine);
    desk.answer = MessageAnswer::Yes;
    EXPECT_TRUE(desk.frame->runs().runAgain());
    EXPECT_EQ(TableDesk::northings(*report), QStringList{"7.000"});
    EXPECT_TRUE(desk.frame->runs().runAgain());
    EXPECT_EQ(desk.messages.size(), 2) << "there are none any more";
    desk.answer = MessageAnswer::No;
}

TEST(RunAgain, ChangesInTheMeantimeAreAskedAboutAsWell)
{
    for (const bool areGivenUp : {false, true}) {
        TableDesk desk;
        UReportDoc *report = desk.open();
        ASSERT_NE(report, nullptr);
        desk.putRows(1, 7);
        desk.answer = areGivenUp ? MessageAnswer::Yes : MessageAnswer::No;
        duringRun([report] { report->ReplaceText(0, 0, u"mine"); });
        EXPECT_EQ(desk.frame->runs().runAgain(), areGivenUp);
        EXPECT_EQ(desk.messages.size(), 1);
        EXPECT_EQ(Desk::textOf(*report).startsWith(QStringLiteral("mine")), !areGivenUp);
        desk.answer = MessageAnswer::No;
    }
}

TEST(RunAgain, ARunThatIsCancelledLeavesTheReportAsItIs)
{
    TableDesk desk;
    UReportDoc *report = desk.open();
    ASSERT_NE(report, nullptr);
    desk.putRows(1, 7);
    duringRun([] { kareport::setInterrupted(true); });
    EXPECT_FALSE(desk.frame->runs().runAgain());
    kareport::setInterrupted(false);
    EXPECT_EQ(TableDesk::northings(*report).size(), 3);
    EXPECT_TRUE(desk.messages.isEmpty()) << "the user knows";
    EXPECT_TRUE(desk.frame->runs().runAgain());
    EXPECT_EQ(TableDesk::northings(*report).size(), 1);
}

TEST(RunAgain, AReportMayBeClosedWhileItIsMade)
{
    TableDesk desk;
    UReportDoc *report = desk.open();
    ASSERT_NE(report, nullptr);
    duringRun([report] { report->OnCloseDocument(); });
    EXPECT_FALSE(desk.frame->runs().runAgain());
    EXPECT_TRUE(Desk::reports().empty());
    EXPECT_TRUE(desk.messages.isEmpty());
    EXPECT_FALSE(desk.isEnabled(runAgainCommand));
    desk.putRows(1);
    waitForWatches(desk.folder.path());
    EXPECT_TRUE(Desk::reports().empty()) << "its files are not looked at any more";
}

TEST(RunAgain, AReportWindowShowsTheLinesOfTheNewRun)
{
    TableDesk desk;
    ASSERT_TRUE(desk.frame->OpenFile(desk.folder.path("job.json")));
    UReportDoc *report = Desk::reports().front();
    auto *window = dynamic_cast<UReportWindowDlg *>(report->GetReportWindow());
    ASSERT_NE(window, nullptr);
    if (!window->isCreated()) {
        window->createDocked(report->GetTitle(), nullptr); // the user keeps it
    }
    desk.putRows(2, 50);
    ASSERT_TRUE(desk.frame->runs().runAgain());
    QStringList first;
    for (int row = 0; row < window->GetList()->GetCount(); ++row) {
        first.append(window->GetList()->GetText(row));
    }
    EXPECT_EQ(first.filter(QStringLiteral("50.000")).size(), 1);
    EXPECT_EQ(first.filter(QStringLiteral("51.000")).size(), 1);
    EXPECT_EQ(first.filter(QStringLiteral("0.000")).size(), 1) << "those of the first run are gone";
    EXPECT_EQ(window->GetList()->model()->rowCount(), window->GetList()->GetCount()) << "they are shown at once";
    EXPECT_TRUE(
        QTest::qWaitFor([list = window->GetList()] { return list->currentIndex().row() == list->GetCurSel(); }));
}

TEST(RunAgain, TheTitleFollowsTheJobUnlessTheReportHasAFile)
{
    TableDesk desk;
    UReportDoc *report = desk.open();
    ASSERT_NE(report, nullptr);
    QByteArray job = desk.folder.bytesOf("job.json");
    desk.folder.put("job.json", job.replace("{\"template\"", "{\"title\": \"New\", \"template\""));
    ASSERT_TRUE(desk.frame->runs().runAgain());
    EXPECT_EQ(report->GetTitle(), QStringLiteral("New"));
    EXPECT_TRUE(Desk::textOf(*report).contains(QStringLiteral("TALVEN - New")));
    ASSERT_TRUE(report->OnSaveDocument(desk.folder.path("mine.rep")));
    report->SetPathName(desk.folder.path("mine.rep"), false);
    const QString title = report->GetTitle();
    desk.folder.put("job.json", job.replace("New", "Newer"));
    ASSERT_TRUE(desk.frame->runs().runAgain());
    EXPECT_EQ(report->GetTitle(), title);
    EXPECT_TRUE(Desk::textOf(*report).contains(QStringLiteral("TALVEN - Newer")));
    EXPECT_TRUE(report->IsModified()) << "its file has the earlier run";
}

TEST(RunAgain, PagesThatFlowOnTheSheetsGoOnDoingSo)
{
    TableDesk desk;
    UReportDoc *report = desk.open();
    ASSERT_NE(report, nullptr);
    ASSERT_TRUE(report->IsPageFixed());
    report->UseGivenPage(false);
    report->SetPageSize();
    ASSERT_TRUE(desk.frame->runs().runAgain());
    EXPECT_FALSE(report->IsPageFixed());
    EXPECT_EQ(report->GetGivenLinesPerPage(), 60);
}

/// A desk whose reports follow their files, with the report of the job open.
class FollowingDesk : public TableDesk
{
public:
    explicit FollowingDesk(bool follows = true)
    {
        frame->runs().setFollowsFiles(follows);
        // A change within the precision of a file's time would look like none.
        for (const QString &name : QDir(folder.path()).entryList(QDir::Files)) {
            QFile file(folder.path(qPrintable(name)));
            EXPECT_TRUE(file.open(QIODevice::ReadWrite) &&
                        file.setFileTime(QDateTime::currentDateTime().addSecs(-60), QFileDevice::FileModificationTime));
        }
        report = open();
    }
    bool comesTo(const QStringList &values) const
    {
        return QTest::qWaitFor([&] { return northings(*report) == values; });
    }
    bool says(const char *text) const
    {
        return QTest::qWaitFor([&] { return frame->statusBar()->currentMessage().contains(QString::fromUtf8(text)); });
    }

    UReportDoc *report = nullptr;
};

TEST(RunAgain, AReportFollowsItsFiles)
{
    FollowingDesk desk;
    ASSERT_NE(desk.report, nullptr);
    desk.putRows(1, 7);
    EXPECT_TRUE(desk.comesTo({"7.000"})) << "the data was written";
    desk.folder.put("new.csv", TableDesk::rows(1, 8));
    QFile::remove(desk.folder.path("p.csv"));
    QFile::rename(desk.folder.path("new.csv"), desk.folder.path("p.csv"));
    EXPECT_TRUE(desk.comesTo({"8.000"})) << "another file took the place of the data";
    QByteArray text = desk.folder.bytesOf("t.xml");
    desk.folder.put("t.xml", text.replace("<Label>North<", "<Label>Nord<"));
    EXPECT_TRUE(QTest::qWaitFor([&desk] { return Desk::textOf(*desk.report).contains(QStringLiteral("Nord")); }))
        << "the template was written";
    text = desk.folder.bytesOf("job.json");
    desk.folder.put("other.csv", TableDesk::rows(1, 9));
    desk.folder.put("job.json", text.replace("p.csv", "other.csv"));
    EXPECT_TRUE(desk.comesTo({"9.000"})) << "the job was written";
    desk.folder.put("other.csv", TableDesk::rows(1, 10));
    EXPECT_TRUE(desk.comesTo({"10.000"})) << "the file that the job names now counts";
    EXPECT_TRUE(desk.messages.isEmpty());
}

TEST(RunAgain, AFileThatIsCutOffOrGoneLeavesTheReport)
{
    FollowingDesk desk;
    ASSERT_NE(desk.report, nullptr);
    const QString before = Desk::textOf(*desk.report);
    desk.folder.put("p.csv", "Number,North\n1,"); // of a row that is being written
    desk.folder.put("p.csv", "Number,North\n1,2,");
    EXPECT_TRUE(desk.says("was not made again"));
    EXPECT_EQ(Desk::textOf(*desk.report), before);
    EXPECT_TRUE(desk.messages.isEmpty()) << "a file that is not complete yet is not an error";
    kareport::NotesPane &pane = desk.frame->runs().notesPane();
    EXPECT_TRUE(pane.isVisible());
    EXPECT_EQ(pane.count(), 1);
    EXPECT_TRUE(pane.list().topLevelItem(0)->text(1).contains(QStringLiteral("p.csv:2:")));
    desk.putRows(1, 7);
    EXPECT_TRUE(desk.comesTo({"7.000"}));
    EXPECT_EQ(pane.count(), 0) << "the list empties with the next run";
    QFile::remove(desk.folder.path("p.csv"));
    waitForWatches(desk.folder.path());
    EXPECT_EQ(TableDesk::northings(*desk.report), QStringList{"7.000"});
    desk.putRows(1, 8);
    EXPECT_TRUE(desk.comesTo({"8.000"})) << "it is back";
}

TEST(RunAgain, WithoutFollowingTheUserIsToldAlone)
{
    FollowingDesk desk(false);
    ASSERT_NE(desk.report, nullptr);
    desk.putRows(1, 7);
    EXPECT_TRUE(desk.says("F5"));
    EXPECT_EQ(TableDesk::northings(*desk.report).size(), 3);
    EXPECT_TRUE(desk.frame->OnCommand(kareport::runWhenChangedCommand));
    EXPECT_TRUE(desk.frame->runs().followsFiles());
    EXPECT_TRUE(desk.comesTo({"7.000"})) << "what has changed already counts";
    EXPECT_TRUE(desk.frame->OnCommand(kareport::runWhenChangedCommand));
    desk.putRows(1, 8);
    waitForWatches(desk.folder.path());
    EXPECT_EQ(TableDesk::northings(*desk.report), QStringList{"7.000"});
}

TEST(RunAgain, FollowingIsKeptForTheNextStart)
{
    TableDesk desk;
    EXPECT_FALSE(desk.frame->runs().followsFiles());
    desk.frame->runs().setFollowsFiles(true);
    desk.frame.reset();
    desk.frame.emplace();
    EXPECT_TRUE(desk.frame->runs().followsFiles());
}

TEST(RunAgain, WhoRefusesToGiveUpHisChangesIsNotAskedAtEachChange)
{
    FollowingDesk desk;
    ASSERT_NE(desk.report, nullptr);
    desk.report->ReplaceText(0, 0, u"mine");
    desk.answer = MessageAnswer::No;
    desk.putRows(1, 7);
    EXPECT_TRUE(QTest::qWaitFor([&desk] { return desk.messages.size() == 1; }));
    desk.putRows(1, 8);
    EXPECT_TRUE(desk.says("F5"));
    EXPECT_EQ(desk.messages.size(), 1);
    EXPECT_TRUE(Desk::textOf(*desk.report).startsWith(QStringLiteral("mine")));
    desk.answer = MessageAnswer::Yes;
    EXPECT_TRUE(desk.frame->runs().runAgain());
    EXPECT_EQ(TableDesk::northings(*desk.report), QStringList{"8.000"});
    desk.answer = MessageAnswer::No;
    desk.putRows(1, 9);
    EXPECT_TRUE(desk.comesTo({"9.000"})) << "it follows again";
}

TEST(RunAgain, AChangeWhileTheReportIsMadeIsNoticed)
{
    FollowingDesk desk;
    ASSERT_NE(desk.report, nullptr);
    duringRun([&desk] { desk.folder.put("p.csv", TableDesk::rows(2, 4)); });
    desk.frame->runs().runAgain();
    EXPECT_TRUE(desk.comesTo({"4.000", "5.000"}));
}

} // namespace
