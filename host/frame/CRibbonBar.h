#pragma once

#include <QHash>

#include <optional>

class UView;

/// Remembers which tab of the frame's bar was in front while a view was used.
class CRibbonBar
{
public:
    /// Remembers the tab of a view, replacing an earlier one. @param index  from 0
    void SetRibbonTabIndexForView(const UView *view, int index) { tabs_.insert(view, index); }
    /// Forgets the tab of a view; nothing for a view that has none.
    void RemoveRibbonTabIndexForView(const UView *view) { tabs_.remove(view); }
    /// Nothing for a view that has none.
    std::optional<int> GetRibbonTabIndexForView(const UView *view) const
    {
        const auto found = tabs_.find(view);
        return found != tabs_.end() ? std::optional(*found) : std::nullopt;
    }

private:
    QHash<const UView *, int> tabs_;
};
