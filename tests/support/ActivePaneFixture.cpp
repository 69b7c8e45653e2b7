#include "ActivePaneFixture.h"

PaneTab tabOf(const UXTPMDIFrameWnd &frame, const COneViewPane &pane)
{
    for (QTabBar *bar : frame.findChildren<QTabBar *>()) {
        for (int i = 0; i < bar->count(); ++i) {
            if (bar->isVisible() && bar->tabText(i) == pane.GetDock()->windowTitle()) {
                return {bar, i};
            }
        }
    }
    return {};
}

bool clickTab(const UXTPMDIFrameWnd &frame, const COneViewPane &pane)
{
    const PaneTab tab = tabOf(frame, pane);
    if (tab.bar != nullptr) {
        QTest::mouseClick(tab.bar, Qt::LeftButton, Qt::NoModifier, tab.bar->tabRect(tab.index).center());
    }
    return tab.bar != nullptr;
}

COneViewPane &dockPaneOf(const UReportDoc &report, std::size_t view)
{
    return dynamic_cast<COneViewPane &>(*report.GetViews().at(view)->GetParentPane());
}

kareport::ReportEdit &editOf(const UReportDoc &report, std::size_t view)
{
    return dynamic_cast<UReportView &>(*report.GetViews().at(view)).GetEdit();
}

namespace
{

/// Lets nothing learn that a widget has come above others.
class UnseenOrder : public QObject
{
protected:
    bool eventFilter(QObject *, QEvent *event) override { return event->type() == QEvent::ZOrderChange; }
};

} // namespace

void putAboveSiblings(QDockWidget &dock)
{
    UnseenOrder unseen;
    dock.installEventFilter(&unseen);
    dock.raise();
}

QString wrongWithActive(const UXTPMDIFrameWnd &frame)
{
    const COneViewPane *pane = frame.GetActivePane();
    const UView *view = frame.GetActiveView();
    const auto docks = frame.findChildren<QDockWidget *>();
    const bool hasDock =
        std::any_of(docks.begin(), docks.end(), [](const QDockWidget *dock) { return !dock->isHidden(); });
    if (pane == nullptr) {
        return hasDock           ? QStringLiteral("no pane is active")
               : view != nullptr ? QStringLiteral("a view without a pane")
                                 : QString();
    }
    if (!pane->IsInFront() || pane->GetDock()->visibleRegion().isEmpty()) {
        return QStringLiteral("the active pane is not seen");
    }
    if (pane->GetActiveView() != nullptr && pane->GetActiveView() != view) {
        return QStringLiteral("another view is active than that of the active pane");
    }
    if (view != nullptr && (view->GetParentPane() == nullptr || !view->GetParentPane()->IsInFront())) {
        return QStringLiteral("the active view is not seen");
    }
    const QWidget *focus = QApplication::focusWidget();
    return focus != nullptr && pane->GetDock()->isAncestorOf(focus) ? QString()
                                                                    : QStringLiteral("the keyboard is elsewhere");
}
