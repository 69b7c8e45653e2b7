#pragma once

#include "CharacterBlocks.h"
#include "PendingEdits.h"

#include <QLatin1StringView>
#include <QStringView>

#include <cstddef>

namespace kareport
{

/// The text of a report: one growing run of characters, ended by a 0.
///
/// Most reports hold no character above U+00FF. Such a text is kept with one byte a character, which halves the memory of
/// long reports, until it is asked for in UTF-16 or another character is written.
class ReportText
{
public:
    /// The function that allocates memory: `realloc`, or a test's own.
    using Reallocate = CharacterBlocks<char16_t>::Reallocate;

    static constexpr qint64 blockSize = CharacterBlocks<char16_t>::blockSize;
    static constexpr qint64 longest = CharacterBlocks<char16_t>::longest;

    /// One block, empty. @throws std::bad_alloc when there is no memory for it
    explicit ReportText(Reallocate reallocate = nullptr);

    /// The characters in UTF-16, with a 0 after the last; valid until the next change. A text that cannot be converted to
    /// UTF-16 because memory ran out shows as an empty one; `size` still says its length.
    const char16_t *data() const;
    qint64 size() const { return (isNarrow_ ? narrow_.size() : wide_.size()) + pending_.growth(); }
    bool isEmpty() const { return size() == 0; }
    QStringView view() const;

    /// Whether the text is kept with one byte a character: `narrowView` then shows it as it is, until the text is changed
    /// or asked for in UTF-16.
    bool isNarrow() const { return isNarrow_; }
    QLatin1StringView narrowView() const;

    /// Reads the whole text as it is kept, which does not change how it is kept. Whoever reads a text asks here, not for its
    /// form.
    /// @param read  is given a `QLatin1StringView` or a `QStringView`, which is valid until the next change
    /// @return what it answers
    template <typename Read>
    auto visit(Read read) const
    {
        return isNarrow_ ? read(narrowView()) : read(view());
    }

    /// Hands the text on in pieces, in their order, as it is kept: nothing is moved, no edit carried out and no memory
    /// asked for.
    /// @param take  is given a `QLatin1StringView` or a `QStringView`, never empty
    template <typename Take>
    void forEachPiece(Take take) const;

    /// Whether a text is a piece of this very text, which a change may move. Such a piece, valid as long as the text is not
    /// changed, can be appended, assigned and inserted like any other text.
    bool owns(QStringView text) const;
    bool owns(QLatin1StringView text) const;

    /// Makes room for so many characters and the 0 after them. @return false when there is no memory for them or they
    /// are more than `longest`; the text stays as it is
    bool reserve(qint64 characters) { return isNarrow_ ? narrow_.reserve(characters) : wide_.reserve(characters); }

    /// Appends a text. @return false, changing nothing, when there is no room
    bool append(QStringView text);
    bool append(QLatin1StringView text);
    /// Appends a line end, CR LF. @return false, changing nothing, when there is no room
    bool appendLineEnd();
    /// Takes what was written last off the end, down to a size.
    void truncate(qint64 size);
    /// Replaces the text. @return false when there is no room; the text is then empty
    bool assign(QStringView text);
    /// Replaces a piece of the text. An edit costs what is typed, wherever it is: the edits are carried out in the long
    /// text together, when it is next read.
    /// @return false, changing nothing, for a piece that is not in the text or when there is no room
    bool replace(qint64 at, qint64 removed, QStringView inserted);
    /// A copy of a piece of the text, in a time that does not grow with the text. Empty for a piece that is not in it.
    QString piece(qint64 at, qint64 length) const;
    /// Exchanges two texts, however long they are.
    void swap(ReportText &other) noexcept;
    /// Empties the text and goes back to one block.
    void clear();
    /// Empties the text and keeps its memory, for what is written next.
    void drain();

private:
    static constexpr std::size_t mostPending = 4096;        ///< edits
    static constexpr qint64 longestPending = 2 * blockSize; ///< characters inserted by one of them

    bool widen() const;
    void settle() const
    {
        if (!pending_.isEmpty()) {
            carryOutPending();
        }
    }
    void carryOutPending() const;
    bool replaceNow(qint64 at, qint64 removed, QStringView inserted) const;
    bool replaceLater(qint64 at, qint64 removed, QStringView inserted);
    template <typename Take>
    void forEachKeptPiece(qint64 begin, qint64 end, Take take) const;

    // How the text is kept is nothing that a reader sees, so it changes in a const text as well.
    mutable CharacterBlocks<unsigned char> narrow_;
    mutable CharacterBlocks<char16_t> wide_;
    mutable bool isNarrow_ = true;
    mutable PendingEdits pending_;
};

template <typename Take>
void ReportText::forEachKeptPiece(qint64 begin, qint64 end, Take take) const
{
    if (isNarrow_) {
        narrow_.forEachPiece(begin, end, [&take](const unsigned char *characters, qint64 count) {
            take(QLatin1StringView(reinterpret_cast<const char *>(characters), count));
        });
    } else {
        wide_.forEachPiece(begin, end,
                           [&take](const char16_t *characters, qint64 count) { take(QStringView(characters, count)); });
    }
}

template <typename Take>
void ReportText::forEachPiece(Take take) const
{
    qint64 kept = 0;
    for (const PendingEdits::Edit &edit : pending_.edits()) {
        forEachKeptPiece(kept, edit.at, take);
        if (!edit.inserted.isEmpty()) {
            take(QStringView(edit.inserted));
        }
        kept = edit.at + edit.removed;
    }
    forEachKeptPiece(kept, size() - pending_.growth(), take);
}

} // namespace kareport
