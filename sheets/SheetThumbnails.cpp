#include "SheetThumbnails.h"

#include "SheetLayout.h"
#include "Xlate.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QScrollBar>

#include <algorithm>

namespace kareport
{

namespace
{

constexpr int usualWidth = 110;
constexpr int keptPictures = 200;
constexpr int restBeforeDrawing = 250; // milliseconds

} // namespace

SheetThumbnails::SheetThumbnails(Source source, QWidget *parent)
    : SheetColumn(std::move(source), parent), pictures_(keptPictures)
{
    setAccessibleName(Xlate("Small pictures of the sheets"));
    setFocusPolicy(Qt::StrongFocus);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    forgetTimer_.setSingleShot(true);
    forgetTimer_.setInterval(restBeforeDrawing);
    connect(&forgetTimer_, &QTimer::timeout, this, [this] {
        pictures_.clear();
        viewport()->update();
    });
}

QSize SheetThumbnails::sizeHint() const
{
    return {usualWidth + 2 * gap() + verticalScrollBar()->sizeHint().width(), 200};
}

QSize SheetThumbnails::minimumSizeHint() const
{
    return {48, 48};
}

QSize SheetThumbnails::sheetSize() const
{
    const SheetLayout *sheets = layout();
    const QSize paper = sheets != nullptr ? sheets->paper().size : QSize();
    const int width = std::max(16, viewport()->width() - 2 * gap());
    return {width, paper.isEmpty() ? width : std::max(1, width * paper.height() / paper.width())};
}

void SheetThumbnails::sheetsChanged()
{
    forgetTimer_.start();
    SheetColumn::sheetsChanged();
}

void SheetThumbnails::setShown(int sheet)
{
    if (sheet == shown_) {
        return;
    }
    shown_ = sheet;
    setAccessibleDescription(sheet < 0 ? QString() : Xlate("Sheet %1 of %2").arg(sheet + 1).arg(count()));
    bring(sheet);
    viewport()->update();
}

void SheetThumbnails::bring(int sheet)
{
    const QRect rect = sheetRect(sheet).adjusted(0, -gap(), 0, captionHeight());
    if (sheet >= 0 && rect.top() < 0) {
        verticalScrollBar()->setValue(verticalScrollBar()->value() + rect.top());
    } else if (sheet >= 0 && rect.bottom() > viewport()->height()) {
        verticalScrollBar()->setValue(verticalScrollBar()->value() + rect.bottom() - viewport()->height() + 1);
    }
}

const QPixmap *SheetThumbnails::pictureOf(SheetLayout &layout, int sheet, const QSize &size)
{
    const qreal ratio = devicePixelRatioF();
    const QPixmap *known = pictures_.object(sheet);
    if (known != nullptr && known->deviceIndependentSize().toSize() == size && known->devicePixelRatio() == ratio) {
        return known;
    }
    auto *picture = new QPixmap((QSizeF(size) * ratio).toSize());
    picture->setDevicePixelRatio(ratio);
    picture->fill(Qt::white);
    {
        QPainter painter(picture);
        drawText(painter, layout, sheet, QRect(QPoint(), size));
    }
    pictures_.insert(sheet, picture);
    return pictures_.object(sheet);
}

void SheetThumbnails::drawSheet(QPainter &painter, SheetLayout &layout, int sheet, const QRect &rect)
{
    if (const QPixmap *picture = pictureOf(layout, sheet, rect.size())) {
        painter.drawPixmap(rect.topLeft(), *picture);
    }
    const QRect caption(rect.left(), rect.bottom() + 3, rect.width(), captionHeight() - 2);
    const bool isShown = sheet == shown_;
    if (isShown) {
        painter.fillRect(caption, palette().color(QPalette::Highlight));
    }
    const bool isLight = ground().lightness() > 128;
    painter.setPen(isShown ? palette().color(QPalette::HighlightedText) : isLight ? Qt::black : Qt::white);
    painter.drawText(caption, Qt::AlignCenter, QString::number(sheet + 1));
}

void SheetThumbnails::choose(int sheet)
{
    const int wanted = std::clamp(sheet, 0, std::max(0, count() - 1));
    setShown(wanted);
    if (go_ && count() > 0) {
        go_(wanted);
    }
}

void SheetThumbnails::keyPressEvent(QKeyEvent *event)
{
    const int window = std::max(1, viewport()->height() / pitch());
    switch (event->key()) {
    case Qt::Key_Down:
    case Qt::Key_Right: choose(shown_ + 1); break;
    case Qt::Key_Up:
    case Qt::Key_Left: choose(shown_ - 1); break;
    case Qt::Key_PageDown: choose(shown_ + window); break;
    case Qt::Key_PageUp: choose(shown_ - window); break;
    case Qt::Key_Home: choose(0); break;
    case Qt::Key_End: choose(count() - 1); break;
    default: event->ignore(); // for the window around it
    }
}

void SheetThumbnails::mousePressEvent(QMouseEvent *event)
{
    const auto [first, last] = sheetsIn(QRect(event->position().toPoint(), QSize(1, 1)));
    if (event->button() == Qt::LeftButton && first <= last) {
        choose(first);
    }
}

void SheetThumbnails::resizeEvent(QResizeEvent *event)
{
    SheetColumn::resizeEvent(event);
    viewport()->update();
}

void SheetThumbnails::changeEvent(QEvent *event)
{
    SheetColumn::changeEvent(event);
    if (event->type() == QEvent::FontChange || event->type() == QEvent::PaletteChange) {
        pictures_.clear();
        setRanges();
        viewport()->update();
    }
}

} // namespace kareport
