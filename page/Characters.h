#pragma once

#include <QStringView>

#include <algorithm>
#include <iterator>

namespace kareport
{

/// The columns from one tab stop to the next.
inline constexpr int tabColumns = 8;

/// Whether all characters of a text are up to U+00FF.
inline bool isLatin1(QStringView text)
{
    unsigned all = 0;
    for (const char16_t *at = text.utf16(), *end = at + text.size(); at != end; ++at) {
        all |= *at;
    }
    return all <= 0xFF;
}

/// Whether a character is a control: it takes no place in a line. A tab is one.
constexpr bool isControl(char16_t character)
{
    constexpr char16_t lineSeparator = 0x2028;
    constexpr char16_t paragraphSeparator = 0x2029;
    return character < 0x20 || (character >= 0x7F && character < 0xA0) || character == lineSeparator ||
           character == paragraphSeparator;
}

/// Whether a character needs no shaping: it takes its place in a line whatever is next to it, as it is not joined, not
/// stacked, not turned round and no half of a pair. The widths of such characters add up.
constexpr bool needsNoShaping(char16_t character)
{
    struct Range
    {
        char16_t first;
        char16_t last;
    };
    constexpr Range ranges[] = {
        {0x0020, 0x007E}, {0x00A0, 0x00AC}, {0x00AE, 0x02FF}, // Latin, without the soft hyphen
        {0x0370, 0x0482}, {0x048A, 0x0523},                   // Greek, Cyrillic
        {0x2010, 0x2027}, {0x2030, 0x205E}, {0x2070, 0x20CF}, // punctuation, signs of currency
        {0x2100, 0x2BFF},                                     // symbols, arrows, box drawing
        {0x2E80, 0x3029}, {0x3030, 0x3098}, {0x309B, 0x9FFF}, // Chinese, Japanese
        {0xAC00, 0xD7A3}, {0xF900, 0xFAFF}, {0xFF01, 0xFF9D}, {0xFFA0, 0xFFEE},
    };
    return std::any_of(std::begin(ranges), std::end(ranges),
                       [character](const Range &range) { return character >= range.first && character <= range.last; });
}

} // namespace kareport
