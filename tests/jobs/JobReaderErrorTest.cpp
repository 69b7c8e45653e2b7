#include "JobReader.h"

#include "JobFolder.h"

#include <gtest/gtest.h>

namespace
{

using kareport::errorOf;
using kareport::JsonSource;

/// A job with one mistake, which is marked by "@".
struct Row
{
    const char *job;
    const char *contains; ///< what the message says was expected, or names
    const char *reason;
};

template <std::size_t count>
void expectErrors(const Row (&rows)[count])
{
    for (const Row &row : rows) {
        const MarkedText marked(row.job);
        const auto read = JsonSource::fromBytes(QStringLiteral("job.json"), marked.text);
        ASSERT_EQ(errorOf(read), nullptr) << row.job;
        const auto job = kareport::readJob(std::get<JsonSource>(read));
        const kareport::InputError *error = errorOf(job);
        ASSERT_NE(error, nullptr) << row.reason << ": " << row.job;
        const QString message = error->message();
        EXPECT_TRUE(message.startsWith(QStringLiteral("job.json:%1: error: ").arg(marked.place)))
            << row.reason << ": " << row.job << "\n"
            << message.toStdString();
        EXPECT_TRUE(error->text.contains(QString::fromUtf8(row.contains))) << row.reason << ": " << row.job << "\n"
                                                                           << message.toStdString();
        EXPECT_FALSE(message.contains(u'\n')) << row.reason;
    }
}

TEST(JobReaderError, OfTheJobItself)
{
    constexpr Row rows[] = {
        {R"(@{})", "\"report\"", "the one key that must be there"},
        {R"(@{"title": "T"})", "\"report\"", "where nothing else is wrong"},
        {R"({"report": @{}})", "a list was expected", "steps in an object"},
        {R"({"report": @null})", "a list was expected", "null is not a list"},
        {R"({"report": [], @"reports": []})", "\"reports\"", "an unknown key is named"},
        {R"({"report": [], @"Title": "T"})", "\"Title\"", "case matters in keys"},
        {R"({"report": [], "title": @5})", "a text was expected", "wrong type"},
        {R"({"report": [], "title": @null})", "a text was expected", "null is not a text"},
        {R"({"report": [], "application": @5})", "a text was expected", "wrong type"},
        {R"({"report": [], "application": @"Survey"})", "TALVEN", "the application's name must begin the title"},
        {R"({"report": [], "header": @"yes"})", "true or false was expected", "wrong type"},
        {R"({"report": [], "header": @1})", "true or false was expected", "wrong type"},
        {R"({"report": [], "now": @5})", "a text was expected", "wrong type"},
        {R"({"report": [], "now": @"yesterday"})", "2024-03-05T14:07:00", "no time"},
        {R"({"report": [], "now": @"2024-02-30T00:00:00"})", "2024-03-05T14:07:00", "no such day"},
        {R"({"report": [], "now": @""})", "2024-03-05T14:07:00", "an empty text"},
        {"{\"report\": [],\r\n  \"title\": \"Gr\xC3\xB6\xC3\x9F"
         "e \xF0\x9D\x84\x9E\", \"header\": @0}",
         "true or false was expected", "columns count characters"},
        {"\xEF\xBB\xBF{\"report\": [], \"header\": @0}", "true or false was expected", "after a byte-order mark"},
    };
    expectErrors(rows);
}

TEST(JobReaderError, OfPdfs)
{
    constexpr Row rows[] = {
        {R"({"report": [], "pdf": @true})", "an object was expected", "wrong type"},
        {R"({"report": [], "pdf": @null})", "an object was expected", "null is not an object"},
        {R"({"report": [], "pdf": {@"autor": "A"}})", "did you mean \"author\"", "an unknown key, with the nearest"},
        {R"({"report": [], "pdf": {"title": @5}})", "a text was expected", "wrong type"},
        {R"({"report": [], "pdf": {"author": @null}})", "a text was expected", "wrong type"},
        {R"({"report": [], "pdf": {"creator": @[]}})", "a text was expected", "wrong type"},
        {R"({"report": [], "pdf": {"language": @5}})", "a text was expected", "wrong type"},
        {R"({"report": [], "pdf": {"language": @"German language"}})", "de or en-GB", "no tag"},
        {R"({"report": [], "pdf": {"language": @""}})", "de or en-GB", "an empty text"},
        {R"({"report": [], "pdf": {"language": @"de_DE"}})", "de or en-GB", "a locale of a system"},
        {R"({"report": [], "pdf": {"language": @"de-"}})", "de or en-GB", "an empty part"},
        {R"({"report": [], "pdf": {"language": @"de\n"}})", "de or en-GB", "a line end"},
        {R"({"report": [], "pdf": {"language": @"d\u00e9"}})", "de or en-GB", "a letter that is not ASCII"},
        {R"({"report": [], "pdf": {"outline": @"yes"}})", "true or false was expected", "wrong type"},
        {R"({"report": [], "pdf": {"pageLabels": @1}})", "true or false was expected", "wrong type"},
    };
    expectErrors(rows);
}

TEST(JobReaderError, OfThePage)
{
    constexpr Row rows[] = {
        {R"({"report": [], "page": @[]})", "an object was expected", "wrong type"},
        {R"({"report": [], "page": {@"lines": 72}})", "\"lines\"", "unknown key"},
        {R"({"report": [], "page": {"paper": @"B5"}})", "A4", "no such paper"},
        {R"({"report": [], "page": {"paper": @4}})", "a text was expected", "wrong type"},
        {R"({"report": [], "page": {"orientation": @"upright"}})", "portrait, landscape", "no such orientation"},
        {R"({"report": [], "page": {"orientation": @true}})", "a text was expected", "wrong type"},
        {R"({"report": [], "page": {"resolution": @0}})", "a whole number from 1", "no dots"},
        {R"({"report": [], "page": {"resolution": @600.5}})", "a whole number", "not whole"},
        {R"({"report": [], "page": {"resolution": @"600"}})", "a whole number", "wrong type"},
        {R"({"report": [], "page": {"margins": @1000}})", "four margins", "wrong type"},
        {R"({"report": [], "page": {"margins": @[1, 2, 3]}})", "four margins", "one is missing"},
        {R"({"report": [], "page": {"margins": @[1, 2, 3, 4, 5]}})", "four margins", "one too many"},
        {R"({"report": [], "page": {"margins": [1, 2, @"3", 4]}})", "a whole number", "wrong type inside"},
        {R"({"report": [], "page": {"margins": [1, 2, 3, @0.5]}})", "a whole number", "not whole"},
        {R"({"report": [], "page": {"fontName": @5}})", "a text was expected", "wrong type"},
        {R"({"report": [], "page": {"fontSize": @0}})", "a whole number from 1", "no size"},
        {R"({"report": [], "page": {"fontSize": @"8"}})", "a whole number", "wrong type"},
        {R"({"report": [], "page": {"linesPerPage": @0}})", "a whole number from 1", "less than 1"},
        {R"({"report": [], "page": {"linesPerPage": @-72}})", "a whole number from 1", "negative"},
        {R"({"report": [], "page": {"linesPerPage": @1e300}})", "a whole number from 1", "beyond a page"},
        {R"({"report": [], "page": {"linesPerPage": @"72"}})", "a whole number", "wrong type"},
        {R"({"report": [], "page": {"charsPerRow": @0}})", "a whole number from 1", "less than 1"},
        {R"({"report": [], "page": {"printer": @"laser"}})", "default", "no such printer"},
        {R"({"report": [], "page": {"printer": @true}})", "a text was expected", "wrong type"},
    };
    expectErrors(rows);
}

TEST(JobReaderError, OfTheSettings)
{
    constexpr Row rows[] = {
        {R"({"report": [], "settings": @5})", "an object was expected", "wrong type"},
        {R"({"report": [], "settings": {@"lenghtUnit": "m"}})", "\"lenghtUnit\"", "unknown key"},
        {R"({"report": [], "settings": {"lengthUnit": @"yd"}})", "m, mm, km, ft, usft", "no such unit"},
        {R"({"report": [], "settings": {"lengthUnit": @"M"}})", "m, mm, km, ft, usft", "case matters"},
        {R"({"report": [], "settings": {"lengthUnit": @"us-ft"}})", "did you mean \"usft\"?", "a misspelt unit"},
        {R"({"report": [], "page": {"paper": @"Leter"}})", "did you mean \"Letter\"?", "a misspelt word"},
        {R"({"report": [], "data": {"p": {"csv": "p", "encoding": @"utf8"}}})", "did you mean \"utf-8\"?",
         "a misspelt encoding"},
        {R"({"report": [], "settings": {"lengthUnit": @1}})", "a text was expected", "wrong type"},
        {R"({"report": [], "settings": {"areaUnit": @"m"}})", "m2, ha, km2, ft2, ac", "a unit of length"},
        {R"({"report": [], "settings": {"angleUnit": @"dms"}})", "deg, gon, rad", "a unit of data only"},
        {R"({"report": [], "settings": {"lengthDecimals": @16}})", "from 0 to 15", "too many"},
        {R"({"report": [], "settings": {"lengthDecimals": @-1}})", "from 0 to 15", "negative"},
        {R"({"report": [], "settings": {"lengthDecimals": @2.5}})", "from 0 to 15", "not whole"},
        {R"({"report": [], "settings": {"stationDecimals": @16}})", "from 0 to 15", "too many"},
        {R"({"report": [], "settings": {"numberDecimals": @"3"}})", "from 0 to 15", "wrong type"},
        {R"({"report": [], "settings": {"stationFormat": @"0+0"}})", "plain, 0+00, 0+000", "no such format"},
        {R"({"report": [], "settings": {"northEastOrder": @"NW"}})", "NE, EN", "no such order"},
        {R"({"report": [], "settings": {"bearingUnit": @"rad"}})", "dms, deg, gon", "no such unit"},
        {R"({"report": [], "settings": {"bearingStyle": @"round"}})", "quadrant, circle", "no such style"},
        {R"({"report": [], "settings": {"bearingDecimals": @10}})", "from 0 to 9", "too many"},
        {R"({"report": [], "settings": {"bearingPadding": @1}})", "true or false was expected", "wrong type"},
        {R"({"report": [], "settings": {"bearingReference": @"east"}})", "north, south", "no such reference"},
        {R"({"report": [], "settings": {"angleMarks": @"d"}})", "a list of three texts", "wrong type"},
        {R"({"report": [], "settings": {"angleMarks": @["d"]}})", "a list of three texts", "two are missing"},
        {R"({"report": [], "settings": {"angleMarks": ["d", @1, ""]}})", "a text was expected", "wrong type inside"},
        {R"({"report": [], "settings": {"angleMarks": ["d", "m", @"''"]}})", "one character", "two characters"},
        {"{\"report\": [], \"settings\": {\"angleMarks\": [@\"\xE2\x82\xAC\", \"m\", \"s\"]}}", "up to 255",
         "a character beyond Latin-1"},
    };
    expectErrors(rows);
}

TEST(JobReaderError, OfTemplateAndOptions)
{
    constexpr Row rows[] = {
        {R"({"report": [], "template": @"t.xml"})", "an object was expected", "wrong type"},
        {R"({"report": [], "template": @{"file": "t.xml"}})", "\"name\"", "no name"},
        {R"({"report": [], "template": @{"name": "T"}})", "\"file\"", "no file"},
        {R"({"report": [], "template": {"file": @5, "name": "T"}})", "a text was expected", "wrong type"},
        {R"({"report": [], "template": {"file": "t.xml", "name": "T", @"table": "P"}})", "\"table\"", "unknown key"},
        {R"({"report": [], "options": @[]})", "an object was expected", "wrong type"},
        {R"({"report": [], "options": {@"blankZero": true}})", "\"blankZero\"", "unknown key"},
        {R"({"report": [], "options": {"zeroBlank": @1}})", "true or false was expected", "wrong type"},
        {R"({"report": [], "options": {"writeTableName": @"x"}})", "true or false was expected", "wrong type"},
        {R"({"report": [], "options": {"printHash": @null}})", "true or false was expected", "null is not false"},
        {R"({"report": [], "options": {"excel": @"true"}})", "true or false was expected", "wrong type"},
        {R"({"report": [], "options": {"chainageLabel": @5}})", "a text was expected", "wrong type"},
        {R"({"report": [], "options": {"separator": @""}})", "one character", "no character"},
        {R"({"report": [], "options": {"separator": @"ab"}})", "one character", "two characters"},
        {R"({"report": [], "options": {"separator": @-1}})", "a whole number from 0", "negative"},
        {R"({"report": [], "options": {"separator": @65536}})", "a whole number from 0", "no 16-bit character"},
        {R"({"report": [], "options": {"separator": @true}})", "a whole number", "wrong type"},
    };
    expectErrors(rows);
}

TEST(JobReaderError, OfData)
{
    constexpr Row rows[] = {
        {R"({"report": [], "data": @[]})", "an object was expected", "wrong type"},
        {R"({"report": [], "data": {"p": @"p.csv"}})", "an object was expected", "wrong type of a set"},
        {R"({"report": [], "data": {"p": @{}}})", "one of the keys csv, values, sqlite", "none of them"},
        {R"({"report": [], "data": {"p": @{"csv": "p.csv", "values": []}}})", "only one of the keys csv, values was",
         "two"},
        {R"({"report": [], "data": {"p": {"csv": "p.csv", @"separator": ";"}}})", "\"separator\"", "unknown key"},
        {R"({"report": [], "data": {"p": {"csv": @5}}})", "a text was expected", "wrong type"},
        {R"({"report": [], "data": {"p": {"values": @5}}})", "an object or a list of objects", "wrong type"},
        {R"({"report": [], "data": {"p": {"values": @null}}})", "an object or a list of objects", "null"},
        {R"({"report": [], "data": {"p": {"csv": "p.csv", "delimiter": @""}}})", "one ASCII character", "none"},
        {R"({"report": [], "data": {"p": {"csv": "p.csv", "delimiter": @"||"}}})", "one ASCII character", "two"},
        {R"({"report": [], "data": {"p": {"csv": "p.csv", "delimiter": @"\""}}})", "quote", "a quote"},
        {R"({"report": [], "data": {"p": {"csv": "p.csv", "delimiter": @"\n"}}})", "line end", "a line end"},
        {R"({"report": [], "data": {"p": {"csv": "p.csv", "delimiter": @"\u0000"}}})", "ASCII character", "zero"},
        {R"({"report": [], "data": {"p": {"csv": "p.csv", "delimiter": @"\u00a7"}}})", "ASCII", "more than a byte"},
        {R"({"report": [], "data": {"p": {"csv": "p.csv", "delimiter": @9}}})", "a text was expected", "wrong type"},
        {R"({"report": [], "data": {"p": {"values": [], "units": @"m"}}})", "an object was expected", "wrong type"},
        {R"({"report": [], "data": {"p": {"values": [], "units": {@"lenght": "m"}}}})", "\"lenght\"", "unknown key"},
        {R"({"report": [], "data": {"p": {"values": [], "units": {"length": @"yd"}}}})", "m, mm, km, ft, usft", "none"},
        {R"({"report": [], "data": {"p": {"values": [], "units": {"area": @"m"}}}})", "m2, ha, km2, ft2, ac", "none"},
        {R"({"report": [], "data": {"p": {"values": [], "units": {"angle": @"grad"}}}})", "deg, gon, rad, dms", "none"},
        {R"({"report": [], "data": {"p": {"values": [], "units": {"angle": @5}}}})", "a text was expected", "type"},
        {"{\"report\": [],\n \"data\": {\"a\": {\"values\": []},\n  \"b\": {\"values\": [],\n   @\"csw\": \"\"}}}",
         "\"csw\"", "in the second set, lines below"},
    };
    expectErrors(rows);
}

