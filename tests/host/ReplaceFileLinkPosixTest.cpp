#include "LinkOwnersPosix.h"
#include "LinkTarget.h"
#include "ReplaceFile.h"
#include "UnfinishedFile.h"

#include "JobFolder.h"

#include <QFile>
#include <QFileInfo>

#include <gtest/gtest.h>

#include <sys/stat.h>
#include <unistd.h>

namespace
{

using kareport::linkTarget;
using kareport::mayFollowLink;
using kareport::replaceFile;
using kareport::UnfinishedFile;

TEST(ReplaceFileLink, ALinkOfAStrangerInAFolderOfAllIsNotFollowed)
{
    constexpr unsigned root = 0;
    constexpr unsigned we = 1000;
    constexpr unsigned stranger = 1001;
    struct Row
    {
        unsigned folderMode;
        unsigned folderOwner;
        unsigned linkOwner;
        bool isFollowed;
        const char *reason;
    };
    constexpr Row rows[] = {
        {01777, root, stranger, false, "a stranger's link in the folder for temporary files"},
        {01777, root, we, true, "our own"},
        {01777, root, root, true, "the folder's owner could do anything to it"},
        {01777, stranger, stranger, true, "a stranger's own folder"},
        {00777, root, stranger, true, "not sticky: the link could have been put there by anybody in our name"},
        {01775, root, stranger, true, "not everybody can write there"},
        {01757, root, stranger, false, "the group's rights do not count"},
        {00755, stranger, stranger, true, "a folder that only its owner writes to"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(mayFollowLink(row.folderMode, row.folderOwner, row.linkOwner, we), row.isFollowed) << row.reason;
    }
    EXPECT_FALSE(mayFollowLink(01777, we, stranger, root)) << "root least of all";
}

TEST(ReplaceFileLink, TheTargetIsWhatTheSystemOpens)
{
    const JobFolder folder;
    const QDir dir(QFileInfo(folder.path()).canonicalFilePath());
    ASSERT_TRUE(dir.mkpath(QStringLiteral("a/b")));
    folder.put("a/b/file", "x");
    struct Link
    {
        const char *target;
        const char *name;
    };
    constexpr Link links[] = {{"a/b/file", "toFile"},    {"a/b", "toFolder"},    {"toFile", "twice"},
                              {"../a/./b/file", "a/up"}, {"a/new", "toMissing"}, {"loop", "loop"},
                              {"missing/x", "toNowhere"}};
    for (const Link &link : links) {
        ASSERT_EQ(symlink(link.target, qPrintable(dir.filePath(QString::fromUtf8(link.name)))), 0);
    }
    struct Row
    {
        const char *path;
        const char *target; ///< null when the path itself is the answer
        const char *reason;
    };
    constexpr Row rows[] = {
        {"a/b/file", "a/b/file", "no link"},
        {"toFile", "a/b/file", "a link"},
        {"toFolder/file", "a/b/file", "a link on the way"},
        {"toFolder/../b/file", "a/b/file", "above what a link leads to, not above the link"},
        {"twice", "a/b/file", "a link to a link"},
        {"a/up", "a/b/file", "a link with steps up"},
        {"a//b/./file", "a/b/file", "steps that lead nowhere"},
        {"toMissing", "a/new", "a file that is not there yet"},
        {"toFolder/new", "a/b/new", "the same in a folder behind a link"},
        {"new", "new", "a new file"},
        {"loop", nullptr, "the system will say what is wrong"},
        {"toNowhere", nullptr, "a folder that is not there"},
    };
    for (const Row &row : rows) {
        const QString path = dir.filePath(QString::fromUtf8(row.path));
        EXPECT_EQ(linkTarget(path), row.target == nullptr ? path : dir.filePath(QString::fromUtf8(row.target)))
            << row.reason;
    }
    EXPECT_EQ(linkTarget(QString()), QString());
}

TEST(ReplaceFileLink, AStrangersLinkKeepsItsTarget)
{
    if (geteuid() != 0) {
        GTEST_SKIP() << "only root can give a link to another user";
    }
    constexpr uid_t stranger = 65534;
    const JobFolder folder;
    ASSERT_EQ(mkdir(qPrintable(folder.path("shared")), 0777), 0);
    ASSERT_EQ(chmod(qPrintable(folder.path("shared")), 01777), 0);
    ASSERT_TRUE(QDir(folder.path()).mkdir(QStringLiteral("own")));
    folder.put("own/file.txt", "precious");
    for (const char *link : {"shared/file.txt", "shared/folder"}) {
        const bool isFile = QByteArray(link).endsWith(".txt");
        ASSERT_EQ(symlink(isFile ? "../own/file.txt" : "../own", qPrintable(folder.path(link))), 0);
        ASSERT_EQ(lchown(qPrintable(folder.path(link)), stranger, stranger), 0);
        QString error;
        const QString path = folder.path(isFile ? link : "shared/folder/file.txt");
        EXPECT_FALSE(replaceFile(
            path, [](QIODevice &device) { return device.write("new") == 3; }, &error))
            << link;
        EXPECT_EQ(error, QStringLiteral("the link \"%1\" belongs to another user and is in a folder that everybody can "
                                        "write to")
                             .arg(QFileInfo(folder.path("shared")).canonicalFilePath() + u'/' +
                                  QString::fromUtf8(link).section(u'/', 1)));
        EXPECT_EQ(folder.bytesOf("own/file.txt"), "precious") << link;
    }
    EXPECT_EQ(QDir(folder.path("own")).entryList(QDir::Files | QDir::Hidden), QStringList{QStringLiteral("file.txt")});
}

TEST(ReplaceFileLink, AFileWithANameIsTakenAwayWhenTheProgramIsEnded)
{
    const JobFolder folder;
    UnfinishedFile::remove(); // there is none
    QFile first(folder.path("out.rep.abcdef"));
    ASSERT_TRUE(first.open(QIODevice::WriteOnly));
    folder.put("other", "kept");
    {
        const UnfinishedFile unfinished(first.handle());
        const UnfinishedFile second(2); // only one at a time
        UnfinishedFile::remove();
        EXPECT_FALSE(first.exists());
    }
    EXPECT_EQ(folder.names(), QStringList{QStringLiteral("other")});
    folder.put("out.rep", "done");
    UnfinishedFile::remove();
    EXPECT_EQ(folder.bytesOf("out.rep"), "done") << "what is finished stays";
}

} // namespace
