#pragma once

#include "LandXmlRows.h"

namespace kareport
{

/// Rows that are made from what a file holds as a whole: it is read when the first one is asked for.
class ModelRows : public LandXmlRows
{
public:
    bool next() final
    {
        if (!isLoaded_) {
            isLoaded_ = true;
            isSound_ = load();
        }
        if (!isSound_ || index_ + 1 >= count_) {
            return false;
        }
        take(++index_);
        return true;
    }
    void rewind() final { index_ = beforeFirst; }
    void goTo(std::size_t index) final
    {
        index_ = index;
        take(index);
    }
    std::optional<std::size_t> byteOf(std::size_t index) final
    {
        if (!isSound_ || index >= count_) {
            return std::nullopt;
        }
        goTo(index);
        return byte();
    }

protected:
    using LandXmlRows::LandXmlRows;

    /// Reads the file and sets the number of rows. @return false when something is wrong
    virtual bool load() = 0;
    /// Goes to a row.
    virtual void take(std::size_t index) = 0;

    std::size_t count_ = 0;

private:
    static constexpr std::size_t beforeFirst = std::size_t(-1); // one more is 0

    bool isLoaded_ = false;
    bool isSound_ = false;
    std::size_t index_ = beforeFirst;
};

} // namespace kareport
