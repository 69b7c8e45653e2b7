#include "ScreenFit.h"

#include <QApplication>
#include <QDialog>
#include <QEvent>
#include <QScreen>

namespace kareport
{

QSize fittingSize(const QWidget &window, const QSize &wanted)
{
    constexpr qreal part = 0.95; // the window system draws a frame around it
    const QScreen *screen = window.screen();
    return screen != nullptr ? wanted.boundedTo(screen->availableSize() * part) : wanted;
}

ScreenFit::ScreenFit(QObject &owner) : QObject(&owner)
{
    qApp->installEventFilter(this);
}

bool ScreenFit::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::Show) {
        auto *dialog = qobject_cast<QDialog *>(watched);
        if (dialog != nullptr && dialog->isWindow()) {
            if (const QSize size = fittingSize(*dialog, dialog->size()); size != dialog->size()) {
                dialog->resize(size);
            }
        }
    }
    return false;
}

} // namespace kareport
