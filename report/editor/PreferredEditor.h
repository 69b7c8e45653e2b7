#pragma once

#include <QString>

namespace kareport
{

/// The path of the user's editor as it is entered; empty while the user does not want one. Nothing is kept: the user may
/// change the preferences, or install the editor, at any time.
QString preferredEditor();

/// The path of the user's editor; empty when it is not wanted or not installed.
QString availableEditor();

} // namespace kareport
