#pragma once

#include "KaReportExport.h"

#include <QStringView>

#include <cstddef>
#include <optional>
#include <vector>

namespace kareport
{

/// Where the pages of a report begin, as its writer recorded them: places in its text, counted in characters from 0.
///
/// Edits of the text carry them along. A place that no longer stands at the beginning of a line stays, so that it counts
/// again when the line end comes back; `reportPages` passes it over.
class KAREPORT_EXPORT PageStarts
{
public:
    /// In ascending order, each once.
    const std::vector<qint64> &positions() const { return positions_; }

    void clear();
    /// Replaces all of them; negative ones and doubles are left out.
    void assign(std::vector<qint64> positions);
    /// Begins a page at the end of the text.
    void add(qint64 at);

    /// Carries the starts along with an edit of the text, in two steps: `prepare` needs memory and is called before the
    /// text changes, `carryOut` cannot fail.
    ///
    /// A start whose text before it is removed stays with its page. An inserted piece brings pages along where page
    /// headers stand in it, or where it is the very piece that was removed together with them. Text put in at a page's
    /// start belongs to the page before when it ends with a line end, else to the page.
    struct Edit;
    /// Whether `prepare` wants to see what is removed.
    bool wantsRemoved(qint64 at, qint64 removed, qint64 inserted) const;
    /// @param removedText  what is removed; empty where `wantsRemoved` says no
    Edit prepare(qint64 at, qint64 removed, QStringView removedText, QStringView inserted);
    void carryOut(Edit &&edit) noexcept;

private:
    /// A piece that was removed with the starts at it: an undo puts the very same piece in again.
    struct Piece
    {
        qint64 at = 0;
        qint64 length = 0;
        std::size_t hash = 0;
        std::size_t otherHash = 0;
        std::vector<qint64> offsets; ///< of the starts, from 0 to the length

        static Piece of(qint64 at, QStringView text);
        bool holdsSame(const Piece &other) const;
        bool bringsPages() const;
    };

public:
    struct Edit
    {
        std::size_t first = 0; ///< the starts from here
        std::size_t last = 0;  ///< to before here become those of `middle`
        std::vector<qint64> middle;
        qint64 at = 0;
        qint64 removed = 0;
        qint64 growth = 0;
        std::optional<std::size_t> undone; ///< the piece that comes back to its place
        std::optional<Piece> removedPiece;
    };

private:
    std::vector<qint64> positions_;
    std::vector<Piece> pieces_; ///< the oldest first
};

} // namespace kareport
