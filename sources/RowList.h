#pragma once

#include "InputError.h"
#include "UDataObjectList.h"

#include <cstddef>
#include <functional>
#include <optional>

namespace kareport
{

/// Is told now and then how far reading has come, in the unit that the source counts in. @return false to stop
using ReadProgress = std::function<bool(std::size_t done)>;

/// The rows of a data source as data objects, made while they are asked for in turn. When something is wrong with a row, or
/// reading is stopped, the list ends there.
class RowList : public UDataObjectList
{
public:
    /// What is wrong with the source or with the row after the last one; nothing when the rows are all good, or reading was
    /// stopped. Asked when the list has been made, when it has been sorted and when it has come to its end.
    virtual std::optional<InputError> error() const = 0;
};

} // namespace kareport
