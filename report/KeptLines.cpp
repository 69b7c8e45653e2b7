#include "KeptLines.h"

#include "ReportOutline.h"

#include <algorithm>
#include <numeric>

namespace kareport
{

qint64 KeptLines::heightOf(QStringView text)
{
    return 1 + text.count(u'\n');
}

void KeptLines::add(const Line &line, QStringView text)
{
    if (!line.isBound && open_ == 0 && !lines_.empty()) {
        writeHeld(nullptr);
    }
    lines_.push_back({line, text_.size(), text.size(), heightOf(text)});
    text_.append(text);
}

std::size_t KeptLines::addOpen(const Line &line)
{
    if (!line.isBound && open_ == 0 && !lines_.empty()) {
        writeHeld(nullptr);
    }
    ++open_;
    texts_.emplace_back();
    lines_.push_back({line, texts_.size() - 1, -1, 0});
    return texts_.size() - 1;
}

void KeptLines::setText(std::size_t open, QString text)
{
    texts_[open] = std::move(text);
    --open_;
}

void KeptLines::finish(const std::vector<QString> &more)
{
    writeHeld(&more);
}

QStringView KeptLines::textOf(const Held &held) const
{
    return held.size < 0 ? QStringView(texts_[held.start]) : text_.from(held.start).first(held.size);
}

/// Writes the lines that are held. @param more  what follows the last of them; null where more rows may follow
void KeptLines::writeHeld(const std::vector<QString> *more)
{
    for (std::size_t begin = 0; begin < lines_.size();) {
        std::size_t end = begin + 1;
        while (end < lines_.size() && lines_[end].line.isBound) {
            ++end;
        }
        writeTogether(begin, end, end == lines_.size() ? more : nullptr);
        begin = end;
    }
    lines_.clear();
    text_.clear();
    texts_.clear();
}

void KeptLines::writeTogether(std::size_t begin, std::size_t end, const std::vector<QString> *more)
{
    const qint64 after = reserved_ + (more != nullptr ? heightOf(*more) : 0);
    place(begin, heightOf(begin, end) + after);
    const bool isLast = more != nullptr && more->empty() && reserved_ == 0;
    if (heightOf(begin, end) + after <= page_.linesLeft()) {
        writePart(begin, end, isLast);
    } else {
        writeParts(begin, end, after, isLast);
    }
    if (more == nullptr || isLast) {
        return;
    }
    std::vector<QString> last = hooks_.pageEnd();
    last.insert(last.end(), more->begin(), more->end());
    for (std::size_t i = 0; i < last.size(); ++i) {
        writeLine(last[i], 0, i + 1 == last.size());
    }
}

/// Writes lines that no page has room for together: the headings before a row and the totals after it still stay with it.
/// @param after  lines that follow the last of them @param isLast  nothing follows them
void KeptLines::writeParts(std::size_t begin, std::size_t end, qint64 after, bool isLast)
{
    for (std::size_t part = begin; part < end;) {
        const std::size_t next = endOfPart(part, end);
        const qint64 height = heightOf(part, next) + (next == end ? after : reserved_);
        if (part > begin && height > page_.linesLeft() && !isAtTop()) {
            endPage();
        }
        writePart(part, next, isLast && next == end);
        part = next;
    }
}

/// Where a part ends that stays together on a small page as well: after a row and the totals under it.
std::size_t KeptLines::endOfPart(std::size_t begin, std::size_t end) const
{
    std::size_t at = begin;
    while (at < end && lines_[at].line.row == 0) {
        ++at;
    }
    at = std::min(at + 1, end);
    while (at < end && lines_[at].line.row == 0 && lines_[at].line.group < 0) {
        ++at;
    }
    return at;
}

/// Writes lines one after the other. Where the page ends before them, they go on on the next one.
/// @param isLast  nothing follows them
void KeptLines::writePart(std::size_t begin, std::size_t end, bool isLast)
{
    for (std::size_t i = begin; i < end; ++i) {
        const Held &held = lines_[i];
        if (i > begin && reserved_ >= page_.linesLeft() && !isAtTop()) {
            endPage(); // a page is too small for all of it
        }
        if (held.line.group >= 0) {
            page_.announceEntry(ReportOutline::firstGroupLevel + held.line.group, textOf(held).toString().simplified());
        }
        writeLine(textOf(held), held.line.before, isLast && i + 1 == end);
        if (held.line.row != 0) {
            hooks_.rowWritten(held.line);
        }
    }
}

/// Turns the page where it has no room for what belongs together.
void KeptLines::place(std::size_t begin, qint64 lines)
{
    if (!hasBegun_) {
        hasBegun_ = true;
        hooks_.begin(lines);
        page_.newPage(0); // which the first line would do
        noteTop();        // the heading is not left alone either
        return;
    }
    if (!isAtTop() && (lines_[begin].line.beginsPage || lines > page_.linesLeft())) {
        endPage();
    }
}

qint64 KeptLines::heightOf(std::size_t begin, std::size_t end) const
{
    qint64 lines = 0;
    for (std::size_t i = begin; i < end; ++i) {
        const bool isDropped = i == begin && (!hasBegun_ || isAtTop());
        const Held &held = lines_[i];
        lines += (held.size < 0 ? heightOf(textOf(held)) : held.height) + (isDropped ? 0 : held.line.before);
    }
    return lines;
}

qint64 KeptLines::heightOf(const std::vector<QString> &lines)
{
    return std::accumulate(lines.begin(), lines.end(), qint64(0),
                           [](qint64 height, const QString &line) { return height + heightOf(line); });
}

void KeptLines::writeLine(QStringView text, int before, bool isLast)
{
    const int blank = isAtTop() ? 0 : before;
    if (isLast) {
        page_.skipLines(blank);
        page_.write(text, 0);
        page_.noteChange();
        // The last line end may turn the page: without a heading it does not begin with one over no rows.
        page_.setHeading({QString(), 0, 2});
        page_.writeLine(QStringView(), 0, 1, 0);
        return;
    }
    page_.writeLine(text, blank, 1, 0);
    if (page_.pageNumber() != topPage_) { // that was the last line of the page
        noteTop();
        hooks_.pageTurned();
    }
}

void KeptLines::endPage()
{
    const int page = page_.pageNumber();
    for (const QString &text : hooks_.pageEnd()) {
        writeLine(text, 0, false);
    }
    if (page_.pageNumber() == page) {
        page_.breakPage();
        noteTop();
        hooks_.pageTurned();
    }
}

void KeptLines::noteTop()
{
    topPage_ = page_.pageNumber();
    topLine_ = page_.lineNumber();
}

} // namespace kareport
