#include "UReportDoc.h"

#include "CPropertyPane.h"
#include "CViewPane.h"
#include "EditorHandOver.h"
#include "EditorKind.h"
#include "Folders.h"
#include "MemoryLasts.h"
#include "PreferredEditor.h"
#include "ReportEntry.h"
#include "ReportParts.h"
#include "ReportSaveName.h"
#include "ReportViews.h"
#include "TemporaryNames.h"
#include "UView.h"

#include <algorithm>

using kareport::EditorKind;
using kareport::RichTextImage;
using kareport::showsReport;

namespace
{

constexpr QChar infinity(0x221E);

/// Hands on the lines of a text without their LF, except those that hold nothing but a CR. That CR stays with its line.
template <typename View, typename Take>
void forEachWrittenLine(View text, Take take)
{
    qsizetype end = 0;
    for (qsizetype begin = 0; begin < text.size(); begin = end + 1) {
        end = text.indexOf(u'\n', begin);
        end = end < 0 ? text.size() : end;
        const View line = text.sliced(begin, end - begin);
        if (line.count(u'\r') < line.size()) {
            take(line);
        }
    }
}

/// Writes the lines of another report's text.
void writeLinesOf(const kareport::ReportText &text, kareport::PageWriter &page)
{
    QString line;
    const auto write = [&page, &line](auto written) {
        line.resize(0);
        line += written;
        // The sign has no byte of its own in the file that is made of this.
        line.replace(infinity, QStringLiteral("inf."));
        page.writeLine(line, 0, 1, 0);
        page.countLine();
    };
    text.visit([&write](auto whole) { forEachWrittenLine(whole, write); });
}

/// A new report with a pane of its own, which is hidden where there is an editor. Null without the template for reports.
UReportDoc *openReportForEditor()
{
    UDocTemplate *reportTemplate = GetReportTemplate();
    if (reportTemplate == nullptr) {
        return nullptr;
    }
    const int show = IsUseExternalEditor(true) ? 0 : 1;
    return dynamic_cast<UReportDoc *>(
        reportTemplate->OpenReportDocumentFile(QString(), show, show, nullptr, UReportDoc::ownPaneStyle, nullptr));
}

void showFrame(UReportDoc &report)
{
    // A pane that is open already is left alone: showing it again takes the focus from the view that is typed in.
    CViewPane *frame = report.GetFrameWindow();
    if (frame != nullptr && !report.GetCloseDocumentFlag() && !frame->IsVisible()) {
        kareport::showReportPane(*frame, true);
    }
}

void showInModule(UReportDoc &report)
{
    if (std::none_of(report.GetViews().begin(), report.GetViews().end(), showsReport)) {
        kareport::openOwnPane(report);
    }
    report.SetModifiedFlag(true);
    report.UpdateAllViews(nullptr, 0, nullptr);
    if (!UReportDoc::IsReportAvailable(&report)) {
        return; // its last view has closed it
    }
    const auto shown = std::find_if(report.GetViews().begin(), report.GetViews().end(), [](const UView *view) {
        return showsReport(view) && view->GetParentPane() != nullptr;
    });
    if (shown != report.GetViews().end()) {
        (*shown)->GetParentPane()->BringToTop();
    }
}

} // namespace

bool IsUseExternalEditor(bool want)
{
    return want && kareport::whileMemoryLasts(false, [] { return !kareport::availableEditor().isEmpty(); });
}

void UReportDoc::SetExternalEditorFlag(bool on)
{
    parts_->externalEditor = on;
}

bool UReportDoc::GetExternalEditorFlag() const
{
    return parts_->externalEditor;
}

bool UReportDoc::UsePreferredReportEditor() const
{
    return IsUseExternalEditor(parts_->externalEditor);
}

void UReportDoc::SetOptionExcel()
{
    parts_->optionExcel = true;
}

bool UReportDoc::IsOptionExcel() const
{
    return parts_->optionExcel;
}

void UReportDoc::SetExternalExcel()
{
    parts_->mirrors.imageForm = RichTextImage::Form::BareText;
}

bool UReportDoc::IsExternalExcel() const
{
    return parts_->mirrors.imageForm == RichTextImage::Form::BareText;
}

bool UReportDoc::IsConvertToOpenInWord(const QString &file, const QString &editor)
{
    if (kareport::editorKind(editor, IsOptionExcel()) == EditorKind::Plain) {
        return false;
    }
    if (kareport::isExcelEditor(editor)) {
        SetExternalExcel();
    }
    return !kareport::isRichTextName(file) && !kareport::isPdfName(file);
}

void UReportDoc::UpdateAllViews(UView *sender, long hint, void *hintObject)
{
    kareport::doneWhileMemoryLasts([&] {
        const QString editor = kareport::editorOf(*this);
        if (editor.isEmpty()) {
            UDocument::UpdateAllViews(sender, hint, hintObject);
            if (IsReportAvailable(this)) { // its last view may have closed it
                showFrame(*this);
            }
        } else if (kareport::openInEditor(*this, editor) && IsReportAvailable(this)) {
            // While it is being loaded, the code that loads it still needs it. What the editor did not get, because
            // the disk is full or memory ran out, is kept nowhere else.
            const bool isHandedOver = !HasLostText() && (IsEmpty() || !IsModified());
            if (isHandedOver && parts_->closeDocument && !parts_->isSerializing) {
                OnCloseDocument();
            }
        }
        CPropertyPane::UpdateAllPropertyPane(IsReportAvailable(this) ? this : nullptr);
    });
}

void UReportDoc::ConvertAndOpenInWord()
{
    kareport::doneWhileMemoryLasts([this] {
        UReportDoc *converted = openReportForEditor();
        if (converted == nullptr) {
            return;
        }
        converted->SetHeaderFlag(false);
        converted->SetExternalEditorFlag(true);
        converted->Clear();
        converted->SetRTFDataFlag(true);
        converted->SetReportFileName(GetReportFileName());
        if (IsOptionExcel()) {
            converted->SetOptionExcel();
        }
        if (IsExternalExcel()) {
            converted->SetExternalExcel();
        }
        kareport::PageWriter &page = converted->parts_->page;
        page.losesNothing([&] { writeLinesOf(parts_->page.text(), page); });
        if (HasLostText()) {
            page.noteLostText();
        }
        converted->ReportRTfData();
        if (!IsReportAvailable(converted)) {
            return;
        }
        converted->SetModifiedFlag(false);
        if (converted->GetCloseDocumentFlag()) {
            converted->OnCloseDocument();
        }
    });
}

void UReportDoc::ReportRTfData()
{
    kareport::doneWhileMemoryLasts([this] {
        const QString editor = kareport::editorOf(*this);
        if (editor.isEmpty()) {
            showInModule(*this);
        } else {
            kareport::openWrittenInEditor(*this, editor);
        }
    });
}

void UReportDoc::SetReportFileName(const QString &name)
{
    parts_->reportFileName = name;
}

const QString &UReportDoc::GetReportFileName() const
{
    return parts_->reportFileName;
}

QString UReportDoc::GetCurrentReportFileName() const
{
    // One for all reports, so that no two of them get one name.
    static kareport::TemporaryNames names;
    return kareport::whileMemoryLasts(
        QString(), [this] { return names.next(GetTempDir(false), kareport::temporaryStem(GetReportFileName())); });
}
