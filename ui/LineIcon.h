#pragma once

#include <QIcon>

#include <functional>

class QColor;
class QPainter;

namespace kareport
{

/// Icons are drawn on a sheet of so many units a side.
inline constexpr qreal iconSheet = 16;
inline constexpr qreal iconLineWidth = 1;

/// Draws an icon on such a sheet. The painter's pen has the colour of the text, and it fills nothing.
/// @param accent  a second colour, which shows on the background as well
using DrawIcon = std::function<void(QPainter &painter, const QColor &accent)>;

/// An icon that is drawn as lines in the colour of the text, so that it reads on light and dark at any size and resolution.
QIcon lineIcon(DrawIcon draw);

} // namespace kareport
