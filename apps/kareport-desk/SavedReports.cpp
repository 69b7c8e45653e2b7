#include "SavedReports.h"

#include "InputError.h"
#include "LineEndings.h"
#include "LoadedText.h"
#include "MemoryLasts.h"
#include "PdfFile.h"
#include "ReportContent.h"
#include "ReportEntry.h"
#include "RichTextReader.h"
#include "SavedText.h"
#include "TextFile.h"
#include "UReportDoc.h"
#include "Xlate.h"

#include <QFile>
#include <QFileInfo>
#include <QTextDocument>

#include <optional>

namespace kareport
{

namespace
{

/// The text of a report file as it was before it was saved: each line end once, and UTF-8 as the characters that it stands
/// for. Rich text, and what is no UTF-8, is another text, which the report loads byte by byte.
TextFile readReportFile(const QString &path, UserInput input)
{
    if (path.endsWith(u".rtf", Qt::CaseInsensitive)) {
        return {TextFile::State::OtherText, nullptr};
    }
    return readTextFile(path, input, loadReportText);
}

/// The pages of a report that was loaded byte by byte, or as rich text, are those that it was written in, whatever a page
/// would be measured to now. What counts is what it shows.
/// @return what it does not show
QStringList keepPageLength(UReportDoc &report)
{
    QTextDocument shown;
    RichTextNotes passedOver;
    const auto wrong = showReportContent(report, shown, &passedOver);
    if (const auto lines = linesOfPages(withCrLf(shown.toPlainText()))) {
        report.FixPage(lines, std::nullopt);
    }
    QStringList warnings = passedOver.texts();
    if (wrong) {
        warnings.append(InputError{QFileInfo(report.GetPathName()).fileName(), wrong->place, wrong->text}.message());
    }
    return warnings;
}

/// @return whether the report has all of the text
bool fill(UReportDoc &report, LoadedText &loaded)
{
    // A window that shows the report while it is written is told line by line.
    const bool isWatched = report.GetReportWindow() != nullptr;
    const QString copy = isWatched ? loaded.text.piece(0, loaded.text.size()) : QString();
    report.Clear();
    if (loaded.linesPerPage) {
        report.FixPage(loaded.linesPerPage, std::nullopt);
    }
    report.SetPageSize();
    if (isWatched) {
        writeLines(report, copy);
        report.FindPageStarts();
    } else {
        report.TakeText(loaded);
    }
    report.UpdateAllViews(nullptr, 0, nullptr);
    report.SetModifiedFlag(false);
    return !report.HasLostText();
}

/// A page length that only the text told goes with the text. One that was given otherwise, as by a job, stays.
void forgetPageLengthOfText(UReportDoc &report)
{
    if (report.GetGivenLinesPerPage() && report.GetGivenLinesPerPage() == linesOfPages(shownPlainText(report))) {
        report.FixPage(std::nullopt, std::nullopt);
        report.SetPageSize();
    }
}

bool reload(UReportDoc &report, ReadNotes &notes)
{
    if (!whyNotOpened(report.GetPathName()).isEmpty() || !QFile(report.GetPathName()).open(QIODevice::ReadOnly)) {
        return false; // what is shown is then all that there is
    }
    // What the user types until the file has been read would go with the text before it.
    const TextFile read = readReportFile(report.GetPathName(), UserInput::Kept);
    notes.isStopped = read.state == TextFile::State::Stopped;
    const bool isRead = read.state == TextFile::State::Whole || read.state == TextFile::State::OtherText;
    if (!isRead || !UReportDoc::IsReportAvailable(&report)) {
        return false;
    }
    report.SetRTFDataFlag(false); // in rich-text mode nothing is loaded
    forgetPageLengthOfText(report);
    if (read.text) {
        return fill(report, *read.text);
    }
    report.Clear();
    const bool isLoaded = report.OnOpenDocument(report.GetPathName());
    notes.warnings = keepPageLength(report);
    report.UpdateAllViews(nullptr, 0, nullptr);
    return isLoaded;
}

} // namespace

QString whyNotOpened(const QString &path)
{
    const QFileInfo info(path);
    if (!info.exists()) {
        return Xlate("There is no file \"%1\".").arg(path);
    }
    if (!info.isFile()) {
        return Xlate("\"%1\" is a folder, a pipe or a device. Only files can be opened here.").arg(path);
    }
    return isPdfFile(path) ? Xlate("A PDF cannot be opened as a report") : QString();
}

UReportDoc *openSavedReport(const QString &path, ReadNotes *notes)
{
    ReadNotes unasked;
    ReadNotes &said = notes != nullptr ? *notes : unasked;
    if (!whyNotOpened(path).isEmpty()) {
        return nullptr;
    }
    const TextFile read = readReportFile(path, UserInput::Taken);
    said.isStopped = read.state == TextFile::State::Stopped;
    if (read.state == TextFile::State::OtherText) {
        auto *other =
            dynamic_cast<UReportDoc *>(GetReportTemplate()->OpenReportDocumentFile(path, 1, 1, nullptr, 0, nullptr));
        if (other != nullptr) {
            said.warnings = keepPageLength(*other);
        }
        return other;
    }
    UReportDoc *report = read.text ? CreateReport(QString(), true, false, nullptr, 0, nullptr) : nullptr;
    if (report != nullptr) {
        if (!fill(*report, *read.text)) {
            report->OnCloseDocument();
            return nullptr;
        }
        report->SetPathName(path, true);
        report->OnDocumentEvent(UDocument::DocumentEvent::AfterOpenDocument);
    }
    return report;
}

bool reloadSavedReport(UReportDoc &report, ReadNotes *notes)
{
    ReadNotes said;
    const bool isLoaded = whileMemoryLasts(false, [&] { return reload(report, said); });
    if (notes != nullptr) {
        *notes = said;
    }
    return isLoaded;
}

} // namespace kareport
