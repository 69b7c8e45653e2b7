#pragma once

#include "KaReportExport.h"

#include <QString>

class CViewPane;

namespace kareport
{

/// What a report document needs of the separate window that mirrors its text.
class KAREPORT_EXPORT ReportWindow
{
public:
    virtual ~ReportWindow();
    /// Takes a piece of text as it is written; pieces are not whole lines.
    virtual void WriteLine(const QString &piece) = 0;
    /// The pane that shows the window, closed together with the document; may be null.
    virtual CViewPane *GetOwningPane() = 0;
};

} // namespace kareport
