#include "RememberedView.h"

#include "FrameFixture.h"
#include "UXTPMDIFrameWnd.h"

#include <gtest/gtest.h>

#include <optional>

namespace
{

using kareport::RememberedView;

class ToppedPane : public RecordingPane
{
public:
    using RecordingPane::RecordingPane;
    void BringToTop() override { ++tops; }
    int tops = 0;
};

TEST(RememberedView, OfNoViewDoesNothing)
{
    const RememberedView none;
    EXPECT_EQ(none.get(), nullptr);
    EXPECT_FALSE(none.bringToTop());
    none.reactivate();
    EXPECT_EQ(RememberedView::active().get(), nullptr) << "there is no frame";
}

TEST(RememberedView, IsForgottenWhenTheViewGoes)
{
    std::optional<UView> view(std::in_place);
    const RememberedView remembered(&*view);
    const RememberedView copy = remembered;
    EXPECT_EQ(remembered.get(), &*view);
    EXPECT_FALSE(remembered.bringToTop()) << "it has no pane";
    view.reset();
    EXPECT_EQ(remembered.get(), nullptr);
    EXPECT_EQ(copy.get(), nullptr);
    view.emplace();
    EXPECT_EQ(remembered.get(), nullptr) << "another view in the same place";
}

TEST(RememberedView, GetsItsPlaceBack)
{
    FrameLog log;
    TextDocument document(log);
    document.SetAutoDelete(false);
    auto *pane = new ToppedPane(log);
    UView *view = addRecordingView(*pane, document);
    EXPECT_FALSE(RememberedView(view).bringToTop()) << "it would not be seen";
    pane->ShowPane(true);
    RememberedView(view).reactivate();
    EXPECT_EQ(pane->tops, 1) << "also without a frame";

    UXTPMDIFrameWnd frame;
    EXPECT_EQ(RememberedView::active().get(), nullptr) << "no view is active";
    frame.SetActiveViewForFrameAndPane(view);
    const RememberedView remembered = RememberedView::active();
    EXPECT_EQ(remembered.get(), view);
    frame.SetActiveViewForFrameAndPane(nullptr);
    EXPECT_TRUE(remembered.bringToTop());
    EXPECT_EQ(pane->tops, 2);
    EXPECT_EQ(frame.GetActiveView(), nullptr) << "in front, not active";
    remembered.reactivate();
    EXPECT_EQ(pane->tops, 3);
    EXPECT_EQ(frame.GetActiveView(), view);
}

} // namespace
