#pragma once

#include "KaReportExport.h"

/// The paper orientation that the host's modules print and preview with at the moment.
class KAREPORT_EXPORT UPreviewDlg
{
public:
    static bool IsModulePrinterOrientationPortrait();
    static void SetModulePrinterOrientationPortrait(bool portrait);
};
