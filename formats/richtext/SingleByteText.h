#pragma once

#include <QStringView>

class QIODevice;

namespace kareport
{

/// Takes the place of a character that has no byte of its own.
enum class WideCharacters
{
    RichTextEscape, ///< `\uN?` for each UTF-16 unit, N as a signed number, as rich text has it
    QuestionMark    ///< "?" for each character
};

/// Writes a text to an open device with one byte a character up to U+00FF, and each LF as CR LF.
/// @return false as soon as a write fails or memory ends
bool writeSingleByteText(QIODevice &device, QStringView text, WideCharacters wide);

} // namespace kareport
