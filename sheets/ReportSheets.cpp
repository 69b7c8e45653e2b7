#include "ReportSheets.h"

#include "ReportChange.h"
#include "ReportEdit.h"
#include "SheetPane.h"
#include "SheetThumbnails.h"
#include "SheetView.h"
#include "Xlate.h"

#include <utility>

namespace kareport
{

namespace
{

/// How long the windows wait for the sheets at most.
constexpr int slice = 8; // milliseconds
/// How often they show how many sheets are known.
constexpr int publishInterval = 100;
constexpr int restWhileLoading = 50;

} // namespace

ReportSheets::ReportSheets(ReportEdit &edit, Surroundings surroundings)
    : edit_(edit), surroundings_(std::move(surroundings))
{
    timer_.setInterval(0);
    QObject::connect(&timer_, &QTimer::timeout, &timer_, [this] { work(); });
    // A frame that closes destroys the windows before the views.
    QObject::connect(&edit, &QObject::destroyed, &timer_, [this] {
        isActive_ = false;
        timer_.stop();
        layout_.reset();
    });
}

ReportSheets::~ReportSheets()
{
    if (pane_) {
        pane_->leave();
        pane_->view().setPlaceHandler({});
        pane_->view().setWordHandler({});
        pane_->view().setShownHandler({});
        pane_->view().setFocusHandler({});
    }
}

SheetPane &ReportSheets::pane()
{
    if (!pane_) {
        pane_ = new SheetPane([this] { return layout(); });
        SheetView &view = pane_->view();
        view.setPlaceHandler([this](qint64 position, bool extends) {
            QTextCursor cursor = edit_.textCursor();
            cursor.setPosition(static_cast<int>(position), extends ? QTextCursor::KeepAnchor : QTextCursor::MoveAnchor);
            edit_.setTextCursor(cursor);
            showCursor(false);
        });
        view.setWordHandler([this] {
            QTextCursor cursor = edit_.textCursor();
            cursor.select(QTextCursor::WordUnderCursor);
            edit_.setTextCursor(cursor);
            showCursor(false);
        });
    }
    return *pane_;
}

void ReportSheets::setActive(bool on)
{
    if (on != isActive_) {
        isActive_ = on;
        hasShown_ = false;
        on ? restart() : timer_.stop();
    }
}

bool ReportSheets::isCurrent() const
{
    return layout_ != nullptr && text_ == edit_.document() && revision_ == text_->revision();
}

SheetLayout *ReportSheets::layout()
{
    if (!isActive_ || isCurrent()) {
        return isActive_ ? layout_.get() : nullptr;
    }
    timer_.start(); // another text: it is looked at when it is complete
    return nullptr;
}

void ReportSheets::restart()
{
    layout_.reset();
    sincePublished_.invalidate();
    if (isActive_) {
        pane().setMessage(QString());
        timer_.start();
    }
}

void ReportSheets::begin()
{
    layout_.reset();
    text_ = edit_.document();
    revision_ = text_->revision();
    const SheetPaper paper = surroundings_.paper();
    if (paper.size.isEmpty() || paper.resolution <= 0) {
        return; // a page that nothing has measured
    }
    layout_ = std::make_unique<SheetLayout>(*text_, paper, surroundings_.findPages);
    showCursor(false);
}

void ReportSheets::work()
{
    timer_.setInterval(edit_.isLoading() ? restWhileLoading : 0);
    if (edit_.isLoading()) {
        pane().setMessage(Xlate("Loading %1 %@@percent of a report").arg(edit_.loadedPercent()));
        return; // until all of it is there
    }
    if (!isCurrent()) {
        begin();
    }
    const bool isDone = !layout_ || layout_->work(slice);
    if (isDone) {
        timer_.stop();
    }
    if (isDone || !sincePublished_.isValid() || sincePublished_.elapsed() >= publishInterval) {
        sincePublished_.start();
        publish();
    }
    if (std::exchange(bringsCursor_, false)) {
        showCursor(true);
    }
}

void ReportSheets::publish()
{
    hasShown_ = hasShown_ || (layout_ != nullptr && layout_->isDone());
    if (layout_ == nullptr) {
        pane().setMessage(Xlate("There is no page to show."));
    } else if (layout_->isDone()) {
        pane().setMessage(Xlate("This report is empty."));
    } else {
        pane().setMessage(Xlate("Finding the sheets: %1 %").arg(layout_->percent()));
    }
    pane().sheetsChanged();
}

void ReportSheets::finish()
{
    edit_.finishLoading();
    if (!isActive_) {
        return;
    }
    do {
        work();
    } while (layout_ && !layout_->isDone());
}

void ReportSheets::noteEdit(const ReportChange &change)
{
    if (layout_ == nullptr || text_ != edit_.document()) {
        restart();
        return;
    }
    layout_->noteEdit(change.position, change.removed, change.inserted.size());
    revision_ = text_->revision();
    if (isActive_) {
        pane().view().forgetRows();
        timer_.start();
    }
}

void ReportSheets::bringCursor()
{
    if (isActive_) {
        bringsCursor_ = true;
        timer_.start();
    }
}

void ReportSheets::showCursor(bool follows)
{
    if (!isActive_ || !pane_) {
        return;
    }
    const QTextCursor cursor = edit_.textCursor();
    // While a text is loaded its cursor is put back where it was: that is not a reason to go there.
    pane_->view().setCursorPlace(cursor.anchor(), cursor.position(), follows && (isCurrent() || !hasShown_));
    pane_->thumbnails().setCurrent(pane_->view().current());
    if (follows) {
        pane_->thumbnails().bring(pane_->view().current());
    }
}

} // namespace kareport
