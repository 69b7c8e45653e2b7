#include "UReportDoc.h"

#include "CPropertyPane.h"
#include "CViewPane.h"
#include "EditorKind.h"
#include "EditorLauncher.h"
#include "FileExtension.h"
#include "Folders.h"
#include "MemoryLasts.h"
#include "Preferences.h"
#include "PrivateFile.h"
#include "Profile.h"
#include "ReportEntry.h"
#include "ReportViews.h"
#include "UView.h"

#include <algorithm>
#include <utility>

using kareport::EditorKind;
using kareport::showsReport;

namespace
{

constexpr QChar infinity(0x221E);

/// The path of the user's editor as it is entered; empty while the user does not want one.
QString preferredEditor()
{
    return GetUsePreferredReportEditorFlag() != 0 ? GetProfileString(QString(), GetPreferredReportEditorRegKey())
                                                  : QString();
}

/// The path of the user's editor; empty when it is not wanted or not installed. Nothing is kept: the user may change the
/// preferences, or install the editor, at any time.
QString availableEditor()
{
    const QString editor = preferredEditor();
    return IsFileExisting(editor) != 0 ? editor : QString();
}

void startEditor(const QString &editor, const QString &file, UDocument &report)
{
    if (!file.isEmpty()) {
        kareport::launchEditor(editor, file, GetTempDir(false), &report);
    }
}

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

} // namespace

bool IsUseExternalEditor(bool want)
{
    return want && kareport::whileMemoryLasts(false, [] { return !availableEditor().isEmpty(); });
}

bool UReportDoc::UsePreferredReportEditor() const
{
    return IsUseExternalEditor(externalEditor_);
}

bool UReportDoc::IsConvertToOpenInWord(const QString &file, const QString &editor)
{
    if (kareport::editorKind(editor, IsOptionExcel()) == EditorKind::Plain) {
        return false;
    }
    if (kareport::isExcelEditor(editor)) {
        SetExternalExcel();
    }
    return !kareport::endsWithExtension(file, u".rtf") && !kareport::endsWithExtension(file, u".pdf");
}

void UReportDoc::UpdateAllViews(UView *sender, long hint, void *hintObject)
{
    kareport::doneWhileMemoryLasts([&] {
        const QString editor = editorForReport();
        if (editor.isEmpty()) {
            UDocument::UpdateAllViews(sender, hint, hintObject);
            if (IsReportAvailable(this)) { // its last view may have closed it
                showFrame();
            }
        } else {
            openInEditor(editor);
        }
        CPropertyPane::UpdateAllPropertyPane(IsReportAvailable(this) ? this : nullptr);
    });
}

QString UReportDoc::editorForReport() const
{
    // Half a report is shown here, where it is known for what it is; an editor would take it for a whole one.
    return externalEditor_ && !HasLostText() ? availableEditor() : QString();
}

void UReportDoc::showFrame()
{
    // A pane that is open already is left alone: showing it again takes the focus from the view that is typed in.
    CViewPane *frame = GetFrameWindow();
    if (frame != nullptr && !closeDocument_ && !frame->IsVisible()) {
        kareport::showReportPane(*frame, true);
    }
}

void UReportDoc::openInEditor(const QString &editor)
{
    const QString name = GetCurrentReportFileName();
    if (name.isEmpty()) {
        return; // memory has ended
    }
    const QString file = saveForEditor(name);
    CViewPane *frame = GetFrameWindow();
    if (frame != nullptr && !closeDocument_) {
        kareport::showReportPane(*frame, false);
    }
    if (IsConvertToOpenInWord(file, editor)) {
        ConvertAndOpenInWord();
    } else {
        startEditor(editor, file, *this);
    }
    // While it is being loaded, whoever loads it still needs it. What the editor did not get, for want of room on the disk or
    // of memory, is nowhere else.
    if (IsReportAvailable(this) && closeDocument_ && !isSerializing_ && !HasLostText() && (IsEmpty() || !IsModified()))
    {
        OnCloseDocument();
    }
}

QString UReportDoc::saveForEditor(QString name)
{
    // An empty report makes no file, so it needs no place for one.
    while (!IsEmpty() && !kareport::makePrivateFile(name)) {
        if (!kareport::isNameTaken(name)) {
            return name; // as good as any other: there is no folder to write to
        }
        const QString taken = std::exchange(name, GetCurrentReportFileName());
        if (name == taken) {
            return QString(); // all names are, and what stands there is not the report
        }
    }
    OnSaveDocument(name);
    return name;
}

