#include "EditedText.h"

#include "PrintQt.h"

#include <QStringList>

#include <gtest/gtest.h>

#include <string>

namespace
{

using kareport::printableText;
using kareport::textOfBytes;
using kareport::wrappedText;

TEST(EditedText, TwoBytesAreACharacter)
{
    struct Row
    {
        QByteArrayView bytes;
        QStringView expected;
        const char *reason;
    };
    const Row rows[] = {
        {{}, u"", "empty"},
        {"A", u"", "half a character"},
        {QByteArrayView("A\0", 2), u"A", "low byte first"},
        {"AB", u"\u4241", "two letters of a plain text become one character"},
        {"ABC", u"\u4241", "the odd byte goes"},
        {QByteArrayView("\x3D\xD8\x00\xDE", 4), u"\xD83D\xDE00", "a pair"},
        {QByteArrayView("\x3D\xD8", 2), u"\xD83D", "half a pair is kept here"},
        {QByteArrayView("\xFF\xFE\x00\x00", 4), QStringView(u"\uFEFF\0", 2),
         "a byte-order mark and a zero are characters"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(textOfBytes(row.bytes), row.expected.toString()) << row.reason;
    }
    const char bytes[] = "xA\0B\0";
    EXPECT_EQ(textOfBytes(QByteArrayView(bytes + 1, 4)), QStringLiteral("AB")) << "from an odd address";
}

TEST(EditedText, WhatCannotBePrintedBecomesABlank)
{
    struct Row
    {
        QStringView text;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", u"", "empty"},
        {u"A b", u"A b", "nothing to do"},
        {u"a\r\nb\r\n", u"a  b", "line ends become blanks, one each, and go at the end"},
        {u"a\nb\rc", u"a b c", "single ones as well"},
        {u"a\tb", u"a b", "a tab"},
        {u"a\u0001\u001F\u007F\u0080\u009Fb", u"a     b", "control characters"},
        {QStringView(u"a\0b", 3), u"a b", "a zero"},
        {u"  a", u"  a", "blanks in front stay"},
        {u"a  \t\r\n ", u"a", "white space at the end goes"},
        {u"a\u0001", u"a", "also where it was something else before"},
        {u"\r\n \t", u"", "nothing is left"},
        {u"é°∞測量ß", u"é°∞測量ß", "letters and signs of any script"},
        {u"a\u3000", u"a", "a wide blank at the end is white space"},
        {u"a\xD83D", u"a", "half a pair cannot be printed"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(printableText(row.text.toString()), row.expected.toString())
            << row.reason << ": " << testing::PrintToString(row.text);
    }
}

TEST(EditedText, IsBrokenAfterABlankAtColumn80)
{
    const std::u16string x77(77, u'x');
    const std::u16string x78(78, u'x');
    const std::u16string x79(79, u'x');
    const std::u16string x80(80, u'x');
    struct Row
    {
        std::u16string text;
        std::u16string expected;
        const char *reason;
    };
    const Row rows[] = {
        {u"", u"", "empty"},
        {u"a", u"a", "one character"},
        {x80 + x80, x80 + x80, "a word is never broken"},
        {x77 + u" a b", x77 + u" a \nb", "the 79th character is within the line, the 81st is not"},
        {x78 + u" a", x78 + u" \na", "the 80th character begins a word"},
        {x79 + u" a", x79 + u" \na", "the first word that begins after it"},
        {x77 + u" abcd c", x77 + u" abcd \nc", "a word that has begun before stays"},
        {x79 + u"   a", x79 + u"   \na", "all blanks stay before the break"},
        {x79 + u" ", x79 + u" ", "no word after the blank"},
        {x80 + u" ab " + x78 + u" c", x80 + u" \nab " + x78 + u" \nc", "counted anew after a break"},
        {x79 + u" " + x78 + u" a b", x79 + u" \n" + x78 + u" a \nb", "the character after a break does not count"},
        {x79 + u"\r\nb c", x79 + u"\r\r\nb c", "LF gets a CR, and the counting begins anew"},
        {x79 + u"\nb c", x79 + u"\r\nb c", "LF alone gets a CR"},
        {x79 + u"\r b", x79 + u"\r b", "CR alone begins the counting anew and stays alone"},
        {u"\n", u"\r\n", "nothing but a line end"},
        {u"\n\n", u"\r\n\r\n", "line ends alone"},
        {x79 + u"\ta", x79 + u"\ta", "a tab is not a blank"},
        {std::u16string(79, u'測') + u" 量", std::u16string(79, u'測') + u" \n量", "characters count, not their width"},
        {std::u16string(80, u' ') + u"a", std::u16string(80, u' ') + u"\na", "blanks in front count as well"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(wrappedText(QString::fromStdU16String(row.text)), QString::fromStdU16String(row.expected))
            << row.reason;
    }
}

TEST(EditedText, BreaksAreAllThatIsAdded)
{
    QString text;
    for (int i = 0; i < 5000; ++i) {
        text += QString::number(i * 7919 % 100003) + u' ';
    }
    const QString wrapped = wrappedText(text);
    EXPECT_EQ(QString(wrapped).remove(u'\n'), text);
    const QStringList lines = wrapped.split(u'\n');
    EXPECT_GT(lines.size(), 300);
    for (const QString &line : lines.first(lines.size() - 1)) {
        EXPECT_TRUE(line.endsWith(u' '));
        EXPECT_GE(line.size(), 80 - 1) << testing::PrintToString(line);
        EXPECT_LE(line.size(), 80 + 6) << testing::PrintToString(line);
    }
}

} // namespace
