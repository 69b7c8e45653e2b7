#include "FileWatch.h"

#include "JobFolder.h"

#include <QElapsedTimer>
#include <QTest>

#include <gtest/gtest.h>

namespace
{

/// Waits until `count` changes have been reported, and then until another file's change has been reported as well: by
/// then a further one would have been.
class Watched
{
public:
    Watched() : watch([this](const QString &path) { told.append(QFileInfo(path).fileName()); })
    {
        folder.put("a", "1");
        folder.put("other", "1");
        watch.watch(folder.path("a"));
        watch.watch(folder.path("other"));
    }
    bool waitFor(qsizetype count)
    {
        return QTest::qWaitFor([&] { return told.size() >= count; });
    }
    /// Changes the other file and waits for it to be reported.
    QStringList settled()
    {
        folder.put("other", QByteArray(++others_ + 1, 'x'));
        EXPECT_TRUE(QTest::qWaitFor([this] { return told.contains(QStringLiteral("other")); }));
        told.removeAll(QStringLiteral("other"));
        return told;
    }

    JobFolder folder;
    QStringList told;
    kareport::FileWatch watch;

private:
    int others_ = 0;
};

TEST(FileWatch, AChangeIsToldOnce)
{
    Watched t;
    t.folder.put("a", "12");
    t.folder.put("a", "123");
    EXPECT_TRUE(t.waitFor(1));
    EXPECT_EQ(t.settled(), QStringList(QStringLiteral("a"))) << "written in pieces, told once";
    t.folder.put("a", "1234");
    EXPECT_TRUE(t.waitFor(2)) << "and again when it changes again";
}

TEST(FileWatch, AFileThatIsReplacedIsFollowed)
{
    Watched t;
    for (int i = 2; i < 5; ++i) {
        t.folder.put("new", QByteArray(i, 'x'));
        ASSERT_EQ(std::rename(qPrintable(t.folder.path("new")), qPrintable(t.folder.path("a"))), 0);
        EXPECT_TRUE(t.waitFor(i - 1)) << "replaced " << i - 1 << " times";
    }
}

TEST(FileWatch, WhatTheProgramWritesItselfIsNotTold)
{
    Watched t;
    t.folder.put("a", "12");
    t.watch.watch(t.folder.path("a"));
    EXPECT_EQ(t.settled(), QStringList());
}

TEST(FileWatch, AFileThatIsForgottenIsNotTold)
{
    Watched t;
    t.watch.forget(t.folder.path("a"));
    t.folder.put("a", "12");
    EXPECT_EQ(t.settled(), QStringList());
    t.watch.forget(t.folder.path("never watched"));
    t.watch.forget(QString());
}

TEST(FileWatch, AFileThatGoesAndComesBackIsToldWhenItIsBack)
{
    Watched t;
    QFile::remove(t.folder.path("a"));
    EXPECT_EQ(t.settled(), QStringList()) << "a file that has gone is nothing to load";
    t.folder.put("a", "back again");
    EXPECT_TRUE(t.waitFor(1));
}

TEST(FileWatch, AFileThatIsNotThereYetIsToldWhenItComes)
{
    Watched t;
    for (const char *name : {"late", "new/late", "new/deep/late"}) {
        t.told.clear();
        t.watch.watch(t.folder.path(name));
        EXPECT_EQ(t.settled(), QStringList()) << name;
        ASSERT_TRUE(QDir(t.folder.path()).mkpath(QFileInfo(QString::fromUtf8(name)).path()));
        EXPECT_EQ(t.settled(), QStringList()) << name << ": its folder alone";
        t.folder.put(name, "1");
        EXPECT_TRUE(t.waitFor(1)) << name;
    }
}

TEST(FileWatch, ALinkThatLeadsElsewhereIsAChange)
{
    Watched t;
    t.folder.put("b", "1");
    QDir(t.folder.path()).mkdir(QStringLiteral("links"));
    const QString link = t.folder.path("links/l");
    ASSERT_TRUE(QFile::link(t.folder.path("a"), link));
    t.watch.forget(t.folder.path("a"));
    t.watch.watch(link);
    const QString other = t.folder.path("links/new");
    ASSERT_TRUE(QFile::link(t.folder.path("b"), other));
    ASSERT_EQ(std::rename(qPrintable(other), qPrintable(link)), 0);
    EXPECT_TRUE(t.waitFor(1)) << "as long, and perhaps as old";
}

TEST(FileWatch, AFileThatNeverSettlesIsToldAllTheSame)
{
    Watched t;
    QElapsedTimer clock;
    clock.start();
    int size = 1;
    while (t.told.isEmpty() && clock.elapsed() < 30'000) {
        t.folder.put("a", QByteArray(++size, 'x'));
        QTest::qWait(50);
    }
    EXPECT_FALSE(t.told.isEmpty());
}

TEST(FileWatch, AChangeBetweenTheReadingAndTheWatchIsTold)
{
    Watched t;
    t.folder.put("b", "1");
    t.folder.put("c", "1");
    t.folder.put("d", "1");
    t.watch.expect(t.folder.path("b"));
    t.watch.expect(t.folder.path("c"));
    t.watch.expect(t.folder.path("d"));
    t.watch.expect(QString());
    t.folder.put("b", "12");
    t.folder.put("d", "12");
    t.watch.ceaseToExpect(t.folder.path("d"));
    for (const char *name : {"b", "c", "d"}) {
        t.watch.watch(t.folder.path(name));
    }
    EXPECT_TRUE(t.waitFor(1));
    EXPECT_EQ(t.settled(), QStringList(QStringLiteral("b"))) << "the others are as they were when they were read";
}

} // namespace
