#include "FileSizeLimit.h"
#include "FrameFixture.h"

#include <QDir>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

QStringList namesIn(const QString &folder)
{
    return QDir(folder).entryList(QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot);
}

TEST(UDocumentSave, NewIsEmptyUnmodifiedAndWithoutAFile)
{
    FrameLog log;
    TextDocument document(log);
    document.SetPathName(QStringLiteral("/jobs/a.txt"), false);
    document.content = "content";
    document.SetModifiedFlag();
    EXPECT_TRUE(document.OnNewDocument());
    EXPECT_EQ(document.content, "");
    EXPECT_EQ(document.GetPathName(), QString());
    EXPECT_FALSE(document.IsModified());
    EXPECT_EQ(log.events, QStringList{QStringLiteral("new")});
}

TEST(UDocumentSave, StoresIntoItsFile)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a é.txt"));
    FrameLog log;
    TextDocument document(log);
    document.content = "one";
    document.SetModifiedFlag();
    EXPECT_TRUE(document.OnSaveDocument(path));
    EXPECT_EQ(contentOf(path), "one") << "a new file";
    EXPECT_FALSE(document.IsModified());
    EXPECT_EQ(log.events, QStringList{QStringLiteral("save")});
    EXPECT_EQ(document.archivePath, path);
    EXPECT_EQ(document.GetPathName(), QString()) << "saving alone does not give it a file";

    document.content = "x";
    EXPECT_TRUE(document.OnSaveDocument(path));
    EXPECT_EQ(contentOf(path), "x") << "in place of a longer one";
    document.content = "";
    EXPECT_TRUE(document.OnSaveDocument(path));
    EXPECT_EQ(contentOf(path), "") << "an empty one";
    document.content = QByteArray(1000000, 'x');
    EXPECT_TRUE(document.OnSaveDocument(path));
    EXPECT_TRUE(contentOf(path) == document.content.toStdString()) << "a large one";
    EXPECT_EQ(namesIn(folder.path()).size(), 1) << "and no other file";
}

TEST(UDocumentSave, TheArchiveKnowsTheFullPath)
{
    const QTemporaryDir folder;
    FrameLog log;
    TextDocument document(log);
    const QString current = QDir::currentPath();
    ASSERT_TRUE(QDir::setCurrent(folder.path()));
    const QString expected = QDir::current().filePath(QStringLiteral("a.txt"));
    EXPECT_TRUE(document.OnSaveDocument(QStringLiteral("a.txt")));
    EXPECT_EQ(document.archivePath, expected);
    document.archivePath.clear();
    EXPECT_TRUE(document.OnOpenDocument(QStringLiteral("a.txt")));
    EXPECT_EQ(document.archivePath, expected);
    ASSERT_TRUE(QDir::setCurrent(current));
}

TEST(UDocumentSave, LoadsFromAFile)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.txt"));
    putFile(path, "stored");
    FrameLog log;
    TextDocument document(log);
    document.content = "earlier";
    document.SetModifiedFlag();
    EXPECT_TRUE(document.OnOpenDocument(path));
    EXPECT_EQ(document.content, "stored");
    EXPECT_EQ(document.archiveLength, 6);
    EXPECT_FALSE(document.IsModified());
    EXPECT_EQ(log.events, QStringList{QStringLiteral("open")});
}

TEST(UDocumentSave, StaysAsItIsWhenAFileCannotBeOpenedAndIsEmptyWhenItCannotBeRead)
{
    const QTemporaryDir folder;
    const QString broken = folder.filePath(QStringLiteral("broken.txt"));
    putFile(broken, "broken content");
    struct Row
    {
        QString path;
        const char *expected;
        const char *reason;
    };
    const Row rows[] = {
        {broken, "", "reading fails in the middle: what was read goes, and what was there has gone"},
        {folder.filePath(QStringLiteral("missing.txt")), "earlier", "no such file"},
        {folder.filePath(QStringLiteral("missing/a.txt")), "earlier", "no such folder"},
        {folder.path(), "earlier", "a folder"},
        {QString(), "earlier", "no name"},
    };
    for (const Row &row : rows) {
        FrameLog log;
        TextDocument document(log);
        document.content = "earlier";
        EXPECT_FALSE(document.OnOpenDocument(row.path)) << row.reason;
        EXPECT_EQ(document.content.toStdString(), row.expected) << row.reason;
        EXPECT_EQ(log.events, QStringList()) << row.reason;
    }
}

