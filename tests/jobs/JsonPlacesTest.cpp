#include "JsonPlaces.h"

#include "InputErrorText.h"
#include "JobFolder.h"

#include <gtest/gtest.h>

namespace
{

using kareport::JsonPath;
using kareport::placeInJson;
using kareport::placeOfByte;

QString name(const char *text)
{
    return QString::fromUtf8(text);
}

JsonPath path(std::initializer_list<std::variant<QString, qsizetype>> steps)
{
    return JsonPath(steps);
}

struct Row
{
    const char *json;
    JsonPath path;
    const char *key;
    const char *value;
    const char *reason;
};

const Row rows[] = {
    {"{}", {}, "1:1", "1:1", "the root itself"},
    {" \n\t {}", {}, "2:3", "2:3", "white space in front; a tab is one column"},
    {R"({"a": 1})", path({name("a")}), "1:2", "1:7", "a member's name and its value"},
    {R"({"a":1})", path({name("a")}), "1:2", "1:6", "no blank after the colon"},
    {"\xEF\xBB\xBF{\"a\": 1}", path({name("a")}), "1:2", "1:7", "a byte-order mark takes no column"},
    {"{\n  \"a\"\n :\n   1}", path({name("a")}), "2:3", "4:4", "name and value in lines of their own"},
    {"{\r\n \"a\":1}", path({name("a")}), "2:2", "2:6", "lines that end with CR LF"},
    {R"({"a": {"b": {"c": true}}})", path({name("a"), name("b"), name("c")}), "1:14", "1:19", "members in members"},
    {R"({"a": [10, [20, 21], {"b": 3}]})", path({name("a"), qsizetype(0)}), "1:8", "1:8", "the first element"},
    {R"({"a": [10, [20, 21], {"b": 3}]})", path({name("a"), qsizetype(1), qsizetype(1)}), "1:17", "1:17",
     "a list in a list"},
    {R"({"a": [10, [20, 21], {"b": 3}]})", path({name("a"), qsizetype(2), name("b")}), "1:23", "1:28",
     "a member of an element"},
    {R"({"x": "},]\"{", "y": 2})", path({name("y")}), "1:17", "1:22", "brackets and quotes inside a text"},
    {R"({"x": "\\", "y": 2})", path({name("y")}), "1:13", "1:18", "a text that ends with a backslash"},
    {R"({"x": [{}, []], "y": 2})", path({name("y")}), "1:17", "1:22", "empty objects and lists"},
    {R"({"x": -1.5e+3, "y": null, "z": false})", path({name("z")}), "1:27", "1:32", "words and numbers before it"},
    {R"({"\u0061": 1})", path({name("a")}), "1:2", "1:12", "a name written with an escape"},
    {"{\"\xC3\xA4\": 1, \"b\": 2}", path({name("b")}), "1:10", "1:15", "columns count characters, not bytes"},
    {"{\"\xF0\x9D\x84\x9E\": 1, \"b\": 2}", path({name("b")}), "1:10", "1:15", "a surrogate pair is one character"},
    {"{\"\xE6\xB8\xAC\": 1}", path({name("\xE6\xB8\xAC")}), "1:2", "1:7", "a name outside ASCII"},
    {R"({"a": 1, "a": 2})", path({name("a")}), "1:10", "1:15", "of members of one name the last counts"},
    {R"({"a": 1, "A": 2})", path({name("a")}), "1:2", "1:7", "case matters"},
    {R"({"": 1})", path({QString()}), "1:2", "1:6", "an empty name"},
    {R"({"b": 1})", path({name("a")}), "none", "none", "no such member"},
    {R"({})", path({name("a")}), "none", "none", "no member at all"},
    {R"({"a": []})", path({name("a"), qsizetype(0)}), "none", "none", "no element at all"},
    {R"({"a": [1]})", path({name("a"), qsizetype(1)}), "none", "none", "after the last element"},
    {R"({"a": [1]})", path({name("a"), qsizetype(-1)}), "none", "none", "before the first element"},
    {R"({"a": [1]})", path({name("a"), name("0")}), "none", "none", "a name leads into no list"},
    {R"({"a": {"0": 1}})", path({name("a"), qsizetype(0)}), "none", "none", "an index leads into no object"},
    {R"({"a": "b"})", path({name("a"), name("b")}), "none", "none", "nothing is inside a text"},
};

TEST(JsonPlaces, FindsNamesAndValues)
{
    for (const Row &row : rows) {
        EXPECT_EQ(placeText(placeInJson(row.json, row.path, true)), name(row.key)) << row.reason;
        EXPECT_EQ(placeText(placeInJson(row.json, row.path, false)), name(row.value)) << row.reason;
    }
}

