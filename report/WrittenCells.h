#pragma once

#include <QString>
#include <QtGlobal>

#include <vector>

namespace kareport
{

/// A piece of a report's text that shows a field of a table or of a block.
struct WrittenCell
{
    qint64 at = 0;        ///< its first character, from 0
    qsizetype size = 0;   ///< with the blanks that fill the column; of a block's line, with the label
    int record = 0;       ///< index of the table or block
    int field = 0;        ///< index of the field in it
    bool isLabel = false; ///< the label in the heading of a table, and not a value
};

/// Where a report shows the fields of its tables and blocks, noted while it is written.
class WrittenCells
{
public:
    /// A table or a block that was written.
    struct Record
    {
        bool isTable = false;
        QString name;
        std::vector<QString> variables; ///< that the fields name, in the order that they are shown in
    };

    /// Begins a table or a block: the cells that follow are its. @return its index
    int begin(Record record)
    {
        records_.push_back(std::move(record));
        return static_cast<int>(records_.size()) - 1;
    }
    void add(const WrittenCell &cell) { cells_.push_back(cell); }
    /// The text that the cells are in is gone.
    void clear() { cells_.clear(); }

    const std::vector<Record> &records() const { return records_; }
    /// In no particular order.
    const std::vector<WrittenCell> &cells() const { return cells_; }

private:
    std::vector<Record> records_;
    std::vector<WrittenCell> cells_;
};

} // namespace kareport
