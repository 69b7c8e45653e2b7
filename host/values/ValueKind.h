#pragma once

namespace kareport
{

/// What the untyped value of a data object points to. The numbers are those that hosts hand to
/// `UReportDoc::FormatXmlStringToDisplay`; any other number means no value.
enum class ValueKind : int
{
    None = 0,
    Boolean = 1, ///< a byte that is 0 or not
    Int16 = 2,
    Int32 = 4,
    Double = 8, ///< in internal units
    Text = 16,  ///< a QString
    PointNumber = 32
};

} // namespace kareport
