#pragma once

#include "KaReportExport.h"
#include "UDocTemplate.h"

#include <QRect>
#include <QString>

#include <memory>

class CViewPane;
class UReportDoc;

/// Makes sure that the module is loaded; does nothing else.
KAREPORT_EXPORT void LoadKaReport();

namespace kareport
{

/// Reports that the application continues, because the user has cancelled its exit or it was refused: a report whose
/// closing the exit has deferred closes normally again (`UReportDoc::SetCloseDocument`), and is closed now when that
/// was asked for meanwhile (`UReportDoc::CloseReportDocument`). What the host itself has deferred stays so. A main
/// frame whose `closeEvent` refuses calls it.
KAREPORT_EXPORT void noteExitCancelled();

/// A new document template for reports with panes and views of the host's own; with none given, reports are made without
/// windows. `ReportInitialTemplate` makes the usual one.
KAREPORT_EXPORT std::unique_ptr<UDocTemplate> makeReportTemplate(UDocTemplate::PaneFactory makePane = {},
                                                                 UDocTemplate::ViewFactory makeView = {});

} // namespace kareport

/// The application's document template for reports; null when there is no application or no such template.
KAREPORT_EXPORT UDocTemplate *GetReportTemplate();

/// Makes an empty report.
/// @param name            its title and file name; a null text for none
/// @param headerFlag      whether every page begins with header and heading
/// @param externalEditor  whether it is meant for the user's preferred editor; if it is and there is one, the report's
///                        own pane is not shown
/// @param pane            the pane that shows it; null for a new one
/// @param style, rect     window style and place of a new pane; rect may be null
/// @return the report, owned by its document template; null when there is no template or no document can be made
KAREPORT_EXPORT UReportDoc *CreateReport(const QString &name, bool headerFlag, bool externalEditor, CViewPane *pane,
                                         unsigned style, const QRect *rect);

/// Whether a report that wants the user's preferred editor gets it: one is chosen, preferred and installed. Looks the
/// preferences up each time.
KAREPORT_EXPORT bool IsUseExternalEditor(bool want);
