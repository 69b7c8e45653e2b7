#include "DeskApplication.h"

#include "CReportViewPane.h"
#include "DeskFrame.h"
#include "Profile.h"
#include "ReportEntry.h"
#include "UReportView.h"
#include "WorkAside.h"

#include <QFileInfo>

namespace
{

QString recentEntry(qsizetype number)
{
    return QStringLiteral("Recent File %1").arg(number);
}

} // namespace

DeskApplication::DeskApplication()
{
    AddDocTemplate(kareport::makeReportTemplate([] { return new CReportViewPane; },
                                                [] {
                                                    auto view = std::make_unique<UReportView>();
                                                    view->SetLoadsInPieces(true);
                                                    return view;
                                                }));
    QStringList files;
    for (qsizetype number = 1; !GetProfileString(QString(), recentEntry(number)).isEmpty(); ++number) {
        files.prepend(GetProfileString(QString(), recentEntry(number)));
    }
    for (const QString &file : files) {
        UApplication::AddToRecentFileList(file);
    }
}

DeskApplication::~DeskApplication()
{
    kareport::waitForStoppedWork();
}

void DeskApplication::AddToRecentFileList(const QString &path)
{
    UApplication::AddToRecentFileList(QFileInfo(path).absoluteFilePath());
    for (qsizetype i = 0; i < GetRecentFileList().size(); ++i) {
        WriteProfileString(QString(), recentEntry(i + 1), GetRecentFileList().at(i));
    }
}

void DeskApplication::OnDocumentEvent(UDocument &document, UDocument::DocumentEvent event)
{
    if (auto *frame = dynamic_cast<DeskFrame *>(UXTPMDIFrameWnd::Get())) {
        frame->NoteDocumentEvent(document, event);
    }
}
