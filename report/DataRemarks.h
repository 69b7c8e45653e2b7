#pragma once

#include <QString>
#include <QtGlobal>

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

/// What a column of a table does not show as it is.
struct ColumnRemarks
{
    QString variable;   ///< the name of the variable that the column shows
    quint32 id = 0;     ///< its identifier in the dictionary
    ValueCount tooWide; ///< values wider than the column, which is then wider, or shows "#"
    ValueCount missing; ///< values that are not there and show as 0
};

/// What the table that was written last does not show as it is, by its fields.
struct DataRemarks
{
    std::vector<ColumnRemarks> columns; ///< one for each field of the table, in their order

    /// Counts a value. @param row  from 0
    void add(ValueCount &count, quint64 row)
    {
        if (++count.count == 1) {
            count.firstRow = row + 1;
            hasNew_ = true;
        }
    }
    /// Says which line of the report the row is in that was added last.
    void setLine(qint64 line)
    {
        if (hasNew_) {
            giveLine(line);
        }
    }

private:
    void giveLine(qint64 line)
    {
        for (ColumnRemarks &column : columns) {
            for (ValueCount *count : {&column.tooWide, &column.missing}) {
                count->firstLine = count->count != 0 && count->firstLine == 0 ? line : count->firstLine;
            }
        }
        hasNew_ = false;
    }

    bool hasNew_ = false;
};

} // namespace kareport
