#include "RichTextDescription.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QTextDocument>

#include <random>

using richtext::expectBodies;
using richtext::Row;
using richtext::shown;

namespace
{

TEST(RichTextReader, ReadsTheFormOfAReport)
{
    EXPECT_EQ(shown("{\\rtf1\\ansi\\ansicpg1252\\deff0\\deflang1033{\\fonttbl{\\f9\\fnil\\fcharset0 Lucida Console;}}"
                    "\\viewkind4\\uc1\\pard\\f1\\fs18 ABC \\par\\viewkind4\\uc1\\pard\\b\\f1\\fs18 X\\b0 \\par}"),
              QStringLiteral("<Lucida Console 9pt>ABC |<Lucida Console 9pt b>X"))
        << "font 1 is not in the table: the first one is used; the blank after ABC is text, that after b0 is not";
}

TEST(RichTextReader, KnowsRichTextByItsBeginning)
{
    struct BeginningRow
    {
        const char *text;
        bool expected;
        const char *reason;
    };
    constexpr BeginningRow rows[] = {
        {"{\\rtf1}", true, "the usual one"},
        {"{\\rtf", true, "nothing follows it"},
        {"", false, "nothing"},
        {"{\\rt", false, "cut off"},
        {" {\\rtf1}", false, "a blank before it"},
        {"{\\RTF1}", false, "words are in small letters"},
        {"{\\urtf1}", false, "another word"},
    };
    for (const BeginningRow &row : rows) {
        EXPECT_EQ(kareport::isRichText(QByteArrayView(row.text)), row.expected) << row.reason;
        EXPECT_EQ(kareport::isRichText(QString::fromLatin1(row.text)), row.expected) << row.reason;
    }
}

TEST(RichTextReader, EndsParagraphs)
{
    const Row rows[] = {
        {"", u"", "nothing: one empty paragraph"},
        {"A", u"A", "a text without an end of its paragraph"},
        {"A\\par", u"A", "no empty paragraph after the last end"},
        {"A\\par\\par", u"A|", "an empty paragraph with an end of its own is one"},
        {"\\par", u"", "one empty paragraph"},
        {"\\par\\par\\par", u"||", "three empty ones"},
        {"\\par A", u"|A", "an empty one before a text"},
        {"A\\\nB\\\r\nC\\\rD", u"A|B|C|D", "an escaped line end ends the paragraph"},
        {"A\nB\r\nC", u"ABC", "a line end that is not escaped is ignored"},
        {"A\\par\nB", u"A|B", "a line end ends a word"},
        {"A\\par B\\par  C", u"A|B| C", "one blank ends a word, the next is text"},
        {"A\\line B",
         u"A\u2028"
         u"B",
         "a line end within the paragraph"},
        {"A\\'0dB\\u10?C\\u8233?D", u"A|B|C|D", "characters that end paragraphs do"},
        {QByteArray("A\0B\\p\0ar C", 11), u"ABar C", "zero bytes are left out, and end a word"},
        {"A}B", u"A", "what follows the last group is not read"},
        {"A\\parx B", u"AB", "a word that is not known is left out"},
        {"A\\par1 B", u"A|B", "a number without a meaning"},
        {"a\tb\\tab c\\\td", u"a\tb\tc\td", "a tab in all its forms"},
    };
    expectBodies(rows);
}

TEST(RichTextReader, ReadsNamedCharacters)
{
    const Row rows[] = {
        {"\\{\\}\\\\", u"{}\\", "escaped"},
        {"\\emdash\\endash\\lquote\\rquote\\ldblquote\\rdblquote\\bullet", u"—–‘’“”•", "named"},
        {"\\~\\-\\_", u"\u00A0\u00AD\u2011", "blank without a break, soft hyphen, hyphen without a break"},
        {"\\emspace\\enspace\\qmspace\\zwj\\zwnj\\ltrmark\\rtlmark\\zwbo\\zwnbo",
         u"\u2003\u2002\u2005\u200D\u200C\u200E\u200F\u200B\u2060", "blanks and marks"},
        {"a\\:b\\|c\\ d", u"abcd", "symbols of index entries, and unknown ones, show nothing"},
        {"\\'zzA\\'4", u"zzA4", "no hexadecimal digits: what follows is text"},
    };
    expectBodies(rows);
}

TEST(RichTextReader, ReadsUnicodeCharactersAndLeavesOutWhatStandsForThem)
{
    const Row rows[] = {
        {"\\u8364?x", u"€x", "one character for old readers"},
        {"\\u8364 ?x", u"€x", "a blank ends the word and is not counted"},
        {"\\u-3857?", u"\xF0EF", "numbers are signed"},
        {"\\u26085\\'93\\'fax", u"日\xFAx", "each byte is one"},
        {"\\uc2\\u26085\\'93\\'fax", u"日x", "two stand for it"},
        {"\\uc0\\u8364 x", u"€x", "nothing stands for it"},
        {"\\uc0\\u8364x", u"€x", "a letter ends the word"},
        {"{\\uc0 {\\u8364 a}\\u8364 b}\\u8364 cd", u"€a€b€d", "the count belongs to the group"},
        {"\\uc3\\u8364 a}b", u"€", "the end of a group ends it; it is the last one here"},
        {"{\\uc3\\u8364 a}bcd", u"€bcd", "the end of a group ends it"},
        {"\\uc3\\u8364 a{bcd}e", u"€bcde", "the beginning of a group ends it"},
        {"\\uc2\\u8364\\emdash\\endash x", u"€x", "a word counts as one"},
        {"\\uc2\\u8364\\~\\{x", u"€x", "a symbol counts as one"},
        {"\\u8364\n?x", u"€x", "a line end does not count"},
        {"\\u55357?\\u56832?", u"😀", "both halves of a pair"},
        {"\\u-10179?\\u-8704?", u"😀", "both halves, signed"},
        {"\\u55357\\u56832?x", u"😀x", "a Unicode character never stands for another"},
        {"\\u128512?", u"😀", "in one number"},
        {"\\u1114112?", u"\xFFFD", "beyond the last character"},
        {"\\u-99999?\\u2147483648?", u"\xFFFD\xFFFD", "out of range"},
        {"a\\u0?b", u"ab", "a zero shows nothing"},
        {"\\u64976?\\u64977?", u"\xFFFD\xFFFD", "no characters, but a document's own marks"},
        {"\\uc-1\\u8364 x", u"€x", "a count below zero is ignored"},
        {"\\uc99999999999\\u8364 abc{d}", u"€d", "a huge count"},
        {"\\u?x", u"x", "without a number"},
    };
    expectBodies(rows);
}

TEST(RichTextReader, ReadsTablesAsLinesWithTabs)
{
    const Row rows[] = {
        {"\\trowd\\cellx1000\\cellx2000\\intbl A\\cell B\\cell\\row\\pard C\\par", u"A\tB|C", "two cells"},
        {"\\cell\\cell\\cell\\row x", u"\t\t|x", "empty cells"},
        {"A\\cell\\row B\\cell\\row", u"A|B", "a cell a row"},
        {"A\\par B\\cell C\\cell\\row", u"A|B\tC", "two paragraphs in a cell"},
        {"A\\cell x\\nestcell y\\nestcell{\\*\\nesttableprops\\trowd\\cellx1\\nestrow}{\\nonesttables\\par}\\cell\\row z",
         u"A\tx\ty|z", "a table in a table"},
        {"A\\cell\\par B\\cell\\row", u"A\t|B", "a cell that begins with an empty paragraph"},
        {"A\\cell B", u"A\tB", "cut off in a row"},
    };
    expectBodies(rows);
}

TEST(RichTextReader, ReadsWhatGroupsAreFor)
{
    const Row rows[] = {
        {"a{\\field{\\*\\fldinst HYPERLINK \"x\"}{\\fldrslt link}}b", u"alinkb", "a field shows its result"},
        {"{\\listtext\\'95\\tab}x{\\pntext 1.\\tab}y", u"•\tx1.\ty", "marks of lists"},
        {"{\\upr{ansi}{\\*\\ud{unicode}}}", u"unicode", "of two forms the one in Unicode"},
        {"{\\*\\unheardof{deep}text}x", u"x", "an unknown group that not every reader has to know"},
        {"{\\unheardof text}x", u"textx", "an unknown word and then text"},
        {"{\\info{\\title T}{\\author A}}{\\stylesheet{\\s0 Normal;}}{\\*\\generator G;}x", u"x", "about the file"},
        {"{\\*\\bkmkstart b}x{\\*\\bkmkend b}{\\xe{index}}{\\tc{contents}}", u"x", "marks in the text"},
        {"a{\\v hidden{\\par more}}b\\v c\\v0 d", u"abd", "hidden text is not shown"},
        {"a{\\*\\cs13 b}c\\*\\cs0 d{\\i e\\*\\cs13 f}", u"abcd<i>ef", "a character style says nothing of its group"},
        {"{\\*\\ts11 a}{\\*\\ds1 b}{\\*\\s2 c}", u"abc", "nor do the styles of tables, sections and paragraphs"},
        {"a{\\*\\b b}c", u"a<b>b<>c", "nor does any word that is known and is not what a group is for"},
        {"a{\\*\\pict 00}{\\*\\footnote b}c", u"ac", "what a group is for, with the mark or without"},
        {"a{\\*}b{\\* text}", u"ab text", "the mark without a word"},
    };
    expectBodies(rows);
}

TEST(RichTextReader, PassesOverBinaryDataByTheirLength)
{
    const Row rows[] = {
        {"a\\bin3 }{\\b", u"ab", "bytes that look like the end of a group"},
        {"a\\bin3}{\\b", u"ab", "without a blank"},
        {"a\\bin0 b\\bin c\\bin-4 d", u"abcd", "no data"},
        {"a{\\pict\\bin5 }}}}}}b", u"ab", "a picture"},
        {"a\\u8364\\bin2 }}b", u"a€b", "data count as one character"},
    };
    expectBodies(rows);
}

TEST(RichTextReader, ReplacesTheDocumentAndKeepsNoUndoSteps)
{
    QTextDocument document(QStringLiteral("before"));
    document.setModified(true);
    EXPECT_FALSE(kareport::readRichText(QByteArrayView("{\\rtf1 new}"), document));
    EXPECT_EQ(document.toPlainText(), QStringLiteral("new"));
    EXPECT_TRUE(document.isUndoRedoEnabled());
    EXPECT_FALSE(document.isUndoAvailable());
    EXPECT_FALSE(document.isModified());
}

/// Rich texts of all kinds: those of the reports, and those that were found to be hard.
QList<QByteArray> manyRichTexts()
{
    QList<QByteArray> texts;
    for (const QString &folder : {QStringLiteral(KAREPORT_TEST_DIR "/golden"),
                                  QStringLiteral(KAREPORT_TEST_DIR "/../fuzz/corpus/FuzzRichText")})
    {
        for (const QFileInfo &info : QDir(folder).entryInfoList(QDir::Files, QDir::Name)) {
            QFile file(info.filePath());
            if (file.open(QIODevice::ReadOnly)) {
                texts.append(file.readAll());
            }
        }
    }
    return texts;
}

TEST(RichTextReader, ReadsTheCharactersAloneAsADocumentHasThem)
{
    const QList<QByteArray> texts = manyRichTexts();
    ASSERT_GT(texts.size(), 20);
    std::mt19937 random(20240305);
    for (int round = 0; round < 1500; ++round) {
        QByteArray bytes = texts[round % texts.size()];
        // Behind the first rounds, with pieces cut out and doubled.
        for (int cut = 0; round >= texts.size() && cut < 3 && bytes.size() > 10; ++cut) {
            const qsizetype at = 6 + static_cast<qsizetype>(random()) % (bytes.size() - 6);
            const qsizetype count = std::min<qsizetype>(static_cast<qsizetype>(random()) % 20, bytes.size() - at);
            const QByteArray piece = bytes.mid(at, count);
            random() % 2 == 0 ? bytes.remove(at, count) : bytes.insert(at, piece);
        }
        QTextDocument document;
        kareport::RichTextNotes notes;
        const auto error = kareport::readRichText(QByteArrayView(bytes), document, &notes);
        QString text = QStringLiteral("old");
        kareport::RichTextNotes textNotes;
        const auto textError = kareport::readRichTextCharacters(bytes, text, &textNotes);
        ASSERT_EQ(text, document.toRawText()) << bytes.constData();
        ASSERT_EQ(error.has_value(), textError.has_value());
        if (error) {
            ASSERT_EQ(error->text, textError->text);
            ASSERT_EQ(error->place.line, textError->place.line);
        }
        ASSERT_EQ(notes.texts(), textNotes.texts());
    }
}

} // namespace
