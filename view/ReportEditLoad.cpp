#include "ReportEdit.h"

#include <QPlainTextDocumentLayout>
#include <QPointer>
#include <QSignalBlocker>
#include <QTextDocument>

#include <utility>

namespace kareport
{

namespace
{

QTextDocument *newDocument(QWidget *parent, const QFont &font)
{
    auto *document = new QTextDocument(parent);
    document->setDocumentLayout(new QPlainTextDocumentLayout(document));
    document->setDefaultFont(font);
    return document;
}

/// Colours of rich text are meant for paper, so it is shown on a white background even if the desktop is dark.
QPalette paper()
{
    QPalette palette;
    palette.setColor(QPalette::Base, Qt::white);
    palette.setColor(QPalette::Text, Qt::black);
    return palette;
}

} // namespace

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
    loader->addPiece(); // before the control's cursor is in the document, at whose end the pieces come in
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
        const bool isShown = sinceShown_.elapsed() >= followInterval_;
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

/// Loads what is missing at once, up to a line.
void ReportEdit::loadToLine(int line)
{
    isScrolled_ = true; // the window goes to that line, and not to the place that it was at before
    while (isLoading() && document()->blockCount() <= line) {
        loader_->addPiece();
        if (loader_->isDone()) {
            endLoading();
        }
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
    auto error = read(*loaded);
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

bool ReportEdit::isWaiting() const
{
    return isLoading() && !isScrolled_ && textCursor().position() == waiting_;
}

} // namespace kareport
