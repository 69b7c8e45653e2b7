#pragma once

#include <QString>

namespace kareport
{

/// Numbers of the texts that every host has.
inline constexpr unsigned allFilesTitle = 61442;
inline constexpr unsigned fileTooLarge = 61701;

/// A standard text by its number, in the current language; empty for a number that is not known.
QString standardText(unsigned number);

} // namespace kareport
