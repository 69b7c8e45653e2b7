#include "ReportReplacing.h"

#include "ReportAccess.h"
#include "ReportEdit.h"
#include "ReportGuards.h"
#include "ReportLines.h"
#include "ReportWindow.h"
#include "UReportList.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"

#include <QFont>
#include <QScrollBar>

#include <algorithm>
#include <utility>
#include <vector>

namespace kareport
{

/// Keeps the pieces that a report window would be given while a report is written.
class WrittenLines : public ReportWindow
{
public:
    void WriteLine(const QString &piece) override { lines_.append(piece); }
    CViewPane *GetOwningPane() override { return nullptr; }
    bool isCreated() const override { return true; }
    bool createDocked(const QString & /*caption*/, UView * /*previousView*/) override { return true; }
    void showBar(bool /*show*/) override {}
    void setActive(bool /*active*/) override {}
    void takeFocus() override {}

    const ReportLines &lines() const { return lines_; }

private:
    ReportLines lines_;
};

namespace
{

/// A view, as long as it is there, and where it was.
struct ShownPlace
{
    std::weak_ptr<UView *const> view;
    ReportEdit::LinePlace place;
};

UReportView *openView(const ShownPlace &shown)
{
    const auto handle = shown.view.lock();
    return handle ? dynamic_cast<UReportView *>(*handle) : nullptr;
}

/// Where the views of a report are. None when none of them is shown: they load the report when they are shown.
std::vector<ShownPlace> shownPlaces(const UReportDoc &report)
{
    std::vector<ShownPlace> places;
    bool isSeen = false;
    for (UView *view : report.GetViews()) {
        if (auto *reportView = dynamic_cast<UReportView *>(view); reportView != nullptr && view->GetWidget() != nullptr)
        {
            isSeen = isSeen || view->IsVisible();
            places.push_back({view->GetHandle(), reportView->GetEdit().linePlace()});
        }
    }
    return isSeen ? places : std::vector<ShownPlace>();
}

void showInViews(UReportDoc &report, const std::vector<ShownPlace> &places, bool hasOtherFont)
{
    if (places.empty()) {
        return;
    }
    if (hasOtherFont) {
        for (const ShownPlace &shown : places) {
            if (UReportView *view = openView(shown)) {
                view->OnCreate();
            }
        }
    }
    {
        const auto guard = withoutEditor(report);
        report.UpdateAllViews(nullptr, 0, nullptr);
    }
    for (const ShownPlace &shown : places) {
        if (UReportView *view = openView(shown)) {
            view->GetEdit().goToLinePlace(shown.place);
        }
    }
}

/// Shows other lines in the list of a report window, at the same place.
void showInList(UReportList &list, const ReportLines &lines)
{
    auto *model = dynamic_cast<ReportLines *>(list.model());
    if (model == nullptr) {
        return;
    }
    const int current = std::min(list.GetCurSel(), lines.count() - 1);
    const int top = list.verticalScrollBar()->value();
    const int left = list.horizontalScrollBar()->value();
    model->clear();
    for (int line = 0; line < lines.count(); ++line) {
        if (line == current) {
            list.WriteLine(lines.line(line)); // it is the current one also when the list brings itself up to date
        } else {
            list.AddString(lines.line(line));
        }
    }
    model->publish();
    list.doItemsLayout();
    list.setCurrentIndex(model->index(current));
    list.verticalScrollBar()->setValue(top);
    list.horizontalScrollBar()->setValue(left);
}

} // namespace

WrittenReport::WrittenReport(const ReportSurroundings &surroundings, const UReportDoc &shown) : made_(surroundings)
{
    if (shown.GetReportWindow() != nullptr && shown.GetReportWindow()->isCreated()) {
        lines_ = std::make_unique<WrittenLines>();
        made_.SetReportWindow(lines_.get());
    }
}

WrittenReport::~WrittenReport()
{
    made_.SetReportWindow(nullptr); // a report deletes its window
}

void WrittenReport::putInto(UReportDoc &report)
{
    made_.SetReportWindow(nullptr);
    const std::vector<ShownPlace> places = shownPlaces(report);
    const auto font = std::pair(report.GetFontName(), report.GetFontSize());
    ReportAccess::takeContent(report, made_);
    const bool hasOtherFont = font != std::pair(report.GetFontName(), report.GetFontSize());
    if (auto *window = dynamic_cast<UReportWindowDlg *>(report.GetReportWindow())) {
        if (window->GetList() != nullptr && lines_) {
            if (hasOtherFont) {
                window->SetReportDoc(&report);
            }
            showInList(*window->GetList(), lines_->lines());
        }
    }
    showInViews(report, places, hasOtherFont);
}

} // namespace kareport
