#include "Recovery.h"

#include "MemoryLasts.h"
#include "ReportEntry.h"
#include "ReportSaveName.h"
#include "UReportDoc.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QStandardPaths>
#include <QStringEncoder>
#include <QUuid>

#include <algorithm>
#include <functional>
#include <utility>

namespace kareport
{

namespace
{

constexpr QFileDevice::Permissions onlyUser = QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ExeOwner;
const QString linesPerPageKey = QStringLiteral("linesPerPage");
const QString pageLinesKey = QStringLiteral("pages");

/// The view whose formats are not in the report's text; null when there is none.
const UReportView *formattedView(const UReportDoc &report)
{
    for (const UView *view : report.GetViews()) {
        const auto *shown = dynamic_cast<const UReportView *>(view);
        if (shown != nullptr && shown->ShowsFormats()) {
            return shown;
        }
    }
    return nullptr;
}

/// Writes a report's text piece by piece: while a long one is written, the windows wait.
bool writeAll(const UReportDoc &report, QIODevice &device)
{
    constexpr qint64 longestPiece = qint64(128) * 1024; // characters
    return whileMemoryLasts(false, [&] {
        QStringEncoder encode(QStringEncoder::Utf8);
        const qint64 length = report.GetTextLength();
        for (qint64 at = 0; at < length; at += longestPiece) {
            const QString piece = report.CopyText(at, longestPiece);
            const QByteArray bytes = encode(piece);
            // A copy needs memory: without it, the earlier copy is kept.
            if (piece.size() != std::min(longestPiece, length - at) || device.write(bytes) != bytes.size()) {
                return false;
            }
        }
        return true;
    });
}

std::vector<KeptReport> readList(const RecoveryFolder &folder)
{
    std::vector<KeptReport> reports;
    for (const QJsonValue entry : folder.list().value_or(QJsonArray())) {
        const QString text = entry[QStringLiteral("text")].toString();
        reports.push_back({entry[QStringLiteral("title")].toString(), entry[QStringLiteral("path")].toString(),
                           text.isEmpty() ? text : folder.textFile(text), entry[linesPerPageKey].toInt()});
        for (const QJsonValue line : entry[pageLinesKey].toArray()) {
            reports.back().pageLines.push_back(line.toInteger());
        }
    }
    return reports;
}

} // namespace

QString Recovery::usualFolder()
{
    return QStandardPaths::writableLocation(QStandardPaths::AppLocalDataLocation) + QStringLiteral("/recovery");
}

Recovery::Recovery(const QString &folder)
{
    QDir all(folder);
    if (!all.mkpath(QStringLiteral("."))) {
        return;
    }
    if (!QFileInfo(folder).isSymLink()) {
        QFile::setPermissions(folder, onlyUser);
    }
    for (const QString &name :
         all.entryList(QDir::Dirs | QDir::NoSymLinks | QDir::NoDotAndDotDot, QDir::Time | QDir::Reversed))
    {
        takeIfLeft(RecoveryFolder(all.filePath(name)));
    }
    const QString name = QUuid::createUuid().toString(QUuid::WithoutBraces);
    if (all.mkdir(name)) {
        folder_.emplace(all.filePath(name));
        QFile::setPermissions(folder_->path(), onlyUser);
        lock_ = folder_->makeLock();
        lock_->tryLock(0);
    }
}

Recovery::~Recovery()
{
    if (lock_ && !folder_->isOurs()) {
        // Something else has taken the folder's name meanwhile: unlocking would remove its lock.
        doneWhileMemoryLasts([this] {
            // For as long as the program runs. NOLINTNEXTLINE(bugprone-unhandled-exception-at-new): it is handled here
            static auto *const left = new std::vector<QLockFile *>;
            left->push_back(lock_.get());
        });
        static_cast<void>(lock_.release());
    } else if (lock_) {
        folder_->removeFiles();
        lock_->unlock();
        folder_->removeIfEmpty();
    }
}

void Recovery::takeIfLeft(const RecoveryFolder &folder)
{
    auto lock = folder.isOurs() ? folder.makeLock() : nullptr;
    if (lock == nullptr || !lock->tryLock(0)) {
        return;
    }
    if (folder.list() || folder.isUnused()) {
        left_.push_back({folder, std::move(lock)});
    } else {
        unreadable_.append(folder.path());
    }
}

std::vector<KeptReport> Recovery::leftReports() const
{
    std::vector<KeptReport> reports;
    for (const Left &left : left_) {
        for (KeptReport &kept : readList(left.folder)) {
            reports.push_back(std::move(kept));
        }
    }
    return reports;
}

void Recovery::discardLeft(const std::vector<KeptReport> &lost)
{
    const auto isKept = [&lost](const Left &left) {
        return std::any_of(lost.begin(), lost.end(), [&left](const KeptReport &kept) {
            return QFileInfo(kept.textFile).path() == left.folder.path() && kept.holdsText();
        });
    };
    for (const Left &left : left_) {
        if (!isKept(left)) {
            left.folder.removeFiles();
            left.lock->unlock();
            left.folder.removeIfEmpty();
        }
    }
    std::erase_if(left_, std::not_fn(isKept));
}

QString Recovery::textFileOf(const UReportDoc &report)
{
    Written &written = written_[&report];
    const auto *window = dynamic_cast<UReportWindowDlg *>(report.GetReportWindow());
    const bool isBeingWritten = window != nullptr && window->isCreated() && !window->IsActive();
    const UReportView *view = formattedView(report);
    const bool isSame = written.edits == report.GetEditCount() && written.length == report.GetTextLength() &&
                        written.isFormatted == (view != nullptr); // formats go with the view that has them
    if (isBeingWritten || isSame) {
        return written.length < 0 ? QString() : written.file;
    }
    if (written.file.isEmpty()) {
        written.file = QString::number(++lastNumber_);
    }
    const bool isWritten = folder_->write(written.file, [&report, view](QIODevice &device) {
        if (view != nullptr) {
            return view->streamRichText(device);
        }
        return writeAll(report, device);
    });
    if (!isWritten) {
        isComplete_ = false; // a full disk: the next turn tries again, and what was written before stays
        return written.length < 0 ? QString() : written.file;
    }
    written.edits = report.GetEditCount();
    written.length = report.GetTextLength();
    written.isFormatted = view != nullptr;
    written.pageLines = {};
    for (const qint64 line : view != nullptr ? std::vector<qint64>() : report.GetPageStartLines()) {
        written.pageLines.append(line);
    }
    return written.file;
}

void Recovery::forget(const UReportDoc *report)
{
    gone_.append(written_.take(report).file);
}

bool Recovery::keep()
{
    if (!folder_) {
        return false;
    }
    isComplete_ = true;
    QJsonArray list;
    QHash<const UReportDoc *, Written> kept;
    for (const UDocument *document : GetReportTemplate()->GetDocuments()) {
        const auto *report = dynamic_cast<const UReportDoc *>(document);
        if (report == nullptr || (!report->IsModified() && report->GetPathName().isEmpty())) {
            continue; // there is nothing to bring back
        }
        const bool hasOwnFile = !isPdfName(report->GetPathName()); // a PDF does not bring the report back
        QJsonObject entry = {{QStringLiteral("title"), report->GetTitle()},
                             {QStringLiteral("path"), report->GetPathName()}};
        if (report->IsPageFixed()) {
            entry.insert(linesPerPageKey, report->GetLinesPerPage());
        }
        if (report->IsModified() || !hasOwnFile) {
            entry.insert(QStringLiteral("text"), textFileOf(*report));
            entry.insert(pageLinesKey, written_.value(report).pageLines);
            kept.insert(report, written_.value(report));
        }
        list.append(entry);
    }
    // Only now can the texts be removed that the list has named until now.
    const QByteArray bytes = QJsonDocument(list).toJson();
    if (bytes != list_) {
        if (!folder_->writeList(bytes)) {
            return false;
        }
        list_ = bytes;
    }
    for (auto written = written_.cbegin(); written != written_.cend(); ++written) {
        if (!kept.contains(written.key())) {
            gone_.append(written->file);
        }
    }
    gone_.removeAll(QString()); // of reports whose text was never written
    for (const QString &file : std::exchange(gone_, {})) {
        folder_->removeText(file);
    }
    written_ = kept;
    return isComplete_;
}

} // namespace kareport
