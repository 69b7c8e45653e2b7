#include "SheetLayout.h"

#include "PageUnits.h"

#include <QElapsedTimer>
#include <QPainter>
#include <QTextBlock>
#include <QTextDocument>

#include <algorithm>
#include <utility>

namespace kareport
{

namespace
{

/// Measures as a printer of a resolution does.
QImage deviceOf(int resolution)
{
    QImage device(1, 1, QImage::Format_RGB32);
    device.setDotsPerMeterX(qRound(resolution / metresPerInch));
    device.setDotsPerMeterY(qRound(resolution / metresPerInch));
    return device;
}

} // namespace

SheetLayout::SheetLayout(const QTextDocument &text, const SheetPaper &paper, FindPages findPages)
    : text_(text),
      paper_(paper),
      findPages_(std::move(findPages)),
      device_(deviceOf(paper.resolution)),
      pager_(text, device_)
{
    pager_.setUsualLines(paper.usualLines);
}

bool SheetLayout::work(int milliseconds)
{
    if (isDone_) {
        return true;
    }
    QElapsedTimer elapsed;
    elapsed.start();
    do {
        step();
    } while (!isDone_ && elapsed.elapsed() < milliseconds);
    publish();
    return isDone_;
}

int SheetLayout::percent() const
{
    if (isDone_ || !hasBegun_) {
        return isDone_ ? 100 : 0;
    }
    return plan_ ? plan_->percent() : static_cast<int>(next_ * 100 / std::max<qint64>(1, pager_.length()));
}

void SheetLayout::noteEdit(qint64 position, qint64 removed, qint64 added)
{
    const qint64 length = pager_.length();
    const qint64 lengthBefore = length - added + removed;
    if (edited_) {
        edited_->head = std::min(edited_->head, position);
        edited_->tail = std::min(edited_->tail, lengthBefore - position - removed);
        edited_->length = length;
    } else {
        edited_ = UnchangedText{position, lengthBefore - position - removed, lengthBefore, length};
    }
    const auto moved = [=](qint64 place) {
        // What is put in at the beginning of a sheet is on that sheet.
        return place > position && place >= position + removed ? place + added - removed : std::min(place, position);
    };
    for (std::vector<PrintSheet> *sheets : {&sheets_, &found_, &before_}) {
        const auto first = std::lower_bound(sheets->begin(), sheets->end(), position,
                                            [](const PrintSheet &sheet, qint64 at) { return sheet.stop < at; });
        std::for_each(first, sheets->end(), [&moved](PrintSheet &sheet) {
            sheet.start = moved(sheet.start);
            sheet.stop = moved(sheet.stop);
        });
    }
    if (isDone_ || hasBegun_) { // else it is as it was at the edit before this one
        isWholeBefore_ = isDone_ || (isWholeBefore_ && nextBefore_ < before_.size());
    }
    isDone_ = false;
    hasBegun_ = false;
}

int SheetLayout::sheetAt(qint64 position) const
{
    const auto after = std::upper_bound(sheets_.begin(), sheets_.end(), position,
                                        [](qint64 at, const PrintSheet &sheet) { return at < sheet.start; });
    if (sheets_.empty()) {
        return -1;
    }
    return after == sheets_.begin() ? 0 : static_cast<int>(after - sheets_.begin()) - 1;
}

void SheetLayout::begin()
{
    hasBegun_ = true;
    const auto edited = std::exchange(edited_, std::nullopt);
    auto pages = findPages_ ? findPages_() : std::nullopt;
    if (pages && !pages->empty()) {
        if (!plan_) {
            plan_.emplace(pager_, paper_.room, paper_.usualLines);
        }
        plan_->begin(std::move(*pages), edited.value_or(UnchangedText()));
        return;
    }
    const bool wasGiven = plan_.has_value();
    plan_.reset();
    if (!edited || wasGiven || found_.empty() || pager_.length() == 0) {
        found_.clear();
        before_.clear();
        nextBefore_ = 0;
        next_ = 0;
        isDone_ = pager_.length() == 0;
        return;
    }
    resumeAfter(*edited);
}

void SheetLayout::resumeAfter(const UnchangedText &edited)
{
    // The sheet that the line begins on, or the one before it where it is the first there: a line that has become shorter may
    // have room on that one.
    const qint64 lineStart = text_.findBlock(static_cast<int>(std::min(edited.head, pager_.length()))).position();
    const auto after = std::lower_bound(found_.begin(), found_.end(), lineStart,
                                        [](const PrintSheet &sheet, qint64 at) { return sheet.start < at; });
    const auto kept = std::max<std::ptrdiff_t>(0, after - found_.begin() - 1);
    next_ = kept == 0 ? 0 : found_[static_cast<std::size_t>(kept)].start;
    // Where another edit came before all sheets were found again, what follows is what followed before that.
    before_.erase(before_.begin(), before_.begin() + static_cast<std::ptrdiff_t>(nextBefore_));
    if (before_.empty()) {
        before_.assign(found_.begin() + kept, found_.end());
    }
    found_.resize(static_cast<std::size_t>(kept));
    const QTextBlock line = text_.findBlock(static_cast<int>(pager_.length() - edited.tail));
    const qint64 unchanged = line.isValid() ? line.position() + line.length() : pager_.length();
    nextBefore_ = 0;
    while (nextBefore_ < before_.size() && before_[nextBefore_].start < unchanged) {
        ++nextBefore_;
    }
}

void SheetLayout::step()
{
    if (!hasBegun_) {
        begin();
    } else if (plan_) {
        isDone_ = !plan_->step();
    } else {
        findNext();
    }
    if (isDone_) {
        before_.clear();
        nextBefore_ = 0;
    }
}

void SheetLayout::findNext()
{
    if (resumes()) {
        return;
    }
    const qint64 start = next_;
    next_ = pager_.layOut(paper_.room, start, -1);
    found_.push_back({start, next_, 1});
    isDone_ = next_ >= pager_.length() || next_ <= start; // a sheet that takes nothing would be followed without end
}

bool SheetLayout::resumes()
{
    while (nextBefore_ < before_.size() && before_[nextBefore_].start < next_) {
        ++nextBefore_;
    }
    if (nextBefore_ >= before_.size() || before_[nextBefore_].start != next_) {
        return false;
    }
    // From here on the text is as it was, and so are its sheets.
    found_.insert(found_.end(), before_.begin() + static_cast<std::ptrdiff_t>(nextBefore_), before_.end());
    nextBefore_ = before_.size();
    next_ = found_.back().stop;
    isDone_ = isWholeBefore_;
    return true;
}

void SheetLayout::publish()
{
    if (plan_) {
        // After an edit the sheets before it are shown until all are known.
        if (isDone_ || !wasDone_) {
            sheets_ = plan_->sheets();
        }
        wasDone_ = wasDone_ || isDone_;
        return;
    }
    sheets_ = found_;
    if (!isDone_) {
        const auto rest = std::lower_bound(before_.begin(), before_.end(), next_,
                                           [](const PrintSheet &sheet, qint64 at) { return sheet.start < at; });
        sheets_.insert(sheets_.end(), rest, before_.end());
    }
}

qint64 SheetLayout::layOut(const PrintSheet &sheet, QPainter *painter, std::vector<PageRow> *rows)
{
    return plan_ ? pager_.layOutScaled(paper_.room, sheet.start, sheet.stop, sheet.scale, painter, rows)
                 : pager_.layOut(paper_.room, sheet.start, sheet.stop, painter, rows);
}

void SheetLayout::draw(QPainter &painter, int sheet)
{
    layOut(sheets_.at(static_cast<std::size_t>(sheet)), &painter, nullptr);
}

std::vector<PageRow> SheetLayout::rows(int sheet)
{
    std::vector<PageRow> rows;
    layOut(sheets_.at(static_cast<std::size_t>(sheet)), nullptr, &rows);
    return rows;
}

} // namespace kareport
