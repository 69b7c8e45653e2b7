#pragma once

#include <QStringView>

#include <functional>
#include <vector>

namespace kareport
{

/// The advance of a character in thousandths of the font size.
using CharacterWidth = std::function<int(char32_t)>;

/// Breaks a line that is wider than its box: after the last blank that is in it or that crosses its edge, and in the
/// middle of a word only where the word alone is wider than the box. Blanks at the end of the line take no room.
/// @param width  of the box, in thousandths of the font size
/// @param pieces  receives the pieces, at least one; together they are the line
void breakLine(QStringView line, double width, const CharacterWidth &characterWidth, std::vector<QStringView> &pieces);

} // namespace kareport
