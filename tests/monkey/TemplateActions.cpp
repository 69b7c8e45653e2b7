#include "DeskActions.h"

#include "CommandList.h"
#include "OpenTemplate.h"
#include "TemplateFindBar.h"
#include "TemplateTextEdit.h"
#include "TemplateWindow.h"
#include "World.h"

#include <QAbstractItemView>
#include <QAction>
#include <QApplication>
#include <QCompleter>
#include <QFile>
#include <QLineEdit>
#include <QMenu>
#include <QMenuBar>
#include <QTest>

namespace monkey
{

namespace
{

using kareport::ListedCommand;
using kareport::TemplateWindow;

TemplateWindow *openWindow()
{
    for (QWidget *widget : QApplication::topLevelWidgets()) {
        auto *window = dynamic_cast<TemplateWindow *>(widget);
        if (window != nullptr && window->isVisible()) {
            return window;
        }
    }
    return nullptr;
}

void typeInto(TemplateWindow &window, Chance &chance)
{
    static const QStringList pieces = {
        QStringLiteral("<"),       QStringLiteral("</Field>"),    QStringLiteral("x"),  QStringLiteral("RIGHT"),
        QStringLiteral("<Field>"), QStringLiteral("<Sort>North"), QStringLiteral("\t"), QStringLiteral("12.3")};
    kareport::TemplateTextEdit &edit = window.edit();
    const int place = chance.below(edit.document()->characterCount());
    edit.select({place, place});
    QTest::keyClicks(&edit, pieces.at(chance.below(pieces.size())));
    if (edit.completer().popup()->isVisible()) {
        QTest::keyClick(edit.completer().popup(), chance.oneIn(2) ? Qt::Key_Return : Qt::Key_Escape);
    }
}

void find(TemplateWindow &window, Chance &chance)
{
    static const QStringList words = {QStringLiteral("north"), QStringLiteral("<"), QStringLiteral("Field>\n")};
    window.findBar().open();
    window.findBar().field().setText(words.at(chance.below(words.size())));
    window.findBar().replacement().setText(chance.oneIn(2) ? QString() : QStringLiteral("N"));
    if (chance.oneIn(6)) {
        window.findBar().replaceAll();
    } else {
        window.findBar().replace();
    }
    window.findBar().close();
}

/// Runs a command that can act; each says so or why not, and one that inserts something does.
void runTemplateCommand(World &world, TemplateWindow &window, Chance &chance)
{
    window.updateCommands();
    std::vector<ListedCommand> commands;
    for (const ListedCommand &command : kareport::listedCommands(*window.menuBar())) {
        if (command.action->isEnabled() != command.action->statusTip().isEmpty()) {
            world.fail(QStringLiteral("the command %1 is %2 and says \"%3\"")
                           .arg(command.name,
                                command.action->isEnabled() ? QStringLiteral("enabled") : QStringLiteral("disabled"),
                                command.action->statusTip()));
        }
        // Those of files ask for files.
        if (command.action->isEnabled() && !command.name.startsWith(u"File ")) {
            commands.push_back(command);
        }
    }
    const ListedCommand &command = chance.of(commands);
    world.did += command.name + u' ';
    const QString before = window.edit().wholeText();
    const std::size_t asked = world.answers().count();
    command.action->trigger();
    if (command.name.startsWith(u"Insert ") && world.answers().count() == asked && window.edit().wholeText() == before)
    {
        world.fail(command.name + QStringLiteral(" was enabled and has inserted nothing"));
    }
}

void saveTemplate(World &world, TemplateWindow &window)
{
    if (!window.save() || fileLimit() >= 0) {
        return;
    }
    QFile file(window.path());
    const QByteArray text = window.edit().wholeText().toUtf8();
    if (!file.open(QIODevice::ReadOnly) || file.readAll() != text) {
        world.fail(QStringLiteral("the template is not what was saved"));
    }
}

} // namespace

void editTemplate(World &world, Chance &chance)
{
    const QString path = world.folder().filePath(QStringLiteral("data/edited.xml"));
    if (!QFile::exists(path)) {
        const qint64 limit = fileLimit();
        limitFiles(-1);
        QFile::copy(world.folder().filePath(QStringLiteral("data/points.xml")), path);
        limitFiles(limit);
    }
    kareport::openTemplateAt(path);
    TemplateWindow *window = openWindow();
    if (window == nullptr) {
        return;
    }
    for (int step = 0; step < 5; ++step) {
        if (chance.oneIn(3)) {
            typeInto(*window, chance);
        } else if (chance.oneIn(6)) {
            find(*window, chance);
        } else {
            runTemplateCommand(world, *window, chance);
        }
        QCoreApplication::processEvents();
    }
    if (chance.oneIn(4)) {
        saveTemplate(world, *window);
    }
    if (chance.oneIn(2)) {
        window->close();
    }
}

} // namespace monkey
