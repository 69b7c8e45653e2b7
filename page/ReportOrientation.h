#pragma once

#include "Preferences.h"
#include "UPreviewDlg.h"
#include "ValueGuard.h"

namespace kareport
{

/// Lets the module's printer stand as the user has reports printed, upright or not, for as long as the guard lives.
inline auto reportOrientation()
{
    return ValueGuard(UPreviewDlg::IsModulePrinterOrientationPortrait(), IsReportPrinterSetToPortrait(),
                      UPreviewDlg::SetModulePrinterOrientationPortrait);
}

} // namespace kareport
