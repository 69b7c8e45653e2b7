#pragma once

#include "ColumnTotal.h"
#include "TableGroups.h"

#include <cstddef>
#include <vector>

namespace kareport
{

/// What a list of rows is as well whose table has groups or totals.
class GroupedList
{
public:
    GroupedList() = default;
    virtual ~GroupedList();
    GroupedList(const GroupedList &) = delete;
    GroupedList &operator=(const GroupedList &) = delete;

    virtual const TableGroups &groups() const = 0;
    /// The outermost level that a new group of begins with the row that was asked for last; the number of levels for none.
    virtual std::size_t firstNewLevel() const = 0;
    /// Is told, when the table was written, which values are in no total. @param variables  as `TableGroups::variables`
    virtual void noteLeftOut(std::vector<LeftOut> variables) = 0;
};

} // namespace kareport
