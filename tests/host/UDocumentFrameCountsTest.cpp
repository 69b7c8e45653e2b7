#include "FrameFixture.h"

#include <gtest/gtest.h>

namespace
{

/// A document shown in panes that are called by its title.
class UDocumentFrameCounts
{
public:
    explicit UDocumentFrameCounts(int panes)
    {
        document.SetAutoDelete(false);
        for (int i = 0; i < panes; ++i) {
            openRecordingPane(log, document);
        }
        document.SetTitle(QStringLiteral("T"));
    }
    RecordingPane &pane(std::size_t index) { return static_cast<RecordingPane &>(*log.panes.at(index)); }
    /// Numbers the panes. @return their captions
    QString count()
    {
        document.UpdateFrameCounts();
        return paneCaptions().join(u' ');
    }

    FrameLog log;
    TextDocument document{log};
};

TEST(UDocumentFrameCounts, NoPane)
{
    UDocumentFrameCounts shown(0);
    EXPECT_EQ(shown.count(), QString());
}

TEST(UDocumentFrameCounts, AnOnlyPaneHasNoNumber)
{
    UDocumentFrameCounts shown(1);
    EXPECT_EQ(shown.count(), QStringLiteral("T"));
    EXPECT_EQ(shown.pane(0).GetWindowNumber(), 0);
}

TEST(UDocumentFrameCounts, SeveralPanesCountFromOne)
{
    UDocumentFrameCounts shown(3);
    EXPECT_EQ(shown.count(), QStringLiteral("T:1 T:2 T:3"));
}

TEST(UDocumentFrameCounts, HiddenPanesDoNotCount)
{
    UDocumentFrameCounts shown(3);
    shown.pane(1).ShowPane(false);
    shown.count();
    EXPECT_EQ(shown.pane(0).GetWindowNumber(), 1);
    EXPECT_EQ(shown.pane(2).GetWindowNumber(), 2) << "the hidden one is skipped";
    shown.pane(0).ShowPane(false);
    shown.count();
    EXPECT_EQ(shown.pane(2).GetWindowNumber(), 0) << "the only one that is seen";
    shown.pane(0).ShowPane(true);
    shown.pane(1).ShowPane(true);
    EXPECT_EQ(shown.count(), QStringLiteral("T:1 T:2 T:3")) << "all again";
}

TEST(UDocumentFrameCounts, HiddenFromTheStartHasNoNumber)
{
    UDocumentFrameCounts shown(1);
    addRecordingView(*new RecordingPane(shown.log), shown.document);
    shown.count();
    EXPECT_EQ(shown.pane(0).GetWindowNumber(), 0);
    EXPECT_EQ(shown.pane(1).GetWindowNumber(), 0);
}

TEST(UDocumentFrameCounts, AllPanesHidden)
{
    UDocumentFrameCounts shown(2);
    shown.pane(0).ShowPane(false);
    shown.pane(1).ShowPane(false);
    shown.pane(0).titleUpdates = 0;
    shown.count();
    EXPECT_EQ(shown.pane(0).titleUpdates, 0) << "nothing is shown again";
}

TEST(UDocumentFrameCounts, ClosingAPaneCountsTheRestAgain)
{
    UDocumentFrameCounts shown(3);
    shown.pane(0).ClosePane();
    EXPECT_EQ(paneCaptions().join(u' '), QStringLiteral("T:1 T:2"));
    shown.pane(1).ClosePane();
    EXPECT_EQ(paneCaptions().join(u' '), QStringLiteral("T")) << "the last one loses its number";
}

TEST(UDocumentFrameCounts, SeveralViewsInOnePaneCountOnce)
{
    UDocumentFrameCounts shown(1);
    addRecordingView(shown.pane(0), shown.document);
    EXPECT_EQ(shown.count(), QStringLiteral("T"));
    openRecordingPane(shown.log, shown.document)->SetWindowTextW(QStringLiteral("U"));
    addRecordingView(shown.pane(0), shown.document);
    EXPECT_EQ(shown.count(), QStringLiteral("T:1 U:2")) << "views of the first pane before and after the second";
}

TEST(UDocumentFrameCounts, CountInTheOrderOfTheViews)
{
    FrameLog log;
    TextDocument document(log);
    document.SetAutoDelete(false);
    auto *first = new RecordingPane(log);
    auto *second = new RecordingPane(log);
    first->ShowPane(true);
    second->ShowPane(true);
    addRecordingView(*second, document);
    addRecordingView(*first, document);
    document.UpdateFrameCounts();
    EXPECT_EQ(second->GetWindowNumber(), 1) << "its view came first";
    EXPECT_EQ(first->GetWindowNumber(), 2);
}

TEST(UDocumentFrameCounts, EveryCountedPaneShowsItsTitleAgainOnce)
{
    for (const int panes : {1, 2, 3}) {
        UDocumentFrameCounts shown(panes);
        for (int i = 0; i < panes; ++i) {
            shown.pane(static_cast<std::size_t>(i)).titleUpdates = 0;
        }
        shown.count();
        for (int i = 0; i < panes; ++i) {
            EXPECT_EQ(shown.pane(static_cast<std::size_t>(i)).titleUpdates, 1) << i << " of " << panes;
        }
    }
}

TEST(UDocumentFrameCounts, ViewsWithoutAPaneDoNotCount)
{
    UDocumentFrameCounts shown(1);
    UView withoutPane;
    shown.document.AddView(&withoutPane);
    EXPECT_EQ(shown.count(), QStringLiteral("T"));
}

TEST(UDocumentFrameCounts, OtherDocumentsCountForThemselves)
{
    UDocumentFrameCounts first(2);
    UDocumentFrameCounts second(1);
    EXPECT_EQ(first.count(), QStringLiteral("T:1 T:2 T"));
}

} // namespace
