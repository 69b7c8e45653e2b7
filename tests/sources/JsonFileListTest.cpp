#include "JsonFileList.h"

#include "SurveyRows.h"

#include <gtest/gtest.h>

namespace
{

using kareport::ColumnChoice;
using kareport::JsonFileList;

std::shared_ptr<const kareport::FileBytes> fileOf(const JobFolder &folder, const QByteArray &text)
{
    folder.put("points.json", text);
    return std::get<std::shared_ptr<const kareport::FileBytes>>(kareport::FileBytes::open(folder.path("points.json")));
}

std::string rowsOf(const QByteArray &text, const std::vector<ColumnChoice> &columns = {},
                   const std::vector<unsigned> &sortedBy = {})
{
    const JobFolder folder;
    JsonFileList list(fileOf(folder, text), columns, survey::variables(), {});
    if (!sortedBy.empty()) {
        list.Sort(sortedBy);
    }
    return survey::rowsOf(list).join(u'\n').toStdString();
}

TEST(JsonFileList, ReadsListsAndLines)
{
    const char *two = "number=1 northing=2.5\nnumber=2";
    struct Row
    {
        QByteArray text;
        const char *expected;
        const char *reason;
    };
    const Row rows[] = {
        {R"([{"Number":"1","Northing":2.5},{"Number":"2"}])", two, "a list"},
        {"\xEF\xBB\xBF \n[ {\"Number\" : \"1\" ,\n \"Northing\" : 2.5 }\n , \n{ \"Number\":\"2\"}\n] \n", two,
         "blanks, and a byte-order mark"},
        {"{\"Number\":\"1\",\"Northing\":2.5}\n{\"Number\":\"2\"}\n", two, "an object a line"},
        {"{\"Number\":\"1\",\"Northing\":2.5}\r\n\r\n {\"Number\":\"2\"}", two, "with CR LF and blank lines"},
        {"{\"Number\":\"1\",\n\"Northing\":2.5}\n{\"Number\":\"2\"}", two, "over several lines"},
        {R"({"Number":"1"})", "number=1", "one object"},
        {"[]", "", "no object"},
        {" [ \n ] ", "", "no object"},
        {"[{}]", "\nerror no key of the objects is a variable of the dictionary; the keys are: none",
         "an object without a key"},
        {R"([{"number":1},{"NUMBER":2}])", "number=1\nnumber=2", "keys in any case"},
        {R"([{"Number":1,"Code":{"a":[1,{"Northing":7}]},"More":[{"Northing":3},"]}"]}])", "number=1",
         "what is not known is skipped"},
        {R"([{"Number":null,"Northing":null,"Count":2},{"Number":3}])", "count=2\nnumber=3",
         "null means no value, and nothing stays from the row before"},
        {R"([{"Description":"Gr\u00f6\u00dfe \ud834\udd1e \"x\" \\ \/"}])", "description=Größe 𝄞 \"x\" \\ /",
         "escapes"},
        {R"([{"Descr\u0069ption":"a"}])", "description=a", "in a key"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(rowsOf(row.text), row.expected) << row.reason;
    }
}

