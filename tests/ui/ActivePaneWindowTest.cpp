#include "ActivePaneFixture.h"
#include "PrintFixture.h"

#include <QClipboard>

namespace
{

/// A report window with the keyboard, above it a report that can be seen as well.
class ReportWindowInFront : public WrittenReportWindow
{
protected:
    ReportWindowInFront()
    {
        before->WriteLine(QStringLiteral("kept"), 0, 1, 0);
        before->UpdateAllViews(nullptr);
        before->SetModifiedFlag(false);
        report->SetReportWindowActive();
        WindowDesk::settle();
    }

    bool isCommandEnabled(unsigned id)
    {
        QAction *action = desk.frame->CommandAction(id);
        desk.frame->UpdateCommands();
        return action->isEnabled();
    }

    const QString written = QStringLiteral("  first\r\nsecond\r\n");
};

TEST_F(ReportWindowInFront, HasTheKeyboardAndTheCommands)
{
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
    EXPECT_EQ(desk.frame->GetActivePane(), &window);
    EXPECT_EQ(desk.frame->GetCommandDocument(), report);
    EXPECT_EQ(activeView(), before->GetViews().front()) << "a host's own commands go to it, as it is seen";
}

TEST_F(ReportWindowInFront, NothingThatIsEditedOrLookedForReachesAnotherReport)
{
    struct Row
    {
        unsigned id;
        const char *name;
    };
    constexpr Row rows[] = {{57637, "Paste"},      {57635, "Cut"},     {57642, "Select All"}, {57643, "Undo"},
                            {57644, "Redo"},       {57636, "Find"},    {57640, "Find Next"},  {33240, "Find Previous"},
                            {33241, "Go to Page"}, {33242, "Zoom In"}, {33243, "Zoom Out"},   {33244, "Usual Size"}};
    QGuiApplication::clipboard()->setText(QStringLiteral("pasted"));
    for (const Row &row : rows) {
        EXPECT_FALSE(isCommandEnabled(row.id)) << row.name;
        desk.frame->OnCommand(row.id);
        EXPECT_EQ(textOf(*report), written) << row.name;
        EXPECT_EQ(textOf(*before), QStringLiteral("kept\r\n")) << row.name;
    }
    EXPECT_EQ(editOf(*before).zoomPercent(), 100);
    EXPECT_TRUE(window.GetList()->hasFocus()) << "no bar of the other report has taken the keyboard";
}

TEST_F(ReportWindowInFront, SavesTheReportThatItShows)
{
    const QString path = folder.filePath(QStringLiteral("a.rep"));
    const AnsweredSaving saving(path);
    ASSERT_TRUE(isCommandEnabled(57603));
    desk.frame->OnCommand(57603);
    EXPECT_NE(contentOf(path).find("  first\r"), std::string::npos);
    EXPECT_FALSE(report->IsModified());
    EXPECT_TRUE(window.isCreated());
    desk.frame->OnCommand(57604);
    EXPECT_EQ(saving.requests.size(), 2U) << "Save As";
    EXPECT_EQ(before->GetPathName(), QString());
}

TEST_F(ReportWindowInFront, PrintsTheReportThatItShowsAndStays)
{
    AnsweredPrinting printing;
    ASSERT_TRUE(isCommandEnabled(57607));
    desk.frame->OnCommand(57607);
    EXPECT_EQ(printing.prints, 1);
    EXPECT_EQ(printing.printedPages(), 1);
    EXPECT_EQ(editOf(*report).toPlainText(), QStringLiteral("  first\nsecond\n")) << "from its view, loaded for it";
    EXPECT_TRUE(window.IsVisible());
    WindowDesk::settle();
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
    EXPECT_EQ(desk.frame->GetActivePane(), &window);
}

TEST_F(ReportWindowInFront, CopiesItsLine)
{
    ASSERT_TRUE(isCommandEnabled(57634));
    desk.frame->OnCommand(57634);
    EXPECT_EQ(QGuiApplication::clipboard()->text(), QStringLiteral("second"));
}

TEST_F(ReportWindowInFront, ClosesTheReportThatItShows)
{
    ASSERT_TRUE(isCommandEnabled(57602));
    {
        const AnsweredBoxes boxes(MessageAnswer::Cancel);
        desk.frame->OnCommand(57602);
        EXPECT_EQ(boxes.boxes.size(), 1U);
        EXPECT_TRUE(window.isCreated());
    }
    report->EnableCloseOption(false);
    EXPECT_FALSE(isCommandEnabled(57602)) << "an editor holds it";
    report->EnableCloseOption(true);
    const AnsweredBoxes boxes(MessageAnswer::No);
    desk.frame->OnCommand(57602);
    EXPECT_FALSE(UReportDoc::IsReportAvailable(report));
    WindowDesk::settle();
    EXPECT_EQ(wrongWithActive(*desk.frame), QString());
    EXPECT_EQ(activeView(), before->GetViews().front());
}

TEST_F(ReportWindowInFront, WhileItIsWrittenOnlyItsLinesCanBeCopied)
{
    report->UpdateReportInfo(QString(), false, false);
    window.takeFocus();
    for (const unsigned id : {57602U, 57603U, 57604U, 57606U, 57607U, 57608U, 57609U, 33236U, 33237U, 32771U}) {
        EXPECT_FALSE(isCommandEnabled(id)) << id;
    }
    EXPECT_TRUE(isCommandEnabled(57634));
}

TEST_F(ReportWindowInFront, LeavesTheKeyboardToWhatIsLeftInAnyOrder)
{
    const AnsweredBoxes boxes(MessageAnswer::No);
    struct Row
    {
        std::function<void()> act;
        const UReportDoc *active; ///< null: the window
        const char *reason;
    };
    const Row rows[] = {
        {[this] { dockPaneOf(*before).BringToTop(); }, before, "the report above"},
        {[this] { window.takeFocus(); }, nullptr, "the window"},
        {[this] { window.GetDock()->setFloating(true); }, nullptr, "floating"},
        {[this] { QTest::mouseClick(editOf(*before).viewport(), Qt::LeftButton); }, before, "pressed in the other"},
        {[this] { window.takeFocus(); }, nullptr, "back to the floating one"},
        {[this] { dockPaneOf(*before).ShowPane(false); }, nullptr, "the other is hidden"},
        {[this] { window.GetDock()->setFloating(false); }, nullptr, "docked again"},
        {[this] {
             UReportDoc::ShowReportBar(&window, false);
             dockPaneOf(*before).ShowPane(true);
         },
         before, "hidden"},
        {[this] { UReportDoc::ShowReportBar(&window, true); }, nullptr, "shown"},
        {[this] { report->UpdateReportInfo(QStringLiteral("Again"), false, false); }, before,
         "another run: the view that was active gets the keyboard"},
        {[this] { report->SetReportWindowActive(); }, nullptr, "written"},
        {[this] { window.ShowReport(); }, report, "opened in a pane"},
        {[this] { report->UpdateReportInfo(QStringLiteral("Again"), false, false); }, nullptr,
         "another run hides the pane and brings the window back"},
        {[this] { window.OnPressCloseButton(); }, before, "closed"},
    };
    for (const Row &row : rows) {
        row.act();
        WindowDesk::settle();
        EXPECT_EQ(wrongWithActive(*desk.frame), QString()) << row.reason;
        EXPECT_EQ(desk.frame->GetCommandDocument(), row.active != nullptr ? row.active : report) << row.reason;
    }
}

} // namespace
