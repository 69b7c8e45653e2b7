#include "ReportEdit.h"

#include "AppMessageBox.h"
#include "MemoryLasts.h"
#include "Xlate.h"

#include <QAction>
#include <QClipboard>
#include <QContextMenuEvent>
#include <QGuiApplication>
#include <QMenu>
#include <QMimeData>

namespace kareport
{

void sayNotCopied()
{
    AppMessageBox(Xlate("There is not enough memory to copy this. The clipboard is as it was."));
}

std::unique_ptr<QMimeData> ReportEdit::selection() const
{
    return std::unique_ptr<QMimeData>(QPlainTextEdit::createMimeDataFromSelection());
}

QMimeData *ReportEdit::createMimeDataFromSelection() const
{
    auto selected = whileMemoryLasts(std::unique_ptr<QMimeData>(), [this] { return selection(); });
    return selected ? selected.release() : new QMimeData; // without a text nothing takes it
}

bool ReportEdit::copySelection() const
{
    if (!textCursor().hasSelection()) {
        return false;
    }
    const bool isCopied =
        doneWhileMemoryLasts([this] { QGuiApplication::clipboard()->setMimeData(selection().release()); });
    if (!isCopied) {
        sayNotCopied();
    }
    return isCopied;
}

void ReportEdit::copy()
{
    copySelection();
}

void ReportEdit::cut()
{
    if (!isReadOnly() && copySelection()) {
        textCursor().removeSelectedText();
        ensureCursorVisible();
    }
}

void ReportEdit::contextMenuEvent(QContextMenuEvent *event)
{
    QMenu *menu = createStandardContextMenu(event->pos());
    if (menu == nullptr) {
        return;
    }
    const auto redirect = [this, menu](const char *name, void (ReportEdit::*act)()) {
        if (auto *action = menu->findChild<QAction *>(QLatin1StringView(name))) {
            QObject::disconnect(action, &QAction::triggered, nullptr, nullptr);
            connect(action, &QAction::triggered, this, act);
        }
    };
    redirect("edit-copy", &ReportEdit::copy);
    redirect("edit-cut", &ReportEdit::cut);
    menu->setAttribute(Qt::WA_DeleteOnClose);
    menu->popup(event->globalPos());
}

} // namespace kareport
