#pragma once

#include <array>

namespace kareport
{

/// The characters of the bytes from 0x80 to 0x9F in the code page 1252; 0 where it has none. The other bytes are as in
/// Latin-1. A table of our own, as there are systems without converters.
inline constexpr std::array<char16_t, 32> windows1252 = {
    0x20AC, 0,      0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021, 0x02C6, 0x2030, 0x0160,
    0x2039, 0x0152, 0,      0x017D, 0,      0,      0x2018, 0x2019, 0x201C, 0x201D, 0x2022,
    0x2013, 0x2014, 0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, 0,      0x017E, 0x0178};

} // namespace kareport
