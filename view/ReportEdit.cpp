#include "ReportEdit.h"

#include "ValueGuard.h"
#include "Xlate.h"

#include <QScrollBar>
#include <QTextBlock>
#include <QTextDocument>

#include <algorithm>

namespace kareport
{

ReportEdit::ReportEdit(QWidget *parent) : QPlainTextEdit(parent)
{
    setAccessibleName(Xlate("Report text"));
    setLineWrapMode(NoWrap);
    setWordWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere);
    connect(verticalScrollBar(), &QScrollBar::actionTriggered, this, [this] { isScrolled_ = true; });
    watch();
}

ReportEdit::~ReportEdit()
{
    // The document, a child, is destroyed after the device that its layout measures with.
    document()->documentLayout()->setPaintDevice(nullptr);
}

void ReportEdit::setReportFont(const QFont &font)
{
    setFont(font);
    document()->setDefaultFont(font);
    applyZoom();
}

ReportEdit::Place ReportEdit::place() const
{
    return {textCursor().position(), verticalScrollBar()->value(), horizontalScrollBar()->value()};
}

void ReportEdit::goTo(const Place &place)
{
    QTextCursor cursor(document());
    cursor.setPosition(std::min(place.position, length_));
    setTextCursor(cursor);
    verticalScrollBar()->setValue(place.top);
    horizontalScrollBar()->setValue(place.left);
}

ReportEdit::LinePlace ReportEdit::linePlace()
{
    if (isWaiting() && wanted_.position >= length_) {
        finishLoading(); // the place is in what is missing
    }
    const QTextCursor cursor = textCursor();
    const QTextBlock anchor = document()->findBlock(cursor.anchor());
    return {anchor.blockNumber(),     cursor.anchor() - anchor.position(), cursor.blockNumber(),
            cursor.positionInBlock(), verticalScrollBar()->value(),        horizontalScrollBar()->value()};
}

/// The position of a column of a line, or the last one that there is.
int ReportEdit::positionOf(int line, int column) const
{
    const QTextBlock block = document()->findBlockByNumber(std::min(line, document()->blockCount() - 1));
    const bool isBeyond = line >= document()->blockCount();
    return block.position() + (isBeyond ? block.length() - 1 : std::min(column, block.length() - 1));
}

void ReportEdit::goToLinePlace(const LinePlace &place)
{
    constexpr int mostShown = 500; // no window shows more lines
    loadToLine(std::max({place.anchorLine, place.line, place.top + mostShown}));
    QTextCursor cursor(document());
    cursor.setPosition(positionOf(place.anchorLine, place.anchorColumn));
    cursor.setPosition(positionOf(place.line, place.column), QTextCursor::KeepAnchor);
    setTextCursor(cursor);
    verticalScrollBar()->setValue(place.top);
    horizontalScrollBar()->setValue(place.left);
}

void ReportEdit::goToLine(int line)
{
    constexpr int mostShown = 500;
    loadToLine(line + mostShown);
    QTextCursor cursor(document());
    cursor.setPosition(positionOf(line, 0));
    setTextCursor(cursor);
    centerCursor();
}

void ReportEdit::watch()
{
    noteLength();
    watching_ = connect(document(), &QTextDocument::contentsChange, this, &ReportEdit::noteEdit);
}

void ReportEdit::noteLength()
{
    length_ = document()->characterCount() - 1;
    lineEnds_ = document()->blockCount() - 1;
}

void ReportEdit::noteEdit(int position, int removed, int added)
{
    ReportChange change;
    change.lengthBefore = length_;
    change.lineEndsInAll = lineEnds_;
    noteLength();
    if (isFollowing_ || isLoading() || !edited_) {
        return;
    }
    // The end of the last paragraph, which is not a character of the text, is counted with an edit that touches it.
    const int over = std::max(0, position + added - length_);
    change.position = position;
    change.removed = removed - over;
    int end = position + added - over;
    if (change.removed < 0 || change.lengthBefore - change.removed + end - position != length_) {
        change.position = 0;
        change.removed = change.lengthBefore;
        end = length_;
    }
    if (change.removed == 0 && end == change.position) {
        return;
    }
    QTextCursor cursor(document());
    cursor.setPosition(change.position);
    change.lineEndsBefore = cursor.blockNumber();
    cursor.setPosition(end, QTextCursor::KeepAnchor);
    const int lineEndsAdded = cursor.blockNumber() - change.lineEndsBefore;
    change.lineEndsRemoved = change.lineEndsInAll + lineEndsAdded - lineEnds_;
    change.inserted = cursor.selectedText();
    change.inserted.replace(QChar::ParagraphSeparator, QLatin1Char('\n'));
    edited_(change);
}

bool ReportEdit::applyChange(const ReportChange &change)
{
    if (isLoading() || change.lengthBefore != length_ || change.lineEndsInAll != lineEnds_) {
        return false;
    }
    const ValueGuard following(isFollowing_, true, [this](bool on) { isFollowing_ = on; });
    QTextCursor cursor(document());
    cursor.setPosition(change.position);
    cursor.setPosition(change.position + change.removed, QTextCursor::KeepAnchor);
    cursor.insertText(change.inserted);
    return true;
}

void ReportEdit::selectAll()
{
    finishLoading();
    QPlainTextEdit::selectAll();
}

QString ReportEdit::windowText()
{
    finishLoading();
    const QString raw = document()->toRawText();
    QString text;
    text.reserve(windowTextLength());
    for (const QChar character : raw) {
        if (character == QChar::ParagraphSeparator) {
            text += QLatin1String("\r\n");
        } else {
            // A line break within a paragraph is one character here as there.
            text += character == QChar::LineSeparator ? QChar(u'\n') : character;
        }
    }
    return text;
}

} // namespace kareport
