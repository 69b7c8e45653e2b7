#pragma once

#include "WidestText.h"

#include <QString>
#include <QtGlobal>

#include <array>
#include <utility>
#include <vector>

namespace kareport
{

/// How many values of a column there are of some sort, and where the first one is.
struct ValueCount
{
    quint64 count = 0;    ///< of the values; 0 when there is none
    quint64 firstRow = 0; ///< of the table, from 1, in the order that it is written in
    qint64 firstLine = 0; ///< of the report, from 1
};

// Keeps a function that is called for remarks alone one of its own: the benchmarks count its instructions by its name.
#ifdef KAREPORT_COUNTS_REMARKS
#define KA_REMARK [[gnu::noinline]]
#else
#define KA_REMARK
#endif

/// What a column of a table, or a line of a block, does not show as it is.
struct ColumnRemarks
{
    QString variable;          ///< the name of the variable that the column shows
    ValueCount tooWide;        ///< values wider than the column, which is then wider, or shows "#"
    ValueCount missing;        ///< values that are not there and show as 0
    ValueCount blank;          ///< numbers that are not there and show as blanks, as asked for
    ValueCount unwritten;      ///< numbers that are not there, so that the lines of a block that show them are left out
    bool isBlankAsked = false; ///< such numbers were not to show, as blanks are asked for
    ValueCount notFinite;      ///< values that are infinite or not-a-number
    ValueCount wideTotals;     ///< totals wider than the column, with the last row above them
    quint64 wideZeros = 0;     ///< how many of the missing values show as a 0 that is wider than the column
    WidestText widest;         ///< the widest value, where it is asked for
    quint64 widestRow = 0;     ///< of the table, from 1; 0 for none
    qint64 widestLine = 0;     ///< of the report, from 1

    /// All counts of it.
    std::array<ValueCount *, 5> counts() { return {&tooWide, &missing, &blank, &notFinite, &wideTotals}; }
};

/// What the table or block that was written last does not show as it is, by its fields.
struct DataRemarks
{
    std::vector<ColumnRemarks> columns; ///< one for each field, in their order
    quint64 rows = 0;                   ///< how many were written
    bool measures = false;              ///< whether the widest value of each column is asked for

    /// Counts a value. @param row  from 0
    void add(ValueCount &count, quint64 row)
    {
        if (++count.count == 1) {
            count.firstRow = row + 1;
            hasNew_ = true;
        }
    }
    /// Says that the widest value of a column is in a row. @param row  from 0
    void addWidest(ColumnRemarks &column, quint64 row)
    {
        column.widestRow = row + 1;
        column.widestLine = 0;
        hasNew_ = true;
    }
    /// Says which line of the report the row is in that was added last.
    void setLine(qint64 line)
    {
        if (hasNew_) {
            giveLine(line);
        }
    }
    /// Whether `setLine` is waited for; it is not any more then, and `setLineOf` may come after other rows.
    bool takeNew() { return std::exchange(hasNew_, false); }
    /// Says which line of the report a row is in. @param row  from 1
    void setLineOf(quint64 row, qint64 line)
    {
        for (ColumnRemarks &column : columns) {
            for (ValueCount *count : column.counts()) {
                count->firstLine = count->firstRow == row && count->firstLine == 0 ? line : count->firstLine;
            }
            column.widestLine = column.widestRow == row && column.widestLine == 0 ? line : column.widestLine;
        }
    }

    /// Gives a line to everything that has none.
    void setMissingLines(qint64 line)
    {
        hasNew_ = true;
        setLine(line);
    }

private:
    void giveLine(qint64 line)
    {
        for (ColumnRemarks &column : columns) {
            for (ValueCount *count : column.counts()) {
                count->firstLine = count->count != 0 && count->firstLine == 0 ? line : count->firstLine;
            }
            column.widestLine = column.widestRow != 0 && column.widestLine == 0 ? line : column.widestLine;
        }
        hasNew_ = false;
    }

    bool hasNew_ = false;
};

} // namespace kareport
