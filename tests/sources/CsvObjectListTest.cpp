#include "CsvFile.h"
#include "InputErrorText.h"

#include <gtest/gtest.h>

#include <array>
#include <random>

namespace
{

using namespace csv;

/// A file of rows whose number is their index.
QByteArray numberedRows(int count)
{
    QByteArray content = "Number,Northing,Note,Count\r\n";
    for (int i = 0; i < count; ++i) {
        const QByteArray n = QByteArray::number(i);
        // Every third row has empty cells, so that a refilled object would show what it held before.
        content += i % 3 == 0 ? n + ",,,\r\n" : n + ',' + n + ".5,note " + n + ',' + n + "\r\n";
    }
    return content;
}

QString numberedRow(std::size_t index)
{
    const QString n = QString::number(index);
    return index % 3 == 0 ? n + QStringLiteral("|-|-|-") : QStringLiteral("%1|%1.5|note %1|%1").arg(n);
}

TEST(CsvObjectList, MakesObjectsOfRows)
{
    const CsvFile file("Number,Northing,Note,Count\n12A,-2.5,\"a, b\",3\n,,,\n1,INF,x,-1\n");
    EXPECT_EQ(textOf(file.list->GetAt(0)), QStringLiteral("12A|-2.5|a, b|3"));
    EXPECT_EQ(textOf(file.list->GetAt(1)), QStringLiteral("-|-|-|-")) << "empty cells store no entry";
    EXPECT_EQ(textOf(file.list->GetAt(2)), QStringLiteral("1|inf|x|-1"));
    EXPECT_EQ(file.list->GetAt(3), nullptr);
    EXPECT_EQ(file.list->GetAt(1000), nullptr);
    EXPECT_FALSE(file.list->error());
}

TEST(CsvObjectList, PassesColumnsOverThatTheDictionaryDoesNotKnow)
{
    const CsvFile file("Code,Number,,Northing\nany,1,thing,2\n\"\",2,\"a\nb\",3\n");
    EXPECT_EQ(textOf(file.list->GetAt(0)), QStringLiteral("1|2|-|-"));
    EXPECT_EQ(textOf(file.list->GetAt(1)), QStringLiteral("2|3|-|-"));
    EXPECT_FALSE(file.list->error());
}

TEST(CsvObjectList, OfAHeaderAloneIsEmpty)
{
    for (const char *content : {"Number", "Number\n", "\xEF\xBB\xBFNumber,Note\r\n\r\n\r\n"}) {
        const CsvFile file(content);
        EXPECT_EQ(file.list->GetAt(0), nullptr) << content;
        EXPECT_FALSE(file.list->error()) << content;
        file.list->Sort({numberId});
        EXPECT_EQ(file.list->GetAt(0), nullptr) << content;
        EXPECT_FALSE(file.list->error()) << content;
    }
}

TEST(CsvObjectList, NamesOfColumnsAreTakenWithoutBlanksAroundThem)
{
    struct Row
    {
        const char *header;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"Number, Northing, Note, Count", "a blank after each delimiter"},
        {"Number ,Northing\t,Note  ,Count", "blanks and tabs before it"},
        {"\" Number\",\"Northing \",Note,Count", "inside quotes"},
        {"\xC2\xA0Number,Northing\xE2\x80\xAF,\xE2\x80\x87Note,Count", "blanks that do not break a line"},
        {"\xEF\xBB\xBF\xEF\xBB\xBFNumber,Northing,Note,Count", "a second byte-order mark"},
        {"Number,\xEF\xBB\xBFNorthing,Note\xE2\x80\x8B,\xE2\x81\xA0"
         "Count",
         "marks that are not seen"},
        {"Number,Northing,Note,Count ", "at the end of the line"},
    };
    for (const Row &row : rows) {
        const CsvFile file(QByteArray(row.header) + "\r\n A , 12.5 , a b , 3 \r\n");
        EXPECT_EQ(textOf(file.list->GetAt(0)), QStringLiteral(" A |12.5| a b |3"))
            << row.reason << ": what is in texts stays";
        EXPECT_FALSE(file.list->error()) << row.reason;
    }
    const CsvFile unnamed("Number, ,Remark, Remark ,,\n1,2,3,4,5,6\n");
    EXPECT_EQ(textOf(unnamed.list->GetAt(0)), QStringLiteral("1|-|-|-")) << "what is not known may be there twice";
}

