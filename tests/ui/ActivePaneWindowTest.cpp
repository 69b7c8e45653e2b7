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

/// Lets reports that are printed without a question go into a folder of their own.
class PrivateHome
{
public:
    PrivateHome() { qputenv("HOME", QFile::encodeName(folder.path())); }
    ~PrivateHome() { before_.isNull() ? qunsetenv("HOME") : qputenv("HOME", before_); }
    PrivateHome(const PrivateHome &) = delete;
    PrivateHome &operator=(const PrivateHome &) = delete;

    QTemporaryDir folder;

private:
    QByteArray before_ = qgetenv("HOME");
};

TEST_F(ReportWindowInFront, EveryPrintCommandIsAboutTheReportThatItShows)
{
    struct Row
    {
        unsigned id;
        int prints;
        int previews;
        std::size_t setups;
        const char *name;
    };
    constexpr Row rows[] = {
        {57606, 0, 0, 1, "Page Setup"},       {57607, 1, 0, 0, "Print"},
        {33236, 1, 0, 0, "the host's Print"}, {57608, 0, 0, 0, "Print Direct"},
        {57609, 0, 1, 0, "Print Preview"},    {33237, 0, 1, 0, "the host's Print Preview"},
    };
    const PrivateHome home;
    report->SetMargins(QMargins(1100, 1200, 1300, 1400));
    for (const Row &row : rows) {
        const AnsweredPrinting printing;
        ASSERT_TRUE(isCommandEnabled(row.id)) << row.name;
        desk.frame->OnCommand(row.id);
        EXPECT_EQ(printing.prints, row.prints) << row.name;
        EXPECT_EQ(printing.previews, row.previews) << row.name;
        ASSERT_EQ(printing.setups.size(), row.setups) << row.name;
        if (row.setups > 0) {
            EXPECT_EQ(printing.setups[0].margins, QMargins(1100, 1200, 1300, 1400)) << row.name;
            EXPECT_TRUE(editOf(*report).toPlainText().isEmpty()) << "its text is not loaded for that";
        } else {
            EXPECT_EQ(editOf(*report).toPlainText(), QStringLiteral("  first\nsecond\n")) << row.name;
        }
        EXPECT_EQ(pagesIn(home.folder.filePath(QStringLiteral("Traverse.pdf"))), row.id == 57608 ? 1 : -1) << row.name;
        QFile::remove(home.folder.filePath(QStringLiteral("Traverse.pdf")));
    }
}

TEST_F(ReportWindowInFront, WhatIsShownAlreadyIsNotLoadedAgain)
{
    const PrivateHome home;
    dockPaneOf(*report).ShowPane(true);
    kareport::ReportEdit &edit = editOf(*report);
    QTest::keyClick(&edit, Qt::Key_X);
    const QString typed = QStringLiteral("x  first\nsecond\n");
    ASSERT_EQ(edit.toPlainText(), typed);
    const QTextDocument *shown = edit.document();
    for (const unsigned id : {57607U, 57608U, 57609U, 57606U, 33236U, 33237U}) {
        const AnsweredPrinting printing;
        window.takeFocus();
        ASSERT_EQ(desk.frame->GetActivePane(), &window);
        desk.frame->OnCommand(id);
        EXPECT_EQ(edit.document(), shown) << id;
        EXPECT_TRUE(edit.document()->isUndoAvailable()) << id << ": what was typed can still be undone";
    }
    edit.undo();
    EXPECT_EQ(textOf(*report), written);
}

/// A document of a host that keeps the texts it is given.
class TextReceiver : public UDocument
{
public:
    explicit TextReceiver(std::vector<QString> &texts) : texts_(texts) {}
    bool OnTextReceived(unsigned, const QString &text) override
    {
        QByteArray bytes;
        for (const QChar character : text) {
            bytes.append(static_cast<char>(character.cell())).append(static_cast<char>(character.row()));
        }
        texts_.push_back(QString::fromLatin1(bytes));
        return true;
    }

private:
    std::vector<QString> &texts_;
};

