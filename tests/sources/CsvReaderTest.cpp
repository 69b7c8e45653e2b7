#include "CsvReader.h"

#include "InputErrorText.h"
#include "JobFolder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace
{

using kareport::CsvReader;
using kareport::errorOf;
using kareport::FileBytes;
using testing::ElementsAre;

using Cells = std::vector<std::string>;

const QString file = QStringLiteral("points.csv");

Cells cellsOf(const CsvReader &reader)
{
    return {reader.cells().begin(), reader.cells().end()};
}

std::vector<Cells> rowsOf(CsvReader &reader)
{
    std::vector<Cells> rows;
    while (reader.next()) {
        rows.push_back(cellsOf(reader));
    }
    return rows;
}

TEST(CsvReader, ReadsRowsAndCells)
{
    struct Row
    {
        std::string_view bytes;
        char delimiter;
        std::vector<Cells> expected;
        const char *reason;
    };
    const Row rows[] = {
        {"", ',', {}, "an empty file"},
        {"\xEF\xBB\xBF", ',', {}, "a byte-order mark and nothing else"},
        {"\n\r\n\n", ',', {}, "blank lines only"},
        {"a", ',', {{"a"}}, "one cell without a line end"},
        {"a,b\n1,2\n", ',', {{"a", "b"}, {"1", "2"}}, "rows that end with LF"},
        {"a,b\r\n1,2\r\n", ',', {{"a", "b"}, {"1", "2"}}, "rows that end with CR LF"},
        {"a,b\n1,2", ',', {{"a", "b"}, {"1", "2"}}, "the last row without a line end"},
        {"a,b\r\n1,2\n3,4", ',', {{"a", "b"}, {"1", "2"}, {"3", "4"}}, "both line ends in one file"},
        {"\xEF\xBB\xBF"
         "a,b",
         ',',
         {{"a", "b"}},
         "a byte-order mark is not part of the first cell"},
        {"\xEF\xBB\xBF\"a\",b", ',', {{"a", "b"}}, "a quoted cell after a byte-order mark"},
        {",", ',', {{"", ""}}, "two empty cells"},
        {"a,,b,\n", ',', {{"a", "", "b", ""}}, "empty cells, the last one too"},
        {" a , b ", ',', {{" a ", " b "}}, "blanks are part of a cell"},
        {"\"a,b\",c", ',', {{"a,b", "c"}}, "a delimiter in quotes"},
        {"\"a\"\"b\"", ',', {{"a\"b"}}, "a doubled quote"},
        {"\"\"\"\"", ',', {{"\""}}, "a doubled quote alone"},
        {"\"\"\"\"\"\"", ',', {{"\"\""}}, "two doubled quotes"},
        {"\"a\"\"\",\"\"\"b\"", ',', {{"a\"", "\"b"}}, "doubled quotes in two cells"},
        {"\"\"", ',', {{""}}, "an empty quoted cell"},
        {"\"\",\"\"", ',', {{"", ""}}, "empty quoted cells"},
        {"\"a\nb\",c\nd,e", ',', {{"a\nb", "c"}, {"d", "e"}}, "a quoted cell over two lines"},
        {"\"a\r\nb\r\n\r\n\",c", ',', {{"a\r\nb\r\n\r\n", "c"}}, "a quoted cell keeps its line ends"},
        {"\"a\"\r\n\"b\"", ',', {{"a"}, {"b"}}, "a quote at the end of a row"},
        {"a\tb,c\n", '\t', {{"a", "b,c"}}, "tabs between; the comma is not a delimiter"},
        {"a;\"b;c\";1,5\n", ';', {{"a", "b;c", "1,5"}}, "semicolons between"},
        {"a b\n", ' ', {{"a", "b"}}, "blanks between"},
        {"Gr\xC3\xB6\xC3\x9F"
         "e,\xE6\xB8\xAC,\xF0\x9D\x84\x9E",
         ',',
         {{"Gr\xC3\xB6\xC3\x9F"
           "e",
           "\xE6\xB8\xAC", "\xF0\x9D\x84\x9E"}},
         "UTF-8 of two, three and four bytes"},
        {"a\n\n\n\r\n", ',', {{"a"}}, "blank lines at the end are not rows"},
        {"a,b\n\n1,2", ',', {{"a", "b"}, {""}, {"1", "2"}}, "a blank line inside is a row of one empty cell"},
        {"\n\na", ',', {{""}, {""}, {"a"}}, "blank lines at the beginning"},
    };
    for (const Row &row : rows) {
        CsvReader reader(file, row.bytes, row.delimiter);
        EXPECT_EQ(rowsOf(reader), row.expected) << row.reason;
        EXPECT_FALSE(reader.error()) << row.reason;
        EXPECT_FALSE(reader.next()) << row.reason << ": it stays at the end";
    }
}

TEST(CsvReader, EveryMistakeHasItsPlace)
{
    using namespace std::string_view_literals;
    struct Row
    {
        std::string_view bytes;
        const char *place;
        const char *contains;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"a\"b"sv, "1:2", "quote", "a quote in a plain cell"},
        {"a,b\n1,2\"3"sv, "2:4", "quote", "in the second row"},
        {"a,b\n1,2\"\n"sv, "2:4", "quote", "at the end of a plain cell"},
        {"a, \"b\""sv, "1:4", "quote", "a blank in front of a quoted cell"},
        {"\"a\"b"sv, "1:4", "delimiter", "a letter after the closing quote"},
        {"\"a\" ,b"sv, "1:4", "delimiter", "a blank after the closing quote"},
        {"\"a\";b"sv, "1:4", "delimiter", "another delimiter after the closing quote"},
        {"\"abc"sv, "1:1", "no closing quote", "cut off in a quoted cell"},
        {"x,\"abc\ndef\n"sv, "1:3", "no closing quote", "where the quote was opened, not where the file ends"},
        {"\"a\"\""sv, "1:1", "no closing quote", "a doubled quote closes nothing"},
        {"\""sv, "1:1", "no closing quote", "a quote alone"},
        {"a\0b"sv, "1:2", "zero byte", "a zero byte"},
        {"\"a\0\""sv, "1:3", "zero byte", "a zero byte in quotes"},
        {"a\rb"sv, "1:2", "line feed", "a carriage return alone"},
        {"ab\xFF"sv, "1:3", "not UTF-8", "a byte that is never UTF-8"},
        {"Gr\xF6\xDF"
         "e"sv,
         "1:3", "not UTF-8", "Latin-1"},
        {"a,b\n1,\xE4\n"sv, "2:3", "not UTF-8", "Latin-1 in the second row"},
        {"\xC3\xA4\xC3"sv, "1:2", "not UTF-8", "cut off in the middle of a character"},
        {"x\xC0\x80"sv, "1:2", "not UTF-8", "an overlong zero"},
        {"x\xED\xA0\x80"sv, "1:2", "not UTF-8", "half a surrogate pair"},
        {"x\xF4\x90\x80\x80"sv, "1:2", "not UTF-8", "beyond the last character"},
        {"\"a\nb\xFF\""sv, "2:2", "not UTF-8", "in the second line of a quoted cell"},
        {"\xEF\xBB\xBF"
         "a\xFF"sv,
         "1:2", "not UTF-8", "after a byte-order mark"},
        {"\xFF\xFE"
         "N\0,\0E\0"sv,
         "1:4", "", "UTF-16"},
        {"\"x\ny\",z\nq\""sv, "3:2", "quote", "the row after one of two lines"},
        {"\"x\ny\",z\""sv, "2:5", "quote", "the second line of a row"},
        {"\"x\r\ny\",z\""sv, "2:5", "quote", "the second line of a row, with CR LF"},
        {"\xF0\x9D\x84\x9E\xE6\xB8\xAC,a\""sv, "1:5", "quote", "columns count characters, not bytes"},
        {"\xEF\xBB\xBF"
         "a\""sv,
         "1:2", "quote", "a byte-order mark takes no column"},
    };
    for (const Row &row : rows) {
        CsvReader reader(file, row.bytes, ',');
        rowsOf(reader);
        ASSERT_TRUE(reader.error()) << row.reason;
        EXPECT_EQ(placeText(reader.error()), QString::fromUtf8(row.place)) << row.reason;
        EXPECT_TRUE(reader.error()->text.contains(QString::fromUtf8(row.contains)))
            << row.reason << ": " << reader.error()->text.toStdString();
        EXPECT_EQ(reader.error()->file, file) << row.reason;
        EXPECT_FALSE(reader.next()) << row.reason << ": nothing is read after a mistake";
    }
}

