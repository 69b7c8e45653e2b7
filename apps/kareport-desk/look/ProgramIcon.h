#pragma once

#include <QIcon>
#include <QImage>

class QPainter;
class QRectF;

namespace kareport
{

/// The sizes in which desktops look for the icon of a program, in pixels a side.
inline constexpr int programIconSizes[] = {16, 22, 24, 32, 48, 64, 128, 256, 512};

/// Draws the program's icon into a square.
void drawProgramIcon(QPainter &painter, const QRectF &square);
/// The program's icon as a picture. @param size  pixels a side
QImage programPicture(int size);
/// The program's icon: that of the user's theme where it has one, else as it is drawn here.
QIcon programIcon();

} // namespace kareport
