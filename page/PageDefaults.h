#pragma once

#include <QMargins>
#include <QStringView>

namespace kareport
{

// What a report is laid out with for which nobody has chosen or measured anything else.

/// Hundredths of a millimetre.
inline constexpr QMargins defaultMargins(1000, 1000, 1200, 2000);
inline constexpr int defaultLinesPerPage = 72;
inline constexpr int defaultCharsPerRow = 80;
inline constexpr QStringView defaultFace = u"Lucida Console";
inline constexpr unsigned defaultFontSize = 8; ///< points

} // namespace kareport
