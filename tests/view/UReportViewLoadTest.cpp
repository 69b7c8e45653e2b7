#include "ViewFixture.h"

#include "FindBar.h"
#include "TestSize.h"
#include "UApplication.h"

#include <QClipboard>
#include <QLabel>
#include <QLineEdit>
#include <QScrollBar>
#include <QTemporaryDir>

#include <limits>
#include <memory>
#include <utility>

namespace
{

/// Lines of several pieces, however fast they are loaded.
int lineCount()
{
    return testSize(24'000, 60'000);
}

QString longText(int lines = lineCount())
{
    QString text;
    for (int line = 0; line < lines; ++line) {
        text += QStringLiteral("line %1 of a long report\r\n").arg(line);
    }
    return text;
}

/// A long report, and a view that loads it in pieces.
class LongReport
{
public:
    explicit LongReport(int lines = lineCount()) : shown(longText(lines))
    {
        auto *pane = new CViewPane;
        view = showIn<UReportView>(*pane, shown.report);
        view->SetLoadsInPieces(true);
        view->OnInitialUpdate();
        view->GetWidget()->resize(640, 400);
        view->GetWidget()->show();
        pane_ = pane;
    }
    ~LongReport() { pane_->ClosePane(); }
    LongReport(const LongReport &) = delete;
    LongReport &operator=(const LongReport &) = delete;

    kareport::ReportEdit &edit() const { return view->GetEdit(); }
    bool isWhole() const { return !edit().isLoading() && edit().document()->blockCount() == lineCount() + 1; }

