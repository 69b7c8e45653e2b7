#include "PageWriter.h"

#include "PageMark.h"

#include <QByteArrayView>

#include <cstdint>
#include <cstring>
#include <type_traits>

namespace kareport
{

namespace
{

/// Whether a text holds a line feed. Most pieces are short and hold none, and the library's own search, which is made for
/// long texts, takes most of its time to begin.
bool holdsLineFeed(QStringView text)
{
    constexpr std::uint64_t ones = 0x0001000100010001;
    constexpr qsizetype atOnce = sizeof ones / sizeof(char16_t);
    const char16_t *at = text.utf16();
    const char16_t *const end = at + text.size();
    std::uint64_t found = 0;
    for (; end - at >= atOnce; at += atOnce) {
        std::uint64_t word;
        std::memcpy(&word, at, sizeof word);
        // A line feed becomes 0, and taking 1 from it sets the top bit that it did not have.
        const std::uint64_t difference = word ^ (ones * u'\n');
        found |= (difference - ones) & ~difference & (ones << 15);
    }
    bool isFound = found != 0;
    for (; at != end; ++at) {
        isFound = isFound || *at == u'\n';
    }
    return isFound;
}

qsizetype countAll(QStringView text)
{
    return holdsLineFeed(text) ? text.count(u'\n') : 0;
}

qsizetype countAll(QLatin1StringView text)
{
    const QByteArrayView bytes(text);
    return bytes.contains('\n') ? bytes.count('\n') : 0;
}

template <typename View>
int countLineFeeds(View text)
{
    // One at the end need not be looked for.
    const int atEnd = text.endsWith(u'\n') ? 1 : 0;
    return atEnd + static_cast<int>(countAll(text.chopped(atEnd)));
}

} // namespace

PageWriterObserver::~PageWriterObserver() = default;

PageWriter::PageWriter(PageWriterObserver *observer, ReportText::Reallocate reallocate)
    : observer_(observer), text_(reallocate)
{}

void PageWriter::clear()
{
    text_.clear();
    starts_.clear();
    losses_ = 0;
    lineCount_ = 0;
    heading_.text.clear();
    noteChange();
}

bool PageWriter::emptyIntoOutlet()
{
    bool isTaken = false;
    losesNothing([&] { isTaken = text_.visit([this](auto text) { return outlet_->write(text); }); });
    text_.drain();
    starts_.clear();
    return isTaken;
}

template <typename View>
bool PageWriter::tellWritten(View text, int style)
{
    if constexpr (std::is_same_v<View, QStringView>) {
        return observer_->textWritten(text, style);
    } else {
        return whileMemoryLasts(false, [&] { return observer_->textWritten(QString(text), style); });
    }
}

template <typename View>
bool PageWriter::writeText(View text, int style)
{
    const bool isOwn = text_.owns(text);
    const qint64 before = text_.size();
    const int lineFeeds = countLineFeeds(text);
    if (!text_.append(text)) {
        noteLostText();
        return false;
    }
    if (isOwn) { // the text may have moved, and the piece with it
        if constexpr (std::is_same_v<View, QStringView>) {
            text = text_.view().sliced(before);
        } else {
            text = text_.narrowView().sliced(before);
        }
    }
    lineNumber_ += lineFeeds;
    lineCount_ += lineFeeds;
    if (observer_ != nullptr && !text.isEmpty()) {
        if (!observer_->takesText()) {
            observer_->changed();
        } else if (!tellWritten(text, style)) {
            lineNumber_ -= lineFeeds;
            lineCount_ -= lineFeeds;
            takeBack(before);
            return false;
        }
    }
    noteGrowth();
    return true;
}

bool PageWriter::write(QStringView text, int style)
{
    return writeText(text, style);
}

bool PageWriter::write(QLatin1StringView text, int style)
{
    return writeText(text, style);
}

void PageWriter::lineFeed(qint64 count)
{
    for (qint64 i = 0; i < count; ++i) {
        if (!text_.appendLineEnd()) {
            noteLostText();
            return;
        }
        if (observer_ != nullptr && !observer_->lineEnded()) {
            takeBack(text_.size() - 2);
            return;
        }
        ++lineNumber_;
        ++lineCount_;
        noteGrowth();
    }
}

void PageWriter::exchangeText(ReportText &text, std::vector<qint64> pageStarts, qint64 lineEnds)
{
    text_.swap(text);
    starts_.assign(std::move(pageStarts));
    lineNumber_ += static_cast<int>(lineEnds);
    lineCount_ += lineEnds;
}

bool PageWriter::replace(qint64 at, qint64 removed, QStringView inserted)
{
    if (at < 0 || removed < 0 || at > text_.size() || removed > text_.size() - at) {
        return false;
    }
    return whileMemoryLasts(false, [&] {
        if (text_.owns(inserted)) {
            return replace(at, removed, inserted.toString());
        }
        const bool wantsRemoved = starts_.wantsRemoved(at, removed, inserted.size());
        const QString removedText = wantsRemoved ? text_.piece(at, removed) : QString();
        const bool mayBeHeader = inserted.size() > PageStarts::shortestHeader;
        const bool beginsLine = at == 0 || (mayBeHeader && text_.piece(at - 1, 1) == u"\n");
        PageStarts::Edit edit = starts_.prepare(at, removed, removedText, inserted, beginsLine);
        if (!text_.replace(at, removed, inserted)) {
            return false;
        }
        starts_.carryOut(std::move(edit));
        return true;
    });
}

void PageWriter::notePageStart()
{
    if (outlet_ == nullptr && !doneWhileMemoryLasts([this] { starts_.add(text_.size()); })) {
        noteLostText(); // the text is whole, its pages are not
    }
}

void PageWriter::beginFirstPage()
{
    pageNumber_ = 1;
    lineNumber_ = 1;
    notePageStart();
    if (headerFlag_) {
        writeHeader();
    }
}

void PageWriter::breakPage()
{
    lineFeed(linesLeft() + 1);
    ++pageNumber_;
    lineNumber_ = 1;
    notePageStart();
    if (headerFlag_) {
        writeHeader();
    }
}

bool PageWriter::newPage(qint64 linesNeeded)
{
    if (lineCount_ == 0) {
        beginFirstPage();
        return true;
    }
    const qint64 remaining = linesLeft();
    if (remaining != 0 && linesNeeded >= 0 && linesNeeded < remaining) {
        return false;
    }
    breakPage();
    return true;
}

void PageWriter::skipLines(qint64 count)
{
    if (!newPage(count)) {
        lineFeed(count);
    }
}

template <typename View>
void PageWriter::writeTextLine(View text, int linesAfter, int style)
{
    writeText(text, style);
    if (linesAfter != 0) {
        lineFeed(1);
        skipLines(qint64(linesAfter) - 1);
    }
    noteChange();
}

void PageWriter::writeLine(QStringView text, int linesBefore, int linesAfter, int style)
{
    skipLines(linesBefore);
    writeTextLine(text, linesAfter, style);
}

void PageWriter::writeLine(QLatin1StringView text, int linesBefore, int linesAfter, int style)
{
    skipLines(linesBefore);
    writeTextLine(text, linesAfter, style);
}

bool PageWriter::isNumbered(QStringView text) const
{
    return hasPageMarks_ && text.contains(pageMark);
}

void PageWriter::writeNumberedLine(QStringView text, qsizetype marked, int linesBefore, int linesAfter, int style)
{
    skipLines(linesBefore); // which may begin the page that counts
    if (!isNumbered(text.first(marked))) {
        writeTextLine(text, linesAfter, style);
        return;
    }
    const QString numbered = withPageNumber(text.first(marked), pageNumber_).append(text.sliced(marked));
    writeTextLine(QStringView(numbered), linesAfter, style);
}

void PageWriter::writeHeadingText()
{
    if (isNumbered(heading_.text)) {
        write(withPageNumber(heading_.text, pageNumber_), 0);
    } else {
        write(heading_.text, 0);
    }
}

void PageWriter::writeHeading()
{
    lineFeed(heading_.linesBefore);
    writeHeadingText();
    lineFeed(heading_.linesAfter);
    noteChange();
}

void PageWriter::writeHeader()
{
    // Counted here and again when the heading is written: a heading of several lines reserves a spare line for each
    // of its line breaks. Page layouts in use are tuned to it.
    const int lineFeeds = countLineFeeds(heading_.text);
    lineNumber_ += lineFeeds;
    lineCount_ += lineFeeds;
    write(headerLine_ + QStringLiteral("%1").arg(pageNumber_, 3), 0);
    lineFeed(qint64(heading_.linesBefore) + headerGap);
    writeHeadingText();
    lineFeed(heading_.linesAfter);
    noteChange();
}

void PageWriter::noteChange()
{
    if (observer_ != nullptr) {
        observer_->changed();
    }
}

} // namespace kareport
