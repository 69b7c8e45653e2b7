#include "PageBar.h"

#include "PlainWidgets.h"
#include "Xlate.h"

#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QPushButton>
#include <QSpinBox>

namespace kareport
{

PageBar::PageBar(std::function<void(int)> go, std::function<void()> leave, QWidget *parent)
    : QWidget(parent),
      go_(std::move(go)),
      leave_(std::move(leave)),
      page_(new QSpinBox(this)),
      pages_(plainLabel(QString(), this))
{
    setAccessibleName(Xlate("Go to page"));
    page_->setAccessibleName(Xlate("Page to go to"));
    page_->setMinimum(1);
    pages_->setAccessibleName(Xlate("Pages"));
    auto *label = plainLabel(Xlate("&Go to page"), this);
    label->setBuddy(page_);
    auto *button = new QPushButton(Xlate("G&o"), this);
    button->setAccessibleName(Xlate("Go to page"));

    auto *row = new QHBoxLayout(this);
    row->setContentsMargins(4, 2, 4, 2);
    row->addWidget(label);
    row->addWidget(page_);
    row->addWidget(pages_);
    row->addWidget(button);
    row->addStretch();

    page_->installEventFilter(this);
    setFocusProxy(page_);
    connect(button, &QPushButton::clicked, this, [this] {
        go_(page_->value());
        close();
    });
    hide();
}

void PageBar::open(int page, int pages)
{
    page_->setMaximum(pages);
    page_->setValue(page);
    pages_->setText(Xlate("of %1@@number of pages").arg(pages));
    show();
    page_->selectAll();
    page_->setFocus(Qt::ShortcutFocusReason);
}

void PageBar::close()
{
    hide();
    leave_();
}

bool PageBar::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == page_ && event->type() == QEvent::KeyPress) {
        const int key = static_cast<QKeyEvent *>(event)->key();
        if (key == Qt::Key_Return || key == Qt::Key_Enter) {
            page_->interpretText();
            go_(page_->value());
            close();
            return true;
        }
    }
    return QWidget::eventFilter(watched, event);
}

} // namespace kareport
