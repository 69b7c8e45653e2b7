#include "BracketTranslator.h"
#include "PrintFixture.h"
#include "ReportWindowFixture.h"

#include <QFile>

#include <gmock/gmock.h>

namespace
{

using ReportWindowCommands = WrittenReportWindow;
using testing::IsEmpty;

TEST_F(ReportWindowCommands, ButtonsFollowTheMarkAndTheReport)
{
    struct Row
    {
        bool active;
        bool linked;
        bool modified;
        bool save;
        bool others;
        const char *reason;
    };
    constexpr Row rows[] = {
        {false, true, true, false, false, "while the report is written"},
        {true, true, true, true, true, "when it is written"},
        {true, true, false, false, true, "nothing to save"},
        {true, false, true, false, false, "no report"},
        {false, false, false, false, false, "nothing at all"},
    };
    for (const Row &row : rows) {
        window.SetReportDoc(row.linked ? report : nullptr);
        report->SetModifiedFlag(row.modified);
        window.setActive(row.active);
        EXPECT_EQ(isEnabled(11007), row.save) << "Save: " << row.reason;
        EXPECT_EQ(isEnabled(11009), row.others) << "View\\Edit Report: " << row.reason;
        EXPECT_EQ(isEnabled(11011), row.others) << "Print: " << row.reason;
    }
    EXPECT_EQ(window.commands().size(), 3U);
    kareport::CommandState state;
    EXPECT_FALSE(window.updateCommand(57603, state)) << "no command of the window";
}

TEST_F(ReportWindowCommands, ButtonsFollowByThemselves)
{
    window.setActive(true);
    const QAction *save = window.GetToolBar()->actions().front();
    ASSERT_TRUE(save->isEnabled());
    report->SetModifiedFlag(false);
    EXPECT_TRUE(QTest::qWaitFor([save] { return !save->isEnabled(); }, 5000))
        << "a report does not tell that it is saved";
    report->SetModifiedFlag(true);
    EXPECT_TRUE(QTest::qWaitFor([save] { return save->isEnabled(); }, 5000));
}

TEST_F(ReportWindowCommands, WithoutAReportNothingIsDone)
{
    const AnsweredSaving saving(folder.filePath(QStringLiteral("a.rep")));
    const AnsweredPrinting printing;
    report->SetReportWindow(nullptr);
    const std::unique_ptr<UReportWindowDlg> owner(&window);
    window.SetReportDoc(nullptr);
    window.setActive(true);
    window.OnSave();
    window.OnPrint();
    window.OnShowReport();
    EXPECT_THAT(saving.requests, IsEmpty());
    EXPECT_EQ(printing.prints, 0);
    EXPECT_TRUE(window.isCreated()) << "it stays open";
    EXPECT_EQ(report->GetViews().size(), 1U);
}

TEST_F(ReportWindowCommands, SavingAsksForAFile)
{
    SetLastOpenDir(folder.filePath(QStringLiteral("before.rep")), QStringLiteral("LastOpenDirectoryReport"));
    const QDir chosenFolder(folder.filePath(QStringLiteral("chosen")));
    ASSERT_TRUE(QDir().mkpath(chosenFolder.path()));
    const QString path = chosenFolder.filePath(QStringLiteral("report.rep"));
    const AnsweredSaving saving(path);
    window.setActive(true);
    ASSERT_TRUE(report->IsModified());
    click(11007);
    ASSERT_EQ(saving.requests.size(), 1U);
    const kareport::SaveRequest &request = saving.requests.front();
    EXPECT_EQ(request.filter, QStringLiteral("Report Files (*.rep)|*.rep|RTF Files (*.rtf)|*.rtf|PDF (*.pdf)|*.pdf|"
                                             "All Files (*.*)|*.*||"));
    EXPECT_EQ(request.defaultExtension, QStringLiteral("rep"));
    EXPECT_EQ(request.fileName, QString());
    EXPECT_EQ(request.flags, 0x806U);
    EXPECT_EQ(QDir(request.initialFolder), QDir(folder.path()));
    EXPECT_EQ(QDir(GetInitialOpenDir(QStringLiteral("LastOpenDirectoryReport"))), chosenFolder);
    EXPECT_NE(contentOf(path).find("  first\r"), std::string::npos) << "as report text";
    EXPECT_FALSE(report->IsModified());
    EXPECT_FALSE(isEnabled(11007));
    EXPECT_EQ(report->GetPathName(), QString()) << "the file does not become the report's own";
    EXPECT_TRUE(window.isCreated()) << "the window stays open";
}

TEST_F(ReportWindowCommands, TheKindsOfFilesAreTranslated)
{
    const AnsweredSaving saving(std::nullopt);
    {
        const BracketTranslator translator;
        window.OnSave();
    }
    ASSERT_EQ(saving.requests.size(), 1U);
    EXPECT_TRUE(saving.requests.front().filter.startsWith(
        QStringLiteral("[Report Files (*.rep)|*.rep|RTF Files (*.rtf)|*.rtf|PDF (*.pdf)|*.pdf|]")))
        << saving.requests.front().filter.toStdString();
}

TEST_F(ReportWindowCommands, TheEndingOfTheNameSaysTheKindOfFile)
{
    struct Row
    {
        const char *name;
        const char *begin;
    };
    constexpr Row rows[] = {{"a.pdf", "%PDF"}, {"a.rtf", "{\\rtf"}, {"a.txt", "\xEF\xBB\xBF"}};
    for (const Row &row : rows) {
        const QString path = folder.filePath(QString::fromUtf8(row.name));
        const AnsweredSaving saving(path);
        report->SetModifiedFlag(true);
        window.OnSave();
        EXPECT_EQ(contentOf(path).substr(0, std::string(row.begin).size()), row.begin) << row.name;
        EXPECT_FALSE(report->IsModified()) << row.name;
    }
}

TEST_F(ReportWindowCommands, ACancelledDialogChangesNothing)
{
    SetLastOpenDir(folder.filePath(QStringLiteral("before.rep")), QStringLiteral("LastOpenDirectoryReport"));
    const AnsweredSaving saving(std::nullopt);
    window.OnSave();
    EXPECT_EQ(saving.requests.size(), 1U);
    EXPECT_TRUE(report->IsModified());
    EXPECT_EQ(QDir(GetInitialOpenDir(QStringLiteral("LastOpenDirectoryReport"))), QDir(folder.path()));
    EXPECT_TRUE(window.isCreated());
}

TEST_F(ReportWindowCommands, ASaveThatFailsLeavesTheReportModified)
{
    const QString path = folder.filePath(QStringLiteral("missing/a.rep"));
    const AnsweredSaving saving(path);
    const AnsweredBoxes boxes(MessageAnswer::Ok);
    window.OnSave();
    EXPECT_TRUE(report->IsModified());
    ASSERT_EQ(boxes.boxes.size(), 1U) << "and says why";
    EXPECT_TRUE(boxes.boxes[0].text.startsWith(u'"' + path + u'"')) << boxes.boxes[0].text.toStdString();
    EXPECT_TRUE(boxes.boxes[0].text.contains(QStringLiteral("No such file or directory")))
        << boxes.boxes[0].text.toStdString();
}

TEST_F(ReportWindowCommands, TheReportMayBeClosedWhileTheDialogIsOpen)
{
    const QString path = folder.filePath(QStringLiteral("a.rep"));
    AnsweredSaving saving(path);
    saving.meanwhile = [this] { report->OnCloseDocument(); };
    window.OnSave();
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
    EXPECT_FALSE(QFile::exists(path));
}

TEST_F(ReportWindowCommands, ClosingAsksWhenTheReportIsModified)
{
    struct Row
    {
        bool modified;
        QString title;
        QString question; ///< empty: none
        const char *reason;
    };
    const Row rows[] = {
        {false, QStringLiteral("Traverse"), QString(), "nothing to save"},
        {true, QStringLiteral("Traverse"), QStringLiteral("Save changes to Traverse?"), "changes to a report"},
        {true, QString(), QStringLiteral("Save changes?"), "to one without a title"},
    };
    for (const Row &row : rows) {
        const AnsweredBoxes boxes(MessageAnswer::No);
        const AnsweredSaving saving(folder.filePath(QStringLiteral("a.rep")));
        window.createDocked(QString(), before->GetViews().front());
        window.SetWindowTextW(row.title);
        report->SetModifiedFlag(row.modified);
        window.OnPressCloseButton();
        EXPECT_EQ(boxes.boxes.size(), row.question.isEmpty() ? 0U : 1U) << row.reason;
        if (!boxes.boxes.empty()) {
            EXPECT_EQ(boxes.boxes.front().text, row.question) << row.reason;
            EXPECT_EQ(boxes.boxes.front().buttons, MessageButtons::YesNo) << row.reason;
            EXPECT_EQ(boxes.boxes.front().icon, kareport::MessageIcon::Question) << row.reason;
        }
        EXPECT_THAT(saving.requests, IsEmpty()) << row.reason;
        EXPECT_FALSE(window.isCreated()) << row.reason;
        EXPECT_EQ(report->IsModified(), row.modified) << row.reason;
        EXPECT_EQ(activeView(), before->GetViews().front()) << row.reason;
        WindowDesk::settle();
    }
}

TEST_F(ReportWindowCommands, TheQuestionIsTranslatedPieceByPiece)
{
    const AnsweredBoxes boxes(MessageAnswer::No);
    window.SetWindowTextW(QStringLiteral("Traverse"));
    ASSERT_TRUE(report->IsModified());
    {
        const BracketTranslator translator;
        window.OnPressCloseButton();
    }
    ASSERT_EQ(boxes.boxes.size(), 1U);
    EXPECT_EQ(boxes.boxes.front().text, QStringLiteral("[Save changes] [to] Traverse?"));
}

TEST_F(ReportWindowCommands, ClosingSavesWhenThatIsWanted)
{
    const QString path = folder.filePath(QStringLiteral("a.rep"));
    const AnsweredBoxes boxes(MessageAnswer::Yes);
    {
        const AnsweredSaving cancelled(std::nullopt);
        window.OnPressCloseButton();
        EXPECT_EQ(cancelled.requests.size(), 1U);
        EXPECT_FALSE(window.isCreated()) << "a cancelled file dialog changes nothing: the window closes";
        EXPECT_TRUE(report->IsModified());
    }
    ASSERT_TRUE(window.createDocked(QStringLiteral("Traverse"), nullptr));
    const AnsweredSaving saving(path);
    window.OnPressCloseButton();
    EXPECT_TRUE(QFile::exists(path));
    EXPECT_FALSE(report->IsModified());
    EXPECT_FALSE(window.isCreated());
}

TEST_F(ReportWindowCommands, TheCloseBoxAsks)
{
    const AnsweredBoxes boxes(MessageAnswer::No);
    desk.frame->SetActiveViewForFrameAndPane(nullptr);
    window.GetDock()->close();
    EXPECT_EQ(activeView(), before->GetViews().front());
    EXPECT_EQ(boxes.boxes.size(), 1U);
    EXPECT_FALSE(window.isCreated());
    EXPECT_TRUE(UReportDoc::IsReportAvailable(report)) << "the report lives on without its window";
    WindowDesk::settle();
    report->WriteLine(QStringLiteral("third"), 0, 1, 0);
    EXPECT_EQ(reports(), 2U);
}

TEST_F(ReportWindowCommands, OtherSystemCommandsDoNothing)
{
    const AnsweredBoxes boxes(MessageAnswer::No);
    window.OnSysCommand(61472, 0);
    EXPECT_TRUE(window.isCreated());
    EXPECT_THAT(boxes.boxes, IsEmpty());
}

TEST_F(ReportWindowCommands, AWindowWithoutAReportClosesWithoutAsking)
{
    const AnsweredBoxes boxes(MessageAnswer::Yes);
    UReportWindowDlg own;
    ASSERT_TRUE(own.createDocked(QStringLiteral("Own"), before->GetViews().front()));
    desk.frame->SetActiveViewForFrameAndPane(nullptr);
    own.OnPressCloseButton();
    EXPECT_FALSE(own.isCreated());
    EXPECT_THAT(boxes.boxes, IsEmpty());
    EXPECT_EQ(activeView(), before->GetViews().front());
}

TEST_F(ReportWindowCommands, TheReportMayBeClosedWhileItsWindowAsks)
{
    for (const MessageAnswer answer : {MessageAnswer::Yes, MessageAnswer::No}) {
        UReportDoc *closed = CreateReportWindow(QStringLiteral("Closed"), false, false);
        closed->WriteLine(QStringLiteral("text"), 0, 1, 0);
        AnsweredBoxes boxes(answer);
        const AnsweredSaving saving(folder.filePath(QStringLiteral("a.rep")));
        boxes.meanwhile = [closed] { closed->OnCloseDocument(); };
        WindowDesk::windowOf(closed).OnPressCloseButton();
        EXPECT_FALSE(UReportDoc::IsReportAvailable(closed));
        EXPECT_THAT(saving.requests, IsEmpty());
    }
}

} // namespace
