#pragma once

#include "CellDecimal.h"
#include "ColumnTotal.h"
#include "DecimalSum.h"
#include "UDataObject.h"

#include <optional>

namespace kareport
{

/// A variable of a row that depends on the rows before it.
class RunningValue
{
public:
    enum class Kind
    {
        Sum,        ///< of the values so far; one that is missing or not finite adds nothing
        Difference, ///< to the row before; the first row has none
        RowNumber
    };
    struct Target
    {
        quint32 id = 0;
        int type = 0;
    };
    /// @param source   whose values are added or subtracted; not of `RowNumber`
    /// @param reader   of the source's values
    /// @param perGroup whether it begins again with each group
    RunningValue(Kind kind, quint32 source, const CellReader &reader, Target target, bool perGroup)
        : kind_(kind), source_(source), reader_(reader), target_(target), perGroup_(perGroup)
    {}

    /// Begins again with the first row.
    void restart();
    /// Gives the next row its value. @param row  of the table, from 1
    void setValue(UDataObject &object, bool beginsGroup, quint64 row);
    /// The values that are in no sum.
    const LeftOut &leftOut() const { return leftOut_; }
    quint32 source() const { return source_; }

private:
    void begin();
    void setSum(UDataObject &object, quint64 row);
    void setDifference(UDataObject &object);
    void setRowNumber(UDataObject &object);

    Kind kind_;
    quint32 source_;
    CellReader reader_;
    Target target_;
    bool perGroup_;
    DecimalSum sum_;
    std::optional<double> before_;
    quint64 row_ = 0;
    LeftOut leftOut_;
};

} // namespace kareport
