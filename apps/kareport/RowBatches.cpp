#include "RowBatches.h"

#include "Xlate.h"

#include <new>

namespace kareport
{

RowBatches::RowBatches(std::function<void(RowBatch &)> fill) : fill_(std::move(fill))
{
    thread_ = std::jthread([this](const std::stop_token &stop) { read(stop); });
}

RowBatches::~RowBatches()
{
    thread_.request_stop();
    free_.release();
}

void RowBatches::read(const std::stop_token &stop)
{
    for (std::size_t next = 0;; next = 1 - next) {
        free_.acquire();
        if (stop.stop_requested()) {
            return;
        }
        RowBatch &batch = batches_[next];
        batch.count = 0;
        try {
            fill_(batch);
        } catch (const std::bad_alloc &) {
            batch.error = InputError{QString(), std::nullopt, Xlate("there is not enough memory for the data")};
            batch.isLast = true;
        }
        const bool isLast = batch.isLast;
        ready_.release();
        if (isLast) {
            return;
        }
    }
}

const RowBatch &RowBatches::next()
{
    if (started_) {
        free_.release();
    }
    started_ = true;
    ready_.acquire();
    used_ = 1 - used_;
    return batches_[used_];
}

} // namespace kareport