TEST_F(ReportWindowInFront, UpdateTextSendsWhatTheReportHoldsNow)
{
    std::vector<QString> texts;
    UDocTemplate *receivers = desk.application->AddDocTemplate(std::make_unique<UDocTemplate>(
        9, [&texts] { return std::make_unique<TextReceiver>(texts); }, UDocTemplate::PaneFactory(),
        UDocTemplate::ViewFactory(), QStringLiteral("Receivers"), 0, 0));
    UDocument *receiver = receivers->OpenReportDocumentFile(QString(), 0, 0, nullptr, 0, nullptr);
    EXPECT_FALSE(isCommandEnabled(32771)) << "there is no text object";
    report->SetTextObject(receiver, 7);
    const auto sends = [&](const char *text, const char *reason) {
        texts.clear();
        ASSERT_TRUE(isCommandEnabled(32771)) << reason;
        desk.frame->OnCommand(32771);
        ASSERT_EQ(texts.size(), 1U) << reason;
        EXPECT_EQ(texts[0].simplified(), QString::fromUtf8(text)) << reason; // an odd byte at the end is not sent
    };
    sends("first secon", "from its hidden view, loaded for it");
    {
        const AnsweredPrinting printing;
        window.OnPrint();
        EXPECT_EQ(printing.prints, 1);
    }
    ASSERT_EQ(report->GetViews().size(), 2U) << "printing has left a view of its own, which is not seen";
    report->UpdateReportInfo(QStringLiteral("Traverse"), false, false);
    report->Clear();
    report->WriteLine(QStringLiteral("third"), 0, 1, 0);
    report->SetReportWindowActive();
    WindowDesk::settle();
    sends("thir", "after another run: no view has been told of it");
}

TEST_F(ReportWindowInFront, TheReportMayBeClosedWhileItsCloseAsks)
{
    for (const MessageAnswer answer : {MessageAnswer::Yes, MessageAnswer::No, MessageAnswer::Cancel}) {
        UReportDoc *closed = CreateReportWindow(QStringLiteral("Closed"), false, false);
        closed->WriteLine(QStringLiteral("text"), 0, 1, 0);
        closed->SetReportWindowActive();
        WindowDesk::settle();
        AnsweredBoxes boxes(answer);
        const AnsweredSaving saving(folder.filePath(QStringLiteral("a.rep")));
        boxes.meanwhile = [closed] { closed->OnCloseDocument(); };
        desk.frame->OnCommand(57602);
        EXPECT_EQ(boxes.boxes.size(), 1U);
        EXPECT_FALSE(UReportDoc::IsReportAvailable(closed));
        EXPECT_TRUE(saving.requests.empty());
    }
}

TEST_F(ReportWindowInFront, TheReportMayBeClosedWhileItsNameIsAskedFor)
{
    for (const unsigned id : {57603U, 57604U}) {
        UReportDoc *closed = CreateReportWindow(QStringLiteral("Closed"), false, false);
        closed->WriteLine(QStringLiteral("text"), 0, 1, 0);
        closed->SetReportWindowActive();
        WindowDesk::settle();
        const AnsweredBoxes boxes(MessageAnswer::Ok);
        AnsweredSaving saving(folder.filePath(QStringLiteral("a.rep")));
        saving.meanwhile = [closed] { closed->OnCloseDocument(); };
        desk.frame->OnCommand(id);
        EXPECT_EQ(saving.requests.size(), 1U) << id;
        EXPECT_FALSE(UReportDoc::IsReportAvailable(closed)) << id;
        EXPECT_FALSE(QFile::exists(folder.filePath(QStringLiteral("a.rep")))) << id;
        EXPECT_TRUE(boxes.boxes.empty()) << id << ": no word of a save that failed";
    }
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
