#include "SingleByteText.h"

#include "LimitedDevice.h"
#include "PrintQt.h"

#include <QBuffer>

#include <gtest/gtest.h>

#include <string>

namespace
{

using kareport::WideCharacters;
using kareport::writeSingleByteText;

std::string bytesOf(QStringView text, WideCharacters wide)
{
    QBuffer buffer;
    buffer.open(QIODevice::WriteOnly);
    EXPECT_TRUE(writeSingleByteText(buffer, text, wide));
    return buffer.data().toStdString();
}

TEST(SingleByteText, HasOneByteACharacterAndAnEscapeForWiderOnes)
{
    struct Row
    {
        QStringView text;
        std::string escaped;
        std::string marked;
        const char *reason;
    };
    const Row rows[] = {
        {u"", "", "", "empty"},
        {u"A", "A", "A", "ASCII"},
        {u"\u0080é\u00FF", "\x80\xE9\xFF", "\x80\xE9\xFF", "up to U+00FF the byte of the same value"},
        {u"\u0100", "\\u256?", "?", "the first character that has no byte"},
        {u"a∞b", "a\\u8734?b", "a?b", "nothing that follows it is lost"},
        {u"測量", "\\u28204?\\u-28209?", "??", "a number beyond 32767 is written as the negative one"},
        {u"\u7FFF\u8000\uFFFF", "\\u32767?\\u-32768?\\u-1?", "???", "the ends of the signed numbers"},
        {u"a\xD83D\xDE00"
         u"b",
         "a\\u-10179?\\u-8704?b", "a?b", "a pair: two units, one character"},
        {u"\xD83D", "\\u-10179?", "?", "half a pair at the end"},
        {u"\xD83D\xD83D\xDE00", "\\u-10179?\\u-10179?\\u-8704?", "??", "half a pair before a whole one"},
        {u"\xDE00\xD83D"
         u"é",
         "\\u-8704?\\u-10179?\xE9", "??\xE9", "the halves in the wrong order are two characters"},
        {u"\xD83D\n", "\\u-10179?\r\n", "?\r\n", "half a pair before a line end"},
        {u"a\nb", "a\r\nb", "a\r\nb", "LF becomes CR LF"},
        {u"a\r\nb\r\n", "a\r\r\nb\r\r\n", "a\r\r\nb\r\r\n", "a CR before it stays"},
        {u"\n\n\r", "\r\n\r\n\r", "\r\n\r\n\r", "line ends alone; a lone CR stays"},
        {u"\\{}\t", "\\{}\t", "\\{}\t", "markup and control characters are left alone here"},
        {QStringView(u"a\0b", 3), std::string("a\0b", 3), std::string("a\0b", 3), "a zero is a character"},
        {u"\uFEFF"
         u"a",
         "\\u-257?a", "?a", "a byte-order mark is a character, and none is put in front"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(bytesOf(row.text, WideCharacters::RichTextEscape), row.escaped) << row.reason;
        EXPECT_EQ(bytesOf(row.text, WideCharacters::QuestionMark), row.marked) << row.reason;
    }
}

TEST(SingleByteText, IsWholeAtEveryLength)
{
    // Around the size in which it is handed on, with a character that becomes several bytes at each place.
    for (const int length : {65533, 65534, 65535, 65536, 65537, 131072, 200001}) {
        const QString before(length, u'x');
        EXPECT_EQ(bytesOf(QString(before + QStringLiteral("∞y\n")), WideCharacters::RichTextEscape),
                  before.toStdString() + "\\u8734?y\r\n")
            << length;
        EXPECT_EQ(bytesOf(QString(before + QStringLiteral("\xD83D\xDE00y")), WideCharacters::QuestionMark),
                  before.toStdString() + "?y")
            << length;
    }
}

TEST(SingleByteText, AFailedWriteEndsIt)
{
    struct Row
    {
        qsizetype length;
        qint64 limit;
        bool expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {10, 10, true, "just fits"},
        {11, 10, false, "the device takes a part"},
        {10, -1, false, "the device fails"},
        {10, 0, false, "the device takes nothing"},
        {200000, 1000, false, "already the first piece does not fit"},
    };
    for (const Row &row : rows) {
        LimitedDevice device;
        device.limit = row.limit;
        EXPECT_EQ(writeSingleByteText(device, QString(row.length, u'x'), WideCharacters::QuestionMark), row.expected)
            << row.reason;
        EXPECT_LE(device.taken.size(), std::max<qint64>(row.limit, 0)) << row.reason << ": nothing after the gap";
    }
}

} // namespace
