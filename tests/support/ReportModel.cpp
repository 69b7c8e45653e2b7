#include "ReportModel.h"

void ReportModel::clear()
{
    setText(QString());
    lineCount_ = 0;
    heading_.clear();
}

void ReportModel::setData(const QString &text)
{
    setText(text);
    findHeaders(0);
    history_.clear();
}

void ReportModel::setHeading(const QString &text, int before, int after)
{
    heading_ = text;
    headingBefore_ = before;
    headingAfter_ = after;
}

void ReportModel::write(const QString &text)
{
    for (const QChar character : text) {
        cells_.push_back({character, false});
        if (character == u'\n') {
            ++lineNumber_;
            ++lineCount_;
        }
    }
    // A start at the very end is that of the first character that comes.
    if (startsAtEnd_ && !text.isEmpty()) {
        cells_[cells_.size() - static_cast<std::size_t>(text.size())].starts = true;
        startsAtEnd_ = false;
    }
}

void ReportModel::lineFeed(int count)
{
    for (int i = 0; i < count; ++i) {
        write(QStringLiteral("\r\n"));
    }
}

void ReportModel::writeHeader()
{
    const int again = static_cast<int>(heading_.count(u'\n'));
    lineNumber_ += again;
    lineCount_ += again;
    write(headerFront_ + QString::number(page_).rightJustified(3));
    lineFeed(headingBefore_ + 4);
    write(heading_);
    lineFeed(headingAfter_);
}

void ReportModel::writeHeading()
{
    lineFeed(headingBefore_);
    write(heading_);
    lineFeed(headingAfter_);
}

bool ReportModel::newPage(int needed)
{
    const int left = linesPerPage_ - lineNumber_;
    if (lineCount_ == 0) {
        page_ = 1;
    } else if (left != 0 && needed >= 0 && needed < left) {
        return false;
    } else {
        lineFeed(left + 1);
        ++page_;
    }
    lineNumber_ = 1;
    startsAtEnd_ = true;
    if (headerFlag_) {
        writeHeader();
    }
    return true;
}

void ReportModel::writeLine(const QString &text, int before, int after)
{
    skipLines(before);
    write(text);
    if (after != 0) {
        lineFeed(1);
        skipLines(after - 1);
    }
}

void ReportModel::writeTable(const ModelTable &table)
{
    skipLines(table.before);
    setHeading(table.heading, 0, table.headingAfter);
    if (!heading_.isEmpty()) {
        constexpr int room = 3; // a heading and one row
        if (lineCount_ == 0 || linesPerPage_ - lineNumber_ <= room) {
            newPage(-1); // its header brings the heading
        } else {
            if (!table.name.isEmpty()) {
                lineFeed(1);
                writeLine(table.name, 0, 1);
                lineFeed(1);
            }
            writeHeading();
        }
    }
    for (int i = 0; i < table.rows.size(); ++i) {
        const bool isLast = i + 1 == table.rows.size();
        if (!isLast) {
            writeLine(table.rows[i], 0, 1);
            continue;
        }
        newPage(0);
        write(table.rows[i]);
        endHeading(); // a page that the end of the last row begins has none
        writeLine(QString(), 0, 1);
    }
    endHeading();
    skipLines(table.after);
}

void ReportModel::writeBlock(const QStringList &lines, int before, int after)
{
    skipLines(before);
    for (const QString &line : lines) {
        writeLine(line, 0, 1);
    }
    endHeading();
    skipLines(after);
}

void ReportModel::skipLines(int count)
{
    if (!newPage(count)) {
        lineFeed(count);
    }
}

void ReportModel::load(const QStringList &lines)
{
    const qint64 before = size();
    for (const QString &line : lines) {
        writeLine(line, 0, 1);
        ++lineCount_;
    }
    if (before == size() || headersIn(text().mid(before)).empty()) {
        return; // the pages that it was written in now
    }
    for (auto cell = cells_.begin() + before; cell != cells_.end(); ++cell) {
        cell->starts = false;
    }
    startsAtEnd_ = false;
    findHeaders(before);
    history_.clear(); // of the pages that there were
}

void ReportModel::reload(const QString &text)
{
    clear();
    write(text);
    startsAtEnd_ = false;
    findHeaders(0);
    history_.clear();
}

