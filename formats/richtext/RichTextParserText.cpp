#include "RichTextParser.h"

#include <cstdint>
#include <cstring>

namespace kareport
{

namespace
{

/// How many characters below 0x80 the bytes begin with.
std::size_t asciiCount(std::string_view bytes)
{
    constexpr std::uint64_t tops = 0x8080808080808080;
    std::size_t count = 0;
    for (std::uint64_t word = 0; bytes.size() - count >= sizeof word; count += sizeof word) {
        std::memcpy(&word, bytes.data() + count, sizeof word);
        if ((word & tops) != 0) {
            break;
        }
    }
    while (count < bytes.size() && static_cast<unsigned char>(bytes[count]) < 0x80) {
        ++count;
    }
    return count;
}

} // namespace

void RichTextParser::putRawBytes(std::string_view bytes)
{
    const std::size_t ascii = asciiCount(bytes);
    if (bytes_.isEmpty()) {
        putAscii(bytes.substr(0, ascii));
    } else {
        // The second byte of a character may be below 0x80.
        bytes_.append(bytes.data(), static_cast<qsizetype>(ascii));
    }
    bytes.remove_prefix(ascii);
    if (bytes.empty()) {
        return;
    }
    if (rawBytes_ == RichTextRawBytes::Utf8) {
        flushBytes();
        putText(QString::fromUtf8(bytes.data(), static_cast<qsizetype>(bytes.size())));
    } else if (state_.codePage->isSingleByte()) {
        for (const char byte : bytes) {
            put(state_.codePage->character(byte));
        }
    } else {
        bytes_.append(bytes.data(), static_cast<qsizetype>(bytes.size()));
    }
}

void RichTextParser::putAscii(std::string_view bytes)
{
    if (bytes.empty()) {
        return;
    }
    const QLatin1StringView text(bytes.data(), static_cast<qsizetype>(bytes.size()));
    if (state_.destination == RichTextDestination::FontTable) {
        fonts_.current().family.append(text);
    } else if (state_.hasSignBytes) {
        putSigns(bytes);
    } else if (isShown()) {
        beforeText();
        target_->append(text, format());
    } else {
        noteHidden();
    }
}

/// Appends the symbols of a symbol font whose codes are the bytes below 0x80. In a font that is not known the bytes stay
/// letters: many fonts of letters claim to be symbol fonts.
void RichTextParser::putSigns(std::string_view bytes)
{
    for (const char byte : bytes) {
        const bool isSign = byte > ' ';
        if (isSign && state_.signs != nullptr) {
            put(static_cast<char16_t>(0xF000 + static_cast<unsigned char>(byte)));
        } else {
            notes_.signs += isSign && isShown() ? 1 : 0;
            put(static_cast<unsigned char>(byte));
        }
    }
}

void RichTextParser::flushBytes()
{
    if (!bytes_.isEmpty()) {
        const QString text = state_.codePage->decode(bytes_);
        bytes_.resize(0);
        putText(text);
    }
}

void RichTextParser::putText(QStringView text)
{
    for (const QChar character : text) {
        put(character.unicode());
    }
}

void RichTextParser::put(char16_t character)
{
    switch (character) {
    case 0: return;
    case u'\n':
    case u'\r':
    case QChar::ParagraphSeparator: endParagraph(); return;
    case 0xFDD0:
    case 0xFDD1:
        // They are not characters, and a document keeps them for the edges of its frames.
        character = QChar::ReplacementCharacter;
        break;
    default: break;
    }
    if (state_.destination == RichTextDestination::FontTable) {
        fonts_.current().family.append(QChar(character));
    } else if (!isShown()) {
        noteHidden();
    } else if (isPrivateSign(character)) {
        putSign(character);
    } else {
        beforeText();
        target_->append(character, format());
    }
}

void RichTextParser::putSign(char16_t character)
{
    const char32_t known = characterOfSign(character, state_.signs);
    notes_.signs += known == 0 ? 1 : 0;
    beforeText();
    if (known == 0) {
        target_->append(character, format());
    } else {
        for (const char16_t unit : QChar::fromUcs4(known)) {
            target_->append(unit, format());
        }
    }
}

/// Counts a hidden text once, however many pieces it is in.
void RichTextParser::noteHidden()
{
    if (state_.destination == RichTextDestination::Body && !hiddenCounted_) {
        hiddenCounted_ = true;
        ++notes_.hidden;
    }
}

void RichTextParser::beforeText()
{
    nestedRowEnded_ = false;
    hiddenCounted_ = false;
    if (cellEnded_) {
        cellEnded_ = false;
        target_->append(u'\t', format());
    }
}

int RichTextParser::format()
{
    if (state_.format < 0) {
        state_.format = target_->takesFormats() ? formats_.character(state_.characters) : 0;
    }
    return state_.format;
}

void RichTextParser::endParagraph()
{
    if (!isShown()) {
        return;
    }
    beforeText();
    if (pageBreak_) {
        RichTextParagraph paragraph = state_.paragraph;
        paragraph.pageBreakBefore = true;
        target_->endParagraph(paragraph, format());
    } else {
        target_->endParagraph(state_.paragraph, format());
    }
    pageBreak_ = false;
    sectionBreak_ = false;
}

/// A row is a paragraph, with a tab between its cells and none after the last one.
void RichTextParser::endRow(bool isNested)
{
    if (!isShown()) {
        return;
    }
    cellEnded_ = false;
    // A table that fills the last cell of a row has ended the row's paragraph already.
    if (isNested || !nestedRowEnded_ || !target_->isParagraphEmpty()) {
        endParagraph();
    }
    nestedRowEnded_ = isNested;
}

void RichTextParser::breakPage()
{
    if (!isShown()) {
        return;
    }
    if (!target_->isParagraphEmpty()) {
        endParagraph();
    }
    pageBreak_ = true;
}

void RichTextParser::readUnicode(int number)
{
    fallback_ = state_.fallbackCount;
    if (number < 0) {
        // Numbers are written as signed 16-bit integers.
        number = number >= -0x8000 ? number + 0x10000 : int(QChar::ReplacementCharacter);
    }
    if (number > int(QChar::LastValidCodePoint)) {
        number = int(QChar::ReplacementCharacter);
    }
    const auto code = static_cast<char32_t>(number);
    if (QChar::requiresSurrogates(code)) {
        put(QChar::highSurrogate(code));
        put(QChar::lowSurrogate(code));
        return;
    }
    put(static_cast<char16_t>(code));
}

} // namespace kareport
