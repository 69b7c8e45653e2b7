#pragma once

#include <QtGlobal>

#include <algorithm>
#include <cstddef>
#include <cstdlib>
#include <cstring>
#include <functional>
#include <type_traits>
#include <utility>

namespace kareport
{

/// A growing run of characters with a 0 after the last. Its capacity is counted in blocks and zeroed block by block;
/// its memory grows geometrically, so that a text of any length is copied a constant number of times.
///
/// What is free lies after the last character or, while pieces are replaced, as a gap where the last one was: pieces
/// that are replaced from the front to the back move the text once. Reading the text in one piece closes the gap, and so
/// does growing, which makes new room at the end.
template <typename Character>
class CharacterBlocks
{
    static_assert(std::is_trivially_copyable_v<Character>);

public:
    using Reallocate = void *(*)(void *memory, std::size_t bytes);

    static constexpr qint64 blockSize = 32000;    ///< characters in a block
    static constexpr qint64 longest = 0x7FFFFFFF; ///< characters at most

    explicit CharacterBlocks(Reallocate reallocate) : reallocate_(reallocate) {}
    ~CharacterBlocks() { std::free(data_); }
    CharacterBlocks(const CharacterBlocks &) = delete;
    CharacterBlocks &operator=(const CharacterBlocks &) = delete;

    void swap(CharacterBlocks &other) noexcept
    {
        std::swap(reallocate_, other.reallocate_);
        std::swap(data_, other.data_);
        std::swap(size_, other.size_);
        std::swap(gapAt_, other.gapAt_);
        std::swap(usable_, other.usable_);
        std::swap(allocated_, other.allocated_);
    }

    /// All characters in one piece; null before the first successful `reserve`.
    Character *data() const
    {
        if (gapAt_ != size_) {
            moveGap(size_);
            data_[size_] = Character(0);
        }
        return data_;
    }
    qint64 size() const { return size_; }

    /// Makes room for so many characters and the 0 after them.
    bool reserve(qint64 characters) { return characters <= usable_ || grow(characters); }
    /// Takes characters over that were written after the last one, within what was reserved.
    void setSize(qint64 size)
    {
        size_ = size;
        gapAt_ = size;
        data_[size_] = Character(0);
    }
    /// Replaces characters by others; `inserted` must not lie in this text. @return false, changing nothing, when there is
    /// no room
    template <typename Source>
    bool replace(qint64 at, qint64 removed, const Source *inserted, qint64 count)
    {
        const qint64 size = size_ - removed + count;
        if (!reserve(size)) {
            return false;
        }
        if (gapAt_ < at) {
            moveGap(at);
        } else if (gapAt_ > at + removed) {
            moveGap(at + removed);
        }
        // What is removed now touches the gap on one side or both, and becomes a part of it.
        std::transform(inserted, inserted + count, data_ + at, [](Source c) { return static_cast<Character>(c); });
        gapAt_ = at + count;
        size_ = size;
        if (gapAt_ == size_) {
            data_[size_] = Character(0);
        }
        return true;
    }
    /// Hands on a part of the text as it lies, in one piece or two, moving nothing. @param take  is given an address and a
    /// number of characters, never 0
    template <typename Take>
    void forEachPiece(qint64 begin, qint64 end, Take take) const
    {
        if (begin < std::min(end, gapAt_)) {
            take(data_ + begin, std::min(end, gapAt_) - begin);
        }
        if (std::max(begin, gapAt_) < end) {
            take(data_ + std::max(begin, gapAt_) + (usable_ - size_), end - std::max(begin, gapAt_));
        }
    }
    /// Whether an address lies in the memory of this text.
    bool holds(const Character *address) const
    {
        return std::less_equal<>()(data_, address) && std::less_equal<>()(address, data_ + usable_);
    }
    /// Empties the text and goes back to one block, or to none.
    void clear(bool keepBlock)
    {
        size_ = 0;
        gapAt_ = 0;
        usable_ = 0;
        if (!keepBlock) {
            std::free(data_);
            data_ = nullptr;
            allocated_ = 0;
        } else {
            // A smaller block always fits; where the system would not shrink it, the larger one stays.
            if (allocated_ > blockSize) {
                allocate(blockSize);
            }
            grow(1);
        }
    }

private:
    bool allocate(qint64 characters)
    {
        void *memory = reallocate_(data_, static_cast<std::size_t>(characters + 1) * sizeof(Character));
        if (memory == nullptr) {
            return false;
        }
        data_ = static_cast<Character *>(memory);
        allocated_ = characters;
        return true;
    }

    bool grow(qint64 characters)
    {
        if (characters > longest) {
            return false;
        }
        const qint64 counted = (characters + blockSize - 1) / blockSize * blockSize;
        // With little memory left, only what is asked for is allocated.
        if (counted > allocated_ && !allocate(std::max(counted, allocated_ * 2)) && !allocate(counted)) {
            return false;
        }
        // What is new is at the end of all that is usable: a gap would take a part of the text for it.
        data();
        const qint64 firstNew = usable_ == 0 ? size_ : usable_ + 1;
        std::fill(data_ + firstNew, data_ + counted + 1, Character(0));
        usable_ = counted;
        return true;
    }

    void moveGap(qint64 to) const
    {
        const qint64 gap = usable_ - size_;
        if (to < gapAt_) {
            std::memmove(data_ + to + gap, data_ + to, static_cast<std::size_t>(gapAt_ - to) * sizeof(Character));
        } else {
            std::memmove(data_ + gapAt_, data_ + gapAt_ + gap,
                         static_cast<std::size_t>(to - gapAt_) * sizeof(Character));
        }
        gapAt_ = to;
    }

    Reallocate reallocate_;
    Character *data_ = nullptr;
    qint64 size_ = 0;
    mutable qint64 gapAt_ = 0; ///< characters before the gap; where it is the size, the text is in one piece
    qint64 usable_ = 0;        ///< characters that fit into the counted blocks, all of them allocated and zeroed
    qint64 allocated_ = 0;     ///< characters that fit into the memory
};

} // namespace kareport
