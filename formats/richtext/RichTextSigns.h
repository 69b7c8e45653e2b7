#pragma once

#include <QString>
#include <QStringView>

#include <array>

namespace kareport
{

/// The signs of a font as characters, by their numbers in the font from 0x20 on; 0 where no character is known.
using RichTextSigns = std::array<char32_t, 0x100 - 0x20>;

/// The signs of the font of that name; null for a font that holds letters, or signs that are not known here.
const RichTextSigns *signsOfFont(QStringView family);

/// The private characters U+F000 to U+F0FF are where fonts of signs keep theirs.
inline bool isPrivateSign(char16_t character)
{
    return (character & 0xFF00) == 0xF000;
}

/// The character of a private one. Without a known font only the bullet is, with which lists begin.
/// @param signs  of the font; null where they are not known
/// @return 0 where none is known
char32_t characterOfSign(char16_t character, const RichTextSigns *signs);

} // namespace kareport
