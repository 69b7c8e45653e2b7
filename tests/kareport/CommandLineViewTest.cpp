#include "CommandLine.h"

#include <QTest>

#include <gtest/gtest.h>

namespace
{

/// A folder with a program instead of the desktop program, which notes what it is started with.
class ViewFolder : public JobFolder
{
public:
    ViewFolder()
    {
        put("kareport-desk",
            "#!/bin/sh\nprintf '%s\\n' \"$#\" \"$1\" > \"$NOTE.part\" && mv \"$NOTE.part\" \"$NOTE\"\n");
        QFile::setPermissions(path("kareport-desk"), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    }
};

TEST(CommandLineView, WhatCannotBeShownIsSaid)
{
    struct Row
    {
        QStringList arguments;
        const char *display;
        int status;
        const char *message;
        const char *reason;
    };
    const JobFolder folder;
    folder.put("a.rep", "TALVEN\r\r\n");
    folder.put("a.pdf", "%PDF-1.4");
    folder.put("pdf.rep", "%PDF-1.4");
    const Row rows[] = {
        {{QStringLiteral("view")}, ":9", 1, "FILE was expected", "no file"},
        {{QStringLiteral("view"), QStringLiteral("gone.rep")}, ":9", 2, "gone.rep", "a file that is not there"},
        {{QStringLiteral("view"), QStringLiteral(".")}, ":9", 2, "there is no file", "a folder"},
        {{QStringLiteral("view"), QStringLiteral("a.pdf")}, ":9", 2, "A PDF cannot be opened as a report", "a PDF"},
        {{QStringLiteral("view"), QStringLiteral("pdf.rep")}, ":9", 2, "A PDF cannot", "by its first bytes"},
        {{QStringLiteral("view"), QStringLiteral("a.rep")}, "", 3, "DISPLAY", "nowhere to show it"},
    };
    for (const Row &row : rows) {
        const ProgramRun run =
            runProgram(folder.path(), row.arguments, {{"DISPLAY", row.display}, {"WAYLAND_DISPLAY", ""}});
        EXPECT_EQ(run.status, row.status) << row.reason << "\n" << run.all().toStdString();
        EXPECT_TRUE(run.err.contains(row.message)) << row.reason << "\n" << run.all().toStdString();
    }
}

TEST(CommandLineView, TheDesktopProgramIsStartedWithTheFile)
{
    // A copy of the program is in a folder of its own, so that it finds the other one on the path.
    const JobFolder bin;
    ASSERT_TRUE(QFile::copy(QStringLiteral(KAREPORT_PROGRAM), bin.path("kareport")));
    const ViewFolder folder;
    for (const char *name : {"a b.rep", "-x.rep", "$(touch hacked).rep", "quote\".rep", "\xE4\xB8\xAD.rep"}) {
        folder.put(name, "TALVEN\r\r\n");
        const QString note = folder.path("note");
        QFile::remove(note);
        QProcess process;
        QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
        environment.insert(QStringLiteral("PATH"), folder.path() + u':' + environment.value(QStringLiteral("PATH")));
        environment.insert(QStringLiteral("NOTE"), note);
        environment.insert(QStringLiteral("DISPLAY"), QStringLiteral(":9"));
        process.setProcessEnvironment(environment);
        process.setWorkingDirectory(folder.path());
        process.start(bin.path("kareport"), {QStringLiteral("view"), QStringLiteral("--"), QString::fromUtf8(name)});
        ASSERT_TRUE(process.waitForFinished()) << name;
        EXPECT_EQ(process.exitCode(), 0) << name << process.readAllStandardError().toStdString();
        EXPECT_TRUE(QTest::qWaitFor([&note] { return QFile::exists(note); })) << name;
        EXPECT_EQ(folder.bytesOf("note"), "1\n" + QFile::encodeName(folder.path(name)) + "\n") << name;
    }
    EXPECT_FALSE(folder.names().contains(QStringLiteral("hacked"))) << "no shell reads a name";
}

} // namespace
