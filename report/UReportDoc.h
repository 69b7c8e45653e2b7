#pragma once

#include "KaReportExport.h"
#include "UDocument.h"

#include <QMargins>
#include <QSize>
#include <QString>
#include <QStringView>

#include <functional>
#include <memory>
#include <optional>
#include <unordered_map>
#include <vector>

class CViewPane;
class QIODevice;
class UDataObject;
class UDataObjectList;
class UJobSettings;
class UXmlReportTpl;
struct sXmlReportField;

namespace kareport
{
class ReportTextWriter;
class ReportWindow;
enum class LineEnds;
struct PdfDetails;
struct PdfNotes;
struct ReportAccess;
struct ReportPage;
struct ReportParts;
struct ReportSurroundings;
} // namespace kareport

/// A report: fixed-pitch text laid out in pages and lines, written by host code or through a template.
///
/// Reports are made through their document template (`CreateReport`), which owns them. Functions answer false or 0 when
/// they cannot do what they are asked, and never throw. What writes text, line ends or a page header sets the modified flag.
///
/// Three things may surprise a newcomer and are intended. An update of the views (`UpdateAllViews`) starts the user's editor when
/// the report is marked for it, and may close the report. `SaveFile` answers 1 also when the save failed. A report that has
/// lost text because memory ran out (`HasLostText`) is never saved.
class KAREPORT_EXPORT UReportDoc : public UDocument
{
public:
    /// @param name            title and report file name; a null text for none
    /// @param externalEditor  meant for the user's preferred editor
    /// @param closeDocument   closes as soon as its content has been handed to an editor
    /// @param owner           the host document that asked for the report, notified when it is deleted; null for none. It is not
    ///                        owned and must outlive the report
    UReportDoc(const QString &name, bool externalEditor, bool closeDocument, UDocument *owner);
    /// A report without a name, for the user's own view.
    UReportDoc();
    /// A report with surroundings of its own, which apply until others are set.
    explicit UReportDoc(const kareport::ReportSurroundings &surroundings);
    /// Destroys the report window as well.
    ~UReportDoc() override;

    /// Whether a pointer is a report that is still alive.
    static bool IsReportAvailable(const UReportDoc *report);
    /// Always "": a report is known by its object, not by an id.
    QString GetDocId() const;
    /// Always false.
    bool IsThatDocId(const QString &) const;

    /// Gives the report surroundings of its own in place of the application's name, its clock, the default printer, the
    /// user's preferences and the setting for wide values. Margins and font size are taken over. With no value the program's
    /// own apply again; margins and font size then stay. The page is not measured.
    void SetSurroundings(const std::optional<kareport::ReportSurroundings> &surroundings);
    /// The report's own surroundings; nothing while those of the program apply.
    const std::optional<kareport::ReportSurroundings> &GetSurroundings() const;

    // --- Text: UReportDocText.cpp -----------------------------------------------------------------------------------

    /// The report text, lines ended by CR LF, followed by a 0; valid until the next write. A text without a character above
    /// U+00FF is kept with one byte a character until it is asked for here, which doubles its memory until the next `Clear`.
    const char16_t *GetData() const;
    /// The same with its length, for texts that hold a character 0.
    QStringView GetText() const;
    /// Whether the report has no text.
    bool IsEmpty() const;
    /// Whether a part of what was to be written, or set, since the last `Clear` is missing because memory ran out. Such a
    /// report is not saved, also when nothing is left of it.
    bool HasLostText() const;
    /// Passes the text to a writer while it is written, so that a report that only becomes a file may be longer than there
    /// is memory: the document then holds no more than its end, and `Clear` does not take back what was passed on. Null
    /// keeps the text. The writer must live until `EndTextStream`, or until another one or null is set.
    void StreamText(kareport::ReportTextWriter *writer);
    /// Passes the rest to the writer, ends its text and keeps the text from now on. @return whether the writer has all of it
    bool EndTextStream(kareport::ReportTextWriter &writer);
    /// Replaces the text as it is. Counters stay, so what is written next continues the old pages. Where its pages begin is
    /// found by its page headers. Without memory for it the text is empty, and lost.
    void SetData(const QString &text);
    /// Replaces a piece of the text as it is, in a time that does not grow with the text. Counters stay; pages begin where
    /// they did before.
    /// @param at  the first character replaced, from 0
    /// @return false, changing nothing, for a piece that is not in the text or when there is no memory
    bool ReplaceText(qint64 at, qint64 removed, QStringView inserted);
    /// The text's length in characters.
    qint64 GetTextLength() const;
    /// How often a text took the place of another, in whole or in part. What is only written at the end does not count: it
    /// changes the length.
    quint64 GetEditCount() const;
    /// A copy of the text, which does not change how the text is kept. Null when there is no memory for it, and only then.
    QString CopyText() const;
    /// A copy of a piece of the text: of as many characters of it as there are. @param at  the first character, from 0
    /// @return null when there is no memory for it, and only then
    QString CopyText(qint64 at, qint64 count) const;
    /// Empties the report. The next line written begins page 1.
    virtual void Clear();
    /// Makes room for so many characters of the kind written so far. @return 0 when there is no memory for them
    int CheckSize(int required);

