#pragma once

#include "KaReportExport.h"
#include "UDocTemplate.h"

#include <memory>

/// A new document template for reports, which the host adds to its application: every report has a view (`UReportView`) in a
/// pane (`CReportViewPane`).
KAREPORT_EXPORT std::unique_ptr<UDocTemplate> ReportInitialTemplate();
