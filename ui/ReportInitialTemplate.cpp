#include "ReportInitialTemplate.h"

#include "CReportViewPane.h"
#include "MemoryLasts.h"
#include "ReportEntry.h"
#include "UReportView.h"

std::unique_ptr<UDocTemplate> ReportInitialTemplate()
{
    return kareport::whileMemoryLasts(std::unique_ptr<UDocTemplate>(), [] {
        return kareport::makeReportTemplate([] { return new CReportViewPane; },
                                            [] { return std::make_unique<UReportView>(); });
    });
}