    /// Appends text as it is. @param style  handed on to the rich text: 0 plain, 1 bold, 2 underlined, 3 both
    /// @return false, with nothing written, when there is no memory
    bool Write(const QString &text, int style);
    /// Ends the current line `count` times; nothing for 0 or less.
    void LineFeed(int count);
    /// Starts a new page when the page has no room for more than `linesNeeded` lines, and always for a number below 0.
    /// @return whether it did
    bool NewPage(int linesNeeded);
    /// Writes a line: blank lines before it (dropped where a page begins), the text, and line ends after it; 0 after
    /// leaves the line open. Below 0 before forces a new page.
    void WriteLine(const QString &text, int linesBefore, int linesAfter, int style);

    /// Announces an entry of the report's outline, which leads to what is written next. Nothing while the text is handed on.
    /// @param level  0 for a heading, 1 for a table, from 2 on for groups within groups: an entry belongs to the last one
    ///               before it with a smaller level
    /// @param text   empty for none, which ends what belongs to the entries of this level and of greater ones
    void AnnounceEntry(int level, const QString &text);

    /// Sets the text that repeats under the header of every page.
    void SetHeading(const QString &heading, int linesBefore, int linesAfter);
    /// Writes the heading where the report is; does not look for a page's end.
    void WriteHeading();
    /// Builds the header line again from application, title and the current time.
    void SetHeader();
    /// Writes the header line with the page's number where the report is, and the line ends after it.
    void WriteHeader();
    /// Sets whether every page begins with header and heading.
    void SetHeaderFlag(bool on);
    /// Whether every page begins with header and heading.
    bool GetHeaderFlag() const;

    int GetLineCount() const;  ///< 0: nothing has been written yet
    int GetLineNumber() const; ///< on the page, from 1
    int GetPageNumber() const; ///< from 1

    // --- Rich text: UReportDocRichText.cpp --------------------------------------------------------------------------

    /// Switches rich-text mode: while it is on, what is written goes into a rich-text image as well. Without memory for it the
    /// mode stays off, and the report has lost text.
    void SetRTFDataFlag(bool on);
    /// Whether rich-text mode is on.
    bool GetRTFDataFlag() const;
    /// Cuts a rich-text document down to its paragraph. @return false, with the text as it was, when it has none or memory
    /// ends
    static bool ResetFormatString(QString &document);
    /// Adds a piece of text in a style to the image, or a line end for an empty text; nothing while rich-text mode is off.
    void WriteRTFData(const QString &text, int style);
    /// The whole rich-text document; in external-Excel mode only the texts that were written. Null when there is no memory
    /// for it, and only then.
    void GetRTFData(QString &document) const;
    /// The font table of the document.
    void GetFontTableData(QString &table) const;
    /// Writes the font table to an open device. @return false when the write fails or memory ends
    bool WriteFontTable(QIODevice &device) const;
    /// Writes the rich-text document for a word processor to an open device, one byte a character.
    /// @return false as soon as a write fails, when memory runs out or when the report has lost text
    bool WriteRichTextFile(QIODevice &device) const;

