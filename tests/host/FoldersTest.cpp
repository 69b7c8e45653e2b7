#include "Folders.h"

#include "PrintQt.h"
#include "Profile.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

/// Leaves the folders and the current folder as the tests begin with.
class FoldersRestored
{
public:
    FoldersRestored() : current_(QDir::currentPath()) {}
    ~FoldersRestored()
    {
        kareport::setLibraryDir(QString());
        kareport::setStartPathName(QString());
        QDir::setCurrent(current_);
    }
    FoldersRestored(const FoldersRestored &) = delete;
    FoldersRestored &operator=(const FoldersRestored &) = delete;

private:
    QString current_;
};

TEST(Folders, AreAbsoluteWithoutASetting)
{
    EXPECT_TRUE(QDir::isAbsolutePath(GetLibraryDir(false)));
    EXPECT_TRUE(QDir(GetStartPathName()).exists());
    EXPECT_NE(GetStartPathName(), QDir::currentPath()) << "the program is in a temporary folder since its start";
    EXPECT_TRUE(QDir::isAbsolutePath(GetTempDir(false)));
}

TEST(Folders, AreTheOnesThatWereSetUntilAnEmptyPathIs)
{
    const FoldersRestored restored;
    const QString library = GetLibraryDir(false);
    const QString start = GetStartPathName();
    struct Row
    {
        QStringView path;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"/srv/templates", "a folder"},
        {u"/srv/templates/", "a slash at the end stays"},
        {u"C:\\Survey Jobs\\", "another platform's"},
        {u"relative", "taken as given"},
        {u"/srv/測量 é", "characters beyond ASCII"},
    };
    for (const Row &row : rows) {
        kareport::setLibraryDir(row.path.toString());
        EXPECT_EQ(GetLibraryDir(false), row.path.toString()) << row.reason;
        EXPECT_EQ(GetStartPathName(), start) << "each for itself";
        kareport::setLibraryDir(QString());
        EXPECT_EQ(GetLibraryDir(false), library) << row.reason;

        kareport::setStartPathName(row.path.toString());
        EXPECT_EQ(GetStartPathName(), row.path.toString()) << row.reason;
        EXPECT_EQ(GetLibraryDir(false), library) << "each for itself";
        kareport::setStartPathName(QStringLiteral(""));
        EXPECT_EQ(GetStartPathName(), start) << row.reason;
    }
}

TEST(Folders, TheStartFolderStaysWhenTheCurrentFolderChanges)
{
    const FoldersRestored restored;
    const QTemporaryDir elsewhere;
    const QString start = GetStartPathName();
    ASSERT_TRUE(QDir::setCurrent(elsewhere.path()));
    EXPECT_EQ(GetStartPathName(), start) << "where the host was started, not where it has gone";
}

TEST(Folders, TemporaryFilesCanBeMadeInTheSystemsFolder)
{
    EXPECT_TRUE(QFileInfo(GetTempDir(false)).isDir());
    EXPECT_EQ(QDir(GetTempDir(false)), QDir::temp());
}

TEST(Folders, AFileExistsUnderItsOwnName)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("測量 é"));
    EXPECT_EQ(IsFileExisting(path), 0);
    ASSERT_TRUE(QFile(path).open(QIODevice::WriteOnly));
    EXPECT_NE(IsFileExisting(path), 0);
    ASSERT_TRUE(QFile::link(path, folder.filePath(QStringLiteral("link"))));
    ASSERT_TRUE(QFile::link(folder.filePath(QStringLiteral("gone")), folder.filePath(QStringLiteral("loose link"))));
    EXPECT_NE(IsFileExisting(folder.filePath(QStringLiteral("link"))), 0) << "a link to a file";
    EXPECT_EQ(IsFileExisting(folder.filePath(QStringLiteral("loose link"))), 0) << "a link to nothing";
    EXPECT_EQ(IsFileExisting(path + u' '), 0) << "a blank belongs to the name";
    EXPECT_EQ(IsFileExisting(folder.path()), 0) << "a folder";
    EXPECT_EQ(IsFileExisting(QString()), 0) << "no name";
}

class LastOpenFolder : public testing::Test
{
protected:
    void SetUp() override { kareport::setProfileStore(kareport::makeMemoryProfile()); }
    void TearDown() override { kareport::setProfileStore(kareport::makeMemoryProfile()); }
};

TEST_F(LastOpenFolder, IsTheFolderOfTheFileUnderItsKey)
{
    const QTemporaryDir folder;
    const QTemporaryDir otherFolder;
    const QString reports = QStringLiteral("LastOpenDirectoryReport");
    const QString plans = QStringLiteral("LastOpenDirectoryPlan");
    EXPECT_EQ(GetInitialOpenDir(reports), QString()) << "nothing has been opened";
    SetLastOpenDir(folder.filePath(QStringLiteral("a.rep")), reports);
    EXPECT_EQ(GetInitialOpenDir(reports), folder.path()) << "the file itself need not exist";
    EXPECT_EQ(GetInitialOpenDir(plans), QString()) << "each purpose for itself";
    SetLastOpenDir(otherFolder.filePath(QStringLiteral("b.rep")), plans);
    EXPECT_EQ(GetInitialOpenDir(reports), folder.path());
    SetLastOpenDir(otherFolder.filePath(QStringLiteral("c.rep")), reports);
    EXPECT_EQ(GetInitialOpenDir(reports), otherFolder.path()) << "the last one counts";
    EXPECT_EQ(GetProfileString(QString(), reports), otherFolder.path()) << "kept with the preferences";
}

TEST_F(LastOpenFolder, IsKeptAsAFullPath)
{
    const FoldersRestored restored;
    const QTemporaryDir folder;
    ASSERT_TRUE(QDir::setCurrent(folder.path()));
    const QString here = QDir::currentPath();
    const QString key = QStringLiteral("LastOpenDirectoryReport");
    struct Row
    {
        QString path;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("a.rep"), here, "a name alone is in the current folder"},
        {QStringLiteral("測量 é.rep"), here, "characters beyond ASCII"},
        {QStringLiteral("/a.rep"), QStringLiteral("/"), "the root"},
        {QDir::tempPath() + QStringLiteral("/a"), QDir::tempPath(), "a file without an extension"},
    };
    for (const Row &row : rows) {
        SetLastOpenDir(row.path, key);
        ASSERT_TRUE(QDir::setCurrent(QStringLiteral("/")));
        EXPECT_EQ(GetInitialOpenDir(key), row.expected) << row.reason;
        ASSERT_TRUE(QDir::setCurrent(folder.path()));
    }
}

TEST_F(LastOpenFolder, ThatIsGoneIsNotOffered)
{
    const QString key = QStringLiteral("LastOpenDirectoryReport");
    QTemporaryDir folder;
    const QString path = folder.path();
    SetLastOpenDir(folder.filePath(QStringLiteral("a.rep")), key);
    ASSERT_TRUE(folder.remove());
    EXPECT_EQ(GetInitialOpenDir(key), QString());
    ASSERT_TRUE(QDir().mkpath(path));
    EXPECT_EQ(GetInitialOpenDir(key), path) << "offered again when it is back";
    ASSERT_TRUE(QDir().rmdir(path));
    QFile file(path);
    ASSERT_TRUE(file.open(QIODevice::WriteOnly));
    EXPECT_EQ(GetInitialOpenDir(key), QString()) << "a file of its name is not a folder";
    ASSERT_TRUE(file.remove());
}

} // namespace
