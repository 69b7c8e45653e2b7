#include "Recovery.h"

#include "ReplaceFile.h"
#include "ReportEntry.h"
#include "SavedReports.h"
#include "UReportDoc.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"
#include "Xlate.h"

#include <QDir>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QStandardPaths>
#include <QUuid>

#include <utility>

namespace kareport
{

namespace
{

const QString lockName = QStringLiteral("lock");
const QString listName = QStringLiteral("reports.json");
constexpr QFileDevice::Permissions onlyUser = QFileDevice::ReadOwner | QFileDevice::WriteOwner | QFileDevice::ExeOwner;

bool writeFile(const QString &path, const QByteArray &bytes)
{
    return replaceFile(path, [&bytes](QIODevice &device) { return device.write(bytes) == bytes.size(); });
}

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

std::vector<KeptReport> readList(const QString &folder)
{
    std::vector<KeptReport> reports;
    QFile file(QDir(folder).filePath(listName));
    if (!file.open(QIODevice::ReadOnly)) {
        return reports;
    }
    for (const QJsonValue &entry : QJsonDocument::fromJson(file.readAll()).array()) {
        const QString text = entry[QStringLiteral("text")].toString();
        reports.push_back({entry[QStringLiteral("title")].toString(), entry[QStringLiteral("path")].toString(),
                           text.isEmpty() ? text : QDir(folder).filePath(QFileInfo(text).fileName())});
    }
    return reports;
}

} // namespace

QString Recovery::usualFolder()
{
    return QStandardPaths::writableLocation(QStandardPaths::AppLocalDataLocation) + QStringLiteral("/recovery");
}

QString KeptReport::name() const
{
    if (!title.isEmpty()) {
        return title;
    }
    return path.isEmpty() ? Xlate("Untitled") : path;
}

Recovery::Recovery(const QString &folder)
{
    QDir all(folder);
    if (!all.mkpath(QStringLiteral("."))) {
        return;
    }
    QFile::setPermissions(folder, onlyUser);
    const auto makeLock = [&all](const QString &name) {
        auto lock = std::make_unique<QLockFile>(all.filePath(name + u'/' + lockName));
        lock->setStaleLockTime(0); // however long a program runs, its lock holds
        return lock;
    };
    for (const QString &name : all.entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Time | QDir::Reversed)) {
        auto lock = makeLock(name);
        if (lock->tryLock(0)) {
            left_.emplace_back(all.filePath(name), std::move(lock));
        }
    }
    const QString name = QUuid::createUuid().toString(QUuid::WithoutBraces);
    if (all.mkdir(name)) {
        folder_ = all.filePath(name);
        QFile::setPermissions(folder_, onlyUser);
        lock_ = makeLock(name);
        lock_->tryLock(0);
    }
}

Recovery::~Recovery()
{
    if (lock_) {
        lock_->unlock();
        QDir(folder_).removeRecursively();
    }
}

std::vector<KeptReport> Recovery::leftReports() const
{
    std::vector<KeptReport> reports;
    for (const auto &left : left_) {
        for (KeptReport &kept : readList(left.first)) {
            reports.push_back(std::move(kept));
        }
    }
    return reports;
}

void Recovery::discardLeft()
{
    for (const auto &[folder, lock] : left_) {
        lock->unlock();
        QDir(folder).removeRecursively();
    }
    left_.clear();
}

UReportDoc *Recovery::reopen(const KeptReport &kept)
{
    if (kept.textFile.isEmpty()) {
        return QFile::exists(kept.path) ? openSavedReport(kept.path) : nullptr;
    }
    QFile file(kept.textFile);
    if (!file.open(QIODevice::ReadOnly)) {
        return nullptr;
    }
    UReportDoc *report = CreateReport(kept.title, true, false, nullptr, 0, nullptr);
    if (report != nullptr) {
        report->SetData(QString::fromUtf8(file.readAll()));
        if (!kept.path.isEmpty()) {
            report->SetPathName(kept.path, false);
        }
        report->UpdateAllViews(nullptr, 0, nullptr);
        report->SetModifiedFlag(true);
    }
    return report;
}

QString Recovery::textFileOf(const UReportDoc &report)
{
    Written &written = written_[&report];
    const auto *window = dynamic_cast<UReportWindowDlg *>(report.GetReportWindow());
    const bool isBeingWritten = window != nullptr && window->isCreated() && !window->IsActive();
    if (isBeingWritten || (written.edits == report.GetEditCount() && written.length == report.GetTextLength())) {
        return written.length < 0 ? QString() : written.file;
    }
    if (written.file.isEmpty()) {
        written.file = QString::number(++lastNumber_);
    }
    const UReportView *view = formattedView(report);
    const bool isWritten = replaceFile(QDir(folder_).filePath(written.file), [&report, view](QIODevice &device) {
        if (view != nullptr) {
            return view->streamRichText(device);
        }
        const QByteArray bytes = report.CopyText().toUtf8();
        return device.write(bytes) == bytes.size();
    });
    if (!isWritten) {
        isComplete_ = false; // a full disk: the next turn tries again, and what was written before stays
        return written.length < 0 ? QString() : written.file;
    }
    written.edits = report.GetEditCount();
    written.length = report.GetTextLength();
    return written.file;
}

void Recovery::forget(const UReportDoc *report)
{
    gone_.append(written_.take(report).file);
}

bool Recovery::keep()
{
    if (folder_.isEmpty()) {
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
        QJsonObject entry = {{QStringLiteral("title"), report->GetTitle()},
                             {QStringLiteral("path"), report->GetPathName()}};
        if (report->IsModified()) {
            entry.insert(QStringLiteral("text"), textFileOf(*report));
            kept.insert(report, written_.value(report));
        }
        list.append(entry);
    }
    // Only then may texts go that the list named till now.
    const QByteArray bytes = QJsonDocument(list).toJson();
    if (bytes != list_) {
        if (!writeFile(QDir(folder_).filePath(listName), bytes)) {
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
        QFile::remove(QDir(folder_).filePath(file));
    }
    written_ = kept;
    return isComplete_;
}

} // namespace kareport