    // --- Pages: UReportDocPages.cpp ---------------------------------------------------------------------------------

    /// Measures the page on the default printer. @return 1, or 0 without a printer: the figures then stay as they were
    int SetPageSize();
    /// Fixes the lines of a page or the characters of a row (1 or more), whatever is measured; with both, no font is
    /// measured. What is not given is measured again by the next `SetPageSize`.
    void FixPage(std::optional<int> linesPerPage, std::optional<int> charsPerRow);
    /// Whether the lines of a page are those given to `FixPage`, and not measured.
    bool IsPageFixed() const;
    /// Switches between the lines of a page that were given and those that are measured, which the next `SetPageSize` does.
    /// `FixPage` switches back to the given ones.
    void UseGivenPage(bool on);
    /// The lines of a page that were given to `FixPage`, whether they count or not.
    std::optional<int> GetGivenLinesPerPage() const;

    /// Whether the text is the source of a rich-text document, which is shown in its place.
    bool HoldsRichTextSource() const;
    /// The pages of the report, for all that shows, prints or saves them. Of a report that holds the source of a rich-text
    /// document they are those of the text that its view shows.
    std::vector<kareport::ReportPage> GetPages() const;
    /// Where pages begin, as the writer recorded it: the places of characters in the text, from 0, in ascending order. A
    /// place that is not at the beginning of a line counts for nothing.
    const std::vector<qint64> &GetPageStarts() const;
    /// Replaces the record of where pages begin. @param starts  in ascending order
    void SetPageStarts(std::vector<qint64> starts);
    /// Takes the page headers in the text from a place on for the page starts there. Nothing where there is none.
    /// @return whether there was one
    bool FindPageStarts(qint64 from = 0);
    /// The lines, from 0, that pages begin with; text before the first of them has pages by counting lines.
    std::vector<qint64> GetPageStartLines() const;

    /// The lines of a page between the margins; 72 until measured or given.
    int GetLinesPerPage() const;
    /// The characters of average width between the margins; 80 until measured or given.
    int GetCharsPerRow() const;
    unsigned GetPrintResolution() const; ///< vertical dots per inch; 0: not measured
    QSize GetPageSize() const;           ///< whole sheet in printer dots
    unsigned GetFontSize() const;        ///< points
    void SetFontSize(unsigned points);   ///< does not measure again
    /// The face of the report; "Lucida Console" until it is set.
    QString GetFontName() const;
    void SetFontName(const QString &name); ///< does not measure again
    /// Hundredths of a millimetre.
    QMargins GetMargins() const;
    /// Stores the margins; `SaveSettings` keeps them for later reports and `SetPageSize` measures with them.
    void SetMargins(const QMargins &margins);
    /// Reads the margins and the font size from the user's preferences.
    void LoadSettings();
    /// Writes the margins to the user's preferences.
    void SaveSettings();

    // --- Templates and data: UReportDocTemplate.cpp -----------------------------------------------------------------

    /// Loads a template from a file of the library folder or, failing that, of the start folder, and with it a table
    /// and a block unless their names are empty. Takes over the template's separator and page breaks, and its title once
    /// table and block are loaded. Table and block that were loaded before are dropped with the template before.
    /// @return false when neither file has the template (separator, page breaks and title then stay), or when table or
    ///         block cannot be loaded
    bool LoadTemplateXml(const QString &fileName, const QString &templateName, const QString &tableName,
                         const QString &blockName);
    /// The same from the file at a path.
    bool LoadTemplateFile(const QString &path, const QString &templateName, const QString &tableName,
                          const QString &blockName);
    /// Loads a table of the loaded template instead of the one before, which is dropped even if this fails.
    /// @return false without a template, when it has no such table or not its dictionary, or without memory
    bool LoadTemplateTable(const QString &tableName);
    /// Loads a block of the loaded template instead of the one before, which is dropped even if this fails.
    /// @return false without a template, when it has no such block or not its dictionary, or without memory
    bool LoadTemplateBlock(const QString &blockName);
    /// The loaded template, or null. It is the report's, and is deleted when another one is loaded.
    const UXmlReportTpl *GetTemplate() const;

