#include "UPreviewDlg.h"

#include <gtest/gtest.h>

namespace
{

TEST(UPreviewDlg, KeepsTheOrientationThatModulesPrintWith)
{
    EXPECT_TRUE(UPreviewDlg::IsModulePrinterOrientationPortrait()) << "upright at first";
    UPreviewDlg::SetModulePrinterOrientationPortrait(false);
    EXPECT_FALSE(UPreviewDlg::IsModulePrinterOrientationPortrait());
    UPreviewDlg::SetModulePrinterOrientationPortrait(true);
    EXPECT_TRUE(UPreviewDlg::IsModulePrinterOrientationPortrait());
}

} // namespace
