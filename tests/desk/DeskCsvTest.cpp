#include "CommandLine.h"
#include "DeskFixture.h"

#include <QTimer>

#include <gtest/gtest.h>

namespace
{

TEST(DeskCsv, ThatIsCutShortWhileAJobReadsItIsSaidAndLeavesNoReport)
{
    constexpr int rows = 400'000; // enough for a file that is mapped
    const CommandLineFolder folder;
    const QByteArray csv = "Number,Northing\n" + QByteArray("1,12.5\n").repeated(rows);
    folder.put("points.csv", csv);
    Desk desk;
    desk.answer = MessageAnswer::No;
    bool isCut = false;
    // As soon as the windows have their turn, which is before the first row is printed.
    QTimer::singleShot(0, [&] { isCut = QFile::resize(folder.path("points.csv"), 1000); });
    EXPECT_FALSE(desk.frame->OpenFile(folder.path("job.json")));
    EXPECT_TRUE(isCut);
    ASSERT_EQ(desk.messages.size(), 1);
    EXPECT_TRUE(desk.messages.front().contains(QStringLiteral("points.csv"))) << desk.messages.front().toStdString();
    EXPECT_TRUE(desk.messages.front().contains(QStringLiteral("the file was cut short while it was read")))
        << desk.messages.front().toStdString();
    EXPECT_TRUE(Desk::reports().empty()) << "half a report is not opened";

    desk.messages.clear();
    folder.put("points.csv", "Number,Northing\n1,12.5\n2A,0\n");
    EXPECT_TRUE(desk.frame->OpenFile(folder.path("job.json"))) << "the desk goes on";
    EXPECT_TRUE(desk.messages.isEmpty());
    ASSERT_EQ(Desk::reports().size(), 1U);
    EXPECT_EQ(Desk::textOf(*Desk::reports().front()).toUtf8(), jobText());
}

} // namespace
