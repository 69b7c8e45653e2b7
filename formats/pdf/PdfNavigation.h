#pragma once

#include "PdfDocument.h"
#include "PdfGeometry.h"
#include "ReportOutline.h"

#include <QByteArray>
#include <QString>

#include <deque>
#include <vector>

namespace kareport
{

/// A place of a PDF that its outline leads to.
struct PdfPlace
{
    HPDF_Page page = nullptr; ///< null for an entry that is not shown, which only ends those above it
    float top = 0;            ///< of what is shown at the window's upper edge, points from the sheet's lower edge
    int level = 0;            ///< as `OutlineEntry` has it
    QString text;
};

/// Finds the places of an outline's entries while the pages of a report are made, line by line and sheet by sheet.
class PdfPlaces
{
public:
    /// @param entries  in the order of their places; must outlive this object
    explicit PdfPlaces(const std::vector<OutlineEntry> &entries) : entries_(entries) {}

    /// The next line of a page. @param end  of it in the text. @param piece  its first one, from 0 on each page
    void addLine(qint64 end, std::size_t piece);
    /// The next sheet of that page, with so many of its pieces.
    void addSheet(HPDF_Page sheet, const PdfPageBox &box, const LinePlacement &placement, std::size_t firstPiece,
                  std::size_t pieces);
    /// The places on all sheets so far.
    const std::vector<PdfPlace> &places() const { return places_; }

private:
    /// An entry that begins on the current page.
    struct Beginning
    {
        std::size_t piece;
        std::size_t entry;
    };

    const std::vector<OutlineEntry> &entries_;
    std::size_t nextEntry_ = 0;
    std::deque<Beginning> beginnings_; ///< that are on no sheet yet
    std::vector<PdfPlace> places_;
};

/// A sheet from which on the sheets are numbered.
struct PdfLabels
{
    unsigned sheet = 0;  ///< from 0
    unsigned number = 1; ///< of that sheet; those after it go on
    QByteArray prefix;   ///< before each number
};

/// Numbers the sheets of a report's pages: a page that continues on further sheets has "12", "12-2", "12-3".
class PdfPageLabels
{
public:
    /// Adds the sheets of a page. @param page  its number
    void addPage(unsigned page, unsigned sheets);
    const std::vector<PdfLabels> &labels() const { return labels_; }

private:
    std::vector<PdfLabels> labels_;
    unsigned sheets_ = 0;
    unsigned next_ = 0; ///< the number that the next sheet has by itself; 0 for none
};

/// Writes an outline. @param places  in the order of the report. @return false after an error
bool writeOutline(PdfDocument &pdf, const std::vector<PdfPlace> &places);
/// Writes page labels. @return false after an error
bool writePageLabels(PdfDocument &pdf, const std::vector<PdfLabels> &labels);

} // namespace kareport
