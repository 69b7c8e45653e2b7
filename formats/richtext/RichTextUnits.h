#pragma once

namespace kareport
{

/// Measures of a QTextDocument are pixels of which 96 are an inch, those of rich text twips of which 1440 are one.
constexpr int twipsPerPixel = 15;
/// Line spacing that is a multiple counts single lines in these.
constexpr int spacingOfOneLine = 240;

} // namespace kareport
