#include "Actions.h"

#include "COneViewPane.h"
#include "CReportToolBar.h"
#include "DefaultPrinter.h"
#include "DeskActions.h"
#include "DeskCommandIds.h"
#include "DeskFrame.h"
#include "DeskPreferences.h"
#include "HelpWindow.h"
#include "PaneDock.h"
#include "ReportEdit.h"
#include "ReportResources.h"
#include "SheetColumn.h"
#include "StartPage.h"
#include "UReportDoc.h"
#include "UReportView.h"
#include "UReportWindowDlg.h"
#include "World.h"

#include <QAction>
#include <QApplication>
#include <QDropEvent>
#include <QFile>
#include <QMenu>
#include <QMenuBar>
#include <QMimeData>
#include <QTabBar>
#include <QTest>
#include <QToolButton>
#include <QUrl>

#include <algorithm>
#include <cstring>

namespace monkey
{

void aimKeyboard(World &world)
{
    if (const auto *report = dynamic_cast<const UReportDoc *>(world.frame().GetCommandDocument())) {
        world.mayChange.insert(report);
    }
    if (const UReportView *view = World::viewWithKeyboard()) {
        world.mayChange.insert(view->GetDocument());
    }
}

namespace
{

QWidget *keyboardOf(World &world)
{
    QWidget *focus = QApplication::focusWidget();
    return focus != nullptr ? focus : &world.frame();
}

void typeText(World &world, Chance &chance)
{
    static const QStringList words = {QStringLiteral("a"),   QStringLiteral("Elevation 12.5"),
                                      QStringLiteral("x y"), QStringLiteral("{\\rtf"),
                                      QStringLiteral("0"),   QStringLiteral("  ")};
    aimKeyboard(world);
    const QString &text = words.at(chance.below(words.size()));
    world.did = u'"' + text + u'"';
    QTest::keyClicks(keyboardOf(world), text);
}

void pressKey(World &world, Chance &chance)
{
    struct Press
    {
        Qt::Key key;
        Qt::KeyboardModifiers modifiers;
    };
    static const std::vector<Press> presses = {
        {Qt::Key_Return, Qt::NoModifier},    {Qt::Key_Return, Qt::NoModifier},    {Qt::Key_Backspace, Qt::NoModifier},
        {Qt::Key_Delete, Qt::NoModifier},    {Qt::Key_Z, Qt::ControlModifier},    {Qt::Key_Z, Qt::ControlModifier},
        {Qt::Key_Y, Qt::ControlModifier},    {Qt::Key_A, Qt::ControlModifier},    {Qt::Key_C, Qt::ControlModifier},
        {Qt::Key_X, Qt::ControlModifier},    {Qt::Key_V, Qt::ControlModifier},    {Qt::Key_V, Qt::ControlModifier},
        {Qt::Key_Home, Qt::ControlModifier}, {Qt::Key_End, Qt::ControlModifier},  {Qt::Key_Down, Qt::NoModifier},
        {Qt::Key_Up, Qt::NoModifier},        {Qt::Key_Down, Qt::ShiftModifier},   {Qt::Key_PageDown, Qt::ShiftModifier},
        {Qt::Key_PageDown, Qt::NoModifier},  {Qt::Key_Left, Qt::NoModifier},      {Qt::Key_F, Qt::ControlModifier},
        {Qt::Key_G, Qt::ControlModifier},    {Qt::Key_F3, Qt::NoModifier},        {Qt::Key_Escape, Qt::NoModifier},
        {Qt::Key_Tab, Qt::NoModifier},       {Qt::Key_Plus, Qt::ControlModifier}, {Qt::Key_0, Qt::ControlModifier},
        {Qt::Key_Return, Qt::ShiftModifier}};
    aimKeyboard(world);
    const Press press = presses[static_cast<std::size_t>(chance.below(static_cast<qsizetype>(presses.size())))];
    world.did = QKeySequence(static_cast<int>(press.key) | static_cast<int>(press.modifiers)).toString();
    QTest::keyClick(keyboardOf(world), press.key, press.modifiers);
}

/// All that can be chosen in a menu and the menus below it.
void collect(const QMenu &menu, QList<QAction *> &actions)
{
    for (QAction *action : menu.actions()) {
        if (action->menu() != nullptr) {
            collect(*action->menu(), actions);
        } else if (!action->isSeparator() && action->isEnabled()) {
            actions.append(action);
        }
    }
}

/// The guide is read and closed again: what follows is done in the main window.
void closeGuide(World &world)
{
    for (QObject *child : world.frame().children()) {
        if (auto *guide = dynamic_cast<kareport::HelpWindow *>(child); guide != nullptr && guide->isVisible()) {
            guide->close();
            world.frame().activateWindow();
        }
    }
}

void chooseFromMenu(World &world, Chance &chance)
{
    QList<QAction *> actions;
    for (QAction *action : world.frame().menuBar()->actions()) {
        if (QMenu *menu = action->menu()) {
            Q_EMIT menu->aboutToShow();
            collect(*menu, actions);
        }
    }
    if (actions.isEmpty()) {
        return;
    }
    QAction *action = chance.of(actions);
    if (action->data().toUInt() == kareport::exitCommand) {
        return; // which is a step of its own
    }
    aimKeyboard(world);
    world.did = action->text();
    action->trigger();
    closeGuide(world);
}

void runCommand(World &world, unsigned id)
{
    world.frame().UpdateCommands();
    QAction *action = world.frame().CommandAction(id);
    world.did = action->text();
    if (action->isEnabled()) {
        action->trigger();
    }
}

void save(World &world, Chance &chance)
{
    runCommand(world, chance.oneIn(2) ? kareport::fileSaveCommand : kareport::fileSaveAsCommand);
}

void closeReport(World &world, Chance & /*chance*/)
{
    runCommand(world, kareport::fileCloseCommand);
}

void newWindow(World &world, Chance & /*chance*/)
{
    runCommand(world, kareport::windowNewCommand);
}

void openFile(World &world, Chance &chance)
{
    const QStringList names = world.files().entryList(QDir::Files);
    if (names.isEmpty()) {
        return;
    }
    const QString name = names.at(chance.below(names.size()));
    world.did = name;
    if (!name.endsWith(u".xml")) {
        world.frame().OpenFile(world.files().filePath(name));
    }
}

void runJob(World &world, Chance &chance)
{
    static const QStringList jobs = {QStringLiteral("long.json"),  QStringLiteral("short.json"),
                                     QStringLiteral("same.json"),  QStringLiteral("empty.json"),
                                     QStringLiteral("wrong.json"), QStringLiteral("points.json")};
    world.did = jobs.at(chance.below(jobs.size()));
    world.frame().OpenFile(world.files().filePath(world.did));
}

void openLong(World &world, Chance & /*chance*/)
{
    world.openLong();
}

void reopen(World &world, Chance &chance)
{
    world.reopen(chance);
}

void dropFile(World &world, Chance &chance)
{
    const QStringList names = world.files().entryList(QDir::Files);
    if (names.isEmpty()) {
        return;
    }
    world.did = names.at(chance.below(names.size()));
    QMimeData data;
    data.setUrls({QUrl::fromLocalFile(world.files().filePath(world.did))});
    QDropEvent event(QPointF(10, 10), Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(&world.frame(), &event);
}

void clickTab(World &world, Chance &chance)
{
    QList<QTabBar *> bars;
    for (QTabBar *bar : world.frame().findChildren<QTabBar *>()) {
        if (bar->isVisible() && bar->count() > 1) {
            bars.append(bar);
        }
    }
    if (bars.isEmpty()) {
        return;
    }
    QTabBar *bar = chance.of(bars);
    const int tab = chance.below(bar->count());
    world.did = bar->tabText(tab);
    QTest::mouseClick(bar, Qt::LeftButton, Qt::NoModifier, bar->tabRect(tab).center());
}

void middleClickTab(World &world, Chance &chance)
{
    for (QTabBar *bar : world.frame().findChildren<QTabBar *>()) {
        if (bar->isVisible() && bar->count() > 1) {
            const int tab = chance.below(bar->count());
            world.did = bar->tabText(tab);
            QTest::mouseClick(bar, Qt::MiddleButton, Qt::NoModifier, bar->tabRect(tab).center());
            return;
        }
    }
}

/// Chooses an entry of the start page, where that is shown.
void useStartPage(World &world, Chance &chance)
{
    const auto *page = dynamic_cast<const kareport::StartPage *>(world.frame().centralWidget());
    if (page == nullptr || !page->isVisible()) {
        return;
    }
    kareport::EntryList &list = chance.oneIn(3) ? page->exampleList() : page->recentList();
    if (list.count() == 0) {
        return;
    }
    const int row = chance.below(list.count());
    world.did = list.item(row)->text();
    list.setCurrentRow(row);
    QTest::keyClick(&list, Qt::Key_Return);
    QCoreApplication::processEvents();
}

void clickText(World & /*world*/, Chance &chance)
{
    const std::vector<UReportView *> views = World::viewsOnScreen();
    if (!views.empty()) {
        QWidget *text =
            views[static_cast<std::size_t>(chance.below(static_cast<qsizetype>(views.size())))]->GetEdit().viewport();
        QTest::mouseClick(text, Qt::LeftButton, Qt::NoModifier,
                          QPoint(chance.below(qMax(1, text->width())), chance.below(qMax(1, text->height()))));
    }
}

void clickSheet(World & /*world*/, Chance &chance)
{
    QList<kareport::SheetColumn *> columns;
    for (UReportView *view : World::viewsOnScreen()) {
        for (auto *area : view->GetWidget()->findChildren<QAbstractScrollArea *>()) {
            auto *column = dynamic_cast<kareport::SheetColumn *>(area);
            if (column != nullptr && column->isVisible()) {
                columns.append(column);
            }
        }
    }
    if (!columns.isEmpty()) {
        QWidget *sheets = chance.of(columns)->viewport();
        QTest::mouseClick(sheets, Qt::LeftButton, chance.oneIn(3) ? Qt::ShiftModifier : Qt::NoModifier,
                          QPoint(chance.below(qMax(1, sheets->width())), chance.below(qMax(1, sheets->height()))));
    }
}

void showSheets(World &world, Chance &chance)
{
    runCommand(world, chance.oneIn(2) ? kareport::viewSheetsCommand : kareport::viewSheetsBesideCommand);
}

QList<QDockWidget *> shownDocks(const World &world)
{
    QList<QDockWidget *> docks;
    for (QDockWidget *dock : world.frame().findChildren<QDockWidget *>()) {
        if (dock->isVisible() && !dock->visibleRegion().isEmpty()) {
            docks.append(dock);
        }
    }
    return docks;
}

void floatPane(World &world, Chance &chance)
{
    QList<QDockWidget *> docks = shownDocks(world);
    if (docks.isEmpty()) {
        return;
    }
    // As a double click on its title does.
    QDockWidget *dock = chance.of(docks);
    world.did = dock->windowTitle();
    dock->setFloating(!dock->isFloating());
}

void dragPane(World &world, Chance &chance)
{
    QList<QDockWidget *> docks = shownDocks(world);
    if (docks.isEmpty()) {
        return;
    }
    QDockWidget *dock = chance.of(docks);
    world.did = dock->windowTitle();
    const QPoint title(40, 8);
    const QPoint way(chance.below(400) - 200, chance.below(400) - 200);
    QTest::mousePress(dock, Qt::LeftButton, Qt::NoModifier, title);
    for (int part = 1; part <= 4; ++part) {
        QTest::mouseMove(dock, title + way * part / 4);
    }
    QTest::mouseRelease(dock, Qt::LeftButton, Qt::NoModifier, title + way);
}

void closePane(World &world, Chance &chance)
{
    QList<QDockWidget *> docks = shownDocks(world);
    if (docks.isEmpty()) {
        return;
    }
    QDockWidget *dock = chance.of(docks);
    world.did = dock->windowTitle();
    if (auto *button = dock->findChild<QAbstractButton *>(QStringLiteral("qt_dockwidget_closebutton"))) {
        button->click();
    }
}

void pressWindowButton(World &world, Chance &chance)
{
    QList<QToolButton *> buttons;
    for (UReportDoc *report : World::reports()) {
        auto *window = dynamic_cast<UReportWindowDlg *>(report->GetReportWindow());
        if (window == nullptr || window->GetToolBar() == nullptr) {
            continue;
        }
        for (QToolButton *button : window->GetToolBar()->findChildren<QToolButton *>()) {
            if (button->isVisible() && button->isEnabled()) {
                buttons.append(button);
            }
        }
    }
    if (!buttons.isEmpty()) {
        QToolButton *button = chance.of(buttons);
        world.did = button->toolTip();
        button->click();
    }
}

void changeFile(World &world, Chance &chance)
{
    QStringList paths;
    for (const UReportDoc *report : World::reports()) {
        if (!report->GetPathName().isEmpty()) {
            paths.append(report->GetPathName());
        }
    }
    if (paths.isEmpty()) {
        return;
    }
    const QString path = paths.at(chance.below(paths.size()));
    world.did = path;
    if (chance.oneIn(4)) {
        QFile::remove(path);
    } else {
        QFile file(path);
        if (file.open(QIODevice::Append)) {
            file.write("written by another program\r\r\n");
        }
    }
    world.wait(450);
}

void letTimePass(World &world, Chance &chance)
{
    world.wait(chance.oneIn(4) ? 2500 : 650);
}

void chooseEditor(World &world, Chance &chance)
{
    kareport::DeskPreferences preferences = kareport::loadPreferences();
    preferences.usesEditor = chance.oneIn(3);
    preferences.editor =
        world.folder().filePath(chance.oneIn(2) ? QStringLiteral("bin/editor") : QStringLiteral("bin/winword"));
    world.did = preferences.usesEditor ? preferences.editor : QStringLiteral("none");
    kareport::savePreferences(preferences);
}

void endEditor(World &world, Chance & /*chance*/)
{
    world.did = QString::number(endEditors(world.folder()));
    world.wait(650);
}

void exitDesk(World &world, Chance &chance)
{
    if (chance.oneIn(2)) {
        runCommand(world, kareport::exitCommand);
    } else {
        world.frame().close();
    }
    if (!world.frame().isVisible()) {
        world.did = QStringLiteral("ended, started again");
        world.restart();
    }
}

void keep(World &world, Chance & /*chance*/)
{
    world.keep();
}

void crash(World &world, Chance &chance)
{
    if (chance.oneIn(2)) {
        world.did = QStringLiteral("crash");
        world.crash();
    }
}

void failFiles(World & /*world*/, Chance &chance)
{
    limitFiles(chance.oneIn(3) ? chance.below(200) : -1);
}

void failPrinter(World &world, Chance &chance)
{
    kareport::DefaultPrinter printer = kareport::defaultPrinter();
    printer.source = chance.oneIn(2) ? kareport::PrinterSource::None : kareport::PrinterSource::SystemOrBuiltIn;
    kareport::setDefaultPrinter(printer);
    world.did = printer.source == kareport::PrinterSource::None ? QStringLiteral("no printer") : QString();
}

void failEditor(World &world, Chance & /*chance*/)
{
    kareport::DeskPreferences preferences = kareport::loadPreferences();
    preferences.usesEditor = true;
    preferences.editor = world.files().filePath(QStringLiteral("plain.txt")); // a file that is not a program
    kareport::savePreferences(preferences);
}

} // namespace

const std::vector<Action> &allActions()
{
    static const std::vector<Action> actions = {
        {"type", 14, false, typeText},
        {"key", 22, false, pressKey},
        {"menu", 10, false, chooseFromMenu},
        {"save", 5, false, save},
        {"close", 3, false, closeReport},
        {"new-window", 3, false, newWindow},
        {"open", 5, false, openFile},
        {"job", 6, false, runJob},
        {"open-long", 1, false, openLong},
        {"reopen", 3, false, reopen},
        {"drop", 2, false, dropFile},
        {"tab", 8, false, clickTab},
        {"click", 6, false, clickText},
        {"click-sheet", 3, false, clickSheet},
        {"sheets", 2, false, showSheets},
        {"float", 2, false, floatPane},
        {"drag", 2, false, dragPane},
        {"close-pane", 5, false, closePane},
        {"window-button", 6, false, pressWindowButton},
        {"change-file", 1, false, changeFile},
        {"time", 1, false, letTimePass},
        {"editor", 1, false, chooseEditor},
        {"end-editor", 1, false, endEditor},
        {"keep", 6, false, keep},
        {"middle-click", 2, false, middleClickTab},
        {"start-page", 3, false, useStartPage},
        {"exit", 2, false, exitDesk},
        {"crash", 1, false, crash},
        {"template", 2, false, editTemplate},
        {"import", 3, false, importData},
        {"units", 3, false, chooseUnits},
        {"note", 3, false, goToNote},
        {"change-data", 1, false, changeData},
        {"fail-files", 2, true, failFiles},
        {"fail-printer", 1, true, failPrinter},
        {"fail-editor", 1, true, failEditor},
    };
    return actions;
}

const Action *actionOf(const char *name)
{
    const auto found = std::find_if(allActions().begin(), allActions().end(),
                                    [name](const Action &action) { return std::strcmp(action.name, name) == 0; });
    return found == allActions().end() ? nullptr : &*found;
}

} // namespace monkey
