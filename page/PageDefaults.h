#pragma once

#include <QMargins>
#include <QStringView>

namespace kareport
{

// What a report is laid out with for which nothing else was chosen or measured.

/// The margins of a page in hundredths of a millimetre.
inline constexpr QMargins defaultMargins(1000, 1000, 1200, 2000);
/// The lines of a page between the margins.
inline constexpr int defaultLinesPerPage = 72;
/// The characters of a line between the margins.
inline constexpr int defaultCharsPerRow = 80;
/// The face that a page is measured with and printed in.
inline constexpr QStringView defaultFace = u"Lucida Console";
/// The size of the face in points.
inline constexpr unsigned defaultFontSize = 8;

} // namespace kareport
