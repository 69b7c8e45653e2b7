#include "LandXmlList.h"

#include "EntryOrder.h"

#include <algorithm>
#include <numeric>

namespace kareport
{

namespace
{

/// Brings the lengths of a query into metres. @param unit  metres in their unit
void scale(LandXmlQuery &query, double unit)
{
    query.unit = 1.0;
    query.interval *= unit;
    for (double &station : query.stations) {
        station *= unit;
    }
    for (LandXmlOffset &line : query.offsets) {
        line.offset *= unit;
    }
}

} // namespace

LandXmlList::LandXmlList(std::shared_ptr<const FileBytes> file, LandXmlQuery query, const FindVariable &findVariable,
                         ReadProgress progress, const UJobSettings &settings)
    : file_(std::move(file)), progress_(std::move(progress)), settings_(settings)
{
    auto header = readLandXmlHeader(file_);
    if (const InputError *error = errorOf(header)) {
        error_ = endOfRows(*error);
        return;
    }
    const double unit = query.unit.value_or(std::get<LandXmlHeader>(header).units.metres);
    scale(query, unit);
    rows_ = LandXmlRows::make({file_, std::get<LandXmlHeader>(header), std::move(query), progress_, unit});
    bind(findVariable);
}

LandXmlList::~LandXmlList() = default;

DataUnits LandXmlList::units()
{
    DataUnits units;
    units.angle = AngleUnit::Radian;
    return units;
}

std::vector<LandXmlVariable> LandXmlList::variables(const LandXmlQuery &query)
{
    // Which they are does not depend on the file.
    const auto nothing = std::make_shared<FileBytes>();
    return LandXmlRows::make({nothing, LandXmlHeader(), query, {}})->variables();
}

UDataObject *LandXmlList::GetAt(std::size_t index)
{
    if (stopped_ || (error_ && batch_ == nullptr)) {
        return nullptr;
    }
    if (batch_ == nullptr || index < batchStart_) {
        static const RowBatch nothing;
        rewind();
        batch_ = &nothing;
        batches_ = std::make_unique<RowBatches>([this](RowBatch &batch) { fill(batch); });
    }
    while (index - batchStart_ >= batch_->count) {
        if (!takeBatch()) {
            return nullptr;
        }
    }
    return const_cast<UDataObject *>(&batch_->objects[index - batchStart_]);
}

/// Goes back to the first row, with no batch read.
void LandXmlList::rewind()
{
    batches_.reset();
    if (!order_) { // a sorted list asks for its rows by their numbers, and its notes are complete
        rows_->rewind();
    }
    nextOrdered_ = 0;
    error_.reset();
    batch_ = nullptr;
    batchStart_ = 0;
}

/// Why the rows end where they do. Bytes that were cut off the file while it was read look like rows that are wrong.
std::optional<InputError> LandXmlList::endOfRows(const std::optional<InputError> &error) const
{
    const auto lost = file_->lostBytes();
    return lost ? lost : error;
}

bool LandXmlList::takeBatch()
{
    if (batch_->isLast) {
        error_ = endOfRows(batch_->error);
        return false;
    }
    batchStart_ += batch_->count;
    batch_ = &batches_->next();
    stopped_ = rows_->isStopped() || (progress_ && !progress_(batch_->position));
    return !stopped_;
}

void LandXmlList::fill(RowBatch &batch)
{
    batch.error.reset();
    batch.isLast = false;
    while (batch.count < RowBatch::most && !batch.isLast) {
        batch.isLast = !readRow(batch);
    }
    batch.position = rows_->position();
}

bool LandXmlList::readRow(RowBatch &batch)
{
    if (order_) {
        if (nextOrdered_ == order_->size()) {
            return false;
        }
        rows_->goTo((*order_)[nextOrdered_++]);
    } else if (!rows_->next()) {
        batch.error = rows_->error();
        return false;
    }
    batch.error = storeValues(batch.next(), nullptr);
    batch.count += batch.error ? 0U : 1U;
    return !batch.error;
}

void LandXmlList::Sort(const std::vector<unsigned> &ids)
{
    if (error_) {
        return;
    }
    order_.reset();
    rewind();
    rows_->keep();
    std::vector<UDataObject> keys;
    while (rows_->next()) {
        if (progress_ && keys.size() % RowBatch::most == 0 && !progress_(rows_->position())) {
            stopped_ = true;
            return;
        }
        if (const auto wrong = storeValues(keys.emplace_back(), &ids)) {
            error_ = endOfRows(wrong);
            return;
        }
    }
    stopped_ = rows_->isStopped();
    error_ = endOfRows(rows_->error());
    std::vector<std::size_t> order(keys.size());
    std::iota(order.begin(), order.end(), std::size_t(0));
    std::stable_sort(order.begin(), order.end(), [&](std::size_t left, std::size_t right) {
        return compareObjects(keys[left], keys[right], ids) < 0;
    });
    order_ = std::move(order);
}

std::vector<InputError> LandXmlList::notes() const
{
    // Until then another thread adds to them.
    const bool isComplete = batch_ != nullptr && batch_->isLast;
    return isComplete ? rows_->notes() : std::vector<InputError>();
}

} // namespace kareport