void ReportModel::withCrLf()
{
    std::vector<Cell> cells;
    for (const Cell &cell : cells_) {
        if (cell.character == u'\n' && (cells.empty() || cells.back().character != u'\r')) {
            cells.push_back({u'\r', cell.starts});
            cells.push_back({u'\n', false});
        } else {
            cells.push_back(cell);
        }
    }
    cells_ = cells;
    const std::vector<qint64> kept = starts();
    for (Cell &cell : cells_) {
        cell.starts = false;
    }
    // Only what begins a line is carried over.
    startsAtEnd_ = startsAtEnd_ && (cells_.empty() || cells_.back().character == u'\n');
    for (const qint64 start : kept) {
        if (start < size() && beginsLine(start)) {
            cells_[static_cast<std::size_t>(start)].starts = true;
        }
    }
    history_.clear();
}

void ReportModel::setTextWithStarts(const QString &text, const std::vector<qint64> &starts)
{
    setText(text);
    for (const qint64 start : starts) {
        (start < size() ? cells_[static_cast<std::size_t>(start)].starts : startsAtEnd_) = true;
    }
}

void ReportModel::replace(qint64 at, qint64 removed, const QString &inserted)
{
    Change change = {at, text().mid(at, removed), inserted, {}, {}};
    trim(change);
    change.before = startsAt(change.at, change.removed.size());
    const auto undone = std::find_if(history_.rbegin(), history_.rend(), [&](const Change &earlier) {
        return earlier.at == change.at && earlier.inserted == change.removed && earlier.removed == change.inserted &&
               earlier.after == change.before;
    });
    const bool isUndo = undone != history_.rend();
    std::vector<qint64> brought = isUndo ? undone->before : broughtBy(change, at, inserted);
    splice(change, brought, isUndo);
    change.after = startsAt(change.at, change.inserted.size());
    const qint64 end = change.at + change.removed.size();
    for (Change &earlier : history_) {
        if (earlier.at > end || (earlier.at == end && (!change.removed.isEmpty() || !isUndo))) {
            earlier.at += change.inserted.size() - change.removed.size();
        } else if (earlier.at > change.at) {
            earlier.at = change.at;
        }
    }
    if (isUndo) {
        history_.erase(std::next(undone).base());
    }
    if (!change.before.empty() || !change.after.empty() || !headersIn(change.removed).empty()) {
        history_.push_back(change);
    }
}

QString ReportModel::text() const
{
    QString text;
    for (const Cell &cell : cells_) {
        text += cell.character;
    }
    return text;
}

std::vector<kareport::ReportPage> ReportModel::pages() const
{
    std::vector<kareport::ReportPage> pages;
    bool isBegun = false;
    int lines = 0;
    const auto dropBlank = [&pages](std::size_t kept) {
        while (pages.size() > kept && pages.back().lines == 0) {
            pages.pop_back();
        }
    };
    const QString all = text();
    for (qint64 at = 0; at < size(); ++lines) {
        const qint64 feed = all.indexOf(u'\n', at);
        const qint64 end = feed < 0 ? size() : feed + 1;
        const bool begins = cells_[static_cast<std::size_t>(at)].starts;
        if (begins && !isBegun) {
            dropBlank(0);
        }
        if (begins || (!isBegun && lines % std::max(1, linesPerPage_) == 0)) {
            pages.push_back({at, at, 0});
            lines = 0;
        }
        isBegun = isBegun || begins;
        if (!QStringView(all).sliced(at, end - at).trimmed().isEmpty()) {
            pages.back().end = end;
            pages.back().lines = lines + 1;
        }
        at = end;
    }
    dropBlank(0);
    if (pages.empty() && size() > 0) {
        pages.push_back({});
    }
    return pages;
}

void ReportModel::setText(const QString &text)
{
    cells_.clear();
    startsAtEnd_ = false;
    for (const QChar character : text) {
        cells_.push_back({character, false});
    }
    history_.clear();
}

bool ReportModel::isHeader(const QString &line)
{
    static const QRegularExpression header(
        QStringLiteral("[A-Z][a-z]{2} \\d\\d, \\d{4}  \\d\\d:\\d\\d[AP]M\\s*Page: *\\d+[ \r]*$"));
    return header.match(line).hasMatch();
}

