#include "PdfFixture.h"

#include <gtest/gtest.h>

#include <string>

// The text of a PDF, read back.

namespace
{

using kareport::PdfNotes;
using kareport::PdfOptions;

/// The points that a character of 9 points takes.
constexpr double characterWidth = 5.418;

TEST(PdfExportText, LinesAreOnTheirPages)
{
    struct Row
    {
        QString text;
        QStringList expected;
        const char *reason;
    };
    const QString sixty = QStringLiteral("line\r\n").repeated(59) + QStringLiteral("last of 60\r\n");
    const auto full = [](const char *last) { return QStringLiteral("line\n").repeated(59) + QString::fromUtf8(last); };
    const Row rows[] = {
        {QStringLiteral("A\r\n"), {QStringLiteral("A")}, "one line"},
        {QStringLiteral("A"), {QStringLiteral("A")}, "without its end"},
        {sixty, {full("last of 60")}, "the last line of a full page is there"},
        {sixty + QStringLiteral("61st\r\n"), {full("last of 60"), QStringLiteral("61st")}, "one line more"},
        {sixty + sixty, {full("last of 60"), full("last of 60")}, "two full pages"},
        {sixty + QString(200, u'\n'), {full("last of 60")}, "blank lines at the end make no page"},
        {QString(60, u'\n'), {QString()}, "empty lines alone"},
    };
    for (const Row &row : rows) {
        const PdfReadBack pdf(pdfBytes(row.text, pdfOptions()));
        EXPECT_EQ(pdf.columns(characterWidth), row.expected) << row.reason;
        EXPECT_EQ(pdf.pageCount(), row.expected.size()) << row.reason;
        EXPECT_EQ(pdf.check(), QString()) << row.reason;
    }
}

TEST(PdfExportText, AReportWithoutLinesHasNoPage)
{
    const QByteArray bytes = pdfBytes(u"", pdfOptions());
    EXPECT_TRUE(bytes.startsWith("%PDF-"));
    EXPECT_TRUE(bytes.trimmed().endsWith("%%EOF"));
    EXPECT_TRUE(bytes.contains("/Count 0")) << "the library writes it as it is";
}

TEST(PdfExportText, IsWhatIsSeenOfTheReport)
{
    struct Row
    {
        QStringView line;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"(a) \\ <b> [c] {d} %e /f", u"(a) \\ <b> [c] {d} %e /f", "what has a meaning in a PDF"},
        {u"a\rb", u"ab", "a lone CR ends nothing and draws nothing"},
        {u"a\fb", u"ab", "a form feed begins no page"},
        {QStringView(u"a\0b", 3), u"ab", "a zero ends nothing"},
        {u"a\u2028b\u2029c", u"abc", "separators end nothing"},
        {u"é°ßÄ½", u"é°ßÄ½", "Latin-1"},
        {u"\u0128\u0129\u015C\u010D\u010A", u"\u0128\u0129\u015C\u010D\u010A",
         "codes whose lower bytes are brackets, a backslash, line ends"},
        {u"\u2987\u2988\u29EB", u"\u2987\u2988\u29EB", "the higher byte as well"},
        {u"\u5C28\u5C0D\u5C5C", u"\u5C28\u5C0D\u5C5C", "the higher byte as well, in a collection's face"},
        {u"∞ ≤ Ω", u"∞ ≤ Ω", "signs"},
        {u"測量 é ∞", u"測量 é ∞", "CJK among others"},
        {u"a\xD83Dz", u"a\uFFFDz", "half a pair"},
        {u"a\xDE00", u"a\uFFFD", "the other half, at the end"},
    };
    for (const Row &row : rows) {
        PdfNotes notes;
        const PdfReadBack pdf(
            pdfBytes(QString(row.line.toString() + QStringLiteral("\r\nnext\r\n")), pdfOptions(), &notes));
        EXPECT_EQ(pdf.pages(), QStringList{row.expected.toString() + QStringLiteral("\nnext")}) << row.reason;
        EXPECT_EQ(pdf.check(), QString()) << row.reason;
        EXPECT_EQ(notes.warnings(), QStringList()) << row.reason;
    }
}

TEST(PdfExportText, TabsLeadToEveryEighthColumn)
{
    const PdfReadBack pdf(pdfBytes(QStringLiteral("0\t1\t12345678\t2\r\n1234567\t8\r\n\tx  y\r\n")));
    EXPECT_EQ(pdf.columns(characterWidth), QStringList{QStringLiteral("0       1       12345678        2\n"
                                                                      "1234567 8\n"
                                                                      "        x  y")});
}

