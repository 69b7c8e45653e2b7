#include "PdfNavigation.h"

#include <hpdf_objects.h>

namespace kareport
{

namespace
{

/// An entry of the outline that others may belong to.
struct Open
{
    int level;
    HPDF_Outline outline; ///< null for one that is not shown
};

/// The array of a place: viewers keep their zoom.
HPDF_Array destinationOf(const PdfPlace &place)
{
    auto *const destination = HPDF_Array_New(place.page->mmgr);
    const bool isDone =
        destination != nullptr && HPDF_Array_Add(destination, place.page) == HPDF_OK &&
        HPDF_Array_AddName(destination, "XYZ") == HPDF_OK && HPDF_Array_AddNumber(destination, 0) == HPDF_OK &&
        HPDF_Array_AddReal(destination, place.top) == HPDF_OK && HPDF_Array_AddNumber(destination, 0) == HPDF_OK;
    return isDone ? destination : nullptr;
}

} // namespace

void PdfPlaces::addLine(qint64 end, std::size_t piece)
{
    for (; nextEntry_ < entries_.size() && entries_[nextEntry_].at <= end; ++nextEntry_) {
        beginnings_.push_back({piece, nextEntry_});
    }
}

void PdfPlaces::addSheet(HPDF_Page sheet, const PdfPageBox &box, const LinePlacement &placement, std::size_t firstPiece,
                         std::size_t pieces)
{
    for (; !beginnings_.empty() && beginnings_.front().piece < firstPiece + pieces; beginnings_.pop_front()) {
        const std::size_t line = beginnings_.front().piece - firstPiece;
        const OutlineEntry &entry = entries_[beginnings_.front().entry];
        const float top = line == 0 ? box.height : box.top - static_cast<float>(line) * placement.leading;
        places_.push_back({entry.text.isEmpty() ? nullptr : sheet, top, entry.level, entry.text});
    }
}

void PdfPageLabels::addPage(unsigned page, unsigned sheets)
{
    if (page != next_ || labels_.empty()) {
        labels_.push_back({sheets_, page, {}});
    }
    next_ = page + 1;
    if (sheets > 1) {
        labels_.push_back({sheets_ + 1, 2, QByteArray::number(page) + '-'});
        next_ = 0;
    }
    sheets_ += sheets;
}

bool writeOutline(PdfDocument &pdf, const std::vector<PdfPlace> &places)
{
    std::vector<Open> open;
    bool isEmpty = true;
    for (const PdfPlace &place : places) {
        while (!open.empty() && open.back().level >= place.level) {
            open.pop_back();
        }
        if (place.page == nullptr) {
            continue;
        }
        const HPDF_Outline outline =
            pdf.addOutline(open.empty() ? nullptr : open.back().outline, place.text.simplified());
        if (outline == nullptr || HPDF_Dict_Add(outline, "Dest", destinationOf(place)) != HPDF_OK) {
            return false;
        }
        // What belongs to a table is shown when it is asked for: there may be thousands of groups.
        HPDF_Outline_SetOpened(outline, place.level < ReportOutline::tableLevel ? HPDF_TRUE : HPDF_FALSE);
        open.push_back({place.level, outline});
        isEmpty = false;
    }
    return pdf.isGood() && (isEmpty || pdf.showOutline());
}

bool writePageLabels(PdfDocument &pdf, const std::vector<PdfLabels> &labels)
{
    for (const PdfLabels &label : labels) {
        if (!pdf.addLabel(label.sheet, label.number, label.prefix)) {
            return false;
        }
    }
    return pdf.isGood();
}

} // namespace kareport
