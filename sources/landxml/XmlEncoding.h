#pragma once

#include <string_view>

namespace kareport
{

/// Gives the characters of windows-1252, which the parser has no table of its own for.
/// @param name  of the encoding that a file declares
/// @param map   receives the character of each byte, -1 where it has none
/// @return whether the name is that of the encoding
bool describeWindows1252(std::string_view name, int (&map)[256]);

} // namespace kareport
