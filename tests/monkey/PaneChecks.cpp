#include "World.h"

#include "COneViewPane.h"
#include "DeskFrame.h"
#include "PaneDock.h"
#include "UReportDoc.h"
#include "UReportView.h"

#include <QApplication>
#include <QDockWidget>
#include <QTabBar>
#include <QToolBar>

#include <algorithm>

namespace monkey
{

QString World::describePanes() const
{
    const DeskFrame &frame = *frame_;
    const COneViewPane *active = frame.GetActivePane();
    QStringList lines;
    for (const QDockWidget *dock : frame.findChildren<QDockWidget *>()) {
        const auto *paneDock = dynamic_cast<const kareport::PaneDock *>(dock);
        const COneViewPane *pane = paneDock != nullptr ? paneDock->pane() : nullptr;
        const QRect place = dock->geometry();
        lines.append(QStringLiteral("  %1%2%3%4%5 at %6,%7 of %8 x %9")
                         .arg(dock->windowTitle(), dock->isHidden() ? QStringLiteral(", hidden") : QString(),
                              dock->isFloating()         ? QStringLiteral(", floats")
                              : dock->window() != &frame ? QStringLiteral(", floats with others")
                                                         : QString(),
                              pane == nullptr     ? QStringLiteral(", left by its pane")
                              : pane->IsInFront() ? QStringLiteral(", in front")
                                                  : QString(),
                              pane != nullptr && pane == active ? QStringLiteral(", active") : QString())
                         .arg(place.x())
                         .arg(place.y())
                         .arg(place.width())
                         .arg(place.height()));
    }
    const QWidget *focus = QApplication::focusWidget();
    const QWidget *window = QApplication::activeWindow();
    return QStringLiteral("\n%1\n  keyboard in %2, active window %3")
        .arg(lines.join(u'\n'),
             focus != nullptr ? QLatin1String(focus->metaObject()->className()) : QLatin1String("nothing"),
             window != nullptr ? QLatin1String(window->metaObject()->className()) : QLatin1String("none"));
}

QString World::checkActive() const
{
    if (frame_ == nullptr || !frame_->isVisible()) {
        return {};
    }
    const std::vector<UReportView *> shown = viewsOnScreen();
    const COneViewPane *pane = frame_->GetActivePane();
    const QDockWidget *dock = pane != nullptr ? pane->GetDock() : nullptr;
    if (!shown.empty() && (dock == nullptr || !pane->IsInFront())) {
        return QStringLiteral("a report is on the screen, and no pane on the screen is active");
    }
    const auto *active = dynamic_cast<UReportView *>(frame_->GetActiveView());
    if (active != nullptr && active->GetParentPane() == pane &&
        std::find(shown.begin(), shown.end(), active) == shown.end())
    {
        return QStringLiteral("the active view is not on the screen");
    }
    const UReportView *typedInto = viewWithKeyboard();
    if (typedInto != nullptr && (typedInto != active || typedInto->GetParentPane() != pane)) {
        return QStringLiteral("the view with the keyboard is not the active one");
    }
    const QWidget *focus = QApplication::focusWidget();
    const QList<QDockWidget *> docks = frame_->findChildren<QDockWidget *>();
    const bool hasPanes = std::any_of(docks.begin(), docks.end(), [](const QDockWidget *shownDock) {
        const auto *paneDock = dynamic_cast<const kareport::PaneDock *>(shownDock);
        return paneDock != nullptr && paneDock->pane() != nullptr && paneDock->pane()->IsInFront() &&
               paneDock->window() == QApplication::activeWindow();
    });
    const auto *tabs = qobject_cast<const QTabBar *>(focus);
    const bool isInTabs = mayBeInTabs_ && tabs != nullptr && tabs->count() > 1 && !tabs->visibleRegion().isEmpty();
    // The frame's own parts, the notes and the bars, take the keyboard while the report beside them stays the active one.
    const bool isInFrame = focus != nullptr && std::any_of(docks.begin(), docks.end(), [focus](const QDockWidget *own) {
                               return dynamic_cast<const kareport::PaneDock *>(own) == nullptr && own->isVisible() &&
                                      own->isAncestorOf(focus);
                           });
    const QList<QToolBar *> bars = frame_->findChildren<QToolBar *>();
    const bool isInBar = std::any_of(bars.begin(), bars.end(), [focus](const QToolBar *bar) {
        return focus != nullptr && bar->isVisible() && bar->isAncestorOf(focus);
    });
    if (hasPanes && !isInTabs && !isInFrame && !isInBar &&
        (dock == nullptr || focus == nullptr || !dock->isAncestorOf(focus)))
    {
        return QStringLiteral("the keyboard is not in the active pane");
    }
    if (typedInto != nullptr && frame_->GetCommandDocument() != typedInto->GetDocument()) {
        return QStringLiteral("commands are not for the report that has the keyboard");
    }
    return {};
}

} // namespace monkey