    /// The text of a value, fitted to its field. @param kind  what `value` points to: 1 a bool, 2 a qint16, 4 a qint32,
    /// 8 a double in internal units, 16 a QString, 32 a UPointNumber; any other, or null, for no value
    /// @param offsetStyle  "+" shows an offset with its sign
    QString FormatXmlStringToDisplay(const sXmlReportField *field, int kind, const void *value,
                                     const QString &offsetStyle) const;

    /// Writes an object through the loaded block: a line for each field that the object has a value for.
    /// @return false, with nothing written, when no block is loaded or the object is null; false as well when memory runs out in
    ///         the middle: what comes then is not written
    bool WriteDataBlock(const UDataObject *object, int linesBefore, int linesAfter);
    /// Loads a block and writes through it, as the two functions do.
    bool WriteDataBlock(const QString &blockName, const UDataObject *object, int linesBefore, int linesAfter);
    /// Writes a list through the loaded table: heading, then a line for each object, sorted if the table says so.
    /// @param headingLinesAfter  line ends after the heading; -1 for 2
    /// @return false, with nothing written, when no table is loaded or the list is null; false as well when memory runs out in
    ///         the middle: what comes then is not written
    bool WriteDataTable(UDataObjectList *list, int linesBefore, int linesAfter, int headingLinesAfter);
    /// Loads a table and writes through it, as the two functions do.
    bool WriteDataTable(const QString &tableName, UDataObjectList *list, int linesBefore, int linesAfter,
                        int headingLinesAfter);

    /// Sets units and display formats of what is written from now on; northing and easting are put in order when a table is loaded.
    void SetJobSettings(const UJobSettings &settings);
    /// The units and display formats; those of a new job until they are set.
    const UJobSettings &GetJobSettings() const;
    /// Replaces the caption of the chainage column in table headings.
    void SetChainageLabel(const QString &label);
    /// The character between columns; `raw` takes the character 255 instead.
    void SetDataColumnSeparator(char16_t separator, bool raw);
    /// The character between columns; a blank until it is set or a template loaded.
    char16_t GetDataColumnSeparator() const;
    /// Columns for a spreadsheet: no header, a tab between them.
    void SetExcelFormat();
    /// Whether data tables print their name.
    void WriteTableName(bool on);
    /// Whether values of zero print as blanks.
    void SetZeroBlank(bool on);
    /// Whether values of zero print as blanks; not at first.
    bool IsZeroBlank() const;
    bool GetPageBreaks() const; ///< the loaded template's option

    // --- Title, panes and report window: UReportDocPanes.cpp ---------------------------------------------------------

    /// The window style of a pane that a report opens for itself.
    static constexpr unsigned ownPaneStyle = 4096;

    /// The report's title, with the number that made it unique, to be changed in place: neither header line nor panes follow.
    QString &GetTitle();
    /// The report's title, with the number that made it unique; without the number of a window that a pane may show.
    const QString &GetTitle() const;
    /// Sets the title and the header line. While an open pane of another document has the title as its caption, the
    /// document's title gets a number from 2 after it; the header line keeps the title as given. An empty title gets none.
    void SetTitle(const QString &title) override;
    /// Sets the text of the report's own pane.
    void SetWindowTextW(const QString &text);
    /// The pane of the first view that shows the report's text, or null.
    CViewPane *GetFrameWindow() const;
    /// Opens a new pane for the report and updates all views. @param reserved  not looked at
    void Activate(bool reserved);

