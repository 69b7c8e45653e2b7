#pragma once

#include "COneViewPane.h"
#include "KaReportExport.h"

/// The pane that a report's view is in. Whether it may close is for its document to say, and not at all while an
/// editor holds the report.
class KAREPORT_EXPORT CReportViewPane : public COneViewPane
{
public:
    /// Asks the report (`UReportDoc::CanCloseFrame`); a pane without one may always close.
    bool CanClosePane() override;
    /// Closing is refused, with a message, while the report's close option is off; all else is the pane's own.
    void OnSysCommand(unsigned command, long parameter) override;
};
