#include "TextBuffer.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

#include <limits>

namespace
{

using kareport::TextBuffer;

QString textOf(const TextBuffer &buffer)
{
    return buffer.view().toString();
}

TEST(TextBuffer, IsEmptyAtFirst)
{
    const TextBuffer buffer;
    EXPECT_EQ(buffer.size(), 0U);
    EXPECT_TRUE(buffer.view().isEmpty());
    EXPECT_TRUE(buffer.from(0).isEmpty());
}

TEST(TextBuffer, AppendsEveryKindOfText)
{
    TextBuffer buffer;
    buffer.append(u'a');
    buffer.append(u"測量😀");
    buffer.append(QStringView());
    buffer.append(QStringView(u""));
    buffer.appendAscii("");
    buffer.appendAscii(std::string_view("x\0y", 3));
    buffer.appendFill(3, u'-');
    buffer.appendFill(0, u'!');
    buffer.append(u'\0');
    EXPECT_EQ(textOf(buffer), QStringView(u"a測量😀x\0y---\0", 12).toString());
    EXPECT_EQ(buffer.size(), 12U);
}

TEST(TextBuffer, GrowsBeyondAnyCapacityWithoutLosingText)
{
    TextBuffer buffer;
    QString expected;
    for (int i = 0; i < 5000; ++i) {
        const auto character = static_cast<char16_t>(u'!' + i % 90);
        buffer.append(character);
        expected += character;
    }
    EXPECT_EQ(textOf(buffer), expected) << "one by one";
    const QString large(100000, u'x');
    buffer.append(large);
    expected += large;
    EXPECT_EQ(textOf(buffer), expected) << "much at once";
    buffer.insertFill(2, 300000, u'.');
    expected.insert(2, QString(300000, u'.'));
    EXPECT_EQ(textOf(buffer), expected) << "inserted";
}

TEST(TextBuffer, IsReusedAfterClearAndTruncate)
{
    TextBuffer buffer;
    buffer.append(u"abcdef");
    buffer.truncate(6);
    EXPECT_EQ(textOf(buffer), QStringLiteral("abcdef")) << "all it has";
    buffer.truncate(3);
    EXPECT_EQ(textOf(buffer), QStringLiteral("abc"));
    buffer.append(u'x');
    EXPECT_EQ(textOf(buffer), QStringLiteral("abcx"));
    buffer.truncate(0);
    EXPECT_EQ(textOf(buffer), QString());
    buffer.append(u"new");
    buffer.clear();
    EXPECT_EQ(buffer.size(), 0U);
    buffer.append(u"y");
    EXPECT_EQ(textOf(buffer), QStringLiteral("y"));
}

TEST(TextBuffer, GivesTheTextFromAPosition)
{
    TextBuffer buffer;
    buffer.append(u"abc");
    EXPECT_EQ(buffer.from(0).toString(), QStringLiteral("abc"));
    EXPECT_EQ(buffer.from(2).toString(), QStringLiteral("c"));
    EXPECT_TRUE(buffer.from(3).isEmpty()) << "the end";
}

TEST(TextBuffer, InsertsAtAnyPosition)
{
    struct Row
    {
        std::size_t position;
        std::size_t count;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, 2, u"--abc", "at the front"},
        {1, 2, u"a--bc", "inside"},
        {1, 10, u"a----------bc", "more than there is after it"},
        {3, 2, u"abc--", "at the end"},
        {1, 0, u"abc", "nothing"},
    };
    for (const Row &row : rows) {
        TextBuffer buffer;
        buffer.append(u"abc");
        buffer.insertFill(row.position, row.count, u'-');
        EXPECT_EQ(textOf(buffer), row.expected.toString()) << row.reason;
    }
    TextBuffer empty;
    empty.insertFill(0, 3, u'x');
    EXPECT_EQ(textOf(empty), QStringLiteral("xxx")) << "into nothing";
}

TEST(TextBuffer, PadsOnlyWhatFollowsThePosition)
{
    struct Row
    {
        QStringView text;
        std::size_t start;
        int width;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"abc", 0, 5, u"  abc", "before"},
        {u"abc", 0, -5, u"abc  ", "blanks after"},
        {u"abc", 0, 3, u"abc", "as long as wide"},
        {u"abc", 0, -3, u"abc", "as long as wide, blanks after"},
        {u"abc", 0, 2, u"abc", "never cut"},
        {u"abc", 0, -2, u"abc", "never cut, blanks after"},
        {u"abc", 0, 0, u"abc", "no width"},
        {u"abc", 1, 4, u"a  bc", "what is before it does not count"},
        {u"abc", 1, -4, u"abc  ", "what is before it does not count, blanks after"},
        {u"abc", 3, 2, u"abc  ", "an empty part"},
        {u"abc", 3, -2, u"abc  ", "an empty part, blanks after"},
        {u"", 0, 2, u"  ", "an empty text"},
        {u"😀", 0, 3, u" 😀", "a surrogate pair is two characters wide"},
    };
    for (const Row &row : rows) {
        TextBuffer buffer;
        buffer.append(row.text);
        buffer.pad(row.start, row.width);
        EXPECT_EQ(textOf(buffer), row.expected.toString()) << row.reason;
    }
}

TEST(TextBuffer, TrimsOnlyWhatFollowsThePosition)
{
    struct Row
    {
        QStringView text;
        std::size_t start;
        QStringView expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"  abc  ", 0, u"abc", "both ends"},
        {u"abc", 0, u"abc", "nothing to take"},
        {u" \t\r\n a b \t\r\n", 0, u"a b", "every kind of white space; not inside"},
        {u"    ", 0, u"", "white space only"},
        {u"", 0, u"", "an empty text"},
        {u"x   abc  ", 2, u"x abc", "what is before it stays"},
        {u"x    ", 1, u"x", "white space only, after something"},
        {u"x ", 2, u"x ", "an empty part"},
        {u"\u00A0\u3000測\u2003", 0, u"測", "white space beyond ASCII"},
    };
    for (const Row &row : rows) {
        TextBuffer buffer;
        buffer.append(row.text);
        buffer.trim(row.start);
        EXPECT_EQ(textOf(buffer), row.expected.toString()) << row.reason;
    }
}

} // namespace
