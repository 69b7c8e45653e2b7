#pragma once

#include <QRect>

class QPainter;

namespace kareport
{

/// Draws the edges of a rectangle in twips, and a numbered line for each row of text between them. Nothing where the
/// painter does not paint.
void drawMargins(QPainter &painter, const QRect &twips);

} // namespace kareport
