#pragma once

#include "CommandTarget.h"

class UReportDoc;
class UReportView;
class UReportWindowDlg;

namespace kareport
{

/// The first view of a report that shows its text; null for none.
UReportView *firstReportView(const UReportDoc &report);

/// What the commands of a report's menus do while a report window has the keyboard: they act on the report that it shows, or
/// are disabled. None of them is passed on to a view of another report.
class ReportWindowCommands : public CommandTarget
{
public:
    /// @param window  must outlive this
    explicit ReportWindowCommands(UReportWindowDlg &window);

    const std::vector<Command> &commands() const override { return commands_; }

private:
    std::vector<Command> makeCommands();
    Command ofReport(unsigned id, void (ReportWindowCommands::*act)());
    Command ofView(unsigned id, void (*act)(UReportView &));
    Command ofLoadedView(unsigned id, void (*act)(UReportView &));
    bool hasReport() const;
    UReportView *view() const;

    void save();
    void saveAs();
    void close();
    void updateText();

    UReportWindowDlg &window_;
    std::vector<Command> commands_;
};

} // namespace kareport
