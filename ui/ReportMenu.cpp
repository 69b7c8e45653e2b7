#include "ReportMenu.h"

#include "ReportCommandIds.h"
#include "UXTPMDIFrameWnd.h"
#include "Xlate.h"

#include <QMenuBar>

namespace kareport
{

namespace
{

QMenu *addFileMenu(UXTPMDIFrameWnd &frame, QMenuBar &bar)
{
    QMenu *file = bar.addMenu(Xlate("&File"));
    frame.AddCommand(*file, fileNewCommand, Xlate("&New\tCtrl+N"));
    frame.AddCommand(*file, fileOpenCommand, Xlate("&Open...\tCtrl+O"));
    frame.AddCommand(*file, fileCloseCommand, Xlate("&Close"));
    frame.AddCommand(*file, fileSaveCommand, Xlate("&Save\tCtrl+S"));
    frame.AddCommand(*file, fileSaveAsCommand, Xlate("Save &As..."));
    frame.AddCommand(*file, updateTextCommand, Xlate("Update Text"));
    file->addSeparator();
    frame.AddCommand(*file, filePrintCommand, Xlate("&Print...\tCtrl+P"));
    frame.AddCommand(*file, printPreviewCommand, Xlate("Print Pre&view"));
    frame.AddCommand(*file, pageSetupCommand, Xlate("Pa&ge Setup..."));
    file->addSeparator();
    frame.AddCommand(*file, recentFileCommand, Xlate("Recent File"));
    file->addSeparator();
    frame.AddCommand(*file, exitCommand, Xlate("E&xit"));
    return file;
}

QMenu *addEditMenu(UXTPMDIFrameWnd &frame, QMenuBar &bar)
{
    QMenu *edit = bar.addMenu(Xlate("&Edit"));
    frame.AddCommand(*edit, undoCommand, Xlate("&Undo\tCtrl+Z"));
    edit->addSeparator();
    frame.AddCommand(*edit, cutCommand, Xlate("Cu&t\tCtrl+X"));
    frame.AddCommand(*edit, copyCommand, Xlate("&Copy\tCtrl+C"));
    frame.AddCommand(*edit, pasteCommand, Xlate("&Paste\tCtrl+V"));
    return edit;
}

QMenu *addViewMenu(UXTPMDIFrameWnd &frame, QMenuBar &bar)
{
    QMenu *view = bar.addMenu(Xlate("&View"));
    frame.AddCommand(*view, viewToolBarCommand, Xlate("&Toolbar"))->setCheckable(true);
    frame.AddCommand(*view, viewStatusBarCommand, Xlate("&Status Bar"))->setCheckable(true);
    return view;
}

QMenu *addWindowMenu(UXTPMDIFrameWnd &frame, QMenuBar &bar)
{
    QMenu *window = bar.addMenu(Xlate("&Window"));
    frame.AddCommand(*window, windowNewCommand, Xlate("&New Window"));
    frame.AddCommand(*window, windowCascadeCommand, Xlate("&Cascade"));
    frame.AddCommand(*window, windowTileHorizontallyCommand, Xlate("&Tile Horizontally"));
    frame.AddCommand(*window, windowTileVerticallyCommand, Xlate("Tile Vertically"));
    frame.AddCommand(*window, windowArrangeCommand, Xlate("&Arrange Icons"));
    return window;
}

QMenu *addHelpMenu(UXTPMDIFrameWnd &frame, QMenuBar &bar)
{
    QMenu *help = bar.addMenu(Xlate("&Help"));
    frame.AddCommand(*help, helpContentsCommand, Xlate("&Help"));
    frame.AddCommand(*help, helpAboutCommand, Xlate("&About..."));
    return help;
}

} // namespace

ReportMenu addReportMenu(UXTPMDIFrameWnd &frame, QMenuBar &bar)
{
    ReportMenu menu;
    menu.file = addFileMenu(frame, bar);
    menu.edit = addEditMenu(frame, bar);
    menu.view = addViewMenu(frame, bar);
    menu.window = addWindowMenu(frame, bar);
    menu.help = addHelpMenu(frame, bar);
    return menu;
}

} // namespace kareport
