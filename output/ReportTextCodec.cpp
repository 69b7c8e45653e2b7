#include "ReportTextCodec.h"

#include <QChar>

#include <array>
#include <cstdint>

namespace kareport
{

namespace
{

/// Characters looked at together. A fixed count lets the compiler use vector instructions.
constexpr std::size_t runLength = 16;

/// Whether a run holds only characters that are written as one byte of the same value.
template <typename IsSpecial>
bool isPlainRun(const char16_t *run, IsSpecial isSpecial)
{
    unsigned special = 0;
    for (std::size_t i = 0; i < runLength; ++i) {
        special |= static_cast<unsigned>(run[i] > 0x7F) | static_cast<unsigned>(isSpecial(run[i]));
    }
    return special == 0;
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

} // namespace

std::size_t ReportTextEncoder::encode(QStringView text, char *out, bool last)
{
    const bool reportFile = lineEnds_ == LineEnds::ReportFile;
    const char16_t *at = text.utf16();
    const char16_t *const end = at + text.size();
    char *const begin = out;

    // What was held back is settled by the first character of this piece.
    const auto settle = [&](char16_t next, bool hasNext) {
        const char16_t held = heldBack_;
        heldBack_ = 0;
        if (held == u'\r') {
            if (!(hasNext && next == u'\n')) {
                *out++ = '\r';
            }
            return false;
        }
        if (hasNext && QChar::isLowSurrogate(next)) {
            out = writeCharacter(out, QChar::surrogateToUcs4(held, next));
            return true;
        }
        out = writeCharacter(out, QChar::ReplacementCharacter);
        return false;
    };
    if (heldBack_ != 0 && (at != end || last)) {
        if (settle(at != end ? *at : u'\0', at != end)) {
            ++at;
        }
    }

    while (at != end) {
        while (static_cast<std::size_t>(end - at) >= runLength &&
               (reportFile ? isPlainRun(at, [](char16_t c) { return c == u'\n'; })
                           : isPlainRun(at, [](char16_t c) { return c == u'\r'; })))
        {
            for (std::size_t i = 0; i < runLength; ++i) {
                out[i] = static_cast<char>(at[i]);
            }
            out += runLength;
            at += runLength;
        }
        for (std::size_t i = 0; i < runLength && at != end; ++i) {
            const char16_t character = *at++;
            const bool holdsBack = QChar::isHighSurrogate(character) || (!reportFile && character == u'\r');
            if (holdsBack) {
                heldBack_ = character;
                if (at == end && !last) {
                    break;
                }
                if (settle(at != end ? *at : u'\0', at != end)) {
                    ++at;
                }
            } else if (character == u'\n' && reportFile) {
                *out++ = '\r';
                *out++ = '\n';
            } else if (QChar::isLowSurrogate(character)) {
                out = writeCharacter(out, QChar::ReplacementCharacter);
            } else {
                out = writeCharacter(out, character);
            }
        }
    }
    return static_cast<std::size_t>(out - begin);
}

} // namespace kareport
