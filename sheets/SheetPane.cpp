#include "SheetPane.h"

#include "SheetThumbnails.h"
#include "SheetView.h"

#include <QHBoxLayout>
#include <QSplitter>

namespace kareport
{

SheetPane::SheetPane(const SheetColumn::Source &source, QWidget *parent)
    : QWidget(parent), splitter_(new QSplitter), thumbnails_(new SheetThumbnails(source)), view_(new SheetView(source))
{
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(splitter_);
    splitter_->addWidget(thumbnails_);
    splitter_->addWidget(view_);
    splitter_->setStretchFactor(0, 0);
    splitter_->setStretchFactor(1, 1);
    splitter_->setChildrenCollapsible(false);
    setFocusProxy(view_);
    thumbnails_->setGoHandler([this](int sheet) { view_->goToSheet(sheet); });
}

void SheetPane::setShowsThumbnails(bool on)
{
    thumbnails_->setVisible(on);
}

bool SheetPane::showsThumbnails() const
{
    return !thumbnails_->isHidden();
}

void SheetPane::sheetsChanged()
{
    view_->sheetsChanged();
    thumbnails_->sheetsChanged();
    thumbnails_->setCurrent(view_->current());
    thumbnails_->setShown(view_->shownSheet());
}

void SheetPane::setMessage(const QString &message)
{
    view_->setMessage(message);
}

void SheetPane::leave()
{
    view_->leave();
    thumbnails_->leave();
}

} // namespace kareport