    /// Links a report window, which the document destroys with itself; null takes the link away.
    void SetReportWindow(kareport::ReportWindow *window);
    /// The linked report window; null for none.
    kareport::ReportWindow *GetReportWindow() const;
    /// Lets the report in its window be saved, printed and opened, and gives the keyboard to the window; nothing without
    /// one.
    void SetReportWindowActive();
    /// Shows a report window or hides it; nothing for null.
    static void ShowReportBar(kareport::ReportWindow *window, bool show);
    /// Prepares the report for another run: hides its pane, brings its window back when it was closed, and gives it a name
    /// and flags as `CreateReport` does. What the report holds stays; a name that its title does not begin with is written
    /// under it, between blank lines.
    /// @param name  a null text leaves title and file name as they are
    void UpdateReportInfo(const QString &name, bool headerFlag, bool externalEditor);
    /// The report's window shows it as well.
    bool IsShown(const CViewPane *except = nullptr) const override;

    // --- External editor: UReportDocEditor.cpp ----------------------------------------------------------------------

    /// Marks the report for the user's preferred editor.
    void SetExternalEditorFlag(bool on);
    /// Whether the report is meant for the user's preferred editor.
    bool GetExternalEditorFlag() const;
    /// Whether the report goes to the user's preferred editor: it is marked for it, and an editor is preferred and
    /// installed. The preferences are looked up each time.
    bool UsePreferredReportEditor() const;
    /// Lets the report be opened in the spreadsheet as in a word processor.
    void SetOptionExcel();
    /// Whether `SetOptionExcel` was called.
    bool IsOptionExcel() const;
    /// The rich-text image is for the spreadsheet: it holds the bare texts.
    void SetExternalExcel();
    /// Whether `SetExternalExcel` was called, by a host or by `IsConvertToOpenInWord`.
    bool IsExternalExcel() const;
    /// Whether a file is to be converted to rich text for an editor: for a word processor, unless it is rich text or a PDF
    /// already. With the Excel option and Excel for an editor, the report is an external Excel's from then on.
    bool IsConvertToOpenInWord(const QString &file, const QString &editor);
    /// Shows the report as it is now. A report that goes to the user's preferred editor is written into a new temporary
    /// file and opened there, each time; its pane is hidden. Any other updates its views and shows its pane. Property panes
    /// are notified in either case. With the close-document flag the pane stays as it is, and a report that went to the editor
    /// closes.
    ///
    /// So whatever updates the views starts the editor and may close the report, an edit in the view included: callers look
    /// at `IsReportAvailable` before they continue. The flag is cleared for a moment where only views are to be updated.
    void UpdateAllViews(UView *sender, long hint = 0, void *hintObject = nullptr) override;
    /// Makes a second, hidden report in rich-text mode of the lines of this one, without blank lines, and opens it in the
    /// user's preferred editor. It stays open. Nothing happens without the application's template for reports.
    void ConvertAndOpenInWord();
    /// Opens the report in the user's preferred editor: what was written in rich-text mode for a word processor, the text
    /// for any other. A report that is not opened there is shown in its view, in a new pane where it has none.
    void ReportRTfData();
    /// The name that temporary files are named after.
    void SetReportFileName(const QString &name);
    /// The name that temporary files are named after; empty until it is set.
    const QString &GetReportFileName() const;
    /// A temporary name for the report that no report has had; empty when memory runs out.
    QString GetCurrentReportFileName() const;

    // --- Saving: UReportDocSave.cpp ---------------------------------------------------------------------------------

    /// Saves under a path; asks for one when it is empty or is to become the document's own.
    /// @return false when the dialog is cancelled, with nothing changed, or the save fails
    bool DoSave(const QString &path, bool replace) override;
    /// Writes the file in one step. The name's ending says what: ".rtf" the rich text of the report's view, ".pdf" a PDF,
    /// any other the report text. An empty report text is saved by doing nothing: no file is made and none is emptied.
    /// @return false when it could not be written, or the report has lost text: an earlier file is then as it was
    bool OnSaveDocument(const QString &path) override;
    /// Why the last `OnSaveDocument` failed, as the end of a sentence; empty when it did not, or nothing is known.
    const QString &GetSaveProblem() const;
    /// Saves through `OnSaveDocument`. @return 0 for an empty path, else 1, whether the save succeeded or not: callers continue
    /// either way. Callers that need to know call `OnSaveDocument`
    int SaveFile(const QString &path);
    /// Writes the text to an open device, in UTF-8. @return false as soon as a write fails
    bool WriteText(QIODevice &device, kareport::LineEnds lineEnds) const;
    /// Writes the text to an open device as a PDF. @param notes  receives what is missing or went wrong; may be null
    /// @param progress  receives the pages done and all pages; its false stops the work. May be empty
    /// @param details  what the PDF says of itself, with the outline that was announced; null for its pages alone
    /// @return false when there is no measured page or no font, a write fails, or the work was stopped
    bool WritePdf(QIODevice &device, kareport::PdfNotes *notes = nullptr,
                  const std::function<bool(qint64, qint64)> &progress = {},
                  const kareport::PdfDetails *details = nullptr) const;

