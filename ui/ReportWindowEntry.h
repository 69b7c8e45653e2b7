#pragma once

#include "KaReportExport.h"

#include <QString>

class UReportDoc;

/// Makes an empty report whose lines are shown, as they are written, in a report window at the bottom of the main frame. The
/// report's own pane stays hidden, and the view that was active keeps the keyboard.
/// @param name            its title and file name, and the window's caption; a null text for none
/// @param headerFlag      whether every page begins with header and heading
/// @param externalEditor  whether the report is meant for the user's preferred editor
/// @return the report, owned by its document template, which owns the window; null when there is no template or no document
///         can be made. Without a main frame the report has no window
KAREPORT_EXPORT UReportDoc *CreateReportWindow(const QString &name, bool headerFlag, bool externalEditor);
