#pragma once

#include "KaReportExport.h"

namespace kareport
{

/// Marks the views that show a report's text, among all views that a host may give a report document.
class KAREPORT_EXPORT ReportViewPort
{
public:
    virtual ~ReportViewPort();
};

} // namespace kareport