    // --- Opening: UReportDocOpen.cpp --------------------------------------------------------------------------------

    /// Begins an empty report: its page is measured. @return false when the base class fails
    bool OnNewDocument() override;
    /// Reads a file into the report. A name with ".rtf" in it makes the report one that was opened from rich text.
    /// @return false when the file cannot be read
    bool OnOpenDocument(const QString &path) override;
    /// Writes into an archive, or reads a file from one. What is written is the first half of the text in UTF-16: as many bytes
    /// as the text has characters, which is the length that readers of such archives expect.
    void Serialize(UArchive &archive) override;
    /// Reads a report file, or a rich-text file, at the end of what the report holds.
    /// @param keepLineEnds  whether the lines keep their own line ends before the one that each of them gets
    /// @return 0 for an empty path, a file that cannot be opened or one that there is no memory for, else 1
    int LoadFile(const QString &path, bool keepLineEnds);
    /// Whether the report's text was loaded from a rich-text file.
    bool IsOpenedFromRtf() const;
    /// For a text that is taken over from a report that was. `Clear` takes it back.
    void SetOpenedFromRtf(bool on);

    // --- The text of a host's object: UReportDocTextObject.cpp ------------------------------------------------------

    /// Links the host document that takes the edited text, and the number of its object there. @param object  a `UDocument`
    /// of the application, not owned; it may be deleted before the report
    void SetTextObject(void *object, unsigned id);
    bool HasTextObj() const; ///< whether the number is not 0
    /// The host document that takes the edited text; null for none.
    void *GetTextObject() const;
    /// Gives the text that the user edited in the view back to the object that the report was made from.
    void SaveText();

    // --- Closing: UReportDocClose.cpp -------------------------------------------------------------------------------

    /// Whether a pane of the report may be closed; false while `SetCanClose` forbids it. The last pane asks whether changes are
    /// saved.
    bool CanCloseFrame(CViewPane *pane) override;
    /// Closes the report without asking, with its panes and its report window. Nothing happens while a report with a report
    /// window has its closing deferred.
    void OnCloseDocument() override;
    /// Notifies the owner that the report is being deleted.
    void OnAutoDelete() override;
    /// Closes the report at once or, when closing has been deferred, asks for it: the next call closes.
    void CloseReportDocument();
    /// 0 closes normally, 1 defers closing, 2 closing has been asked for.
    void SetCloseDocument(int mode);
    /// What `SetCloseDocument` was given last, 2 after `CloseReportDocument`; 0 at first.
    int GetCloseDocument() const;
    /// Closes the report as soon as its content has been handed to an editor.
    void SetCloseDocumentFlag(bool on);
    /// Whether the report closes as soon as it has been handed to an editor.
    bool GetCloseDocumentFlag() const;
    /// 0 forbids closing the report's panes.
    void SetCanClose(int can);
    /// Switches the report's close option: while it is off, its panes refuse to close and say why.
    void EnableCloseOption(bool on);
    /// Whether the close option is on, as it is at first.
    bool EnableCloseOption() const;

private:
    friend struct kareport::ReportAccess;

    void enter();
    bool loadTemplate(const QStringList &paths, const QString &templateName, const QString &tableName,
                      const QString &blockName);

    /// Every live report, with the value true.
    static std::unordered_map<const UReportDoc *, bool> UReportMgr;

    std::unique_ptr<kareport::ReportParts> parts_; ///< never null
};
