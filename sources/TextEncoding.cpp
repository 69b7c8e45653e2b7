#include "TextEncoding.h"

#include "SpooledBytes.h"
#include "Windows1252.h"
#include "Xlate.h"

#include <QChar>

#include <algorithm>
#include <array>
#include <string>
#include <string_view>

namespace kareport
{

namespace
{

void appendUtf8(std::string &out, char32_t character)
{
    const auto append = [&out](char32_t byte) { out += static_cast<char>(byte); };
    if (character < 0x80) {
        append(character);
    } else if (character < 0x800) {
        append(0xC0 | character >> 6);
        append(0x80 | (character & 0x3F));
    } else if (character < 0x10000) {
        append(0xE0 | character >> 12);
        append(0x80 | (character >> 6 & 0x3F));
        append(0x80 | (character & 0x3F));
    } else {
        append(0xF0 | character >> 18);
        append(0x80 | (character >> 12 & 0x3F));
        append(0x80 | (character >> 6 & 0x3F));
        append(0x80 | (character & 0x3F));
    }
}

/// Takes characters from the bytes of a text, one after the other.
class CharacterReader
{
public:
    CharacterReader(std::string_view bytes, TextEncoding encoding) : bytes_(bytes), encoding_(encoding)
    {
        if (encoding_ == TextEncoding::Utf16) {
            isBigEndian_ = bytes_.starts_with("\xFE\xFF");
            hasMark_ = isBigEndian_ || bytes_.starts_with("\xFF\xFE");
            at_ = 2;
        }
    }

    bool hasMark() const { return encoding_ != TextEncoding::Utf16 || hasMark_; }
    bool atEnd() const { return at_ >= bytes_.size(); }
    std::size_t position() const { return at_; }

    /// The next character; nothing when the bytes are none.
    std::optional<char32_t> next()
    {
        if (encoding_ == TextEncoding::Utf16) {
            return nextOfUtf16();
        }
        const auto byte = static_cast<unsigned char>(bytes_[at_++]);
        if (encoding_ == TextEncoding::Latin1 || byte < 0x80 || byte >= 0xA0) {
            return byte;
        }
        const char16_t character = windows1252[byte - 0x80U];
        return character != 0 ? std::optional<char32_t>(character) : std::nullopt;
    }

private:
    std::optional<char16_t> unit()
    {
        if (bytes_.size() - at_ < 2) {
            at_ = bytes_.size();
            return std::nullopt;
        }
        const auto first = static_cast<unsigned char>(bytes_[at_]);
        const auto second = static_cast<unsigned char>(bytes_[at_ + 1]);
        at_ += 2;
        return static_cast<char16_t>(isBigEndian_ ? first << 8 | second : second << 8 | first);
    }

    std::optional<char32_t> nextOfUtf16()
    {
        const auto first = unit();
        if (!first || !QChar::isSurrogate(*first)) {
            return first;
        }
        const auto second = QChar::isHighSurrogate(*first) && !atEnd() ? unit() : std::nullopt;
        return second && QChar::isLowSurrogate(*second) ? std::optional(QChar::surrogateToUcs4(*first, *second))
                                                        : std::nullopt;
    }

    std::string_view bytes_;
    TextEncoding encoding_;
    std::size_t at_ = 0;
    bool isBigEndian_ = false;
    bool hasMark_ = false;
};

constexpr struct
{
    QStringView key;
    TextEncoding encoding;
} encodingKeys[] = {{u"utf-8", TextEncoding::Utf8},
                    {u"latin-1", TextEncoding::Latin1},
                    {u"windows-1252", TextEncoding::Windows1252},
                    {u"utf-16", TextEncoding::Utf16}};

QString wrongCharacter(TextEncoding encoding)
{
    return encoding == TextEncoding::Utf16
               ? Xlate("the file is not UTF-16")
               : Xlate("the file is not Windows-1252: it contains a byte that this encoding does not use");
}

} // namespace

QStringList textEncodingKeys()
{
    QStringList keys;
    for (const auto &row : encodingKeys) {
        keys.append(row.key.toString());
    }
    return keys;
}

std::optional<TextEncoding> textEncodingFromKey(QStringView key)
{
    const auto *found = std::find_if(std::begin(encodingKeys), std::end(encodingKeys),
                                     [key](const auto &row) { return row.key == key; });
    return found != std::end(encodingKeys) ? std::optional(found->encoding) : std::nullopt;
}

Expected<std::shared_ptr<const FileBytes>> toUtf8(std::shared_ptr<const FileBytes> file, TextEncoding encoding,
                                                  const std::function<bool()> &isToStop)
{
    if (encoding == TextEncoding::Utf8) {
        return file;
    }
    CharacterReader reader(file->view(), encoding);
    if (!reader.hasMark()) {
        return InputError{file->path(), TextPlace(),
                          Xlate("the file has no byte-order mark: UTF-16 with its mark was expected")};
    }
    SpooledBytes spooled;
    TextPlace place;
    std::size_t released = 0;
    constexpr std::size_t charactersBetween = 1 << 16;
    for (std::size_t read = 1; !reader.atEnd(); ++read) {
        if (read % charactersBetween == 0) {
            if (isToStop && isToStop()) {
                return std::shared_ptr<const FileBytes>();
            }
            file->releaseBefore(reader.position(), released);
        }
        const auto character = reader.next();
        if (!character) {
            const auto lost = file->lostBytes();
            return lost ? *lost : InputError{file->path(), place, wrongCharacter(encoding)};
        }
        appendUtf8(spooled.buffer(), *character);
        place = *character == U'\n' ? TextPlace{place.line + 1, 1} : TextPlace{place.line, place.column + 1};
        if (!spooled.flushFull()) {
            return InputError{file->path(), std::nullopt, spooled.wrong()};
        }
    }
    if (const auto lost = file->lostBytes()) {
        return *lost;
    }
    return FileBytes::ofSpooled(file->path(), std::move(spooled));
}

} // namespace kareport
