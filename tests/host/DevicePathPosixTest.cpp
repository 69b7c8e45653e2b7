#include "DevicePath.h"

#include "JobFolder.h"

#include <QFile>

#include <gtest/gtest.h>

#include <sys/stat.h>

namespace
{

TEST(DevicePathPosix, DevicesAndPipesAreOpenedByTheirNames)
{
    const JobFolder folder;
    const QString pipe = folder.path("pipe");
    ASSERT_EQ(mkfifo(QFile::encodeName(pipe).constData(), 0600), 0);
    EXPECT_EQ(kareport::devicePath(pipe), pipe);
    EXPECT_EQ(kareport::devicePath(QStringLiteral("/dev/null")), QStringLiteral("/dev/null"));
}

TEST(DevicePathPosix, FilesFoldersAndWhatIsMissingAreNone)
{
    const JobFolder folder;
    folder.put("file", "text");
    EXPECT_EQ(kareport::devicePath(folder.path("file")), QString());
    EXPECT_EQ(kareport::devicePath(folder.path()), QString());
    EXPECT_EQ(kareport::devicePath(folder.path("missing")), QString());
    EXPECT_EQ(kareport::devicePath(QStringLiteral("NUL")), QString()) << "a file like any other";
}

} // namespace
