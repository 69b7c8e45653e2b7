#include "CommandLine.h"
#include "PdfReadBack.h"

#include <QFile>

#include <gtest/gtest.h>

namespace
{

/// A report of two pages with header lines, 8 lines a page.
QByteArray pagedJob()
{
    return R"({"title": "T", "now": "2024-03-05T14:07:00", "page": {"linesPerPage": 8, "charsPerRow": 80},
        "report": [{"line": "a\u00e9"}, {"line": "b"}, {"line": "c \u221e"}, {"line": "d"}, {"line": "e"}]})";
}

TEST(CommandLineConvert, AReportFileBecomesWhatTheReportBecame)
{
    const CommandLineFolder folder;
    folder.put("paged.json", pagedJob());
    ASSERT_EQ(folder.run("render paged.json -o a.rep -o a.txt -o a.rtf -o a.pdf").status, 0);
    for (const char *kind : {"rep", "txt", "rtf", "pdf"}) {
        const QByteArray line = QByteArray("convert a.rep b.") + kind;
        const ProgramRun run = folder.run(line.constData());
        EXPECT_EQ(run.status, 0) << run.all().constData();
        EXPECT_EQ(run.err.toStdString(), "") << kind;
        EXPECT_TRUE(folder.bytesOf((QByteArray("a.") + kind).constData()) ==
                    folder.bytesOf((QByteArray("b.") + kind).constData()))
            << kind << ": the pages of the PDF, too, are told from the header lines";
    }
    EXPECT_EQ(PdfReadBack(folder.bytesOf("b.pdf")).pageCount(), 2);
}

TEST(CommandLineConvert, RichTextIsReadAndWritten)
{
    const CommandLineFolder folder;
    folder.put("a.rtf", "{\\rtf1\\ansi{\\fonttbl{\\f0 Courier;}}\\f0 one \\b two\\b0\\par th\\'e9\\u8734?\\par}");
    struct Row
    {
        const char *line;
        const char *file;
        QByteArray bytes;
        const char *reason;
    };
    const Row rows[] = {
        {"convert a.rtf b.txt", "b.txt", "one two\nth\xC3\xA9\xE2\x88\x9E\n", "every paragraph is a line"},
        {"convert a.rtf b.rep", "b.rep", "\xEF\xBB\xBFone two\r\r\nth\xC3\xA9\xE2\x88\x9E\r\r\n", "a report file"},
        {"convert b.rep c.rtf --as rtf-image", "c.rtf",
         "{\\rtf1\\ansi\\ansicpg1252\\deff0\\deflang1033{\\fonttbl{\\f8\\fnil\\fcharset0 Lucida Console;}}"
         "\\viewkind4\\uc1\\pard\\f1\\fs18 one two \\par\\viewkind4\\uc1\\pard\\f1\\fs18 th\xE9\\u8734? \\par}",
         "the image for a word processor, line by line"},
    };
    for (const Row &row : rows) {
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, 0) << run.all().constData();
        EXPECT_EQ(folder.bytesOf(row.file).toStdString(), row.bytes.toStdString()) << row.reason;
    }
}

TEST(CommandLineConvert, PlainTextHasItsPagesAsTheCommandLineSays)
{
    const CommandLineFolder folder;
    folder.put("a.txt", "1\n2\n3\n4\n5\n");
    ASSERT_EQ(folder.run("convert a.txt a.pdf --set page.linesPerPage=2 --set page.paper=Letter").status, 0);
    EXPECT_EQ(PdfReadBack(folder.bytesOf("a.pdf")).pageCount(), 3);
    EXPECT_EQ(PdfReadBack(folder.bytesOf("a.pdf")).pageSize(), QStringLiteral("612 x 792 pts (letter)"))
        << "the paper is the one that was set";
    ASSERT_EQ(folder.run("convert a.txt b.pdf").status, 0);
    EXPECT_EQ(PdfReadBack(folder.bytesOf("b.pdf")).pageCount(), 1) << "as measured: a page has room for more";
}

