#pragma once

namespace kareport
{

// What lengths on a page are converted by.

inline constexpr int pointsPerInch = 72;
/// Hundredths of a millimetre, in which margins are kept.
inline constexpr int hundredthsPerInch = 2540;
inline constexpr double millimetresPerInch = 25.4;
inline constexpr double metresPerInch = 0.0254;

} // namespace kareport
