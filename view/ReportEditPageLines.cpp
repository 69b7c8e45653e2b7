#include "ReportEdit.h"

#include "Xlate.h"

#include <QPaintEvent>
#include <QPainter>
#include <QTextBlock>
#include <QTextLayout>

namespace kareport
{

namespace
{

QColor mixed(const QColor &a, const QColor &b)
{
    return QColor((a.red() + b.red()) / 2, (a.green() + b.green()) / 2, (a.blue() + b.blue()) / 2);
}

} // namespace

void ReportEdit::setPageBeginnings(std::function<int(int)> pageOf)
{
    pageBegunBy_ = std::move(pageOf);
    viewport()->update();
}

void ReportEdit::drawPageLines(QPaintEvent &event)
{
    QPainter painter(viewport());
    const QColor color = mixed(palette().color(QPalette::Text), palette().color(QPalette::Base));
    const int right = viewport()->width() - 1;
    for (QTextBlock block = firstVisibleBlock(); block.isValid(); block = block.next()) {
        const QRectF place = blockBoundingGeometry(block).translated(contentOffset());
        if (place.top() > event.rect().bottom() + 1) {
            break;
        }
        const int page = block.isVisible() ? pageBegunBy_(block.blockNumber()) : 0;
        if (page == 0) {
            continue;
        }
        const int y = qRound(place.top());
        painter.setPen(QPen(color, 1, Qt::DashLine));
        painter.drawLine(0, y, right, y);
        QFont small = painter.font();
        small.setPointSizeF(qMax(1.0, QWidget::font().pointSizeF() * 0.8));
        painter.setFont(small);
        painter.setPen(color);
        const QString name = Xlate("Page %1").arg(page);
        const QRect line(0, y + 1, right - 4, qRound(place.height()));
        const QTextLine first = block.layout()->lineAt(0);
        const qreal textEnd = first.isValid() ? place.left() + first.x() + first.naturalTextWidth() : 0;
        if (textEnd < line.right() - painter.fontMetrics().horizontalAdvance(name + u' ')) {
            painter.drawText(line, Qt::AlignRight | Qt::AlignTop, name);
        }
    }
}

} // namespace kareport
