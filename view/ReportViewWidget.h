#pragma once

#include "PageLines.h"
#include "ReportPage.h"

#include <QTimer>
#include <QWidget>

#include <functional>
#include <optional>
#include <vector>

class QHBoxLayout;
class QLabel;
class QTextDocument;

namespace kareport
{

class FindBar;
class PageBar;
class ReportEdit;
struct ReportChange;

/// The window of a report view: the text, the bars that find a text and go to a page, and a line that says where the
/// cursor is.
class ReportViewWidget : public QWidget
{
public:
    explicit ReportViewWidget(QWidget *parent = nullptr);

    ReportEdit &edit() const { return *edit_; }
    FindBar &findBar() const { return *findBar_; }
    PageBar &pageBar() const { return *pageBar_; }
    QLabel &pageLabel() const { return *pageLabel_; }
    QLabel &lineLabel() const { return *lineLabel_; }
    QLabel &columnLabel() const { return *columnLabel_; }
    /// How much of a long report has been loaded; empty when all of it is there.
    QLabel &loadLabel() const { return *loadLabel_; }
    QLabel &zoomLabel() const { return *zoomLabel_; }
    /// The line that they are in.
    QHBoxLayout &statusRow() const { return *statusRow_; }

    /// Where the lines of a page are asked for; 72 without.
    void setLinesPerPage(std::function<int()> linesPerPage);
    /// Where the lines are asked for that pages were begun with, from 0; without, pages are cut by counting lines.
    void setPageStarts(std::function<std::vector<int>()> starts);
    /// What the report's pages are has changed: they are asked for again.
    void forgetPages();
    /// An edit has been made. @param starts  the lines that pages begin with now, among those that the edit has left
    void followEdit(const ReportChange &change, const std::vector<int> &starts);
    /// Called when the mouse is pressed anywhere in it.
    void setPressHandler(std::function<void()> handler) { pressed_ = std::move(handler); }
    /// Called when the window comes to be seen after it was hidden.
    void setShowHandler(std::function<void()> handler) { shown_ = std::move(handler); }

    /// Called when the place of the cursor, the number of pages or the zoom is shown anew.
    void setPlaceHandler(std::function<void()> handler) { placed_ = std::move(handler); }
    /// Other pages than those of the text, to which the page bar goes.
    struct OtherPages
    {
        int current = 0; ///< from 1
        int count = 0;
        std::function<void(int page)> go;
    };
    /// Asked whenever the page bar is used; where nothing comes back it is about the pages of the text.
    void setOtherPages(std::function<std::optional<OtherPages>()> pages) { otherPages_ = std::move(pages); }
    /// Whether the text shows where pages begin. It does not at first.
    void setShowsPageLines(bool on);

    void openFindBar();
    void openPageBar();
    /// Finds on, or opens the find bar when nothing has been looked for yet.
    void findNext();
    void findPrevious();

    /// The pages of the text, as `reportPages` finds them, without looking at all of it.
    std::vector<ReportPage> reportPages() const;
    int pageCount() const;
    int currentPage() const; ///< from 1
    /// Puts the cursor at the beginning of a page and shows it at the top. @param page  brought into 1 to `pageCount`
    void goToPage(int page);
    /// Shows page, line and column again, after the lines of a page have changed.
    void showPlace();

protected:
    bool event(QEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void showEvent(QShowEvent *event) override;
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    using Action = void (ReportViewWidget::*)();

    Action actionOfKey(const QKeyEvent &event) const;
    void closeBar();
    void goFromBar(int page);
    int linesPerPage() const;
    const PageLines &pages() const;
    bool isBlankLine(int line) const;
    int pageBegunBy(int line) const;
    void showLoading();
    void showZoom();

    ReportEdit *edit_;
    FindBar *findBar_;
    PageBar *pageBar_;
    QLabel *pageLabel_;
    QLabel *lineLabel_;
    QLabel *columnLabel_;
    QLabel *loadLabel_;
    QLabel *zoomLabel_;
    QHBoxLayout *statusRow_;
    int shownPages_ = 0; ///< their number
    QTimer placeTimer_;  ///< shows the place again
    std::function<int()> linesPerPage_;
    std::function<std::vector<int>()> pageStarts_;
    mutable PageLines pages_; ///< of the text of a document at a revision
    mutable const QTextDocument *pagesOf_ = nullptr;
    mutable int pagesRevision_ = 0;
    std::function<void()> pressed_;
    std::function<void()> shown_;
    std::function<void()> placed_;
    std::function<std::optional<OtherPages>()> otherPages_;
};

} // namespace kareport
