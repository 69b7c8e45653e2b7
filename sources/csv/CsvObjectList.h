#pragma once

#include "CsvReader.h"
#include "DataUnits.h"
#include "RowBatches.h"
#include "RowList.h"
#include "ValueParser.h"

#include <memory>
#include <optional>

namespace kareport
{

/// The rows of a CSV file: the file is read once and only a few objects exist at a time. Progress is told in bytes.
class CsvObjectList : public RowList
{
public:
    /// Reads the header row. Columns that the dictionary does not know are passed over.
    CsvObjectList(std::shared_ptr<const FileBytes> file, char delimiter, const FindVariable &findVariable,
                  ReadProgress progress);

    /// Going back is possible, but reads the file from its first row again.
    UDataObject *GetAt(std::size_t index) override;
    /// Reads the sort keys of all rows and orders the places of the rows; they are then read in that order.
    void Sort(const std::vector<unsigned> &ids) override;

    std::optional<InputError> error() const override { return error_; }

private:
    struct Column
    {
        QString name;
        std::optional<ValueParser> parser;
    };
    struct RowPlace
    {
        std::size_t start;
        qsizetype line;
    };

    void readHeader(const FindVariable &findVariable);
    void noteSharedIds();
    bool isShared(unsigned id) const;
    void rewind();
    void fill(RowBatch &batch);
    bool seekNext();
    bool readRow(RowBatch &batch);
    bool takeBatch();
    std::optional<InputError> endOfRows(const std::optional<InputError> &error) const;
    std::optional<InputError> storeCells(UDataObject &object, const std::vector<unsigned> *onlyIds) const;

    std::shared_ptr<const FileBytes> file_;
    CsvReader reader_;
    ReadProgress progress_;
    std::vector<Column> columns_;
    std::vector<unsigned> sharedIds_; ///< identifiers that several columns have
    RowPlace firstRow_{};
    std::optional<std::vector<RowPlace>> order_; ///< of a sorted list
    std::size_t nextOrdered_ = 0;                ///< the row of `order_` that is read next
    const RowBatch *batch_ = nullptr;
    std::size_t batchStart_ = 0; ///< index of the batch's first row
    std::optional<InputError> error_;
    bool stopped_ = false;
    std::unique_ptr<RowBatches> batches_; ///< last, so that its thread ends before what it reads goes
};

} // namespace kareport
