#pragma once

#include "KaReportExport.h"

#include <QString>

/// The font size of new reports in points: the user's preference, 8 when there is none.
KAREPORT_EXPORT unsigned GetReportFontSize();
/// Keeps the font size of new reports as the user's preference.
KAREPORT_EXPORT void SetReportFontSize(unsigned points);

/// Whether reports are printed upright; true when the user has not chosen.
KAREPORT_EXPORT bool IsReportPrinterSetToPortrait();
/// Keeps whether reports are printed upright as the user's preference.
KAREPORT_EXPORT void SetReportPrinterSetToPortrait(bool portrait);

/// Non-zero when the user wants reports in the preferred editor instead of the report view.
KAREPORT_EXPORT int GetUsePreferredReportEditorFlag();
/// Keeps as the user's preference whether reports go to the preferred editor.
KAREPORT_EXPORT void SetUsePreferredReportEditorFlag(bool use);
/// The name of the profile entry that holds the preferred editor's full path.
KAREPORT_EXPORT QString GetPreferredReportEditorRegKey();
