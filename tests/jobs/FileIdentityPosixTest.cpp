#include "FileIdentity.h"

#include "JobFolder.h"

#include <QFileInfo>

#include <gtest/gtest.h>

namespace
{

using kareport::fileIdentity;

TEST(FileIdentity, FilesInMissingFoldersAreToldApartAsWhenTheFoldersAreMade)
{
    struct Row
    {
        const char *left;
        const char *right;
        bool isSame;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"new/a", "new/a", true, "one name"},
        {"new/a", "./new/../new/a", true, "written otherwise"},
        {"new/a", "new/x/../a", true, "through a folder that is missing as well"},
        {"new/../a", "a", true, "out of the missing folder"},
        {"new/../there", "there", true, "to a file that is there"},
        {"new/a", "new/b", false, "two names"},
        {"new/a", "other/a", false, "two folders"},
        {"new/a", "new/a/a", false, "a file and one below"},
        {"new/a", "a", false, "one is in no folder"},
    };
    for (const Row &row : rows) {
        const JobFolder folder;
        folder.put("there", "x");
        EXPECT_EQ(fileIdentity(folder.path(row.left)) == fileIdentity(folder.path(row.right)), row.isSame)
            << row.reason;
        EXPECT_NE(fileIdentity(folder.path(row.left)), QString()) << row.reason;
    }
    const JobFolder folder;
    const QString before = fileIdentity(folder.path("new/deep/a"));
    ASSERT_TRUE(QDir(folder.path()).mkpath(QStringLiteral("new")));
    EXPECT_NE(fileIdentity(folder.path("new/deep/a")), before) << "the folder has an identity of its own now";
}

} // namespace
