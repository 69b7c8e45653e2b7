#include "FindBar.h"

#include "PlainWidgets.h"
#include "ReportEdit.h"
#include "Xlate.h"

#include <QCheckBox>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QTextBlock>
#include <QTextDocument>
#include <QToolButton>

namespace kareport
{

namespace
{

/// How long the text must stay unchanged before its matches are counted again.
constexpr int recountDelay = 200; // milliseconds

QToolButton *newButton(QWidget *parent, const QString &text, const QString &name, const QString &key)
{
    auto *button = new QToolButton(parent);
    button->setText(text);
    button->setAccessibleName(name);
    button->setToolTip(name + QStringLiteral(" (") + key + u')');
    button->setAutoRaise(true);
    button->setFocusPolicy(Qt::TabFocus);
    return button;
}

} // namespace

FindBar::FindBar(ReportEdit &edit, QWidget *parent)
    : QWidget(parent),
      edit_(edit),
      field_(new QLineEdit(this)),
      previous_(newButton(this, QStringLiteral("\u2191"), Xlate("Previous match"), QStringLiteral("Shift+F3"))),
      next_(newButton(this, QStringLiteral("\u2193"), Xlate("Next match"), QStringLiteral("F3"))),
      matchCase_(new QCheckBox(Xlate("Match &case"), this)),
      wholeWord_(new QCheckBox(Xlate("Whole wor&d"), this)),
      count_(plainLabel(QString(), this)),
      close_(newButton(this, QStringLiteral("\u00D7"), Xlate("Close the find bar"), QStringLiteral("Esc"))),
      counter_([this] { showCount(); })
{
    setAccessibleName(Xlate("Find"));
    field_->setAccessibleName(Xlate("Text to find"));
    field_->setPlaceholderText(Xlate("Find"));
    field_->setMinimumWidth(80);
    field_->setMaximumWidth(320);
    count_->setAccessibleName(Xlate("Matches"));
    count_->setMinimumWidth(count_->fontMetrics().horizontalAdvance(QStringLiteral("000000 of 000000")));

    auto *row = new QHBoxLayout(this);
    row->setContentsMargins(4, 2, 4, 2);
    row->addWidget(field_, 1);
    row->addWidget(previous_);
    row->addWidget(next_);
    row->addWidget(matchCase_);
    row->addWidget(wholeWord_);
    row->addWidget(count_);
    row->addStretch();
    row->addWidget(close_);

    field_->installEventFilter(this);
    setFocusProxy(field_);
    connect(field_, &QLineEdit::textChanged, this, [this] { searchChanged(); });
    connect(matchCase_, &QCheckBox::toggled, this, [this] { searchChanged(); });
    connect(wholeWord_, &QCheckBox::toggled, this, [this] { searchChanged(); });
    connect(previous_, &QToolButton::clicked, this, [this] { findPrevious(); });
    connect(next_, &QToolButton::clicked, this, [this] { findNext(); });
    connect(close_, &QToolButton::clicked, this, [this] { close(); });
    connect(&edit_, &QPlainTextEdit::cursorPositionChanged, this, [this] { showCount(); });
    connect(&edit_, &QPlainTextEdit::textChanged, this, [this] { watchDocument(); });
    connect(&recountTimer_, &QTimer::timeout, this, [this] { recount(); });
    recountTimer_.setSingleShot(true);
    hide();
}

void FindBar::open()
{
    const QString selected = edit_.textCursor().selectedText();
    show();
    if (!selected.isEmpty() && !selected.contains(QChar::ParagraphSeparator)) {
        field_->setText(selected);
    }
    field_->selectAll();
    field_->setFocus(Qt::ShortcutFocusReason);
    recount();
}

void FindBar::close()
{
    hide();
    edit_.setFocus(Qt::OtherFocusReason);
}

void FindBar::hideEvent(QHideEvent *event)
{
    recountTimer_.stop();
    counter_.stop();
    count_->clear();
    QWidget::hideEvent(event);
    if (shown_) {
        shown_();
    }
}

void FindBar::showEvent(QShowEvent *event)
{
    QWidget::showEvent(event);
    if (shown_) {
        shown_();
    }
}

bool FindBar::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == field_ && event->type() == QEvent::KeyPress) {
        const auto *key = static_cast<QKeyEvent *>(event);
        if (key->key() == Qt::Key_Return || key->key() == Qt::Key_Enter) {
            key->modifiers().testFlag(Qt::ShiftModifier) ? findPrevious() : findNext();
            return true;
        }
    }
    return QWidget::eventFilter(watched, event);
}

