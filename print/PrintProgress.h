#pragma once

#include <QElapsedTimer>
#include <QPointer>

#include <memory>

class QProgressDialog;
class QWidget;

namespace kareport
{

/// Keeps the program answering during a long job, in a window that shows how far it is and lets the user cancel it. A job
/// of a moment shows none.
class PrintProgress
{
public:
    PrintProgress(QWidget *parent, int expectedPages);
    ~PrintProgress();
    PrintProgress(const PrintProgress &) = delete;
    PrintProgress &operator=(const PrintProgress &) = delete;

    /// To be called for every page. @return whether other events have been handled meanwhile
    bool step(int page);
    bool isCancelled() const { return cancelled_; }

private:
    void show();

    QPointer<QWidget> parent_;
    QPointer<QProgressDialog> dialog_; ///< may be destroyed with its parent
    int expected_;
    bool shown_ = false;
    bool cancelled_ = false;
    QElapsedTimer sinceEvents_;
};

} // namespace kareport
