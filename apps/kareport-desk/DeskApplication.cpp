#include "DeskApplication.h"

#include "AppMessageBox.h"
#include "CReportViewPane.h"
#include "DeskFrame.h"
#include "DeskPreferences.h"
#include "DeskSheets.h"
#include "PageSetupDialog.h"
#include "PlainWidgets.h"
#include "PrintDialogs.h"
#include "Profile.h"
#include "ReportEntry.h"
#include "ReportSaveName.h"
#include "SaveAs.h"
#include "SaveDialog.h"
#include "WorkAside.h"

#include <QFileInfo>

namespace
{

QString recentEntry(qsizetype number)
{
    return QStringLiteral("Recent File %1").arg(number);
}

} // namespace

DeskApplication::DeskApplication() : printerBefore_(kareport::defaultPrinter())
{
    kareport::usePaper(kareport::loadPreferences());
    AddDocTemplate(kareport::makeReportTemplate([] { return new CReportViewPane; },
                                                [] {
                                                    auto view = std::make_unique<kareport::SheetReportView>();
                                                    view->SetLoadsInPieces(true);
                                                    kareport::showAsChosen(*view);
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
    kareport::setDefaultPrinter(printerBefore_);
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

namespace kareport
{

void installDialogs(QWidget *parent)
{
    setMessageBox([parent](const Message &message) { return showMessageBox(parent, message); });
    PrintDialogs printing;
    printing.pageSetup = [](PageSetup &setup, QWidget *window) {
        setup.inInches = loadPreferences().inInches;
        return showPageSetup(setup, window);
    };
    setPrintDialogs(printing);
    setSaveDialog([parent](const SaveRequest &request) {
        return askOwnName(request, [parent](const SaveRequest &asked) {
            const auto *frame = dynamic_cast<const DeskFrame *>(UXTPMDIFrameWnd::Get());
            const QString origin = frame != nullptr ? frame->OriginFile(asked.document) : QString();
            return askSavePath(parent, withProposedName(asked, origin));
        });
    });
    setSaveFailure(sayNotSaved);
}

} // namespace kareport
