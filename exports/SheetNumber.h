#pragma once

#include "ResultOptions.h"
#include "ResultSink.h"

#include <optional>
#include <string>

namespace kareport
{

/// A number of a spreadsheet with the format that shows it as the report does.
struct SheetNumber
{
    double value = 0;
    std::string format; ///< a number format; empty for that of the column
};

/// The number format of a column of numbers, such as 0.000, 0+000.000 or 0.000"R";0.000"L";0.000.
std::string sheetFormat(const ResultColumn &column, const UJobSettings &settings);

/// What a cell of a column of numbers is in a spreadsheet: the number that is printed or, with `ResultValues::Exact`, the
/// one that it was rounded from. Nothing for what is missing, and where the report shows no number.
std::optional<SheetNumber> sheetNumber(const ResultColumn &column, const ResultCell &cell, const UJobSettings &settings,
                                       ResultValues values);

/// The number of a cell that the report leaves blank, with a format that shows nothing. Nothing for what is missing.
std::optional<SheetNumber> blankNumber(const ResultColumn &column, const ResultCell &cell,
                                       const UJobSettings &settings);

} // namespace kareport
