#pragma once

#include <QtGlobal>

#include <algorithm>
#include <cstddef>
#include <cstdlib>

namespace kareport
{

/// A growing run of characters with a 0 behind the last. Its capacity is counted in blocks and zeroed block by block;
/// the memory behind it grows geometrically, so that a text of any length is copied a constant number of times.
template <typename Character>
class CharacterBlocks
{
public:
    using Reallocate = void *(*)(void *memory, std::size_t bytes);

    static constexpr qint64 blockSize = 32000;    ///< characters in a block
    static constexpr qint64 longest = 0x7FFFFFFF; ///< characters at most

    explicit CharacterBlocks(Reallocate reallocate) : reallocate_(reallocate) {}
    ~CharacterBlocks() { std::free(data_); }
    CharacterBlocks(const CharacterBlocks &) = delete;
    CharacterBlocks &operator=(const CharacterBlocks &) = delete;

    /// Null before the first successful `reserve`.
    Character *data() const { return data_; }
    qint64 size() const { return size_; }

    /// Makes room for so many characters and the 0 behind them.
    bool reserve(qint64 characters) { return characters <= usable_ || grow(characters); }
    /// Takes characters over that were written behind the last one, within what was reserved.
    void setSize(qint64 size)
    {
        size_ = size;
        data_[size_] = Character(0);
    }
    /// Empties the text and goes back to one block, or to none.
    void clear(bool keepBlock)
    {
        size_ = 0;
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
        // With little memory left, what is asked for is enough.
        if (counted > allocated_ && !allocate(std::max(counted, allocated_ * 2)) && !allocate(counted)) {
            return false;
        }
        const qint64 firstNew = usable_ == 0 ? size_ : usable_ + 1;
        std::fill(data_ + firstNew, data_ + counted + 1, Character(0));
        usable_ = counted;
        return true;
    }

    Reallocate reallocate_;
    Character *data_ = nullptr;
    qint64 size_ = 0;
    qint64 usable_ = 0;    ///< characters that fit into the counted blocks, all of them allocated and zeroed
    qint64 allocated_ = 0; ///< characters that fit into the memory
};

} // namespace kareport
