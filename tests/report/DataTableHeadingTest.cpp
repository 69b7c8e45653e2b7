#include "DataWriter.h"

#include "DataReport.h"

#include <gtest/gtest.h>

namespace
{

using markup::field;

TEST(DataTableHeading, TheChainageLabelReplacesChainageElseStation)
{
    struct Row
    {
        QString heading;
        QString label;
        QString expected;
        const char *reason;
    };
    const QString kp = QStringLiteral("KP");
    const Row rows[] = {
        {QStringLiteral("Chainage|Station"), kp, QStringLiteral("KP|Station"), "with both, Station stays"},
        {QStringLiteral("Station|Chainage"), kp, QStringLiteral("Station|KP"), "with both, in either order"},
        {QStringLiteral("Station|Stations"), kp, QStringLiteral("KP|KPs"), "every Station where there is no Chainage"},
        {QStringLiteral("Chainage Chainages"), kp, QStringLiteral("KP KPs"), "every Chainage"},
        {QStringLiteral("chainage|STATION"), kp, QStringLiteral("chainage|STATION"), "case matters"},
        {QStringLiteral("Point|North"), kp, QStringLiteral("Point|North"), "neither"},
        {QString(), kp, QString(), "nothing"},
        {QStringLiteral("Chainage|x"), QString(), QStringLiteral("|x"), "an empty label"},
        {QStringLiteral("Chainage"), QStringLiteral("Chainage of Station"), QStringLiteral("Chainage of Station"),
         "a label is not searched again"},
        {QStringLiteral("Station"), QStringLiteral("Station"), QStringLiteral("Station"), "the same again"},
    };
    for (const Row &expected : rows) {
        EXPECT_EQ(kareport::withChainageLabel(expected.heading, expected.label), expected.expected) << expected.reason;
    }
}

TEST(DataTableHeading, TheChainageLabelIsStationUnlessItIsSet)
{
    TableReport t({field("Chainage", "Chainage", "12"), field("Note", "Station", "8")}, "124");
    t.goToLine(2);
    EXPECT_EQ(t.write(0, 0, 1), reportLines(QStringLiteral("Station    |Station \n")))
        << "the column is not filled again";
    t.report.SetChainageLabel(QStringLiteral("Distance"));
    EXPECT_EQ(t.write(0, 0, 1), reportLines(QStringLiteral("Distance    |Station \n")));
}

TEST(DataTableHeading, NorthingAndEastingAreInTheJobsOrder)
{
    TableReport t(
        {field("Number", "Pt", "5"), field("Northing", "N", "7.3", "RIGHT"), field("Easting", "East", "6.3", "RIGHT")},
        "124");
    UDataObject &point = t.add("1");
    point.Set(2, 1.0);
    point.Set(3, 2.0);
    t.goToLine(2);
    EXPECT_EQ(t.write(0, 0, 1), reportLines(QStringLiteral("Pt   |      N|  East\n1    |  1.000| 2.000\n")));
    UJobSettings settings;
    settings.northEastOrder = 0;
    t.report.SetJobSettings(settings);
    ASSERT_TRUE(t.report.LoadTemplateTable(QStringLiteral("Points")));
    EXPECT_EQ(t.write(0, 0, 1), reportLines(QStringLiteral("Pt   |  East|      N\n1    | 2.000|  1.000\n")));
}

} // namespace