TEST(JobReaderError, OfTheMarksOfTextFiles)
{
    constexpr Row rows[] = {
        {R"({"report": [], "data": {"p": {"csv": "p", "delimiter": @"tab"}}})", "whitespace, auto", "no such word"},
        {R"({"report": [], "data": {"p": {"csv": "p", "delimiter": @"5"}}})", "other than a letter, a digit",
         "a digit"},
        {R"({"report": [], "data": {"p": {"csv": "p", "delimiter": @"x"}}})", "other than a letter, a digit",
         "a letter"},
        {R"({"report": [], "data": {"p": {"csv": "p", "delimiter": @"-"}}})", "other than a letter, a digit", "a sign"},
        {R"({"report": [], "data": {"p": {"csv": "p", "delimiter": @"."}}})", "that of \"decimal\"",
         "the decimal point, which the job does not say"},
        {R"({"report": [], "data": {"p": {"csv": "p", "decimal": @","}}})", "that of \"delimiter\"",
         "the comma between cells, which the job does not say"},
        {R"({"report": [], "data": {"p": {"csv": "p", "thousands": @","}}})", "that of \"delimiter\"", "the same"},
        {R"({"report": [], "data": {"p": {"csv": "p", "comment": @","}}})", "that of \"delimiter\"", "empty cells"},
        {R"({"report": [], "data": {"p": {"csv": "p", "comment": @"."}}})", "that of \"decimal\"", "such as .5"},
        {R"({"report": [], "data": {"p": {"csv": "p", "comment": @"-"}}})", "other than a letter, a digit",
         "such as -5"},
        {R"({"report": [], "data": {"p": {"csv": "p", "comment": @"1"}}})", "other than a letter, a digit",
         "such as 12"},
        {R"({"report": [], "data": {"p": {"csv": "p", "delimiter": "whitespace", "comment": @" "}}})",
         "that of \"delimiter\"", "blanks around a row"},
        {R"({"report": [], "data": {"p": {"csv": "p", "decimal": @";"}}})", "\".\", \",\"", "no decimal sign"},
        {R"({"report": [], "data": {"p": {"csv": "p", "thousands": @"."}}})", "or the decimal sign", "is one"},
        {R"({"report": [], "data": {"p": {"csv": "p", "thousands": @"5"}}})", "other than a digit", "is a digit"},
        {R"({"report": [], "data": {"p": {"csv": "p", "thousands": @""}}})", "one character", "none"},
        {R"({"report": [], "data": {"p": {"csv": "p", "comment": @"//"}}})", "one ASCII character", "two"},
    };
    expectErrors(rows);
}

TEST(JobReaderError, OfTheRowsOfTextFiles)
{
    constexpr Row rows[] = {
        {R"({"report": [], "data": {"p": {"csv": "p", "header": @"no"}}})", "true or false", "wrong type"},
        {R"({"report": [], "data": {"p": {"csv": "p", "columns": @[]}}})", "in their order", "no column"},
        {R"({"report": [], "data": {"p": {"csv": "p", "columns": ["A", @5]}}})", "a text", "a number for a name"},
        {R"({"report": [], "data": {"p": {"csv": "p", "columns": @"A"}}})", "an object", "wrong type"},
        {R"({"report": [], "data": {"p": {"csv": "p", "columns": {"A": @0}}}})", "from 1", "columns begin with 1"},
        {R"({"report": [], "data": {"p": {"csv": "p", "columns": {"A": @""}}}})", "the name of a column", "empty"},
        {R"({"report": [], "data": {"p": {"csv": "p", "columns": {"A": @null}}}})", "the name of a column", "null"},
        {R"({"report": [], "data": {"p": {"csv": "p", "order": @"PNEX"}}})", "PNEZD", "no such letter"},
        {R"({"report": [], "data": {"p": {"csv": "p", "order": @""}}})", "PNEZD", "no letter"},
        {R"({"report": [], "data": {"p": {"csv": "p", "columns": ["A"], "order": @"P"}}})", "either", "named twice"},
        {R"({"report": [], "data": {"p": {"csv": "p", "encoding": @"UTF-8"}}})", "utf-8, latin-1", "case matters"},
        {R"({"report": [], "data": {"p": {"csv": "p", "skip": @-1}}})", "a whole number from 0", "below 0"},
        {R"({"report": [], "data": {"p": {"csv": "p", "skipBlankLines": @1}}})", "true or false", "wrong type"},
        {R"({"report": [], "data": {"p": {"csv": "p", @"encodign": "utf-8"}}})", "did you mean \"encoding\"?",
         "misspelt"},
        {R"({"report": [], "data": {"p": {"csv": "p", @"query": "SELECT 1"}}})", "unknown key \"query\"",
         "a key of another kind"},
    };
    expectErrors(rows);
}

TEST(JobReaderError, OfTheOtherKindsOfData)
{
    constexpr Row rows[] = {
        {R"({"report": [], "data": {"p": @{"sqlite": "p"}}})", "either \"table\" or \"query\"", "neither"},
        {R"({"report": [], "data": {"p": @{"sqlite": "p", "table": "a", "query": "b"}}})", "either \"table\"", "both"},
        {R"({"report": [], "data": {"p": {"sqlite": "p", "table": @5}}})", "a text", "wrong type"},
        {R"({"report": [], "data": {"p": {"sqlite": "p", "table": "a", @"delimiter": ";"}}})", "unknown key",
         "no text"},
        {R"({"report": [], "data": {"p": {"sqlite": @"p\u0000.db", "table": "a"}}})", "a character 0", "cut"},
        {R"({"report": [], "data": {"p": {"sqlite": "p", "table": @"a\u0000b"}}})", "a zero character", "cut"},
        {R"({"report": [], "data": {"p": {"sqlite": "p", "query": @"SELECT 1 \u0000"}}})", "a zero character", "cut"},
        {R"({"report": [], "data": {"p": {"postgresql": @"\u0000", "query": "a"}}})", "a zero character", "cut"},
        {R"({"report": [], "data": {"p": {"postgresql": "", "query": @"\u0000"}}})", "a zero character", "cut"},
        {R"({"report": [], "data": {"p": {"postgresql": "", "query": "a", "parameters": [@"a\u0000b"]}}})",
         "a zero character", "cut"},
        {R"({"report": [], "data": {"p": @{"postgresql": ""}}})", "\"query\"", "no query"},
        {R"({"report": [], "data": {"p": {"postgresql": "", "query": "SELECT $1", "parameters": @5}}})", "a list",
         "type"},
        {R"({"report": [], "data": {"p": {"postgresql": "", "query": "SELECT $1", "parameters": [@[]]}}})",
         "true, false or null", "a list for a value"},
        {R"({"report": [], "data": {"p": {"postgresql": "", "query": "SELECT 1", @"table": "t"}}})", "unknown key",
         "none"},
        {R"({"report": [], "data": {"p": {"json": @5}}})", "a text", "wrong type"},
        {R"({"report": [], "data": {"p": {"json": "p", "columns": @[]}}})", "an object", "keys have no order"},
        {R"({"report": [], "strict": @"yes"})", "true or false", "wrong type"},
    };
    expectErrors(rows);
}

#define KA_SETS R"("template": {"file": "t.xml", "name": "T"}, "data": {"d": {"values": []}}, )"

TEST(JobReaderError, OfSteps)
{
    constexpr Row rows[] = {
        {R"({"report": [@5]})", "an object was expected", "wrong type"},
        {R"({"report": [@{}]})", "heading, line, lineFeed, newPage, block, table, clear", "a step of nothing"},
        {R"({"report": [{@"headings": "H"}]})", "\"headings\"", "unknown step"},
        {R"({"report": [{"line": "a"}, {"line": @5}]})", "a text was expected", "wrong type in the second step"},
        {R"({"report": [{"heading": @5}]})", "a text was expected", "wrong type"},
        {R"({"report": [{"heading": "H", @"style": 1}]})", "\"style\"", "a heading has no style"},
        {R"({"report": [{"heading": "H", @"line": "L"}]})", "\"line\"", "two steps in one"},
        {R"({"report": [{"heading": "H", "before": @"1"}]})", "a whole number", "wrong type"},
        {R"({"report": [{"heading": "H", "after": @0.5}]})", "a whole number", "not whole"},
        {R"({"report": [{"line": "L", "before": @true}]})", "a whole number", "wrong type"},
        {R"({"report": [{"line": "L", "after": @null}]})", "a whole number", "null is not a number"},
        {R"({"report": [{"line": "L", "style": @"bold"}]})", "a whole number", "wrong type"},
        {R"({"report": [{"line": "L", "style": @2147483648}]})", "from -2147483648 to 2147483647", "beyond 32 bits"},
        {R"({"report": [{"line": "L", "style": @-2147483649}]})", "from -2147483648 to 2147483647", "beyond 32 bits"},
        {R"({"report": [{"line": "L", @"data": "d"}]})", "\"data\"", "a line has no data"},
        {R"({"report": [{"lineFeed": @"1"}]})", "a whole number", "wrong type"},
        {R"({"report": [{"lineFeed": 1, @"style": 1}]})", "\"style\"", "unknown key"},
        {R"({"report": [{"newPage": @true}]})", "a whole number", "wrong type"},
        {R"({"report": [{"clear": @1}]})", "true or false was expected", "wrong type"},
        {R"({"report": [{"clear": @false}]})", "true was expected", "not to clear is not a step"},
        {"{" KA_SETS R"("report": [{"block": @5, "data": "d"}]})", "a text was expected", "wrong type"},
        {"{" KA_SETS R"("report": [@{"block": "B"}]})", "\"data\"", "no data"},
        {"{" KA_SETS R"("report": [{"block": "B", "data": @5}]})", "a text was expected", "wrong type"},
        {"{" KA_SETS R"("report": [{"block": "B", "data": @"e"}]})", "\"e\"", "no such data"},
        {"{" KA_SETS R"("report": [{"block": "B", "data": @"D"}]})", "\"D\"", "case matters in names of data"},
        {"{" KA_SETS R"("report": [{"table": "P", "data": @"dd"}]})",
         "there is no data set named \"dd\" in the job: one of d was expected; did you mean \"d\"?",
         "the nearest name"},
        {R"({"options": {"placeholders": true}, "report": [{"line": @"a {nix}"}]})",
         "unknown placeholder {nix}: one of", "a placeholder in a line"},
        {R"({"options": {"placeholders": true}, "report": [{"heading": @"{dat}"}]})", "did you mean \"{date}\"?",
         "a placeholder in a heading"},
        {R"({"options": {"placeholders": true}, "report": [{"line": @"a { b"}]})", "\"}\" was expected", "a brace"},
        {R"({"options": {"placeholders": true, "chainageLabel": @"{nix}"}, "report": []})", "unknown placeholder {nix}",
         "a placeholder in the word for stations"},
        {R"({"options": {"placeholders": @1}, "report": []})", "true or false was expected", "wrong type"},
        {"{" KA_SETS R"("report": [{"block": "B", "data": "d", @"headingAfter": 1}]})", "\"headingAfter\"", "unknown"},
        {"{" KA_SETS R"("report": [@{"table": "P"}]})", "\"data\"", "no data"},
        {"{" KA_SETS R"("report": [{"table": "P", "data": @"e"}]})", "\"e\"", "no such data"},
        {"{" KA_SETS R"("report": [{"table": "P", "data": "d", "headingAfter": @"2"}]})", "a whole number", "type"},
        {"{" KA_SETS R"("report": [{"table": "P", "data": "d", @"style": 1}]})", "\"style\"", "unknown key"},
        {R"({"data": {"d": {"values": []}}, "report": [@{"table": "P", "data": "d"}]})", "\"template\"",
         "a table without a template"},
        {R"({"data": {"d": {"values": {}}}, "report": [@{"block": "B", "data": "d"}]})", "\"template\"",
         "a block without a template"},
    };
    expectErrors(rows);
}

TEST(JobReaderError, OfFileNamesThatTheSystemWouldCut)
{
    const char *const cut = "a file name without a character 0 was expected";
    const Row rows[] = {
        {R"({"report": [], "data": {"d": {"csv": @"p.csv\u0000.txt"}}})", cut, "a data file"},
        {R"({"report": [], "template": {"file": @"t.xml\u0000", "name": "T"}})", cut, "a template, at its end"},
        {R"({"report": [], "output": ["a.rep", @"b\u0000.rep"]})", cut, "an output"},
        {R"({"report": [], "output": [{"file": @"\u0000b.rep", "as": "rep"}]})", cut, "an output with its kind"},
    };
    expectErrors(rows);
}

TEST(JobReaderError, OfOutputs)
{
    constexpr Row rows[] = {
        {R"({"report": [], "output": @"a.rep"})", "a list was expected", "wrong type"},
        {R"({"report": [], "output": ["a.rep", @5]})", "a text was expected", "wrong type inside"},
        {R"({"report": [], "output": [@"a.doc"]})", "\"a.doc\"", "an ending of no kind"},
        {R"({"report": [], "output": [@"rep"]})", "\"rep\"", "no ending"},
        {R"({"report": [], "output": [@{}]})", "\"file\"", "no file"},
        {R"({"report": [], "output": [@{"as": "rep"}]})", "\"file\"", "a kind, but no file"},
        {R"({"report": [], "output": [{"file": @5, "as": "rep"}]})", "a text was expected", "wrong type"},
        {R"({"report": [], "output": [{"file": @"a.bin"}]})", "\"as\"", "an ending of no kind"},
        {R"({"report": [], "output": [{"file": "a.rep", "as": @"doc"}]})", "rep", "no such kind"},
        {R"({"report": [], "output": [{"file": "a.rep", "as": @"REP"}]})", "rep", "case matters in kinds"},
        {R"({"report": [], "output": [{"file": "a.rep", "as": @1}]})", "a text was expected", "wrong type"},
        {R"({"report": [], "output": [{"file": "a.rep", @"kind": "rep"}]})", "\"kind\"", "unknown key"},
    };
    expectErrors(rows);
}

} // namespace
