#include "SaveAs.h"

#include "AppMessageBox.h"
#include "ApplicationTitle.h"
#include "Clock.h"
#include "FileIdentity.h"
#include "FileKind.h"
#include "Folders.h"
#include "JobOutputs.h"
#include "PdfExport.h"
#include "ProposedName.h"
#include "ReplaceFile.h"
#include "ReportSaveName.h"
#include "ReportViews.h"
#include "UApplication.h"
#include "UReportDoc.h"
#include "WaitCursor.h"
#include "Xlate.h"

#include <QAbstractItemView>
#include <QFileDialog>
#include <QFileInfo>

#include <algorithm>

namespace kareport
{

namespace
{

/// A kind of file that a save dialog offers.
struct OfferedKind
{
    QString title;           ///< as Qt shows it, with its pattern
    QString pattern;         ///< "*" for all files
    bool hasOutline = false; ///< a PDF with one
};

std::vector<OfferedKind> kindsOf(const QString &filter)
{
    std::vector<OfferedKind> kinds;
    const QStringList parts = filter.split(u'|', Qt::SkipEmptyParts);
    for (qsizetype i = 0; i + 1 < parts.size(); i += 2) {
        // The pattern after the title counts, not the one that the title shows. On this platform "*.*" would leave out
        // names without a dot.
        const QString pattern = parts[i + 1] == u"*.*" ? QStringLiteral("*") : parts[i + 1];
        kinds.push_back(
            {parts[i].section(QStringLiteral(" ("), 0, 0) + QStringLiteral(" (") + pattern + u')', pattern});
    }
    return kinds;
}

/// Puts PDFs with an outline after those without, where reports are saved.
void addOutlineKind(std::vector<OfferedKind> &kinds)
{
    const auto pdf =
        std::find_if(kinds.begin(), kinds.end(), [](const OfferedKind &kind) { return isPdfName(kind.pattern); });
    if (pdf != kinds.end()) {
        const QString pattern = pdf->pattern;
        kinds.insert(pdf + 1, {Xlate("PDF with outline and page numbers (%1)").arg(pattern), pattern, true});
    }
}

/// Qt's dialog takes names in folders that are not there. @return false, after a message
bool hasFolder(const QString &path, const SaveRequest &request)
{
    const QString folder = QFileInfo(path).absolutePath();
    if ((request.flags & SaveRequest::pathMustExist) == 0 || QFileInfo(folder).isDir()) {
        return true;
    }
    showMessage({Xlate("There is no folder \"%1\". Choose another one, or create it first.").arg(folder), QString(),
                 MessageButtons::Ok, MessageIcon::Information});
    return false;
}

/// Whether another report that is open has a file for its own: the two would overwrite each other.
bool isOpenElsewhere(const QString &path, const SaveRequest &request)
{
    const QString identity = fileIdentity(path);
    const std::vector<UDocument *> open = UApplication::Get()->GetDocuments();
    return !identity.isEmpty() && std::any_of(open.begin(), open.end(), [&](const UDocument *document) {
        return document != request.document && !document->GetPathName().isEmpty() &&
               fileIdentity(document->GetPathName()) == identity;
    });
}

bool mayReplace(const QString &path, const SaveRequest &request)
{
    if (isOpenElsewhere(path, request)) {
        showMessage({Xlate("\"%1\" is open as another report. Close that one first, or choose another name.").arg(path),
                     QString(), MessageButtons::Ok, MessageIcon::Information});
        return false;
    }
    if ((request.flags & SaveRequest::overwritePrompt) == 0 || !QFileInfo::exists(path)) {
        return true;
    }
    return showMessage({Xlate("\"%1\" already exists. Replace it?").arg(path), QString(), MessageButtons::YesNo,
                        MessageIcon::Question}) == MessageAnswer::Yes;
}

/// Puts a name into the dialog. A file that has it is not selected: what is typed over the name would be added to it.
void propose(QFileDialog &dialog, const QString &name)
{
    dialog.selectFile(name);
    for (const QAbstractItemView *view : dialog.findChildren<QAbstractItemView *>()) {
        if (view->selectionModel() != nullptr && view->objectName() == u"listView") {
            view->selectionModel()->clearSelection();
        }
    }
}

/// Whenever another kind is chosen, the name in the dialog gets its ending.
void followKind(QFileDialog &dialog, const QStringList &titles, const QStringList &patterns)
{
    QObject::connect(&dialog, &QFileDialog::filterSelected, &dialog, [&dialog, titles, patterns](const QString &title) {
        const QString name = dialog.selectedFiles().value(0);
        const QString other = withOtherEnding(name, patterns.value(titles.indexOf(title)), patterns);
        if (other != name && !QFileInfo(name).isDir()) {
            propose(dialog, other);
        }
    });
}

PdfDetails detailsOf(const UReportDoc &report)
{
    PdfDetails details;
    details.title = report.GetTitle();
    details.creator = GetApplicationTitle();
    details.created = currentTime();
    return details;
}

/// Writes a report as a PDF, and reports what is not in it or why it could not be written.
void exportPdf(const UReportDoc &report, const SaveChoice &choice)
{
    const QString &path = choice.path;
    PdfNotes notes;
    QString problem;
    bool isWritten = false;
    if (report.HasLostText()) {
        problem = lostTextReason();
    } else if (makesNoPage(report)) {
        problem = emptyPdfReason();
    } else {
        const WaitCursor cursor;
        finishLoading(report);
        const PdfDetails details = detailsOf(report);
        const auto write = [&](QIODevice &device) {
            return report.WritePdf(device, &notes, {}, choice.hasOutline ? &details : nullptr);
        };
        isWritten = replaceFile(path, write, &problem);
    }
    if (!isWritten) {
        sayNotSaved(path, notes.problem.isEmpty() ? problem : notes.problem);
    } else if (const QStringList warnings = notes.warnings(); !warnings.isEmpty()) {
        showMessage({Xlate("\"%1\" was saved, but it differs from the report:\n\n%2").arg(path, warnings.join(u'\n')),
                     QString(), MessageButtons::Ok, MessageIcon::Information});
    }
}

} // namespace

SaveRequest withProposedName(const SaveRequest &request, const QString &origin)
{
    const auto *report = dynamic_cast<const UReportDoc *>(request.document);
    if (report == nullptr || !request.fileName.isEmpty()) {
        return request;
    }
    const std::vector<OfferedKind> kinds = kindsOf(request.filter);
    const QString ending = kinds.empty() || !kinds.front().pattern.startsWith(u"*.") ? request.defaultExtension
                                                                                     : kinds.front().pattern.mid(2);
    SaveRequest proposing = request;
    proposing.fileName =
        proposedName({report->GetTitle(), report->GetPathName(), origin, request.initialFolder}, ending);
    return proposing;
}

QString withEndingOf(const QString &path, const QString &kind, const QStringList &kinds)
{
    const bool isKnown = std::any_of(kinds.begin(), kinds.end(), [&path](const QString &known) {
        return known.startsWith(u"*.") && hasEnding(path, QStringView(known).sliced(1));
    });
    return isKnown || !kind.startsWith(u"*.") ? path : path + kind.sliced(path.endsWith(u'.') ? 2 : 1);
}

std::optional<SaveChoice> askSavePath(QWidget *parent, const SaveRequest &request)
{
    std::vector<OfferedKind> kinds = kindsOf(request.filter);
    if (dynamic_cast<const UReportDoc *>(request.document) != nullptr) {
        addOutlineKind(kinds);
    }
    QStringList titles;
    QStringList patterns;
    for (const OfferedKind &kind : kinds) {
        titles.append(kind.title);
        patterns.append(kind.pattern);
    }
    QFileDialog dialog(parent, Xlate("Save As"), request.initialFolder);
    dialog.setNameFilters(titles);
    dialog.setAcceptMode(QFileDialog::AcceptSave);
    // The name is not complete yet when the dialog would ask, and its questions take names for HTML.
    dialog.setOption(QFileDialog::DontConfirmOverwrite);
    for (QAbstractItemView *view : dialog.findChildren<QAbstractItemView *>()) {
        view->setContextMenuPolicy(Qt::NoContextMenu); // it would ask before it deletes a file
    }
    followKind(dialog, titles, patterns);
    if (!request.fileName.isEmpty()) {
        if (QFileInfo(request.fileName).isAbsolute()) {
            dialog.setDirectory(QFileInfo(request.fileName).absolutePath());
        }
        propose(dialog, QFileInfo(request.fileName).fileName());
    }
    while (dialog.exec() == QDialog::Accepted) {
        const qsizetype chosen = titles.indexOf(dialog.selectedNameFilter());
        QString path = withEndingOf(dialog.selectedFiles().value(0), patterns.value(chosen), patterns);
        if (hasFolder(path, request) && mayReplace(path, request)) {
            return SaveChoice(path, chosen >= 0 && kinds[static_cast<std::size_t>(chosen)].hasOutline);
        }
    }
    return std::nullopt;
}

std::optional<QString> askOwnName(const SaveRequest &request,
                                  const std::function<std::optional<SaveChoice>(const SaveRequest &)> &ask)
{
    const auto choice = ask(request);
    if (!choice) {
        return std::nullopt;
    }
    const auto *report = dynamic_cast<const UReportDoc *>(request.document);
    // The report may have been closed while the dialog was open.
    if (report == nullptr || !isPdfName(choice->path) || !UReportDoc::IsReportAvailable(report)) {
        return choice->path;
    }
    SetLastOpenDir(choice->path, lastReportFolder);
    exportPdf(*report, *choice);
    return std::nullopt;
}

} // namespace kareport