TEST(UDocumentSave, SavingUnderANameMakesItTheDocumentsOwnWhenWanted)
{
    const QTemporaryDir folder;
    const QString copy = folder.filePath(QStringLiteral("copy.txt"));
    const QString own = folder.filePath(QStringLiteral("own.txt"));
    const UApplication application;
    FrameLog log;
    TextDocument document(log);
    document.SetTitle(QStringLiteral("Traverse"));
    document.content = "content";

    EXPECT_FALSE(document.DoFileSave()) << "it has no file yet";
    EXPECT_FALSE(document.DoSave(QString(), true)) << "no name";

    EXPECT_TRUE(document.DoSave(copy, false));
    EXPECT_EQ(contentOf(copy), "content");
    EXPECT_EQ(document.GetPathName(), QString());
    EXPECT_EQ(document.GetTitle(), QStringLiteral("Traverse"));
    EXPECT_EQ(application.GetRecentFileList(), QStringList());

    EXPECT_TRUE(document.DoSave(own, true));
    EXPECT_EQ(document.GetPathName(), own);
    EXPECT_EQ(document.GetTitle(), QStringLiteral("own.txt"));
    EXPECT_EQ(application.GetRecentFileList(), QStringList{own});

    document.content = "changed";
    document.SetTitle(QStringLiteral("Traverse"));
    EXPECT_TRUE(document.DoFileSave());
    EXPECT_EQ(contentOf(own), "changed");
    EXPECT_EQ(contentOf(copy), "content");
    EXPECT_EQ(document.GetTitle(), QStringLiteral("Traverse")) << "its own file again changes no title";
}

/// A document with a file that holds "earlier" and with changes.
class ChangedDocument
{
public:
    ChangedDocument()
    {
        putFile(path, "earlier");
        document.SetPathName(path, false);
        document.content = "changed";
        document.SetModifiedFlag();
    }

    QTemporaryDir folder;
    QString path = folder.filePath(QStringLiteral("own.txt"));
    FrameLog log;
    TextDocument document{log};
};

TEST(UDocumentSave, AnImpossibleTargetKeepsTheModifiedFlagAndThePath)
{
    ChangedDocument changed;
    ASSERT_TRUE(QDir().mkdir(changed.folder.filePath(QStringLiteral("folder"))));
    struct Row
    {
        QStringView name;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"folder", "a folder has the name"},
        {u"missing/new.txt", "the folder does not exist"},
        {u"own.txt/new.txt", "a file is not a folder"},
    };
    for (const Row &row : rows) {
        EXPECT_FALSE(changed.document.DoSave(changed.folder.filePath(row.name.toString()), true)) << row.reason;
        EXPECT_TRUE(changed.document.IsModified()) << row.reason;
        EXPECT_EQ(changed.document.GetPathName(), changed.path) << row.reason;
        EXPECT_EQ(changed.document.GetTitle(), QStringLiteral("own.txt")) << row.reason;
        EXPECT_EQ(changed.log.events, QStringList()) << row.reason;
        EXPECT_EQ(contentOf(changed.path), "earlier") << row.reason;
        EXPECT_EQ(namesIn(changed.folder.path()), (QStringList{QStringLiteral("folder"), QStringLiteral("own.txt")}))
            << row.reason << ": nothing is left behind";
    }
}

TEST(UDocumentSave, AFullDiskLeavesTheEarlierFileWhole)
{
    struct Row
    {
        int size;
        const char *reason;
    };
    constexpr Row rows[] = {
        {1000000, "the write itself fails"},
        {10000, "the write fails when its last bytes reach the disk"},
    };
    for (const Row &row : rows) {
        ChangedDocument changed;
        changed.document.content = QByteArray(row.size, 'x');
        bool saved = true;
        {
            const FileSizeLimit full(4096);
            saved = changed.document.DoFileSave();
        }
        EXPECT_FALSE(saved) << row.reason;
        EXPECT_TRUE(changed.document.IsModified()) << row.reason;
        EXPECT_EQ(changed.log.events, QStringList()) << row.reason;
        EXPECT_EQ(contentOf(changed.path).substr(0, 20), "earlier") << row.reason;
        EXPECT_EQ(namesIn(changed.folder.path()), QStringList{QStringLiteral("own.txt")})
            << row.reason << ": nothing is left behind";
        EXPECT_TRUE(changed.document.DoFileSave()) << row.reason << ": there is room again";
        EXPECT_TRUE(contentOf(changed.path) == changed.document.content.toStdString()) << row.reason;
    }
}

} // namespace
