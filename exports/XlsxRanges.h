#pragma once

#include <xlsxwriter.h>

#include <cstddef>
#include <optional>
#include <vector>

namespace kareport
{

/// Keeps which rows of a sheet the rows of a table and of its groups are in, so that a formula can add them up.
class XlsxRanges
{
public:
    /// From the first row to the last one.
    struct Range
    {
        lxw_row_t first = 0;
        lxw_row_t last = 0;
    };

    /// Begins a table.
    void beginTable(std::size_t columns);
    /// What comes next is in another sheet: no formula reaches the rows before.
    void beginSheet();
    /// A row of data. @param level  the first one of groups that begins with it
    void addRow(lxw_row_t row, int level);
    /// A total that is a plain number, which a formula over it would add as well.
    void addValue(std::size_t column, lxw_row_t row) { values_[column].latest = row; }

    /// The rows of the group of a level that ended, or of the table for `ResultRow::noLevel`.
    /// @return nothing where some are in another sheet, or a plain total is among them
    std::optional<Range> of(int level, std::size_t column) const;

private:
    static constexpr lxw_row_t noRow = LXW_ROW_MAX; ///< in another sheet
    struct Values
    {
        lxw_row_t latest = 0;     ///< 0 for none
        lxw_row_t beforeData = 0; ///< the last one that rows of data follow
    };

    lxw_row_t first_ = noRow; ///< of the table
    lxw_row_t last_ = 0;
    std::vector<lxw_row_t> begins_; ///< of the groups, by their levels
    lxw_row_t lastBegin_ = noRow;   ///< of those of all levels after these
    std::vector<Values> values_;    ///< by the columns
    bool hasRows_ = false;
};

} // namespace kareport
