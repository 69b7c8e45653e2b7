#pragma once

#include <QString>
#include <QTimer>

#include <vector>

class UReportDoc;

namespace kareport
{

struct EditorLaunch;

/// Starts the user's editor, and keeps a report from being closed while the editor that it was handed to is open, where the
/// user wants that.
class EditorHold
{
public:
    EditorHold();
    ~EditorHold();
    EditorHold(const EditorHold &) = delete;
    EditorHold &operator=(const EditorHold &) = delete;

    /// Whether a program that was started for a report still runs, or has failed to start and this is still to be
    /// shown. A report that is open in one as a copy is held as long as any runs.
    bool holds(const UReportDoc &report) const;
    /// A report has been closed: a new report may get its address.
    void forget(const UReportDoc *report);

private:
    struct Held
    {
        UReportDoc *report;
        qint64 process;
        bool isKept; ///< the user cannot close the report meanwhile
    };

    void start(const EditorLaunch &launch);
    void checkPrograms();

    void showInstead(UReportDoc *report, const QString &program);

    std::vector<Held> held_;
    std::vector<const UReportDoc *> unstarted_; ///< whose editor could not be started, which is still to be reported
    QTimer checkTimer_;
};

} // namespace kareport
