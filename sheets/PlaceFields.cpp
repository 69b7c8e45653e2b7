#include "PlaceFields.h"

#include "PlainWidgets.h"
#include "Xlate.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QSignalBlocker>
#include <QSpinBox>
#include <QToolButton>

namespace kareport
{

namespace
{

QToolButton *newButton(const QString &sign, const QString &name)
{
    auto *button = new QToolButton;
    button->setText(sign);
    button->setAccessibleName(name);
    button->setToolTip(name);
    button->setAutoRaise(true);
    button->setFocusPolicy(Qt::TabFocus);
    return button;
}

QHBoxLayout *newRow(QWidget &widget)
{
    auto *row = new QHBoxLayout(&widget);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(2);
    return row;
}

QString percentText(int percent)
{
    return Xlate("%1 %@@zoom in percent").arg(percent);
}

} // namespace

PageField::PageField(std::function<void(int)> go, QWidget *parent)
    : QWidget(parent),
      go_(std::move(go)),
      name_(plainLabel()),
      previous_(newButton(QStringLiteral("\u25C0"), Xlate("Previous page"))),
      page_(new QSpinBox),
      pages_(plainLabel()),
      next_(newButton(QStringLiteral("\u25B6"), Xlate("Next page")))
{
    page_->setAccessibleName(Xlate("Page shown"));
    page_->setButtonSymbols(QAbstractSpinBox::NoButtons);
    page_->setAlignment(Qt::AlignRight);
    page_->setKeyboardTracking(false);
    QHBoxLayout *row = newRow(*this);
    for (QWidget *part : {static_cast<QWidget *>(name_), static_cast<QWidget *>(previous_),
                          static_cast<QWidget *>(page_), static_cast<QWidget *>(pages_), static_cast<QWidget *>(next_)})
    {
        row->addWidget(part);
    }
    connect(page_, &QSpinBox::valueChanged, this, [this](int page) { choose(page); });
    connect(previous_, &QToolButton::clicked, this, [this] { choose(page_->value() - 1); });
    connect(next_, &QToolButton::clicked, this, [this] { choose(page_->value() + 1); });
}

void PageField::choose(int page) const
{
    if (go_) {
        go_(page);
    }
}

void PageField::setPlace(const QString &name, int page, int pages)
{
    const QSignalBlocker blocker(page_);
    const QString of = Xlate("of %1@@number of pages").arg(pages);
    if (name_->text() != name) {
        name_->setText(name);
    }
    if (pages_->text() != of) {
        pages_->setText(of);
        page_->setRange(pages > 0 ? 1 : 0, pages);
        const int width = page_->fontMetrics().horizontalAdvance(QString::number(pages) + QStringLiteral("00"));
        page_->setFixedWidth(width + page_->fontMetrics().height());
    }
    if (!page_->hasFocus() || page_->value() != page) {
        page_->setValue(page);
    }
    page_->setEnabled(pages > 0);
    previous_->setEnabled(page > 1);
    next_->setEnabled(page < pages);
}

ZoomField::ZoomField(std::function<void(int)> zoom, std::function<void(int)> stepBy, QWidget *parent)
    : QWidget(parent),
      zoomed_(std::move(zoom)),
      stepped_(std::move(stepBy)),
      smaller_(newButton(QStringLiteral("\u2212"), Xlate("Smaller"))),
      zoom_(new QComboBox),
      larger_(newButton(QStringLiteral("+"), Xlate("Larger")))
{
    zoom_->setAccessibleName(Xlate("Zoom"));
    zoom_->setEditable(true);
    zoom_->setInsertPolicy(QComboBox::NoInsert);
    zoom_->setCompleter(nullptr);
    zoom_->setMinimumContentsLength(6);
    QHBoxLayout *row = newRow(*this);
    row->addWidget(smaller_);
    row->addWidget(zoom_);
    row->addWidget(larger_);
    for (const int percent : {25, 50, 75, 100, 125, 150, 200, 300, 400, 500}) {
        zoom_->addItem(percentText(percent), percent);
    }
    const auto step = [this](int direction) {
        if (stepped_) {
            stepped_(direction);
        }
    };
    connect(smaller_, &QToolButton::clicked, this, [step] { step(-1); });
    connect(larger_, &QToolButton::clicked, this, [step] { step(1); });
    connect(zoom_, &QComboBox::activated, this, [this](int index) { choose(index); });
    connect(zoom_->lineEdit(), &QLineEdit::editingFinished, this, [this] { takeTyped(); });
}

void ZoomField::choose(int index)
{
    if (zoomed_) {
        zoomed_(zoom_->itemData(index).toInt());
    }
    zoom_->setEditText(percentText(percent_));
}

void ZoomField::takeTyped()
{
    QString typed = zoom_->currentText();
    bool isNumber = false;
    const int percent = typed.remove(u'%').trimmed().toInt(&isNumber);
    if (isNumber && percent != percent_ && zoomed_) {
        zoomed_(percent);
    }
    zoom_->setEditText(percentText(percent_));
}

void ZoomField::setZoom(int percent, bool offersFit)
{
    percent_ = percent;
    const bool hasFit = zoom_->itemData(0).toInt() < 0;
    const QSignalBlocker blocker(zoom_);
    if (offersFit && !hasFit) {
        zoom_->insertItem(0, Xlate("Fit to Width"), FitWidth);
        zoom_->insertItem(1, Xlate("Fit to Page"), FitPage);
    } else if (!offersFit && hasFit) {
        zoom_->removeItem(1);
        zoom_->removeItem(0);
    }
    const bool isTypedIn = zoom_->lineEdit()->hasFocus() && zoom_->lineEdit()->isModified();
    if (!isTypedIn && zoom_->currentText() != percentText(percent)) {
        zoom_->setEditText(percentText(percent));
    }
}

} // namespace kareport
