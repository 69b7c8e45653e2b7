#include "JsonNode.h"

#include "InputErrorText.h"
#include "JobFolder.h"

#include <QJsonDocument>

#include <gtest/gtest.h>

namespace
{

using kareport::errorOf;
using kareport::InputError;
using kareport::JsonNode;
using kareport::JsonSource;

const QString job = QStringLiteral("job.json");

JsonSource sourceOf(const QByteArray &json)
{
    auto read = JsonSource::fromBytes(job, json);
    EXPECT_EQ(errorOf(read), nullptr) << json.constData();
    return std::get<JsonSource>(std::move(read));
}

TEST(JsonSource, ATextThatIsNotAnObjectIsAnErrorWithItsPlace)
{
    struct Row
    {
        QByteArray json;
        const char *line;
        const char *reason;
    };
    const Row rows[] = {
        {"", "1:", "an empty file"},
        {" \n ", "", "a file of white space"},
        {"[]", "1:1", "a list"},
        {"\"text\"", "1:", "a text"},
        {"{", "1:", "cut off after the first character"},
        {"{\"report\": [\n{\"line\": \"a\"},\n{\"line\": \"b", "3:", "cut off in the middle of a text"},
        {"{\"report\": [\n{\"line\": \"a\"},\n", "", "cut off in the middle of a list"},
        {"{\"a\": 1,\n \"b\": }", "2:", "a value is missing"},
        {"{\"a\": 1,\n \"b\" 2}", "2:", "a colon is missing"},
        {"{\"a\": 1\n\n \"b\": 2}", "3:", "a comma is missing"},
        {"{\"a\": 1,\n \"b\": yes}", "2:", "a word that is not known"},
        {"{'a': 1}", "1:", "single quotes"},
        {"{\n\"a\": \"\xFF\"}", "2:", "a text that is not UTF-8"},
        {"{}\n{}", "2:", "something after the object"},
        {QByteArray("\0\1\2\3", 4), "1:", "binary"},
    };
    for (const Row &row : rows) {
        const auto read = JsonSource::fromBytes(job, row.json);
        const InputError *error = errorOf(read);
        ASSERT_NE(error, nullptr) << row.reason;
        EXPECT_EQ(error->file, job) << row.reason;
        EXPECT_TRUE(error->place) << row.reason;
        EXPECT_TRUE(placeText(error->place).startsWith(QLatin1StringView(row.line)))
            << row.reason << ": " << placeText(error->place).toStdString();
        EXPECT_TRUE(error->text.contains(u"a JSON object was expected")) << row.reason;
        EXPECT_FALSE(error->message().contains(u'\n')) << row.reason;
    }
}

TEST(JsonSource, AFileThatCannotBeReadIsAnError)
{
    const JobFolder folder;
    const QString missing = folder.path("missing.json");
    for (const QString &path : {missing, folder.path()}) {
        const auto read = JsonSource::read(path);
        const InputError *error = errorOf(read);
        ASSERT_NE(error, nullptr);
        EXPECT_TRUE(error->message().startsWith(path + QStringLiteral(": error: ")));
    }
    folder.put("job.json", "{\"title\": \"A\"}");
    const auto read = JsonSource::read(folder.path("job.json"));
    ASSERT_EQ(errorOf(read), nullptr);
    EXPECT_EQ(std::get<JsonSource>(read).path(), folder.path("job.json"));
}

TEST(JsonSource, AByteOrderMarkIsSkipped)
{
    JsonSource source = sourceOf("\xEF\xBB\xBF{\"title\": 1}");
    std::optional<InputError> error;
    EXPECT_EQ(JsonNode(source, error)[QStringLiteral("title")].text(), QString());
    EXPECT_EQ(placeText(error), QStringLiteral("1:11"));
}

TEST(JsonNode, ReadsValues)
{
    JsonSource source = sourceOf(R"({"text": "ab", "yes": true, "n": 7, "list": [1, 2, 3], "object": {"x": ""}})");
    std::optional<InputError> error;
    const JsonNode root(source, error);
    EXPECT_EQ(root[QStringLiteral("text")].text(QStringLiteral("other")), QStringLiteral("ab"));
    EXPECT_EQ(root[QStringLiteral("none")].text(QStringLiteral("other")), QStringLiteral("other"));
    EXPECT_TRUE(root[QStringLiteral("yes")].boolean(false));
    EXPECT_TRUE(root[QStringLiteral("none")].boolean(true));
    EXPECT_FALSE(root[QStringLiteral("none")].boolean(false));
    EXPECT_EQ(root[QStringLiteral("n")].whole(1, 7, 7), 7);
    EXPECT_EQ(root[QStringLiteral("none")].whole(-5, 0, 1), -5);
    EXPECT_EQ(root[QStringLiteral("list")].size(), 3);
    EXPECT_EQ(root[QStringLiteral("list")][2].whole(0, 0, 9), 3);
    EXPECT_TRUE(root[QStringLiteral("list")].expectArray());
    EXPECT_FALSE(root[QStringLiteral("none")].expectArray());
    EXPECT_TRUE(root[QStringLiteral("object")].expectObject());
    EXPECT_FALSE(root[QStringLiteral("none")].expectObject());
    EXPECT_EQ(root[QStringLiteral("object")][QStringLiteral("x")].text(QStringLiteral("other")), QString());
    EXPECT_FALSE(root[QStringLiteral("none")].exists());
    EXPECT_FALSE(error.has_value()) << "what is missing falls back";
}

TEST(JsonNode, AnotherTypeFailsTheSourceWhereTheValueIs)
{
    using Read = void (*)(const JsonNode &);
    constexpr Read text = [](const JsonNode &node) { node.text(); };
    constexpr Read boolean = [](const JsonNode &node) { node.boolean(true); };
    constexpr Read whole = [](const JsonNode &node) { node.whole(5, 1, 9); };
    constexpr Read object = [](const JsonNode &node) { node.expectObject(); };
    constexpr Read array = [](const JsonNode &node) { node.expectArray(); };
    struct Row
    {
        const char *json;
        Read read;
        const char *contains;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"{\"a\":\n @1}", text, "a text was expected", "a number for a text"},
        {"{\"a\": @null}", text, "a text was expected", "null is not a text"},
        {"{\"a\": @1}", boolean, "true or false was expected", "1 is not true"},
        {"{\"a\": @\"true\"}", boolean, "true or false was expected", "a text is not true"},
        {"{\"a\": @0}", whole, "a whole number from 1 to 9 was expected", "too small"},
        {"{\"a\": @10}", whole, "a whole number from 1 to 9 was expected", "too large"},
        {"{\"a\": @1.5}", whole, "a whole number from 1 to 9 was expected", "not whole"},
        {"{\"a\": @1e300}", whole, "a whole number from 1 to 9 was expected", "far too large"},
        {"{\"a\": @\"5\"}", whole, "a whole number from 1 to 9 was expected", "a text"},
        {"{\"a\": @true}", whole, "a whole number from 1 to 9 was expected", "a boolean"},
        {"{\"a\": @[]}", object, "an object was expected", "a list for an object"},
        {"{\"a\": @null}", object, "an object was expected", "null for an object"},
        {"{\"a\": @{}}", array, "a list was expected", "an object for a list"},
    };
    for (const Row &row : rows) {
        const MarkedText marked(row.json);
        JsonSource source = sourceOf(marked.text);
        std::optional<InputError> error;
        row.read(JsonNode(source, error)[QStringLiteral("a")]);
        ASSERT_TRUE(error.has_value()) << row.reason;
        EXPECT_EQ(placeText(error), marked.place) << row.reason;
        EXPECT_TRUE(error->text.contains(QLatin1StringView(row.contains))) << row.reason;
        EXPECT_EQ(error->message(), QStringLiteral("job.json:%1: error: %2").arg(marked.place, error->text))
            << row.reason;
    }
}

