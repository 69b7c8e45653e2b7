#pragma once

#include <QtGlobal>

namespace kareport
{

/// The smallest type, in points, that a page is set in to have room on a sheet.
inline constexpr double smallestType = 5;

/// A page of text at its own type size. Lengths are in any one unit.
struct PageText
{
    double points = 0; ///< the type size
    qint64 rows = 0;
    double rowHeight = 0;
    double widestRow = 0;
};

/// What a sheet gives to text, in the same unit.
struct SheetRoom
{
    double width = 0;
    double height = 0;
};

/// How a page of text is placed on sheets.
struct PageFit
{
    double points = 0;       ///< the type size
    qint64 pieces = 1;       ///< the sheets that its rows take
    bool breaksRows = false; ///< whether a row is still wider than the sheet
};

/// Fits a page on a sheet: in its own type size, or in the smaller one that has room for all of its rows and for the widest
/// of them, but not below `smallestType`. The rest continues on further sheets. Type that is smaller already stays
/// as it is.
PageFit fitPage(const PageText &text, const SheetRoom &room);

} // namespace kareport
