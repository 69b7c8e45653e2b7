#pragma once

#include <QStringView>

#include <cstddef>
#include <optional>
#include <vector>

namespace kareport
{

/// Where the pages of a report begin, as its writer recorded them: places in its text, counted in characters from 0.
///
/// Edits of the text carry them along. A place that is no longer at the beginning of a line stays, so that it counts
/// again when the line end comes back; `reportPages` passes it over.
class PageStarts
{
public:
    /// In ascending order, each once.
    const std::vector<qint64> &positions() const { return positions_; }

    void clear();
    /// Replaces all of them; negative ones and doubles are left out.
    void assign(std::vector<qint64> positions);
    /// Begins a page at the end of the text.
    void add(qint64 at);

    struct Edit;
    /// Carries the starts along with an edit of the text, in two steps: `prepare` needs memory and is called before the
    /// text changes, `carryOut` cannot fail.
    ///
    /// A start whose text before it is removed stays with its page. Text put in at a page's start belongs to the page
    /// before when it ends with a line end, else to the page. An inserted piece brings pages along where page headers
    /// are in it, or where it was removed together with them. The exact inverse of an edit, which is what an undo is,
    /// restores the earlier starts.
    /// @param removedText  what is removed; empty where `wantsRemoved` says no
    /// @param beginsLine   whether the place is the beginning of a line. Looked at only where the first line that is
    ///                     inserted is a page header, which is longer than `shortestHeader`
    Edit prepare(qint64 at, qint64 removed, QStringView removedText, QStringView inserted, bool beginsLine);
    static constexpr qint64 shortestHeader = 20;
    /// Whether `prepare` needs the text that is removed.
    bool wantsRemoved(qint64 at, qint64 removed, qint64 inserted) const;
    void carryOut(Edit &&edit) noexcept;

private:
    /// A text, known again by its length and two hashes.
    struct Piece
    {
        qint64 length = 0;
        std::size_t hash = 0;
        std::size_t otherHash = 0;

        static Piece of(QStringView text);
        bool operator==(const Piece &other) const = default;
    };
    /// An edit that starts were touched by, or that could bring them: where they were before and after it, counted from its place.
    struct Record
    {
        qint64 at = 0;
        Piece removed;
        Piece inserted;
        std::vector<qint64> before;
        std::vector<qint64> after;

        bool bringsPages() const;
    };
    const Record *inverseOf(const Record &edit) const;
    std::vector<qint64> broughtBy(const Record &edit) const;
    static void carry(Record &record, qint64 removed, QStringView inserted);

public:
    struct Edit
    {
        std::size_t first = 0; ///< the starts from here
        std::size_t last = 0;  ///< to before here become those of `middle`
        std::vector<qint64> middle;
        qint64 at = 0;
        qint64 removed = 0;
        qint64 growth = 0;
        std::optional<std::size_t> undone; ///< the record that it is the inverse of
        std::optional<Record> record;
    };

private:
    std::vector<qint64> positions_;
    std::vector<Record> records_; ///< the oldest first
};

} // namespace kareport
