#include "CsvFile.h"
#include "InputErrorText.h"

#include <gtest/gtest.h>

#include <array>
#include <random>

namespace
{

using namespace csv;

/// Rows with many equal and missing keys.
std::vector<std::array<QByteArray, 4>> randomRows(std::size_t count)
{
    const char *numbers[] = {"", "1", "2", "9", "10", "010", "12A", "12a", "A12", "BM-3", "BM-12"};
    const char *northings[] = {"", "0", "-0", "-1.5", "2", "INF", "-INF", "NAN", "1e-3"};
    const char *notes[] = {"", "a", "A", "b", "\xC3\xA4", "\xC3\x84", " "};
    const char *counts[] = {"", "-1", "0", "1"};
    std::mt19937 random(7);
    const auto pick = [&random](const auto &values) { return QByteArray(values[random() % std::size(values)]); };
    std::vector<std::array<QByteArray, 4>> rows;
    for (std::size_t i = 0; i < count; ++i) {
        rows.push_back({pick(numbers), pick(northings), pick(notes), pick(counts)});
    }
    return rows;
}

TEST(CsvObjectListSort, SortsLikeAListThatIsHeld)
{
    const auto rows = randomRows(3000);
    const char *names[] = {"Number", "Northing", "Note", "Count"};
    QByteArray content = "Number,Northing,Note,Count\n";
    for (const auto &row : rows) {
        content += row[0] + ',' + row[1] + ',' + row[2] + ',' + row[3] + '\n';
    }
    const std::vector<unsigned> keys[] = {{numberId},
                                          {northingId},
                                          {noteId},
                                          {countId},
                                          {},
                                          {99},
                                          {noteId, countId},
                                          {countId, numberId, northingId, noteId},
                                          {northingId, northingId, 99, noteId}};
    for (const auto &ids : keys) {
        UDataObjectList held;
        for (const auto &row : rows) {
            UDataObject &object = held.Add();
            for (std::size_t i = 0; i < row.size(); ++i) {
                ASSERT_TRUE(findVariable(QString::fromUtf8(names[i]))->store(row[i].toStdString(), object));
            }
        }
        held.Sort(ids);
        const CsvFile file(content);
        ASSERT_NE(file.list->GetAt(0), nullptr) << "read before it is sorted";
        file.list->Sort(ids);
        for (std::size_t i = 0; i < rows.size(); ++i) {
            ASSERT_EQ(textOf(file.list->GetAt(i)), textOf(held.GetAt(i))) << "row " << i << " of keys " << ids.size();
        }
        EXPECT_EQ(file.list->GetAt(rows.size()), nullptr);
        EXPECT_FALSE(file.list->error());
        EXPECT_EQ(textOf(file.list->GetAt(10)), textOf(held.GetAt(10))) << "going back in a sorted list";
    }
}

TEST(CsvObjectListSort, SortingAgainKeepsTheOrderOfEqualRows)
{
    const CsvFile file("Number,Count\n3,1\n1,2\n2,1\n1,1\n");
    file.list->Sort({numberId});
    file.list->Sort({countId});
    QStringList numbers;
    for (std::size_t i = 0; i < 4; ++i) {
        numbers.append(textOf(file.list->GetAt(i)));
    }
    EXPECT_EQ(numbers.join(u' '), QStringLiteral("1|-|-|1 2|-|-|1 3|-|-|1 1|-|-|2"));
}

TEST(CsvObjectListSort, AMistakeInASortedFileHasItsPlace)
{
    struct Row
    {
        const char *content;
        const char *place;
        const char *reason;
    };
    constexpr Row rows[] = {
        {"Count,Northing\n3,1\nx,2\n1,3\n", "3:1", "in a sort key"},
        {"Count,Northing\n3,1\n2,x\n1,3\n", "3:3", "in a cell that is not a sort key"},
        {"Count,Northing\n3,x\n1,y\n", "2:3", "the first of the file, though the other one is met before"},
        {"Count,Northing\n3,1\n2,2,2\n1,3\n", "3:5", "a cell too many"},
        {"Count,Northing\n3,1\n2,2\n1,\"3\n", "4:3", "a quote that is not closed, in the last row"},
        {"Count,Note\n3,\"a\nb\"\n2,c\n1,\"d\n\ne\"\n0,f\nx,g\n", "9:1", "after cells of several lines"},
    };
    for (const Row &row : rows) {
        const CsvFile file(row.content);
        file.list->Sort({countId});
        for (std::size_t i = 0; file.list->GetAt(i) != nullptr; ++i) {
            ASSERT_LT(i, 10U);
        }
        EXPECT_EQ(placeText(file.list->error()), QString::fromUtf8(row.place)) << row.reason;
    }
}

TEST(CsvObjectListSort, LookingForTheFirstWrongRowCanBeStopped)
{
    // The row that is wrong comes first in the order, and last in the file: it is looked for from the beginning.
    QByteArray content = "Number,Northing\n";
    for (int i = 0; i < 20'000; ++i) {
        content += QByteArray::number(i + 1) + ",1\n";
    }
    content += "0,x\n";
    for (const bool isStopped : {false, true}) {
        int calls = 0;
        int most = 1'000'000;
        const CsvFile file(content, [&](std::size_t) { return ++calls < most; });
        file.list->Sort({numberId});
        const int before = calls;
        most = isStopped ? before + 2 : most; // the first is that of the batch
        EXPECT_EQ(file.list->GetAt(0), nullptr);
        EXPECT_EQ(file.list->error().has_value(), !isStopped) << "to be stopped is not a mistake of the data";
        EXPECT_GE(calls - before, isStopped ? 2 : 8) << "it is asked for every so many rows";
        EXPECT_LE(calls - before, isStopped ? 3 : 100);
    }
}

} // namespace