TEST(JsonNode, AnUnknownKeyFailsWhereTheKeyIs)
{
    const MarkedText marked("{\"title\": \"a\",\n  \"colour\": {@\"rad\": 1}}");
    JsonSource source = sourceOf(marked.text);
    std::optional<InputError> error;
    JsonNode(source, error).allowOnly({"title", "colour"});
    EXPECT_FALSE(error.has_value());
    JsonNode(source, error)[QStringLiteral("colour")].allowOnly({"red", "green"});
    EXPECT_EQ(placeText(error), marked.place);
    EXPECT_EQ(error->text, QStringLiteral("unknown key \"rad\": red, green expected; did you mean \"red\"?"));
}

TEST(JsonNode, WhatIsMissingIsMissedWhereItsParentIs)
{
    const MarkedText marked("{\"a\": [1,\n @{\"b\": 2}]}");
    JsonSource source = sourceOf(marked.text);
    std::optional<InputError> error;
    JsonNode(source, error)[QStringLiteral("a")][1][QStringLiteral("c")][QStringLiteral("d")].fail(
        QStringLiteral("missed"));
    EXPECT_EQ(placeText(error), marked.place);
}

TEST(JsonNode, TheFirstErrorStays)
{
    JsonSource source = sourceOf(R"({"a": 1, "b": 2})");
    std::optional<InputError> error;
    JsonNode(source, error)[QStringLiteral("b")].fail(QStringLiteral("first"));
    JsonNode(source, error)[QStringLiteral("a")].fail(QStringLiteral("second"));
    EXPECT_EQ(error->text, QStringLiteral("first"));
    EXPECT_EQ(placeText(error), QStringLiteral("1:15"));
}