TEST(CsvObjectList, AnEmptyCellLeavesWhatAnotherVariableOfItsIdentifierHasStored)
{
    // Two names of one identifier, as templates have them for a value that goes by two names.
    const auto find = [](const QString &name) -> std::optional<kareport::ValueParser> {
        if (name == u"Count") {
            return kareport::ValueParser(VARIABLE_INTEGER, csv::countId, kareport::DataUnits());
        }
        return kareport::ValueParser(VARIABLE_NUMBER, numberId, kareport::DataUnits());
    };
    JobFolder folder;
    QByteArray content = "Number,Point,Count\n";
    for (int i = 0; i < 3 * static_cast<int>(kareport::RowBatch::most); ++i) {
        // Batches are filled again: a row of empty cells must not show what an earlier one had.
        content += std::array<const char *, 4>{"A,,1\n", ",B,2\n", ",,\n", "A,B,4\n"}[static_cast<std::size_t>(i) % 4];
    }
    folder.put("points.csv", content);
    auto opened = kareport::FileBytes::open(folder.path("points.csv"));
    kareport::CsvObjectList list(std::get<std::shared_ptr<const kareport::FileBytes>>(opened), ',', find, {});
    const QString expected[] = {QStringLiteral("A|-|-|1"), QStringLiteral("B|-|-|2"), QStringLiteral("-|-|-|-"),
                                QStringLiteral("B|-|-|4")};
    for (std::size_t i = 0; i < 3 * kareport::RowBatch::most; ++i) {
        ASSERT_EQ(textOf(list.GetAt(i)), expected[i % 4]) << i;
    }
    list.Sort({numberId});
    EXPECT_EQ(textOf(list.GetAt(0)), expected[2]) << "no value comes first";
    EXPECT_EQ(textOf(list.GetAt(kareport::RowBatch::most)), expected[0]) << "sorted by what the row shows";
}

TEST(CsvObjectList, ReadsALongFileInTurn)
{
    constexpr std::size_t count = 5000;
    const CsvFile file(numberedRows(count));
    for (std::size_t i = 0; i < count; ++i) {
        ASSERT_EQ(textOf(file.list->GetAt(i)), numberedRow(i));
        ASSERT_EQ(textOf(file.list->GetAt(i)), numberedRow(i)) << "asked for twice";
    }
    EXPECT_EQ(file.list->GetAt(count), nullptr);
    EXPECT_FALSE(file.list->error());
}

TEST(CsvObjectList, GoesBackAndForth)
{
    // Three batches: the first is read by the caller, the others ahead of it.
    constexpr std::size_t batch = kareport::RowBatch::most;
    constexpr std::size_t count = 2 * batch + 1000;
    const CsvFile file(numberedRows(count));
    for (const std::size_t index : {count - 1, std::size_t(0), batch - 1, batch, batch - 1, batch + 600, batch + 599,
                                    2 * batch - 1, 2 * batch, count, count - 1, std::size_t(0)})
    {
        EXPECT_EQ(textOf(file.list->GetAt(index)), index < count ? numberedRow(index) : QStringLiteral("null"));
    }
    std::mt19937 random(20240305);
    for (int i = 0; i < 20; ++i) {
        const std::size_t index = random() % count;
        EXPECT_EQ(textOf(file.list->GetAt(index)), numberedRow(index));
    }
}

TEST(CsvObjectList, EndsWithItsBatch)
{
    // One row less than a batch holds, as many, and one more; and two batches.
    constexpr std::size_t batch = kareport::RowBatch::most;
    for (const std::size_t count : {batch - 1, batch, batch + 1, 2 * batch}) {
        const CsvFile file(numberedRows(static_cast<int>(count)));
        for (int round = 0; round < 2; ++round) {
            EXPECT_EQ(textOf(file.list->GetAt(0)), numberedRow(0)) << count;
            EXPECT_EQ(textOf(file.list->GetAt(count - 1)), numberedRow(count - 1)) << count;
            EXPECT_EQ(file.list->GetAt(count), nullptr) << count;
        }
        EXPECT_FALSE(file.list->error()) << count;
    }
}

TEST(CsvObjectList, ReadsWhileItIsAskedFor)
{
    const QByteArray content = numberedRows(100000);
    std::size_t read = 0;
    const CsvFile file(content, [&read](std::size_t bytes) {
        read = bytes;
        return true;
    });
    EXPECT_NE(file.list->GetAt(0), nullptr);
    EXPECT_GT(read, 0U);
    EXPECT_LT(read, static_cast<std::size_t>(content.size()) / 10) << "the first row needs only the beginning";
    EXPECT_NE(file.list->GetAt(50000), nullptr);
    EXPECT_GT(read, static_cast<std::size_t>(content.size()) / 3);
    EXPECT_LT(read, static_cast<std::size_t>(content.size()) * 2 / 3);
    EXPECT_EQ(file.list->GetAt(100000), nullptr);
    EXPECT_EQ(read, static_cast<std::size_t>(content.size()));
}

TEST(CsvObjectList, EndsWhereItIsStopped)
{
    int calls = 0;
    const CsvFile file(numberedRows(100000), [&calls](std::size_t) { return ++calls < 3; });
    std::size_t index = 0;
    while (file.list->GetAt(index) != nullptr) {
        ++index;
    }
    EXPECT_LT(index, 100000U);
    EXPECT_EQ(calls, 3);
    EXPECT_FALSE(file.list->error()) << "to be stopped is not a mistake of the file";
    EXPECT_EQ(file.list->GetAt(0), nullptr);
    EXPECT_EQ(calls, 3) << "it stays stopped";
}

