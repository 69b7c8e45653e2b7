#include "UReportDoc.h"

#include "EditedText.h"
#include "FileExtension.h"
#include "Folders.h"
#include "LineEndings.h"
#include "MemoryLasts.h"
#include "PageHeader.h"
#include "PdfExport.h"
#include "ReplaceFile.h"
#include "ReportContent.h"
#include "ReportSaveName.h"
#include "ReportViews.h"
#include "RichTextReader.h"
#include "TemporaryNames.h"
#include "UApplication.h"
#include "UView.h"
#include "WaitCursor.h"
#include "Xlate.h"

#include <QBuffer>

#include <algorithm>

namespace
{

bool isRichTextName(const QString &name)
{
    return kareport::endsWithExtension(name, u".rtf");
}

bool isPdfName(const QString &name)
{
    return kareport::endsWithExtension(name, u".pdf");
}

} // namespace

bool UReportDoc::DoSave(const QString &path, bool replace)
{
    return kareport::whileMemoryLasts(false, [&] { return saveUnderChosenName(path, replace); });
}

bool UReportDoc::saveUnderChosenName(const QString &path, bool replace)
{
    bool isSaved = false;
    QString name = path;
    if (path.isEmpty() || replace) {
        const auto chosen = kareport::askReportName(*this, openedFromRtf_);
        if (!chosen) {
            return false;
        }
        name = *chosen;
    }
    if (!IsReportAvailable(this)) {
        return false; // it was closed while the dialog was open
    }
    {
        const kareport::WaitCursor cursor;
        isSaved = OnSaveDocument(name);
    }
    if (!isSaved) {
        // A view that was updated may have closed the report.
        kareport::sayNotSaved(name, IsReportAvailable(this) ? saveProblem_ : QString());
        return false;
    }
    if (!IsReportAvailable(this)) {
        return true; // what it told of the save has closed it
    }
    if (replace) {
        SetPathName(name, !isRichTextName(name) && !isPdfName(name));
    }
    SetModifiedFlag(false);
    return true;
}

bool UReportDoc::OnSaveDocument(const QString &path)
{
    saveProblem_.clear();
    const bool isSaved = kareport::whileMemoryLasts(false, [&] { return saveByName(path); });
    if (isSaved) {
        saveProblem_.clear(); // a view that could not write left its reason to the next one
        kareport::doneWhileMemoryLasts([this] { OnDocumentEvent(DocumentEvent::AfterSaveDocument); });
    }
    return isSaved;
}

bool UReportDoc::saveByName(const QString &path)
{
    if (HasLostText()) {
        // It would put half a report in the place of a whole one, or nothing in the place of what was lost.
        saveProblem_ = Xlate("a part of the report was lost when memory ran out");
        return false;
    }
    if (isRichTextName(path)) {
        // Without a view that can write it, the report text is saved under the name.
        const auto saved = saveViewAsRichText(path);
        return saved ? *saved : saveText(path);
    }
    if (isPdfName(path)) {
        kareport::PdfNotes notes;
        const bool isSaved = kareport::replaceFile(
            path, [this, &notes](QIODevice &device) { return WritePdf(device, &notes); }, &saveProblem_);
        if (!notes.problem.isEmpty()) {
            saveProblem_ = notes.problem;
        }
        return isSaved;
    }
    return saveText(path);
}

std::optional<bool> UReportDoc::saveViewAsRichText(const QString &path)
{
    for (UView *view : kareport::reportViews(*this)) {
        // The view must hold the report as it is now, and no editor is to be started for it.
        const bool externalEditor = externalEditor_;
        externalEditor_ = false;
        UpdateAllViews(nullptr, 0, nullptr);
        if (!IsReportAvailable(this)) {
            return false; // its last view has closed it
        }
        externalEditor_ = externalEditor;
        if (std::find(GetViews().begin(), GetViews().end(), view) == GetViews().end()) {
            continue;
        }
        bool isOpen = false;
        const auto *port = dynamic_cast<const kareport::ReportViewPort *>(view);
        const bool saved = kareport::replaceFile(
            path,
            [&](QIODevice &device) {
                isOpen = true;
                return port->streamRichText(device);
            },
            &saveProblem_);
        if (saved) {
            kareport::doneWhileMemoryLasts([&] { openSavedFile(path); });
        }
        if (isOpen) {
            return saved;
        }
    }
    return std::nullopt;
}

