#pragma once

#include "KaReportExport.h"

#include <QStringView>

#include <cstddef>

namespace kareport
{

/// The text of a report: one growing run of UTF-16 characters, ended by a 0 character.
///
/// The capacity is counted in blocks and zeroed block by block; the memory behind it grows geometrically, so that a text
/// of any length is copied a constant number of times.
class KAREPORT_EXPORT ReportText
{
public:
    /// What memory is got with: `realloc`, or a test's own.
    using Reallocate = void *(*)(void *memory, std::size_t bytes);

    static constexpr qint64 blockSize = 32000;    ///< characters in a block
    static constexpr qint64 longest = 0x7FFFFFFF; ///< characters in a text at most

    /// One block, empty. @throws std::bad_alloc when there is no memory for it
    explicit ReportText(Reallocate reallocate = nullptr);
    ~ReportText();
    ReportText(const ReportText &) = delete;
    ReportText &operator=(const ReportText &) = delete;

    /// The characters, with a 0 behind the last; valid until the next change.
    const char16_t *data() const { return data_; }
    qint64 size() const { return size_; }
    QStringView view() const { return {data_, size_}; }

    /// Makes room for so many characters and the 0 behind them. @return false when there is no memory for them or they
    /// are more than `longest`; the text stays as it is
    bool reserve(qint64 characters) { return characters <= usable_ || grow(characters); }

    /// Appends a text. @return false, changing nothing, when there is no room
    bool append(QStringView text);
    /// Appends a line end, CR LF. @return false, changing nothing, when there is no room
    bool appendLineEnd();
    /// Replaces the text. @return false when there is no room; the text is then empty
    bool assign(QStringView text);
    /// Empties the text and goes back to one block.
    void clear();

private:
    bool grow(qint64 characters);
    bool allocate(qint64 characters);

    Reallocate reallocate_;
    char16_t *data_ = nullptr;
    qint64 size_ = 0;
    qint64 usable_ = 0;    ///< characters that fit into the counted blocks, all of them allocated and zeroed
    qint64 allocated_ = 0; ///< characters that fit into the memory
};

} // namespace kareport
