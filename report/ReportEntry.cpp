#include "ReportEntry.h"

#include "MemoryLasts.h"
#include "NewReport.h"
#include "ReportViewPort.h"
#include "ReportWindow.h"
#include "UApplication.h"
#include "UReportDoc.h"

namespace
{

constexpr unsigned reportResourceId = 27006;
const QString creatorName = QStringLiteral("REPORTDOCTEMPLATE");

} // namespace

kareport::ReportWindow::~ReportWindow() = default;
kareport::ReportViewPort::~ReportViewPort() = default;

void LoadKaReport() {}

std::unique_ptr<UDocTemplate> kareport::makeReportTemplate(UDocTemplate::PaneFactory makePane,
                                                           UDocTemplate::ViewFactory makeView)
{
    return std::make_unique<UDocTemplate>(
        reportResourceId, [] { return std::make_unique<UReportDoc>(); }, std::move(makePane), std::move(makeView),
        creatorName, 1, 1);
}

UDocTemplate *GetReportTemplate()
{
    if (UApplication::Get() == nullptr) {
        return nullptr;
    }
    for (const auto &docTemplate : UApplication::Get()->GetDocTemplates()) {
        if (docTemplate->IsThatCreator(creatorName)) {
            return docTemplate.get();
        }
    }
    return nullptr;
}

UReportDoc *CreateReport(const QString &name, bool headerFlag, bool externalEditor, CViewPane *pane, unsigned style,
                         const QRect *rect)
{
    return kareport::whileMemoryLasts<UReportDoc *>(nullptr, [&] {
        return kareport::openNewReport({name, headerFlag, externalEditor}, !IsUseExternalEditor(externalEditor), pane,
                                       style, rect);
    });
}
