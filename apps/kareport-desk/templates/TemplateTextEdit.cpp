#include "TemplateTextEdit.h"

#include "PlainWidgets.h"
#include "TemplateHighlighter.h"
#include "TextDifference.h"
#include "Xlate.h"

#include <QAbstractItemView>
#include <QCompleter>
#include <QFontDatabase>
#include <QHelpEvent>
#include <QPainter>
#include <QTextBlock>
#include <QTextEdit>
#include <QToolTip>

#include <algorithm>

namespace kareport
{

/// The line numbers, and a sign at the lines with remarks.
class TemplateTextEdit::Margin : public QWidget
{
public:
    explicit Margin(TemplateTextEdit &edit) : QWidget(&edit), edit_(edit) {}

    QSize sizeHint() const override { return {edit_.marginWidth(), 0}; }

protected:
    void paintEvent(QPaintEvent *event) override { edit_.paintMargin(*event); }

private:
    TemplateTextEdit &edit_;
};

namespace
{

constexpr int marginGap = 6; // pixels beside the numbers
constexpr int tabBlanks = 4;

QColor remarkColour(const QPalette &palette, bool isError)
{
    if (isError) {
        return isDark(palette) ? QColor(242, 120, 110) : QColor(190, 30, 20);
    }
    return isDark(palette) ? QColor(235, 190, 90) : QColor(150, 100, 0);
}

QColor fieldColour(const QPalette &palette)
{
    return isDark(palette) ? QColor(50, 66, 84) : QColor(226, 238, 252);
}

QColor foundColour(const QPalette &palette)
{
    return isDark(palette) ? QColor(92, 82, 30) : QColor(255, 240, 170);
}

QTextCursor cursorOver(QTextDocument &document, const TextRange &range)
{
    const auto last = static_cast<qsizetype>(document.characterCount()) - 1;
    QTextCursor cursor(&document);
    cursor.setPosition(static_cast<int>(std::clamp<qsizetype>(range.begin, 0, last)));
    cursor.setPosition(static_cast<int>(std::clamp<qsizetype>(range.end, 0, last)), QTextCursor::KeepAnchor);
    return cursor;
}

} // namespace

TemplateTextEdit::TemplateTextEdit(QWidget *parent)
    : QPlainTextEdit(parent), margin_(new Margin(*this)), completer_(new QCompleter(this))
{
    setAccessibleName(Xlate("Text of the template"));
    setFont(QFontDatabase::systemFont(QFontDatabase::FixedFont));
    setLineWrapMode(QPlainTextEdit::NoWrap);
    setTabStopDistance(tabBlanks * fontMetrics().horizontalAdvance(u' '));
    setMouseTracking(true);
    completer_->setModel(&words_);
    completer_->setWidget(this);
    completer_->setCaseSensitivity(Qt::CaseInsensitive);
    completer_->setCompletionMode(QCompleter::PopupCompletion);
    completer_->popup()->setAccessibleName(Xlate("What can be written here"));
    highlighter_ = new TemplateHighlighter(document(), palette());
    connect(completer_, qOverload<const QString &>(&QCompleter::activated), this,
            [this](const QString &word) { insertCompletion(word); });
    connect(this, &QPlainTextEdit::blockCountChanged, this, [this] { placeMargin(); });
    connect(this, &QPlainTextEdit::updateRequest, this, [this](const QRect &rect, int dy) {
        if (dy != 0) {
            margin_->scroll(0, dy);
        } else {
            margin_->update(0, rect.y(), margin_->width(), rect.height());
        }
    });
    connect(this, &QPlainTextEdit::cursorPositionChanged, this, [this] { showMarks(); });
    placeMargin();
}

QString TemplateTextEdit::wholeText() const
{
    return document()->toRawText().replace(QChar::ParagraphSeparator, u'\n');
}

void TemplateTextEdit::replaceBy(const QString &text, const TextRange &selection)
{
    const TextDifference change = differenceOf(wholeText(), text);
    QTextCursor cursor = cursorOver(*document(), {change.at, change.at + change.removed});
    cursor.beginEditBlock();
    cursor.insertText(change.inserted);
    cursor.endEditBlock();
    if (selection.exists()) {
        select(selection);
    }
}

void TemplateTextEdit::select(const TextRange &range)
{
    setTextCursor(cursorOver(*document(), range));
    ensureCursorVisible();
}

void TemplateTextEdit::setRemarks(std::vector<RemarkMark> remarks)
{
    remarks_ = std::move(remarks);
    showMarks();
    margin_->update();
}

const RemarkMark *TemplateTextEdit::remarkAt(qsizetype position) const
{
    const auto found = std::find_if(remarks_.begin(), remarks_.end(),
                                    [position](const RemarkMark &remark) { return remark.range.touches(position); });
    return found != remarks_.end() ? &*found : nullptr;
}

void TemplateTextEdit::setField(const TextRange &field)
{
    field_ = field;
    showMarks();
}

void TemplateTextEdit::setFound(const std::vector<TextRange> &found)
{
    found_ = found;
    showMarks();
}

void TemplateTextEdit::showMarks()
{
    QList<QTextEdit::ExtraSelection> marks;
    const auto add = [&](const TextRange &range, const QTextCharFormat &format) {
        QTextEdit::ExtraSelection mark;
        mark.cursor = cursorOver(*document(), range);
        mark.format = format;
        marks.append(mark);
    };
    QTextCharFormat line;
    line.setBackground(palette().color(QPalette::AlternateBase));
    line.setProperty(QTextFormat::FullWidthSelection, true);
    const qsizetype at = textCursor().position();
    add({at, at}, line);
    if (field_.exists()) {
        QTextCharFormat format;
        format.setBackground(fieldColour(palette()));
        add(field_, format);
    }
    for (const TextRange &range : found_) {
        QTextCharFormat format;
        format.setBackground(foundColour(palette()));
        add(range, format);
    }
    for (const RemarkMark &remark : remarks_) {
        QTextCharFormat format;
        format.setUnderlineStyle(QTextCharFormat::WaveUnderline);
        format.setUnderlineColor(remarkColour(palette(), remark.isError));
        add(remark.range, format);
    }
    setExtraSelections(marks);
}

int TemplateTextEdit::marginWidth() const
{
    constexpr int leastDigits = 3;
    const auto digits = std::max<qsizetype>(leastDigits, QString::number(blockCount()).size());
    const int digit = fontMetrics().horizontalAdvance(u'9');
    return static_cast<int>(digits + 1) * digit + 2 * marginGap; // one more for the sign of a remark
}

void TemplateTextEdit::placeMargin()
{
    setViewportMargins(marginWidth(), 0, 0, 0);
    const QRect inside = contentsRect();
    margin_->setGeometry(inside.left(), inside.top(), marginWidth(), inside.height());
}

void TemplateTextEdit::resizeEvent(QResizeEvent *event)
{
    QPlainTextEdit::resizeEvent(event);
    placeMargin();
}

void TemplateTextEdit::changeEvent(QEvent *event)
{
    QPlainTextEdit::changeEvent(event);
    if (event->type() == QEvent::PaletteChange && highlighter_ != nullptr) {
        highlighter_->setColours(palette());
        showMarks();
    } else if (event->type() == QEvent::FontChange && highlighter_ != nullptr) {
        setTabStopDistance(tabBlanks * fontMetrics().horizontalAdvance(u' '));
        placeMargin();
    }
}

void TemplateTextEdit::paintMargin(QPaintEvent &event)
{
    QPainter painter(margin_);
    painter.fillRect(event.rect(), palette().color(QPalette::Window));
    painter.setFont(font());
    QTextBlock block = firstVisibleBlock();
    qreal top = blockBoundingGeometry(block).translated(contentOffset()).top();
    const int digit = fontMetrics().horizontalAdvance(u'9');
    for (; block.isValid() && top <= event.rect().bottom(); block = block.next()) {
        const qreal height = blockBoundingRect(block).height();
        const QRectF line(0, top, margin_->width() - marginGap, height);
        painter.setPen(palette().color(QPalette::WindowText));
        painter.drawText(line, Qt::AlignRight | Qt::AlignVCenter, QString::number(block.blockNumber() + 1));
        const RemarkMark *worst = nullptr;
        for (const RemarkMark &remark : remarks_) {
            const bool isHere = block.contains(static_cast<int>(remark.range.begin));
            worst = isHere && (worst == nullptr || remark.isError) ? &remark : worst;
        }
        if (worst != nullptr) {
            painter.setPen(remarkColour(palette(), worst->isError));
            painter.drawText(QRectF(marginGap / 2.0, top, digit, height), Qt::AlignCenter,
                             worst->isError ? QStringLiteral("\u00D7") : QStringLiteral("!"));
        }
        top += height;
    }
}

bool TemplateTextEdit::viewportEvent(QEvent *event)
{
    if (event->type() == QEvent::ToolTip) {
        const auto *help = static_cast<QHelpEvent *>(event);
        const RemarkMark *remark = remarkAt(cursorForPosition(help->pos()).position());
        QToolTip::showText(help->globalPos(), remark != nullptr ? plainToolTip(remark->text) : QString(), this);
        return true;
    }
    return QPlainTextEdit::viewportEvent(event);
}

bool TemplateTextEdit::event(QEvent *event)
{
    if (event->type() == QEvent::ToolTip) { // over the margin
        const auto *help = static_cast<QHelpEvent *>(event);
        const QTextBlock block = cursorForPosition(QPoint(0, help->pos().y() - viewport()->y())).block();
        QStringList texts;
        for (const RemarkMark &remark : remarks_) {
            if (block.contains(static_cast<int>(remark.range.begin))) {
                texts.append(remark.text);
            }
        }
        QToolTip::showText(help->globalPos(), texts.isEmpty() ? QString() : plainToolTip(texts.join(u'\n')), this);
        return true;
    }
    return QPlainTextEdit::event(event);
}

} // namespace kareport
