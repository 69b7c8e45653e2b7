#include "ReplaceFile.h"

#include "PrintQt.h"

#include <QDir>
#include <QFile>
#include <QSaveFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

using kareport::replaceFile;

/// A folder with the file that is to be replaced.
class Folder
{
public:
    Folder() { put(QStringLiteral("report.rep"), "old content"); }

    QString path(const QString &name = QStringLiteral("report.rep")) const { return directory_.filePath(name); }
    void put(const QString &name, const QByteArray &content) const
    {
        QFile file(path(name));
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(content);
    }
    std::string content(const QString &name = QStringLiteral("report.rep")) const
    {
        QFile file(path(name));
        return file.open(QIODevice::ReadOnly) ? file.readAll().toStdString() : "(cannot be read)";
    }
    QString names() const
    {
        return QDir(directory_.path())
            .entryList(QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot)
            .join(u' ');
    }

private:
    QTemporaryDir directory_;
};

bool writeNew(QIODevice &device)
{
    return device.write("new") == 3;
}

TEST(ReplaceFile, PutsTheNewContentIntoTheFilesPlace)
{
    const Folder folder;
    QString error = QStringLiteral("untouched");
    EXPECT_TRUE(replaceFile(folder.path(), writeNew, &error));
    EXPECT_EQ(folder.content(), "new");
    EXPECT_EQ(error, QStringLiteral("untouched")) << "there is nothing to tell";
    EXPECT_TRUE(replaceFile(folder.path(), [](QIODevice &) { return true; }));
    EXPECT_EQ(folder.content(), "") << "an empty content replaces as well";
    EXPECT_TRUE(replaceFile(folder.path(QStringLiteral("another")), writeNew));
    EXPECT_EQ(folder.content(QStringLiteral("another")), "new") << "a file that was not there";
    EXPECT_EQ(folder.names(), QStringLiteral("another report.rep"));
}

TEST(ReplaceFile, TheOldFileIsWholeUntilTheNewOneIsComplete)
{
    const Folder folder;
    EXPECT_TRUE(replaceFile(folder.path(), [&folder](QIODevice &device) {
        device.write(QByteArray(1000000, 'x'));
        EXPECT_EQ(folder.content(), "old content");
        return true;
    }));
    EXPECT_EQ(folder.content(), std::string(1000000, 'x'));
}

TEST(ReplaceFile, AWriteThatFailsLeavesTheOldFileAndNoOther)
{
    struct Row
    {
        bool (*write)(QIODevice &);
        const char *reason;
    };
    constexpr Row rows[] = {
        {[](QIODevice &) { return false; }, "nothing was written"},
        {[](QIODevice &device) { return device.write("half of the new con") < 0; }, "a part was written"},
        {[](QIODevice &device) { return device.write(QByteArray(1000000, 'x')) < 0; }, "much was written"},
        {[](QIODevice &device) {
             static_cast<QSaveFile &>(device).cancelWriting();
             return true;
         },
         "the write gave up but answers true"},
    };
    for (const Row &row : rows) {
        const Folder folder;
        EXPECT_FALSE(replaceFile(folder.path(), row.write)) << row.reason;
        EXPECT_EQ(folder.content(), "old content") << row.reason;
        EXPECT_EQ(folder.names(), QStringLiteral("report.rep")) << row.reason;
        EXPECT_FALSE(replaceFile(folder.path(QStringLiteral("another")), row.write)) << row.reason;
        EXPECT_EQ(folder.names(), QStringLiteral("report.rep")) << row.reason << ": no file where there was none";
    }
}

TEST(ReplaceFile, ATargetThatCannotBeAFileIsRefusedWithTheReason)
{
    const Folder folder;
    ASSERT_TRUE(QDir().mkdir(folder.path(QStringLiteral("folder"))));
    struct Row
    {
        QString name;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("folder"), "a folder has the name"},
        {QStringLiteral("missing/report.rep"), "the folder does not exist"},
        {QStringLiteral("report.rep/report.rep"), "a file is not a folder"},
    };
    for (const Row &row : rows) {
        QString error;
        bool asked = false;
        EXPECT_FALSE(replaceFile(
            folder.path(row.name), [&asked](QIODevice &) { return asked = true; }, &error))
            << row.reason;
        EXPECT_FALSE(asked) << row.reason << ": nothing is written for nothing";
        EXPECT_FALSE(error.isEmpty()) << row.reason;
        EXPECT_EQ(folder.names(), QStringLiteral("folder report.rep")) << row.reason;
        EXPECT_EQ(folder.content(), "old content") << row.reason;
    }
    EXPECT_FALSE(replaceFile(QString(), writeNew)) << "no name at all";
}

TEST(ReplaceFile, ASymbolicLinkStaysALink)
{
    const Folder folder;
    const Folder elsewhere;
    const QString link = folder.path(QStringLiteral("link"));
    ASSERT_TRUE(QFile::link(elsewhere.path(), link));
    EXPECT_TRUE(replaceFile(link, writeNew));
    EXPECT_TRUE(QFileInfo(link).isSymLink());
    EXPECT_EQ(elsewhere.content(), "new") << "what the link points to is replaced";

    EXPECT_FALSE(replaceFile(link, [](QIODevice &) { return false; }));
    EXPECT_TRUE(QFileInfo(link).isSymLink());
    EXPECT_EQ(elsewhere.content(), "new") << "and stays when the write fails";

    const QString toFolder = folder.path(QStringLiteral("toFolder"));
    ASSERT_TRUE(QFile::link(QFileInfo(elsewhere.path()).path(), toFolder));
    EXPECT_FALSE(replaceFile(toFolder, writeNew)) << "a link to a folder is a folder";
    EXPECT_TRUE(QFileInfo(toFolder).isSymLink());
}

TEST(ReplaceFile, ALinkToNothingGetsItsTarget)
{
    const Folder folder;
    const Folder elsewhere;
    const QString link = folder.path(QStringLiteral("link"));
    ASSERT_TRUE(QFile::link(elsewhere.path(QStringLiteral("later")), link));
    EXPECT_TRUE(replaceFile(link, writeNew));
    EXPECT_TRUE(QFileInfo(link).isSymLink());
    EXPECT_EQ(elsewhere.content(QStringLiteral("later")), "new");
}

} // namespace
