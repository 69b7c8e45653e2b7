#pragma once

#include "DecimalSum.h"

#include <QtGlobal>

namespace kareport
{

/// What is added up of a variable over some rows.
struct ColumnTotal
{
    DecimalSum sum;    ///< in the data's unit, or of the digits that are printed
    quint64 count = 0; ///< values that are in it
    double least = 0;  ///< internal; only where there are values
    double greatest = 0;

    void add(double value, const CellDecimal &number)
    {
        sum.add(number);
        addRange(value, value, 1);
    }
    /// Counts a value that is not a number.
    void addText() { ++count; }
    /// Adds what was added up of other rows.
    void add(const ColumnTotal &other);
    void clear();
    /// Takes a range of values in.
    void addRange(double lowest, double highest, quint64 values)
    {
        least = count == 0 || lowest < least ? lowest : least;
        greatest = count == 0 || highest > greatest ? highest : greatest;
        count += values;
    }
};

/// What is wrong with the values of a variable that are in no total.
struct LeftOut
{
    quint64 missing = 0;
    quint64 firstMissing = 0; ///< row of the table, from 1
    quint64 notFinite = 0;
    quint64 firstNotFinite = 0;

    /// Counts a value. @param row  of the table, from 1
    void add(bool isMissing, quint64 row)
    {
        quint64 &count = isMissing ? missing : notFinite;
        quint64 &first = isMissing ? firstMissing : firstNotFinite;
        first = count == 0 ? row : first;
        ++count;
    }
};

} // namespace kareport
