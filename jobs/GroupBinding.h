#pragma once

#include "TableGroups.h"
#include "TableShape.h"
#include "VariableLookup.h"

#include <vector>

namespace kareport
{

/// Looks up what the groups and totals of a table step name.
class GroupBinding
{
public:
    explicit GroupBinding(VariableLookup &lookup) : lookup_(lookup) {}

    /// @param sortIds  the sort keys of the rows: those of the groups must come first
    TableGroups bind(const TableShape &shape, const std::vector<unsigned> &sortIds);

private:
    void bindLevels(const TableShape &shape);
    void checkSort(const TableShape &shape, const std::vector<unsigned> &sortIds);
    TotalCell total(TotalKind kind, const TableShape::Name &name);
    std::vector<TotalLine> lines(const std::vector<TableShape::TotalLine> &lines, const std::vector<FoundVariable> &by);
    GroupText text(const TableShape::Name &name, const std::vector<FoundVariable> &by);

    VariableLookup &lookup_;
    TableGroups groups_;
    std::vector<FoundVariable> by_; ///< of all levels
};

} // namespace kareport