TEST(JsonFileList, ValuesFitTheTypesOfTheirVariables)
{
    struct Row
    {
        QByteArray member;
        const char *expected;
        const char *reason;
    };
    const Row rows[] = {
        {"\"Northing\": 2", "northing=2", "a whole number"},
        {"\"Northing\": -2.5e3", "northing=-2500", "with an exponent"},
        {"\"Northing\": 18446744073709551615", "northing=1.84467440737096e+19", "with many digits"},
        {"\"Northing\": \"2.5\"", "northing=2.5", "a text that is one"},
        {"\"Northing\": \"\"", "", "an empty text means no value"},
        {"\"Northing\": \"x\"", "error 1:15 the value of \"Northing\" does not fit: a number was expected",
         "a text that is not one"},
        {"\"Northing\": true", "error 1:15 the value of \"Northing\"", "a boolean"},
        {"\"Northing\": [1]", "error 1:15 the value of \"Northing\"", "a list"},
        {"\"Northing\": {}", "error 1:15 the value of \"Northing\"", "an object"},
        {"\"Northing\":\n\n  x", "error 3:3 this is not JSON: invalid literal", "not even JSON"},
        {"\"Northing\": 1e400", "error 1:20 this is not JSON: number overflow", "a number too large"},
        {"\"Number\": 12", "number=12", "a number where a text is wanted"},
        {"\"Number\": 9007199254740993", "number=9007199254740993", "with all its digits"},
        {"\"Number\": 9223372036854775808", "number=9223372036854775808", "beyond what is signed"},
        {"\"Number\": 18446744073709551615", "number=18446744073709551615", "the largest of 64 bits"},
        {"\"Number\": 18446744073709551616", "number=18446744073709552000", "and beyond it"},
        {"\"Count\": 9223372036854775808", "error 1:12 the value of \"Count\"", "too large for a whole number"},
        {"\"Number\": 2.50", "number=2.5", "with the digits that say it"},
        {"\"Number\": \"2.50\"", "number=2.50", "as a text it stays"},
        {"\"Description\": \"a\\u0000b\"", "error 1:18 the value of \"Description\"", "a zero byte"},
        {"\"Count\": 2.5", "error 1:12 the value of \"Count\" does not fit: a whole number was expected", "not whole"},
        {"\"Flag\": true", "flag=yes", "a flag"},
        {"\"Flag\": 0", "flag=no", "as a number"},
        {"\"Flag\": \"*\"", "flag=yes", "as a text"},
        {"\"Station\": \"12+345.678\", \"Offset\": \"3.2 L\"", "station=12345.678 offset=-3.2", "notation"},
        {"\"Bearing\": \"N45-30-36E\", \"Angle\": \"50g\"", "bearing=45.51 angle=45", "notation"},
        {"\"Number\": 1, \"Number\": 2", "error 1:16 the key \"Number\" occurs twice in an object", "a key twice"},
        {"\"Code\": 1, \"Code\": 2", "error 1:14 the key \"Code\" occurs twice in an object",
         "one that is not known, too"},
        {"\"Number\": 1, \"NUMBER\": 2", "error 1:16 the variable \"NUMBER\" occurs twice", "a variable twice"},
    };
    for (const Row &row : rows) {
        const std::string read = rowsOf("[{" + row.member + "}]");
        EXPECT_TRUE(QByteArray(row.expected).startsWith("error")
                        ? read.starts_with(row.expected)
                        : read == row.expected || (*row.expected == '\0' && read.empty()))
            << row.reason << ": " << read;
    }
}