TEST(CsvReader, RowsBeforeAMistakeAreRead)
{
    CsvReader reader(file, "a,b\n1,2\n3,\"4\n", ',');
    EXPECT_THAT(rowsOf(reader), ElementsAre(Cells{"a", "b"}, Cells{"1", "2"}));
    EXPECT_EQ(placeText(reader.error()), QStringLiteral("3:3"));
}

TEST(CsvReader, AnEndlessLineIsNotCsv)
{
    constexpr std::size_t most = std::size_t(1) << 20;
    struct Row
    {
        std::string bytes;
        const char *place; ///< null when it is read
        const char *reason;
    };
    const Row rows[] = {
        {std::string(most, 'x'), nullptr, "the longest row"},
        {std::string(most, 'x') + "\n", nullptr, "the longest row and its line end"},
        {std::string(most, 'x') + "\ny\n", nullptr, "the longest row and another one"},
        {std::string(most + 1, 'x'), "1:1", "one byte more"},
        {"a\n" + std::string(3 * most, 'x'), "2:1", "a second line without an end"},
        {std::string(3 * most, ','), "1:1", "cells without an end"},
        {"a\n\"" + std::string(3 * most, 'x') + "\"\n", "2:1", "a quoted cell without an end"},
        {"a\n\"" + std::string(3 * most, '\n') + "\"\n", "2:1", "lines without an end in a quoted cell"},
    };
    for (const Row &row : rows) {
        CsvReader reader(file, row.bytes, ',');
        rowsOf(reader);
        EXPECT_EQ(placeText(reader.error()), QString::fromUtf8(row.place != nullptr ? row.place : "no error"))
            << row.reason;
    }
}