bool UReportDoc::saveText(const QString &path)
{
    // An empty report is saved by doing nothing: no file is made and none is emptied.
    const auto write = [this](QIODevice &device) { return WriteText(device, kareport::LineEnds::ReportFile); };
    if (!IsEmpty() && !kareport::replaceFile(path, write, &saveProblem_)) {
        return false;
    }
    SetModifiedFlag(false);
    return true;
}

bool UReportDoc::WriteText(QIODevice &device, kareport::LineEnds lineEnds) const
{
    if (HasLostText()) {
        return false;
    }
    const kareport::ReportText &text = page_.text();
    return kareport::whileMemoryLasts(false, [&] {
        return text.isNarrow() ? kareport::writeReportText(device, text.narrowView(), lineEnds)
                               : kareport::writeReportText(device, text.view(), lineEnds);
    });
}

bool UReportDoc::EndTextStream(kareport::ReportTextWriter &writer)
{
    page_.setOutlet(&writer);
    const bool isTaken = page_.emptyIntoOutlet();
    page_.setOutlet(nullptr);
    return isTaken && !HasLostText() && kareport::whileMemoryLasts(false, [&] { return writer.finish(); });
}

bool UReportDoc::WritePdf(QIODevice &device, kareport::PdfNotes *notes,
                          const std::function<bool(qint64, qint64)> &progress) const
{
    return !HasLostText() && kareport::whileMemoryLasts(false, [&] { return writeAsPdf(device, notes, progress); });
}

bool UReportDoc::writeAsPdf(QIODevice &device, kareport::PdfNotes *notes,
                            const std::function<bool(qint64, qint64)> &progress) const
{
    kareport::PdfOptions options;
    options.page = {geometry_.pageSize, geometry_.resolution, margins_, fontSize_, GetLinesPerPage()};
    options.pageStarts = GetPageStarts();
    options.progress = progress;
    const kareport::ReportText &text = page_.text();
    if (HoldsRichTextSource()) {
        // The text of the document, not its source.
        const QString shown = kareport::shownPlainText(*this);
        options.pageStarts = kareport::pageHeadersIn(shown);
        return kareport::writePdf(device, QStringView(shown), options, notes);
    }
    return text.isNarrow() ? kareport::writePdf(device, text.narrowView(), options, notes)
                           : kareport::writePdf(device, text.view(), options, notes);
}

int UReportDoc::SaveFile(const QString &path)
{
    if (path.isEmpty()) {
        return 0;
    }
    OnSaveDocument(path);
    return 1;
}

QString UReportDoc::GetCurrentReportFileName() const
{
    // One for all reports, so that no two of them get one name.
    static kareport::TemporaryNames names;
    return kareport::whileMemoryLasts(
        QString(), [this] { return names.next(GetTempDir(false), kareport::temporaryStem(reportFileName_)); });
}

void UReportDoc::SetTextObject(void *object, unsigned id)
{
    textObject_ = object;
    textObjectId_ = id;
}

void UReportDoc::SaveText()
{
    if (textObjectId_ != 0 && textObject_ != nullptr) {
        kareport::doneWhileMemoryLasts([this] { sendText(); });
    }
}

void UReportDoc::sendText()
{
    QString edited;
    for (UView *view : kareport::reportViews(*this)) {
        auto *port = dynamic_cast<kareport::ReportViewPort *>(view);
        port->loadIfStale(); // the report was written again, and the view is hidden
        QBuffer bytes;
        bytes.open(QIODevice::WriteOnly);
        if (port->streamPlainText(bytes) && bytes.size() > 0) {
            // The receiving side expects the bytes of the plain text two to a character.
            edited = kareport::textOfBytes(bytes.data());
        }
    }
    const QString text = kareport::wrappedText(kareport::printableText(edited));
    if (text.isEmpty()) {
        return;
    }
    // The pointer may be stale.
    const UApplication *application = UApplication::Get();
    if (application == nullptr || !application->IsOpen(textObject_)) {
        return;
    }
    auto *receiver = static_cast<UDocument *>(textObject_);
    const bool taken = receiver->OnTextReceived(textObjectId_, text);
    if (!IsReportAvailable(this)) {
        return; // the receiver has closed the report
    }
    if (!taken || !application->IsOpen(textObject_)) {
        SetTextObject(nullptr, 0);
    }
}
