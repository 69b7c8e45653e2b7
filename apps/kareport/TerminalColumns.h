#pragma once

namespace kareport
{

/// The columns of the terminal that standard error goes to; 0 when it goes to none.
int terminalColumns();

} // namespace kareport
