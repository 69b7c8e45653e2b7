#include "RowBatches.h"

#include "StandardText.h"

#include <chrono>
#include <new>
#include <system_error>

namespace kareport
{

namespace
{

constexpr std::chrono::milliseconds pollTime(50);

} // namespace

RowBatches::RowBatches(std::function<void(RowBatch &)> fill, std::function<void()> poll)
    : fill_(std::move(fill)), poll_(std::move(poll)), noMemory_{QString(), std::nullopt, noMemoryText()}
{}

RowBatches::~RowBatches()
{
    thread_.request_stop();
    free_.release();
}

void RowBatches::fill(RowBatch &batch)
{
    batch.count = 0;
    try {
        fill_(batch);
    } catch (const std::bad_alloc &) {
        batch.error = noMemory_;
        batch.isLast = true;
    }
}

/// Fills the batches in turn, beginning with one, as they become free.
void RowBatches::readAhead(const std::stop_token &stop, std::size_t next)
{
    for (;; next = 1 - next) {
        free_.acquire();
        if (stop.stop_requested()) {
            return;
        }
        fill(batches_[next]);
        const bool isLast = batches_[next].isLast;
        ready_.release();
        if (isLast) {
            return;
        }
    }
}

/// Has the batches read on another thread, beginning with one. @return whether there is one
bool RowBatches::startThread(std::size_t next)
{
    try {
        thread_ = std::jthread([this, next](const std::stop_token &stop) { readAhead(stop, next); });
    } catch (const std::system_error &) {
        isAlone_ = true; // the user has as many threads as are allowed: then without one
    } catch (const std::bad_alloc &) {
        isAlone_ = true;
    }
    return !isAlone_;
}

void RowBatches::waitForBatch()
{
    if (!poll_) {
        ready_.acquire();
        return;
    }
    while (!ready_.try_acquire_for(pollTime)) {
        poll_();
    }
}

const RowBatch &RowBatches::next()
{
    used_ = 1 - used_;
    RowBatch &batch = batches_[used_];
    if (thread_.joinable()) {
        free_.release();
        waitForBatch();
        return batch;
    }
    if (poll_ && !isAlone_ && startThread(used_)) {
        free_.release(); // the other batch
        waitForBatch();
        return batch;
    }
    fill(batch);
    if (!batch.isLast && !isAlone_) {
        startThread(1 - used_);
    }
    return batch;
}

} // namespace kareport
