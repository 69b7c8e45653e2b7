#pragma once

#include <QFont>
#include <QString>
#include <QStringList>

namespace kareport
{

/// The most characters that the name of a face has on a printer.
inline constexpr qsizetype longestFaceName = 31;

/// The faces that replace a fixed-pitch face that is not installed, the nearest first. The system would take a
/// proportional one. Where a page is measured, shown, printed and saved as a PDF the same one has to replace it, or lines and
/// pages would not agree.
const QStringList &substituteFaces();

/// A font of a fixed pitch, upright and of normal weight whatever the application's own font is.
/// @param face  the face that is wanted; `substituteFaces` follow it
QFont fixedPitchFont(const QString &face);

/// Has the system take a fixed-pitch face, and `substituteFaces` after those that a font names.
void setFixedPitch(QFont &font);

} // namespace kareport
