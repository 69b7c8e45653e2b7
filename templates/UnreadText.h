#pragma once

#include "ScanText.h"

#include <QString>

#include <vector>

namespace kareport
{

/// Something in a template file that is not read, although it is neither a comment nor blank.
struct UnreadPiece
{
    enum class Kind
    {
        Element,  ///< an element of a name that templates do not have
        Text,     ///< text between the elements of a template
        Around,   ///< text before the first template, or between two
        AfterLast ///< text after the last template
    };
    Kind kind;
    qsizetype source;          ///< where it begins in the file
    QString text;              ///< of an element its name, of a text its beginning
    qsizetype end = 0;         ///< where a text around templates ends in the file
    bool holdsElement = false; ///< of an element: one that is read is inside it
};

/// The parts of a file that are not read, in the order of the file. A file without a template has none: all of it is unread.
std::vector<UnreadPiece> findUnread(const ScanText &file);

} // namespace kareport
