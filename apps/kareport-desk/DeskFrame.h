#pragma once

#include "CommandReasons.h"
#include "DeskRuns.h"
#include "EditorHold.h"
#include "FileWatch.h"
#include "JobExport.h"
#include "OutputKind.h"
#include "Recovery.h"
#include "SaveAs.h"
#include "UDocument.h"
#include "UXTPMDIFrameWnd.h"

#include <QLatin1StringView>

#include <functional>
#include <memory>
#include <optional>

class QMenu;
class QToolBar;
class UReportDoc;

namespace kareport
{
class StartPage;
class WindowList;
struct ReadNotes;
struct TemplateJob;
} // namespace kareport

/// The main window of the desktop program.
class DeskFrame : public UXTPMDIFrameWnd
{
public:
    /// The timer that looks for reports that no window shows any more; each of its timeouts is a look.
    static constexpr QLatin1StringView unseenTimerName{"unseen"};

    DeskFrame();
    ~DeskFrame() override;

    const std::vector<kareport::Command> &commands() const override { return commands_; }

    /// Opens a job, a saved report, rich text, or a template to make a report from.
    /// The windows answer while a long report is read.
    /// @return false, after a message, when it cannot be opened; also when the user has stopped it. True for a report that is
    ///         being read already: it comes to the front when it is there
    bool OpenFile(const QString &path);
    /// Makes a report from a template and a data file. @return as `OpenFile`
    bool OpenTemplateJob(const kareport::TemplateJob &job);

    /// Offers what a program that crashed had open.
    void OfferLeftReports();

    /// Opens what was open when the program ended, where the user wants that.
    void RestoreSession();

    /// The job, or the data, that a report was made of; empty for one that was not.
    QString OriginFile(const UDocument *report) const;
    /// Shows the place of the guides that fits what the user looks at.
    void ShowHelp();

    void UpdateCommands() override;
    /// Report windows that are kept are tabs of one row, wherever the first one is.
    void DockBar(COneViewPane &pane, Qt::DockWidgetArea area) override;

    /// Told by the application what becomes of documents: their files are watched.
    void NoteDocumentEvent(UDocument &document, UDocument::DocumentEvent event);

    /// Asks for a file to open; a test answers instead.
    std::function<std::optional<QString>()> askFile;
    /// Asks for template and data, beginning with a template file that may be empty; a test answers instead.
    std::function<std::optional<kareport::TemplateJob>(const QString &templateFile)> askTemplate;

    /// The reports that jobs made, and how they are made again.
    kareport::DeskRuns &runs() { return runs_; }

    /// Asks where the values of a report go; a test answers instead.
    std::function<std::optional<QString>(const kareport::SaveRequest &)> askExport;
    /// Asks where a report is exported to; a test answers instead.
    std::function<std::optional<kareport::SaveChoice>(const kareport::SaveRequest &)> askExportFile;

protected:
    void SettlePanes() override;
    bool CanAct(unsigned command) const override;
    void childEvent(QChildEvent *event) override;
    void closeEvent(QCloseEvent *event) override;

private:
    std::vector<kareport::Command> makeCommands();
    void askNames();
    void makeMenus();
    void makeFileMenu(QMenu &file);
    void makeEditMenu(QMenu &edit);
    void makeToolBar();
    void makeStartPage();
    void fillRecentFiles();
    /// Shows the start page while no report is docked in the window.
    void updateStartPage();
    /// Opens files that were dropped: data is proposed for a new report.
    void openDropped(const QStringList &files);
    /// Replaces the report window of a job by the report, unless it is to be kept.
    void giveWay(UDocument *report);
    void keepReportWindow();
    void chooseCommand();
    /// Writes the report in front into a file of another kind.
    void exportAs(kareport::OutputKind kind);
    /// What is open and can be opened again.
    QStringList openFiles() const;

    void newReport();
    void open();
    void fromTemplate(const QString &templateFile);
    void askPreferences();
    /// Writes the values of the report in front into a file of another program.
    void exportValues();
    /// Shows what a file holds that its report does not show, if anything.
    static void sayWhatIsNotShown(const QString &path, const kareport::ReadNotes &notes);
    bool finishOpening(UDocument *report, const QString &error);
    /// Runs a job. What there is to note on its report is shown beside it.
    bool openJob(const kareport::ReportRecipe &recipe);
    /// The report of a file, which is opened where it is not open.
    UDocument *openReport(const QString &file, kareport::ReadNotes &notes);
    /// Opens a report by any means, while its file counts as being opened: what changes in it meanwhile is reported.
    UReportDoc *read(const QString &file, const std::function<UReportDoc *()> &open);
    /// Opens what a program that crashed had open. @return what could not be opened, and what the user did not wait for
    std::vector<kareport::KeptReport> reopen(const std::vector<kareport::KeptReport> &left);
    /// Brings a report to the front where it is shown, and shows it where it is not.
    void activate(UDocument *report);
    /// Closes reports that the user can no longer see or close, as after their window was closed. One that has changes
    /// is shown again, and so is one whose editor has been closed.
    void closeUnseen();
    void fileChanged(const QString &path);
    void loadAgain(UReportDoc &report);

    /// Brings the next report to the front, the first one after the last. @param step  1, or -1 for the one before
    void stepReport(int step);
    void newWindow();
    void arrange(Qt::Orientation orientation);
    void cascade();
    /// Docks all panes one after the other. @param join  joins a pane to the one before it
    void dockAll(const std::function<void(QDockWidget *before, QDockWidget *dock)> &join);
    void joinDocks(const std::function<void(QDockWidget *before, QDockWidget *dock)> &join);
    void about();
    void loadLayout();
    /// Called when all reports are closed.
    void saveLayout();

    std::vector<kareport::Command> commands_;
    QMenu *recentFiles_ = nullptr;
    QToolBar *toolBar_ = nullptr;
    kareport::StartPage *start_ = nullptr;
    std::unique_ptr<kareport::WindowList> windows_;
    bool keepsReportWindows_ = false;
    kareport::DeskState state_; ///< as of the last update of the commands
    QStringList reading_;       ///< files that are being opened now
    kareport::FileWatch files_;
    kareport::Recovery recovery_;
    kareport::EditorHold editors_;
    kareport::DeskRuns runs_{*this};
};
