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

    /// Whether a program that was started for a report still runs, or is about to be said not to have started. A report that
    /// stands in one as a copy is held as long as any runs.
    bool holds(const UReportDoc &report) const;
    /// A report has been closed: what comes in its place in memory is another one.
    void forget(const UReportDoc *report);

private:
    struct Held
    {
        UReportDoc *report;
        qint64 process;
        bool isKept; ///< the user cannot close the report meanwhile
    };

    void start(const EditorLaunch &launch);
    void look();

    void showInstead(UReportDoc *report, const QString &program);

    std::vector<Held> held_;
    std::vector<const UReportDoc *> unstarted_; ///< whose editor could not be started, which is still to be said
    QTimer timer_;
};

} // namespace kareport
