#pragma once

#include <QMargins>
#include <QString>

namespace kareport
{

/// Page margins as the profile keeps them: left, top, right, bottom in hundredths of a millimetre, "%d, %d, %d, %d".
QString marginsToText(const QMargins &margins);
/// The margins of such a text. Numbers that are missing leave their margin as it is in `margins`; a piece without a
/// number counts as 0. No range is checked.
QMargins marginsFromText(const QString &text, QMargins margins);

} // namespace kareport
