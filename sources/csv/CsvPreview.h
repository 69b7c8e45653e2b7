#pragma once

#include "CsvDialect.h"
#include "DataPreview.h"
#include "FileBytes.h"

#include <memory>

namespace kareport
{

/// Reads the first rows of a text file as `CsvObjectList` does, cell by cell.
/// @param file  or the beginning of one
DataPreview previewCsv(const std::shared_ptr<const FileBytes> &file, const CsvDialect &dialect,
                       const Variables &variables, int mostRows);

/// The cells of the first rows of a file whose delimiter is known, as far as they can be read.
std::vector<std::vector<QString>> firstCells(const FileBytes &utf8, const CsvDialect &dialect, int mostRows);

} // namespace kareport
