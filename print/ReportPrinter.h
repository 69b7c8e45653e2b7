#pragma once

#include "PageSetupForm.h"

#include <QSize>
#include <QString>

#include <memory>
#include <vector>

class QPageSize;
class QPrinter;

namespace kareport
{

/// Whether there is a printer to print on: an installed one, or the built-in page device where the host has chosen it.
bool hasReportPrinter();
/// That printer, upright or not, ready for whole sheets. The built-in page device prints into a file named after the
/// report. @return null when it cannot be made
std::shared_ptr<QPrinter> makeReportPrinter(bool portrait, const QString &title);
/// The sheet that a printer is set to, in twips.
QSize sheetInTwips(const QPrinter &printer);

/// A sheet as it is chosen from a list.
PageSheet pageSheet(const QPageSize &size);
/// The sheets to choose from where no printer says which it takes: one, and the usual ones after it.
std::vector<PageSheet> usualSheets(const QPageSize &first);
/// The printers to choose from, and the one that is chosen.
void fillPrinters(PageSetup &setup);
/// Makes an installed printer the one that the application prints on. @param sheet  upright, in points; empty for the
/// printer's own
void selectPrinter(const QString &name, const QSize &sheet);

} // namespace kareport
