#pragma once

namespace kareport
{

/// Makes the files that are part of the program known: its icon and its guides. To be called before one of them is read.
void initDeskResources();

} // namespace kareport
