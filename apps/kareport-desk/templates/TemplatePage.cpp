#include "TemplatePage.h"

#include "FixedPitchFont.h"
#include "PageDefaults.h"
#include "TemplateHighlighter.h"
#include "Xlate.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QScrollBar>
#include <QTextBlock>

#include <algorithm>

namespace kareport
{

namespace
{

/// The lines of a text, whatever ends them, and where each begins.
QStringList linesOf(const QString &text, std::vector<qint64> &starts)
{
    QStringList lines;
    starts.clear();
    for (qsizetype begin = 0;;) {
        starts.push_back(begin);
        qsizetype end = begin;
        while (end < text.size() && text[end] != u'\r' && text[end] != u'\n') {
            ++end;
        }
        lines.append(text.mid(begin, end - begin));
        if (end == text.size()) {
            return lines;
        }
        begin = end + (text[end] == u'\r' && end + 1 < text.size() && text[end + 1] == u'\n' ? 2 : 1);
    }
}

} // namespace

TemplatePage::TemplatePage(QWidget *parent) : QPlainTextEdit(parent)
{
    setAccessibleName(Xlate("First pages of the report"));
    setAccessibleDescription(Xlate("Enter on a value or a label goes to its field in the template."));
    setFont(fixedPitchFont(defaultFace.toString()));
    setReadOnly(true);
    setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    setLineWrapMode(QPlainTextEdit::NoWrap);
    setUndoRedoEnabled(false);
    viewport()->setMouseTracking(true);
}

void TemplatePage::setPages(PreviewPages pages)
{
    const bool isSame = pages.text == pages_.text && !lineStarts_.empty();
    pages_ = std::move(pages);
    if (!isSame) {
        const int across = horizontalScrollBar()->value();
        const int down = verticalScrollBar()->value();
        const int block = textCursor().blockNumber();
        const int column = textCursor().positionInBlock();
        setPlainText(linesOf(pages_.text, lineStarts_).join(u'\n'));
        QTextCursor cursor(document()->findBlockByNumber(std::min(block, blockCount() - 1)));
        cursor.setPosition(cursor.position() + std::min(column, cursor.block().length() - 1));
        setTextCursor(cursor);
        horizontalScrollBar()->setValue(across);
        verticalScrollBar()->setValue(down);
    }
    field_ = {}; // of the text before
    showMarks();
}

int TemplatePage::positionOf(qint64 at) const
{
    const auto after = std::upper_bound(lineStarts_.begin(), lineStarts_.end(), at);
    if (after == lineStarts_.begin()) {
        return 0;
    }
    const QTextBlock block = document()->findBlockByNumber(static_cast<int>(after - lineStarts_.begin()) - 1);
    return block.position() + static_cast<int>(std::min<qint64>(at - *(after - 1), block.length() - 1));
}

const PreviewCell *TemplatePage::cellAt(int position) const
{
    const QTextBlock block = document()->findBlock(position);
    const auto line = static_cast<std::size_t>(block.blockNumber());
    return block.isValid() && line < lineStarts_.size() ? pages_.cellAt(lineStarts_[line] + position - block.position())
                                                        : nullptr;
}

void TemplatePage::mark(const TextRange &field)
{
    if (field.begin != field_.begin || field.end != field_.end) {
        field_ = field;
        showMarks();
    }
}

void TemplatePage::showMarks()
{
    QList<QTextEdit::ExtraSelection> marks;
    for (const PreviewCell &cell : pages_.cells) {
        if (!field_.exists() || cell.field.begin != field_.begin) {
            continue;
        }
        QTextEdit::ExtraSelection mark;
        mark.cursor = QTextCursor(document());
        mark.cursor.setPosition(positionOf(cell.at));
        mark.cursor.setPosition(positionOf(cell.at + cell.size), QTextCursor::KeepAnchor);
        mark.format.setBackground(isDark(palette()) ? QColor(46, 82, 122) : QColor(200, 224, 252));
        marks.append(mark);
    }
    setExtraSelections(marks);
}

void TemplatePage::choose(int position)
{
    const PreviewCell *cell = cellAt(position);
    if (cell == nullptr && position > 0) {
        cell = cellAt(position - 1); // a click on the right half of its last character
    }
    if (cell != nullptr && chosen) {
        chosen(*cell);
    }
}

void TemplatePage::mouseMoveEvent(QMouseEvent *event)
{
    const QTextCursor under = cursorForPosition(event->position().toPoint());
    viewport()->setCursor(cellAt(under.position()) != nullptr ? Qt::PointingHandCursor : Qt::IBeamCursor);
    QPlainTextEdit::mouseMoveEvent(event);
}

void TemplatePage::mouseReleaseEvent(QMouseEvent *event)
{
    QPlainTextEdit::mouseReleaseEvent(event);
    if (event->button() == Qt::LeftButton && !textCursor().hasSelection()) {
        choose(cursorForPosition(event->position().toPoint()).position());
    }
}

void TemplatePage::keyPressEvent(QKeyEvent *event)
{
    if (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter) {
        choose(textCursor().position());
        return;
    }
    QPlainTextEdit::keyPressEvent(event);
}

void TemplatePage::changeEvent(QEvent *event)
{
    QPlainTextEdit::changeEvent(event);
    if (event->type() == QEvent::PaletteChange) {
        showMarks();
    }
}

/// A line shows where a page begins.
void TemplatePage::paintEvent(QPaintEvent *event)
{
    QPlainTextEdit::paintEvent(event);
    QPainter painter(viewport());
    painter.setPen(QPen(palette().color(QPalette::Mid), 1, Qt::DashLine));
    for (std::size_t page = 1; page < pages_.starts.size(); ++page) {
        const QTextBlock block = document()->findBlock(positionOf(pages_.starts[page]));
        const qreal top = blockBoundingGeometry(block).translated(contentOffset()).top();
        painter.drawLine(QPointF(0, top), QPointF(viewport()->width(), top));
    }
}

} // namespace kareport
