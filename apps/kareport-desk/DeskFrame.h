#pragma once

#include "UXTPMDIFrameWnd.h"

#include <functional>
#include <optional>

class QMenu;
class QToolBar;
class UDocument;

/// The main window of the desktop program.
class DeskFrame : public UXTPMDIFrameWnd
{
public:
    DeskFrame();
    ~DeskFrame() override;

    const std::vector<kareport::Command> &commands() const override { return commands_; }

    /// Opens a job, a saved report or rich text. @return false, after a message, when it cannot be opened
    bool OpenFile(const QString &path);

    /// Asks for a file to open; a test answers instead.
    std::function<std::optional<QString>()> askFile;

protected:
    void closeEvent(QCloseEvent *event) override;
    void dragEnterEvent(QDragEnterEvent *event) override;
    void dropEvent(QDropEvent *event) override;

private:
    std::vector<kareport::Command> makeCommands();
    void makeMenus();
    void fillRecentFiles();
    void newReport();
    void activate(UDocument *report);
    void open();
    void newWindow();
    void arrange(Qt::Orientation orientation);
    void cascade();
    void about();
    UDocument *activeDocument() const;
    void loadLayout();
    void saveLayout() const;

    std::vector<kareport::Command> commands_;
    QMenu *recentFiles_ = nullptr;
    QToolBar *toolBar_ = nullptr;
};
