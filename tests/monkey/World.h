#pragma once

#include "DeskApplication.h"
#include "DialogAnswers.h"
#include "Steps.h"

#include <QDateTime>
#include <QDir>
#include <QHash>
#include <QString>

#include <memory>
#include <optional>
#include <set>
#include <vector>

class DeskFrame;
class UReportDoc;
class UReportView;

namespace monkey
{

/// A report as it was at some moment.
struct Seen
{
    const UReportDoc *report = nullptr;
    quint64 id = 0; ///< of the report: another one may come to its place in memory
    QString text;
    bool isModified = false;
    QString path;
    QString title;
};

/// A file as it was at some moment.
struct Stamp
{
    QDateTime modified;
    qint64 size = -1;

    bool operator==(const Stamp &) const = default;
};

/// The desk that is driven: its window, its files, and what was seen of its reports.
class World
{
public:
    /// @param folder  everything that the desk reads and writes is below it
    explicit World(const QString &folder);
    ~World();
    World(const World &) = delete;
    World &operator=(const World &) = delete;

    DeskFrame &frame() const { return *frame_; }
    bool isOpen() const { return frame_ != nullptr; }
    /// Ends the window after it was closed, and starts it again.
    void restart();
    QDir files() const { return QDir(folder_.filePath(QStringLiteral("files"))); }
    QDir folder() const { return folder_; }
    DialogAnswers &answers() { return answers_; }

    static std::vector<UReportDoc *> reports();
    static QString textOf(const UReportDoc &report);
    static qsizetype pagesOf(const UReportDoc &report);
    /// The views of all reports that are on the screen now: in a pane that is shown, and not below another tab.
    static std::vector<UReportView *> viewsOnScreen();
    /// The view whose text has the keyboard; null when none has.
    static UReportView *viewWithKeyboard();

    /// Takes down what is there before a step.
    void note();
    /// Does a step and all that follows from it at once.
    void run(const Step &step);
    /// What is wrong after the step that was run last; empty when all is well.
    QString check();

    /// Lets the clock go on, so that what looks at times does.
    void wait(int milliseconds);
    /// Does what the desk does every few seconds: what is open is on the disk after it.
    void keep();
    /// The desk has written down what is open, and dies.
    [[noreturn]] void crash();
    /// Whether reports that were lost in a crash have come back. @return what is wrong
    QString checkRecovered();
    QString newPath(Chance &chance) const;

    /// Opens what a report was saved in, as a user does with a copy of the file, by the command for it or otherwise. What
    /// is wrong with it is found by the check.
    void reopen(Chance &chance);
    /// Opens a report so long that it is loaded in pieces.
    void openLong();
    /// The step has found something wrong.
    void fail(const QString &what);

    // What the step that runs says of itself.
    std::set<const UReportDoc *> mayChange; ///< texts that it edits
    QString did;                            ///< in words, for the log

private:
    class Application;

    /// The file that a report was saved in, as it was then.
    struct Saved
    {
        QString path;
        Stamp stamp;
    };

    const Seen *seen(quint64 id) const;
    quint64 idOf(const UReportDoc &report);
    std::vector<Seen> look();
    QHash<QString, Stamp> lookAtFiles() const;
    void makeFiles() const;
    /// Files that were written since the step began.
    QStringList writtenFiles() const;
    bool isKept(const QString &text) const;
    /// A text that is kept nowhere, and what was written: their beginnings.
    QString describeWritten(const QString &text) const;
    /// Whether the user let the desk load the file of a report again.
    bool isReloaded(const Seen &was) const;
    static bool isRich(const UReportDoc &report);
    /// Whether a view that shows formats, or rich text, shows what the report holds.
    static bool showsRich(const UReportDoc &report, const QString &shown);
    QString checkSaved(const UReportDoc &report, const Seen &was);
    /// The reports whose files hold them as they are now.
    std::vector<UReportDoc *> savedReports() const;
    /// Opens a file that a report was saved in, or a copy of it. @return what is wrong with what is opened; empty when nothing is
    QString openSaved(const UReportDoc &report, const QString &copy, bool byCommand);
    /// Types into rich text that was opened, and may undo that. @return what is wrong afterwards; empty when nothing is
    QString editOpened(const QString &copy, Chance &chance);
    static QString checkPdf(const UReportDoc &report);
    /// All that the PDF and the print of a report are made of.
    static QByteArray makingOf(const UReportDoc &report);
    /// Whether that was not looked at yet: what is made of the same is the same.
    bool isNew(const QByteArray &making);
    /// What a view prints into a file; empty where it refuses to.
    QByteArray printOf(UReportView &view) const;
    QString checkPrint(UReportView &view) const;

    QString checkClosed() const;
    QString checkTexts() const;
    QString checkFiles();
    QString checkWindows();
    QString checkActive() const;
    QString checkPages();
    QString checkCommands() const;
    /// Where the panes are, for the log.
    QString describePanes() const;

    QDir folder_;
    std::unique_ptr<Application> application_;
    std::unique_ptr<DeskFrame> frame_;
    DialogAnswers answers_;
    QHash<const UReportDoc *, quint64> ids_;
    quint64 lastId_ = 0;
    std::vector<Seen> before_;
    std::vector<Seen> closed_; ///< as they were when they were closed
    QHash<QString, Stamp> filesBefore_;
    QHash<quint64, Saved> saved_; ///< by the numbers of reports
    QString wrong_;               ///< what the step itself has found
    std::vector<Answer> given_;
    std::set<QByteArray> lookedAt_;
    quint64 steps_ = 0;
    bool mayBeInTabs_ = false; ///< the keyboard, which the Tab key leads to the rows of tabs
};

/// What differs from system to system.
[[noreturn]] void dieAtOnce();
/// Lets files grow to so many bytes from now on; below 0 without end.
void limitFiles(qint64 bytes);
/// To what files may grow; below 0 without end.
qint64 fileLimit();
/// Ends the editors that this desk has started. @return their number
int endEditors(const QDir &folder);
/// Whether one of them is open.
bool isEditorOpen(const QDir &folder);

} // namespace monkey