TEST(CsvReader, ManyRowsAreNotAnEndlessLine)
{
    std::string bytes;
    for (int i = 0; i < 400000; ++i) {
        bytes += "12345,678\r\n";
    }
    CsvReader reader(file, bytes, ',');
    std::size_t count = 0;
    while (reader.next()) {
        ++count;
    }
    EXPECT_FALSE(reader.error());
    EXPECT_EQ(count, 400000U);
    EXPECT_EQ(reader.position(), bytes.size());
}

TEST(CsvReader, CountsLinesAndGoesBack)
{
    constexpr std::string_view bytes = "a\n\"b\nc\"\nd\r\n\"e\r\n\r\nf\"\n\xC3\xA4\n";
    struct Expected
    {
        Cells cells;
        qsizetype line;
    };
    const Expected expected[] = {{{"a"}, 1}, {{"b\nc"}, 2}, {{"d"}, 4}, {{"e\r\n\r\nf"}, 5}, {{"\xC3\xA4"}, 8}};
    CsvReader reader(file, bytes, ',');
    std::vector<std::size_t> starts;
    for (const Expected &row : expected) {
        EXPECT_EQ(reader.nextLine(), row.line);
        ASSERT_TRUE(reader.next());
        EXPECT_EQ(cellsOf(reader), row.cells);
        EXPECT_EQ(reader.rowLine(), row.line);
        starts.push_back(reader.rowStart());
    }
    EXPECT_FALSE(reader.next());
    for (std::size_t i = std::size(expected); i-- > 0;) {
        reader.seek(starts[i], expected[i].line);
        ASSERT_TRUE(reader.next()) << i;
        EXPECT_EQ(cellsOf(reader), expected[i].cells) << i;
        EXPECT_EQ(reader.rowLine(), expected[i].line) << i;
    }
}

TEST(CsvReader, GoesBackAfterAMistake)
{
    CsvReader reader(file, "a\nb\"\n", ',');
    ASSERT_TRUE(reader.next());
    EXPECT_FALSE(reader.next());
    reader.seek(0, 1);
    EXPECT_FALSE(reader.error());
    EXPECT_TRUE(reader.next());
    EXPECT_FALSE(reader.next());
    EXPECT_EQ(placeText(reader.error()), QStringLiteral("2:2"));
}

TEST(CsvReader, KnowsThePlaceOfEachCell)
{
    CsvReader reader(file, "x\n\xC3\xA4,\"b\nc\",\"d\",", ',');
    ASSERT_TRUE(reader.next());
    ASSERT_TRUE(reader.next());
    const char *places[] = {"2:1", "2:3", "3:4", "3:8"};
    for (std::size_t i = 0; i < std::size(places); ++i) {
        EXPECT_EQ(placeText(reader.placeOfCell(i)), QString::fromUtf8(places[i])) << "cell " << i;
    }
}

TEST(FileBytes, ShowsAFilesContent)
{
    const JobFolder folder;
    for (const QByteArray &content : {QByteArray(), QByteArray("a\0b", 3), QByteArray(100000, 'x')}) {
        folder.put("f.csv", content);
        const auto opened = FileBytes::open(folder.path("f.csv"));
        ASSERT_EQ(errorOf(opened), nullptr);
        const auto &bytes = std::get<std::shared_ptr<const FileBytes>>(opened);
        EXPECT_EQ(bytes->view(), std::string_view(content.constData(), static_cast<std::size_t>(content.size())));
        EXPECT_EQ(bytes->path(), folder.path("f.csv"));
    }
}

TEST(FileBytes, AFileThatCannotBeReadIsAnError)
{
    const JobFolder folder;
    for (const QString &path : {folder.path("missing.csv"), folder.path()}) {
        const auto opened = FileBytes::open(path);
        const auto *error = errorOf(opened);
        ASSERT_NE(error, nullptr) << path.toStdString();
        EXPECT_TRUE(error->message().startsWith(path + QStringLiteral(": error: ")));
    }
}

} // namespace