void UReportDoc::ConvertAndOpenInWord()
{
    kareport::doneWhileMemoryLasts([this] { convertForEditor(); });
}

void UReportDoc::convertForEditor()
{
    UDocTemplate *reportTemplate = GetReportTemplate();
    if (reportTemplate == nullptr) {
        return;
    }
    const int show = IsUseExternalEditor(true) ? 0 : 1;
    auto *converted = dynamic_cast<UReportDoc *>(
        reportTemplate->OpenReportDocumentFile(QString(), show, show, nullptr, ownPaneStyle, nullptr));
    if (converted == nullptr) {
        return;
    }
    converted->SetHeaderFlag(false);
    converted->SetExternalEditorFlag(true);
    converted->Clear();
    converted->SetRTFDataFlag(true);
    converted->SetReportFileName(reportFileName_);
    converted->exportOptions_ |= exportOptions_;
    converted->page_.losesNothing([&] { converted->writeLinesOf(page_.text()); });
    if (HasLostText()) {
        converted->page_.noteLostText();
    }
    converted->ReportRTfData();
    if (!IsReportAvailable(converted)) {
        return;
    }
    converted->SetModifiedFlag(false);
    if (converted->closeDocument_) {
        converted->OnCloseDocument();
    }
}

void UReportDoc::writeLinesOf(const kareport::ReportText &text)
{
    QString line;
    const auto write = [this, &line](auto written) {
        line.resize(0);
        line += written;
        // The sign has no byte of its own in the file that is made of this.
        line.replace(infinity, QStringLiteral("inf."));
        page_.writeLine(line, 0, 1, 0);
        page_.countLine();
    };
    if (text.isNarrow()) {
        forEachWrittenLine(text.narrowView(), write);
    } else {
        forEachWrittenLine(text.view(), write);
    }
}

void UReportDoc::ReportRTfData()
{
    kareport::doneWhileMemoryLasts([this] {
        const QString editor = editorForReport();
        if (editor.isEmpty()) {
            showInModule();
        } else {
            openWrittenInEditor(editor);
        }
    });
}

void UReportDoc::openWrittenInEditor(const QString &editor)
{
    const QString name = GetCurrentReportFileName();
    if (name.isEmpty()) {
        return; // memory has ended
    }
    const bool takesRichText = kareport::editorKind(editor, IsOptionExcel()) == EditorKind::WordProcessor;
    const QString richText = takesRichText ? writeRichTextForEditor(name) : QString();
    startEditor(editor, richText.isEmpty() ? saveForEditor(name) : richText, *this);
}

QString UReportDoc::writeRichTextForEditor(const QString &name) const
{
    QFile file(QString(name).replace(QStringLiteral(".rep"), QStringLiteral(".rtf")));
    const QString stem = file.fileName().first(file.fileName().lastIndexOf(u'.'));
    for (int number = 1; !kareport::openPrivateFile(file); ++number) {
        if (!kareport::isNameTaken(file.fileName())) {
            return QString();
        }
        file.setFileName(stem + u'_' + QString::number(number) + QStringLiteral(".rtf"));
    }
    if (!WriteRichTextFile(file) || !file.flush()) {
        file.remove();
        return QString();
    }
    return file.fileName();
}

void UReportDoc::showInModule()
{
    if (std::none_of(GetViews().begin(), GetViews().end(), showsReport)) {
        openOwnPane();
    }
    SetModifiedFlag(true);
    UpdateAllViews(nullptr, 0, nullptr);
    if (!IsReportAvailable(this)) {
        return; // its last view has closed it
    }
    const auto shown = std::find_if(GetViews().begin(), GetViews().end(), [](const UView *view) {
        return showsReport(view) && view->GetParentPane() != nullptr;
    });
    if (shown != GetViews().end()) {
        (*shown)->GetParentPane()->BringToTop();
    }
}

void UReportDoc::openSavedFile(const QString &path)
{
    // Here, and only here, blanks around the path that the user has entered do no harm.
    const QString editor = preferredEditor().trimmed();
    if (externalEditor_ && IsFileExisting(editor) != 0) {
        kareport::launchEditor(editor, path, QString(), this);
    }
}
