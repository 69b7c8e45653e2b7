#include "UReportDoc.h"

#include "FileSizeLimit.h"
#include "ReportFixture.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <string>

namespace
{

TEST(UReportDocSavePosix, AReportThatDoesNotFitOnTheDiskStaysModified)
{
    const struct
    {
        qsizetype size;
        quint64 limit;
        bool fits;
        const char *reason;
    } disks[] = {
        {100, 100, true, "exactly what is free"},
        {101, 100, false, "one byte more, written only when the file is closed"},
        {70000, 65536, false, "the first bytes fit, the last do not"},
    };
    const FixedSurroundings surroundings;
    for (const auto &disk : disks) {
        const QTemporaryDir folder;
        const QString path = folder.filePath(QStringLiteral("a.rep"));
        QFile file(path);
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write("old content");
        file.close();
        UReportDoc report;
        ASSERT_TRUE(report.Write(QString(disk.size - 3, u'x'), 0)); // after the mark of three bytes
        bool saved = false;
        {
            const FileSizeLimit limit(disk.limit);
            saved = report.OnSaveDocument(path);
        }
        EXPECT_EQ(saved, disk.fits) << disk.reason;
        EXPECT_EQ(report.IsModified(), !disk.fits) << disk.reason;
        EXPECT_EQ(contentOf(path), disk.fits ? "\xEF\xBB\xBF" + std::string(97, 'x') : "old content") << disk.reason;
        EXPECT_EQ(QDir(folder.path()).entryList(QDir::Files | QDir::Hidden).size(), 1) << disk.reason;
    }
}

} // namespace
