#include "ReportViewWidget.h"

#include "FindBar.h"
#include "PageBar.h"
#include "ReportEdit.h"

#include <QKeyEvent>
#include <QLineEdit>

// The bars below the text, and the keys that open them.

namespace kareport
{

void ReportViewWidget::openFindBar()
{
    pageBar_->hide();
    findBar_->open();
}

void ReportViewWidget::openPageBar()
{
    findBar_->hide();
    edit_->finishLoading();
    if (const auto other = otherPages_ ? otherPages_() : std::nullopt) {
        pageBar_->open(other->current, other->count);
    } else {
        pageBar_->open(currentPage(), pageCount());
    }
}

void ReportViewWidget::goFromBar(int page)
{
    if (const auto other = otherPages_ ? otherPages_() : std::nullopt) {
        other->go(page);
    } else {
        goToPage(page);
    }
}

void ReportViewWidget::findNext()
{
    if (findBar_->field().text().isEmpty()) {
        openFindBar();
    } else {
        findBar_->findNext();
    }
}

void ReportViewWidget::findPrevious()
{
    if (findBar_->field().text().isEmpty()) {
        openFindBar();
    } else {
        findBar_->findPrevious();
    }
}

void ReportViewWidget::closeBar()
{
    findBar_->isVisible() ? findBar_->close() : pageBar_->close();
}

ReportViewWidget::Action ReportViewWidget::actionOfKey(const QKeyEvent &event) const
{
    const auto modifiers = event.modifiers() & ~Qt::KeypadModifier;
    switch (event.key()) {
    case Qt::Key_F: return modifiers == Qt::ControlModifier ? &ReportViewWidget::openFindBar : nullptr;
    case Qt::Key_G: return modifiers == Qt::ControlModifier ? &ReportViewWidget::openPageBar : nullptr;
    case Qt::Key_F3:
        return modifiers == Qt::NoModifier      ? &ReportViewWidget::findNext
               : modifiers == Qt::ShiftModifier ? &ReportViewWidget::findPrevious
                                                : nullptr;
    case Qt::Key_Escape:
        return modifiers == Qt::NoModifier && (findBar_->isVisible() || pageBar_->isVisible())
                   ? &ReportViewWidget::closeBar
                   : nullptr;
    default: return nullptr;
    }
}

bool ReportViewWidget::event(QEvent *event)
{
    // These keys belong to the window also where a menu has them.
    if (event->type() == QEvent::ShortcutOverride && actionOfKey(*static_cast<QKeyEvent *>(event)) != nullptr) {
        event->accept();
        return true;
    }
    return QWidget::event(event);
}

void ReportViewWidget::keyPressEvent(QKeyEvent *event)
{
    if (const Action action = actionOfKey(*event)) {
        (this->*action)();
        return;
    }
    QWidget::keyPressEvent(event);
}

} // namespace kareport
