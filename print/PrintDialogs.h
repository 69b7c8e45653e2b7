#pragma once

#include "KaReportExport.h"
#include "PageSetup.h"

#include <functional>

class QPrinter;
class QWidget;

namespace kareport
{

/// The windows in which the user answers a print command. An empty member means Qt's own window, or ours.
struct PrintDialogs
{
    /// Asks for printer, pages and copies and sets the printer up with them. @param maxPage  the last page that can be
    /// chosen; below 1 when it is not known. @return false when the job is cancelled
    std::function<bool(QPrinter &printer, int maxPage, QWidget *parent)> print;
    /// Shows the pages that `paint` draws, as often as it needs them, until the user closes it. `paint` is also called with
    /// a printer to print on.
    std::function<void(QPrinter &printer, QWidget *parent, const std::function<void(QPrinter &)> &paint)> preview;
    /// Asks for the set-up of a page. @return false, with the set-up as it was, when it is cancelled
    std::function<bool(PageSetup &setup, QWidget *parent)> pageSetup;
};

/// Installs the windows that print commands ask with; empty ones bring Qt's and our own back.
KAREPORT_EXPORT void setPrintDialogs(PrintDialogs dialogs);

} // namespace kareport
