#pragma once

namespace kareport
{

/// Whether there is a screen to show a window on.
bool hasDisplay();
/// What Qt measures fonts with in a program that shows nothing, as QT_QPA_PLATFORM takes it.
const char *platformWithoutWindows();

} // namespace kareport
