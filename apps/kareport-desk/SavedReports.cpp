#include "SavedReports.h"

#include "FileBytes.h"
#include "MemoryLasts.h"
#include "PdfFile.h"
#include "ReportContent.h"
#include "ReportEntry.h"
#include "ReportTextDecoder.h"
#include "RichTextReader.h"
#include "SavedText.h"
#include "UReportDoc.h"
#include "Xlate.h"

#include <QFile>
#include <QFileInfo>

#include <optional>

namespace kareport
{

namespace
{

/// The text of a report file as it was before it was saved: each line end once, and UTF-8 as the characters that it stands
/// for. Nothing for rich text and for what is no UTF-8, which the report loads byte by byte. An error when the file cannot
/// be read, or is cut short meanwhile: what is left of it is not what was saved.
Expected<std::optional<QString>> exactText(const QString &path)
{
    if (path.endsWith(u".rtf", Qt::CaseInsensitive)) {
        return std::nullopt;
    }
    const auto file = FileBytes::open(path);
    if (const InputError *error = errorOf(file)) {
        return *error;
    }
    const auto &saved = *std::get<std::shared_ptr<const FileBytes>>(file);
    const std::string_view view = saved.view();
    QString text;
    const QByteArrayView bytes(view.data(), static_cast<qsizetype>(view.size()));
    const bool isOther = decodeReportText(bytes, text) || isRichText(text);
    if (const auto lost = saved.lostBytes()) {
        return *lost;
    }
    return isOther ? std::nullopt : std::optional(std::move(text));
}

/// Its pages are those that it was written in, whatever a page would be measured to now.
void keepPageLength(UReportDoc &report, QStringView text)
{
    if (const auto lines = linesOfPages(text)) {
        report.FixPage(lines, std::nullopt);
    }
}

/// The same of a report that was loaded byte by byte, or as rich text: what counts is what it shows.
UReportDoc *withPageLength(UReportDoc *report)
{
    if (report != nullptr) {
        keepPageLength(*report, shownPlainText(*report));
    }
    return report;
}

/// @return whether the report has all of the text
bool fill(UReportDoc &report, const QString &text)
{
    report.Clear();
    keepPageLength(report, text);
    report.SetPageSize();
    writeLines(report, text);
    report.FindPageStarts();
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

bool reload(UReportDoc &report)
{
    if (!whyNotOpened(report.GetPathName()).isEmpty() || !QFile(report.GetPathName()).open(QIODevice::ReadOnly)) {
        return false; // what is shown is then all that there is
    }
    const auto read = exactText(report.GetPathName());
    if (errorOf(read) != nullptr) {
        return false;
    }
    report.SetRTFDataFlag(false); // in rich-text mode nothing is loaded
    forgetPageLengthOfText(report);
    if (const auto &text = std::get<std::optional<QString>>(read)) {
        return fill(report, *text);
    }
    report.Clear();
    const bool isLoaded = report.OnOpenDocument(report.GetPathName());
    withPageLength(&report);
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

UReportDoc *openSavedReport(const QString &path)
{
    if (!whyNotOpened(path).isEmpty()) {
        return nullptr;
    }
    const auto read = exactText(path);
    if (errorOf(read) != nullptr) {
        return nullptr;
    }
    const auto &text = std::get<std::optional<QString>>(read);
    if (!text) {
        return withPageLength(
            dynamic_cast<UReportDoc *>(GetReportTemplate()->OpenReportDocumentFile(path, 1, 1, nullptr, 0, nullptr)));
    }
    UReportDoc *report = CreateReport(QString(), true, false, nullptr, 0, nullptr);
    if (report != nullptr) {
        if (!fill(*report, *text)) {
            report->OnCloseDocument();
            return nullptr;
        }
        report->SetPathName(path, true);
        report->OnDocumentEvent(UDocument::DocumentEvent::AfterOpenDocument);
    }
    return report;
}

bool reloadSavedReport(UReportDoc &report)
{
    return whileMemoryLasts(false, [&report] { return reload(report); });
}

} // namespace kareport
