#pragma once

#include "CommandTarget.h"
#include "KaReportExport.h"
#include "ReportViewPort.h"
#include "UView.h"

#include <QMargins>
#include <QPointer>
#include <QRect>
#include <QSize>
#include <QString>

#include <memory>
#include <optional>
#include <vector>

class QPaintDevice;
class QPainter;
class QPrinter;
class UReportDoc;

namespace kareport
{
class LinePager;
class ReportEdit;
class ReportViewWidget;
struct PrintRun;
struct PrintSheet;
struct ReportChange;
struct ReportPage;

/// A print job as the view sees it.
struct PrintInfo
{
    QPrinter *printer = nullptr; ///< null until a printer has been prepared
    int curPage = 1;             ///< the page that is printed now, from 1
    int maxPage = 0;             ///< the last page; 0 when there is none
    bool direct = false;         ///< the user is not asked for printer and pages
    bool preview = false;        ///< shown on the screen: the user is not asked for printer and pages
    qint64 first = 0;            ///< the first character that is printed
    qint64 last = -1;            ///< before here; -1 for the end of the text
    /// The printer, where it has been prepared for the job and not been given.
    std::shared_ptr<QPrinter> ownPrinter;
};
} // namespace kareport

/// The view of a report: its text in one control, in which the user may edit it. Every edit is made in the document at
/// once.
class KAREPORT_EXPORT UReportView : public UView, public kareport::ReportViewPort, public kareport::CommandTarget
{
public:
    /// Where lines that are too long for the window end.
    enum WordWrap
    {
        WrapNone = 0,    ///< outside the window
        WrapToWindow = 1 ///< on the next line of the window
    };

    UReportView();
    ~UReportView() override;

    /// The report shown; may be null.
    UReportDoc *GetDocument() const;
    QWidget *GetWidget() override;
    /// The control that holds the text.
    kareport::ReportEdit &GetEdit() const;
    /// How lines are wrapped; not at all at first.
    WordWrap GetWordWrap() const { return m_nWordWrap; }
    /// Whether the text was rich text when it was loaded: its formats may then be in the control alone.
    bool ShowsFormats() const { return showsFormats_; }

    /// Whether a long text is loaded in pieces when the view is updated, so that the window answers meanwhile. It is not
    /// unless a host says so: a view that has been updated then shows the whole text.
    void SetLoadsInPieces(bool on) { loadsInPieces_ = on; }

    /// Gives the control its font. @return 0, or -1 when it cannot be made
    int OnCreate();
    void OnInitialUpdate() override;
    void OnUpdate(UView *sender, long hint, void *hintObject) override;
    /// Loads the control from the document, or the document from the control. Without memory for a copy of the document's
    /// text the control keeps what it shows, and nothing can be edited or taken from it until an update finds the memory.
    void UpdateData(bool toView);
    /// Replaces the control's content by a text, plain or rich as it begins.
    void SetRTFText(const QString &text);
    /// Takes over the whole text of the control.
    void OnChange();
    /// Makes the report the one that the user works with (`UApplication::SetCurrentReport`), when the keyboard comes to the view.
    void OnSetFocus();
    /// A press of the mouse in the view's window makes the view the active one of the frame that it is in.
    void OnMouseActivate();
    /// Takes the view from the frame that it is the active one of; called when its window goes.
    void OnDestroy();
    /// Closes the application, and the report's window with it.
    void OnReportExit();
    /// Gives the edited text back to the object that the report was made from (`UReportDoc::SaveText`).
    void OnSaveReportText();
    /// The report can be closed unless its close option is off.
    void OnUpdateCloseCmdUI(kareport::CommandState &state) const;

    bool streamRichText(QIODevice &device) const override;
    bool streamPlainText(QIODevice &device) const override;
    void loadIfStale() override;
    void finishLoading() override;
    const std::vector<kareport::Command> &commands() const override;

    // Printing
    /// @param direct  prints on the prepared printer without asking for printer and pages
    void OnReportPrint(bool direct = false);
    /// Prints the lines that are selected, from the top of a sheet on, after asking for printer and pages. Nothing happens
    /// without a selection.
    void OnPrintSelection();
    /// Shows the pages as they would be printed; nothing is printed unless the user says so there.
    void OnReportPrintPreview();
    /// Asks for paper, orientation and margins, keeps them as preferences and measures the page of the report again.
    void OnPageSetup();
    /// Prepares a job: page count, margins, paper, printer. A report whose page was given has the sheets that its pages take
    /// for pages. @return false cancels it
    bool OnPreparePrinting(kareport::PrintInfo &info);
    /// Begins the table of page starts: with the first page, or with all sheets of a report whose page was given.
    void OnBeginPrinting(QPainter &painter, kareport::PrintInfo &info);
    /// Ends a job: forgets its table of page starts.
    void OnEndPrinting(QPainter &painter, kareport::PrintInfo &info);
    /// Lays the pages out up to `info.curPage`; sets `info.maxPage` when the text ends before it.
    void OnPrepareDC(QPainter &painter, kareport::PrintInfo &info);
    /// Prints the page `info.curPage`. Throws std::invalid_argument for a page whose start is not known.
    void OnPrint(QPainter &painter, kareport::PrintInfo &info);
    /// Prints the characters from `start` to `stop` (-1: to the end) as far as they fit a page.
    /// @return the first character that was not printed
    qint64 PrintPage(QPainter &painter, qint64 start, qint64 stop);
    /// Draws the margins and line places of a page, for checking the print geometry.
    void DrawMargins(QPainter &painter);

