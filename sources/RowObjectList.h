#pragma once

#include "RowBatches.h"
#include "RowList.h"
#include "RowReader.h"
#include "RowSpool.h"

#include <memory>
#include <optional>
#include <utility>
#include <vector>

namespace kareport
{

/// The rows of a source: it is read once and only a few objects exist at a time. Progress is told as `RowReader::position`.
class RowObjectList : public RowList
{
public:
    /// @param reader  a source whose columns are known; one that has an error already makes an empty list
    RowObjectList(std::unique_ptr<RowReader> reader, ReadProgress progress);
    ~RowObjectList() override;

    /// Going back is possible, but reads the source from its first row again.
    UDataObject *GetAt(std::size_t index) override;
    /// Orders the rows by their sort keys. Those are held, with the places of the rows, which are then read in that order:
    /// from the source, or from a temporary file where the source cannot be read twice.
    void Sort(const std::vector<unsigned> &ids) override;

    std::optional<InputError> error() const override { return error_; }
    std::optional<SourceColumns> columns() const override;
    ValuePlace placeOf(std::size_t index, const QString &variable) override;
    std::vector<InputError> differences() const override;
    /// The source, for what it tells about its columns.
    const RowReader &reader() const { return *reader_; }

private:
    struct Key
    {
        UDataObject values;
        RowPlace place;
    };

    void restart();
    void fill(RowBatch &batch);
    bool seekNext();
    bool readRow(RowBatch &batch, std::size_t &bytes);
    bool readFromSpool(RowBatch &batch, std::size_t &bytes);
    std::optional<InputError> firstError(const std::optional<InputError> &met);
    bool takeBatch();
    void poll();
    bool isToStop(std::size_t position);
    std::vector<Key> keysOfPlaces(const std::vector<unsigned> &ids);
    std::vector<Key> keysOfSpooled(const std::vector<unsigned> &ids);
    bool spoolRows();
    void sortPlaces(const std::vector<Key> &keys, const std::vector<unsigned> &ids);
    std::optional<InputError> endOfRows(const std::optional<InputError> &error) const;

    std::unique_ptr<RowReader> reader_;
    ReadProgress progress_;
    std::unique_ptr<RowSpool> spool_;            ///< the rows of a sorted list that cannot be read twice
    std::optional<std::vector<RowPlace>> order_; ///< of a sorted list
    std::size_t nextOrdered_ = 0;                ///< the row of `order_` that is read next
    const RowBatch *batch_ = nullptr;
    std::size_t batchStart_ = 0;                                ///< index of the batch's first row
    std::vector<std::pair<std::size_t, RowPlace>> batchPlaces_; ///< the first rows of batches and where they are
    std::size_t position_ = 0;                                  ///< where reading had come to with the last batch
    std::optional<InputError> error_;
    bool stopped_ = false;
    std::unique_ptr<RowBatches> batches_; ///< last, so that its thread ends before what it reads goes
};

} // namespace kareport
