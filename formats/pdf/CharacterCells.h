#pragma once

#include <QStringView>

#include <cstddef>

namespace kareport
{

/// The entries of a table by character, for those that are one unit of a text.
inline constexpr std::size_t planeSize = 0x10000;

/// The cells that a character takes on a grid of fixed pitch: 2 for one that East Asian typography sets wide or full
/// width; 0 for a combining mark, for a Hangul vowel or final consonant that joins the syllable before it, and for a
/// character that only directs others and is not seen; 1 for any other.
int cellsOf(char32_t character);

/// Whether a character directs others and is never seen itself: joiners, direction marks, variation selectors.
bool isIgnorable(char32_t character);

/// The cells of a line.
qint64 cellsOf(QStringView line);

/// The end of the cluster that begins at `begin`: a character with the ones after it that take no cell of their own.
qsizetype clusterEnd(QStringView line, qsizetype begin);

} // namespace kareport
