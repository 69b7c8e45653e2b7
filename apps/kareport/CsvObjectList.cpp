#include "CsvObjectList.h"

#include "EntryOrder.h"
#include "TemplateText.h"
#include "Xlate.h"

#include <QHash>

#include <algorithm>
#include <numeric>

namespace kareport
{

namespace
{

/// Rows between two looks at the progress.
constexpr std::size_t progressRows = 4096;
constexpr std::size_t longestQuote = 40;

/// A cell for a message, cut short at a whole character.
QString quoteOf(std::string_view cell)
{
    const QString text = QString::fromUtf8(cell.data(), static_cast<qsizetype>(std::min(cell.size(), 4 * longestQuote)));
    return text.size() > qsizetype(longestQuote) ? text.left(longestQuote) + u'…' : text;
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
        error_ = reader_.error() ? *reader_.error()
                                 : reader_.errorAt(TextPlace(), Xlate("a header row of variable names was expected"));
        return;
    }
    QHash<QString, bool> names;
    for (std::size_t i = 0; i < reader_.cells().size(); ++i) {
        const std::string_view cell = reader_.cells()[i];
        const QString name = QString::fromUtf8(cell.data(), static_cast<qsizetype>(cell.size()));
        if (names.contains(foldedKey(name))) {
            error_ = reader_.errorAt(reader_.placeOfCell(i),
                                     Xlate("the column \"%1\" stands twice: each variable was expected once").arg(name));
            return;
        }
        names.insert(foldedKey(name), true);
        columns_.push_back({name, findVariable(name)});
    }
}

UDataObject *CsvObjectList::GetAt(std::size_t index)
{
    if (error_ || stopped_) {
        return nullptr;
    }
    if (order_) {
        if (index >= order_->size()) {
            return nullptr;
        }
        reader_.seek((*order_)[index].start, (*order_)[index].line);
        nextIndex_ = index;
    } else if (index < nextIndex_) {
        rewind();
    }
    while (nextIndex_ <= index) {
        if (!readRow()) {
            return nullptr;
        }
    }
    return &row_;
}

void CsvObjectList::rewind()
{
    reader_.seek(firstRow_.start, firstRow_.line);
    nextIndex_ = 0;
}

bool CsvObjectList::readRow()
{
    if (nextIndex_ % progressRows == 0 && !goOn()) {
        return false;
    }
    if (!reader_.next()) {
        error_ = reader_.error();
        return false;
    }
    ++nextIndex_;
    return storeCells(row_, nullptr);
}

bool CsvObjectList::goOn()
{
    stopped_ = progress_ && !progress_(reader_.position());
    return !stopped_;
}

bool CsvObjectList::storeCells(UDataObject &object, const std::vector<unsigned> *onlyIds)
{
    const auto &cells = reader_.cells();
    if (cells.size() != columns_.size()) {
        error_ = reader_.errorAt(reader_.placeOfCell(std::min(cells.size(), columns_.size())),
                                 Xlate("the row has %1 cells: %2 were expected, as in the header row")
                                     .arg(cells.size())
                                     .arg(columns_.size()));
        return false;
    }
    for (std::size_t i = 0; i < cells.size(); ++i) {
        const auto &parser = columns_[i].parser;
        if (!parser || (onlyIds != nullptr && std::find(onlyIds->begin(), onlyIds->end(), parser->id()) == onlyIds->end())) {
            continue;
        }
        if (!parser->store(cells[i], object)) {
            error_ = reader_.errorAt(
                reader_.placeOfCell(i),
                Xlate("the cell \"%1\" of the column \"%2\" does not fit: %3 was expected")
                    .arg(quoteOf(cells[i]), columns_[i].name, parser->expected()));
            return false;
        }
    }
    return true;
}

void CsvObjectList::Sort(const std::vector<unsigned> &ids)
{
    if (error_) {
        return;
    }
    struct Key
    {
        UDataObject values;
        RowPlace place;
    };
    std::vector<Key> keys;
    rewind();
    while (reader_.next()) {
        if (keys.size() % progressRows == 0 && !goOn()) {
            return;
        }
        Key &key = keys.emplace_back();
        key.place = {reader_.rowStart(), reader_.rowLine()};
        if (!storeCells(key.values, &ids)) {
            return;
        }
    }
    if (reader_.error()) {
        error_ = reader_.error();
        return;
    }
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
