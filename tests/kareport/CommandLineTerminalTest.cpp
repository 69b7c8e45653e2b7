#include "CommandLine.h"

#include "Printing.h"

#include <gtest/gtest.h>

// Names, keys and texts that are not ours must not command the terminal that they are shown on.

namespace
{

TEST(CommandLineTerminal, WhatWouldCommandATerminalIsMadeVisible)
{
    struct Row
    {
        const char *text;
        const char *visible;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"", "", "nothing"},
        {"plain ~ text", "plain ~ text", "as it is"},
        {"äöü 測 😀 e\u0301", "äöü 測 😀 e\u0301", "letters of the world"},
        {"\x1b[31mred", "\\u001b[31mred", "the escape character"},
        {"a\nb\rc\td\a\b", "a\\u000ab\\u000dc\\u0009d\\u0007\\u0008", "a line of its own would look like one of ours"},
        {"\x7f", "\\u007f", "delete"},
        {"\u009b31m\u0085", "\\u009b31m\\u0085", "the same commands as single characters"},
        {"a\u2028b\u2029", "a\\u2028b\\u2029", "line ends"},
        {"\u202egnp.exe\u2066", "\\u202egnp.exe\\u2066", "letters turned around"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(kareport::visibleText(QString::fromUtf8(row.text)), QString::fromUtf8(row.visible)) << row.reason;
    }
}

TEST(CommandLineTerminal, NothingThatIsPrintedHoldsACommand)
{
    const QByteArray evil = "\x1b]0;x\x07\xC2\x9B";
    CommandLineFolder folder;
    folder.put("evil.json", "{\"report\": [], \"k\\u001b[31m\\u009b\\n\": 1}");
    folder.put((evil + ".json").constData(), folder.bytesOf("job.json"));
    folder.put(
        "evil.xml",
        controlTemplates().replace("<Name>SITE", "<Name>" + evil + "SITE").replace("<Title>Site", "<Title>" + evil));
    folder.put((evil + ".csv").constData(), "Number,Northing\n1,\x1b[31m\n");
    folder.put("data.json", folder.bytesOf("job.json").replace("points.csv", "\\u001b]0;x\\u0007\\u009b.csv"));
    const QString name = QString::fromUtf8(evil);
    const QStringList lines[] = {
        {QStringLiteral("render"), QStringLiteral("evil.json")},
        {QStringLiteral("render"), name},
        {QStringLiteral("render"), QStringLiteral("data.json"), QStringLiteral("--progress")},
        {QStringLiteral("render"), name + QStringLiteral(".json"), QStringLiteral("job.json"),
         QStringLiteral("--progress"), QStringLiteral("-o"), QStringLiteral("{}.txt")},
        {QStringLiteral("render"), QStringLiteral("job.json"), QStringLiteral("--") + name},
        {QStringLiteral("render"), QStringLiteral("job.json"), QStringLiteral("--set"), name + QStringLiteral("=1")},
        {QStringLiteral("render"), QStringLiteral("job.json"), QStringLiteral("-o"), name + QStringLiteral("/x.txt")},
        {QStringLiteral("templates"), QStringLiteral("evil.xml")},
        {QStringLiteral("templates"), QStringLiteral("evil.xml"), QStringLiteral("--json")},
        {QStringLiteral("templates"), QStringLiteral("evil.xml"), QStringLiteral("--name"), name},
        {QStringLiteral("check"), name + QStringLiteral(".json")},
        {QStringLiteral("convert"), name, QStringLiteral("x.txt")},
        {QStringLiteral("view"), name},
        {QStringLiteral("watch"), name},
        {QStringLiteral("new"), name + QStringLiteral("/x/y")},
        {QStringLiteral("new"), QStringLiteral("x") + name, QStringLiteral("--parents")},
        {QStringLiteral("help"), name},
        {QStringLiteral("completion"), name},
        {name},
    };
    for (const QStringList &line : lines) {
        const ProgramRun run = runProgram(folder.path(), line, {{"LC_ALL", "C.UTF-8"}});
        const QByteArray all = run.out + run.err;
        EXPECT_TRUE(all.contains("\\u001b")) << qPrintable(line.join(u' ')) << all.constData();
        EXPECT_FALSE(all.contains('\x1b') || all.contains('\a') || all.contains("\xC2\x9B"))
            << qPrintable(line.join(u' ')) << all.toPercentEncoding().constData();
    }
}

TEST(CommandLineTerminal, TheReportItselfIsWhatTheJobSays)
{
    const CommandLineFolder folder;
    folder.put("job.json", R"({"header": false, "page": {"linesPerPage": 9, "charsPerRow": 9},
        "report": [{"line": "a\u001bb"}]})");
    EXPECT_EQ(folder.run("render job.json").out, "a\x1b"
                                                 "b\n");
}

} // namespace
