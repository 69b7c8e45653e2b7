#pragma once

#include "Preferences.h"
#include "UPreviewDlg.h"
#include "ValueGuard.h"

namespace kareport
{

/// Sets the module's printer upright or not, as the user prints reports, for as long as the guard lives.
inline auto reportOrientation()
{
    return ValueGuard(UPreviewDlg::IsModulePrinterOrientationPortrait(), IsReportPrinterSetToPortrait(),
                      UPreviewDlg::SetModulePrinterOrientationPortrait);
}

} // namespace kareport
