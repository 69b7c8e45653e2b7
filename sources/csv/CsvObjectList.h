#pragma once

#include "CsvDialect.h"
#include "FileBytes.h"
#include "RowObjectList.h"

#include <memory>

namespace kareport
{

/// The rows of a text file of rows and cells as data objects.
class CsvObjectList : public RowObjectList
{
public:
    /// Reads the header row of a file that follows RFC 4180 but for its delimiter. Columns that the dictionary does not know
    /// are skipped.
    CsvObjectList(std::shared_ptr<const FileBytes> file, char delimiter, const FindVariable &findVariable,
                  ReadProgress progress);
    /// Reads what comes before the rows of a file of any dialect.
    CsvObjectList(const std::shared_ptr<const FileBytes> &file, const CsvDialect &dialect, const Variables &variables,
                  const ReadProgress &progress);
};

} // namespace kareport
