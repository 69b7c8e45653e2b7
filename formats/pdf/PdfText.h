#pragma once

#include <QLatin1StringView>
#include <QString>
#include <QStringView>

#include <string>

namespace kareport
{

/// Turns a line of a report, without its line feed, into what is seen of it: tabs become blanks up to the next eighth
/// cell, other control characters and blanks at the end are dropped, and half a surrogate pair becomes U+FFFD.
void visibleLine(QStringView line, QString &visible);
void visibleLine(QLatin1StringView line, QString &visible);

/// The characters of a text that are seen, each once, in the order of their codes.
std::u32string visibleCharacters(QStringView text);
std::u32string visibleCharacters(QLatin1StringView text);

/// The lines of a text that are wider than their room.
struct WideLines
{
    qint64 count = 0;
    qint64 first = 0;  ///< number of the first of them, from 1
    qint64 widest = 0; ///< cells of the widest of them
};

/// @param characters  of the text, as `visibleCharacters` gives them
/// @param room        in cells
WideLines wideLines(QStringView text, const std::u32string &characters, qint64 room);
WideLines wideLines(QLatin1StringView text, const std::u32string &characters, qint64 room);

} // namespace kareport
