#pragma once

namespace kareport
{

/// Tells the processor that the wide vector registers are not needed any more.
///
/// The C library copies memory with the widest registers that there are and, where these are 512 bits wide, leaves them
/// marked as in use. On some processors every calculation with floating-point numbers then pays about 20 ns to go around
/// them: five times what formatting a coordinate takes. Where many values are to be read or formatted, this is called before
/// each row of them. It takes less than a nanosecond, and does nothing on processors without such registers.
void endWideVectors();

} // namespace kareport
