#include "UArchive.h"

#include "LimitedDevice.h"
#include "PrintQt.h"

#include <QBuffer>

#include <gtest/gtest.h>

namespace
{

TEST(UArchive, StoresBytes)
{
    QBuffer buffer;
    ASSERT_TRUE(buffer.open(QIODevice::WriteOnly));
    UArchive archive(buffer, UArchive::Mode::Storing, QStringLiteral("/jobs/a.rep"));
    EXPECT_TRUE(archive.IsStoring());
    EXPECT_FALSE(archive.IsLoading());
    EXPECT_EQ(archive.GetFilePath(), QStringLiteral("/jobs/a.rep"));
    EXPECT_EQ(archive.GetLength(), 0);
    archive.Write("one");
    archive.Write("");
    archive.Write(QByteArrayView("\0two", 4));
    EXPECT_TRUE(archive.IsGood());
    EXPECT_EQ(buffer.data(), QByteArray("one\0two", 7));
    EXPECT_EQ(archive.GetLength(), 7);
}

TEST(UArchive, LoadsFromAFileOfALength)
{
    QBuffer buffer;
    buffer.setData("content");
    ASSERT_TRUE(buffer.open(QIODevice::ReadOnly));
    const UArchive archive(buffer, UArchive::Mode::Loading, QString());
    EXPECT_TRUE(archive.IsLoading());
    EXPECT_FALSE(archive.IsStoring());
    EXPECT_EQ(archive.GetLength(), 7);
    EXPECT_TRUE(archive.IsGood());
}

TEST(UArchive, AFailedWriteIsRemembered)
{
    struct Row
    {
        qint64 limit;
        QByteArrayView taken;
        const char *reason;
    };
    const Row rows[] = {
        {-1, "first ", "the device fails"},
        {0, "first ", "the device takes nothing"},
        {3, "first sec", "the device takes a part"},
    };
    for (const Row &row : rows) {
        LimitedDevice device;
        UArchive archive(device, UArchive::Mode::Storing, QString());
        archive.Write("first ");
        EXPECT_TRUE(archive.IsGood()) << row.reason;
        device.limit = row.limit;
        archive.Write("second ");
        EXPECT_FALSE(archive.IsGood()) << row.reason;
        device.limit = 100;
        archive.Write("third ");
        EXPECT_FALSE(archive.IsGood()) << row.reason << ": for good";
        EXPECT_EQ(device.taken, row.taken.toByteArray()) << row.reason << ": nothing is written after the gap";
    }
}

TEST(UArchive, ThatWasGivenUpWritesNothingMore)
{
    QBuffer buffer;
    ASSERT_TRUE(buffer.open(QIODevice::WriteOnly));
    UArchive archive(buffer, UArchive::Mode::Storing, QString());
    archive.Write("before");
    archive.Abandon();
    EXPECT_FALSE(archive.IsGood());
    archive.Write("after");
    archive.Abandon();
    EXPECT_FALSE(archive.IsGood()) << "for good";
    EXPECT_EQ(buffer.data(), QByteArray("before"));
}

TEST(UArchive, AFileThatIsGivenUpWhileItIsLoadedKeepsItsLength)
{
    QBuffer buffer;
    buffer.setData("content");
    ASSERT_TRUE(buffer.open(QIODevice::ReadOnly));
    UArchive archive(buffer, UArchive::Mode::Loading, QStringLiteral("/jobs/a.rep"));
    archive.Abandon();
    EXPECT_FALSE(archive.IsGood());
    EXPECT_TRUE(archive.IsLoading());
    EXPECT_EQ(archive.GetLength(), 7);
    EXPECT_EQ(archive.GetFilePath(), QStringLiteral("/jobs/a.rep"));
}

} // namespace
