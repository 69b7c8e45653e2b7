#include "FileIdentity.h"

#include "JobFolder.h"

#include <QDir>

#include <gtest/gtest.h>

namespace
{

using kareport::fileIdentity;

TEST(FileIdentityOnWindows, TheCaseOfLettersMakesNoOtherFile)
{
    const JobFolder folder;
    folder.put("Report.txt", "text");
    EXPECT_NE(fileIdentity(folder.path("Report.txt")), QString());
    EXPECT_EQ(fileIdentity(folder.path("Report.txt")), fileIdentity(folder.path("REPORT.TXT")));
    EXPECT_EQ(fileIdentity(folder.path("Missing.txt")), fileIdentity(folder.path("MISSING.txt")));
    EXPECT_NE(fileIdentity(folder.path("Missing.txt")), fileIdentity(folder.path("Other.txt")));
}

TEST(FileIdentityOnWindows, OtherPathsToAFolderMakeNoOtherFile)
{
    const JobFolder folder;
    QDir(folder.path()).mkdir(QStringLiteral("inner"));
    const QString plain = folder.path("new.txt");
    EXPECT_EQ(fileIdentity(folder.path("inner/../new.txt")), fileIdentity(plain));
    EXPECT_EQ(fileIdentity(QDir::toNativeSeparators(plain)), fileIdentity(plain));
    EXPECT_EQ(fileIdentity(folder.path("not/there/../../new.txt")), fileIdentity(plain));
}

TEST(FileIdentityOnWindows, DevicesAndFoldersAreNoFiles)
{
    const JobFolder folder;
    EXPECT_EQ(fileIdentity(QStringLiteral("NUL")), QString());
    EXPECT_EQ(fileIdentity(folder.path("con.txt")), QString());
    EXPECT_EQ(fileIdentity(folder.path()), QString());
}

} // namespace
