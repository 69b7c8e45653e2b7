#pragma once

#include <QRect>
#include <QString>

class CViewPane;
class UReportDoc;

namespace kareport
{

/// What a new report is called, and what it is for.
struct NewReport
{
    QString name; ///< title and file name; a null text for none
    bool headerFlag = false;
    bool externalEditor = false;
};

/// Makes an empty report through the document template for reports.
/// @param show  whether its pane is shown
/// @param pane  the pane that shows it; null for a new one, with `style` and at `rect`
/// @return null when there is no template or no document can be made
UReportDoc *openNewReport(const NewReport &report, bool show, CViewPane *pane, unsigned style, const QRect *rect);

} // namespace kareport
