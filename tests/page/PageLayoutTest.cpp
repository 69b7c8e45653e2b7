#include "PageLayout.h"

#include "DefaultPrinter.h"
#include "PageDefaults.h"
#include "PageMeasurement.h"
#include "Profile.h"

#include <gtest/gtest.h>

using kareport::PageLayout;

namespace
{

const QString marginsEntry = QStringLiteral("Report Margins");

/// A printer that is the same everywhere, and preferences that are forgotten.
struct FixedSurroundings
{
    FixedSurroundings()
    {
        kareport::setDefaultPrinter({kareport::PrinterSource::BuiltIn, kareport::PaperSize::A4, 600});
        kareport::setProfileStore(kareport::makeMemoryProfile());
    }
    ~FixedSurroundings()
    {
        kareport::setDefaultPrinter({});
        kareport::setProfileStore(kareport::makeMemoryProfile());
    }
    FixedSurroundings(const FixedSurroundings &) = delete;
    FixedSurroundings &operator=(const FixedSurroundings &) = delete;
};

TEST(PageLayout, BeginsWithTheDefaults)
{
    const PageLayout layout;
    EXPECT_EQ(layout.margins, QMargins(1000, 1000, 1200, 2000));
    EXPECT_EQ(layout.fontName, QStringLiteral("Lucida Console"));
    EXPECT_EQ(layout.fontSize, 8U);
    EXPECT_EQ(layout.geometry().linesPerPage, 72);
    EXPECT_EQ(layout.geometry().charsPerRow, 80);
    EXPECT_FALSE(layout.isGiven());
}

TEST(PageLayout, WhatIsGivenTakesThePlaceOfWhatIsMeasured)
{
    const FixedSurroundings surroundings;
    PageLayout measured;
    ASSERT_TRUE(measured.measure(kareport::reportPageDevice()));

    PageLayout layout;
    layout.give(50, std::nullopt);
    EXPECT_EQ(layout.geometry().linesPerPage, 50);
    EXPECT_EQ(layout.geometry().charsPerRow, 80) << "not measured yet";
    ASSERT_TRUE(layout.measure(kareport::reportPageDevice()));
    EXPECT_EQ(layout.geometry().linesPerPage, 50);
    EXPECT_EQ(layout.geometry().charsPerRow, measured.geometry().charsPerRow);
    EXPECT_EQ(layout.geometry().pageSize, measured.geometry().pageSize);

    layout.useGiven(false);
    EXPECT_EQ(layout.geometry().linesPerPage, 50) << "until it is measured";
    EXPECT_FALSE(layout.isGiven());
    EXPECT_EQ(layout.givenLinesPerPage(), 50);
    ASSERT_TRUE(layout.measure(kareport::reportPageDevice()));
    EXPECT_EQ(layout.geometry().linesPerPage, measured.geometry().linesPerPage);

    layout.useGiven(true);
    EXPECT_EQ(layout.geometry().linesPerPage, 50);
}

TEST(PageLayout, WithoutAPrinterTheFiguresStay)
{
    const FixedSurroundings surroundings;
    kareport::setDefaultPrinter({kareport::PrinterSource::None});
    PageLayout layout;
    EXPECT_FALSE(layout.measure(kareport::reportPageDevice()));
    EXPECT_EQ(layout.geometry().linesPerPage, kareport::defaultLinesPerPage);
    EXPECT_EQ(layout.geometry().pageSize, QSize(0, 0));
}

TEST(PageLayout, MarginsAreKeptInThePreferences)
{
    const FixedSurroundings surroundings;
    PageLayout layout;
    layout.load();
    EXPECT_EQ(GetProfileString(QString(), marginsEntry), QStringLiteral("1000, 1000, 1200, 2000"))
        << "the first report writes those of now";
    layout.margins = {1, 2, 3, 4};
    layout.save();
    PageLayout later;
    later.load();
    EXPECT_EQ(later.margins, QMargins(1, 2, 3, 4));
}

} // namespace
