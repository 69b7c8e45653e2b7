#pragma once

#include "ReportWindowFixture.h"

#include <QTabBar>

/// The tab of a pane in the rows of tabs of a frame: the row and its number. Null where the pane is not a tab.
struct PaneTab
{
    QTabBar *bar = nullptr;
    int index = -1;
};

PaneTab tabOf(const UXTPMDIFrameWnd &frame, const COneViewPane &pane);

bool clickTab(const UXTPMDIFrameWnd &frame, const COneViewPane &pane);

COneViewPane &dockPaneOf(const UReportDoc &report, std::size_t view = 0);

kareport::ReportEdit &editOf(const UReportDoc &report, std::size_t view = 0);

/// Puts a dock widget above its siblings, and leaves the tabs as they are: so docking and floating leave it at times.
void putAboveSiblings(QDockWidget &dock);

/// What is wrong with the active pane and view of a frame; empty when they are what the user sees and types into.
QString wrongWithActive(const UXTPMDIFrameWnd &frame);
