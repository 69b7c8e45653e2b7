#include "RichTextDescription.h"

#include <QRandomGenerator>

using kareport::readRichText;
using kareport::RichTextNotes;

namespace
{

struct ErrorRow
{
    QByteArray bytes;
    qsizetype line;
    qsizetype column;
    const char *error;
    QStringView text;
    const char *reason;
};

TEST(RichTextError, SaysWhatWasExpectedAndKeepsWhatWasRead)
{
    const char *beginning = "a rich text that begins with {\\rtf was expected";
    const char *one = "a closing brace was expected: groups that are still open: 1";
    const char *two = "a closing brace was expected: groups that are still open: 2";
    const ErrorRow rows[] = {
        {"", 1, 1, beginning, u"", "an empty file"},
        {"{\\rt", 1, 1, beginning, u"", "cut off in the first word"},
        {"plain text", 1, 1, beginning, u"", "not rich text"},
        {QByteArray(8, '\0'), 1, 1, beginning, u"", "zeros"},
        {"{\\rtf", 1, 6, one, u"", "cut off after the first word"},
        {"{\\rtf1 a\nbc", 2, 3, one, u"abc", "cut off in the text"},
        {"{\\rtf1 a\\par\nb{\\b c", 2, 7, two, u"a|b<b>c", "cut off in a group"},
        {"{\\rtf1 a\\", 1, 9, one, u"a", "cut off after a backslash"},
        {"{\\rtf1 a\\'", 1, 11, one, u"a", "cut off in a byte"},
        {"{\\rtf1 a\\'b", 1, 12, one, u"ab", "cut off in a byte: no byte"},
        {"{\\rtf1 a{\\pict 00{ff", 1, 21, "a closing brace was expected: groups that are still open: 3", u"a",
         "cut off in a picture"},
        {"{\\rtf1 a\n\\bin5 123}", 2, 1, "5 bytes of data were expected after \\bin", u"a",
         "one byte of data is missing"},
        {"{\\rtf1 a\\bin99999999999 }", 1, 9, "2147483647 bytes of data were expected after \\bin", u"a",
         "far too many"},
        {"{\\rtf1 a{\\*\\x \\bin9 }}", 1, 15, "9 bytes of data were expected after \\bin", u"a", "in what is skipped"},
        {"{\\rtf1 \xB0\xB0{", 1, 11, two, u"°°", "columns of a file are bytes"},
    };
    for (const ErrorRow &row : rows) {
        QTextDocument document(QStringLiteral("before"));
        const auto error = readRichText(QByteArrayView(row.bytes), document);
        ASSERT_TRUE(error) << row.reason;
        EXPECT_EQ(error->place.line, row.line) << row.reason;
        EXPECT_EQ(error->place.column, row.column) << row.reason;
        EXPECT_EQ(error->text, QString::fromLatin1(row.error)) << row.reason;
        EXPECT_EQ(richtext::described(document), row.text) << row.reason;
    }
}

TEST(RichTextError, ColumnsOfATextAreCharacters)
{
    QTextDocument document;
    const auto error = readRichText(QStringView(u"{\\rtf1\n測😀°"), document);
    ASSERT_TRUE(error);
    EXPECT_EQ(error->place.line, 2);
    EXPECT_EQ(error->place.column, 4);
    EXPECT_EQ(document.toPlainText(), QStringLiteral("測😀°"));
}

TEST(RichTextError, GroupsAreReadToALimitedDepth)
{
    for (const char *group : {"{", "{\\b ", "{\\*\\x ", "{\\pict "}) {
        const QByteArray open(group);
        const auto deep = [&](int count) { return "{\\rtf1 a" + open.repeated(count) + QByteArray(count + 1, '}'); };
        QTextDocument document;
        EXPECT_FALSE(readRichText(QByteArrayView(deep(9999)), document)) << group;
        const auto error = readRichText(QByteArrayView(deep(1000000)), document);
        ASSERT_TRUE(error) << group;
        EXPECT_EQ(error->text, QStringLiteral("at most 10000 nested groups were expected")) << group;
        EXPECT_EQ(error->place.column, 9 + 9999 * open.size()) << group;
        EXPECT_EQ(document.toPlainText(), QStringLiteral("a"));
    }
}

TEST(RichTextError, AFileCutOffAnywhereGivesTheBeginningOfItsText)
{
    const QByteArray whole =
        "{\\rtf1\\ansi{\\fonttbl{\\f0\\fcharset128 Font;}}{\\colortbl;\\red1;}\\pard\\qc abc\\u8364?\\par\n"
        "{\\field{\\*\\fldinst x}{\\fldrslt d}}\\'93\\'fae{\\object{\\result f}}\\cell g\\row\\bin3 123}";
    QTextDocument document;
    ASSERT_FALSE(readRichText(QByteArrayView(whole), document));
    const QString text = document.toPlainText();
    EXPECT_EQ(text, QStringLiteral("abc€\nd日ef\tg"));
    for (qsizetype size = 0; size < whole.size(); ++size) {
        ASSERT_TRUE(readRichText(QByteArrayView(whole).first(size), document)) << size;
        EXPECT_TRUE(text.startsWith(document.toPlainText()) || whole.first(size).contains('\\')) << size;
        EXPECT_LE(document.toPlainText().size(), text.size() + 3) << size;
    }
}

TEST(RichTextError, AnythingAfterTheBeginningIsReadOrAnswered)
{
    QRandomGenerator random(20240305);
    constexpr const char *pieces[] = {
        "{",        "}",        "\\",        "\\'",    "\\u-1?", "\\par", "\\fs9999999999", "\\bin3",
        "\\pard",   "\\uc9",    "\\fonttbl", "\\f1",   ";",      "\\*",   "\\upr",          "\\ud",
        "\\object", "\\result", "\\row",     "\\cell", "\x81",   "\n",    "\\ansicpg932",   "\\tx9"};
    for (int round = 0; round < 2000; ++round) {
        QByteArray bytes("{\\rtf1");
        for (int i = 0; i < 60; ++i) {
            const quint32 value = random.generate();
            if (value % 4 == 0) {
                bytes += static_cast<char>(value >> 8);
            } else {
                bytes += pieces[(value >> 8) % std::size(pieces)];
            }
        }
        QTextDocument document;
        const auto error = readRichText(QByteArrayView(bytes), document);
        if (error) {
            EXPECT_FALSE(error->text.isEmpty());
            EXPECT_GE(error->place.line, 1);
            EXPECT_GE(error->place.column, 1);
        }
        EXPECT_LE(document.characterCount(), bytes.size());
    }
}

TEST(RichTextNotes, CountWhatIsNotShown)
{
    struct NoteRow
    {
        QByteArray bytes;
        QList<int> counts; ///< pictures, objects, footnotes, headers, hidden, signs
        QStringView text;
        const char *reason;
    };
    const NoteRow rows[] = {
        {"a", {0, 0, 0, 0, 0, 0}, u"a", "all is shown"},
        {"{\\pict\\pngblip 89504e47}", {1, 0, 0, 0, 0, 0}, u"", "a picture"},
        {"{\\*\\shppict{\\pict 00}}{\\nonshppict{\\pict 00}}",
         {1, 0, 0, 0, 0, 0},
         u"",
         "a picture in two forms is one"},
        {"{\\object\\objemb{\\*\\objclass C}{\\*\\objdata 00}{\\result shown}}",
         {0, 1, 0, 0, 0, 0},
         u"shown",
         "an object"},
        {"{\\object{\\*\\objdata 00}hidden{\\result{\\pict 00}}}", {1, 1, 0, 0, 0, 0}, u"", "an object with a picture"},
        {"a{\\footnote\\pard\\chftn note}{\\*\\footnote x}{\\*\\annotation y}", {0, 0, 3, 0, 0, 0}, u"a", "notes"},
        {"{\\header h}{\\footerl\\pard{\\b f}}{\\headerf\\u8364?}{\\footer\\'b0}", {0, 0, 0, 4, 0, 0}, u"", "of pages"},
        {"{\\header\\pard\\par}{\\footer  }", {0, 0, 0, 0, 0, 0}, u"", "nothing is lost with empty ones"},
        {"{\\shp{\\*\\shpinst{\\shptxt t}}}", {0, 1, 0, 0, 0, 0}, u"", "a drawing with text"},
        {"{\\upr{{\\pict 00}}{\\*\\ud{{\\pict 00}}}}", {1, 0, 0, 0, 0, 0}, u"", "of two forms one is read"},
        {"a{\\v b}c", {0, 0, 0, 0, 1, 0}, u"ac", "hidden text"},
        {"a{\\v b {\\b c}\\'e4\\u8364?\\par d}e", {0, 0, 0, 0, 1, 0}, u"ae", "in pieces it is one"},
        {"a\\v b\\v0 c\\v d\\v0", {0, 0, 0, 0, 2, 0}, u"ac", "shown text parts it"},
        {"a{\\v\\'e4}b{\\v\\u8364?}c{\\v\\{}d{\\v\\emdash}", {0, 0, 0, 0, 4, 0}, u"abcd", "of one character"},
        {"\\ansicpg932 a{\\v\\'93\\'fa}", {0, 0, 0, 0, 1, 0}, u"a", "of one character in two bytes"},
        {"a{\\v  \\par}b{\\v}c", {0, 0, 0, 0, 0, 0}, u"abc", "blanks and line ends are nothing that is missed"},
        {"a{\\v{\\xe index}{\\*\\bkmkstart m}{\\pict 00}}", {1, 0, 0, 0, 0, 0}, u"a", "no text is hidden here"},
        {"a{\\footnote{\\v b}}{\\info{\\v c}}", {0, 0, 1, 0, 0, 0}, u"a", "what is skipped as a whole"},
        {"a\\u-3929?{\\v\\u-3929?}", {0, 0, 0, 0, 1, 1}, u"a\xF0A7", "a private character of no known font"},
    };
    for (const NoteRow &row : rows) {
        RichTextNotes notes;
        notes.pictures = 99;
        EXPECT_EQ(richtext::body(row.bytes, &notes), row.text) << row.reason;
        EXPECT_EQ(
            QList<int>({notes.pictures, notes.objects, notes.footnotes, notes.headers, notes.hidden, notes.signs}),
            row.counts)
            << row.reason;
    }
    EXPECT_EQ(RichTextNotes().texts(), QStringList());
    const RichTextNotes all{.pictures = 1, .objects = 2, .footnotes = 3, .headers = 4, .hidden = 5, .signs = 6};
    EXPECT_EQ(all.texts(), QStringList({QStringLiteral("Pictures are not shown: 1."),
                                        QStringLiteral("Embedded objects and drawings are not shown: 2."),
                                        QStringLiteral("Footnotes and comments are not shown: 3."),
                                        QStringLiteral("Page headers and footers are not shown: 4."),
                                        QStringLiteral("Hidden text is not shown: 5."),
                                        QStringLiteral("Characters of symbol fonts are not known: 6.")}));
}

} // namespace
