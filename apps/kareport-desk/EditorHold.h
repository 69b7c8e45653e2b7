#pragma once

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

private:
    struct Held
    {
        UReportDoc *report;
        qint64 process;
    };

    void start(const EditorLaunch &launch);
    void look();

    std::vector<Held> held_;
    QTimer timer_;
};

} // namespace kareport
