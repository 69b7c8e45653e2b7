#include "CommandLine.h"
#include "PdfReadBack.h"

#include <QFile>

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <gtest/gtest.h>

namespace
{

QByteArray styledJob(const QByteArray &lines)
{
    return R"({"header": false, "page": {"linesPerPage": 60, "charsPerRow": 80}, "report": [)" + lines + "]}";
}

TEST(CommandLineKinds, TheRichTextImageHasTheStylesOfItsLines)
{
    const CommandLineFolder folder;
    folder.put("s.json", styledJob(R"({"line": "ABC"}, {"line": "X", "style": 1}, {"line": "\u221e{", "after": 0})"));
    const QByteArray image =
        "{\\rtf1\\ansi\\ansicpg1252\\deff0\\deflang1033{\\fonttbl{\\f8\\fnil\\fcharset0 Lucida Console;}}"
        "\\viewkind4\\uc1\\pard\\f1\\fs18 ABC \\par\\viewkind4\\uc1\\pard\\b\\f1\\fs18 X\\b0 \\par"
        "\\viewkind4\\uc1\\pard\\f1\\fs18 \\u8734?{ }";
    struct Row
    {
        const char *line;
        const char *reason;
    };
    const Row rows[] = {
        {"render s.json -o i.dat --as rtf-image", "a name that does not tell the kind"},
        {"render s.json -o i.dat -o r.rtf -o r.rep --as rtf-image", "beside other kinds"},
    };
    for (const Row &row : rows) {
        const ProgramRun run = folder.run(row.line);
        EXPECT_EQ(run.status, 0) << run.all().constData();
        EXPECT_EQ(folder.bytesOf("i.dat").toStdString(), image.toStdString()) << row.reason;
    }
    EXPECT_EQ(folder.bytesOf("r.rtf").toStdString(), image.toStdString())
        << "\".rtf\" is rich text of either kind, and the option says of which";
    ASSERT_EQ(folder.run("render s.json -o r.rtf").status, 0);
    EXPECT_TRUE(folder.bytesOf("r.rtf").startsWith("{\\rtf1"));
    EXPECT_FALSE(folder.bytesOf("r.rtf").contains("viewkind")) << "without it, as the view saves it";
}

TEST(CommandLineKinds, RichTextDoesNotHangOnAnotherOutput)
{
    const CommandLineFolder folder;
    folder.put("one.json", styledJob(R"({"line": "X", "style": 1}], "output": ["a.rtf")"));
    folder.put("two.json",
               styledJob(R"({"line": "X", "style": 1}], "output": [{"file": "i.rtf", "as": "rtf-image"}, "b.rtf")"));
    ASSERT_EQ(folder.run("render one.json").status, 0);
    ASSERT_EQ(folder.run("render two.json").status, 0);
    EXPECT_EQ(folder.bytesOf("a.rtf").toStdString(), folder.bytesOf("b.rtf").toStdString());
    EXPECT_TRUE(folder.bytesOf("i.rtf").contains("\\b0"));
}

TEST(CommandLineKinds, APdfSaysWhatTheJobAsks)
{
    const CommandLineFolder folder;
    folder.put("p.json", R"({"title": "Setting out", "now": "2024-03-05T14:07:00",
        "page": {"linesPerPage": 60, "charsPerRow": 80},
        "report": [{"heading": "A"}, {"line": "a"}, {"heading": "B"}, {"newPage": -1}, {"line": "b"}]})");
    ASSERT_EQ(folder.run("render p.json -o plain.pdf").status, 0);
    const ProgramRun run =
        folder.run("render p.json -o a.pdf -o b.rep -o c.pdf --set pdf.author=Ärger --set pdf.language=de");
    ASSERT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(run.err.toStdString(), "");
    EXPECT_EQ(folder.bytesOf("a.pdf"), folder.bytesOf("c.pdf"));
    const PdfReadBack pdf(folder.bytesOf("a.pdf"));
    EXPECT_EQ(pdf.info("Title"), QStringLiteral("Setting out"));
    EXPECT_EQ(pdf.info("Author"), QStringLiteral("Ärger"));
    EXPECT_EQ(pdf.info("Creator"), QStringLiteral("TALVEN"));
    EXPECT_EQ(pdf.outline(), QStringLiteral("A 1\nB 2\n"));
    EXPECT_EQ(pdf.labels(), (QStringList{QStringLiteral("1"), QStringLiteral("2")}));
    EXPECT_TRUE(pdf.objects().contains("/CreationDate (D:20240305140700)"));
    const PdfReadBack plain(folder.bytesOf("plain.pdf"));
    EXPECT_EQ(plain.info("Title"), QString());
    EXPECT_EQ(plain.outline(), QString());
    EXPECT_EQ(plain.pages(), pdf.pages());
    const ProgramRun wrong = folder.run("render p.json -o d.pdf --set pdf.language=d_d");
    EXPECT_EQ(wrong.status, 2);
    EXPECT_TRUE(wrong.err.startsWith("--set pdf.language=d_d: error: ")) << wrong.err.constData();
    EXPECT_FALSE(folder.names().contains(QStringLiteral("d.pdf")));
}

TEST(CommandLineKinds, ACharacterThatNoFontHasIsSaid)
{
    const CommandLineFolder folder;
    folder.put("e.json", styledJob(R"({"line": "a"}, {"line": "b \ud83d\ude00"}, {"line": "\ud83d\ude00"})"));
    const ProgramRun run = folder.run("render e.json -o e.pdf");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(run.err.toStdString(), "kareport: warning: \"e.pdf\": no font has the character \"\xF0\x9F\x98\x80\" "
                                     "(U+1F600), first in line 2, 2 times in all\n");
    EXPECT_EQ(folder.run("render e.json -o e.pdf --quiet").err, "");
}

TEST(CommandLineKinds, AnEmptyReportMakesNoPdf)
{
    const CommandLineFolder folder;
    folder.put("e.json", R"({"report": [], "output": ["e.pdf", "e.txt"]})");
    folder.put("e.pdf", "kept");
    const std::string said = "kareport: the report is empty, and a PDF has at least one page: \"" +
                             folder.path("e.pdf").toStdString() + "\" was not written\n";
    const ProgramRun run = folder.run("render e.json");
    EXPECT_EQ(run.status, 2);
    EXPECT_EQ(run.err.toStdString(), said);
    EXPECT_EQ(folder.bytesOf("e.pdf"), "kept");
    EXPECT_TRUE(QFile::exists(folder.path("e.txt"))) << "the other outputs are written";
    EXPECT_EQ(folder.run("render e.json --quiet").err.toStdString(), said) << "it is an error";
    folder.put("e.rep", "");
    const ProgramRun converted = folder.run("convert e.rep e.pdf");
    EXPECT_EQ(converted.status, 2) << converted.all().constData();
    EXPECT_EQ(folder.bytesOf("e.pdf"), "kept");
    const ProgramRun piped = folder.run("convert e.rep - --as pdf");
    EXPECT_EQ(piped.status, 2);
    EXPECT_EQ(piped.out, QByteArray());
    folder.put("blank.txt", "\r\n");
    ASSERT_EQ(folder.run("convert blank.txt e.pdf").status, 0) << "a blank line is a line";
    EXPECT_EQ(PdfReadBack(folder.bytesOf("e.pdf")).pageCount(), 1);
}

TEST(CommandLineKinds, RichTextThatShowsNothingMakesNoPdf)
{
    const CommandLineFolder folder;
    folder.put("e.pdf", "kept");
    folder.put("e.json", R"({"header": false, "report": [{"line": "{\\rtf1\\ansi}"}]})");
    folder.put("e.rtf", "{\\rtf1\\ansi}");
    for (const char *arguments : {"render e.json -o e.pdf", "convert e.rtf e.pdf"}) {
        const ProgramRun run = folder.run(arguments);
        EXPECT_EQ(run.status, 2) << arguments << run.all().constData();
        EXPECT_TRUE(run.err.contains("the report is empty")) << arguments << run.all().constData();
        EXPECT_EQ(folder.bytesOf("e.pdf"), "kept") << arguments;
    }
}

TEST(CommandLineKinds, AWideLineIsSaid)
{
    const CommandLineFolder folder;
    folder.put("w.txt", "narrow\n" + QByteArray(150, 'x') + "\n");
    const ProgramRun run = folder.run("convert w.txt w.pdf --set page.linesPerPage=72 --set page.paper=A4");
    EXPECT_EQ(run.status, 0);
    EXPECT_TRUE(run.err.startsWith("kareport: warning: \"w.pdf\": line 2 is wider than the page: the type is "))
        << run.err.constData();
}

TEST(CommandLineKinds, APdfGoesToStandardOutputAsWell)
{
    const CommandLineFolder folder;
    folder.put("s.json", styledJob(R"({"line": "on paper"})"));
    ASSERT_EQ(folder.run("render s.json -o s.pdf").status, 0);
    const ProgramRun run = folder.run("render s.json -o - --as pdf");
    EXPECT_EQ(run.status, 0);
    EXPECT_TRUE(run.out == folder.bytesOf("s.pdf"));
    EXPECT_EQ(PdfReadBack(run.out).pages(), QStringList(QStringLiteral("on paper")));
}

TEST(CommandLineKinds, AFontFileThatIsNotOneLeavesTheEarlierFile)
{
    const CommandLineFolder folder;
    folder.put("s.json", styledJob(R"({"line": "x"})"));
    folder.put("s.pdf", "kept");
    folder.put("fonts.conf", "<?xml version=\"1.0\"?><!DOCTYPE fontconfig SYSTEM \"fonts.dtd\"><fontconfig><dir>" +
                                 folder.path("").toUtf8() + "</dir></fontconfig>");
    const QByteArray configuration = folder.path("fonts.conf").toUtf8();
    const std::pair<const char *, const char *> fonts = {"FONTCONFIG_FILE", configuration.constData()};
    const ProgramRun none = runProgram(folder.path(""), words("render s.json -o s.pdf"), {fonts});
    EXPECT_EQ(none.status, 3);
    EXPECT_TRUE(none.err.contains("no fixed-pitch font was found")) << none.all().constData();
    folder.put("lucon.TTF", "this is not a font");
    const ProgramRun broken = runProgram(folder.path(""), words("render s.json -o s.pdf"), {fonts});
    EXPECT_EQ(broken.status, 3);
    EXPECT_TRUE(broken.err.contains("lucon.TTF\" cannot be used")) << broken.all().constData();
    EXPECT_EQ(folder.bytesOf("s.pdf"), "kept");
}

TEST(CommandLineKinds, CharactersThatAPdfCannotShowAreNotes)
{
    const CommandLineFolder folder;
    const char *job = R"({"page": {"linesPerPage": 72, "charsPerRow": 80}, "header": false, "report": [{"line": "a"},
        {"line": "\xF0\x9F\x98\x80 \xF0\x9F\x98\x80"}]})";
    folder.put("smile.json", QByteArray(job).replace("\\xF0\\x9F\\x98\\x80", "\xF0\x9F\x98\x80"));
    const ProgramRun run = folder.run("render smile.json -o a.txt -o a.pdf --notes notes.json");
    EXPECT_EQ(run.status, 0) << run.all().constData();
    EXPECT_EQ(run.err.count("no font has the character"), 1) << run.err.constData();
    const QJsonArray notes = QJsonDocument::fromJson(folder.bytesOf("notes.json")).array();
    ASSERT_EQ(notes.size(), 1) << folder.bytesOf("notes.json").constData();
    const QJsonObject note = notes[0].toObject();
    EXPECT_EQ(note[QStringLiteral("kind")].toString(), u"unshown-character");
    EXPECT_EQ(note[QStringLiteral("file")].toString().section(u'/', -1), u"a.pdf");
    EXPECT_EQ(note[QStringLiteral("count")].toInt(), 2);
    EXPECT_EQ(note[QStringLiteral("reportLine")].toInt(), 2);
    EXPECT_FALSE(note.contains(QStringLiteral("row"))) << "a report has no rows";
    QFile::remove(folder.path("a.txt"));
    QFile::remove(folder.path("a.pdf"));
    const ProgramRun strict = folder.run("render smile.json -o a.txt -o a.pdf --strict --notes strict.json");
    EXPECT_EQ(strict.status, 2) << strict.all().constData();
    EXPECT_TRUE(strict.err.contains("a.pdf: error: no font has the character")) << strict.err.constData();
    EXPECT_FALSE(QFile::exists(folder.path("a.txt"))) << "nothing is written, also not what comes before";
    EXPECT_FALSE(QFile::exists(folder.path("a.pdf")));
    EXPECT_EQ(folder.bytesOf("strict.json"), folder.bytesOf("notes.json"));
    EXPECT_EQ(folder.run("render smile.json -o a.txt --strict").status, 0) << "a text shows all of them";
}

} // namespace
