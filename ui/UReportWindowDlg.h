#pragma once

#include "CPropertyPane.h"
#include "CommandTarget.h"
#include "KaReportExport.h"
#include "ReportWindow.h"

#include <QPointer>

#include <memory>
#include <optional>
#include <utility>

class CReportToolBar;
class QEvent;
class UReportDoc;
class UReportList;
class UReportView;

namespace kareport
{
class RememberedView;
class ReportWindowBody;
class ReportWindowCommands;
} // namespace kareport

/// The report window: a pane at the bottom of the main frame that shows the lines of a report as they are written, with
/// buttons to save it, to open it in its own view and to print it once it is marked active.
///
/// A window that is linked to a report (`UReportDoc::SetReportWindow`) is owned by it; any other by the code that made it. It
/// lives on while it is closed, and can be created again.
class KAREPORT_EXPORT UReportWindowDlg : public CPropertyPane,
                                         public kareport::ReportWindow,
                                         public kareport::CommandTarget
{
public:
    UReportWindowDlg();
    ~UReportWindowDlg() override;

    // --- Window -----------------------------------------------------------------------------------------------------

    /// Creates the window at the left of the main frame and shows it. One that is there already stays as it is.
    /// @param title         an empty one leaves the caption empty
    /// @param previousView  the view that was active before; null for none
    /// @return false, with no window, when there is no main frame
    bool Create(const QString &title, UView *previousView);
    bool createDocked(const QString &caption, UView *previousView) override;
    bool isCreated() const override { return !body_.isNull(); }
    /// Prepares the window that was just created: translates its texts, not active. @return 0
    long HandleInitDialog();
    /// Places the bar on top and the list under it. @param type  not looked at
    void OnSize(unsigned type, int cx, int cy);
    void showBar(bool show) override;
    /// Closes the window, which can be created again: its lines are gone.
    void ClosePane() override;
    void OnSysCommand(unsigned command, long parameter) override;
    /// The window is never one of the tabs of the documents.
    bool CanBeTabbedDocument() const override { return false; }
    CViewPane *GetOwningPane() override { return isCreated() ? this : nullptr; }
    UDocument *GetShownDocument() const override;
    /// Lets the commands of a report's menus act on the report of the window while it has the keyboard. What cannot be done
    /// with its lines is disabled.
    kareport::CommandTarget *GetCommandTarget() override;
    /// Ends what the previous view is in the middle of when the Escape key comes, pressed or released, to whatever in the
    /// window has the keyboard. @return whether it did, and the key is used up
    bool PreTranslateMessage(QEvent *event);

    // --- Content ----------------------------------------------------------------------------------------------------

    /// Links the report that the window shows, which may be null. The list gets its font, so that its columns align.
    void SetReportDoc(UReportDoc *report);
    /// The report; null when there is none or it was closed.
    UReportDoc *GetReportDoc() const;
    /// Adds a line exactly as it is and makes it the current one. Nothing while the window is not created.
    void WriteLine(const QString &line) override;
    /// Adds the lines of the report's text: without the blanks they begin with, and without empty ones. Lines that the list
    /// has stay.
    void UpdateDocumentData();
    /// The list of a window that is created; else null.
    UReportList *GetList() const;
    /// The bar of a window that is created; else null.
    CReportToolBar *GetToolBar() const;

    // --- Commands ---------------------------------------------------------------------------------------------------

    void setActive(bool active) override;
    /// What `setActive` was given last; false at first.
    bool IsActive() const { return active_; }
    /// Whether the user has closed the window and answered that the report is not to be saved. What is written or edited
    /// after the answer takes it back.
    bool IsGivenUp() const;
    void takeFocus() override;
    /// The view to go back to; null for none or when it was closed.
    UView *GetPreviousView() const;
    /// Brings the pane of that view to the front.
    void ActivatePreviousView();

    /// Asks for a file and saves the report there. A save that fails leaves the report modified.
    void OnSave();
    /// Closes the window and prints the report from a view of its own.
    void OnPrint();
    /// The command View\\Edit Report: `ShowReport`.
    void OnShowReport() { ShowReport(); }
    /// Closes the window and opens the report in its view or in the user's preferred editor.
    void ShowReport();
    /// Closes the window; when the report is modified, after asking whether to save it.
    void OnPressCloseButton();

    /// Enables Save while the window is active and its report modified, and marks the caption of an active window.
    void OnUpdateSave(kareport::CommandState &state);
    /// Enables Print while the window is active.
    void OnUpdatePrint(kareport::CommandState &state);
    /// Enables View\\Edit Report while the window is active.
    void OnUpdateShowReport(kareport::CommandState &state);
    const std::vector<kareport::Command> &commands() const override { return commands_; }

private:
    bool createAt(Qt::DockWidgetArea area, const QString &title, UView *previousView);
    void leaveForReport();
    void updateCommands();

    QPointer<kareport::ReportWindowBody> body_; ///< null while the window is not created
    std::vector<kareport::Command> commands_;
    std::unique_ptr<kareport::ReportWindowCommands> menuCommands_;
    UReportDoc *report_ = nullptr; ///< may have been destroyed
    std::unique_ptr<kareport::RememberedView> previousView_;
    bool active_ = false;
    std::optional<std::pair<quint64, qint64>> givenUp_; ///< the edits and the length of the report that was given up
    QObject life_; ///< to see whether a question to the user has outlasted the window
};
