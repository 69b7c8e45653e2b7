#pragma once

#include <QMargins>
#include <QRect>
#include <QSize>

namespace kareport
{

inline constexpr int twipsPerInch = 1440;

/// A length in hundredths of a millimetre as twips, rounded.
int twipsOfHundredths(int hundredths);
QMargins twipsOfHundredths(const QMargins &margins);
/// A sheet in printer dots as twips, cut off. (0, 0) for a sheet that has not been measured, with a resolution of 0.
QSize twipsOfDots(const QSize &sheet, unsigned resolution);
/// A length in millimetres as twips, rounded.
int twipsOfMillimetres(qreal millimetres);

/// How many pages a print job is expected to have before it is laid out, by the lines that were written: what the print
/// dialog begins with. `reportPages`, and the sheets of the job, give the real number.
/// @return 0 for a page without lines, and a number below 0 where the page has fewer than none: there is then no page either
int expectedPages(int lines, int linesPerPage);

/// What the margins leave of a sheet; a width or height below 0 where they leave nothing.
QRect printableRect(const QSize &sheet, const QMargins &margins);
/// Whether the margins leave room for text: a square of 10 mm at least. Sheet and margins in twips.
bool leavesRoom(const QSize &sheet, const QMargins &margins);

} // namespace kareport
