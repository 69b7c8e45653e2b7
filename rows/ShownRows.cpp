#include "ShownRows.h"

#include "EntryOrder.h"
#include "TextFolding.h"

#include <algorithm>

namespace kareport
{

namespace
{

bool isSame(const UDictEntry *left, const UDictEntry *right)
{
    if (left != nullptr && right != nullptr) {
        // Comparing without regard to case takes longer, and nearly all are the same.
        const auto *text = std::get_if<QString>(&left->value());
        const auto *other = std::get_if<QString>(&right->value());
        if (text != nullptr && other != nullptr && *text == *other) {
            return true;
        }
    }
    return std::is_eq(compareEntries(left, right));
}

} // namespace

ShownRows::ShownRows(std::unique_ptr<RowList> rows, RowShape shape)
    : rows_(std::move(rows)), shape_(std::move(shape)), keys_(shape_.groups.levels.size())
{}

void ShownRows::restart()
{
    current_ = nullptr;
    shown_ = 0;
    nextRow_ = 0;
    for (RunningValue &value : shape_.running) {
        value.restart();
    }
}

void ShownRows::Sort(const std::vector<unsigned> &ids)
{
    rows_->Sort(ids);
    restart();
}

UDataObject *ShownRows::GetAt(std::size_t index)
{
    if (index + 1 == shown_) {
        return current_;
    }
    if (index < shown_) {
        restart();
    }
    while (shown_ <= index) {
        if (!readNext()) {
            return nullptr;
        }
    }
    return current_;
}

/// Goes on to the next row that is shown. @return whether there is one
bool ShownRows::readNext()
{
    do {
        current_ = rows_->GetAt(nextRow_);
        if (current_ == nullptr) {
            return false;
        }
        ++nextRow_;
        for (RowFormula &formula : shape_.formulas) {
            formula.setValue(*current_);
        }
    } while (!isShown(*current_));
    findNewLevel(*current_);
    ++shown_;
    for (RunningValue &value : shape_.running) {
        value.setValue(*current_, firstNewLevel_ < keys_.size(), shown_);
    }
    setFlags(shape_.flags, *current_);
    return true;
}

bool ShownRows::isShown(const UDataObject &object)
{
    return std::all_of(shape_.conditions.begin(), shape_.conditions.end(),
                       [&object](RowCondition &condition) { return condition.holds(object); });
}

void ShownRows::findNewLevel(const UDataObject &object)
{
    const auto &levels = shape_.groups.levels;
    firstNewLevel_ = 0;
    if (shown_ != 0) {
        while (firstNewLevel_ < levels.size() &&
               std::all_of(levels[firstNewLevel_].ids.begin(), levels[firstNewLevel_].ids.end(),
                           [&](quint32 id) { return isSame(object.Find(id), keys_[firstNewLevel_].Find(id)); }))
        {
            ++firstNewLevel_;
        }
    }
    for (std::size_t i = firstNewLevel_; i < levels.size(); ++i) {
        keys_[i].Clear();
        for (const quint32 id : levels[i].ids) {
            if (const UDictEntry *entry = object.Find(id)) {
                keys_[i].Set(id, entry->value());
            }
        }
    }
}

ValuePlace ShownRows::placeOf(std::size_t index, const QString &variable)
{
    if (!shape_.conditions.empty() || shape_.variables.contains(foldedKey(variable))) {
        return {};
    }
    return rows_->placeOf(index, variable);
}

std::optional<SourceColumns> ShownRows::columns() const
{
    auto columns = rows_->columns();
    if (columns) {
        for (const QString &variable : shape_.variables) {
            if (!columns->variables.contains(variable)) {
                columns->variables.append(variable);
            }
        }
    }
    return columns;
}

} // namespace kareport
