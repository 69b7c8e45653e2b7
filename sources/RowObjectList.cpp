#include "RowObjectList.h"

#include "EntryOrder.h"
#include "TextFolding.h"
#include "WideVectors.h"

#include <algorithm>
#include <iterator>
#include <numeric>

namespace kareport
{

namespace
{

/// Ends a sorting that was stopped.
struct Stopped
{};

} // namespace

RowObjectList::RowObjectList(std::unique_ptr<RowReader> reader, ReadProgress progress)
    : reader_(std::move(reader)), progress_(std::move(progress)), error_(endOfRows(reader_->error()))
{}

RowObjectList::~RowObjectList()
{
    if (batches_) {
        reader_->stop(); // the thread that reads ahead ends with its batch
    }
}

UDataObject *RowObjectList::GetAt(std::size_t index)
{
    if (stopped_ || (error_ && batch_ == nullptr)) {
        return nullptr;
    }
    if (batch_ == nullptr || index < batchStart_) {
        static const RowBatch nothing;
        restart();
        batch_ = &nothing;
        batches_ = std::make_unique<RowBatches>(
            [this](RowBatch &batch) { fill(batch); },
            reader_->mayWait() && !spool_ ? std::function<void()>([this] { poll(); }) : nullptr);
    }
    while (index - batchStart_ >= batch_->count) {
        if (!takeBatch()) {
            return nullptr;
        }
    }
    return const_cast<UDataObject *>(&batch_->objects[index - batchStart_]);
}

std::optional<SourceColumns> RowObjectList::columns() const
{
    if (error_ || !reader_->knowsColumns()) {
        return std::nullopt;
    }
    return SourceColumns{reader_->name(), reader_->columns(), reader_->variables()};
}

ValuePlace RowObjectList::placeOf(std::size_t index, const QString &variable)
{
    ValuePlace found = {reader_->name()};
    if (!reader_->canSeek()) {
        return found;
    }
    batches_.reset();
    batch_ = nullptr;
    std::size_t row = index;
    if (order_ && index < order_->size()) {
        reader_->seek((*order_)[index]);
    } else {
        const auto after = std::upper_bound(batchPlaces_.begin(), batchPlaces_.end(), index,
                                            [](std::size_t sought, const auto &batch) { return sought < batch.first; });
        if (order_ || after == batchPlaces_.begin()) {
            return found;
        }
        row = std::prev(after)->first;
        reader_->seek(std::prev(after)->second);
    }
    static const std::vector<unsigned> nothing;
    UDataObject object;
    while (row < index && reader_->next(object, &nothing)) {
        ++row;
    }
    if (row == index) {
        found.place = reader_->placeOfNext(foldedKey(variable));
    }
    return found;
}

std::vector<InputError> RowObjectList::differences() const
{
    // Until then another thread adds to them.
    const bool isComplete = batch_ != nullptr && batch_->isLast;
    return isComplete ? reader_->notes() : std::vector<InputError>();
}

/// Goes back to the first row, with no batch read.
void RowObjectList::restart()
{
    batches_.reset();
    if (!spool_) {
        reader_->rewind();
    }
    nextOrdered_ = 0;
    error_.reset();
    batch_ = nullptr;
    batchStart_ = 0;
    batchPlaces_.clear();
}

/// Why the rows end where they do. What was cut off a file while it was read shows as rows that are wrong.
std::optional<InputError> RowObjectList::endOfRows(const std::optional<InputError> &error) const
{
    const auto lost = reader_->lostBytes();
    return lost ? lost : error;
}

/// Goes on to the next batch. @return false when there is none
bool RowObjectList::takeBatch()
{
    if (batch_->isLast) {
        // The thread that reads ahead has ended with the last batch: the source is read by this one.
        error_ = endOfRows(batch_->error && order_ && !spool_ ? firstError(batch_->error) : batch_->error);
        return false;
    }
    batchStart_ += batch_->count;
    batch_ = &batches_->next();
    position_ = batch_->position;
    if (reader_->canSeek() && !order_ && batch_->count > 0) {
        batchPlaces_.emplace_back(batchStart_, batch_->first);
    }
    stopped_ = stopped_ || (progress_ && !progress_(position_));
    return !stopped_;
}

/// Looks whether work is to stop while a row is waited for.
void RowObjectList::poll()
{
    if (!stopped_ && progress_ && !progress_(position_)) {
        stopped_ = true;
        reader_->stop();
    }
}

void RowObjectList::fill(RowBatch &batch)
{
    std::size_t bytes = 0;
    while (batch.count < RowBatch::most && bytes < RowBatch::mostBytes && !batch.isLast) {
        batch.isLast = spool_ ? !readFromSpool(batch, bytes) : !readRow(batch, bytes);
    }
    batch.position = reader_->position();
}

/// Goes to the next row of a sorted list. @return false after the last one
bool RowObjectList::seekNext()
{
    if (order_) {
        if (nextOrdered_ == order_->size()) {
            return false;
        }
        reader_->seek((*order_)[nextOrdered_++]);
    }
    return true;
}

bool RowObjectList::readRow(RowBatch &batch, std::size_t &bytes)
{
    if (!seekNext()) {
        return false;
    }
    endWideVectors();
    if (!reader_->next(batch.next(), nullptr)) {
        batch.error = reader_->error();
        return false;
    }
    bytes += reader_->rowBytes();
    if (batch.count++ == 0) {
        batch.first = reader_->place();
    }
    return true;
}

/// What is wrong with the first row of the source that is wrong, which in a sorted list is not the first that is met: sorting
/// has looked at the sort keys alone. Nothing when work is to stop.
/// @param met  what is wrong with the row that was met
std::optional<InputError> RowObjectList::firstError(const std::optional<InputError> &met)
{
    reader_->rewind();
    UDataObject object;
    for (std::size_t rows = 1; reader_->next(object, nullptr); ++rows) {
        if (rows % RowBatch::most == 0 && isToStop(reader_->position())) {
            return std::nullopt;
        }
    }
    return reader_->error() ? reader_->error() : met;
}

bool RowObjectList::readFromSpool(RowBatch &batch, std::size_t &bytes)
{
    if (!order_ || nextOrdered_ == order_->size()) {
        return false;
    }
    const std::size_t start = (*order_)[nextOrdered_++].start;
    bytes += spool_->read(start, batch.next()) - start;
    ++batch.count;
    return true;
}

void RowObjectList::Sort(const std::vector<unsigned> &ids)
{
    if (error_ || stopped_) {
        return;
    }
    if (!reader_->canSeek() && !spool_ && !spoolRows()) {
        return;
    }
    const std::vector<Key> keys = spool_ ? keysOfSpooled(ids) : keysOfPlaces(ids);
    if (!stopped_ && !error_) {
        sortPlaces(keys, ids);
    }
    batches_.reset();
    batch_ = nullptr;
}

/// The sort keys of all rows, in the order that the rows have, so that equal ones keep it.
std::vector<RowObjectList::Key> RowObjectList::keysOfPlaces(const std::vector<unsigned> &ids)
{
    restart();
    std::vector<Key> keys;
    Key key;
    while (seekNext() && reader_->next(key.values, &ids)) {
        key.place = reader_->place();
        keys.push_back(std::move(key));
        key.values.Clear();
        if (keys.size() % RowBatch::most == 0 && isToStop(reader_->position())) {
            return keys;
        }
    }
    error_ = endOfRows(reader_->error());
    return keys;
}

/// Asks whether work is to stop. @param position  where reading has come to
bool RowObjectList::isToStop(std::size_t position)
{
    stopped_ = stopped_ || (progress_ && !progress_(position));
    return stopped_;
}

/// Reads all rows into a temporary file. @return false when work is to stop or something is wrong
bool RowObjectList::spoolRows()
{
    auto spool = std::make_unique<RowSpool>(reader_->ids());
    bool isKept = true;
    for (std::size_t i = 0; isKept; ++i) {
        const UDataObject *object = GetAt(i);
        if (object == nullptr) {
            break;
        }
        isKept = spool->add(*object);
    }
    batches_.reset();
    batch_ = nullptr;
    if (!isKept || (!error_ && !spool->finish())) {
        error_ = InputError{QString(), std::nullopt, spool->wrong()};
    }
    if (stopped_ || error_) {
        return false;
    }
    spool_ = std::move(spool);
    return true;
}

std::vector<RowObjectList::Key> RowObjectList::keysOfSpooled(const std::vector<unsigned> &ids)
{
    std::vector<Key> keys;
    UDataObject object;
    const auto addKey = [&](std::size_t place) {
        Key &key = keys.emplace_back();
        key.place = {place, 0};
        const std::size_t next = spool_->read(place, object);
        for (const unsigned id : ids) {
            if (const UDictEntry *entry = object.Find(id)) {
                key.values.Set(id, entry->value());
            }
        }
        return next;
    };
    if (order_) {
        for (const RowPlace &place : *order_) {
            if (keys.size() % RowBatch::most == 0 && isToStop(position_)) {
                break;
            }
            addKey(place.start);
        }
        return keys;
    }
    for (std::size_t place = 0; place < spool_->end();) {
        if (keys.size() % RowBatch::most == 0 && isToStop(position_)) {
            break;
        }
        place = addKey(place);
    }
    return keys;
}

void RowObjectList::sortPlaces(const std::vector<Key> &keys, const std::vector<unsigned> &ids)
{
    std::vector<std::size_t> order(keys.size());
    std::iota(order.begin(), order.end(), std::size_t(0));
    constexpr std::size_t comparisonsBetween = 1 << 16;
    std::size_t comparisons = 0;
    try {
        std::stable_sort(order.begin(), order.end(), [&](std::size_t left, std::size_t right) {
            if (++comparisons % comparisonsBetween == 0 && isToStop(position_)) {
                throw Stopped();
            }
            return compareObjects(keys[left].values, keys[right].values, ids) < 0;
        });
    } catch (const Stopped &) {
        return;
    }
    order_.emplace();
    order_->reserve(order.size());
    for (const std::size_t index : order) {
        order_->push_back(keys[index].place);
    }
}

} // namespace kareport