    /// The margins of the job, in twips (1/1440 inch).
    const QMargins &GetPrintMargins() const { return m_rectMargin; }
    /// The sheet of the job, in twips (1/1440 inch).
    const QSize &GetPaperSize() const { return m_sizePaper; }
    /// The first character of each page that is known, page 1 first.
    const std::vector<qint64> &GetPageStarts() const { return m_aPageStart; }

protected:
    /// Called when the text has been loaded, or its pages may have become others in any other way than by an edit.
    virtual void OnPagesForgotten();
    /// Called when the control's text has been edited, here or in another view of the report.
    virtual void OnTextEdited(const kareport::ReportChange &change);
    /// The pages of the text that the control shows, where each is printed on sheets of its own; nothing where lines flow from
    /// sheet to sheet.
    std::optional<std::vector<kareport::ReportPage>> FindGivenPages() const;

private:
    void WrapChanged();
    bool loadInPieces();
    void noteMirrored();
    void noteTaken();
    /// The lines of the control that pages begin with.
    std::vector<int> pageStartLines() const;
    /// The same by the document's record, in a control of so many lines; nothing where the control shows another text.
    std::optional<std::vector<int>> recordedStartLines(int lineCount) const;
    /// Where pages begin in the control's text after an edit that the document has not taken over yet; nothing where the
    /// control shows another text.
    std::optional<std::vector<qint64>> startsAfter(const kareport::ReportChange &change) const;
    void forgetPages();
    void followPages(const kareport::ReportChange &change);
    bool carryThrough(const kareport::ReportChange &change);
    void takeChanged(const kareport::ReportChange &change);
    void takeText();
    QRect printableRect() const; ///< twips
    void prepareRun(QPaintDevice *device);
    /// The sheets of a report whose page was given; empty where the lines flow from sheet to sheet.
    std::vector<kareport::PrintSheet> givenSheets(kareport::LinePager &pager) const;
    /// Does something with a pager for a device: the one of the job, where it is about that device.
    template <typename Work>
    qint64 withPager(QPaintDevice &device, Work work) const;
    bool printsGivenPages() const;
    bool printsSheets(const kareport::PrintInfo &info) const;
    qint64 layOutFrom(qint64 start, const kareport::PrintInfo &info, QPaintDevice &device, QPainter *painter) const;
    /// After the last character that is printed.
    qint64 endOf(const kareport::PrintInfo &info) const;
    qreal usualScale() const;
    bool measureRoom();
    void showMeasuredPage();
    void print(kareport::PrintInfo &info);
    std::vector<kareport::Command> makeCommands();
    void takeEdit(const kareport::ReportChange &change);
    void followEdit(const kareport::ReportChange &change);
    void noteLoaded();
    void noteUnread();
    void noteShown();
    bool isStale() const; ///< whether the document has changed since, and the view was not notified

    QPointer<QWidget> widget_;
    kareport::ReportEdit *edit_ = nullptr; ///< owned by the widget
    std::vector<kareport::Command> commands_;
    WordWrap m_nWordWrap = WrapNone;
    bool loadsInPieces_ = false;
    bool isUnread_ = false;     ///< whether there was no memory to show the document: nothing can be edited
    bool isMirrored_ = false;   ///< whether the document holds the control's text, its lines ended by CR LF
    qint64 loadedLength_ = -1;  ///< the document's length when the control was loaded from it or it from the control
    quint64 mirroredEdits_ = 0; ///< the document's edits by then
    /// The edit that other views are being notified of: they take it over instead of the whole text. Null otherwise.
    const kareport::ReportChange *toldChange_ = nullptr;
    mutable std::vector<qint64> startLines_; ///< that pages begin with, of the document
    mutable quint64 startLinesEdits_ = 0;    ///< its edits by then
    mutable qint64 startLinesLength_ = -1;   ///< its length by then; -1 when they are not known
    bool showsFormats_ = false;              ///< whether the control's text was rich text
    /// The document's edits when it took the control's text over last; nothing before.
    std::optional<quint64> takenEdits_;
    QMargins m_rectMargin; ///< twips
    QSize m_sizePaper;     ///< twips
    std::vector<qint64> m_aPageStart;
    std::unique_ptr<kareport::PrintRun> run_; ///< of the current job
};
