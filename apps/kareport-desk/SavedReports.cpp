#include "SavedReports.h"

#include "FileKind.h"
#include "InputError.h"
#include "LineEndings.h"
#include "LoadedText.h"
#include "MemoryLasts.h"
#include "ReportAccess.h"
#include "ReportContent.h"
#include "ReportEntry.h"
#include "RichTextReader.h"
#include "SavedText.h"
#include "StandardText.h"
#include "TextFile.h"
#include "UReportDoc.h"
#include "UView.h"
#include "Xlate.h"

#include <QFile>
#include <QFileInfo>
#include <QTextDocument>

#include <optional>

namespace kareport
{

namespace
{

/// The text of a report file as it was before it was saved: each line end once, and UTF-8 as the characters that it encodes
/// for. Rich text, and what is not UTF-8, is another text, which the report loads byte by byte. A name that rich text has says
/// nothing: without a view that could write that, the report text is saved under it.
TextFile readReportFile(const QString &path, UserInput input)
{
    const bool mayBeRichText = fileKindOf(path) == FileKind::RichText;
    return readTextFile(path, input, [mayBeRichText](QByteArrayView bytes, LoadedText &loaded, const auto &proceed) {
        return mayBeRichText && !richTextIn(bytes).isEmpty() ? TextLoading::OtherText
                                                             : loadReportText(bytes, loaded, proceed);
    });
}

/// Another text, as a report that is opened from the file has it.
struct OtherText
{
    LoadedText text;
    bool isFromRtf = false;
};

/// Reads one into a hidden report. @return why it was not read; nothing when it was
std::optional<QString> readOther(const QString &path, OtherText &other)
{
    if (QFileInfo(path).size() > UView::nMaxSize) {
        return Xlate("it is too large");
    }
    UReportDoc read;
    read.SetAutoDelete(false);
    read.SetRTFDataFlag(false); // in rich-text mode nothing is loaded
    if (!read.OnOpenDocument(path)) {
        return noMemoryText();
    }
    other.isFromRtf = read.IsOpenedFromRtf();
    other.text.pageStarts = read.GetPageStarts();
    other.text.lineEnds = read.GetLineCount();
    ReportAccess::takeText(read, other.text);
    return std::nullopt;
}

/// The pages of a report that was loaded byte by byte, or as rich text, are those that it was written in, whatever a page
/// would be measured to now. What counts is what it shows.
/// @return what it does not show
QStringList keepPageLength(UReportDoc &report)
{
    QTextDocument shown;
    RichTextNotes notShown;
    const auto wrong = showReportContent(report, shown, &notShown);
    if (const auto lines = linesOfPages(withCrLf(shown.toPlainText()))) {
        report.FixPage(lines, std::nullopt);
    }
    QStringList warnings = notShown.texts();
    if (wrong) {
        warnings.append(InputError{QFileInfo(report.GetPathName()).fileName(), wrong->place, wrong->text}.message());
    }
    return warnings;
}

/// Replaces what a report holds by a text.
void put(UReportDoc &report, LoadedText &loaded, bool isFromRtf)
{
    // A window that shows the report while it is written is given every line.
    const bool isWatched = report.GetReportWindow() != nullptr;
    const QString copy = isWatched ? loaded.text.piece(0, loaded.text.size()) : QString();
    report.Clear();
    report.SetOpenedFromRtf(isFromRtf);
    if (loaded.linesPerPage) {
        report.FixPage(loaded.linesPerPage, std::nullopt);
    }
    report.SetPageSize();
    if (isWatched) {
        writeLines(report, copy);
        report.FindPageStarts();
    } else {
        ReportAccess::takeText(report, loaded);
    }
}

/// @return whether the report has all of the text
bool show(UReportDoc &report)
{
    report.UpdateAllViews(nullptr, 0, nullptr);
    if (!UReportDoc::IsReportAvailable(&report)) {
        return false; // an editor that took it has closed it
    }
    report.SetModifiedFlag(false);
    return !report.HasLostText();
}

/// A page length that was only derived from the text is dropped with the text. One that was set otherwise, as by a
/// job, stays.
void forgetPageLengthOfText(UReportDoc &report)
{
    const std::optional<int> given = report.GetGivenLinesPerPage();
    // By the lines of the text, or by those that it shows: a return within a line ends one that is shown.
    if (given && (given == linesOfPages(report.CopyText()) || given == linesOfPages(shownPlainText(report)))) {
        report.FixPage(std::nullopt, std::nullopt);
        report.SetPageSize();
    }
}

bool reload(UReportDoc &report, ReadNotes &notes)
{
    const QString path = report.GetPathName();
    if (!whyNotOpened(path).isEmpty() || !QFile(path).open(QIODevice::ReadOnly)) {
        return false; // what is shown is then all that there is
    }
    // What the user types until the file has been read would be lost with the text before it.
    const TextFile read = readReportFile(path, UserInput::Kept);
    notes.isStopped = read.state == TextFile::State::Stopped;
    notes.problem = read.problem;
    const bool isRead = read.state == TextFile::State::Whole || read.state == TextFile::State::OtherText;
    if (!isRead || !UReportDoc::IsReportAvailable(&report)) {
        return false;
    }
    OtherText other;
    if (!read.text) {
        if (const auto problem = readOther(path, other)) {
            notes.problem = *problem;
            return false;
        }
    }
    report.SetRTFDataFlag(false);
    forgetPageLengthOfText(report);
    put(report, read.text ? *read.text : other.text, other.isFromRtf);
    if (!read.text) {
        notes.warnings = keepPageLength(report);
    }
    return show(report);
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
    said.problem = read.problem;
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
        put(*report, *read.text, false);
        if (!show(*report)) {
            if (UReportDoc::IsReportAvailable(report)) {
                report->OnCloseDocument();
            }
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
