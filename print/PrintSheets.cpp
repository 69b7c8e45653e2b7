#include "PrintSheets.h"

#include "LinePager.h"
#include "SheetPlan.h"

namespace kareport
{

std::vector<PrintSheet> printSheets(LinePager &pager, const QRect &twips, const std::vector<ReportPage> &pages,
                                    qint64 usualLines)
{
    SheetPlan plan(pager, twips, usualLines);
    plan.begin(pages);
    while (plan.step()) {
    }
    return plan.sheets();
}

} // namespace kareport
