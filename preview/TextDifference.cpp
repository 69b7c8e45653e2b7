#include "TextDifference.h"

#include <algorithm>

namespace kareport
{

TextDifference differenceOf(const QString &before, const QString &after)
{
    const qsizetype most = std::min(before.size(), after.size());
    qsizetype front = 0;
    while (front < most && before[front] == after[front]) {
        ++front;
    }
    qsizetype back = 0;
    while (back < most - front && before[before.size() - 1 - back] == after[after.size() - 1 - back]) {
        ++back;
    }
    // A pair of characters that make one is not taken apart.
    front -= front > 0 && before[front - 1].isHighSurrogate() ? 1 : 0;
    back -= back > 0 && after[after.size() - back].isLowSurrogate() ? 1 : 0;
    return {front, before.size() - front - back, after.mid(front, after.size() - front - back)};
}

} // namespace kareport
