#include "OpenTemplate.h"

#include "AppMessageBox.h"
#include "TemplateWindow.h"
#include "UApplication.h"
#include "Xlate.h"

#include <QFileInfo>
#include <QPointer>

#include <algorithm>

namespace kareport
{

namespace
{

std::vector<QPointer<TemplateWindow>> &windows()
{
    static std::vector<QPointer<TemplateWindow>> all;
    std::erase_if(all, [](const QPointer<TemplateWindow> &window) { return window.isNull(); });
    return all;
}

std::function<bool(const QString &)> &opener()
{
    static std::function<bool(const QString &)> open;
    return open;
}

QString sameName(const QString &path)
{
    const QString canonical = QFileInfo(path).canonicalFilePath();
    return canonical.isEmpty() ? QFileInfo(path).absoluteFilePath() : canonical;
}

void bringToFront(TemplateWindow &window)
{
    window.setWindowState(window.windowState() & ~Qt::WindowMinimized);
    window.show();
    window.raise();
    window.activateWindow();
}

} // namespace

bool openTemplateAt(const QString &path, qsizetype line, qsizetype column)
{
    TemplateWindow *window = nullptr;
    for (const auto &open : windows()) {
        window = sameName(open->path()) == sameName(path) ? open.data() : window;
    }
    if (window == nullptr) {
        auto made = std::make_unique<TemplateWindow>();
        const QString problem = made->load(QFileInfo(path).absoluteFilePath());
        if (!problem.isEmpty()) {
            AppMessageBox(Xlate("\"%1\" could not be opened: %2").arg(path, problem));
            return false;
        }
        window = made.release(); // it deletes itself when it is closed
        windows().emplace_back(window);
        if (UApplication::Get() != nullptr) {
            UApplication::Get()->AddToRecentFileList(path);
        }
    }
    bringToFront(*window);
    if (line > 0) {
        window->goTo(line, std::max<qsizetype>(column, 1));
    }
    return true;
}

std::vector<OpenTemplateFile> openTemplates()
{
    std::vector<OpenTemplateFile> open;
    for (const auto &window : windows()) {
        if (window->isVisible()) { // one that was closed goes a moment later
            open.push_back({window->path(), window->isWindowModified()});
        }
    }
    return open;
}

bool closeTemplateEditors()
{
    const std::vector<QPointer<TemplateWindow>> open = windows();
    return std::all_of(open.begin(), open.end(),
                       [](const QPointer<TemplateWindow> &window) { return window.isNull() || window->close(); });
}

void dropTemplateEditors()
{
    const std::vector<QPointer<TemplateWindow>> open = windows();
    for (const auto &window : open) {
        delete window.data();
    }
}

void setFileOpener(std::function<bool(const QString &path)> open)
{
    opener() = std::move(open);
}

bool openAnyFile(const QString &path)
{
    return opener() && opener()(path);
}

} // namespace kareport