TEST(JsonFileList, EveryMistakeHasItsPlace)
{
    struct Row
    {
        QByteArray text;
        const char *expected;
        const char *reason;
    };
    const Row rows[] = {
        {"", "error 1:1 a list of objects, or an object a line, was expected", "nothing"},
        {" \n ", "error 2:2 a list of objects, or an object a line, was expected", "blanks"},
        {"Number,Northing\n", "error 1:1 a list of objects, or an object a line, was expected", "another format"},
        {"7", "error 1:1 a list of objects, or an object a line, was expected", "a number"},
        {"[1]", "error 1:2 an object was expected", "a list of numbers"},
        {"[", "error 1:2 an object was expected", "cut short"},
        {"[{\"Number\":1},]", "number=1\nerror 1:15 an object was expected", "a comma too many"},
        {"[{\"Number\":1} {\"Number\":2}]", "number=1\nerror 1:15 a comma or the end of the list was expected",
         "a comma is missing"},
        {"[{\"Number\":1}", "number=1\nerror 1:14 a comma or the end of the list was expected", "the end is missing"},
        {"[{\"Number\":1}]\n{}", "number=1\nerror 2:1 nothing was expected after the list", "something after the list"},
        {"[]x", "error 1:3 nothing was expected after the list", "something after the list"},
        {"{\"Number\":1} {\"Number\":2}", "number=1\nerror 1:14 the end of the line was expected",
         "two objects in a line"},
        {"{\"Number\":1}\n2", "number=1\nerror 2:1 an object was expected", "a number in a line"},
        {"{\"Number\":1}\n{\"Number\":", "number=1\nerror 2:10 this is not JSON: ", "cut short"},
        {"{\"Number\":1}\n{\"Number\" 1}", "number=1\nerror 2:12 this is not JSON: ", "a colon is missing"},
        {"{\"Number\":1}\n{\"Number\":\"\xFF\"}",
         "number=1\nerror 2:12 this is not JSON: invalid string: ill-formed UTF-8 byte", "no UTF-8"},
        {"{\"Description\":\"\xC3\xB6\",\"Count\":\"x\"}", "error 1:28 the value of \"Count\"",
         "columns count characters"},
        {"[{\"Number\":1},\n{\"Number\":2,\n \"Count\":\"x\"}]", "number=1\nerror 3:10 the value of \"Count\"",
         "lines are counted"},
        {"{\"Code\":\"" + QByteArray(1 << 20, 'x') + "\"}", "error 1:1 the object is longer than 1048576 bytes",
         "no row"},
        {QByteArray("[").repeated(100000), "error 1:2 an object was expected", "lists in lists"},
        {"{\"Code\":" + QByteArray("[").repeated(100000) + "}",
         "error 1:100009 this is not JSON: ", "lists in a value"},
        {"{\"Code\":1}\n{\"Kind\":1}",
         "\n\nerror no key of the objects is a variable of the dictionary; the keys are: Code, Kind", "no variable"},
    };
    for (const Row &row : rows) {
        EXPECT_TRUE(rowsOf(row.text).starts_with(row.expected))
            << row.reason << ": " << rowsOf(row.text).substr(0, 300);
    }
}

TEST(JsonFileList, KeysAreChosen)
{
    const QByteArray text = R"([{"P":1,"Z":2,"Elevation":3},{"p":4,"Northing":5}])";
    struct Row
    {
        std::vector<ColumnChoice> columns;
        const char *expected;
        const char *reason;
    };
    const auto key = [](const char *name) { return QString::fromUtf8(name); };
    const Row rows[] = {
        {{{"Number", key("P")}}, "number=1 elevation=3\nnumber=4 northing=5", "in any case"},
        {{{"Number", key("P")}, {"Elevation", key("z")}},
         "number=1 elevation=2\nnumber=4 northing=5",
         "the choice wins over the name"},
        {{{"Number", key("P")}, {"Count", key("P")}},
         "number=1 elevation=3 count=1\nnumber=4 northing=5 count=4",
         "one key for two variables"},
        {{{"Easting", key("Northing")}}, "elevation=3\neasting=5", "a key that is chosen is not read by its name"},
        {{{"Number", key("Q")}},
         "elevation=3\nnorthing=5\nerror no object has the key \"Q\"",
         "a key that never comes"},
        {{{"Number", key("Elevatio")}},
         "elevation=3\nnorthing=5\nerror no object has the key \"Elevatio\": did you mean \"Elevation\"?",
         "a misspelt key"},
        {{{"Elev", key("Z")}},
         "error the dictionary has no variable \"Elev\": did you mean \"Elevation\"?",
         "no variable"},
        {{{"Elevation", key("Z")}, {"elevation", key("P")}},
         "error the variable \"elevation\" has two columns",
         "a variable twice"},
        {{{"Elevation", 2}}, "error the columns of JSON have no numbers", "a number"},
    };
    for (const Row &row : rows) {
        EXPECT_TRUE(rowsOf(text, row.columns).starts_with(row.expected))
            << row.reason << ": " << rowsOf(text, row.columns);
    }
}

