#include "UPreviewDlg.h"

namespace
{

bool &isPortrait()
{
    static bool portrait = true;
    return portrait;
}

} // namespace

bool UPreviewDlg::IsModulePrinterOrientationPortrait()
{
    return isPortrait();
}

void UPreviewDlg::SetModulePrinterOrientationPortrait(bool portrait)
{
    isPortrait() = portrait;
}