constexpr const char *base = R"({"page":{"lines":72},"report":[{"after":1}],"title":"T"})";

TEST(JsonSource, SetPutsAValueWhereTheDotsLead)
{
    struct Row
    {
        const char *key;
        const char *text;
        const char *expected; ///< null when there is no place for the key
        const char *reason;
    };
    constexpr Row rows[] = {
        {"title", "New", R"({"page":{"lines":72},"report":[{"after":1}],"title":"New"})", "a text"},
        {"title", "", R"({"page":{"lines":72},"report":[{"after":1}],"title":""})", "an empty text"},
        {"title", "a=b", R"({"page":{"lines":72},"report":[{"after":1}],"title":"a=b"})", "an equals sign"},
        {"title", "1,2", R"({"page":{"lines":72},"report":[{"after":1}],"title":"1,2"})", "no single JSON value"},
        {"title", "1]", R"({"page":{"lines":72},"report":[{"after":1}],"title":"1]"})", "a bracket too many"},
        {"title", "[", R"({"page":{"lines":72},"report":[{"after":1}],"title":"["})", "half a list"},
        {"title", "\"q\"", R"({"page":{"lines":72},"report":[{"after":1}],"title":"q"})", "a JSON text"},
        {"page.lines", "60", R"({"page":{"lines":60},"report":[{"after":1}],"title":"T"})", "a number inside"},
        {"page.wide", "true", R"({"page":{"lines":72,"wide":true},"report":[{"after":1}],"title":"T"})", "a new key"},
        {"a.b.c", "null", R"({"a":{"b":{"c":null}},"page":{"lines":72},"report":[{"after":1}],"title":"T"})",
         "objects that are not there yet"},
        {"page", "{\"lines\": [1]}", R"({"page":{"lines":[1]},"report":[{"after":1}],"title":"T"})", "a whole object"},
        {"report.0.after", "3", R"({"page":{"lines":72},"report":[{"after":3}],"title":"T"})", "an element's member"},
        {"report.0", "5", R"({"page":{"lines":72},"report":[5],"title":"T"})", "an element"},
        {"report.1", "5", nullptr, "after the last element"},
        {"report.-1", "5", nullptr, "before the first element"},
        {"report.x", "5", nullptr, "an element by a name"},
        {"title.x", "5", nullptr, "inside a text"},
        {"page.lines.x", "5", nullptr, "inside a number"},
        {"", "5", nullptr, "no key"},
        {".title", "5", nullptr, "an empty step at the front"},
        {"page.", "5", nullptr, "an empty step at the end"},
        {"page..lines", "5", nullptr, "an empty step inside"},
    };
    for (const Row &row : rows) {
        JsonSource source = sourceOf(base);
        const auto wrong = source.set(QString::fromUtf8(row.key), QString::fromUtf8(row.text));
        const auto json = QString::fromUtf8(QJsonDocument(source.root().toObject()).toJson(QJsonDocument::Compact));
        EXPECT_EQ(json, QString::fromUtf8(row.expected != nullptr ? row.expected : base)) << row.reason;
        EXPECT_EQ(wrong.has_value(), row.expected == nullptr) << row.reason;
        if (wrong) {
            EXPECT_TRUE(wrong->contains(QString::fromUtf8(row.key))) << row.reason;
        }
    }
}

TEST(JsonSource, WhatIsSetIsATextWhereATextIsExpected)
{
    struct Row
    {
        const char *text;
        const char *expected;
    };
    constexpr Row rows[] = {{"5", "5"},          {"1.50", "1.50"}, {"true", "true"}, {"null", "null"},
                            {"\"5\"", "5"},      {"New", "New"},   {"", ""},         {"{\"a\": 1}", "{\"a\": 1}"},
                            {"[1, 2]", "[1, 2]"}};
    for (const Row &row : rows) {
        JsonSource source = sourceOf(base);
        std::optional<InputError> error;
        ASSERT_FALSE(source.set(QStringLiteral("title"), QString::fromUtf8(row.text)));
        const JsonNode title = JsonNode(source, error)[QStringLiteral("title")];
        EXPECT_TRUE(title.isText()) << row.text;
        EXPECT_EQ(title.text(), QString::fromUtf8(row.expected));
        EXPECT_FALSE(error.has_value()) << row.text;
    }
}