TEST(JsonFileList, SortsAndGoesBack)
{
    for (const bool isList : {true, false}) {
        QByteArray text = isList ? "[" : "";
        for (int i = 0; i < 10000; ++i) {
            text += (isList && i > 0 ? "," : "") + QByteArray("{\"Number\":") + QByteArray::number(9999 - i) +
                    ",\n\"Count\":" + QByteArray::number(i) + "}\n";
        }
        text += isList ? "]" : "";
        const JobFolder folder;
        JsonFileList list(fileOf(folder, text), {}, survey::variables(), {});
        const auto row = [](std::size_t number) {
            return QStringLiteral("number=%1 count=%2").arg(number).arg(9999 - number);
        };
        EXPECT_EQ(survey::textOf(list.GetAt(9999)), row(0));
        EXPECT_EQ(survey::textOf(list.GetAt(0)), row(9999));
        list.Sort({survey::numberId});
        for (std::size_t i = 0; i < 10000; ++i) {
            ASSERT_EQ(survey::textOf(list.GetAt(i)), row(i));
        }
        EXPECT_EQ(list.GetAt(10000), nullptr);
        EXPECT_FALSE(list.error());
    }
}

TEST(JsonFileList, AMistakeHasItsPlaceAgain)
{
    const JobFolder folder;
    JsonFileList list(fileOf(folder, "{\"Number\":1}\n{\"Number\":2}\n\n3"), {}, survey::variables(), {});
    EXPECT_EQ(survey::rowsOf(list).last().toStdString(), "error 4:1 an object was expected");
    EXPECT_EQ(survey::rowsOf(list).last().toStdString(), "error 4:1 an object was expected") << "read again";
}

TEST(JsonFileList, AMistakeInASortedFileHasItsPlace)
{
    EXPECT_EQ(rowsOf("{\"Number\":2}\n{\"Number\":1,\n\"Count\":\"x\"}\n", {}, {survey::numberId}),
              "error 3:9 the value of \"Count\" does not fit: a whole number was expected");
    EXPECT_EQ(rowsOf("{\"Number\":2}\n{\"Number\":[]}\n", {}, {survey::numberId}),
              "error 2:11 the value of \"Number\" does not fit: a text was expected");
}

TEST(JsonFileList, TellsItsKeysWhenAllIsRead)
{
    const JobFolder folder;
    JsonFileList list(fileOf(folder, "{\"Number\":1}\n{\"Number\":2,\n  \"Elev\":3}"), {}, survey::variables(), {});
    EXPECT_EQ(survey::rowsOf(list).size(), 2);
    const auto &columns = list.reader().columns();
    ASSERT_EQ(columns.size(), 2U);
    EXPECT_TRUE(columns[0].isKnown);
    EXPECT_EQ(columns[1].name.toStdString(), "Elev");
    EXPECT_FALSE(columns[1].isKnown);
    EXPECT_EQ(placeText(columns[1].place).toStdString(), "3:3");
}

TEST(JsonFileList, KeysWithoutEndTakeNoMemoryWithoutEnd)
{
    QByteArray text;
    for (int i = 0; i < 30000; ++i) {
        text += "{\"Number\":" + QByteArray::number(i) + ",\"k" + QByteArray::number(i) + "\":1}\n";
    }
    const JobFolder folder;
    JsonFileList list(fileOf(folder, text), {}, survey::variables(), {});
    EXPECT_EQ(survey::rowsOf(list).size(), 30000);
    EXPECT_LE(list.reader().columns().size(), 10000U);
}

// A suite of its own, and so a process of its own: it must not map a file before, as a program does not whose data come
// through a pipe.
TEST(JsonInMemory, IsReadToItsEnd)
{
    const QByteArray rest = ",\"Description\":\"" + QByteArray(1000, 'x') + "\"}\n";
    QByteArray text;
    for (int i = 0; text.size() < (12 << 20); ++i) { // several of the pieces that a file's memory is given back in
        text += "{\"Number\":" + QByteArray::number(i) + rest;
    }
    const auto rows = text.count('\n');
    JsonFileList list(kareport::FileBytes::holding(QStringLiteral("-"), text), {}, survey::variables(), {});
    EXPECT_EQ(survey::rowsOf(list).size(), rows);
}

} // namespace
