#include "ReportTextCodec.h"

#include "MemoryLasts.h"

#include <QChar>

#include <array>
#include <cstdint>
#include <cstring>
#include <utility>

namespace kareport
{

namespace
{

/// Characters looked at together.
constexpr std::size_t runLength = 16;

/// Whether a run holds only characters that are written as one byte of the same value, and none that is `special`. Eight
/// bytes are looked at in one machine word.
template <typename Character>
bool isPlainRun(const Character *run, Character special)
{
    constexpr std::uint64_t ones = sizeof(Character) == 1 ? 0x0101010101010101 : 0x0001000100010001;
    constexpr std::uint64_t tops = ones << (8 * sizeof(Character) - 1);
    constexpr std::uint64_t notAscii = sizeof(Character) == 1 ? tops : 0xFF80FF80FF80FF80;
    std::array<std::uint64_t, runLength * sizeof(Character) / sizeof(std::uint64_t)> words;
    std::memcpy(words.data(), run, sizeof words);
    std::uint64_t found = 0;
    for (const std::uint64_t word : words) {
        // A character equal to `special` becomes 0, and taking 1 from it sets the top bit that it did not have.
        const std::uint64_t difference = word ^ (ones * special);
        found |= (word & notAscii) | ((difference - ones) & ~difference & tops);
    }
    return found == 0;
}

char *writeCharacter(char *out, char32_t character)
{
    const auto byte = [](char32_t value) { return static_cast<char>(static_cast<std::uint8_t>(value)); };
    if (character < 0x80) {
        *out++ = byte(character);
    } else if (character < 0x800) {
        *out++ = byte(0xC0 | (character >> 6));
        *out++ = byte(0x80 | (character & 0x3F));
    } else if (character < 0x10000) {
        *out++ = byte(0xE0 | (character >> 12));
        *out++ = byte(0x80 | ((character >> 6) & 0x3F));
        *out++ = byte(0x80 | (character & 0x3F));
    } else {
        *out++ = byte(0xF0 | (character >> 18));
        *out++ = byte(0x80 | ((character >> 12) & 0x3F));
        *out++ = byte(0x80 | ((character >> 6) & 0x3F));
        *out++ = byte(0x80 | (character & 0x3F));
    }
    return out;
}

/// Copies whole runs of plain characters. @return how many characters these are
template <typename Character>
std::size_t copyPlainRuns(const Character *at, const Character *end, Character special, char *out)
{
    const Character *const begin = at;
    while (static_cast<std::size_t>(end - at) >= runLength && isPlainRun(at, special)) {
        for (std::size_t i = 0; i < runLength; ++i) {
            out[i] = static_cast<char>(at[i]);
        }
        out += runLength;
        at += runLength;
    }
    return static_cast<std::size_t>(at - begin);
}

} // namespace

std::size_t ReportTextEncoder::encode(QStringView text, char *out, bool last)
{
    return encodeCharacters(text.utf16(), text.utf16() + text.size(), out, last);
}

std::size_t ReportTextEncoder::encode(QLatin1StringView text, char *out, bool last)
{
    const auto *bytes = reinterpret_cast<const unsigned char *>(text.data());
    return encodeCharacters(bytes, bytes + text.size(), out, last);
}

/// Writes what was held back: the character after it says what it is.
/// @param next  nothing at the end of the text
ReportTextEncoder::Settled ReportTextEncoder::settle(std::optional<char16_t> next, char *out)
{
    const char16_t held = std::exchange(heldBack_, u'\0');
    if (held == u'\r') {
        if (next != u'\n') {
            *out++ = '\r';
        }
        return {out, false};
    }
    if (next && QChar::isLowSurrogate(*next)) {
        return {writeCharacter(out, QChar::surrogateToUcs4(held, *next)), true};
    }
    return {writeCharacter(out, QChar::ReplacementCharacter), false};
}

template <typename Character>
std::size_t ReportTextEncoder::encodeCharacters(const Character *at, const Character *end, char *out, bool last)
{
    const bool reportFile = lineEnds_ == LineEnds::ReportFile;
    char *const begin = out;

    if (heldBack_ != 0 && (at != end || last)) {
        const Settled settled = settle(at != end ? std::optional<char16_t>(*at) : std::nullopt, out);
        out = settled.out;
        at += settled.takesNext ? 1 : 0;
    }

    const auto special = static_cast<Character>(reportFile ? u'\n' : u'\r');
    while (at != end) {
        const std::size_t copied = copyPlainRuns(at, end, special, out);
        at += copied;
        out += copied;
        // Up to and with the character that is not plain; after it whole runs are tried again.
        while (at != end) {
            const char16_t character = *at++;
            if (character < 0x80 && character != special) {
                *out++ = static_cast<char>(character);
                continue;
            }
            if (character == u'\n') {
                *out++ = '\r';
                *out++ = '\n';
            } else if (character == u'\r' || QChar::isHighSurrogate(character)) {
                heldBack_ = character;
                if (at == end && !last) {
                    break;
                }
                const Settled settled = settle(at != end ? std::optional<char16_t>(*at) : std::nullopt, out);
                out = settled.out;
                at += settled.takesNext ? 1 : 0;
            } else if (QChar::isLowSurrogate(character)) {
                out = writeCharacter(out, QChar::ReplacementCharacter);
            } else {
                out = writeCharacter(out, character);
            }
            break;
        }
    }
    return static_cast<std::size_t>(out - begin);
}

namespace
{

template <typename Text>
bool writeWhole(QIODevice &device, Text text, LineEnds lineEnds)
{
    return whileMemoryLasts(false, [&] {
        ReportTextWriter writer(device, lineEnds);
        return writer.write(text) && writer.finish();
    });
}

} // namespace

bool writeReportText(QIODevice &device, QStringView text, LineEnds lineEnds)
{
    return writeWhole(device, text, lineEnds);
}

bool writeReportText(QIODevice &device, QLatin1StringView text, LineEnds lineEnds)
{
    return writeWhole(device, text, lineEnds);
}

} // namespace kareport
