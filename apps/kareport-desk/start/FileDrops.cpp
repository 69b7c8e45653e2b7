#include "FileDrops.h"

#include "PaneWindows.h"

#include <QApplication>
#include <QDropEvent>
#include <QMimeData>
#include <QUrl>
#include <QWidget>

#include <utility>

namespace kareport
{

QStringList droppedFiles(const QMimeData &data)
{
    QStringList files;
    for (const QUrl &url : data.urls()) {
        if (url.isLocalFile()) {
            files.append(url.toLocalFile());
        }
    }
    return files;
}

FileDrops::FileDrops(QWidget &frame, std::function<void(const QStringList &files)> drop)
    : QObject(&frame), frame_(frame), drop_(std::move(drop))
{
    frame.setAcceptDrops(true);
    qApp->installEventFilter(this);
}

/// Whether a window is the frame, or one in which its panes float.
bool FileDrops::isOne(const QWidget *window) const
{
    return belongsTo(window, frame_) && holdsPanes(window, &frame_);
}

bool FileDrops::eventFilter(QObject *watched, QEvent *event)
{
    const auto type = event->type();
    if (type == QEvent::ParentChange || type == QEvent::Show) {
        // A pane that floats is a window of its own.
        auto *widget = qobject_cast<QWidget *>(watched);
        if (widget != nullptr && widget->isWindow() && widget != &frame_ && isOne(widget)) {
            widget->setAcceptDrops(true);
        }
        return false;
    }
    if (type != QEvent::DragEnter && type != QEvent::DragMove && type != QEvent::Drop) {
        return false;
    }
    auto *widget = qobject_cast<QWidget *>(watched);
    auto *drag = static_cast<QDropEvent *>(event);
    if (widget == nullptr || !isOne(widget->window()) || drag->mimeData() == nullptr) {
        return false;
    }
    const QStringList files = droppedFiles(*drag->mimeData());
    if (files.isEmpty()) {
        return false; // a text that is dragged within a report, or into it
    }
    drag->acceptProposedAction();
    if (type == QEvent::Drop) {
        drop_(files);
    }
    return true;
}

} // namespace kareport
