#pragma once

#include "KeptReport.h"
#include "RecoveryFolder.h"

#include <QHash>
#include <QJsonArray>
#include <QLockFile>
#include <QString>

#include <memory>
#include <vector>

class UReportDoc;

namespace kareport
{

/// Keeps what is open on the disk, so that it comes back after a crash.
///
/// Every running program has a folder of its own, which is removed when the program ends regularly. A folder whose
/// program no longer runs was left by a crash. Other folders, and links, are ignored.
class Recovery
{
public:
    /// @param folder  where the folders of all running programs are
    explicit Recovery(const QString &folder = usualFolder());
    /// The regular end: nothing is kept.
    ~Recovery();
    Recovery(const Recovery &) = delete;
    Recovery &operator=(const Recovery &) = delete;

    static QString usualFolder();

    /// What programs that crashed had open, the reports that were opened first coming first.
    std::vector<KeptReport> leftReports() const;
    /// Folders of programs that crashed whose lists cannot be read. They stay as they are.
    const QStringList &unreadableFolders() const { return unreadable_; }
    /// Deletes what crashed programs left. @param lost  what could not be opened again: a folder that holds such a text
    /// stays, and is offered at the next start
    void discardLeft(const std::vector<KeptReport> &lost = {});

    /// Writes down what is open now. Texts that have not changed since are not written again, and those that are being
    /// written by a job not yet. @return whether all of it is on the disk
    bool keep();
    /// A report has been closed: a new report may get its address.
    void forget(const UReportDoc *report);

private:
    struct Written
    {
        QString file;
        quint64 edits = 0;
        qint64 length = -1;
        bool isFormatted = false; ///< by a view, whose formats are not in the report's text
        QJsonArray pageLines;
    };

    QString textFileOf(const UReportDoc &report);

    struct Left
    {
        RecoveryFolder folder;
        std::unique_ptr<QLockFile> lock;
    };

    void takeIfLeft(const RecoveryFolder &folder);

    std::optional<RecoveryFolder> folder_; ///< of this program; nothing when it cannot be made
    std::unique_ptr<QLockFile> lock_;
    std::vector<Left> left_; ///< of crashed programs
    QStringList unreadable_;
    QHash<const UReportDoc *, Written> written_;
    QStringList gone_; ///< texts that are no longer needed
    QByteArray list_;  ///< as it was written last
    int lastNumber_ = 0;
    bool isComplete_ = true; ///< whether the last `keep` could write all texts
};

} // namespace kareport
