#include "RichTextDescription.h"

using richtext::body;
using richtext::expectBodies;
using richtext::Row;

namespace
{

TEST(RichTextCodePage, BytesAreReadInTheCodePageOfTheFile)
{
    const Row rows[] = {
        {"\\'80\\'b0\\'ff\\'81", u"€°ÿ\u0081", "1252 where nothing is said"},
        {"\\ansi\\'e9", u"é", "1252"},
        {"\\mac\\'8e", u"é", "Macintosh"},
        {"\\pc\\'82", u"é", "437"},
        {"\\pca\\'9b", u"ø", "850"},
        {"\\ansi\\ansicpg1251\\'cf\\'f0", u"Пр", "1251"},
        {"\\ansicpg1250\\'b9", u"ą", "1250"},
        {"\\ansicpg1253\\'c1", u"Α", "1253"},
        {"\\ansicpg1254\\'fd", u"ı", "1254"},
        {"\\ansicpg1255\\'e0", u"א", "1255"},
        {"\\ansicpg1256\\'c7", u"ا", "1256"},
        {"\\ansicpg1257\\'e0", u"ą", "1257"},
        {"\\ansicpg1258\\'f0", u"đ", "1258"},
        {"\\ansicpg874\\'a1", u"ก", "874"},
        {"\\ansicpg932\\'93\\'fa\\'96\\'7b", u"日本", "932, two bytes a character"},
        {"\\ansicpg936\\'c4\\'e3\\'80", u"你€", "936"},
        {"\\ansicpg949\\'c7\\'d1", u"한", "949"},
        {"\\ansicpg950\\'b4\\'fa", u"測", "950"},
        {"\\ansicpg65001\\'c2\\'b0\\'f0\\'9f\\'98\\'80", u"°😀", "UTF-8"},
        {"\\ansicpg99999\\'b0\\ansicpg-1\\'b0", u"°°", "code pages that do not exist"},
    };
    expectBodies(rows);
}

TEST(RichTextCodePage, BareBytesAreReadAsEscapedOnes)
{
    const Row rows[] = {
        {"1\xB0\x80", u"1°€", "1252"},
        {"\\ansicpg1251 \xCF\xF0", u"Пр", "1251"},
        {"\\ansicpg932 \x93\xFAx\x96{", u"日x", "932; half a character before a group is dropped"},
        {"\\ansicpg932 \\'83A\\'83\\{\\'83\\\\", u"アボソ", "the second byte may be a letter, a brace or a backslash"},
        {"\\ansicpg932 \\'93\r\n\\'fa", u"日", "a line end between the bytes of a character"},
        {"\\ansicpg932 \\'93\\b\\'fa", u"", "a word between them parts them"},
    };
    for (const Row &row : rows) {
        const bool isOpen = row.bytes.endsWith('{');
        EXPECT_EQ(body(row.bytes + (isOpen ? "}" : "")).remove(QStringLiteral("<b>")).remove(QChar(0xFFFD)),
                  row.expected)
            << row.reason;
    }
}

TEST(RichTextCodePage, FontsHaveTheirOwnCharacterSet)
{
    const QByteArray fonts =
        "\\ansicpg1250{\\fonttbl{\\f0\\fcharset0 A;}{\\f1\\fcharset204 A;}{\\f2\\fcharset128 A;}"
        "{\\f3\\fcharset2 A;}{\\f4\\fcharset1 A;}{\\f5 A;}{\\f6\\fcharset77 A;}{\\f7\\fcharset0\\cpg437 A;}}";
    const Row rows[] = {
        {"\\'b9", u"<A>¹", "0 is 1252, whatever the file has"},
        {"\\f1\\'cf\\f0\\'cf", u"<A>ПÏ", "Cyrillic"},
        {"\\f2\\'93\\'fa", u"<A>日", "Japanese"},
        {"\\f4\\'b9\\f5\\'b9", u"<A>ąą", "that of the file"},
        {"\\f6\\'8e\\f7\\'82", u"<A>éé", "Macintosh; a code page of its own"},
        {"\\f3\\'b7\\'a7\\u-3913?", u"<A>•\xF0A7•", "signs; the bullet is there in every font"},
        {"{\\f1\\'cf}\\'cf", u"<A>ПÏ", "to the end of its group"},
        {"\\f1\\'cf\\plain\\'cf", u"<A>ПÏ", "as if nothing had been said"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(body(fonts + row.bytes), row.expected) << row.reason;
    }
}

TEST(RichTextCodePage, CharactersOfATextInMemoryStandForThemselves)
{
    struct TextRow
    {
        QStringView text;
        QStringView expected;
        const char *reason;
    };
    const TextRow rows[] = {
        {u"{\\rtf1 12° Прüfung 測量 😀}", u"12° Прüfung 測量 😀", "whatever the code page"},
        {u"{\\rtf1\\ansicpg1251 °\\'cf}", u"°П", "bytes are still in the code page"},
        {u"{\\rtf1\\ansicpg932\\'83"
         u"A°\\'93°}",
         u"ア°°", "half a character before one that stands for itself"},
        {u"{\\rtf1\\u8364°x\\u8364😀x}", u"€x€x", "one character is left out, not one byte"},
        {u"{\\rtf1\\uc2\\u8364測量x}", u"€x", "two characters"},
        {u"{\\rtf1{\\fonttbl{\\f0 ＭＳ;}}x}", u"<ＭＳ>x", "in names"},
        {u"{\\rtf1 a\u2029"
         u"b\u2028"
         u"c}",
         u"a|b\u2028"
         u"c",
         "paragraph and line ends"},
    };
    for (const TextRow &row : rows) {
        QTextDocument document;
        EXPECT_FALSE(kareport::readRichText(row.text, document)) << row.reason;
        EXPECT_EQ(richtext::described(document).remove(QChar(0xFFFD)), row.expected) << row.reason;
    }
    const char16_t half[] = {u'{', u'\\', u'r', u't', u'f', u'1', u' ', 0xD83D, u'}'};
    QTextDocument document;
    EXPECT_FALSE(kareport::readRichText(QStringView(half, std::size(half)), document));
    EXPECT_EQ(document.toPlainText(), QString(QChar(0xFFFD))) << "half a surrogate pair";
}

} // namespace
