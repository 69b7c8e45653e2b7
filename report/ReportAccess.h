#pragma once

class UReportDoc;

namespace kareport
{

class Placeholders;
class ResultSink;
class WrittenCells;
struct DataRemarks;
struct LoadedText;
struct PageGeometry;

/// What a job has its report written with. Nothing of it is owned.
struct ReportHooks
{
    const Placeholders *placeholders = nullptr; ///< of labels and headings; null where all texts stay as they are
    DataRemarks *remarks =
        nullptr; ///< receives what the table or block written last does not show as it is; may be null
    ResultSink *results = nullptr; ///< receives the values of tables and blocks while they are written; may be null
    WrittenCells *cells = nullptr; ///< receives where the fields are shown; may be null
};

/// What the programs of this project do with a report and a host does not: it cannot make what the functions take.
struct ReportAccess
{
    /// Takes over a text that was made elsewhere, as on another thread, in a time that does not grow with it. Its lines are
    /// counted as if they had been written, and its pages begin where it says. Neither rich text nor a report window is
    /// notified of it.
    /// @param text  receives the text before it
    static void takeText(UReportDoc &report, LoadedText &text);

    /// Takes over all that was written into another report, with its page, its outline and its template, in a time that does
    /// not grow with it: the report is then as if it had been written itself. Title, file, windows and views stay, and
    /// neither of them is notified. Pages that the user has put on paper as the sheet takes them stay so.
    /// @param made  receives what the report held before
    static void takeContent(UReportDoc &report, UReportDoc &made);

    /// Sets what is written from now on is written with. With placeholders its pages have page marks.
    static void setHooks(UReportDoc &report, const ReportHooks &hooks);
    static const ReportHooks &hooks(const UReportDoc &report);

    /// The page as `UReportDoc::SetPageSize` would measure it now. The report keeps its own.
    static PageGeometry printedPage(const UReportDoc &report);
};

} // namespace kareport
