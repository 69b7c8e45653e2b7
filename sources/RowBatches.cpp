#include "RowBatches.h"

#include "Xlate.h"

#include <new>
#include <system_error>

namespace kareport
{

RowBatches::RowBatches(std::function<void(RowBatch &)> fill)
    : fill_(std::move(fill)), noMemory_{QString(), std::nullopt, Xlate("there is not enough memory for the data")}
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

void RowBatches::readAhead(const std::stop_token &stop)
{
    // The first batch is in use.
    for (std::size_t next = 1;; next = 1 - next) {
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

const RowBatch &RowBatches::next()
{
    used_ = 1 - used_;
    RowBatch &batch = batches_[used_];
    if (!thread_.joinable()) {
        fill(batch);
        if (!batch.isLast && !isAlone_) {
            try {
                thread_ = std::jthread([this](const std::stop_token &stop) { readAhead(stop); });
            } catch (const std::system_error &) {
                isAlone_ = true; // the user has as many threads as are allowed: then without one
            } catch (const std::bad_alloc &) {
                isAlone_ = true;
            }
        }
        return batch;
    }
    free_.release();
    ready_.acquire();
    return batch;
}

} // namespace kareport
