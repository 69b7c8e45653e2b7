#pragma once

#include <QMargins>
#include <QString>

#include <optional>

namespace kareport
{

/// Page margins as the profile keeps them: left, top, right, bottom in hundredths of a millimetre, "%d, %d, %d, %d".
QString marginsToText(const QMargins &margins);
/// The margins of such a text. Numbers that are missing leave their margin as it is in `margins`; a piece without a
/// number counts as 0. No range is checked.
QMargins marginsFromText(const QString &text, QMargins margins);

/// The margins that the profile keeps for all reports; nothing when it keeps none.
/// @param missing  the margins whose numbers the profile's text lacks
std::optional<QMargins> profileMargins(const QMargins &missing);
/// Keeps margins in the profile.
void setProfileMargins(const QMargins &margins);

} // namespace kareport
