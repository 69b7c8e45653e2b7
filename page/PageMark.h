#pragma once

#include <QString>
#include <QStringView>

namespace kareport
{

/// Marks in a text the place of the number of the page that the text is written on: a code that is not a character, so that no text
/// has it.
inline constexpr char16_t pageMark = u'\uFDD0';

/// The text with the number in place of each run of page marks. A number with fewer digits than the run has marks has
/// blanks before it, so that a column keeps its width.
QString withPageNumber(QStringView text, int page);

} // namespace kareport
