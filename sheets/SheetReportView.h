#pragma once

#include "PlaceFields.h"
#include "ReportSheets.h"
#include "UReportView.h"

#include <QPointer>

#include <functional>
#include <memory>
#include <optional>
#include <vector>

class QSplitter;

namespace kareport
{

/// A report view that shows the sheets that the report is printed on, beside its text or instead of it.
class SheetReportView : public UReportView
{
public:
    enum class Shows
    {
        Text,
        Sheets,
        Both
    };

    SheetReportView();
    ~SheetReportView() override;

    Shows shows() const { return shows_; }
    void setShows(Shows shows);
    /// Whether page, zoom and keys are about the sheets: they are all that is shown, or have the keyboard.
    bool actsOnSheets() const;
    void setShowsThumbnails(bool on);
    void setShowsPageLines(bool on);
    /// The paper or its margins may be others.
    void restartSheets();

    ReportSheets &sheets() { return sheets_; }
    PageField &pageField() const { return *pageField_; }
    ZoomField &zoomField() const { return *zoomField_; }

    const std::vector<Command> &commands() const override;

protected:
    void OnPagesForgotten() override;
    void OnTextEdited(const ReportChange &change) override;

private:
    std::vector<Command> makeSheetCommands();
    SheetPaper paper() const;
    void addFields();
    void addPane();
    void followFindBar();
    void showPlace();
    void goTo(int page);
    void zoomTo(int percent);
    void zoomBy(int direction);

    QPointer<QWidget> window_; ///< of the view
    ReportSheets sheets_;
    QPointer<QSplitter> splitter_; ///< text and sheets; null until sheets were shown
    QPointer<PageField> pageField_;
    QPointer<ZoomField> zoomField_;
    Shows shows_ = Shows::Text;
    bool showsThumbnails_ = true;
    std::vector<Command> sheetCommands_;
    QMetaObject::Connection cursorMoved_;
    QMetaObject::Connection selectionChanged_;
};

} // namespace kareport
