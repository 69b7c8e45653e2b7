#include "DefaultPrinter.h"

#include <gtest/gtest.h>

namespace
{

using namespace kareport;

TEST(DefaultPrinter, IsTheSystemsOrAPageOf600DotsPerInch)
{
    EXPECT_EQ(defaultPrinter().source, PrinterSource::SystemOrBuiltIn);
    EXPECT_EQ(defaultPrinter().paper, PaperSize::ByLocale);
    EXPECT_EQ(defaultPrinter().resolution, 600);
}

TEST(DefaultPrinter, CanBeSetByTheHost)
{
    setDefaultPrinter({PrinterSource::None, PaperSize::Legal, 1200});
    EXPECT_EQ(defaultPrinter().source, PrinterSource::None);
    EXPECT_EQ(defaultPrinter().paper, PaperSize::Legal);
    EXPECT_EQ(defaultPrinter().resolution, 1200);
    setDefaultPrinter({});
    EXPECT_EQ(defaultPrinter().source, PrinterSource::SystemOrBuiltIn);
}

} // namespace
