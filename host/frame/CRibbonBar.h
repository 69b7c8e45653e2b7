#pragma once

#include "KaReportExport.h"

#include <QHash>

#include <optional>

class UView;

/// Remembers which tab of the frame's bar was in front while a view was used.
class KAREPORT_EXPORT CRibbonBar
{
public:
    void SetRibbonTabIndexForView(const UView *view, int index) { tabs_.insert(view, index); }
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
