#include "FindBar.h"
#include "PageBar.h"
#include "PrintFixture.h"
#include "ReportCommandIds.h"
#include "ViewFixture.h"

#include "SaveDialog.h"
#include "UXTPMDIFrameWnd.h"

#include <QClipboard>
#include <QLineEdit>

namespace
{

using kareport::CommandState;

bool isEnabled(const UReportView &view, unsigned id)
{
    CommandState state;
    return view.updateCommand(id, state) && state.enabled;
}

TEST(UReportViewCommands, EveryCommandIsKnownByItsNumber)
{
    ShownReport t(QStringLiteral("a"));
    UReportView &view = t.open();
    for (const unsigned id :
         {57607U, 57609U, 33236U, 57608U, 33237U, 57606U, 57665U, 32771U, 57603U, 57604U, 57634U, 57635U,
          57602U, 57636U, 57637U, 57642U, 57643U, 57644U, 57640U, 33240U, 33241U, 33242U, 33243U, 33244U})
    {
        CommandState state;
        EXPECT_TRUE(view.updateCommand(id, state)) << id;
    }
    CommandState state;
    EXPECT_TRUE(view.updateCommand(61536, state)) << "the close box is only updated here";
    EXPECT_FALSE(view.runCommand(61536));
    EXPECT_FALSE(view.updateCommand(1, state));
    EXPECT_FALSE(view.runCommand(57600)) << "a new report is not made by a view";
}

TEST(UReportViewCommands, PrintCommandsDoWhatTheirNumbersSay)
{
    struct Row
    {
        unsigned id;
        int prints;
        int previews;
        std::size_t setups;
        bool isDirect;
        const char *name;
    };
    constexpr Row rows[] = {
        {57606, 0, 0, 1, false, "Page Setup"},       {57607, 1, 0, 0, false, "Print"},
        {33236, 1, 0, 0, false, "the host's Print"}, {57608, 0, 0, 0, true, "Print Direct"},
        {57609, 0, 1, 0, false, "Print Preview"},    {33237, 0, 1, 0, false, "the host's Print Preview"},
    };
    const QTemporaryDir home;
    const QByteArray homeBefore = qgetenv("HOME");
    qputenv("HOME", QFile::encodeName(home.path()));
    for (const Row &row : rows) {
        const AnsweredPrinting printing;
        ShownReport t(QStringLiteral("a"));
        t.report.SetTitle(QStringLiteral("Directly"));
        EXPECT_TRUE(t.open().runCommand(row.id)) << row.name;
        EXPECT_EQ(printing.prints, row.prints) << row.name;
        EXPECT_EQ(printing.previews, row.previews) << row.name;
        EXPECT_EQ(printing.setups.size(), row.setups) << row.name;
        const QString direct = home.filePath(QStringLiteral("Directly.pdf"));
        EXPECT_EQ(pagesIn(direct), row.isDirect ? 1 : -1) << row.name;
        QFile::remove(direct);
    }
    qputenv("HOME", homeBefore);
}

/// A host's document that counts the texts it is given.
class CountingReceiver : public UDocument
{
public:
    explicit CountingReceiver(int &texts) : texts_(texts) {}
    bool OnTextReceived(unsigned id, const QString &text) override
    {
        texts_ += id == 5 && !text.isEmpty() ? 1 : 0;
        return true;
    }

private:
    int &texts_;
};

TEST(UReportViewCommands, UpdateTextSendsTheTextToItsObject)
{
    int texts = 0;
    UApplication application;
    UDocTemplate *receivers = application.AddDocTemplate(std::make_unique<UDocTemplate>(
        9, [&texts] { return std::make_unique<CountingReceiver>(texts); }, UDocTemplate::PaneFactory(),
        UDocTemplate::ViewFactory(), QStringLiteral("Receivers"), 0, 0));
    UDocument *receiver = receivers->OpenReportDocumentFile(QString(), 0, 0, nullptr, 0, nullptr);
    ShownReport t(QStringLiteral("text"));
    UReportView &view = t.open();
    EXPECT_TRUE(view.runCommand(32771));
    EXPECT_EQ(texts, 0) << "there is none";
    t.report.SetTextObject(receiver, 5);
    EXPECT_TRUE(view.runCommand(32771));
    EXPECT_EQ(texts, 1);
    UReportView().OnSaveReportText(); // a view without a report has nothing to send
    EXPECT_EQ(texts, 1);
}

TEST(UReportViewCommands, UpdateTextIsEnabledWhileTheReportHasATextObject)
{
    ShownReport t(QStringLiteral("a"));
    UReportView &view = t.open();
    EXPECT_FALSE(isEnabled(view, 32771));
    int object = 0;
    t.report.SetTextObject(&object, 5);
    EXPECT_TRUE(isEnabled(view, 32771));
    t.report.SetTextObject(&object, 0);
    EXPECT_FALSE(isEnabled(view, 32771));
    EXPECT_FALSE(isEnabled(UReportView(), 32771)) << "no document";
    for (const unsigned id : {57607U, 33236U, 57608U, 57603U, 57604U, 57634U, 57635U}) {
        EXPECT_TRUE(isEnabled(view, id)) << id << ": always";
        EXPECT_TRUE(isEnabled(UReportView(), id)) << id << ": also without a document";
    }
}

TEST(UReportViewCommands, ClosingIsDisabledWhileAnEditorHoldsTheReport)
{
    ShownReport t(QStringLiteral("a"));
    UReportView &view = t.open();
    for (const unsigned id : {57602U, 61536U}) {
        t.report.EnableCloseOption(true);
        EXPECT_TRUE(isEnabled(view, id)) << id;
        t.report.EnableCloseOption(false);
        EXPECT_FALSE(isEnabled(view, id)) << id;
        EXPECT_TRUE(isEnabled(UReportView(), id)) << id << ": no document";
    }
    EXPECT_TRUE(view.runCommand(57602));
    EXPECT_EQ(t.report.GetViews().size(), 1U) << "what is disabled is not done either";
}

TEST(UReportViewCommands, CloseAsksAndClosesTheReport)
{
    ShownReport t(QStringLiteral("a"));
    auto *pane = new CViewPane;
    auto *view = showIn<UReportView>(*pane, t.report);
    t.report.SetModifiedFlag(true);
    {
        const AnsweredMessages messages(MessageAnswer::Cancel);
        EXPECT_TRUE(view->runCommand(57602));
        EXPECT_EQ(messages.texts.size(), 1);
        EXPECT_EQ(t.report.GetViews().size(), 1U);
    }
    const AnsweredMessages messages(MessageAnswer::No);
    EXPECT_TRUE(view->runCommand(57602));
    EXPECT_TRUE(t.report.GetViews().empty());
}

TEST(UReportViewCommands, EditCommandsActOnTheText)
{
    ShownReport t(QStringLiteral("one two"));
    UReportView &view = t.open();
    EXPECT_FALSE(isEnabled(view, kareport::undoCommand));
    EXPECT_FALSE(isEnabled(view, kareport::redoCommand));
    putCursor(view.GetEdit(), 3, 0);
    EXPECT_TRUE(view.runCommand(kareport::copyCommand));
    EXPECT_EQ(QApplication::clipboard()->text(), QStringLiteral("one"));
    EXPECT_TRUE(view.runCommand(kareport::cutCommand));
    EXPECT_EQ(textOf(t.report), QStringLiteral(" two"));
    EXPECT_TRUE(isEnabled(view, kareport::pasteCommand));
    EXPECT_TRUE(view.runCommand(kareport::pasteCommand));
    EXPECT_EQ(textOf(t.report), QStringLiteral("one two"));
    EXPECT_TRUE(isEnabled(view, kareport::undoCommand));
    EXPECT_TRUE(view.runCommand(kareport::undoCommand));
    EXPECT_EQ(textOf(t.report), QStringLiteral(" two"));
    EXPECT_TRUE(isEnabled(view, kareport::redoCommand));
    EXPECT_TRUE(view.runCommand(kareport::redoCommand));
    EXPECT_EQ(textOf(t.report), QStringLiteral("one two"));
    EXPECT_TRUE(view.runCommand(kareport::selectAllCommand));
    EXPECT_EQ(view.GetEdit().textCursor().selectedText(), QStringLiteral("one two"));
}

TEST(UReportViewCommands, ViewCommandsActOnTheWindow)
{
    ShownReport t(QStringLiteral("one\r\ntwo\r\none"));
    UReportView &view = t.open();
    kareport::ReportViewWidget &widget = widgetOf(view);
    EXPECT_TRUE(view.runCommand(kareport::goToPageCommand));
    EXPECT_TRUE(widget.pageBar().isVisible());
    EXPECT_TRUE(view.runCommand(kareport::findCommand));
    EXPECT_TRUE(widget.findBar().isVisible());
    EXPECT_FALSE(widget.pageBar().isVisible()) << "one bar at a time";
    QTest::keyClicks(&widget.findBar().field(), QStringLiteral("one"));
    EXPECT_TRUE(view.runCommand(kareport::findNextCommand));
    EXPECT_EQ(view.GetEdit().textCursor().selectionStart(), 8);
    EXPECT_TRUE(view.runCommand(kareport::findPreviousCommand));
    EXPECT_EQ(view.GetEdit().textCursor().selectionStart(), 0);
    EXPECT_TRUE(view.runCommand(kareport::zoomInCommand));
    EXPECT_EQ(view.GetEdit().zoomPercent(), 110);
    EXPECT_TRUE(view.runCommand(kareport::zoomOutCommand));
    EXPECT_TRUE(view.runCommand(kareport::zoomOutCommand));
    EXPECT_EQ(view.GetEdit().zoomPercent(), 90);
    EXPECT_TRUE(view.runCommand(kareport::zoomResetCommand));
    EXPECT_EQ(view.GetEdit().zoomPercent(), 100);
}

TEST(UReportViewCommands, SaveAndSaveAsAreTheDocuments)
{
    const QTemporaryDir folder;
    ShownReport t(QStringLiteral("one\r\n"));
    UReportView &view = t.open();
    QStringList asked;
    kareport::setSaveDialog([&](const kareport::SaveRequest &) -> std::optional<QString> {
        asked += folder.filePath(QStringLiteral("%1.rep").arg(asked.size()));
        return asked.last();
    });
    EXPECT_TRUE(view.runCommand(kareport::fileSaveAsCommand));
    ASSERT_EQ(asked.size(), 1);
    EXPECT_TRUE(QFile::exists(asked[0]));
    QTest::keyClick(&view.GetEdit(), Qt::Key_X);
    EXPECT_TRUE(view.runCommand(kareport::fileSaveCommand));
    EXPECT_EQ(asked.size(), 1) << "it has a name by now";
    EXPECT_NE(contentOf(asked[0]).find("xone"), std::string::npos);
    EXPECT_FALSE(t.report.IsModified());
    kareport::setSaveDialog({});
}

/// A frame that takes note of being closed.
class ClosingFrame : public UXTPMDIFrameWnd
{
public:
    int closed = 0;

protected:
    void closeEvent(QCloseEvent *) override { ++closed; }
};

TEST(UReportViewCommands, ExitClosesTheWholeApplication)
{
    ClosingFrame frame;
    ShownReport t(QStringLiteral("a"));
    UReportView &view = t.open();
    EXPECT_TRUE(view.runCommand(57665));
    EXPECT_EQ(frame.closed, 1);
    t.report.CloseReportDocument();
    EXPECT_TRUE(t.report.GetViews().empty()) << "without a report window, closing was not deferred";
}

TEST(UReportViewCommands, ExitDefersTheClosingOfAReportWithAWindow)
{
    ClosingFrame frame;
    ShownReport t(QStringLiteral("a"));
    UReportView &view = t.open();
    t.report.SetReportWindow(new TestReportWindow); // destroyed with the report
    EXPECT_TRUE(view.runCommand(57665));
    EXPECT_EQ(frame.closed, 1);
    t.report.CloseReportDocument();
    EXPECT_EQ(t.report.GetViews().size(), 1U) << "the next one closes";
}

TEST(UReportViewCommands, AWindowThatHasGoneHasNoCommands)
{
    UReportView view;
    delete view.GetWidget();
    EXPECT_TRUE(view.commands().empty());
}

} // namespace
