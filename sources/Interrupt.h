#pragma once

namespace kareport
{

/// Whether running work has been asked to stop. It looks now and then, and stops at the next safe point. From any thread.
bool isInterrupted();
/// Asks running work to stop, or lets new work run. A signal's handler may call it.
void setInterrupted(bool isSet);

} // namespace kareport