void FindBar::searchChanged()
{
    search_ = TextSearch(field_->text(), matchCase_->isChecked(), wholeWord_->isChecked());
    // A match that is selected stays so while more of it is typed.
    if (isVisible() && !search_.isEmpty()) {
        findFrom(edit_.textCursor().selectionStart());
    }
    recount();
}

void FindBar::watchDocument()
{
    // What has been counted is no longer true, and the places that were noted may no longer exist.
    if (!isVisible()) {
        return;
    }
    counter_.stop();
    recountTimer_.start(recountDelay);
    showCount();
}

void FindBar::recount()
{
    recountTimer_.stop();
    if (isVisible() && !edit_.isLoading()) { // which counts as an edit when it ends
        counter_.start(*edit_.document(), search_);
    }
    showCount();
}

void FindBar::showCount()
{
    if (!isVisible() || search_.isEmpty()) {
        count_->clear();
        return;
    }
    const bool isDone = counter_.isDone() && !recountTimer_.isActive();
    const QTextCursor cursor = edit_.textCursor();
    const auto number = cursor.selectionEnd() - cursor.selectionStart() == search_.length()
                            ? counter_.numberAt(*edit_.document(), cursor.selectionStart())
                            : std::nullopt;
    QString text;
    if (isDone && counter_.total() == 0) {
        text = Xlate("No match");
    } else if (number) {
        text = Xlate("%1 of %2@@number of a match, number of all matches").arg(*number).arg(counter_.total());
    } else {
        text = Xlate("%1 in all@@number of all matches").arg(counter_.total());
    }
    count_->setText(isDone ? text : text + u'\u2026');
}

bool FindBar::select(const QTextBlock &block, qsizetype at)
{
    QTextCursor cursor(block);
    cursor.setPosition(block.position() + static_cast<int>(at));
    cursor.setPosition(cursor.position() + static_cast<int>(search_.length()), QTextCursor::KeepAnchor);
    edit_.setTextCursor(cursor);
    return true;
}

bool FindBar::findFrom(int position)
{
    edit_.finishLoading();
    const QTextBlock start = edit_.document()->findBlock(position);
    QTextBlock block = start;
    qsizetype from = position - start.position();
    do {
        if (const qsizetype at = search_.find(block.text(), from); at >= 0) {
            return select(block, at);
        }
        from = 0;
        block = block.next().isValid() ? block.next() : edit_.document()->begin();
    } while (block != start);
    const qsizetype at = search_.find(start.text());
    return at >= 0 && select(start, at);
}

bool FindBar::findNext()
{
    if (search_.isEmpty()) {
        return false;
    }
    return findFrom(edit_.textCursor().selectionEnd());
}

bool FindBar::findPrevious()
{
    if (search_.isEmpty()) {
        return false;
    }
    edit_.finishLoading();
    const QTextBlock start = edit_.document()->findBlock(edit_.textCursor().selectionStart());
    QTextBlock block = start;
    qsizetype before = edit_.textCursor().selectionStart() - start.position();
    do {
        if (const qsizetype at = search_.findLast(block.text(), before); at >= 0) {
            return select(block, at);
        }
        block = block.previous().isValid() ? block.previous() : edit_.document()->lastBlock();
        before = block.length();
    } while (block != start);
    const qsizetype at = search_.findLast(start.text(), start.length());
    return at >= 0 && select(start, at);
}

} // namespace kareport
