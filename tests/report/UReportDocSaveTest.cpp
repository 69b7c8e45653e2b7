#include "FrameFixture.h"
#include "ReportFixture.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace
{

TEST(UReportDocSave, AnEmptyReportSavesNoFileAndIsUnmodified)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("a.rep"));
    UReportDoc report;
    report.SetModifiedFlag(true);
    EXPECT_TRUE(report.OnSaveDocument(path));
    EXPECT_FALSE(report.IsModified());
    EXPECT_FALSE(QFile::exists(path));

    putFile(path, "earlier");
    report.SetModifiedFlag(true);
    EXPECT_TRUE(report.OnSaveDocument(path));
    EXPECT_FALSE(report.IsModified());
    EXPECT_EQ(contentOf(path), "earlier") << "an earlier file is not emptied";
    EXPECT_TRUE(report.OnSaveDocument(QStringLiteral("/no/such/folder/a.rep"))) << "no file is opened";
}

TEST(UReportDocSave, WritesTheTextByteForByte)
{
    struct Row
    {
        QString text;
        std::string expected;
        const char *reason;
    };
    const Row rows[] = {
        {QStringLiteral("A\r\nB\r\n"),
         "\xEF\xBB\xBF"
         "A\r\r\nB\r\r\n",
         "lines end with CR CR LF"},
        {QStringLiteral("A\nB\r"),
         "\xEF\xBB\xBF"
         "A\r\nB\r",
         "a line feed becomes CR LF, a carriage return stays"},
        {QStringLiteral(u"12\xB0 \u6E2C \xD83D\xDE00\xD83D"),
         "\xEF\xBB\xBF"
         "12\xC2\xB0 \xE6\xB8\xAC \xF0\x9F\x98\x80\xEF\xBF\xBD",
         "UTF-8, with a mark for half of a pair"},
        {QString(2, QChar(u'\0')), std::string("\xEF\xBB\xBF\0\0", 5), "characters 0 are text"},
    };
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    for (const QString &name : {QStringLiteral("a.rep"), QStringLiteral("a.txt"), QStringLiteral("a")}) {
        const QString path = folder.filePath(name);
        for (const Row &row : rows) {
            UReportDoc report;
            report.SetData(row.text);
            report.SetModifiedFlag(true);
            EXPECT_TRUE(report.OnSaveDocument(path)) << row.reason;
            EXPECT_FALSE(report.IsModified()) << row.reason;
            EXPECT_EQ(contentOf(path), row.expected) << row.reason;
            EXPECT_EQ(textOf(report), row.text) << row.reason << ": saving does not change the report";
        }
    }
}

TEST(UReportDocSave, AFailedSaveKeepsTheModifiedFlagAndTheEarlierFile)
{
    const FixedSurroundings surroundings;
    const QTemporaryDir folder;
    const QString earlier = folder.filePath(QStringLiteral("a.rep"));
    putFile(earlier, "earlier");
    ASSERT_TRUE(QDir().mkdir(folder.filePath(QStringLiteral("folder"))));
    UReportDoc report;
    report.WriteLine(QStringLiteral("x"), 0, 1, 0);
    struct Row
    {
        QString path;
        const char *reason;
    };
    const Row rows[] = {
        {folder.filePath(QStringLiteral("folder")), "a folder has the name"},
        {folder.filePath(QStringLiteral("missing/a.rep")), "the folder does not exist"},
        {earlier + QStringLiteral("/a.rep"), "a file is not a folder"},
        {QString(), "no name at all"},
    };
    for (const Row &row : rows) {
        EXPECT_FALSE(report.OnSaveDocument(row.path)) << row.reason;
        EXPECT_TRUE(report.IsModified()) << row.reason;
        EXPECT_EQ(textOf(report), QStringLiteral("x\r\n")) << row.reason;
    }
    EXPECT_EQ(contentOf(earlier), "earlier");
    EXPECT_EQ(QDir(folder.path()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
              QStringList({QStringLiteral("a.rep"), QStringLiteral("folder")}));
    report.SetModifiedFlag(false);
    EXPECT_FALSE(report.OnSaveDocument(QString()));
    EXPECT_FALSE(report.IsModified()) << "a failure does not set the flag either";
}

} // namespace
