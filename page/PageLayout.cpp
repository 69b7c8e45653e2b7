#include "PageLayout.h"

#include "DefaultPrinter.h"
#include "Preferences.h"
#include "ReportMargins.h"
#include "ReportOrientation.h"

namespace kareport
{

std::optional<PageDevice> reportPageDevice()
{
    const auto orientation = reportOrientation();
    return pageDevice(defaultPrinter(), UPreviewDlg::IsModulePrinterOrientationPortrait());
}

bool PageLayout::measure(const std::optional<PageDevice> &device)
{
    if (!device) {
        return false;
    }
    PageGeometry measured = geometry_;
    measured.pageSize = device->size;
    measured.resolution = static_cast<unsigned>(device->resolution);
    if (!isGiven() || !givenCharsPerRow_) {
        measured = measurePage(*device, margins, measureFont(fontName, fontSize, device->resolution));
    }
    geometry_ = measured;
    applyGiven();
    return true;
}

void PageLayout::give(std::optional<int> linesPerPage, std::optional<int> charsPerRow)
{
    givenLinesPerPage_ = linesPerPage;
    givenCharsPerRow_ = charsPerRow;
    useGiven(true);
}

void PageLayout::useGiven(bool on)
{
    usesGiven_ = on;
    applyGiven();
}

void PageLayout::applyGiven()
{
    if (isGiven()) {
        geometry_.linesPerPage = *givenLinesPerPage_;
    }
    geometry_.charsPerRow = givenCharsPerRow_.value_or(geometry_.charsPerRow);
}

void PageLayout::load()
{
    if (const auto kept = profileMargins(margins)) {
        margins = *kept;
    } else {
        save();
    }
    fontSize = GetReportFontSize();
}

void PageLayout::save() const
{
    setProfileMargins(margins);
}

} // namespace kareport
