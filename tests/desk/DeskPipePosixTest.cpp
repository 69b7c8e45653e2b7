#include "DeskFixture.h"
#include "JobFolder.h"

#include <gtest/gtest.h>

#include <sys/stat.h>

namespace
{

TEST(DeskPipe, IsNotWaitedFor)
{
    // Nothing writes into it: opening it would never return.
    const JobFolder folder;
    ASSERT_EQ(mkfifo(QFile::encodeName(folder.path("pipe.csv")).constData(), 0600), 0);
    ASSERT_EQ(mkfifo(QFile::encodeName(folder.path("pipe.json")).constData(), 0600), 0);
    folder.put("t.xml", "<ReportTemplate><Name>N</Name></ReportTemplate>");
    folder.put("job.json", R"({"report": [{"table": "T", "data": "d"}], "template": {"file": "t.xml", "name": "N"},
                               "data": {"d": {"csv": "pipe.csv"}}})");
    for (const char *name : {"pipe.csv", "pipe.json", "job.json"}) {
        Desk desk;
        desk.frame->askTemplate = [](const QString &) { return std::nullopt; };
        EXPECT_FALSE(desk.frame->OpenFile(folder.path(name))) << name;
        ASSERT_EQ(desk.messages.size(), 1) << name;
        EXPECT_TRUE(desk.messages.front().contains(QStringLiteral("a folder, a pipe or a device")))
            << name << ": " << desk.messages.front().toStdString();
        EXPECT_TRUE(Desk::reports().empty()) << name;
    }
}

} // namespace
