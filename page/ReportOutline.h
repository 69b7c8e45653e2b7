#pragma once

#include <QString>
#include <QStringView>

#include <cstddef>
#include <vector>

namespace kareport
{

/// What a reader goes to by name: a heading, a table or a group.
struct OutlineEntry
{
    int level = 0; ///< it belongs to the last entry before it that has a smaller one
    QString text;  ///< empty for the end of what belongs to an entry of this level
    qint64 at = 0; ///< a character of the line that it begins with, from 0
};

/// The entries of a report's outline, in their order, as its writer recorded them. Edits of the text carry them along; one
/// whose line is taken out goes with it.
class ReportOutline
{
public:
    static constexpr int headingLevel = 0;
    static constexpr int tableLevel = 1;
    static constexpr int firstGroupLevel = 2; ///< groups within groups have greater ones

    /// The entries that something was written for; their places ascend.
    std::vector<OutlineEntry> entries() const
    {
        return {entries_.begin(), entries_.begin() + static_cast<std::ptrdiff_t>(placed_)};
    }
    void clear();
    /// Announces an entry for what is written next. One of its level or a greater one that nothing was written for goes.
    void announce(int level, const QString &text);
    /// Whether there are entries that nothing was written for yet.
    bool isWaiting() const { return placed_ < entries_.size(); }
    /// Places those entries at what is written now. @param at  of its first character. Nothing for text that shows nothing
    void place(qint64 at, QStringView text);
    /// Carries the entries along with an edit of the text.
    /// @param removedText  what is removed; looked at only where `wantsRemoved`
    void carry(qint64 at, qint64 removed, QStringView removedText, QStringView inserted) noexcept;
    bool wantsRemoved(qint64 at, qint64 removed) const;

private:
    std::vector<OutlineEntry> entries_; ///< the places of those that are placed ascend
    std::size_t placed_ = 0;            ///< of them; the others are at the end
};

} // namespace kareport
