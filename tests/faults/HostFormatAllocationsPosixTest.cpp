#include "FailingAllocation.h"
#include "ReportSubject.h"
#include "UFormatAngle.h"
#include "UFormatBearing.h"
#include "UJobSettings.h"

#include <gtest/gtest.h>

namespace
{

constexpr int beyondBuffer = 600; // characters: what the formatters begin with has to grow

struct Format
{
    const char *name;
    void (*format)(QString &text);
};

const Format formats[] = {
    {"UnitLengthToString",
     [](QString &text) { text = UJobSettings().UnitLengthToString(-12345.678, true, true, 3, -1, false); }},
    {"UnitLengthToString, wide",
     [](QString &text) { text = UJobSettings().UnitLengthToString(12345.678, true, true, 3, beyondBuffer, false); }},
    {"UnitLengthToString, with all its digits",
     [](QString &text) { text = UJobSettings().UnitLengthToString(1e300, false, true, 15, -1, false); }},
    {"StationToString",
     [](QString &text) {
         text =
             UJobSettings().StationToString(12345.678, true, true, false, 3, -1, true, true, false, true, true, true);
     }},
    {"StationToString, wide",
     [](QString &text) {
         text = UJobSettings().StationToString(-1e300, false, true, false, 3, beyondBuffer, true, true, false, true,
                                               false, true);
     }},
    {"ConvertToDisplayString, a quadrant",
     [](QString &text) { UFormatBearing(0, 1, 9, 1, 0).ConvertToDisplayString(1.25, text); }},
    {"ConvertToDisplayString, a circle",
     [](QString &text) { UFormatBearing(2, 0, 9, 1, 1).ConvertToDisplayString(1.25, text); }},
};

TEST(HostFormatAllocations, AValueIsShownWholeOrNotAtAll)
{
    for (const Format &row : formats) {
        QString whole;
        row.format(whole);
        ASSERT_GT(whole.size(), 8) << row.name;
        const qint64 allocations = failingEachAllocation([&](qint64 number) {
            QString text = QStringLiteral("earlier");
            bool hasFailed = false;
            {
                const FailingAllocation failing(number);
                EXPECT_NO_THROW(row.format(text)) << row.name << ' ' << number;
                hasFailed = failing.hasFailed();
            }
            EXPECT_EQ(text, hasFailed ? QString() : whole) << row.name << ' ' << number;
            return hasFailed && !testing::Test::HasFailure();
        });
        EXPECT_GE(allocations, 1) << row.name;
    }
}

TEST(HostFormatAllocations, ABearingInATextThatHasRoomNeedsNoMemory)
{
    for (const unsigned unit : {0U, 1U, 2U}) {
        for (const qint16 style : {qint16(0), qint16(1)}) {
            const UFormatBearing format(unit, style, 9, 1, 1);
            QString whole;
            format.ConvertToDisplayString(5.5, whole);
            QString text;
            text.reserve(64);
            {
                const FailingAllocation failing(1);
                format.ConvertToDisplayString(5.5, text);
                UFormatAngle::ConvertToDMSformatString('\xB0', '\'', '"', text);
                EXPECT_FALSE(failing.hasFailed());
            }
            EXPECT_EQ(text, whole);
        }
    }
}

TEST(HostFormatAllocations, MarksOfATextThatIsSharedAreReplacedOrNot)
{
    const QString shared = QString::fromUtf8("12\xC2\xB0"
                                             "30'15\"");
    QString text = shared;
    {
        const FailingAllocation failing(1);
        EXPECT_NO_THROW(UFormatAngle::ConvertToDMSformatString('d', 'm', 's', text));
        EXPECT_TRUE(failing.hasFailed());
    }
    EXPECT_EQ(text, shared);
    UFormatAngle::ConvertToDMSformatString('d', 'm', 's', text);
    EXPECT_EQ(text, QStringLiteral("12d30m15s"));
}

} // namespace
