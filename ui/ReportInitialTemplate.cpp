#include "ReportInitialTemplate.h"

#include "CReportViewPane.h"
#include "ReportEntry.h"
#include "UReportView.h"

std::unique_ptr<UDocTemplate> ReportInitialTemplate()
{
    return kareport::makeReportTemplate([] { return new CReportViewPane; },
                                        [] { return std::make_unique<UReportView>(); });
}
