#pragma once

#include <QColor>

namespace kareport
{

/// The least contrast of a text on its background, and of a shape that means something, by the guidelines for accessible
/// content (level AA).
inline constexpr qreal leastTextContrast = 4.5;
inline constexpr qreal leastShapeContrast = 3;

/// The contrast of two colours by the same guidelines: from 1 to 21.
qreal contrast(const QColor &a, const QColor &b);

} // namespace kareport
