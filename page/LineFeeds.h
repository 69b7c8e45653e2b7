#pragma once

#include <QByteArrayView>
#include <QLatin1StringView>
#include <QStringView>

#include <cstdint>
#include <cstring>

namespace kareport
{

/// Whether a text holds a line feed. Most pieces are short and hold none, and the library's own search, which is made for
/// long texts, takes most of its time to begin.
inline bool holdsLineFeed(QStringView text)
{
    constexpr std::uint64_t ones = 0x0001000100010001;
    constexpr qsizetype atOnce = sizeof ones / sizeof(char16_t);
    const char16_t *at = text.utf16();
    const char16_t *const end = at + text.size();
    std::uint64_t found = 0;
    for (; end - at >= atOnce; at += atOnce) {
        std::uint64_t word;
        std::memcpy(&word, at, sizeof word);
        // A line feed becomes 0, and taking 1 from it sets the top bit that it did not have.
        const std::uint64_t difference = word ^ (ones * u'\n');
        found |= (difference - ones) & ~difference & (ones << 15);
    }
    bool isFound = found != 0;
    for (; at != end; ++at) {
        isFound = isFound || *at == u'\n';
    }
    return isFound;
}

inline qsizetype countAllLineFeeds(QStringView text)
{
    return holdsLineFeed(text) ? text.count(u'\n') : 0;
}

inline qsizetype countAllLineFeeds(QLatin1StringView text)
{
    const QByteArrayView bytes(text);
    return bytes.contains('\n') ? bytes.count('\n') : 0;
}

/// How many line feeds a text holds.
template <typename View>
int countLineFeeds(View text)
{
    // One at the end need not be looked for.
    const int atEnd = text.endsWith(u'\n') ? 1 : 0;
    return atEnd + static_cast<int>(countAllLineFeeds(text.chopped(atEnd)));
}

} // namespace kareport
