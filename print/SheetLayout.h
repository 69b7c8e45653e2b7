#pragma once

#include "LinePager.h"
#include "PageRow.h"
#include "PrintSheets.h"
#include "SheetPlan.h"

#include <QImage>
#include <QRect>
#include <QSize>

#include <cstddef>
#include <functional>
#include <optional>
#include <vector>

class QPainter;
class QTextDocument;

namespace kareport
{

/// A sheet of paper, and the printer that it is for. Lengths in twips.
struct SheetPaper
{
    QSize size;
    QRect room;         ///< takes text
    int resolution = 0; ///< of the printer, dots per inch
    int usualLines = 0; ///< the lines that pages were written for

    bool operator==(const SheetPaper &) const = default;
};

/// The sheets that a text is printed on, found a few at a time, and followed through edits. Each is found, and drawn, by
/// the pager that a print job uses, on a device of the printer's dots.
class SheetLayout
{
public:
    /// Finds the pages that each take sheets of their own; nothing where the lines flow from sheet to sheet.
    using FindPages = std::function<std::optional<std::vector<ReportPage>>()>;

    /// The text must outlive the layout.
    SheetLayout(const QTextDocument &text, const SheetPaper &paper, FindPages findPages);

    const QTextDocument &text() const { return text_; }
    const SheetPaper &paper() const { return paper_; }

    /// Works for so many milliseconds, or for one sheet if that takes longer. @return whether all sheets are known
    bool work(int milliseconds);
    bool isDone() const { return isDone_; }
    int percent() const;
    /// An edit has replaced so many characters by others. The sheets before it stay, those after it move along until they
    /// are found again.
    void noteEdit(qint64 position, qint64 removed, qint64 added);

    const std::vector<PrintSheet> &sheets() const { return sheets_; }
    int count() const { return static_cast<int>(sheets_.size()); }
    /// The sheet, from 0, that a character is printed on, or the next one; -1 without sheets.
    int sheetAt(qint64 position) const;

    /// Draws a sheet with a painter whose unit is a dot of the printer.
    void draw(QPainter &painter, int sheet);
    /// The rows of a sheet, in dots of the printer.
    std::vector<PageRow> rows(int sheet);

private:
    void begin();
    void resumeAfter(const UnchangedText &edited);
    void step();
    void findNext();
    bool resumes();
    void publish();
    qint64 layOut(const PrintSheet &sheet, QPainter *painter, std::vector<PageRow> *rows);

    const QTextDocument &text_;
    SheetPaper paper_;
    FindPages findPages_;
    QImage device_;
    LinePager pager_;
    bool isDone_ = false;
    bool hasBegun_ = false;
    bool wasDone_ = false; ///< whether all sheets have been known, here or before an edit
    std::vector<PrintSheet> sheets_;
    std::optional<UnchangedText> edited_; ///< since the work on the sheets has begun
    std::optional<SheetPlan> plan_;       ///< where pages take sheets of their own
    // Where lines flow from sheet to sheet
    std::vector<PrintSheet> found_;
    qint64 next_ = 0;                ///< the first character of the next sheet
    std::vector<PrintSheet> before_; ///< as they were before an edit, moved along
    std::size_t nextBefore_ = 0;
    bool isWholeBefore_ = false; ///< whether they go to the end of the text
};

} // namespace kareport