TEST(CommandLineConvert, WrongInputIsSaidWithItsPlace)
{
    struct Row
    {
        QByteArray bytes;
        const char *message;
        const char *reason;
    };
    const Row rows[] = {
        {"ok\nb\xE9y\n", "in.rep:2:2: error: a report file was expected; this is not UTF-8\n", "Latin-1"},
        {"%PDF-1.3 \xFF", "in.rep:1:1: error: a saved report was expected; this is a PDF\n", "a PDF"},
    };
    for (const Row &row : rows) {
        const CommandLineFolder folder;
        folder.put("in.rep", row.bytes);
        folder.put("out.txt", "kept");
        const ProgramRun run = folder.run("convert in.rep out.txt");
        EXPECT_EQ(run.status, 2) << row.reason;
        EXPECT_EQ(run.err.toStdString(), row.message) << row.reason;
        EXPECT_EQ(folder.bytesOf("out.txt"), "kept") << row.reason;
    }
    const CommandLineFolder folder;
    const ProgramRun missing = folder.run("convert none.rep out.txt");
    EXPECT_EQ(missing.status, 2);
    EXPECT_TRUE(missing.err.startsWith("none.rep: error: ")) << missing.all().constData();
    folder.put("in.rtf", "{\\rtf1 cut {\\b off");
    const ProgramRun cut = folder.run("convert in.rtf out.txt");
    EXPECT_EQ(cut.status, 2);
    EXPECT_TRUE(cut.err.startsWith("in.rtf:1:")) << cut.all().constData();
}

TEST(CommandLineConvert, AWrongCommandLineIsSaid)
{
    struct Row
    {
        const char *line;
        const char *message;
    };
    const Row rows[] = {
        {"convert a.rep b.dat", "the ending of \"b.dat\" does not say the kind"},
        {"convert a.rep b.dat --as tiff",
         "--as: one of rep, text, rtf, pdf, rtf-image, xlsx, html, csv, jsonl was expected"},
        {"convert a.rep b.pdf --set title=x", "a key of the page was expected"},
        {"convert a.rep b.pdf --set page.linesPerPage=0", "linesPerPage"},
        {"convert a.rep", "OUT"},
    };
    const CommandLineFolder folder;
    folder.put("a.rep", "a\n");
    for (const Row &row : rows) {
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, 1) << row.line << "\n" << run.all().constData();
        EXPECT_TRUE(run.err.contains(row.message)) << run.all().constData();
    }
}

TEST(CommandLineConvert, WhatIsPassedOverIsSaid)
{
    const CommandLineFolder folder;
    folder.put("a.rtf", "{\\rtf1 x{\\pict\\wmetafile8 0102}y\\par}");
    const ProgramRun run = folder.run("convert a.rtf -");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(run.out, "xy\n");
    EXPECT_TRUE(run.err.startsWith("kareport: warning: \"a.rtf\": ")) << run.all().constData();
    EXPECT_EQ(folder.run("convert a.rtf - --quiet").err, "");
}

TEST(CommandLineConvert, APdfOfRichTextHasTheReportsPages)
{
    const CommandLineFolder folder;
    folder.put("paged.json", pagedJob());
    ASSERT_EQ(folder.run("render paged.json -o a.rtf -o a.pdf").status, 0);
    ASSERT_EQ(folder.run("convert a.rtf b.pdf").status, 0);
    EXPECT_TRUE(folder.bytesOf("a.pdf") == folder.bytesOf("b.pdf"));
}

TEST(CommandLineConvert, ANoBreakSpaceStaysOne)
{
    const CommandLineFolder folder;
    folder.put("a.txt", "a\xC2\xA0m\n");
    ASSERT_EQ(folder.run("convert a.txt a.rtf").status, 0);
    EXPECT_EQ(folder.run("convert a.rtf -").out, "a\xC2\xA0m\n");
}

TEST(CommandLineConvert, RichTextMayHaveSomethingInFront)
{
    for (const char *front : {"", "\xEF\xBB\xBF", " \r\n\t", "\xEF\xBB\xBF\n"}) {
        const CommandLineFolder folder;
        folder.put("a.rtf", QByteArray(front) + "{\\rtf1 x\\par}");
        EXPECT_EQ(folder.run("convert a.rtf -").out, "x\n");
    }
}

TEST(CommandLineConvert, MarginsThatLeaveNoRoomAreSaid)
{
    struct Row
    {
        const char *line;
        int status;
    };
    const Row rows[] = {
        {"convert a.txt a.pdf --set page.linesPerPage=9 --set page.margins=[99999,1000,1200,2000]", 3},
        {"convert a.txt a.pdf --set page.linesPerPage=9 --set page.margins=[1000,40000,1200,2000]", 3},
        {"convert a.txt a.pdf --set page.margins=[0,99999,0,0]", 1},
    };
    const CommandLineFolder folder;
    folder.put("a.txt", "a\n");
    for (const Row &row : rows) {
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, row.status) << run.all().constData();
        EXPECT_TRUE(run.err.startsWith("kareport: ") && run.err.contains("the margins leave no room"))
            << run.all().constData();
        EXPECT_FALSE(QFile::exists(folder.path("a.pdf")));
    }
}

} // namespace
