#include "CsvObjectList.h"

#include "EntryOrder.h"
#include "TextFolding.h"
#include "WideVectors.h"
#include "Xlate.h"

#include <QHash>

#include <algorithm>
#include <numeric>

namespace kareport
{

namespace
{

constexpr std::size_t longestQuote = 40;

/// A cell for a message, cut short.
QString quoteOf(std::string_view cell)
{
    const QString text =
        QString::fromUtf8(cell.data(), static_cast<qsizetype>(std::min(cell.size(), 4 * longestQuote)));
    return text.size() > qsizetype(longestQuote) ? text.left(longestQuote) + u'…' : text;
}

/// Blanks of any kind, and marks that nobody sees: programs leave them around the names of columns.
bool isUnseen(QChar character)
{
    constexpr char16_t byteOrderMark = 0xFEFF;
    constexpr char16_t zeroWidthSpace = 0x200B;
    constexpr char16_t wordJoiner = 0x2060;
    return character.isSpace() || character == byteOrderMark || character == zeroWidthSpace || character == wordJoiner;
}

/// The name of a column without what is around it.
QString nameIn(std::string_view cell)
{
    const QString text = QString::fromUtf8(cell.data(), static_cast<qsizetype>(cell.size()));
    QStringView name = text;
    while (!name.isEmpty() && isUnseen(name.front())) {
        name = name.sliced(1);
    }
    while (!name.isEmpty() && isUnseen(name.back())) {
        name.chop(1);
    }
    return name.toString();
}

} // namespace

CsvObjectList::CsvObjectList(std::shared_ptr<const FileBytes> file, char delimiter, const FindVariable &findVariable,
                             ReadProgress progress)
    : file_(std::move(file)), reader_(file_->path(), file_->view(), delimiter), progress_(std::move(progress))
{
    readHeader(findVariable);
    firstRow_ = {reader_.position(), reader_.nextLine()};
}

void CsvObjectList::readHeader(const FindVariable &findVariable)
{
    if (!reader_.next()) {
        error_ = endOfRows(reader_.error()
                               ? *reader_.error()
                               : reader_.errorAt(TextPlace(), Xlate("a header row of variable names was expected")));
        return;
    }
    QHash<QString, std::size_t> names;
    bool anyKnown = false;
    for (std::size_t i = 0; i < reader_.cells().size(); ++i) {
        const QString name = nameIn(reader_.cells()[i]);
        const bool known = columns_.emplace_back(Column{name, findVariable(name)}).parser.has_value();
        anyKnown |= known;
        const auto earlier = names.constFind(foldedKey(name));
        if (earlier != names.constEnd() && (known || columns_[*earlier].parser)) {
            error_ =
                reader_.errorAt(reader_.placeOfCell(i),
                                Xlate("the columns %1 and %2 are both named \"%3\": each variable was expected once")
                                    .arg(QString::number(*earlier + 1), QString::number(i + 1), name));
            return;
        }
        names.insert(foldedKey(name), i);
    }
    noteSharedIds();
    if (!anyKnown) {
        error_ = reader_.errorAt(
            reader_.placeOfCell(0),
            Xlate("no column of the header row is a variable of the dictionary: a header row of variable "
                  "names, with the data's delimiter between them, was expected"));
    }
}

void CsvObjectList::noteSharedIds()
{
    std::vector<unsigned> ids;
    for (const Column &column : columns_) {
        if (!column.parser) {
            continue;
        }
        const unsigned id = column.parser->id();
        (std::find(ids.begin(), ids.end(), id) == ids.end() ? ids : sharedIds_).push_back(id);
    }
}

bool CsvObjectList::isShared(unsigned id) const
{
    return std::find(sharedIds_.begin(), sharedIds_.end(), id) != sharedIds_.end();
}

UDataObject *CsvObjectList::GetAt(std::size_t index)
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
void CsvObjectList::rewind()
{
    batches_.reset();
    reader_.seek(firstRow_.start, firstRow_.line);
    nextOrdered_ = 0;
    error_.reset();
    batch_ = nullptr;
    batchStart_ = 0;
}

/// Why the rows end where they do. What was cut off the file while it was read shows as rows that are wrong.
std::optional<InputError> CsvObjectList::endOfRows(const std::optional<InputError> &error) const
{
    const auto lost = file_->lostBytes();
    return lost ? lost : error;
}

/// Goes on to the next batch. @return false when there is none
bool CsvObjectList::takeBatch()
{
    if (batch_->isLast) {
        error_ = endOfRows(batch_->error);
        return false;
    }
    batchStart_ += batch_->count;
    batch_ = &batches_->next();
    stopped_ = progress_ && !progress_(batch_->position);
    return !stopped_;
}

void CsvObjectList::fill(RowBatch &batch)
{
    std::size_t bytes = 0;
    while (batch.count < RowBatch::most && bytes < RowBatch::mostBytes && !batch.isLast) {
        batch.isLast = !readRow(batch);
        bytes += reader_.position() - reader_.rowStart();
    }
    batch.position = reader_.position();
}

/// Goes to the next row of a sorted list. @return false after the last one
bool CsvObjectList::seekNext()
{
    if (order_) {
        if (nextOrdered_ == order_->size()) {
            return false;
        }
        const RowPlace &place = (*order_)[nextOrdered_++];
        reader_.seek(place.start, place.line);
    }
    return true;
}

bool CsvObjectList::readRow(RowBatch &batch)
{
    if (!seekNext()) {
        return false;
    }
    if (!reader_.next()) {
        batch.error = reader_.error();
        return false;
    }
    endWideVectors();
    batch.error = storeCells(batch.next(), nullptr);
    batch.count += batch.error ? 0U : 1U;
    return !batch.error;
}

/// Stores the values of the row at hand. @return what is wrong with it
std::optional<InputError> CsvObjectList::storeCells(UDataObject &object, const std::vector<unsigned> *onlyIds) const
{
    const auto &cells = reader_.cells();
    if (cells.size() != columns_.size()) {
        return reader_.errorAt(reader_.placeOfCell(std::min(cells.size(), columns_.size())),
                               Xlate("the row has %1 cells: %2 were expected, as in the header row")
                                   .arg(cells.size())
                                   .arg(columns_.size()));
    }
    // The object may hold the values of an earlier row, which none of the cells has to replace.
    for (const unsigned id : sharedIds_) {
        object.Remove(id);
    }
    for (std::size_t i = 0; i < cells.size(); ++i) {
        const auto &parser = columns_[i].parser;
        if (!parser ||
            (onlyIds != nullptr && std::find(onlyIds->begin(), onlyIds->end(), parser->id()) == onlyIds->end())) {
            continue;
        }
        if (parser->isNone(cells[i])) {
            // What another column has stored under the identifier stays.
            if (!isShared(parser->id())) {
                object.Remove(parser->id());
            }
        } else if (!parser->storeValue(cells[i], object)) {
            return reader_.errorAt(reader_.placeOfCell(i),
                                   Xlate("the cell \"%1\" of the column \"%2\" does not fit: %3 was expected")
                                       .arg(quoteOf(cells[i]), columns_[i].name, parser->expected()));
        }
    }
    return std::nullopt;
}

void CsvObjectList::Sort(const std::vector<unsigned> &ids)
{
    if (error_) {
        return;
    }
    // The rows are read in the order that they have, so that equal ones keep it.
    rewind();
    struct Key
    {
        UDataObject values;
        RowPlace place;
    };
    std::vector<Key> keys;
    while (seekNext() && reader_.next()) {
        if (progress_ && keys.size() % RowBatch::most == 0 && !progress_(reader_.position())) {
            stopped_ = true;
            return;
        }
        Key &key = keys.emplace_back();
        key.place = {reader_.rowStart(), reader_.rowLine()};
        if (const auto wrong = storeCells(key.values, &ids)) {
            error_ = endOfRows(wrong);
            return;
        }
    }
    error_ = endOfRows(reader_.error());
    std::vector<std::size_t> order(keys.size());
    std::iota(order.begin(), order.end(), std::size_t(0));
    std::stable_sort(order.begin(), order.end(), [&](std::size_t left, std::size_t right) {
        return compareObjects(keys[left].values, keys[right].values, ids) < 0;
    });
    order_.emplace();
    order_->reserve(order.size());
    for (const std::size_t index : order) {
        order_->push_back(keys[index].place);
    }
}

} // namespace kareport
