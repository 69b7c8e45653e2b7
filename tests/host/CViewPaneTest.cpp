#include "FrameFixture.h"

#include <gtest/gtest.h>

namespace
{

TEST(CViewPane, CarriesItsTitleAndNumberOnItsCaption)
{
    FrameLog log;
    auto *pane = new RecordingPane(log);
    EXPECT_EQ(pane->GetCaption(), QString()) << "empty at first";
    EXPECT_EQ(pane->GetWindowNumber(), 0);
    pane->SetWindowTextW(QStringLiteral("Traverse"));
    EXPECT_EQ(pane->titleUpdates, 1) << "shown again";
    struct Row
    {
        int number;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, u"Traverse", "an only pane"},
        {1, u"Traverse:1", "the first of several"},
        {12, u"Traverse:12", "two digits"},
        {-1, u"Traverse", "while panes are being counted"},
    };
    for (const Row &row : rows) {
        pane->SetWindowNumber(row.number);
        EXPECT_EQ(pane->GetWindowNumber(), row.number);
        EXPECT_EQ(pane->GetCaption(), row.expected.toString()) << row.reason;
        EXPECT_EQ(pane->GetWindowTextW(), QStringLiteral("Traverse")) << "the title is without its number";
    }
    pane->SetWindowNumber(2);
    pane->SetWindowTextW(QString());
    EXPECT_EQ(pane->GetCaption(), QStringLiteral(":2")) << "no title";
}

TEST(CViewPane, CaptionsOfOpenPanesComeInTheOrderOfOpening)
{
    FrameLog log;
    QStringList captions{QStringLiteral("left over")};
    CViewPane::GetPaneCaptions(captions);
    EXPECT_EQ(captions, QStringList()) << "none open; what the list held goes";

    auto *first = new RecordingPane(log);
    auto *second = new RecordingPane(log);
    auto *third = new RecordingPane(log);
    first->SetWindowTextW(QStringLiteral("b"));
    second->SetWindowTextW(QStringLiteral("a"));
    third->SetWindowTextW(QStringLiteral("b"));
    third->SetWindowNumber(2);
    EXPECT_EQ(paneCaptions(), (QStringList{QStringLiteral("b"), QStringLiteral("a"), QStringLiteral("b:2")}))
        << "hidden panes are open as well, and two may have the same title";
    first->ClosePane();
    EXPECT_EQ(paneCaptions(), (QStringList{QStringLiteral("a"), QStringLiteral("b:2")}));
    {
        CViewPane pane;
        pane.SetWindowTextW(QStringLiteral("c"));
        EXPECT_EQ(paneCaptions().size(), 3);
    }
    EXPECT_EQ(paneCaptions().size(), 2) << "one that goes without being closed";
    second->ClosePane();
    third->ClosePane();
    EXPECT_EQ(paneCaptions(), QStringList());
}

TEST(CViewPane, OwnsItsViews)
{
    FrameLog log;
    TextDocument document(log);
    document.SetAutoDelete(false);
    auto *pane = new RecordingPane(log);
    EXPECT_TRUE(pane->GetViews().empty());
    EXPECT_EQ(pane->GetActiveDocument(), nullptr) << "no view";

    const RecordingView *first = addRecordingView(*pane, document);
    const RecordingView *second = addRecordingView(*pane, document);
    EXPECT_EQ(pane->GetViews().size(), 2U);
    EXPECT_EQ(first->GetParentPane(), pane);
    EXPECT_EQ(first->GetDocument(), &document);
    EXPECT_EQ(document.GetViews(), (std::vector<UView *>{viewOf(pane, 0), viewOf(pane, 1)}));
    EXPECT_EQ(viewOf(pane, 1), second);
    EXPECT_EQ(pane->GetActiveDocument(), &document);

    pane->ClosePane();
    EXPECT_TRUE(log.panes.empty()) << "the pane goes with its views";
    EXPECT_TRUE(document.GetViews().empty());
}

TEST(CViewPane, ActiveDocumentIsThatOfTheViewThatIsShown)
{
    FrameLog log;
    TextDocument first(log);
    TextDocument second(log);
    first.SetAutoDelete(false);
    second.SetAutoDelete(false);
    auto *pane = new RecordingPane(log);
    addRecordingView(*pane, first);
    addRecordingView(*pane, second);
    EXPECT_EQ(pane->GetActiveDocument(), &second) << "the view that came last took the place of the other";
    pane->RemoveView(second.GetViews().front());
    EXPECT_EQ(pane->GetActiveDocument(), &first);
}

TEST(CViewPane, ShowsAndHides)
{
    FrameLog log;
    TextDocument document(log);
    document.SetAutoDelete(false);
    auto *pane = new RecordingPane(log);
    const RecordingView *view = addRecordingView(*pane, document);
    EXPECT_FALSE(pane->IsVisible()) << "hidden at first";
    EXPECT_FALSE(view->IsVisible());
    pane->ShowPane(true);
    EXPECT_TRUE(pane->IsVisible());
    EXPECT_TRUE(view->IsVisible());
    pane->ShowPane(false);
    EXPECT_FALSE(pane->IsVisible());
    EXPECT_FALSE(view->IsVisible());
    EXPECT_FALSE(RecordingView().IsVisible()) << "a view without a pane";
}

TEST(CViewPane, AsksItsDocumentWhetherItMayBeClosed)
{
    FrameLog log;
    auto *empty = new RecordingPane(log);
    EXPECT_TRUE(empty->CanClosePane()) << "nothing to ask";

    TextDocument document(log);
    document.SetAutoDelete(false);
    auto *pane = openRecordingPane(log, document);
    EXPECT_TRUE(pane->CanClosePane()) << "not modified";
    document.SetModifiedFlag();
    {
        const AnsweredMessages messages(MessageAnswer::Cancel);
        EXPECT_FALSE(pane->CanClosePane());
        EXPECT_EQ(messages.texts.size(), 1);
    }
    const AnsweredMessages messages(MessageAnswer::No);
    EXPECT_TRUE(pane->CanClosePane());
    EXPECT_EQ(log.panes.size(), 2U) << "asking closes nothing";
}

TEST(CViewPane, ClosesWithoutAsking)
{
    FrameLog log;
    auto *document = new TextDocument(log);
    document->SetModifiedFlag();
    const AnsweredMessages messages(MessageAnswer::Cancel);
    openRecordingPane(log, *document)->ClosePane();
    EXPECT_TRUE(messages.texts.isEmpty());
    EXPECT_TRUE(log.panes.empty());
    EXPECT_EQ(log.documents, 0) << "the document has lost its last view";
}

} // namespace
