#pragma once

#include <QtGlobal>

namespace kareport
{

/// A place in a text, both counted from 1.
struct TextPlace
{
    qsizetype line = 1;   ///< a line end belongs to the line that it ends
    qsizetype column = 1; ///< in characters: a surrogate pair is one
};

} // namespace kareport
