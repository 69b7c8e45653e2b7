#include "FrameFixture.h"

#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

TEST(UDocument, IsUntitledWithoutAFileAtFirst)
{
    FrameLog log;
    const TextDocument document(log);
    EXPECT_EQ(document.GetTitle(), QString());
    EXPECT_EQ(document.GetPathName(), QString());
    EXPECT_FALSE(document.IsModified());
    EXPECT_TRUE(document.GetViews().empty());
    EXPECT_TRUE(document.IsAutoDelete());
    EXPECT_EQ(document.GetDocTemplate(), nullptr);
    EXPECT_FALSE(document.IsSearchAndOrganizeHandler());
}

TEST(UDocument, ShowsItsTitleOnEveryPane)
{
    FrameLog log;
    TextDocument document(log);
    document.SetAutoDelete(false);
    auto *first = openRecordingPane(log, document);
    auto *second = openRecordingPane(log, document);
    second->ShowPane(false);
    UView withoutPane;
    document.AddView(&withoutPane);
    TextDocument other(log);
    other.SetAutoDelete(false);
    auto *otherPane = openRecordingPane(log, other);

    document.SetTitle(QStringLiteral("Traverse 測量"));
    EXPECT_EQ(document.GetTitle(), QStringLiteral("Traverse 測量"));
    EXPECT_EQ(first->GetWindowTextW(), QStringLiteral("Traverse 測量"));
    EXPECT_EQ(second->GetWindowTextW(), QStringLiteral("Traverse 測量")) << "a hidden pane as well";
    EXPECT_EQ(otherPane->GetWindowTextW(), QString()) << "another document's pane stays";
    EXPECT_EQ(document.GetPathName(), QString()) << "a title is not a file";
}

TEST(UDocument, TakesItsTitleFromItsFile)
{
    struct Row
    {
        QStringView path;
        QStringView title;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"/jobs/a.rep", u"a.rep", "the name without its folder"},
        {u"a.rep", u"a.rep", "no folder"},
        {u"/jobs/site 1/b é 測.x.rep", u"b é 測.x.rep", "blanks, points and characters beyond ASCII"},
        {u"/jobs/none", u"none", "no ending"},
        {u"", u"", "no file"},
    };
    for (const Row &row : rows) {
        FrameLog log;
        TextDocument document(log);
        document.SetAutoDelete(false);
        const auto *pane = openRecordingPane(log, document);
        document.SetPathName(row.path.toString(), true);
        EXPECT_EQ(document.GetPathName(), row.path.toString()) << row.reason;
        EXPECT_EQ(document.GetTitle(), row.title.toString()) << row.reason;
        EXPECT_EQ(pane->GetWindowTextW(), row.title.toString()) << row.reason;
    }
}

TEST(UDocument, ItsFileIsAmongThoseLastUsedWhenWanted)
{
    FrameLog log;
    TextDocument document(log);
    document.SetPathName(QStringLiteral("/jobs/a.rep"), true);
    EXPECT_EQ(document.GetPathName(), QStringLiteral("/jobs/a.rep")) << "without an application as well";
    const UApplication application;
    document.SetPathName(QStringLiteral("/jobs/b.rep"), false);
    EXPECT_EQ(application.GetRecentFileList(), QStringList());
    document.SetPathName(QStringLiteral("/jobs/c.rep"), true);
    EXPECT_EQ(application.GetRecentFileList(), QStringList{QStringLiteral("/jobs/c.rep")});
}

TEST(UDocument, UpdatesEveryViewButTheSender)
{
    FrameLog log;
    TextDocument document(log);
    document.SetAutoDelete(false);
    document.UpdateAllViews(nullptr);
    auto *first = viewOf(openRecordingPane(log, document));
    auto *second = viewOf(openRecordingPane(log, document));
    auto *third = addRecordingView(*log.panes[1], document);
    int object = 0;

    document.UpdateAllViews(second, 42, &object);
    const std::vector<RecordingView::Update> once = {{second, 42, &object}};
    EXPECT_EQ(first->updates, once);
    EXPECT_TRUE(second->updates.empty()) << "the sender knows already";
    EXPECT_EQ(third->updates, once) << "a second view in the same pane";

    document.UpdateAllViews(nullptr);
    const RecordingView::Update usual{nullptr, 0, nullptr};
    EXPECT_EQ(first->updates.size(), 2U);
    ASSERT_EQ(second->updates.size(), 1U) << "no sender: every view";
    EXPECT_EQ(second->updates[0], usual);
}

/// A view that closes panes when it is updated.
class ClosingView : public UView
{
public:
    void OnUpdate(UView *, long, void *) override
    {
        for (CViewPane *pane : closes) {
            pane->ClosePane();
        }
        closes.clear();
    }

    std::vector<CViewPane *> closes;
};

TEST(UDocument, AViewMayCloseAnotherOneWhileItIsUpdated)
{
    FrameLog log;
    TextDocument document(log);
    document.SetAutoDelete(false);
    auto *closingPane = new RecordingPane(log);
    auto closing = std::make_unique<ClosingView>();
    ClosingView *view = closing.get();
    closingPane->AddView(std::move(closing));
    document.AddView(view);
    auto *closed = openRecordingPane(log, document);
    auto *last = viewOf(openRecordingPane(log, document));
    view->closes = {closed};
    document.UpdateAllViews(nullptr);
    EXPECT_EQ(log.panes.size(), 2U);
    EXPECT_EQ(last->updates.size(), 1U) << "those after it are updated";
    EXPECT_EQ(document.GetViews().size(), 2U);
}

