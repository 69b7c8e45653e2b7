#include "ReportViewWidget.h"

#include "FindBar.h"
#include "PageBar.h"
#include "PageDefaults.h"
#include "PlainWidgets.h"
#include "ReportChange.h"
#include "ReportEdit.h"
#include "ReportPages.h"
#include "Xlate.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QScrollBar>
#include <QShowEvent>
#include <QTextBlock>
#include <QVBoxLayout>

#include <algorithm>

namespace kareport
{

namespace
{

/// Shows a text in a label that is as wide as the widest of its texts so far. A label of one size lays nothing out again,
/// neither here nor in the windows around it: that would happen at every key.
void showIn(QLabel &label, const QString &text)
{
    const QFontMetrics metrics = label.fontMetrics();
    const int width = metrics.horizontalAdvance(text) + metrics.averageCharWidth();
    const bool isSized = label.minimumWidth() == label.maximumWidth();
    label.setFixedSize(isSized ? std::max(width, label.minimumWidth()) : width, metrics.height());
    label.setText(text);
}

QLabel *newLabel(QWidget *parent, const QString &name, const QString &widest)
{
    auto *label = plainLabel(QString(), parent);
    label->setAccessibleName(name);
    showIn(*label, widest);
    label->clear();
    return label;
}

/// The column of a place in a line, from 1; a surrogate pair is one character.
qsizetype columnOf(const QTextCursor &cursor)
{
    const QString line = cursor.block().text();
    const QStringView before = QStringView(line).first(cursor.positionInBlock());
    return before.size() + 1 -
           std::count_if(before.begin(), before.end(), [](QChar character) { return character.isLowSurrogate(); });
}

} // namespace

ReportViewWidget::ReportViewWidget(QWidget *parent)
    : QWidget(parent),
      edit_(new ReportEdit(this)),
      findBar_(new FindBar(*edit_, this)),
      pageBar_(
          new PageBar([this](int page) { goFromBar(page); }, [this] { edit_->setFocus(Qt::OtherFocusReason); }, this)),
      pageLabel_(newLabel(this, Xlate("Page"), Xlate("Page %1 of %2").arg(88888).arg(88888))),
      lineLabel_(newLabel(this, Xlate("Line"), Xlate("Line %1").arg(88888))),
      columnLabel_(newLabel(this, Xlate("Column"), Xlate("Column %1").arg(888))),
      loadLabel_(newLabel(this, Xlate("Loading"), Xlate("Loading %1 %@@percent of a report").arg(100))),
      zoomLabel_(newLabel(this, Xlate("Zoom"), Xlate("%1 %@@zoom in percent").arg(888))),
      statusRow_(new QHBoxLayout)
{
    QHBoxLayout *status = statusRow_;
    status->setContentsMargins(6, 2, 6, 2);
    status->setSpacing(8);
    status->addWidget(pageLabel_);
    status->addWidget(lineLabel_);
    status->addWidget(columnLabel_);
    status->addStretch();
    status->addWidget(loadLabel_);
    status->addWidget(zoomLabel_);

    auto *column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);
    column->addWidget(edit_, 1);
    column->addWidget(findBar_);
    column->addWidget(pageBar_);
    column->addLayout(status);

    setFocusProxy(edit_);
    edit_->setZoomHandler([this] { showZoom(); });
    edit_->setLoadHandler([this] { showLoading(); });
    // What a key writes is on the screen before the place below it.
    placeTimer_.setSingleShot(true);
    placeTimer_.setInterval(0);
    connect(&placeTimer_, &QTimer::timeout, this, [this] { showPlace(); });
    connect(edit_, &QPlainTextEdit::cursorPositionChanged, &placeTimer_, qOverload<>(&QTimer::start));
    connect(edit_, &QPlainTextEdit::blockCountChanged, &placeTimer_, [this] {
        if (!edit_->isLoading()) { // `showLoading` follows that
            placeTimer_.start();
        }
    });
    for (QWidget *child : findChildren<QWidget *>()) {
        child->installEventFilter(this); // wherever the mouse is pressed
    }
    loadLabel_->hide(); // while there is nothing to say it takes no room from a narrow window
    showPlace();
    showZoom();
}

void ReportViewWidget::setLinesPerPage(std::function<int()> linesPerPage)
{
    linesPerPage_ = std::move(linesPerPage);
    showPlace();
}

int ReportViewWidget::linesPerPage() const
{
    return linesPerPage_ ? std::max(1, linesPerPage_()) : kareport::defaultLinesPerPage;
}

void ReportViewWidget::setPageStarts(std::function<std::vector<int>()> starts)
{
    pageStarts_ = std::move(starts);
    forgetPages();
}

void ReportViewWidget::forgetPages()
{
    pagesOf_ = nullptr;
    placeTimer_.start();
}

bool ReportViewWidget::isBlankLine(int line) const
{
    const QTextBlock block = edit_->document()->findBlockByNumber(line);
    return block.length() <= 1 || kareport::isBlankLine(block.text());
}

