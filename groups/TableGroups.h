#pragma once

#include "CellDecimal.h"
#include "ExactDecimal.h"
#include "sXmlReportField.h"

#include <QString>

#include <cstddef>
#include <vector>

namespace kareport
{

/// What a total says of the values of a variable.
enum class TotalKind
{
    Sum,
    Mean,
    Least,
    Greatest,
    Count ///< of the values that are there
};

/// A variable that totals are made of.
struct TotalledVariable
{
    sXmlReportField field; ///< of the table where it has one, else one of the dictionary's variable
    QString suffix;        ///< that a marker before its column gives an offset
    CellReader reader;     ///< of its values
    UnitRatio ratio;       ///< from what the reader counts to the unit that is shown
    bool isNumber = false; ///< a value that is missing is noted
};

/// A total of one of the variables.
struct TotalCell
{
    std::size_t variable = 0; ///< index of a `TotalledVariable`
    TotalKind kind = TotalKind::Sum;
};

/// A text with values of a group in it.
struct GroupText
{
    struct Piece
    {
        enum class Kind
        {
            Text,
            Value, ///< of a variable that the group or one around it is made by
            Rows,  ///< how many rows the group has
            Total
        };
        Kind kind = Kind::Text;
        QString text;
        sXmlReportField field; ///< of the value
        QString suffix;        ///< that a marker before its column gives an offset
        TotalCell total;
    };
    std::vector<Piece> pieces;

    /// Whether it is known after the last row of the group only.
    bool needsRows() const
    {
        for (const Piece &piece : pieces) {
            if (piece.kind == Piece::Kind::Rows || piece.kind == Piece::Kind::Total) {
                return true;
            }
        }
        return false;
    }
};

/// A line of totals, each in the column of its variable.
struct TotalLine
{
    GroupText label;
    std::vector<TotalCell> cells;
};

/// Rows that have the same values of some variables and come one after the other.
struct GroupLevel
{
    std::vector<quint32> ids; ///< of the variables
    bool hasHeading = false;
    GroupText heading;
    std::vector<TotalLine> totals;
    int before = 0;       ///< blank lines before the group, but at the top of a page
    int keep = 1;         ///< rows that stay on the page of the heading, from 1
    bool newPage = false; ///< whether the group begins a page
};

/// The groups and totals of a table.
struct TableGroups
{
    std::vector<TotalledVariable> variables;
    std::vector<GroupLevel> levels; ///< the outermost first
    std::vector<TotalLine> pageTotals;
    std::vector<TotalLine> tableTotals;
    bool addsPrinted = false; ///< whether the digits that are printed are added

    bool isEmpty() const { return levels.empty() && pageTotals.empty() && tableTotals.empty(); }
};

} // namespace kareport