TEST(CsvObjectList, EveryMistakeHasItsPlace)
{
    struct Row
    {
        const char *content;
        const char *place;
        const char *contains;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"", "1:1", "header row", "an empty file"},
        {"\n\n", "1:1", "header row", "blank lines only"},
        {"Number,\"Note\n1,2\n", "1:8", "no closing quote", "a header row that does not end"},
        {"Number,Note,Number\n", "1:13", "the columns 1 and 3 are both named \"Number\"", "a column twice"},
        {"Number,Note,NUMBER\n1,2,3\n", "1:13", "the columns 1 and 3 are both named \"NUMBER\"",
         "a column twice but for case"},
        {"Note, Number ,Number\n", "1:15", "the columns 2 and 3 are both named \"Number\"", "but for blanks"},
        {"Number,\"\xC2\xA0Number\"\n", "1:8", "the columns 1 and 2 are both named \"Number\"",
         "but for a blank in quotes"},
        {"Code;Northing\n1;2\n", "1:1", "no column", "nothing that the dictionary knows: most often another delimiter"},
        {"Number,Note\n1,a\n1,a,b\n", "3:5", "3 cells", "a cell too many"},
        {"Number,Note\n1,a\n1,\n1,a,\n", "4:5", "2 were expected", "an empty cell too many"},
        {"Number,Northing\n1,2\n2,x\n", "3:3", "\"x\"", "a cell that does not fit is quoted"},
        {"Number,Northing\n1,2\n2,1e999\n", "3:3", "\"1e999\"", "a number out of range"},
        {"Count,Northing\n1,2\n\"1.5\",2\n", "3:1", "\"1.5\"", "a quoted cell: its quote is the place"},
        {"Note,Count\n\"a\nb\",x\n", "3:4", "\"Count\"", "the column is named; the cell is in the row's second line"},
        {"Note,Count\n\xC3\xA4\xF0\x9D\x84\x9E,x\n", "2:4", "a whole number", "columns count characters"},
        {"Number,Count\n1,2\n\n3,4\n", "3:1", "1 cells", "a blank line inside"},
    };
    for (const Row &row : rows) {
        const CsvFile file(row.content);
        for (std::size_t i = 0; file.list->GetAt(i) != nullptr; ++i) {
        }
        ASSERT_TRUE(file.list->error()) << row.reason;
        EXPECT_EQ(placeText(file.list->error()), QString::fromUtf8(row.place)) << row.reason;
        EXPECT_TRUE(textOfError(file.list->error()).contains(QString::fromUtf8(row.contains)))
            << row.reason << ": " << textOfError(file.list->error()).toStdString();
        EXPECT_EQ(file.list->error()->file, file.path()) << row.reason;
    }
}

TEST(CsvObjectList, ARowWithFewerCellsNamesItsLine)
{
    const CsvFile file("Number,Northing,Note\n1,2,a\n1,2\n");
    EXPECT_NE(file.list->GetAt(0), nullptr);
    EXPECT_EQ(file.list->GetAt(1), nullptr);
    ASSERT_TRUE(file.list->error() && file.list->error()->place);
    EXPECT_EQ(file.list->error()->place->line, 3);
    EXPECT_TRUE(textOfError(file.list->error()).contains(u"2 cells"));
    EXPECT_TRUE(textOfError(file.list->error()).contains(u"3 were expected"));
}

TEST(CsvObjectList, RowsBeforeAMistakeInTheMiddleAreRead)
{
    QByteArray content = numberedRows(1400);
    content.replace("\r\n700,700.5,", "\r\n700,7oo.5,");
    const CsvFile file(content);
    for (int round = 0; round < 2; ++round) {
        for (std::size_t i = 0; i < 700; ++i) {
            ASSERT_EQ(textOf(file.list->GetAt(i)), numberedRow(i)) << "round " << round;
        }
        EXPECT_EQ(file.list->GetAt(700), nullptr) << "round " << round;
        EXPECT_EQ(placeText(file.list->error()), QStringLiteral("702:5")) << "round " << round;
        EXPECT_EQ(file.list->GetAt(701), nullptr) << "round " << round;
    }
}

TEST(CsvObjectList, ALongCellIsQuotedInPart)
{
    const CsvFile file("Count\n" + QByteArray(100000, 'x') + "\n");
    EXPECT_EQ(file.list->GetAt(0), nullptr);
    EXPECT_TRUE(textOfError(file.list->error()).contains(QString(40, u'x')));
    EXPECT_LT(textOfError(file.list->error()).size(), 300);
}

TEST(CsvObjectList, SortingIsStoppedToo)
{
    int calls = 0;
    const CsvFile file(numberedRows(100000), [&calls](std::size_t) { return ++calls < 3; });
    file.list->Sort({numberId});
    EXPECT_EQ(calls, 3);
    EXPECT_EQ(file.list->GetAt(0), nullptr);
    EXPECT_FALSE(file.list->error());
}

} // namespace