TEST(PdfExportText, AWideLineGoesOnBelow)
{
    // There are 523.32 points of room: 173 characters of 5 points, which get no smaller.
    const std::u16string x173(173, u'x');
    struct Row
    {
        std::u16string line;
        std::u16string expected;
        const char *reason;
    };
    const Row rows[] = {
        {x173, x173, "fills the box"},
        {x173 + u"y", x173 + u"\ny", "a word that is wider than the box is broken at its edge"},
        {x173 + x173 + u"y z", x173 + u"\n" + x173 + u"\ny z", "and goes on"},
        {x173 + u" y", x173 + u"\ny", "a blank that crosses the edge is the break"},
        {x173.substr(1) + u" y", x173.substr(1) + u"\ny", "a blank in the last place is the break"},
        {u"ab " + x173, u"ab\n" + x173, "a word that does not fit goes below"},
        {u"ab " + x173 + u"y", u"ab\n" + x173 + u"\ny", "also one that is broken there"},
        {x173 + std::u16string(40, u' '), x173, "blanks beyond the edge need no line"},
    };
    for (const Row &row : rows) {
        const std::u16string text = row.line + u"\r\nnext\r\n";
        PdfOptions options = pdfOptions();
        options.page.fontSize = 5;
        const PdfReadBack pdf(pdfBytes(QStringView(text), options));
        EXPECT_EQ(pdf.columns(3.01), QStringList{QString::fromStdU16String(row.expected + u"\nnext")}) << row.reason;
    }
}

TEST(PdfExportText, EmptyLinesTakeTheirRoom)
{
    struct Row
    {
        QStringView between;
        int lines;
        const char *reason;
    };
    const QString blanks(200, u' ');
    const QString tabs = QString(21, u'\t') + QString(6, u' ') + u'x';
    const Row rows[] = {
        {u"", 1, "none"},
        {u"\r\n", 2, "one"},
        {u"\n\n\n", 4, "some"},
        {u"\f\r\n", 2, "a form feed is not seen"},
        {u"\r\r\r\n", 2, "CRs end nothing"},
        {u" \r\n", 2, "a blank"},
        {u"\t\r\n", 2, "a tab"},
    };
    for (const Row &row : rows) {
        const QString text = QStringLiteral("A\r\n") + row.between.toString() + QStringLiteral("B\r\nC\r\n");
        const std::vector<PdfWord> words = PdfReadBack(pdfBytes(text)).words();
        ASSERT_EQ(words.size(), 3U) << row.reason;
        EXPECT_NEAR(words[1].top - words[0].top, row.lines * (words[2].top - words[1].top), 0.01) << row.reason;
    }
    const std::vector<PdfWord> words =
        PdfReadBack(pdfBytes(QString(QStringLiteral("A\r\n") + blanks + QStringLiteral("\r\nB\r\n") + tabs +
                                     QStringLiteral("\r\nC\r\n"))))
            .words();
    ASSERT_EQ(words.size(), 4U);
    const double step = (words[1].top - words[0].top) / 2;
    EXPECT_NEAR(words[2].top - words[1].top, 2 * step, 0.01) << "tabs up to the edge at 5 points, the word below it";
    EXPECT_NEAR(words[3].top - words[2].top, step, 0.01);
    EXPECT_NEAR(words[2].left, 36, 0.01);
}

TEST(PdfExportText, AFullPageOfBrokenLinesLosesNone)
{
    QString text;
    for (int line = 1; line <= 61; ++line) {
        text += QStringLiteral("%1 %2\r\n").arg(QString(250, QChar(u'a' + line % 26))).arg(line);
    }
    const PdfReadBack pdf(pdfBytes(text, pdfOptions()));
    EXPECT_EQ(pdf.pageCount(), 3) << "120 lines of 5 points take two sheets, and one line another page";
    EXPECT_EQ(pdf.characters(), QString(text).remove(u' ').remove(u'\r').remove(u'\n'));
    for (const PdfWord &word : pdf.words()) {
        EXPECT_GE(word.left, 35.9) << word.text.toStdString();
        EXPECT_LE(word.right, 595.32 - 35.9) << word.text.toStdString();
        EXPECT_GE(word.top, 35.9) << word.text.toStdString();
        EXPECT_LE(word.bottom, 841.92 - 35.9) << word.text.toStdString();
    }
}

