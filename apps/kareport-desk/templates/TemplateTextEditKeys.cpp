// What is typed into the text of a template, and completion.
#include "TemplateCompletion.h"
#include "TemplateTextEdit.h"

#include <QAbstractItemView>
#include <QCompleter>
#include <QKeyEvent>
#include <QScrollBar>
#include <QTextBlock>

#include <algorithm>

namespace kareport
{

void TemplateTextEdit::keyPressEvent(QKeyEvent *event)
{
    const bool isOffering = completer_->popup()->isVisible();
    const bool isReturn = event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
    if (isOffering && (isReturn || event->key() == Qt::Key_Tab || event->key() == Qt::Key_Escape)) {
        event->ignore(); // the list takes it
        return;
    }
    if (isReturn && event->modifiers() == Qt::NoModifier && !isReadOnly()) {
        breakLine();
        return;
    }
    QPlainTextEdit::keyPressEvent(event);
    const QString typed = event->text();
    const bool isWord = !typed.isEmpty() && (typed[0].isLetterOrNumber() || typed[0] == u'_');
    if (typed == u"<" || (isWord && !event->modifiers().testFlag(Qt::ControlModifier)) || isOffering) {
        complete(typed == u"<");
    }
}

/// Begins a line with the blanks of the one before it.
void TemplateTextEdit::breakLine()
{
    const QString line = textCursor().block().text().left(textCursor().positionInBlock());
    const auto end = std::find_if_not(line.begin(), line.end(), [](QChar one) { return one == u' ' || one == u'\t'; });
    textCursor().insertText(u'\n' + line.left(end - line.begin()));
    ensureCursorVisible();
}

void TemplateTextEdit::complete(bool always)
{
    if (isReadOnly()) {
        return;
    }
    const qsizetype position = textCursor().position();
    const QString text = wholeText();
    const Completions found = completionsAt(text, position);
    const QString begun = text.mid(found.begin, position - found.begin);
    words_.setStringList(found.words);
    completer_->setCompletionPrefix(begun);
    const bool isWhole = found.words.size() == 1 && found.words.first() == begun;
    if (found.words.isEmpty() || completer_->completionCount() == 0 || isWhole || (begun.isEmpty() && !always)) {
        completer_->popup()->hide();
        return;
    }
    QAbstractItemView &list = *completer_->popup();
    list.setCurrentIndex(completer_->completionModel()->index(0, 0));
    QRect rect = cursorRect().translated(viewport()->pos());
    rect.setWidth(list.sizeHintForColumn(0) + list.verticalScrollBar()->sizeHint().width());
    completer_->complete(rect);
}

void TemplateTextEdit::insertCompletion(const QString &word)
{
    const QString text = wholeText();
    const qsizetype position = textCursor().position();
    const Completions found = completionsAt(text, position);
    QString inserted = word;
    qsizetype cursorAt = found.begin + word.size();
    const bool isOpen = found.areTags && (position >= text.size() || text[position] != u'>');
    if (isOpen) {
        inserted += u'>';
        ++cursorAt;
        const bool isClosing = found.begin > 0 && text[found.begin - 1] == u'/';
        inserted += isClosing ? QString() : QStringLiteral("</") + word + u'>';
    }
    QTextCursor cursor = textCursor();
    cursor.beginEditBlock();
    cursor.setPosition(static_cast<int>(found.begin));
    cursor.setPosition(static_cast<int>(position), QTextCursor::KeepAnchor);
    cursor.insertText(inserted);
    cursor.endEditBlock();
    cursor.setPosition(static_cast<int>(cursorAt));
    setTextCursor(cursor);
}

} // namespace kareport
