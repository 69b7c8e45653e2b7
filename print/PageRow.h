#pragma once

#include <QtGlobal>

#include <vector>

namespace kareport
{

/// A row of characters as it is drawn, in dots.
struct PageRow
{
    qint64 start = 0; ///< its first character
    qint64 stop = 0;  ///< after its last one, without the line's end
    qreal top = 0;
    qreal height = 0;
    std::vector<qreal> edges; ///< where each character begins, and where the last one ends
};

} // namespace kareport