TEST(PdfExportText, APageMayHoldMoreThanALibraryCallTakes)
{
    QString words;
    while (words.size() < 70000) {
        words += QString::number(words.size()) + u' ';
    }
    struct Row
    {
        QString text;
        unsigned fontSize;
        const char *reason;
    };
    const Row rows[] = {
        {words, 9, "words"},
        {QString(70000, u'x'), 9, "a word"},
        {QStringLiteral("測").repeated(23000), 9, "characters of three bytes"},
        {QString(23000, u'x'), 1, "a single line that is longer than what is handed on at once"},
    };
    for (const Row &row : rows) {
        // A huge sheet: on a usual one the text gets so small that it is not read back.
        PdfOptions options = pdfOptions();
        options.page.pageSize = QSize(14000, 14000);
        options.page.resolution = 72;
        options.page.margins = QMargins();
        options.page.fontSize = row.fontSize;
        const PdfReadBack pdf(pdfBytes(QString(row.text + QStringLiteral("\r\nend\r\n")), options));
        EXPECT_EQ(pdf.pageCount(), 1) << row.reason;
        EXPECT_TRUE(pdf.characters() == QString(row.text).remove(u' ') + QStringLiteral("end")) << row.reason;
        EXPECT_EQ(pdf.check(), QString()) << row.reason;
    }
}

TEST(PdfExportText, ACharacterThatNoFaceHasIsReported)
{
    PdfNotes notes;
    const QString text = pdfLines(QStringLiteral("A\n😀 B 😀😀\n𝔸 C\n😀\n"));
    const PdfReadBack pdf(pdfBytes(text, pdfOptions(), &notes));
    EXPECT_EQ(pdf.pages(), QStringList{QStringLiteral("A\n\uFFFD B \uFFFD\uFFFD\n\uFFFD C\n\uFFFD")});
    ASSERT_EQ(notes.missing.size(), 2U);
    EXPECT_EQ(notes.missing[0].character, U'😀');
    EXPECT_EQ(notes.missing[0].count, 4);
    EXPECT_EQ(notes.missing[0].firstLine, 2);
    EXPECT_EQ(notes.missing[1].character, U'𝔸');
    EXPECT_EQ(notes.missing[1].count, 1);
    EXPECT_EQ(notes.missing[1].firstLine, 3);
    EXPECT_EQ(notes.warnings(),
              (QStringList{
                  QStringLiteral("no font has the character \"😀\" (U+1F600), first in line 2, 4 times in all"),
                  QStringLiteral("no font has the character \"𝔸\" (U+1D538), first in line 3, 1 times in all"),
              }));
    EXPECT_EQ(notes.problem, QString());
}

TEST(PdfExportText, TheLineOfAMissingCharacterIsCountedOverAllPages)
{
    PdfNotes notes;
    const QString text = QStringLiteral("line\r\n").repeated(130) + QStringLiteral("😀\r\n");
    pdfBytes(text, pdfOptions(), &notes);
    ASSERT_EQ(notes.missing.size(), 1U);
    EXPECT_EQ(notes.missing[0].firstLine, 131);
}

TEST(PdfExportText, OneByteAndTwoByteTextsGiveTheSameFile)
{
    std::string bytes = "Tab\tb\r\nlone\rCR\r\n\x85\x7F\xA0\xE9\xB0\xFF trailing   \r\n";
    bytes += std::string(300, 'x') + "\r\nlast";
    for (const std::string &text : {bytes, std::string(), std::string("\r\n")}) {
        const PdfOptions options = pdfOptions();
        QBuffer buffer;
        buffer.open(QIODevice::WriteOnly);
        const QLatin1StringView narrow(text.data(), static_cast<qsizetype>(text.size()));
        ASSERT_TRUE(kareport::writePdf(buffer, narrow, options));
        EXPECT_EQ(buffer.data(), pdfBytes(QString(narrow), options));
    }
}

TEST(PdfExportText, TheSameReportGivesTheSameBytes)
{
    const QString text = pdfLines(QStringLiteral("A é ∞ 測量\n😀\n"));
    const QByteArray first = pdfBytes(text);
    EXPECT_EQ(first, pdfBytes(text));
    for (const char *key : {"CreationDate", "ModDate"}) {
        EXPECT_FALSE(first.contains(key)) << key << " would tell when it was written";
    }
    EXPECT_FALSE(first.mid(first.lastIndexOf("trailer")).contains("/ID")) << "one is made of the time";
}

TEST(PdfExportText, TheFileSaysNothingOfItselfAndIsCompressed)
{
    const QByteArray bytes = pdfBytes(pdfLines(QStringLiteral("A é ∞ 測量\n")));
    const QByteArray objects = PdfReadBack(bytes).objects();
    for (const char *key : {"/Title", "/Author", "/Creator", "/Subject", "/Keywords", "/PageMode", "/PageLayout",
                            "/Outlines", "/PageLabels", "/OpenAction", "/Lang", "/Metadata"})
    {
        EXPECT_FALSE(objects.contains(key)) << key;
    }
    // As it is written: the page, two faces and what maps their characters.
    EXPECT_GE(bytes.count("/FlateDecode"), 5);
    EXPECT_EQ(bytes.count("stream\n") + bytes.count("stream\r\n"), 2 * bytes.count("/FlateDecode"))
        << "begin and end of every stream";
}

} // namespace
