#pragma once

#include "KaReportExport.h"
#include "PdfFaces.h"

#include <QLatin1StringView>
#include <QString>
#include <QStringView>

#include <algorithm>
#include <vector>

namespace kareport
{

/// Where the text of a page ends that begins at `begin`: behind its last line feed, or at the end of the text.
template <typename Text>
qsizetype pageEnd(const Text &text, qsizetype begin, int lines)
{
    qsizetype at = begin;
    for (int line = 0; line < lines; ++line) {
        const qsizetype feed = text.indexOf(u'\n', at);
        if (feed < 0) {
            return text.size();
        }
        at = feed + 1;
    }
    return at;
}

/// Turns a line of a report, without its line feed, into what is seen of it: tabs become blanks up to the next eighth
/// column, other control characters and blanks at the end go, and half a surrogate pair becomes U+FFFD.
KAREPORT_EXPORT void visibleLine(QStringView line, QString &visible);
KAREPORT_EXPORT void visibleLine(QLatin1StringView line, QString &visible);

/// The characters of a text that are seen, each once, in the order of their codes.
KAREPORT_EXPORT std::vector<CharacterCount> visibleCharacters(QStringView text);
KAREPORT_EXPORT std::vector<CharacterCount> visibleCharacters(QLatin1StringView text);

} // namespace kareport
