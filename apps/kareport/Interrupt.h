#pragma once

namespace kareport
{

/// Lets an interrupt from the keyboard, or a request to end, stop the work at the next safe point instead of at once.
void catchInterrupts();
bool isInterrupted();
/// Asks running work to stop, or lets new work run.
void setInterrupted(bool isSet);

} // namespace kareport
