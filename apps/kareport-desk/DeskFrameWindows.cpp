#include "DeskFrame.h"

#include "COneViewPane.h"
#include "PaneDock.h"
#include "Profile.h"
#include "ReportEntry.h"

#include <QDockWidget>

namespace
{

const QString layoutEntry = QStringLiteral("Window Layout");
const QString geometryEntry = QStringLiteral("Window Geometry");

} // namespace

void DeskFrame::newWindow()
{
    UDocument *document = activeDocument();
    if (document == nullptr) {
        return;
    }
    if (CViewPane *pane = GetReportTemplate()->CreateNewPane(document, nullptr, 0, nullptr)) {
        GetReportTemplate()->InitialUpdatePane(pane, document, 1);
    }
}

void DeskFrame::dockAll(const std::function<void(QDockWidget *, QDockWidget *)> &join)
{
    QDockWidget *before = nullptr;
    for (QDockWidget *dock : findChildren<QDockWidget *>(QString(), Qt::FindDirectChildrenOnly)) {
        const auto *paneDock = dynamic_cast<kareport::PaneDock *>(dock);
        if (dock->isHidden() || paneDock == nullptr || paneDock->pane() == nullptr ||
            !paneDock->pane()->CanBeTabbedDocument()) {
            continue; // panes beside the reports keep their places
        }
        dock->setFloating(false);
        if (before == nullptr) {
            addDockWidget(Qt::TopDockWidgetArea, dock);
        } else {
            join(before, dock);
        }
        before = dock;
    }
}

void DeskFrame::arrange(Qt::Orientation orientation)
{
    dockAll(
        [this, orientation](QDockWidget *before, QDockWidget *dock) { splitDockWidget(before, dock, orientation); });
}

void DeskFrame::cascade()
{
    dockAll([this](QDockWidget *before, QDockWidget *dock) { tabifyDockWidget(before, dock); });
}

void DeskFrame::loadLayout()
{
    restoreGeometry(QByteArray::fromBase64(GetProfileString(QString(), geometryEntry).toLatin1()));
    restoreState(QByteArray::fromBase64(GetProfileString(QString(), layoutEntry).toLatin1()));
}

void DeskFrame::saveLayout() const
{
    WriteProfileString(QString(), geometryEntry, QString::fromLatin1(saveGeometry().toBase64()));
    WriteProfileString(QString(), layoutEntry, QString::fromLatin1(saveState().toBase64()));
}
