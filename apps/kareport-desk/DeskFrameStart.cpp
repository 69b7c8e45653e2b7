// The start page, and what the window shows of its reports: titles, and the states of its commands.
#include "DeskFrame.h"

#include "DeskCommandIds.h"
#include "DeskTitles.h"
#include "Session.h"
#include "StartPage.h"
#include "UApplication.h"
#include "UReportDoc.h"
#include "WindowList.h"

#include <QAction>
#include <QApplication>
#include <QChildEvent>
#include <QDockWidget>
#include <QFileInfo>

#include <algorithm>
#include <utility>

void DeskFrame::makeStartPage()
{
    using namespace kareport;
    start_ = new StartPage(this);
    QList<QAction *> commands;
    for (const unsigned id :
         {unsigned(fileOpenCommand), unsigned(fileFromTemplateCommand), unsigned(fileNewCommand),
          unsigned(helpContentsCommand), unsigned(commandListCommand), unsigned(preferencesCommand)})
    {
        commands.append(CommandAction(id));
    }
    start_->setCommands(commands);
    start_->openFile = [this](const QString &path) { OpenFile(path); };
    setCentralWidget(start_);
    start_->refresh();
    start_->takeKeyboard();
}

void DeskFrame::updateStartPage()
{
    const QList<QDockWidget *> docks = findChildren<QDockWidget *>(QString(), Qt::FindDirectChildrenOnly);
    const bool isEmpty = std::none_of(docks.begin(), docks.end(),
                                      [](const QDockWidget *dock) { return !dock->isHidden() && !dock->isFloating(); });
    if (isEmpty != start_->isHidden()) {
        return;
    }
    start_->setVisible(isEmpty);
    const QWidget *focus = QApplication::focusWidget();
    if (isEmpty && isActiveWindow() && (focus == nullptr || focus == this || !focus->isVisible())) {
        start_->takeKeyboard();
    }
}

void DeskFrame::childEvent(QChildEvent *event)
{
    UXTPMDIFrameWnd::childEvent(event);
    if (event->added() && start_ != nullptr && qobject_cast<QDockWidget *>(event->child()) != nullptr) {
        start_->hide(); // before the pane is laid out: it gets all the room
        QMetaObject::invokeMethod(
            this, [this] { updateStartPage(); }, Qt::QueuedConnection);
    }
}

void DeskFrame::UpdateCommands()
{
    if (UApplication::Get() == nullptr) {
        return;
    }
    state_ = kareport::deskState(*this);
    state_.isMadeByJob = runs_.recipeInFront() != nullptr;
    UXTPMDIFrameWnd::UpdateCommands();
    for (QAction *action : findChildren<QAction *>(QString(), Qt::FindDirectChildrenOnly)) {
        if (const unsigned id = action->data().toUInt(); id != 0) {
            action->setStatusTip(action->isEnabled() ? QString() : kareport::whyDisabled(id, state_));
        }
    }
    kareport::showTitles(*this, GetCommandDocument());
}

bool DeskFrame::CanAct(unsigned command) const
{
    return kareport::canAct(command, state_);
}

QStringList DeskFrame::openFiles() const
{
    QStringList files;
    QString inFront;
    for (const UDocument *document : UApplication::Get()->GetDocuments()) {
        const auto *recipe = runs_.recipeOf(document);
        const QString file =
            document->GetPathName().isEmpty() && recipe != nullptr ? recipe->jobFile() : document->GetPathName();
        if (!file.isEmpty() && !files.contains(file)) {
            files.append(file);
            inFront = document == GetCommandDocument() ? file : inFront;
        }
    }
    if (files.removeOne(inFront)) {
        files.append(inFront);
    }
    return files;
}

void DeskFrame::RestoreSession()
{
    const QStringList files = kareport::lastSession();
    for (const QString &file : files) {
        if (QFileInfo(file).isFile()) { // what has been moved since is not asked about
            OpenFile(file);
        }
    }
    if (GetCommandDocument() != nullptr) {
        activateWindow(); // the editors of templates are windows of their own
    }
}

QString DeskFrame::OriginFile(const UDocument *report) const
{
    const kareport::ReportRecipe *recipe = runs_.recipeOf(report);
    if (recipe == nullptr) {
        return {};
    }
    const auto *file = std::get_if<QString>(&recipe->origin);
    return file != nullptr ? *file : std::get<kareport::TemplateJob>(recipe->origin).mainFile();
}
