#include "PageWriter.h"

#include "LineFeeds.h"
#include "PageMark.h"

#include <type_traits>

namespace kareport
{

PageWriterObserver::~PageWriterObserver() = default;

PageWriter::PageWriter(PageWriterObserver *observer, ReportText::Reallocate reallocate)
    : observer_(observer), text_(reallocate)
{}

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
void PageWriter::placeEntries(qint64 at, View text)
{
    if constexpr (std::is_same_v<View, QStringView>) {
        outline_.place(at, text);
    } else if (!doneWhileMemoryLasts([&] { outline_.place(at, QString(text)); })) {
        outline_.place(at, u"."); // a line that most likely shows something
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
    if (!text.isEmpty()) {
        lastPieceStart_ = before;
    }
    if (outline_.isWaiting()) {
        placeEntries(before, text);
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

void PageWriter::notePageStart()
{
    if (outlet_ == nullptr && !doneWhileMemoryLasts([this] { starts_.add(text_.size()); })) {
        noteLostText(); // the text is whole, its pages are not
    }
}

void PageWriter::announceEntry(int level, const QString &text)
{
    if (outlet_ == nullptr && !doneWhileMemoryLasts([&] { outline_.announce(level, text); })) {
        noteLostText(); // the text is whole, its outline is not
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
    if (headingStarts_ != nullptr && !heading_.text.isEmpty()) {
        headingStarts_->push_back(text_.size());
    }
    const qint64 piece = lastPieceStart_;
    if (isNumbered(heading_.text)) {
        write(withPageNumber(heading_.text, pageNumber_), 0);
    } else {
        write(heading_.text, 0);
    }
    lastPieceStart_ = piece;
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
    const qint64 piece = lastPieceStart_;
    write(headerLine_ + QStringLiteral("%1").arg(pageNumber_, 3), 0);
    lastPieceStart_ = piece;
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