TEST(JsonPlaces, FindsTheLastOfManyElements)
{
    QByteArray json = "[";
    for (int i = 0; i < 10000; ++i) {
        json += "{\"n\": [" + QByteArray::number(i) + "]},\n";
    }
    json += "{\"n\": 7}]";
    EXPECT_EQ(placeText(placeInJson(json, path({qsizetype(10000), name("n")}))), QStringLiteral("10001:7"));
}

TEST(JsonPlaces, FindsAKeyThatOccursTwice)
{
    struct RepeatedRow
    {
        const char *json;
        const char *expected; ///< key, place of the second one, line of the first
        const char *reason;
    };
    constexpr RepeatedRow repeatedRows[] = {
        {R"({"a": 1, "a": 2})", "a 1:10 1", "in the root"},
        {"{\"a\": 1,\n \"b\": 2,\n \"a\": 3}", "a 3:2 1", "lines below"},
        {"\xEF\xBB\xBF{\"a\": 1,\n \"a\": 3}", "a 2:2 1", "after a byte-order mark"},
        {R"({"x": {"y": {"a": 1, "a": 2}}})", "a 1:22 1", "in an object inside others"},
        {R"({"x": [[{"b": 0}, {"a": 1, "a": 2}]]})", "a 1:28 1", "in an object of a list"},
        {R"({"a": {"a": [{"a": 1}, {"a": 2}]}, "b": "a"})", "none", "in objects of their own"},
        {R"({"a": "b", "b": "a", "c": ["a", "a"]})", "none", "texts are not keys"},
        {R"({"a": 1, "A": 2})", "none", "case matters"},
        {R"({"a": 1, "\u0061": 2})", "a 1:10 1", "the second one written with an escape"},
        {R"({"\u0061": 1, "a": 2})", "a 1:15 1", "the first one written with an escape"},
        {R"({"\"": 1, "\\": 2, "\"": 3})", "\" 1:20 1", "quotes and backslashes"},
        {R"({"": 1, "": 2})", " 1:9 1", "a key without a character"},
        {"{\"\xC3\xA4\": 1, \"\xC3\xA4\": 2}", "\xC3\xA4 1:10 1", "columns count characters"},
        {R"({"b": 1, "a": 2, "a": 3, "b": 4})", "a 1:18 1", "the one that comes first is said"},
        {R"({"a": 1, "a": 2, "a": 3})", "a 1:10 1", "three are two and one more"},
        {R"({"a": {}, "b": [], "c": {"d": -1e5}, "e": null, "f": true})", "none", "nothing is wrong"},
        {"{}", "none", "an empty object"},
        {"[]", "none", "an empty list"},
    };
    for (const RepeatedRow &row : repeatedRows) {
        const auto repeated = kareport::findRepeatedKey(row.json);
        const QString found =
            repeated
                ? QStringLiteral("%1 %2 %3").arg(repeated->key, placeText(repeated->place)).arg(repeated->firstLine)
                : QStringLiteral("none");
        EXPECT_EQ(found, name(row.expected)) << row.reason;
    }
}

TEST(JsonPlaces, FindsARepeatedKeyAmongMany)
{
    QByteArray json = "{";
    for (int i = 0; i < 100000; ++i) {
        json += "\"key" + QByteArray::number(i) + "\": {\"x\": " + QByteArray::number(i) + "},\n";
    }
    EXPECT_FALSE(kareport::findRepeatedKey(json + "\"other\": 0}"));
    const auto repeated = kareport::findRepeatedKey(json + "\"key7\": 0}");
    ASSERT_TRUE(repeated);
    EXPECT_EQ(placeText(repeated->place), QStringLiteral("100001:1"));
    EXPECT_EQ(repeated->firstLine, 8);
}

TEST(JsonPlaces, PlacesAByte)
{
    struct ByteRow
    {
        const char *text;
        qsizetype byte;
        const char *expected;
        const char *reason;
    };
    constexpr ByteRow byteRows[] = {
        {"", 0, "1:1", "an empty text"},
        {"ab\ncd", 0, "1:1", "the first byte"},
        {"ab\ncd", 2, "1:3", "the line end belongs to its line"},
        {"ab\ncd", 3, "2:1", "the first byte of a line"},
        {"ab\ncd", 5, "2:3", "the end"},
        {"ab\ncd", 99, "2:3", "after the end is the end"},
        {"ab\ncd", -1, "1:1", "before the beginning is the beginning"},
        {"\xC3\xA4"
         "b",
         2, "1:2", "a character of two bytes"},
        {"\xF0\x9D\x84\x9E"
         "b",
         4, "1:2", "a character of four bytes"},
    };
    for (const ByteRow &row : byteRows) {
        EXPECT_EQ(placeText(placeOfByte(row.text, row.byte)), name(row.expected)) << row.reason;
    }
}

} // namespace