TEST(UDocument, KnowsItsViewsInTheOrderInWhichTheyCame)
{
    FrameLog log;
    TextDocument document(log);
    auto second = std::make_unique<UView>();
    {
        UView first;
        document.AddView(&first);
        document.AddView(second.get());
        EXPECT_EQ(document.GetViews(), (std::vector<UView *>{&first, second.get()}));
        EXPECT_EQ(first.GetDocument(), &document);
    }
    EXPECT_EQ(document.GetViews(), (std::vector<UView *>{second.get()})) << "the first has gone";
    document.SetAutoDelete(false);
    document.RemoveView(second.get());
    EXPECT_TRUE(document.GetViews().empty());
    EXPECT_EQ(second->GetDocument(), nullptr) << "a view that is taken off lives on without a document";
}

TEST(UView, IsUpdatedOnceAtFirst)
{
    RecordingView view;
    view.OnInitialUpdate();
    EXPECT_EQ(view.updates, (std::vector<RecordingView::Update>{{nullptr, 0, nullptr}}));
    EXPECT_EQ(view.GetDocument(), nullptr);
    EXPECT_EQ(view.GetParentPane(), nullptr);
}

TEST(UDocument, ClosesWithItsLastPane)
{
    FrameLog log;
    auto *document = new TextDocument(log);
    auto *first = openRecordingPane(log, *document);
    auto *second = openRecordingPane(log, *document);
    addRecordingView(*second, *document);
    document->content = "content";
    first->ClosePane();
    EXPECT_EQ(log.documents, 1) << "another pane shows it";
    EXPECT_EQ(document->content, "content");
    second->ClosePane();
    EXPECT_EQ(log.documents, 0) << "both views of the last pane have gone";
    EXPECT_TRUE(log.panes.empty());
    EXPECT_EQ(log.events, QStringList{QStringLiteral("close")}) << "once";
}

TEST(UDocument, StaysWithoutPanesWhenAutoDeleteIsOff)
{
    FrameLog log;
    TextDocument document(log);
    document.SetAutoDelete(false);
    document.content = "content";
    openRecordingPane(log, document)->ClosePane();
    EXPECT_EQ(log.documents, 1);
    EXPECT_EQ(document.content, "content") << "it is not closed";
    EXPECT_EQ(log.events, QStringList());
    openRecordingPane(log, document);
    EXPECT_EQ(document.GetViews().size(), 1U) << "and can be shown again";
}

TEST(UDocument, ClosingItClosesItsPanes)
{
    FrameLog log;
    auto *document = new TextDocument(log);
    openRecordingPane(log, *document);
    openRecordingPane(log, *document)->ShowPane(false);
    auto *withoutPane = new UView;
    document->AddView(withoutPane);
    document->SetModifiedFlag();
    document->OnCloseDocument();
    EXPECT_TRUE(log.panes.empty());
    EXPECT_EQ(log.documents, 0);
    EXPECT_EQ(log.events, QStringList{QStringLiteral("close")});
    EXPECT_EQ(withoutPane->GetDocument(), nullptr) << "a view without a pane stays without a document";
    delete withoutPane;
}

TEST(UDocument, ClosingItWithAutoDeleteOffEmptiesIt)
{
    FrameLog log;
    TextDocument document(log);
    document.SetAutoDelete(false);
    document.content = "content";
    openRecordingPane(log, document);
    document.OnCloseDocument();
    EXPECT_TRUE(log.panes.empty());
    EXPECT_EQ(log.documents, 1);
    EXPECT_EQ(document.content, "");
    EXPECT_FALSE(document.IsAutoDelete()) << "still off";
    EXPECT_EQ(log.events, QStringList{QStringLiteral("close")});
}

TEST(UDocument, ItsPanesCanBeClosedWithoutIt)
{
    FrameLog log;
    auto document = std::make_unique<TextDocument>(log);
    document->content = "content";
    openRecordingPane(log, *document);
    openRecordingPane(log, *document);
    document->CloseAllPanes();
    EXPECT_TRUE(log.panes.empty());
    EXPECT_TRUE(document->GetViews().empty());
    EXPECT_EQ(document->content, "content");
    EXPECT_EQ(log.events, QStringList());
    EXPECT_TRUE(document->IsAutoDelete()) << "on again";
}

TEST(UDocument, HasNoObjectsThatTextCanBeWrittenForUnlessItSaysSo)
{
    FrameLog log;
    TextDocument document(log);
    document.content = "content";
    for (const unsigned id : {0U, 1U, 0xFFFFFFFFU}) {
        EXPECT_FALSE(document.OnTextReceived(id, QStringLiteral("text"))) << id;
    }
    EXPECT_EQ(document.content, "content");
    EXPECT_FALSE(document.IsModified());
    EXPECT_EQ(log.events, QStringList());
}

TEST(UDocument, ThatGoesLeavesItsViewsWithoutADocument)
{
    FrameLog log;
    auto document = std::make_unique<TextDocument>(log);
    const auto *pane = openRecordingPane(log, *document);
    document.reset();
    EXPECT_EQ(viewOf(pane)->GetDocument(), nullptr);
    EXPECT_EQ(pane->GetActiveDocument(), nullptr);
}

} // namespace
