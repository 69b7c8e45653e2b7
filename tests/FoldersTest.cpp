#include "Folders.h"

#include "PrintQt.h"

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
    EXPECT_EQ(GetStartPathName(), QDir::currentPath()) << "the tests have not left the folder they were started in";
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

} // namespace
