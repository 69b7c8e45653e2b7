#include "UReportView.h"

#include "ExampleReport.h"
#include "PrintFixture.h"
#include "PrivateCups.h"
#include "StakeoutSheets.h"

#include <gtest/gtest.h>

namespace
{

TEST(PrintExamplePosix, EachSheetOfTheStakeoutListBeginsWithItsHeader)
{
    ExampleReport example("stakeout.json");
    expectStakeoutPrinted(example.report(), example.view());
}

TEST(PrintExamplePosix, TheStakeoutListGoesThroughAQueue)
{
    PrivateCups cups;
    if (!cups.isRunning()) {
        GTEST_SKIP() << cups.reason();
    }
    ExampleReport example("stakeout.json");
    kareport::setDefaultPrinter({});
    for (const bool portrait : {true, false}) {
        SetReportPrinterSetToPortrait(portrait);
        example.view().OnReportPrint(true);
        ASSERT_EQ(cups.arrivedPages(), pagesOfStakeout);
        expectStakeoutSheets(cups.arrived(), portrait ? "upright" : "lying");
    }
    SetReportPrinterSetToPortrait(true);
}

} // namespace
