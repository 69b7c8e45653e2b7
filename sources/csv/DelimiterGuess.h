#pragma once

#include "CsvDialect.h"
#include "FileBytes.h"
#include "InputError.h"

#include <memory>

namespace kareport
{

/// Finds out what the cells of a file are delimited by: a comma, a semicolon, a tab, a vertical bar, or blanks and tabs.
/// A reading is possible when the first rows have the same number of cells, two at least, and what is read from them fits
/// its types. One that knows some of the variables of another, and no other ones, is none; and readings that give the same
/// cells are one, as with tabs and with blanks and tabs.
/// @return the dialect with its delimiter; an error when no reading is possible, or when several are, which it names
Expected<CsvDialect> guessDelimiter(const std::shared_ptr<const FileBytes> &file, const CsvDialect &dialect,
                                    const Variables &variables);

} // namespace kareport
