#include "UReportDoc.h"

#include "EditorHandOver.h"
#include "MemoryLasts.h"
#include "PageHeader.h"
#include "PdfExport.h"
#include "ReplaceFile.h"
#include "ReportContent.h"
#include "ReportGuards.h"
#include "ReportParts.h"
#include "ReportSaveName.h"
#include "ReportTextCodec.h"
#include "ReportViews.h"
#include "SaveDialog.h"
#include "StandardText.h"
#include "UView.h"
#include "WaitCursor.h"
#include "Xlate.h"

#include <algorithm>

namespace
{

/// Saves what the first view shows that can write it. @return whether it did; nothing without such a view
std::optional<bool> saveViewAsRichText(UReportDoc &report, const QString &path, QString &problem)
{
    for (UView *view : kareport::reportViews(report)) {
        {
            // The view must hold the report as it is now, and no editor is to be started for it.
            const auto guard = kareport::withoutEditor(report);
            report.UpdateAllViews(nullptr, 0, nullptr);
        }
        if (!UReportDoc::IsReportAvailable(&report)) {
            return false; // its last view has closed it
        }
        if (std::find(report.GetViews().begin(), report.GetViews().end(), view) == report.GetViews().end()) {
            continue;
        }
        bool isOpen = false;
        const auto *port = dynamic_cast<const kareport::ReportViewPort *>(view);
        const auto write = [&](QIODevice &device) {
            isOpen = true;
            return port->streamRichText(device);
        };
        const bool saved = kareport::replaceFile(path, write, &problem);
        if (saved) {
            kareport::doneWhileMemoryLasts([&] { kareport::openSavedFile(report, path); });
        }
        if (isOpen) {
            return saved;
        }
    }
    return std::nullopt;
}

bool savePdf(const UReportDoc &report, const QString &path, QString &problem)
{
    kareport::PdfNotes notes;
    const auto write = [&](QIODevice &device) { return report.WritePdf(device, &notes); };
    const bool isSaved = kareport::replaceFile(path, write, &problem);
    if (!notes.problem.isEmpty()) {
        problem = notes.problem;
    }
    return isSaved;
}

bool saveText(UReportDoc &report, const QString &path, QString &problem)
{
    // An empty report is saved by doing nothing: no file is made and none is emptied.
    const auto write = [&](QIODevice &device) { return report.WriteText(device, kareport::LineEnds::ReportFile); };
    if (!report.IsEmpty() && !kareport::replaceFile(path, write, &problem)) {
        return false;
    }
    report.SetModifiedFlag(false);
    return true;
}

bool saveByName(UReportDoc &report, const QString &path, QString &problem)
{
    if (report.HasLostText()) {
        // It would replace a whole report by half of one, or what was lost by nothing.
        problem = kareport::lostTextReason();
        return false;
    }
    kareport::finishLoading(report);
    if (kareport::isRichTextName(path)) {
        // Without a view that can write it, the report text is saved under the name.
        const auto saved = saveViewAsRichText(report, path, problem);
        return saved ? *saved : saveText(report, path, problem);
    }
    return kareport::isPdfName(path) ? savePdf(report, path, problem) : saveText(report, path, problem);
}

/// Saves a report under a name that may be asked for. @param replace  whether the name becomes the report's own
bool saveUnderChosenName(UReportDoc &report, const QString &path, bool replace)
{
    QString name = path;
    if (path.isEmpty() || replace) {
        const auto chosen = kareport::askReportName(report, report.IsOpenedFromRtf());
        if (!chosen) {
            return false;
        }
        name = *chosen;
    }
    if (!UReportDoc::IsReportAvailable(&report)) {
        return false; // it was closed while the dialog was open
    }
    const bool wasModified = report.IsModified();
    bool isSaved = false;
    {
        const kareport::WaitCursor cursor;
        isSaved = report.OnSaveDocument(name);
    }
    // A notification of the save, or a view that was updated, may have closed the report.
    const bool isThere = UReportDoc::IsReportAvailable(&report);
    if (!isSaved) {
        kareport::saySaveFailed(name, isThere ? report.GetSaveProblem() : QString());
        return false;
    }
    if (isThere) {
        if (replace) {
            report.SetPathName(name, !kareport::isRichTextName(name) && !kareport::isPdfName(name));
        }
        if (replace && report.GetPathName() != name) {
            // There was no memory for it: what is saved later would go to another file.
            report.SetModifiedFlag(wasModified);
            kareport::saySaveFailed(name, kareport::noMemoryText());
            return false;
        }
        report.SetModifiedFlag(false);
    }
    return true;
}

} // namespace

bool UReportDoc::DoSave(const QString &path, bool replace)
{
    parts_->saveProblem.clear(); // a host's own OnSaveDocument leaves none
    return kareport::whileMemoryLasts(false, [&] { return saveUnderChosenName(*this, path, replace); });
}

bool UReportDoc::OnSaveDocument(const QString &path)
{
    QString problem;
    const bool isSaved = kareport::whileMemoryLasts(false, [&] { return saveByName(*this, path, problem); });
    if (!IsReportAvailable(this)) {
        return isSaved; // a view that was updated, or an editor that took the file, has closed it
    }
    // A view that could not write leaves its reason to the next one, which may have written.
    parts_->saveProblem = isSaved ? QString() : problem;
    if (isSaved) {
        kareport::doneWhileMemoryLasts([this] { OnDocumentEvent(DocumentEvent::AfterSaveDocument); });
    }
    return isSaved;
}

const QString &UReportDoc::GetSaveProblem() const
{
    return parts_->saveProblem;
}

int UReportDoc::SaveFile(const QString &path)
{
    if (path.isEmpty()) {
        return 0;
    }
    OnSaveDocument(path);
    return 1; // also when nothing was saved: hosts take a 0 for "no path" and continue with any other answer
}

bool UReportDoc::WriteText(QIODevice &device, kareport::LineEnds lineEnds) const
{
    return !HasLostText() && kareport::whileMemoryLasts(false, [&] {
        return parts_->page.text().visit([&](auto text) { return kareport::writeReportText(device, text, lineEnds); });
    });
}

bool UReportDoc::WritePdf(QIODevice &device, kareport::PdfNotes *notes,
                          const std::function<bool(qint64, qint64)> &progress,
                          const kareport::PdfDetails *details) const
{
    bool isWritten = false;
    const auto write = [&] {
        const kareport::PageLayout &layout = parts_->layout;
        const kareport::PageGeometry &geometry = layout.geometry();
        kareport::PdfOptions options;
        options.page = {geometry.pageSize, geometry.resolution, layout.margins, layout.fontSize, geometry.linesPerPage};
        options.pageStarts = GetPageStarts();
        options.progress = progress;
        options.details = details;
        if (HoldsRichTextSource()) {
            // The text of the document, not its source.
            const QString shown = kareport::shownPlainText(*this);
            options.pageStarts = kareport::pageHeadersIn(shown);
            isWritten = kareport::writePdf(device, QStringView(shown), options, notes);
            return;
        }
        if (details != nullptr) {
            options.outline = parts_->page.outline().entries();
        }
        isWritten =
            parts_->page.text().visit([&](auto text) { return kareport::writePdf(device, text, options, notes); });
    };
    if (!HasLostText() && !kareport::doneWhileMemoryLasts(write) && notes != nullptr) {
        notes->problem = kareport::noMemoryText();
    }
    return isWritten;
}
