#pragma once

#include "SpooledBytes.h"
#include "UDataObject.h"

#include <QString>

#include <cstddef>
#include <vector>

namespace kareport
{

/// Keeps the values of rows, many of them in a temporary file, so that rows that cannot be read twice are read in any
/// order and memory does not grow with them.
class RowSpool
{
public:
    /// @param ids  the identifiers whose values are kept
    explicit RowSpool(std::vector<unsigned> ids) : ids_(std::move(ids)) {}

    /// Adds a row. @return whether it is kept; `wrong` says why not
    bool add(const UDataObject &object);
    /// Ends the adding, before the first row is read. @return whether all rows are kept
    bool finish() { return bytes_.finish(); }
    /// Reads the row at a place into an object, which may hold the values of an earlier row. The first row is at 0.
    /// @return where the row after it is
    std::size_t read(std::size_t place, UDataObject &object) const;
    /// Where the last row ends.
    std::size_t end() const { return bytes_.size(); }
    /// What is wrong with the file.
    QString wrong() const { return bytes_.wrong(); }

private:
    std::vector<unsigned> ids_;
    SpooledBytes bytes_;
};

} // namespace kareport
