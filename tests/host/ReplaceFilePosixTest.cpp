#include "ReplaceFile.h"

#include "FileSizeLimit.h"
#include "FrameFixture.h"

#include <QDir>
#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

#include <fcntl.h>
#include <string>
#include <sys/stat.h>
#include <unistd.h>

namespace
{

QString oldFileIn(const QTemporaryDir &folder)
{
    const QString path = folder.filePath(QStringLiteral("a.rep"));
    QFile file(path);
    EXPECT_TRUE(file.open(QIODevice::WriteOnly));
    file.write("old content");
    return path;
}

qsizetype filesIn(const QTemporaryDir &folder)
{
    return QDir(folder.path()).entryList(QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot).size();
}

struct Disk
{
    qsizetype size;
    quint64 limit;
    bool fits;
    const char *reason;
};
constexpr Disk disks[] = {
    {100, 100, true, "exactly what is free"},
    {101, 100, false, "one byte more, written only when the file is closed"},
    {1000, 100, false, "a small file"},
    {16000, 100, false, "just less than what is buffered"},
    {70000, 65536, false, "the first bytes fit, the last do not"},
};

TEST(ReplaceFilePosix, AFullDiskLeavesTheOldFile)
{
    for (const Disk &disk : disks) {
        const QTemporaryDir folder;
        const QString path = oldFileIn(folder);
        QString error;
        bool done = false;
        {
            const FileSizeLimit limit(disk.limit);
            done = kareport::replaceFile(
                path, [&](QIODevice &device) { return device.write(QByteArray(disk.size, 'x')) == disk.size; }, &error);
        }
        EXPECT_EQ(done, disk.fits) << disk.reason;
        EXPECT_EQ(error, disk.fits ? QString() : QStringLiteral("File too large")) << disk.reason;
        EXPECT_EQ(contentOf(path), disk.fits ? std::string(100, 'x') : "old content") << disk.reason;
        EXPECT_EQ(filesIn(folder), 1) << disk.reason;
    }
}

TEST(ReplaceFilePosix, APipeIsWrittenToAndStaysAPipe)
{
    const QTemporaryDir folder;
    const QString path = folder.filePath(QStringLiteral("pipe"));
    const QString link = folder.filePath(QStringLiteral("link"));
    const QByteArray name = QFile::encodeName(path);
    ASSERT_EQ(mkfifo(name.constData(), 0600), 0);
    ASSERT_TRUE(QFile::link(path, link));
    const int reader = open(name.constData(), O_RDONLY | O_NONBLOCK);
    ASSERT_GE(reader, 0);
    for (const QString &target : {path, link}) {
        EXPECT_TRUE(kareport::replaceFile(target, [](QIODevice &device) { return device.write("content") == 7; }));
        char bytes[100];
        const ssize_t count = read(reader, bytes, sizeof bytes);
        EXPECT_EQ(count, 7);
        EXPECT_EQ(std::string(bytes, count > 0 ? static_cast<std::size_t>(count) : 0), "content");
        EXPECT_FALSE(kareport::replaceFile(target, [](QIODevice &) { return false; })) << "the write gave up";
        struct stat status = {};
        EXPECT_EQ(stat(name.constData(), &status), 0);
        EXPECT_TRUE(S_ISFIFO(status.st_mode));
        EXPECT_TRUE(QFileInfo(link).isSymLink());
    }
    EXPECT_EQ(filesIn(folder), 2);
    close(reader);
}

} // namespace
