#include "KeptLines.h"

#include "ReportOutline.h"

namespace kareport
{

void KeptLines::add(const Line &line, QStringView text)
{
    if (!line.isBound && open_ == 0 && !lines_.empty()) {
        writeHeld(nullptr);
    }
    lines_.push_back({line, text_.size(), text.size()});
    text_.append(text);
}

std::size_t KeptLines::addOpen(const Line &line)
{
    if (!line.isBound && open_ == 0 && !lines_.empty()) {
        writeHeld(nullptr);
    }
    ++open_;
    texts_.emplace_back();
    lines_.push_back({line, texts_.size() - 1, -1});
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
    place(begin, heightOf(begin, end) + reserved_ + (more != nullptr ? static_cast<qint64>(more->size()) : 0));
    const bool isLast = more != nullptr && more->empty() && reserved_ == 0;
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
    if (more == nullptr || isLast) {
        return;
    }
    std::vector<QString> last = hooks_.pageEnd();
    last.insert(last.end(), more->begin(), more->end());
    for (std::size_t i = 0; i < last.size(); ++i) {
        writeLine(last[i], 0, i + 1 == last.size());
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
        lines += 1 + (isDropped ? 0 : lines_[i].line.before);
    }
    return lines;
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
