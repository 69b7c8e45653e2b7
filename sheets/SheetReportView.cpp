#include "SheetReportView.h"

#include "FindBar.h"
#include "PageLayout.h"
#include "PageMeasurement.h"
#include "PrintGeometry.h"
#include "ReportAccess.h"
#include "ReportCommandIds.h"
#include "ReportEdit.h"
#include "ReportPage.h"
#include "ReportViewWidget.h"
#include "SheetPane.h"
#include "SheetThumbnails.h"
#include "SheetView.h"
#include "UReportDoc.h"
#include "Xlate.h"

#include <QApplication>
#include <QCheckBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QSplitter>

namespace kareport
{

namespace
{

ReportViewWidget &windowOf(QWidget &widget)
{
    return static_cast<ReportViewWidget &>(widget);
}

} // namespace

SheetReportView::SheetReportView()
    : window_(GetWidget()), sheets_(GetEdit(), {[this] { return paper(); }, [this] { return FindGivenPages(); }})
{
    addFields();
    sheetCommands_ = makeSheetCommands();
    ReportEdit &edit = GetEdit();
    cursorMoved_ =
        QObject::connect(&edit, &QPlainTextEdit::cursorPositionChanged, &edit, [this] { sheets_.showCursor(true); });
    selectionChanged_ =
        QObject::connect(&edit, &QPlainTextEdit::selectionChanged, &edit, [this] { sheets_.showCursor(false); });
}

SheetReportView::~SheetReportView()
{
    QObject::disconnect(cursorMoved_);
    QObject::disconnect(selectionChanged_);
    if (window_) {
        windowOf(*window_).setPlaceHandler({});
        windowOf(*window_).setOtherPages({});
        windowOf(*window_).findBar().setShownHandler({});
    }
    if (pageField_ && zoomField_) {
        pageField_->leave();
        zoomField_->leave();
    }
    sheets_.setActive(false);
}

SheetPaper SheetReportView::paper() const
{
    const UReportDoc *report = GetDocument();
    if (report == nullptr) {
        return {};
    }
    // What a print command begins with: the page measured again, on the printer that it prints on.
    const PageGeometry page = ReportAccess::printedPage(*report);
    const auto device = reportPageDevice();
    SheetPaper paper;
    paper.size = twipsOfDots(page.pageSize, page.resolution);
    paper.room = kareport::printableRect(paper.size, twipsOfHundredths(report->GetMargins()));
    paper.resolution = device ? device->resolution : static_cast<int>(page.resolution);
    paper.usualLines = page.linesPerPage;
    return paper;
}

void SheetReportView::addFields()
{
    ReportViewWidget &window = windowOf(*window_);
    pageField_ = new PageField([this](int page) { goTo(page); });
    zoomField_ = new ZoomField([this](int percent) { zoomTo(percent); }, [this](int direction) { zoomBy(direction); });
    window.pageLabel().hide();
    window.zoomLabel().hide();
    window.statusRow().insertWidget(0, pageField_);
    window.statusRow().addWidget(zoomField_);
    window.setPlaceHandler([this] { showPlace(); });
    window.setOtherPages([this]() -> std::optional<ReportViewWidget::OtherPages> {
        if (shows_ != Shows::Sheets) {
            return std::nullopt;
        }
        sheets_.finish();
        const SheetView &view = sheets_.pane().view();
        return ReportViewWidget::OtherPages{view.shownSheet() + 1, view.count(), [this](int sheet) { goTo(sheet); }};
    });
    showPlace();
}

void SheetReportView::addPane()
{
    ReportViewWidget &window = windowOf(*window_);
    SheetPane &pane = sheets_.pane();
    splitter_ = new QSplitter;
    delete window.layout()->replaceWidget(&window.edit(), splitter_);
    static_cast<QBoxLayout *>(window.layout())->setStretchFactor(splitter_, 1);
    splitter_->addWidget(&window.edit());
    splitter_->addWidget(&pane);
    splitter_->setChildrenCollapsible(false);
    pane.setShowsThumbnails(showsThumbnails_);
    for (QWidget *child : pane.findChildren<QWidget *>()) {
        child->installEventFilter(&window); // a press of the mouse makes the view the active one
    }
    pane.view().setFocusHandler([this] {
        OnSetFocus();
        showPlace();
    });
    pane.view().setShownHandler([this] {
        sheets_.pane().thumbnails().setShown(sheets_.pane().view().shownSheet());
        showPlace();
    });
    followFindBar();
}

void SheetReportView::followFindBar()
{
    FindBar &bar = windowOf(*window_).findBar();
    const QPointer<SheetPane> pane = &sheets_.pane();
    const auto mark = [&bar, pane] {
        if (pane) {
            pane->view().setSearch(bar.isHidden() ? TextSearch() : bar.search());
        }
    };
    // The bar has its own search before this is called, as it was connected first.
    QObject::connect(&bar.field(), &QLineEdit::textChanged, pane.data(), mark);
    QObject::connect(&bar.matchCase(), &QCheckBox::toggled, pane.data(), mark);
    QObject::connect(&bar.wholeWord(), &QCheckBox::toggled, pane.data(), mark);
    bar.setShownHandler(mark);
    mark();
}

void SheetReportView::setShows(Shows shows)
{
    if (!window_ || shows == shows_) {
        return;
    }
    ReportEdit &edit = GetEdit();
    const QWidget *focus = QApplication::focusWidget();
    const bool hadFocus = focus != nullptr && window_->isAncestorOf(focus);
    shows_ = shows;
    if (!splitter_) {
        addPane();
    }
    SheetPane &pane = sheets_.pane();
    // What belongs to the text goes to the sheets where these take its place.
    edit.setFocusProxy(nullptr);
    edit.setVisible(shows != Shows::Sheets);
    pane.setVisible(shows != Shows::Text);
    if (shows == Shows::Sheets) {
        edit.setFocusProxy(&pane.view());
    }
    if (shows == Shows::Both) {
        constexpr int half = 1000; // of any size: they are scaled to what there is
        QList<int> sizes;
        sizes.append(half);
        sizes.append(half);
        splitter_->setSizes(sizes);
    }
    sheets_.setActive(shows != Shows::Text);
    sheets_.showCursor(true);
    sheets_.bringCursor();
    if (hadFocus) {
        edit.setFocus(Qt::OtherFocusReason);
    }
    showPlace();
}

bool SheetReportView::actsOnSheets() const
{
    const auto *focus = QApplication::focusWidget();
    const QWidget *pane = splitter_ ? splitter_->widget(1) : nullptr;
    return shows_ == Shows::Sheets ||
           (shows_ == Shows::Both && focus != nullptr && pane != nullptr && pane->isAncestorOf(focus));
}

void SheetReportView::setShowsThumbnails(bool on)
{
    showsThumbnails_ = on;
    if (splitter_) {
        sheets_.pane().setShowsThumbnails(on);
    }
}

void SheetReportView::setShowsPageLines(bool on)
{
    if (window_) {
        windowOf(*window_).setShowsPageLines(on);
    }
}

void SheetReportView::restartSheets()
{
    sheets_.restart();
}

void SheetReportView::OnPagesForgotten()
{
    sheets_.restart();
}

void SheetReportView::OnTextEdited(const ReportChange &change)
{
    if (sheets_.isActive()) {
        sheets_.noteEdit(change);
    }
}

void SheetReportView::showPlace()
{
    if (!window_ || !pageField_ || !zoomField_) {
        return;
    }
    if (actsOnSheets()) {
        const SheetView &view = sheets_.pane().view();
        pageField_->setPlace(Xlate("Sheet"), view.shownSheet() + 1, view.count());
        zoomField_->setZoom(view.zoomPercent(), true);
    } else {
        const ReportViewWidget &window = windowOf(*window_);
        pageField_->setPlace(Xlate("Page"), window.currentPage(), window.pageCount());
        zoomField_->setZoom(GetEdit().zoomPercent(), false);
    }
}

void SheetReportView::goTo(int page)
{
    if (actsOnSheets()) {
        sheets_.pane().view().goToSheet(page - 1);
    } else {
        windowOf(*window_).goToPage(page);
    }
    showPlace();
}

void SheetReportView::zoomTo(int percent)
{
    if (!actsOnSheets()) {
        GetEdit().setZoomPercent(percent);
    } else if (percent < 0) {
        sheets_.pane().view().setFit(percent == ZoomField::FitWidth ? SheetView::Fit::Width : SheetView::Fit::Page);
    } else {
        sheets_.pane().view().setZoomPercent(percent);
    }
    showPlace();
}

void SheetReportView::zoomBy(int direction)
{
    if (actsOnSheets()) {
        sheets_.pane().view().zoomStep(direction);
    } else {
        GetEdit().zoomStep(direction);
    }
}

const std::vector<Command> &SheetReportView::commands() const
{
    return UReportView::commands().empty() ? UReportView::commands() : sheetCommands_;
}

std::vector<Command> SheetReportView::makeSheetCommands()
{
    std::vector<Command> commands = UReportView::commands();
    const auto replace = [&commands](unsigned id, const std::function<void()> &handler) {
        for (Command &command : commands) {
            if (command.id == id && command.handler) {
                command.handler = handler;
            }
        }
    };
    replace(zoomInCommand, [this] { zoomBy(1); });
    replace(zoomOutCommand, [this] { zoomBy(-1); });
    replace(zoomResetCommand, [this] { zoomTo(100); });
    return commands;
}

} // namespace kareport
