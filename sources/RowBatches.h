#pragma once

#include "InputError.h"
#include "RowReader.h"
#include "UDataObject.h"

#include <array>
#include <cstddef>
#include <functional>
#include <optional>
#include <semaphore>
#include <thread>
#include <vector>

namespace kareport
{

/// Rows that were read one after the other. The objects are kept and refilled from batch to batch.
struct RowBatch
{
    static constexpr std::size_t most = 2048;
    static constexpr std::size_t mostBytes = std::size_t(1) << 20; ///< of the file, and one row more

    std::vector<UDataObject> objects; ///< as many as were ever in use
    std::size_t count = 0;            ///< objects in use
    bool isLast = false;              ///< no row follows, or none that can be read
    std::optional<InputError> error;  ///< what is wrong with the row after the last
    std::size_t position = 0;         ///< where reading has come to in the file
    RowPlace first;                   ///< where the first row is, of a source that can seek

    /// The object after those in use.
    UDataObject &next()
    {
        if (count == objects.size()) {
            objects.emplace_back();
        }
        return objects[count];
    }
};

/// Reads batches of rows ahead of their use: while one batch is used, the next is read on another thread. The
/// first one is read by the thread that asks for it: a file of a few rows needs no thread. Where a row may be long in coming, all
/// are read on the other thread, and the asking thread looks now and then whether work is to stop.
class RowBatches
{
public:
    /// @param fill  reads the next rows into a batch. It is called on a thread of its own but for the first batch, never
    ///              twice at a time, and not any more after the last batch
    /// @param poll  when there is one, it is called a few times a second while a batch is waited for, by the thread that waits; all
    ///              batches are then read on the other thread
    explicit RowBatches(std::function<void(RowBatch &)> fill, std::function<void()> poll = nullptr);
    ~RowBatches();
    RowBatches(const RowBatches &) = delete;
    RowBatches &operator=(const RowBatches &) = delete;

    /// The next batch, valid until the next call; not to be called after the last one.
    const RowBatch &next();

private:
    void fill(RowBatch &batch);
    void readAhead(const std::stop_token &stop, std::size_t next);
    bool startThread(std::size_t next);
    void waitForBatch();

    std::function<void(RowBatch &)> fill_;
    std::function<void()> poll_;
    InputError noMemory_; ///< made while there is memory: copying it takes none
    std::array<RowBatch, 2> batches_;
    std::size_t used_ = 1;               ///< the batch that was handed out last
    bool isAlone_ = false;               ///< no thread could be started
    std::counting_semaphore<3> free_{1}; // of the batches, and one that lets the thread go at the end
    std::counting_semaphore<2> ready_{0};
    std::jthread thread_;
};

} // namespace kareport
