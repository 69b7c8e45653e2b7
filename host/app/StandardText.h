#pragma once

#include <QString>

namespace kareport
{

/// Numbers of the texts that every host has.
inline constexpr unsigned allFilesTitle = 61442;
inline constexpr unsigned fileTooLarge = 61701;

/// A standard text by its number, in the current language; empty for a number that is not known.
QString standardText(unsigned number);

/// Why something was not done when memory has ended, as the end of a sentence; empty when there is none for that either.
QString noMemoryText();

} // namespace kareport
