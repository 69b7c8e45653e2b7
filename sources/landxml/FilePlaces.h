#pragma once

#include "FileBytes.h"
#include "TextPlaces.h"

#include <cstddef>

namespace kareport
{

/// Finds the places of bytes of an XML file. It is in UTF-16 where it begins with a byte-order mark, and otherwise in UTF-8 or
/// in the encoding that it declares, whose characters are one byte each. Bytes that are asked for in order cost one pass through
/// the file, and the file is not in memory as a whole afterwards.
class FilePlaces
{
public:
    explicit FilePlaces(const FileBytes &file);

    /// The place of a byte; after the end, that of the end.
    TextPlace of(std::size_t byte);

private:
    void walk(std::size_t end);
    void walkWide(std::size_t end, bool isLittle);

    const FileBytes &file_;
    bool hasOneByteCharacters_;
    std::size_t at_ = 0; ///< where the walk has come to
    TextPlace place_;    ///< of that
};

} // namespace kareport
