#pragma once

#include <QElapsedTimer>
#include <QString>

#include <functional>
#include <memory>

class QProgressDialog;
class QWidget;

namespace kareport
{

/// Shows how far work has come, and lets the user stop it. Work that is done in a moment shows nothing.
class WorkDialog
{
public:
    /// @param stop  called when the user wants the work to end
    WorkDialog(QWidget *parent, const std::function<void()> &stop);
    ~WorkDialog();
    WorkDialog(const WorkDialog &) = delete;
    WorkDialog &operator=(const WorkDialog &) = delete;

    /// Whether the work has taken long enough to be shown. Until then nothing keeps the user from the windows.
    bool isDue() const;
    /// @param percent  below 0 when that is not known
    void show(const QString &what, int percent);
    /// Takes the dialog away. It comes back with the next `show`.
    void hide();

private:
    std::unique_ptr<QProgressDialog> dialog_;
    QElapsedTimer sinceStart_;
};

} // namespace kareport
