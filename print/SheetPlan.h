#pragma once

#include "PageFit.h"
#include "PrintSheets.h"

#include <QRect>

#include <cstddef>
#include <vector>

namespace kareport
{

/// What an edit has left of a text: so many characters at its beginning and at its end.
struct UnchangedText
{
    qint64 head = 0;
    qint64 tail = 0;
    qint64 lengthBefore = 0;
    qint64 length = 0;
};

/// Finds the sheets that pages take, page by page, so that a window can answer meanwhile. `printSheets` says what they are.
class SheetPlan
{
public:
    /// The pager must outlive the plan. @param twips  the part of a sheet that takes text
    SheetPlan(LinePager &pager, const QRect &twips, qint64 usualLines);

    /// Begins with the pages of a text.
    void begin(std::vector<ReportPage> pages);
    /// Begins again after an edit: pages that it has left are not measured again.
    void begin(std::vector<ReportPage> pages, const UnchangedText &unchanged);

    /// Does what is to be done for one page. @return false when there is nothing left to do
    bool step();
    /// How much of it has been done.
    int percent() const;
    /// The sheets that have been found: all of them when `step` has nothing left to do.
    const std::vector<PrintSheet> &sheets() const { return sheets_; }

private:
    qreal usualScale() const;
    void addSheets(const ReportPage &page, const PageText &text);

    LinePager &pager_;
    QRect twips_;
    qint64 usualLines_;
    std::vector<ReportPage> pages_;
    std::vector<PageText> texts_;  ///< of the pages
    std::vector<bool> isMeasured_; ///< the same
    std::size_t measured_ = 0;     ///< pages that have been looked at
    std::size_t placed_ = 0;       ///< pages whose sheets have been found
    qreal scale_ = 1;              ///< of the usual page
    std::vector<PrintSheet> sheets_;
};

} // namespace kareport
