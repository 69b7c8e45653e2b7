#include "EntryList.h"

#include "PlainWidgets.h"
#include "Readable.h"

#include <QApplication>
#include <QKeyEvent>
#include <QPainter>
#include <QStyledItemDelegate>

#include <algorithm>

namespace kareport
{

namespace
{

constexpr int idRole = Qt::UserRole;
constexpr int detailRole = Qt::UserRole + 1;
constexpr int missingRole = Qt::UserRole + 2;
constexpr int space = 6;
constexpr int iconSide = 16;

QFont detailFont(const QFont &font)
{
    constexpr qreal smaller = 0.9;
    QFont detail = font;
    detail.setPointSizeF(font.pointSizeF() * smaller);
    return detail;
}

/// Draws an entry in one line or two. Texts are drawn as they are: names of files may look like HTML.
class EntryDelegate : public QStyledItemDelegate
{
public:
    using QStyledItemDelegate::QStyledItemDelegate;

    QSize sizeHint(const QStyleOptionViewItem &option, const QModelIndex &index) const override
    {
        const int name = std::max(QFontMetrics(option.font).height(), iconSide);
        const bool hasDetail = !index.data(detailRole).toString().isEmpty();
        const int detail = hasDetail ? QFontMetrics(detailFont(option.font)).height() : 0;
        return {QFontMetrics(option.font).averageCharWidth() * 12, name + detail + space};
    }

    void paint(QPainter *painter, const QStyleOptionViewItem &option, const QModelIndex &index) const override
    {
        QStyleOptionViewItem shown(option);
        initStyleOption(&shown, index);
        shown.text.clear();
        shown.icon = QIcon();
        const QWidget *widget = shown.widget;
        const QStyle *style = widget != nullptr ? widget->style() : QApplication::style();
        style->drawControl(QStyle::CE_ItemViewItem, &shown, painter, widget);

        const bool isSelected = shown.state.testFlag(QStyle::State_Selected);
        const QColor quiet =
            isSelected ? shown.palette.color(QPalette::HighlightedText) : quietColor(shown.palette, QPalette::Base);
        const bool isMissing = index.data(missingRole).toBool();
        const QColor loud = isMissing || isSelected ? quiet : shown.palette.color(QPalette::Active, QPalette::Text);
        QRect place = option.rect.adjusted(space, space / 2, -space, -space / 2);
        painter->save();
        const QIcon icon = index.data(Qt::DecorationRole).value<QIcon>();
        if (!icon.isNull()) {
            const int line = std::max(QFontMetrics(option.font).height(), iconSide);
            icon.paint(painter, QRect(place.left(), place.top() + (line - iconSide) / 2, iconSide, iconSide));
            place.setLeft(place.left() + iconSide + space);
        }
        drawLine(*painter, place, option.font, loud, index.data(Qt::DisplayRole).toString(), Qt::ElideRight);
        place.setTop(place.top() + std::max(QFontMetrics(option.font).height(), icon.isNull() ? 0 : iconSide));
        drawLine(*painter, place, detailFont(option.font), quiet, index.data(detailRole).toString(), Qt::ElideMiddle);
        painter->restore();
    }

private:
    static void drawLine(QPainter &painter, const QRect &place, const QFont &font, const QColor &color,
                         const QString &text, Qt::TextElideMode elide)
    {
        const QFontMetrics metrics(font);
        painter.setFont(font);
        painter.setPen(color);
        painter.drawText(place.left(), place.top() + metrics.ascent(), metrics.elidedText(text, elide, place.width()));
    }
};

} // namespace

EntryList::EntryList(const QString &name, QWidget *parent) : QListWidget(parent)
{
    setAccessibleName(name);
    setItemDelegate(new EntryDelegate(this));
    setFrameShape(QFrame::NoFrame);
    setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setTabKeyNavigation(false);
    setMouseTracking(true);
    connect(this, &QListWidget::itemClicked, this, [this](const QListWidgetItem *item) { choose(item); });
}

void EntryList::setEntries(const std::vector<Entry> &entries)
{
    const int row = currentRow();
    clear();
    for (const Entry &entry : entries) {
        auto *item = new QListWidgetItem(entry.icon, entry.name, this);
        item->setData(idRole, entry.id);
        item->setData(detailRole, entry.detail);
        item->setData(missingRole, entry.isMissing);
        item->setData(Qt::AccessibleTextRole,
                      entry.detail.isEmpty() ? entry.name : entry.name + QStringLiteral(", ") + entry.detail);
        item->setToolTip(plainToolTip(entry.detail.isEmpty() ? entry.name : entry.name + u'\n' + entry.detail));
    }
    setCurrentRow(row >= 0 && row < count() ? row : -1);
}

void EntryList::setNeighbours(EntryList *left, EntryList *right)
{
    left_ = left;
    right_ = right;
}

void EntryList::takeKeyboard()
{
    setFocus(Qt::OtherFocusReason);
    if (currentRow() < 0 && count() > 0) {
        setCurrentRow(0);
    }
}

void EntryList::focusInEvent(QFocusEvent *event)
{
    QListWidget::focusInEvent(event);
    const bool byKey = event->reason() == Qt::TabFocusReason || event->reason() == Qt::BacktabFocusReason;
    if (byKey && currentRow() < 0 && count() > 0) {
        setCurrentRow(0);
    }
}

void EntryList::choose(const QListWidgetItem *item)
{
    if (item != nullptr && chosen) {
        QMetaObject::invokeMethod(
            this, [call = chosen, id = item->data(idRole).toString()] { call(id); }, Qt::QueuedConnection);
    }
}

void EntryList::keyPressEvent(QKeyEvent *event)
{
    const int key = event->key();
    if (key == Qt::Key_Return || key == Qt::Key_Enter || key == Qt::Key_Space) {
        choose(currentItem());
        return;
    }
    EntryList *beside = key == Qt::Key_Left ? left_ : key == Qt::Key_Right ? right_ : nullptr;
    if (beside != nullptr && beside->count() > 0) {
        beside->takeKeyboard();
        return;
    }
    QListWidget::keyPressEvent(event);
}

QSize EntryList::sizeHint() const
{
    constexpr int characters = 24;
    return {fontMetrics().averageCharWidth() * characters, QListWidget::sizeHint().height()};
}

} // namespace kareport
