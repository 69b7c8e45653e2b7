#include "ReportEdit.h"

#include "Characters.h"
#include "Xlate.h"

#include <QKeyEvent>
#include <QMimeData>
#include <QPlainTextDocumentLayout>
#include <QScrollBar>
#include <QSignalBlocker>
#include <QTextBlock>
#include <QTextDocument>
#include <QTextLayout>
#include <QWheelEvent>

#include <algorithm>
#include <iterator>
#include <utility>

namespace kareport
{

namespace
{

constexpr int zoomSteps[] = {25, 33, 50, 67, 75, 80, 90, 100, 110, 125, 150, 175, 200, 250, 300, 400, 500};
constexpr int wheelStep = 120;

QTextDocument *newDocument(QWidget *parent, const QFont &font)
{
    auto *document = new QTextDocument(parent);
    document->setDocumentLayout(new QPlainTextDocumentLayout(document));
    document->setDefaultFont(font);
    return document;
}

/// Rich text names its colours for paper, so it is shown on paper also where the desktop is dark.
QPalette paper()
{
    QPalette palette;
    palette.setColor(QPalette::Base, Qt::white);
    palette.setColor(QPalette::Text, Qt::black);
    return palette;
}

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
    // The document, a child, goes after the device that its layout measures with.
    document()->documentLayout()->setPaintDevice(nullptr);
}

void ReportEdit::setReportFont(const QFont &font)
{
    setFont(font);
    document()->setDefaultFont(font);
    applyZoom();
}

void ReportEdit::loadPlainText(const QString &text)
{
    setPalette(QPalette());
    QTextDocument *loaded = newDocument(this, font());
    loaded->setPlainText(text);
    take(loaded);
}

void ReportEdit::loadPlainTextInPieces(PiecedText text, std::function<void(bool isWhole)> loaded)
{
    setPalette(QPalette());
    const Place before = isWaiting() ? wanted_ : place();
    QTextDocument *filled = newDocument(this, font());
    filled->setUndoRedoEnabled(false);
    auto loader = std::make_unique<PieceLoader>(*filled, std::move(text), [this] { loadPiece(); });
    loader->addPiece(); // before the control's cursor stands in the document, at whose end the pieces come in
    take(filled);
    document()->setUndoRedoEnabled(false);
    loader_ = std::move(loader);
    loaded_ = std::move(loaded);
    wanted_ = before;
    if (!loader_->isDone() && before.position >= length_) {
        goTo({length_ - 1, before.top, before.left}); // a cursor at the end would go along with it
    }
    waiting_ = textCursor().position();
    isScrolled_ = false;
    sinceShown_.start();
    setReadOnly(true);
    if (loader_->isDone()) {
        endLoading();
    } else if (loading_) {
        loading_();
    }
}

void ReportEdit::loadPiece()
{
    // A cursor at the end of what has been loaded would go along with what is added there.
    const int position = textCursor().position();
    const int anchor = textCursor().anchor();
    {
        // Every piece would paint the whole window and move the scroll bar: a few times a second is enough.
        constexpr qint64 showInterval = 200; // milliseconds
        const bool isShown = sinceShown_.elapsed() >= showInterval;
        QSignalBlocker blocker(document()->documentLayout());
        if (isShown || loader_->isLastPiece()) {
            blocker.unblock();
            sinceShown_.start();
        }
        loader_->addPiece();
    }
    if (textCursor().position() != position || textCursor().anchor() != anchor) {
        QTextCursor cursor(document());
        cursor.setPosition(anchor);
        cursor.setPosition(position, QTextCursor::KeepAnchor);
        setTextCursor(cursor);
    }
    if (loader_->isDone()) {
        endLoading();
    } else if (loading_) {
        loading_();
    }
}

void ReportEdit::finishLoading()
{
    if (isLoading()) {
        loader_->finish();
        endLoading();
    }
}

void ReportEdit::stopLoading()
{
    if (isLoading()) {
        loader_.reset();
        loaded_ = {};
        setReadOnly(false);
    }
}

void ReportEdit::endLoading()
{
    const bool wasWaiting = isWaiting();
    const bool isWhole = !loader_->isCutShort();
    loader_.reset();
    setReadOnly(false);
    document()->setUndoRedoEnabled(true);
    document()->setModified(false);
    if (wasWaiting) {
        goTo(wanted_);
    }
    if (loading_) {
        loading_();
    }
    if (const auto loaded = std::exchange(loaded_, {})) {
        loaded(isWhole);
    }
}

std::optional<RichTextError> ReportEdit::loadRichText(QStringView text)
{
    return loadRichText([text](QTextDocument &loaded) { return readRichText(text, loaded); });
}

std::optional<RichTextError>
ReportEdit::loadRichText(const std::function<std::optional<RichTextError>(QTextDocument &loaded)> &read)
{
    setPalette(paper());
    QTextDocument *loaded = newDocument(this, font());
    const auto error = read(*loaded);
    take(loaded);
    return error;
}

void ReportEdit::take(QTextDocument *loaded)
{
    const Place before = isWaiting() ? wanted_ : place();
    const QPointer<QTextDocument> replaced = document();

    stopLoading();
    disconnect(watching_);
    loaded->clearUndoRedoStacks();
    loaded->setUndoRedoEnabled(true);
    setDocument(loaded);
    delete replaced;
    watch();
    applyZoom();
    goTo(before);
}

ReportEdit::Place ReportEdit::place() const
{
    return {textCursor().position(), verticalScrollBar()->value(), horizontalScrollBar()->value()};
}

bool ReportEdit::isWaiting() const
{
    return isLoading() && !isScrolled_ && textCursor().position() == waiting_;
}

void ReportEdit::goTo(const Place &place)
{
    QTextCursor cursor(document());
    cursor.setPosition(std::min(place.position, length_));
    setTextCursor(cursor);
    verticalScrollBar()->setValue(place.top);
    horizontalScrollBar()->setValue(place.left);
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
    // The end of the last paragraph, which is no character of the text, is counted with an edit that touches it.
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
    isFollowing_ = true;
    QTextCursor cursor(document());
    cursor.setPosition(change.position);
    cursor.setPosition(change.position + change.removed, QTextCursor::KeepAnchor);
    cursor.insertText(change.inserted);
    isFollowing_ = false;
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
    // names as well as the report's own, and the distance of tab stops. That stays too: printing goes by it.
    QAbstractTextDocumentLayout *layout = document()->documentLayout();
    const bool wasZoomed = layout->paintDevice() != nullptr;
    setTabStopDistance(kareport::tabColumns * QFontMetricsF(font()).horizontalAdvance(QLatin1Char('x')));
    if (zoom_ == 100) {
        layout->setPaintDevice(nullptr);
    } else {
        constexpr double inch = 0.0254; // metres
        zoomDevice_ = QImage(1, 1, QImage::Format_RGB32);
        zoomDevice_.setDotsPerMeterX(qRound(logicalDpiX() * zoom_ / 100.0 / inch));
        zoomDevice_.setDotsPerMeterY(qRound(logicalDpiY() * zoom_ / 100.0 / inch));
        layout->setPaintDevice(&zoomDevice_);
    }
    if (wasZoomed || zoom_ != 100) {
        document()->setDefaultFont(document()->defaultFont()); // lays the text out anew
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
    // Fine wheels turn less than a step at a time.
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
    // A key paints the cursor's line and touches those beside it. Finding their glyphs anew is most of the work.
    if (const int line = textCursor().blockNumber(); line != keptLine_) {
        keepGlyphs(keptLine_, false);
        keptLine_ = line;
    }
    keepGlyphs(keptLine_, true);
    QPlainTextEdit::paintEvent(event);
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
