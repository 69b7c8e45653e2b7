#pragma once

#include <QColor>
#include <QPalette>

class QWidget;

namespace kareport
{

/// A colour of text that shows on a background: the given one where its contrast is enough, else made darker or lighter
/// until it is.
QColor readableOn(const QColor &text, const QColor &background);

/// A palette in which every text has enough contrast on what it is written on. Colours that have it already stay.
QPalette readablePalette(const QPalette &palette);

/// The colour of less important texts, such as captions and places of files.
QColor quietColor(const QPalette &palette, QPalette::ColorRole background = QPalette::Window);

/// Makes a widget's text quiet. @param background  what it is drawn on
void makeQuiet(QWidget &widget, QPalette::ColorRole background = QPalette::Window);
/// Gives a widget the one size of type that captions have.
void makeCaption(QWidget &widget);

} // namespace kareport