TEST(JsonSource, AKeyThatOccursTwiceIsAnErrorWithBothPlaces)
{
    const auto read =
        JsonSource::fromBytes(job, "{\"report\": [],\n \"data\": {\"d\": {\"values\": {\"A\": 1,\n  \"A\": 2}}}}");
    const InputError *error = errorOf(read);
    ASSERT_NE(error, nullptr);
    EXPECT_EQ(error->message(), QStringLiteral("job.json:3:3: error: the key \"A\" is in line 2 already: each key "
                                               "was expected once"));
}

TEST(JsonSource, DeepNestingIsAnError)
{
    for (const QByteArray &group : {QByteArray("["), QByteArray("{\"a\":")}) {
        const auto read = JsonSource::fromBytes(job, "{\"report\":" + group.repeated(100000));
        const InputError *error = errorOf(read);
        ASSERT_NE(error, nullptr);
        EXPECT_TRUE(error->text.contains(u"too deeply nested")) << error->text.toStdString();
    }
}

TEST(JsonSource, WhatCannotBeSetIsSaidInASentence)
{
    struct Row
    {
        QString key;
        QString text;
        QString message;
        const char *reason;
    };
    const QString most = QStringList(100, QStringLiteral("a")).join(u'.');
    const QString deep = QStringList(50001, QStringLiteral("a")).join(u'.');
    const Row rows[] = {
        {most, QStringLiteral("1"), QString(), "as many steps as are allowed"},
        {most + QStringLiteral(".a"), QStringLiteral("1"),
         QStringLiteral("the key \"") + most.left(100) + QStringLiteral("…\" has 101 steps: at most 100 were expected"),
         "one more"},
        {deep, QStringLiteral("1"),
         QStringLiteral("the key \"") + deep.left(100) +
             QStringLiteral("…\" has 50001 steps: at most 100 were expected"),
         "each step is a call: the stack would not hold them"},
        {QStringLiteral("title"), QStringLiteral("[").repeated(50000), QString(), "no JSON: a text"},
        {QStringLiteral("data"), QStringLiteral("{\"d\": {\"csv\": \"a\", \"csv\": \"b\"}}"),
         QStringLiteral("the key \"csv\" occurs twice in \"{\"d\": {\"csv\": \"a\", \"csv\": \"b\"}}\""),
         "a key twice in a value"},
    };
    for (const Row &row : rows) {
        JsonSource source = sourceOf(base);
        EXPECT_EQ(source.set(row.key, row.text).value_or(QString()), row.message) << row.reason;
    }
}

TEST(JsonSource, AnErrorInWhatIsSetNamesTheOption)
{
    struct Row
    {
        const char *key;
        const char *text;
        const char *message;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"page.lines", "many", "--set page.lines=many: error: a whole number from 1 to 99 was expected",
         "the value itself"},
        {"page", "{\"lines\": 0}", "--set page={\"lines\": 0}: error: a whole number from 1 to 99 was expected",
         "a value inside what was set: the job file is not to blame"},
    };
    for (const Row &row : rows) {
        JsonSource source = sourceOf(base);
        std::optional<InputError> error;
        ASSERT_FALSE(source.set(QString::fromUtf8(row.key), QString::fromUtf8(row.text)));
        JsonNode(source, error)[QStringLiteral("page")][QStringLiteral("lines")].whole(1, 1, 99);
        ASSERT_TRUE(error.has_value()) << row.reason;
        EXPECT_EQ(error->message(), QString::fromUtf8(row.message)) << row.reason;
    }
}

TEST(JsonSource, WhatIsSetLaterReplacesWhatWasSetInsideIt)
{
    JsonSource source = sourceOf(base);
    std::optional<InputError> error;
    ASSERT_FALSE(source.set(QStringLiteral("page.name"), QStringLiteral("5")));
    ASSERT_FALSE(source.set(QStringLiteral("page"), QStringLiteral("{\"name\": 7}")));
    JsonNode(source, error)[QStringLiteral("page")][QStringLiteral("name")].text();
    EXPECT_TRUE(error.has_value()) << "the number 7 is not a text, whatever was set before";
}

TEST(JsonSource, AJobWithoutAFileHasNoPlaces)
{
    const JsonSource source = JsonSource::fromObject({{QStringLiteral("a"), 1}});
    std::optional<InputError> error;
    EXPECT_EQ(source.path(), QString());
    JsonNode(source, error)[QStringLiteral("a")].text();
    EXPECT_EQ(error->message(), QStringLiteral("error: a text was expected"));
}

} // namespace