std::vector<qint64> ReportModel::headersIn(const QString &text)
{
    std::vector<qint64> found;
    qint64 at = 0;
    for (const QString &line : text.split(u'\n')) {
        if (isHeader(line)) {
            found.push_back(at);
        }
        at += line.size() + 1;
    }
    return found;
}

void ReportModel::findHeaders(qint64 from)
{
    for (const qint64 header : headersIn(text().mid(from))) {
        cells_[static_cast<std::size_t>(from + header)].starts = true;
    }
}

std::vector<qint64> ReportModel::startsAt(qint64 at, qint64 length) const
{
    std::vector<qint64> found;
    for (qint64 offset = 0; offset <= length; ++offset) {
        const qint64 place = at + offset;
        if (place < size() ? cells_[static_cast<std::size_t>(place)].starts : startsAtEnd_) {
            found.push_back(offset);
        }
    }
    return found;
}

std::vector<qint64> ReportModel::absolute(std::vector<qint64> offsets, qint64 at)
{
    for (qint64 &offset : offsets) {
        offset += at;
    }
    return offsets;
}

void ReportModel::trim(Change &change)
{
    while (!change.removed.isEmpty() && !change.inserted.isEmpty() && change.removed[0] == change.inserted[0]) {
        change.removed.remove(0, 1);
        change.inserted.remove(0, 1);
        ++change.at;
    }
    while (!change.removed.isEmpty() && !change.inserted.isEmpty() && change.removed.back() == change.inserted.back()) {
        change.removed.chop(1);
        change.inserted.chop(1);
    }
}

std::vector<qint64> ReportModel::broughtBy(const Change &change, qint64 at, const QString &inserted)
{
    std::vector<qint64> brought;
    for (auto earlier = history_.rbegin(); earlier != history_.rend(); ++earlier) {
        const qint64 length = earlier->removed.size();
        const bool isWhole = length > 2 || std::any_of(earlier->before.begin(), earlier->before.end(),
                                                       [length](qint64 o) { return o > 0 && o < length; });
        if (length > 0 && earlier->inserted.isEmpty() && isWhole && earlier->removed == change.inserted) {
            brought = earlier->before;
            brought.erase(std::remove(brought.begin(), brought.end(), length), brought.end());
            break;
        }
    }
    for (const qint64 header : headersIn(inserted)) {
        if (header == 0 && !beginsLine(at)) {
            continue;
        }
        const qint64 offset = at + header - change.at;
        if (offset >= 0 && offset < change.inserted.size()) {
            brought.push_back(offset);
        } else if (offset < 0) {
            cells_[static_cast<std::size_t>(at + header)].starts = true;
        } else {
            cells_[static_cast<std::size_t>(change.at + offset - change.inserted.size() + change.removed.size())]
                .starts = true;
        }
    }
    return brought;
}

void ReportModel::splice(const Change &change, const std::vector<qint64> &brought, bool isUndo)
{
    const auto has = [](const std::vector<qint64> &offsets, qint64 offset) {
        return std::find(offsets.begin(), offsets.end(), offset) != offsets.end();
    };
    const bool startedHere = has(change.before, 0);
    const bool startedAfter = !change.removed.isEmpty() && has(change.before, change.removed.size());
    const auto first = cells_.begin() + change.at;
    cells_.erase(first, first + change.removed.size());
    std::vector<Cell> put;
    for (const QChar character : change.inserted) {
        put.push_back({character, false});
    }
    cells_.insert(cells_.begin() + change.at, put.begin(), put.end());
    const qint64 end = change.at + change.inserted.size();
    const auto mark = [this](qint64 at, bool starts) {
        (at < size() ? cells_[static_cast<std::size_t>(at)].starts : startsAtEnd_) = starts;
    };
    mark(end, false);
    if (!isUndo && change.removed.isEmpty() && startedHere) {
        const bool isBefore = has(brought, 0) || (change.at > 0 && change.inserted.endsWith(u'\n'));
        mark(isBefore ? end : change.at, true);
    } else if (!isUndo) {
        if (startedHere) {
            mark(change.at, true);
        }
        if (startedAfter) {
            mark(end, true);
        }
    }
    for (const qint64 offset : brought) {
        mark(change.at + offset, true);
    }
}
