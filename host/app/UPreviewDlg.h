#pragma once

#include "KaReportExport.h"

/// The paper orientation that the host's modules print and preview with at the moment.
class KAREPORT_EXPORT UPreviewDlg
{
public:
    /// Whether paper is upright, as it does at first.
    static bool IsModulePrinterOrientationPortrait();
    /// Sets whether paper is upright.
    static void SetModulePrinterOrientationPortrait(bool portrait);
};