    ShownReport shown;
    UReportView *view;

private:
    CViewPane *pane_;
};

TEST(UReportViewLoad, ShowsTheBeginningAtOnceAndTheRestFromTheEventLoop)
{
    LongReport report;
    EXPECT_TRUE(report.edit().isLoading());
    EXPECT_GT(report.edit().document()->blockCount(), 100) << "more than a window shows";
    EXPECT_LT(report.edit().document()->blockCount(), lineCount());
    EXPECT_TRUE(widgetOf(*report.view).loadLabel().text().contains(u'%'));
    ASSERT_TRUE(waitUntil([&] { return !report.edit().isLoading(); }));
    EXPECT_EQ(report.edit().windowText(), longText());
    EXPECT_FALSE(report.shown.report.IsModified());
    EXPECT_EQ(widgetOf(*report.view).loadLabel().text(), QString());
}

TEST(UReportViewLoad, TheWindowFollowsNowAndThenAndAtTheEnd)
{
    constexpr int lines = 60'000; // of several pieces
    LongReport report(lines);
    report.edit().setFollowInterval(std::numeric_limits<qint64>::max()); // longer than the loading takes
    int told = 0;
    QObject::connect(report.edit().verticalScrollBar(), &QScrollBar::rangeChanged, &report.edit(), [&told] { ++told; });
    const QString place = widgetOf(*report.view).pageLabel().text();
    int pieces = 0;
    QObject::connect(report.edit().document(), &QTextDocument::contentsChange, &report.edit(), [&pieces] { ++pieces; });
    ASSERT_TRUE(waitUntil([&] { return !report.edit().isLoading(); }));
    EXPECT_GT(pieces, 2);
    EXPECT_GE(told, 1);
    EXPECT_LE(told, 2) << "painting the window for each piece takes longer than the piece";
    EXPECT_GT(report.edit().verticalScrollBar()->maximum(), lines - 1000);
    const kareport::ReportViewWidget &widget = widgetOf(*report.view);
    EXPECT_TRUE(waitUntil([&widget] {
        return widget.pageLabel().text() == QStringLiteral("Page 1 of %1").arg(widget.pageCount());
    })) << widget.pageLabel().text().toStdString();
    EXPECT_NE(widget.pageLabel().text(), place);
}

TEST(UReportViewLoad, TakesNoEditUntilAllOfItIsThere)
{
    LongReport report;
    QTest::keyClicks(&report.edit(), QStringLiteral("x"));
    QApplication::clipboard()->setText(QStringLiteral("pasted"));
    report.edit().paste();
    report.edit().cut();
    report.edit().undo();
    EXPECT_EQ(report.shown.lines().size(), longText().size() - lineCount());
    EXPECT_FALSE(report.shown.report.IsModified());
    ASSERT_TRUE(waitUntil([&] { return !report.edit().isLoading(); }));
    EXPECT_FALSE(report.edit().document()->isUndoAvailable()) << "loading is not an edit";
    QTest::keyClicks(&report.edit(), QStringLiteral("x"));
    EXPECT_TRUE(report.shown.report.IsModified());
    EXPECT_TRUE(report.shown.lines().startsWith(QStringLiteral("xline 0")));
    report.edit().undo();
    EXPECT_TRUE(report.shown.lines().startsWith(QStringLiteral("line 0")));
}

TEST(UReportViewLoad, IsFinishedByWhatNeedsTheWholeText)
{
    struct Row
    {
        void (*act)(LongReport &report);
        const char *reason;
    };
    const Row rows[] = {
        {[](LongReport &report) { report.view->UpdateData(true); }, "loading from the document"},
        {[](LongReport &report) { report.view->UpdateData(false); }, "loading into the document"},
        {[](LongReport &report) { report.view->OnChange(); }, "taking over the text"},
        {[](LongReport &report) {
             QBuffer device;
             device.open(QIODevice::WriteOnly);
             report.view->streamRichText(device);
         },
         "saving as rich text"},
        {[](LongReport &report) {
             QBuffer device;
             device.open(QIODevice::WriteOnly);
             report.view->streamPlainText(device);
         },
         "handing the edited text back"},
        {[](LongReport &report) {
             kareport::PrintInfo info;
             info.preview = true;
             report.view->OnPreparePrinting(info);
         },
         "printing"},
        {[](LongReport &report) {
             const QTemporaryDir folder;
             EXPECT_TRUE(report.shown.report.OnSaveDocument(folder.filePath(QStringLiteral("a.rep"))));
         },
         "saving as a report file"},
        {[](LongReport &report) {
             const QTemporaryDir folder;
             report.shown.report.SetPageSize();
             EXPECT_TRUE(report.shown.report.OnSaveDocument(folder.filePath(QStringLiteral("a.pdf"))));
         },
         "saving as a PDF"},
        {[](LongReport &report) {
             widgetOf(*report.view).openFindBar();
             QTest::keyClicks(&widgetOf(*report.view).findBar().field(), QString::number(lineCount() - 1));
         },
         "finding a text"},
        {[](LongReport &report) { widgetOf(*report.view).openPageBar(); }, "asking for a page"},
        {[](LongReport &report) { widgetOf(*report.view).goToPage(lineCount() / 75); }, "going to a page"},
        {[](LongReport &report) { report.edit().selectAll(); }, "selecting all"},
        {[](LongReport &report) { QTest::keyClick(&report.edit(), Qt::Key_End, Qt::ControlModifier); },
         "going to the end"},
    };
    for (const Row &row : rows) {
        LongReport report;
        ASSERT_TRUE(report.edit().isLoading()) << row.reason;
        row.act(report);
        EXPECT_TRUE(report.isWhole()) << row.reason;
        EXPECT_EQ(report.shown.report.GetTextLength(), longText().size()) << row.reason;
    }
}

/// Keeps the text that it is sent.
class Receiver : public UDocument
{
public:
    explicit Receiver(QString &received) : received_(received) {}
    bool OnTextReceived(unsigned /*id*/, const QString &text) override
    {
        received_ = text;
        return true;
    }

private:
    QString &received_;
};

TEST(UReportViewLoad, TheTextThatGoesBackToItsObjectIsWhole)
{
    QString received;
    UApplication application;
    UDocTemplate *receivers = application.AddDocTemplate(std::make_unique<UDocTemplate>(
        9, [&received] { return std::make_unique<Receiver>(received); }, UDocTemplate::PaneFactory(),
        UDocTemplate::ViewFactory(), QStringLiteral("Receivers"), 0, 0));
    UDocument *receiver = receivers->OpenReportDocumentFile(QString(), 0, 0, nullptr, 0, nullptr);
    LongReport report;
    ASSERT_TRUE(report.edit().isLoading());
    report.shown.report.SetTextObject(receiver, 7);
    report.shown.report.SaveText();
    EXPECT_TRUE(report.isWhole());
    // Two bytes of the view are one character there.
    EXPECT_GT(received.size(), longText().size() / 2 - 2 * lineCount());
    const QString whole = std::exchange(received, QString());
    report.shown.report.SaveText();
    EXPECT_TRUE(received == whole) << "as it is sent when all of it is shown";
}

TEST(UReportViewLoad, BeginsAnewWhenTheTextIsAnother)
{
    LongReport report;
    report.shown.report.ReplaceText(0, 4, u"LINE");
    report.shown.report.UpdateAllViews(nullptr);
    ASSERT_TRUE(waitUntil([&] { return !report.edit().isLoading(); }));
    EXPECT_TRUE(report.edit().windowText().startsWith(QStringLiteral("LINE 0")));
    EXPECT_EQ(report.edit().windowText(), report.shown.report.CopyText());
}

TEST(UReportViewLoad, FollowsWhatIsTypedInAnotherViewMeanwhile)
{
    LongReport report;
    UReportView &other = report.shown.open(); // which loads all at once
    ASSERT_TRUE(report.edit().isLoading());
    QTest::keyClicks(&other.GetEdit(), QStringLiteral("xy"));
    ASSERT_TRUE(waitUntil([&] { return !report.edit().isLoading(); }));
    EXPECT_TRUE(report.edit().windowText().startsWith(QStringLiteral("xyline 0")));
    EXPECT_EQ(report.edit().windowText(), report.shown.report.CopyText());
    QTest::keyClick(&report.edit(), Qt::Key_Delete);
    EXPECT_TRUE(other.GetEdit().windowText() == report.shown.report.CopyText());
}

TEST(UReportViewLoad, ChangedWithoutNoticeShowsTheChange)
{
    LongReport report;
    report.shown.report.ReplaceText(longText().size(), 0, u"last words"); // by a host that does not tell the views
    ASSERT_TRUE(waitUntil([&] { return !report.edit().isLoading(); }));
    EXPECT_TRUE(report.edit().windowText().endsWith(QStringLiteral("last words")));
}

TEST(UReportViewLoad, ThatIsFinishedAfterASilentChangeHandsNoPartOfTheTextOn)
{
    struct Row
    {
        void (*act)(UReportView &view);
        const char *reason;
    };
    const Row rows[] = {
        {[](UReportView &view) { view.UpdateData(false); }, "loading into the document"},
        {[](UReportView &view) { view.OnChange(); }, "taking over the text"},
        {[](UReportView &view) { widgetOf(view).openPageBar(); }, "asking for a page"},
        {[](UReportView &view) { QTest::keyClick(&view.GetEdit(), Qt::Key_End, Qt::ControlModifier); },
         "going to the end"},
    };
    for (const Row &row : rows) {
        LongReport report;
        report.shown.report.ReplaceText(0, 4, u"LINE"); // by a host that does not tell the views
        row.act(*report.view);
        EXPECT_FALSE(report.edit().isLoading()) << row.reason;
        EXPECT_EQ(report.shown.report.GetTextLength(), longText().size()) << row.reason;
        EXPECT_EQ(report.edit().windowText(), report.shown.report.CopyText()) << row.reason;
    }
}

TEST(UReportViewLoad, KeepsTheUsersCursorAndSelectionWhereTheyAre)
{
    LongReport report;
    const int end = report.edit().document()->characterCount() - 1;
    putCursor(report.edit(), end, end - 10);
    ASSERT_TRUE(waitUntil([&] { return !report.edit().isLoading(); }));
    EXPECT_EQ(report.edit().textCursor().position(), end);
    EXPECT_EQ(report.edit().textCursor().anchor(), end - 10);
}

TEST(UReportViewLoad, KeepsThePlaceWhereTheWindowWas)
{
    LongReport report;
    report.edit().finishLoading();
    const int cursor = lineCount() * 10;
    const int top = lineCount() / 2;
    putCursor(report.edit(), cursor);
    report.edit().verticalScrollBar()->setValue(top);
    report.shown.report.UpdateAllViews(nullptr); // twice, as some commands do
    report.shown.report.UpdateAllViews(nullptr);
    ASSERT_TRUE(waitUntil([&] { return !report.edit().isLoading(); }));
    EXPECT_EQ(report.edit().textCursor().position(), cursor);
    EXPECT_EQ(report.edit().verticalScrollBar()->value(), top);
}

TEST(UReportViewLoad, GoesWithAViewThatIsClosedMeanwhile)
{
    {
        LongReport report;
        ASSERT_TRUE(report.edit().isLoading());
    }
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

TEST(UReportViewLoad, ShortTextsAndHostsThatDoNotAskForItLoadAtOnce)
{
    ShownReport shortText(QStringLiteral("one line\r\n"));
    UReportView &view = shortText.open();
    view.SetLoadsInPieces(true);
    view.OnUpdate(nullptr, 0, nullptr);
    EXPECT_FALSE(view.GetEdit().isLoading());
    ShownReport longer(longText());
    EXPECT_FALSE(longer.open().GetEdit().isLoading());
}

} // namespace
