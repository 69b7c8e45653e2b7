#pragma once

#include "CommandTarget.h"
#include "FileWatch.h"
#include "JobNotes.h"
#include "ReportRecipe.h"
#include "SaveDialog.h"

#include <QObject>
#include <QPointer>
#include <QStringList>
#include <QTimer>

#include <functional>
#include <map>
#include <optional>
#include <set>
#include <utility>
#include <vector>

class QToolButton;
class UDocument;
class UReportDoc;
class UXTPMDIFrameWnd;

namespace kareport
{

class NotesPane;
class UnitsBar;
struct LaunchHooks;
struct LaunchResult;
struct ReportMenu;

/// The reports of the desk that jobs made: what each was made of, the notes on it, and how it is made again,
/// because the user asks for it, chooses other units, or has said that it follows its files.
///
/// Changes that were made by hand are discarded only after a question. A run that fails leaves the report as it is.
class DeskRuns : public QObject
{
public:
    /// @param frame  gets the bar of units, the pane of notes and their number in its status bar, and outlives this object
    explicit DeskRuns(UXTPMDIFrameWnd &frame);
    ~DeskRuns() override;

    /// The commands that act on the report in front, for the table of the frame.
    std::vector<Command> commands();
    /// Adds these commands to the menus of the frame.
    void addTo(const ReportMenu &menu);

    /// Runs a job. @param error  receives what went wrong; empty when it was stopped
    /// @return its report; null when it was not made
    UReportDoc *run(const ReportRecipe &recipe, QString &error);
    /// What the report in front was made of; null for one that no job made.
    const ReportRecipe *recipeInFront() const;
    /// The same of any report.
    const ReportRecipe *recipeOf(const UDocument *report) const;
    /// The notes on a report; null for one that no job made.
    const JobNotes *notesOf(const UDocument *report) const;
    /// The report has been closed.
    void forget(const UDocument *report);

    /// Makes the report in front again. @return whether it was made
    bool runAgain();
    /// Makes a report again with other settings, which count for it alone.
    /// @param changed  keys of the job's `settings`. @return whether it was made; otherwise those before stay
    bool runWith(UReportDoc &report, const QJsonObject &changed);
    /// Whether reports are made again when their files change. It is kept for the next start.
    bool followsFiles() const { return followsFiles_; }
    void setFollowsFiles(bool on);
    /// Writes the job of the report in front into a file that the user names.
    void saveAsJob();
    /// Brings bar, pane and status bar up to date with the report in front.
    void showFront();

    /// The pane of notes, which is made when it is needed.
    NotesPane &notesPane();
    UnitsBar &unitsBar() const { return *units_; }

    /// Asks for the name of a job file; a test answers instead.
    std::function<std::optional<QString>(const SaveRequest &)> askJobFile;

private:
    enum class Reason
    {
        Asked,       ///< by the user: what goes wrong is said in a message
        FilesChanged ///< what goes wrong is shown without a message that has to be answered
    };
    /// How a report was when its job had made it: by which the user's own changes are known.
    using TextState = std::pair<quint64, qint64>;

    struct Made
    {
        ReportRecipe recipe;
        JobNotes notes;
        QString title;
        QString problem; ///< why it could not be made again; empty where it could
        TextState text;
        QStringList files;       ///< that it is made of
        bool isOutdated = false; ///< one of them has changed since
        bool isKept = false;     ///< the user has refused to give up his changes for those of the files
    };

    static bool keptFollowsFiles();
    static TextState stateOf(const UReportDoc &report);
    UReportDoc *inFront() const;
    Made *madeOf(const UDocument *report);
    const Made *madeOf(const UDocument *report) const;
    bool runAgain(UReportDoc &report, Reason reason);
    bool mayReplace(const UReportDoc &report, const TextState &made) const;
    LaunchHooks hooksFor(QStringList &files);
    void watch(const QStringList &files);
    void noteFailed(UReportDoc &report, const QString &error, Reason reason);
    void fileChanged(const QString &path);
    void runChanged();
    void showNotes();
    void showCount();
    void goToNote(int number, bool isInFile);
    void goToLine(UReportDoc &report, qint64 line);

    UXTPMDIFrameWnd &frame_;
    std::map<const UDocument *, Made> made_;
    FileWatch watch_;
    bool followsFiles_ = false;
    std::set<const UDocument *> changed_; ///< reports whose files have changed and that are not looked at yet
    QTimer changedTimer_;
    QTimer frontTimer_;
    UnitsBar *units_ = nullptr; ///< the frame's, as are the others
    QPointer<NotesPane> notes_; ///< null until it is needed
    QToolButton *count_;
    const UDocument *shown_ = nullptr; ///< the report that they are about
    quint64 shownState_ = 0;
    quint64 state_ = 1; ///< changes with every run
};

} // namespace kareport
