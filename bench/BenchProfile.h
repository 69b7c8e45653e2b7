#pragma once

namespace kareport
{

/// Gives the process a profile in memory, so that no figure depends on the user's settings, and none of them changes.
void useBenchProfile();

} // namespace kareport
