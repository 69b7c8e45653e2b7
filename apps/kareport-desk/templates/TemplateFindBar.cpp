#include "TemplateFindBar.h"

#include "PlainWidgets.h"
#include "TemplateTextEdit.h"
#include "Xlate.h"

#include <QCheckBox>
#include <QGridLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

#include <algorithm>

namespace kareport
{

TemplateFindBar::TemplateFindBar(TemplateTextEdit &edit, QWidget *parent)
    : QWidget(parent),
      edit_(edit),
      field_(new QLineEdit(this)),
      replacement_(new QLineEdit(this)),
      matchCase_(new QCheckBox(Xlate("Match &case"), this)),
      count_(plainLabel(QString(), this))
{
    setAccessibleName(Xlate("Find and replace"));
    field_->setAccessibleName(Xlate("Text to find"));
    field_->setPlaceholderText(Xlate("Find"));
    constexpr int leastWidth = 120;
    field_->setMinimumWidth(leastWidth);
    replacement_->setAccessibleName(Xlate("Replacement text"));
    replacement_->setPlaceholderText(Xlate("Replace with"));
    count_->setAccessibleName(Xlate("Matches"));
    const auto button = [this](const QString &text, auto act) {
        auto *made = new QPushButton(text, this);
        made->setAutoDefault(false);
        connect(made, &QPushButton::clicked, this, act);
        return made;
    };
    auto *grid = new QGridLayout(this);
    constexpr int gap = 4;
    grid->setContentsMargins(gap, gap, gap, gap);
    grid->addWidget(field_, 0, 0);
    grid->addWidget(button(Xlate("&Next"), [this] { findNext(); }), 0, 1);
    grid->addWidget(button(Xlate("&Previous"), [this] { findPrevious(); }), 0, 2);
    grid->addWidget(matchCase_, 0, 3);
    grid->addWidget(replacement_, 1, 0);
    replaces_ = {button(Xlate("&Replace"), [this] { replace(); }),
                 button(Xlate("Replace &All"), [this] { replaceAll(); })};
    grid->addWidget(replaces_[0], 1, 1);
    grid->addWidget(replaces_[1], 1, 2);
    grid->addWidget(count_, 1, 3);
    grid->setColumnStretch(0, 1);
    connect(field_, &QLineEdit::textChanged, this, [this] { showMatches(); });
    connect(matchCase_, &QCheckBox::toggled, this, [this] { showMatches(); });
    connect(&edit_, &QPlainTextEdit::textChanged, this, [this] { showMatches(); });
    hide();
}

void TemplateFindBar::open()
{
    const QString selected = edit_.textCursor().selectedText();
    for (QPushButton *button : replaces_) {
        button->setEnabled(!edit_.isReadOnly());
    }
    replacement_->setEnabled(!edit_.isReadOnly());
    show();
    if (!selected.isEmpty() && !selected.contains(QChar::ParagraphSeparator)) {
        field_->setText(selected);
    }
    field_->selectAll();
    field_->setFocus(Qt::ShortcutFocusReason);
    showMatches();
}

void TemplateFindBar::close()
{
    hide();
    edit_.setFocus(Qt::OtherFocusReason);
}

void TemplateFindBar::hideEvent(QHideEvent *event)
{
    edit_.setFound({});
    QWidget::hideEvent(event);
}

void TemplateFindBar::keyPressEvent(QKeyEvent *event)
{
    if (event->key() == Qt::Key_Escape) {
        close();
    } else if (event->key() != Qt::Key_Return && event->key() != Qt::Key_Enter) {
        QWidget::keyPressEvent(event);
    } else if (replacement_->hasFocus()) {
        replace();
    } else if (event->modifiers().testFlag(Qt::ShiftModifier)) {
        findPrevious();
    } else {
        findNext();
    }
}

std::vector<TextRange> TemplateFindBar::matches() const
{
    std::vector<TextRange> found;
    const QString wanted = field_->text();
    if (wanted.isEmpty()) {
        return found;
    }
    const QString text = edit_.wholeText();
    const Qt::CaseSensitivity sensitivity = matchCase_->isChecked() ? Qt::CaseSensitive : Qt::CaseInsensitive;
    for (qsizetype at = text.indexOf(wanted, 0, sensitivity); at >= 0;
         at = text.indexOf(wanted, at + wanted.size(), sensitivity))
    {
        found.push_back({at, at + wanted.size()});
    }
    return found;
}

void TemplateFindBar::showMatches()
{
    if (isHidden()) {
        return;
    }
    constexpr std::size_t mostMarked = 1000;
    std::vector<TextRange> found = matches();
    count_->setText(field_->text().isEmpty() ? QString() : Xlate("Matches: %1").arg(found.size()));
    found.resize(std::min(found.size(), mostMarked));
    edit_.setFound(found);
}

bool TemplateFindBar::isSelected(const TextRange &match) const
{
    const QTextCursor cursor = edit_.textCursor();
    return cursor.selectionStart() == match.begin && cursor.selectionEnd() == match.end;
}

bool TemplateFindBar::findNext()
{
    const std::vector<TextRange> found = matches();
    if (found.empty()) {
        return false;
    }
    const qsizetype from = edit_.textCursor().selectionEnd();
    const auto next =
        std::find_if(found.begin(), found.end(), [from](const TextRange &match) { return match.begin >= from; });
    edit_.select(next != found.end() ? *next : found.front());
    return true;
}

bool TemplateFindBar::findPrevious()
{
    const std::vector<TextRange> found = matches();
    if (found.empty()) {
        return false;
    }
    const qsizetype from = edit_.textCursor().selectionStart();
    const auto next =
        std::find_if(found.rbegin(), found.rend(), [from](const TextRange &match) { return match.end <= from; });
    edit_.select(next != found.rend() ? *next : found.back());
    return true;
}

void TemplateFindBar::replace()
{
    if (edit_.isReadOnly()) {
        return;
    }
    for (const TextRange &match : matches()) {
        if (isSelected(match)) {
            edit_.textCursor().insertText(replacement_->text());
            break;
        }
    }
    findNext();
}

void TemplateFindBar::replaceAll()
{
    if (edit_.isReadOnly()) {
        return;
    }
    QString text = edit_.wholeText();
    const std::vector<TextRange> found = matches();
    for (auto match = found.rbegin(); match != found.rend(); ++match) {
        text.replace(match->begin, match->size(), replacement_->text());
    }
    if (!found.empty()) {
        const qsizetype at = edit_.textCursor().position();
        edit_.replaceBy(text, {at, at});
    }
}

} // namespace kareport
