#pragma once

#include <memory>

class UView;

namespace kareport
{

/// A view that is to get its place back after something else came to the front. It may be destroyed meanwhile.
class RememberedView
{
public:
    /// @param view  null for none
    explicit RememberedView(const UView *view = nullptr);
    /// The active view of the main frame; none without a frame.
    static RememberedView active();

    /// The view; null once it has been destroyed.
    UView *get() const { return handle_ ? *handle_ : nullptr; }
    /// Brings the view's pane to the front. @return false without a view and for one whose pane is hidden, or that has none
    bool bringToTop() const;
    /// Does that, and makes the view the active one of the main frame.
    void reactivate() const;

private:
    std::shared_ptr<UView *const> handle_;
};

} // namespace kareport
