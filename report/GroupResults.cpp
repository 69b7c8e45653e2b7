#include "GroupResults.h"

namespace kareport
{

void GroupResults::add(Held held)
{
    if (!isWanted()) {
        return;
    }
    if (open_ == 0) {
        give(held);
    } else {
        held_.push_back(std::move(held));
    }
}

void GroupResults::give(const Held &held)
{
    switch (held.kind) {
    case Held::Kind::Text: feed_.addText(held.textKind, held.text, held.level); break;
    case Held::Kind::Row: feedRow_(held.object, held.level); break;
    case Held::Kind::Totals: feed_.addTotals(held.rowKind, held.totals, held.level); break;
    }
}

void GroupResults::addText(ResultText kind, QString text, int level)
{
    Held held;
    held.level = level;
    held.textKind = kind;
    held.text = std::move(text);
    add(std::move(held));
}

std::size_t GroupResults::addOpen(int level)
{
    ++open_;
    held_.emplace_back().level = level;
    return held_.size() - 1;
}

void GroupResults::setText(std::size_t open, QString text)
{
    held_[open].text = std::move(text);
    --open_;
    if (open_ == 0) {
        for (const Held &held : held_) {
            give(held);
        }
        held_.clear();
    }
}

void GroupResults::addRow(const UDataObject &object, int level)
{
    if (!isWanted()) {
        return;
    }
    if (open_ == 0) {
        feed_.endRow(object, level);
        return;
    }
    feed_.dropRow();
    Held held;
    held.kind = Held::Kind::Row;
    held.level = level;
    held.object = object;
    held_.push_back(std::move(held));
}

void GroupResults::addTotals(ResultRowKind kind, std::vector<ResultTotal> totals, int level)
{
    Held held;
    held.level = level;
    held.kind = Held::Kind::Totals;
    held.rowKind = kind;
    held.totals = std::move(totals);
    add(std::move(held));
}

} // namespace kareport
