#pragma once

#include "NumberStyle.h"

#include <QtGlobal>

#include <string>
#include <string_view>

namespace kareport
{

/// Whether a byte is a digit from 0 to 9, whatever the language of the system.
inline bool isDigit(char byte)
{
    return byte >= '0' && byte <= '9';
}

/// A number as data files write it, INF and NAN among them; blanks around it and one sign are allowed.
bool parseNumber(std::string_view text, double &number);
/// A whole number of 32 bits; blanks around it and one sign are allowed.
bool parseWhole(std::string_view text, qint32 &number);
/// true, yes, y, t, 1, * and false, no, n, f, 0, in any case; blanks around it are allowed.
bool parseBoolean(std::string_view text, bool &value);

/// Writes a text with numbers of a style as it is with a decimal point and no thousands. A decimal point that the style does
/// not have, and thousands that are not groups of three digits, are refused.
/// @param result  is replaced
bool toPlainNumbers(std::string_view text, const NumberStyle &style, std::string &result);

/// Whether a text is valid UTF-8 without a zero byte, as a text of a file must be.
bool isPlainText(std::string_view text);
/// Whether texts are the same but for the case of ASCII letters.
bool equalsIgnoringCase(std::string_view text, std::string_view lower);
/// A text without blanks and tabs around it.
std::string_view trimmedBlanks(std::string_view text);

} // namespace kareport
