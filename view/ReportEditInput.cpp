#include "PageUnits.h"
#include "ReportEdit.h"

#include "Characters.h"

#include <QKeyEvent>
#include <QMimeData>
#include <QTextBlock>
#include <QTextDocument>
#include <QTextLayout>
#include <QWheelEvent>

#include <algorithm>
#include <iterator>

namespace kareport
{

namespace
{

constexpr int zoomSteps[] = {25, 33, 50, 67, 75, 80, 90, 100, 110, 125, 150, 175, 200, 250, 300, 400, 500};
constexpr int wheelStep = 120;

/// What a key zooms by: 1, −1, 0 for back to 100 %.
std::optional<int> zoomOfKey(const QKeyEvent &event)
{
    if ((event.modifiers() & ~(Qt::KeypadModifier | Qt::ShiftModifier)) != Qt::ControlModifier) {
        return std::nullopt;
    }
    switch (event.key()) {
    case Qt::Key_Plus:
    case Qt::Key_Equal: return 1;
    case Qt::Key_Minus: return -1;
    case Qt::Key_0: return 0;
    default: return std::nullopt;
    }
}

} // namespace

void ReportEdit::setZoomPercent(int percent)
{
    const int zoom = std::clamp(percent, zoomSteps[0], *std::rbegin(zoomSteps));
    if (zoom == zoom_) {
        return;
    }
    zoom_ = zoom;
    applyZoom();
    ensureCursorVisible();
    if (zoomed_) {
        zoomed_();
    }
}

void ReportEdit::zoomStep(int direction)
{
    const auto *next = direction > 0 ? std::upper_bound(std::begin(zoomSteps), std::end(zoomSteps), zoom_)
                                     : std::lower_bound(std::begin(zoomSteps), std::end(zoomSteps), zoom_);
    if (direction > 0 ? next != std::end(zoomSteps) : next != std::begin(zoomSteps)) {
        setZoomPercent(direction > 0 ? *next : *(next - 1));
    }
}

void ReportEdit::applyZoom()
{
    // Fonts stay as they are named. They are measured for a device of more dots, which scales the sizes that rich text
    // names as well as the report's own, and the distance of tab stops. That stays too: printing uses it.
    QAbstractTextDocumentLayout *layout = document()->documentLayout();
    const bool wasZoomed = layout->paintDevice() != nullptr;
    setTabStopDistance(kareport::tabColumns * QFontMetricsF(font()).horizontalAdvance(QLatin1Char('x')));
    if (zoom_ == 100) {
        layout->setPaintDevice(nullptr);
    } else {
        zoomDevice_ = QImage(1, 1, QImage::Format_RGB32);
        zoomDevice_.setDotsPerMeterX(qRound(logicalDpiX() * zoom_ / 100.0 / kareport::metresPerInch));
        zoomDevice_.setDotsPerMeterY(qRound(logicalDpiY() * zoom_ / 100.0 / kareport::metresPerInch));
        layout->setPaintDevice(&zoomDevice_);
    }
    if (wasZoomed || zoom_ != 100) {
        document()->setDefaultFont(document()->defaultFont()); // lays the text out again
        viewport()->update();
    }
}

bool ReportEdit::event(QEvent *event)
{
    // These keys belong to the control also where a menu has them.
    if (event->type() == QEvent::ShortcutOverride && zoomOfKey(*static_cast<QKeyEvent *>(event))) {
        event->accept();
        return true;
    }
    return QPlainTextEdit::event(event);
}

void ReportEdit::keyPressEvent(QKeyEvent *event)
{
    if (const auto zoom = zoomOfKey(*event)) {
        *zoom == 0 ? setZoomPercent(100) : zoomStep(*zoom);
        return;
    }
    if (event->matches(QKeySequence::MoveToEndOfDocument) || event->matches(QKeySequence::SelectEndOfDocument) ||
        event->matches(QKeySequence::SelectAll))
    {
        finishLoading(); // the end is that of the whole text
    }
    if (event->matches(QKeySequence::Copy)) {
        copy();
        return;
    }
    if (event->matches(QKeySequence::Cut) && !isReadOnly()) {
        cut();
        return;
    }
    if (event->matches(QKeySequence::InsertLineSeparator) && !isReadOnly()) {
        // A report has lines only: a break within a paragraph would be a character that no printer knows.
        textCursor().insertBlock();
        ensureCursorVisible();
        return;
    }
    QPlainTextEdit::keyPressEvent(event);
}

void ReportEdit::wheelEvent(QWheelEvent *event)
{
    if (!event->modifiers().testFlag(Qt::ControlModifier)) {
        QPlainTextEdit::wheelEvent(event);
        return;
    }
    // Fine wheels report less than a step at a time.
    wheel_ += event->angleDelta().y();
    for (; wheel_ >= wheelStep; wheel_ -= wheelStep) {
        zoomStep(1);
    }
    for (; wheel_ <= -wheelStep; wheel_ += wheelStep) {
        zoomStep(-1);
    }
    event->accept();
}

void ReportEdit::focusInEvent(QFocusEvent *event)
{
    QPlainTextEdit::focusInEvent(event);
    if (focused_) {
        focused_();
    }
}

void ReportEdit::keepGlyphs(int line, bool on)
{
    for (int number = line - 1; number <= line + 1; ++number) {
        if (const QTextBlock block = document()->findBlockByNumber(number); block.isValid()) {
            block.layout()->setCacheEnabled(on);
        }
    }
}

void ReportEdit::paintEvent(QPaintEvent *event)
{
    // A key paints the cursor's line and touches the neighbouring ones. Finding their glyphs again is most of the work.
    if (const int line = textCursor().blockNumber(); line != keptLine_) {
        keepGlyphs(keptLine_, false);
        keptLine_ = line;
    }
    keepGlyphs(keptLine_, true);
    QPlainTextEdit::paintEvent(event);
    if (pageBegunBy_) {
        drawPageLines(*event);
    }
}

void ReportEdit::insertFromMimeData(const QMimeData *source)
{
    if (!source->hasText() || isReadOnly()) {
        return;
    }
    QString text = source->text();
    text.replace(QChar::LineSeparator, QLatin1Char('\n'));
    textCursor().insertText(text);
    ensureCursorVisible();
}

} // namespace kareport
