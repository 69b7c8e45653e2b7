#include "ReportAccess.h"

#include "LoadedText.h"
#include "Placeholders.h"
#include "ReportParts.h"
#include "UReportDoc.h"

#include <utility>

namespace kareport
{

void ReportAccess::takeText(UReportDoc &report, LoadedText &text)
{
    ReportParts &parts = *report.parts_;
    ++parts.editCount;
    parts.page.exchangeText(text.text, std::move(text.pageStarts), text.lineEnds);
    report.SetModifiedFlag(true);
}

void ReportAccess::takeContent(UReportDoc &report, UReportDoc &made)
{
    ReportParts &own = *report.parts_;
    ReportParts &other = *made.parts_;
    const bool flowsOnSheets = own.layout.givenLinesPerPage() && !own.layout.isGiven();
    ++own.editCount;
    own.page.exchangeContent(other.page);
    std::swap(own.layout, other.layout);
    std::swap(own.data, other.data);
    std::swap(own.data.ownPrintHash, other.data.ownPrintHash); // it belongs to the surroundings, which stay
    std::swap(own.chainageLabel, other.chainageLabel);
    std::swap(own.writeTableName, other.writeTableName);
    std::swap(own.reportFileName, other.reportFileName);
    own.mirrors.image.clear();
    own.openedFromRtf = false;
    if (flowsOnSheets && own.layout.givenLinesPerPage()) {
        report.UseGivenPage(false);
        report.SetPageSize();
    }
    report.SetModifiedFlag(true);
}

void ReportAccess::setHooks(UReportDoc &report, const ReportHooks &hooks)
{
    ReportParts &parts = *report.parts_;
    parts.hooks = hooks;
    parts.data.remarks = hooks.remarks;
    parts.data.results = hooks.results;
    const Placeholders *placeholders = hooks.placeholders;
    parts.page.setPageMarks(placeholders != nullptr);
    parts.data.labelText = nullptr;
    if (placeholders != nullptr) {
        parts.data.labelText = [placeholders](const QString &label, const QString &title) {
            return placeholders->labelOf(label, title);
        };
    }
}

const ReportHooks &ReportAccess::hooks(const UReportDoc &report)
{
    return report.parts_->hooks;
}

PageGeometry ReportAccess::printedPage(const UReportDoc &report)
{
    PageLayout layout = report.parts_->layout;
    layout.measure(report.parts_->pageDevice()); // without a printer it stays as it is
    return layout.geometry();
}

} // namespace kareport
