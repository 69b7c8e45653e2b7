#pragma once

#include "SheetLayout.h"

#include <QElapsedTimer>
#include <QPointer>
#include <QTextDocument>
#include <QTimer>

#include <functional>
#include <memory>
#include <optional>

namespace kareport
{

class ReportEdit;
class SheetPane;
struct ReportChange;

/// Keeps the sheets that a pane shows those of a report's text: finds them while the windows answer, and follows edits and
/// loading.
class ReportSheets
{
public:
    /// What the sheets depend on besides the text.
    struct Surroundings
    {
        std::function<SheetPaper()> paper;
        SheetLayout::FindPages findPages;
    };

    /// The control must outlive the object.
    ReportSheets(ReportEdit &edit, Surroundings surroundings);
    ~ReportSheets();
    ReportSheets(const ReportSheets &) = delete;
    ReportSheets &operator=(const ReportSheets &) = delete;

    /// The window that shows the sheets, made with the first call. Whoever puts it into a window owns it.
    SheetPane &pane();
    /// Whether sheets are found at all: only while they are shown.
    void setActive(bool on);
    bool isActive() const { return isActive_; }

    /// The text, its pages or the paper may be others.
    void restart();
    void noteEdit(const ReportChange &change);
    /// Shows cursor and selection of the text. @param follows  whether their sheet is brought into the window
    void showCursor(bool follows);
    /// Brings the sheet with the cursor into the window as soon as that has its size.
    void bringCursor();
    /// The sheets as they are known; null while they are not those of the text.
    SheetLayout *layout();
    /// Finds all sheets that are not known yet.
    void finish();

private:
    bool isCurrent() const;
    void begin();
    void work();
    void publish();

    ReportEdit &edit_;
    Surroundings surroundings_;
    QPointer<SheetPane> pane_;
    bool isActive_ = false;
    bool hasShown_ = false; ///< whether all sheets were known once since they are shown
    bool bringsCursor_ = false;
    QElapsedTimer sincePublished_;
    std::unique_ptr<SheetLayout> layout_;
    QPointer<QTextDocument> text_; ///< of the layout
    int revision_ = 0;             ///< of the text that the layout knows
    QTimer timer_;
};

} // namespace kareport