const PageLines &ReportViewWidget::pages() const
{
    const QTextDocument *document = edit_->document();
    const bool isCurrent =
        pagesOf_ == document && pagesRevision_ == document->revision() && pages_.lineCount() == document->blockCount();
    if (!isCurrent) {
        pages_.load(pageStarts_ ? pageStarts_() : std::vector<int>(), document->blockCount(),
                    [this](int line) { return isBlankLine(line); });
        pagesOf_ = document;
        pagesRevision_ = document->revision();
    }
    return pages_;
}

void ReportViewWidget::followEdit(const ReportChange &change, const std::vector<int> &starts)
{
    const QTextDocument *document = edit_->document();
    const int added = document->blockCount() - 1 - change.lineEndsInAll + change.lineEndsRemoved;
    if (pagesOf_ == document && pages_.lineCount() == change.lineEndsInAll + 1 && added >= 0) {
        pages_.replace(change.lineEndsBefore, change.lineEndsRemoved, added, starts,
                       [this](int line) { return isBlankLine(line); });
        pagesRevision_ = document->revision();
    }
}

std::vector<ReportPage> ReportViewWidget::reportPages() const
{
    const QTextDocument &document = *edit_->document();
    std::vector<ReportPage> found;
    if (document.isEmpty()) {
        return found;
    }
    // Found anew: what is shown below the text may not have followed the report yet.
    PageLines begun;
    begun.load(pageStarts_ ? pageStarts_() : std::vector<int>(), document.blockCount(),
               [this](int line) { return isBlankLine(line); });
    const int lines = linesPerPage();
    const int count = begun.pageCount(lines);
    for (int page = 1; page <= count; ++page) {
        const int first = begun.firstLineOf(page, lines);
        int last = (page < count ? begun.firstLineOf(page + 1, lines) : document.blockCount()) - 1;
        while (last >= first && isBlankLine(last)) {
            --last;
        }
        const qint64 begin = document.findBlockByNumber(first).position();
        const QTextBlock end = document.findBlockByNumber(last);
        const qint64 stop = std::min<qint64>(end.position() + end.length(), document.characterCount() - 1);
        found.push_back(last < first ? ReportPage{begin, begin, 0} : ReportPage{begin, stop, last - first + 1});
    }
    return found;
}

int ReportViewWidget::pageBegunBy(int line) const
{
    const int page = pages().pageOf(line, linesPerPage());
    return line > 0 && pages().firstLineOf(page, linesPerPage()) == line ? page : 0;
}

void ReportViewWidget::setShowsPageLines(bool on)
{
    edit_->setPageBeginnings(on ? [this](int line) { return pageBegunBy(line); } : std::function<int(int)>());
}

int ReportViewWidget::pageCount() const
{
    return pages().pageCount(linesPerPage());
}

int ReportViewWidget::currentPage() const
{
    return pages().pageOf(edit_->textCursor().blockNumber(), linesPerPage());
}

void ReportViewWidget::goToPage(int page)
{
    edit_->finishLoading();
    const int line = pages().firstLineOf(page, linesPerPage());
    const QTextBlock block = edit_->document()->findBlockByNumber(line);
    edit_->setTextCursor(QTextCursor(block));
    edit_->verticalScrollBar()->setValue(block.firstLineNumber());
}

void ReportViewWidget::showPlace()
{
    const QTextCursor cursor = edit_->textCursor();
    if (shownPages_ != pageCount()) {
        shownPages_ = pageCount();
        edit_->viewport()->update(); // the lines between pages
    }
    showIn(*pageLabel_, Xlate("Page %1 of %2").arg(currentPage()).arg(pageCount()));
    showIn(*lineLabel_, Xlate("Line %1").arg(cursor.blockNumber() + 1));
    showIn(*columnLabel_, Xlate("Column %1").arg(columnOf(cursor)));
    if (placed_) {
        placed_();
    }
}

void ReportViewWidget::showLoading()
{
    const QString text =
        edit_->isLoading() ? Xlate("Loading %1 %@@percent of a report").arg(edit_->loadedPercent()) : QString();
    if (text != loadLabel_->text() || !edit_->isLoading()) { // there are more pieces than percents
        showIn(*loadLabel_, text);
        loadLabel_->setVisible(!text.isEmpty());
        placeTimer_.start();
    }
}

void ReportViewWidget::showZoom()
{
    showIn(*zoomLabel_, Xlate("%1 %@@zoom in percent").arg(edit_->zoomPercent()));
    if (placed_) {
        placed_();
    }
}

void ReportViewWidget::showEvent(QShowEvent *event)
{
    if (!event->spontaneous() && shown_) {
        shown_();
    }
    QWidget::showEvent(event);
}

bool ReportViewWidget::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::MouseButtonPress && pressed_) {
        pressed_();
    }
    return QWidget::eventFilter(watched, event);
}

} // namespace kareport
