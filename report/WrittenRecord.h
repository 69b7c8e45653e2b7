#pragma once

#include "DataRemarks.h"
#include "WrittenCells.h"

#include <QString>

#include <cstddef>

// What is noted of a table or a block while it is written.

namespace kareport
{

/// Remarks without any yet, which ask for what the earlier ones do.
/// @param record  a table or a block
template <typename Record>
DataRemarks remarksFor(const Record &record, const DataRemarks &earlier)
{
    DataRemarks remarks;
    remarks.measures = earlier.measures;
    remarks.columns.resize(static_cast<std::size_t>(record.GetFieldsCount()));
    for (int i = 0; i < record.GetFieldsCount(); ++i) {
        remarks.columns[static_cast<std::size_t>(i)].variable = record.GetField(i).VariableName;
    }
    return remarks;
}

/// What cells say of the table or block that they are in.
template <typename Record>
WrittenCells::Record cellRecord(const Record &record, bool isTable, const QString &name)
{
    WrittenCells::Record of{isTable, name, {}};
    for (int i = 0; i < record.GetFieldsCount(); ++i) {
        of.variables.push_back(record.GetField(i).VariableName);
    }
    return of;
}

} // namespace kareport
