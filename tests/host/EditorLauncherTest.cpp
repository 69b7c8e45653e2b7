#include "EditorLauncher.h"

#include "EditorFixture.h"
#include "FrameFixture.h"

#include <QCoreApplication>
#include <QDir>
#include <QTemporaryDir>
#include <QTest>

#include <gtest/gtest.h>

namespace
{

/// Lets a condition come true, at most ten seconds. @return whether it has
template <typename Condition>
bool waitFor(Condition condition)
{
    return QTest::qWaitFor(condition, 10'000);
}

/// A program that notes in its own folder how it was started.
class StandIn
{
public:
    explicit StandIn(const QString &name = QStringLiteral("edit"), const QByteArray &first = {})
    {
        QDir(folder_.path()).mkpath(QFileInfo(at(name)).path());
        program = at(name);
        putFile(program, "#!/bin/sh\n"
                         "notes=$(dirname \"$0\")\n" +
                             first +
                             "printf %s \"$#\" > \"$notes/count\"\n"
                             "printf %s \"$1\" > \"$notes/file\"\n"
                             "printf %s \"$(pwd -P)\" > \"$notes/folder\"\n"
                             "printf %s \"$PPID\" > \"$notes/parent\"\n"
                             "cat \"$1\" > \"$notes/bytes\"\n"
                             ": > \"$notes/done\"\n");
        QFile::setPermissions(program, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    }

    QString at(const QString &name) const { return QDir(folder_.path()).filePath(name); }
    /// What it has noted under a name.
    std::string note(const char *name) const
    {
        return contentOf(QFileInfo(program).dir().filePath(QLatin1String(name)));
    }
    bool isDone() const { return note("done").empty(); }
    bool waitTillDone() const
    {
        return waitFor([this] { return isDone(); });
    }

    QString program;

private:
    QTemporaryDir folder_;
};

class FolderRestored
{
public:
    FolderRestored() : folder_(QDir::currentPath()) {}
    ~FolderRestored() { QDir::setCurrent(folder_); }
    FolderRestored(const FolderRestored &) = delete;
    FolderRestored &operator=(const FolderRestored &) = delete;

private:
    QString folder_;
};

const QStringList oddNames = {
    QStringLiteral("Report$$$ 2.rep"),
    QStringLiteral("it's \"quoted\".rep"),
    QStringLiteral("$(touch pwned).rep"),
    QStringLiteral("`touch pwned`;&|"),
    QStringLiteral(u"測量 é Ω.rep"),
    QStringLiteral("-rf.rep"),
    QStringLiteral("--help"),
    QStringLiteral("a\\b.rep"),
    QStringLiteral(" blanks  around "),
    QStringLiteral("two\nlines.rep"),
    QStringLiteral("*?[a].rep"),
    QStringLiteral("%PATH%~1.rep"),
};

TEST(EditorLauncher, TheFileIsTheOnlyArgumentWhateverItsName)
{
    for (const QString &name : oddNames) {
        const StandIn editor;
        const QTemporaryDir folder;
        const QTemporaryDir work;
        const QString file = folder.filePath(name);
        putFile(file, QByteArray("bytes \0 of \xFF", 11) + name.toUtf8());
        kareport::launchEditor(editor.program, file, work.path());
        ASSERT_TRUE(editor.waitTillDone()) << name.toStdString();
        EXPECT_EQ(editor.note("count"), "1") << name.toStdString();
        EXPECT_EQ(editor.note("file"), QFile::encodeName(file).toStdString());
        EXPECT_EQ(editor.note("bytes"), contentOf(file)) << name.toStdString();
        EXPECT_EQ(editor.note("folder"), QFile::encodeName(QDir(work.path()).canonicalPath()).toStdString());
        EXPECT_TRUE(QDir(work.path()).isEmpty()) << "no shell has read the name " << name.toStdString();
    }
}

TEST(EditorLauncher, TheProgramMayHaveAnyNameToo)
{
    for (const QString &name : oddNames) {
        const StandIn editor(name + u'/' + name);
        const QTemporaryDir work;
        const QString file = work.filePath(QStringLiteral("a.rep"));
        putFile(file, "content");
        kareport::launchEditor(editor.program, file, work.path());
        ASSERT_TRUE(editor.waitTillDone()) << name.toStdString();
        EXPECT_EQ(editor.note("bytes"), "content") << name.toStdString();
        EXPECT_EQ(QDir(work.path()).entryList(QDir::Files), QStringList{QStringLiteral("a.rep")})
            << "no shell has read the name " << name.toStdString();
    }
}

TEST(EditorLauncher, RelativePathsAreThisProcesssOwn)
{
    const FolderRestored restored;
    const StandIn editor(QStringLiteral("-edit"));
    ASSERT_TRUE(QDir::setCurrent(editor.at(QString())));
    const QString here = QDir::currentPath();
    const QTemporaryDir work;
    putFile(editor.at(QStringLiteral("-x.rep")), "the one meant");
    putFile(work.filePath(QStringLiteral("-x.rep")), "another one");
    kareport::launchEditor(QStringLiteral("-edit"), QStringLiteral("-x.rep"), work.path());
    ASSERT_TRUE(editor.waitTillDone()) << "not looked for along the search path";
    EXPECT_EQ(editor.note("bytes"), "the one meant");
    EXPECT_EQ(editor.note("file"), (here + QStringLiteral("/-x.rep")).toStdString()) << "it cannot pass for an option";
}

TEST(EditorLauncher, WithoutAFolderItWorksWhereThisProcessDoes)
{
    const FolderRestored restored;
    const StandIn editor;
    const QTemporaryDir here;
    ASSERT_TRUE(QDir::setCurrent(here.path()));
    putFile(here.filePath(QStringLiteral("a.rep")), "content");
    kareport::launchEditor(editor.program, here.filePath(QStringLiteral("a.rep")), QString());
    ASSERT_TRUE(editor.waitTillDone());
    EXPECT_EQ(editor.note("folder"), QFile::encodeName(QDir(here.path()).canonicalPath()).toStdString());
}

TEST(EditorLauncher, TheProgramGoesOnByItself)
{
    const StandIn editor(QStringLiteral("edit"), "n=0\n"
                                                 "while [ ! -e \"$notes/go\" ] && [ $n -lt 200 ]; do\n"
                                                 "  n=$((n + 1)); sleep 0.05\n"
                                                 "done\n");
    const QTemporaryDir folder;
    kareport::launchEditor(editor.program, folder.filePath(QStringLiteral("a.rep")), folder.path());
    EXPECT_FALSE(editor.isDone()) << "it is not waited for";
    putFile(editor.at(QStringLiteral("go")), "");
    ASSERT_TRUE(editor.waitTillDone());
    EXPECT_NE(editor.note("parent"), std::to_string(QCoreApplication::applicationPid())) << "it is not a child";
}

TEST(EditorLauncher, WhatCannotBeStartedIsSkipped)
{
    const StandIn editor;
    const QTemporaryDir folder;
    const QString file = folder.filePath(QStringLiteral("a.rep"));
    const QString plainFile = folder.filePath(QStringLiteral("no program"));
    putFile(plainFile, "text");
    QFile::setPermissions(plainFile, QFile::ReadOwner);
    const AnsweredMessages messages(MessageAnswer::Ok);
    for (const QString &program : {folder.filePath(QStringLiteral("missing")), plainFile, folder.path(), QString()}) {
        kareport::launchEditor(program, file, folder.path());
    }
    kareport::launchEditor(editor.program, file, folder.filePath(QStringLiteral("missing")));
    EXPECT_EQ(messages.texts, QStringList()) << "nothing is said";
    kareport::launchEditor(editor.program, plainFile, folder.path());
    ASSERT_TRUE(editor.waitTillDone()) << "and the next one is started";
    EXPECT_EQ(editor.note("file"), plainFile.toStdString());
}

TEST(EditorLauncher, AHostMayStartProgramsItself)
{
    const FolderRestored restored;
    const StandIn editor;
    ASSERT_TRUE(QDir::setCurrent(editor.at(QString())));
    const QString here = QDir::currentPath();
    {
        const RecordedLaunches launches;
        kareport::launchEditor(editor.program, QStringLiteral("/t/a b.rep"), QStringLiteral("/t"));
        kareport::launchEditor(QStringLiteral("edit"), QStringLiteral("-x"), QString());
        ASSERT_EQ(launches.all.size(), 2U);
        EXPECT_EQ(launches.all[0].program, editor.program);
        EXPECT_EQ(launches.all[0].file, QStringLiteral("/t/a b.rep")) << "without quotes";
        EXPECT_EQ(launches.all[0].folder, QStringLiteral("/t"));
        EXPECT_EQ(launches.all[1].program, here + QStringLiteral("/edit")) << "full paths";
        EXPECT_EQ(launches.all[1].file, here + QStringLiteral("/-x"));
        EXPECT_EQ(launches.all[1].folder, QString());
    }
    const QString file = editor.at(QStringLiteral("a.rep"));
    kareport::launchEditor(editor.program, file, QString());
    ASSERT_TRUE(editor.waitTillDone()) << "without the host's, a process of its own again";
    EXPECT_EQ(editor.note("file"), QFile::encodeName(file).toStdString()) << "and only the last one was started";
}

} // namespace
