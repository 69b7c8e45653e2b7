#include "PageWriter.h"

#include "PageMeasurement.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <map>
#include <memory>
#include <vector>

namespace
{

using kareport::measurePage;
using kareport::mulDiv;
using kareport::PageWriter;

constexpr int most = std::numeric_limits<int>::max();
constexpr int least = std::numeric_limits<int>::min();

QString lineEnds(int count)
{
    return QStringLiteral("\r\n").repeated(count);
}

TEST(PageWriterLimits, TheLargestAndLeastNumbersOfLinesTurnThePageOnce)
{
    struct Row
    {
        int before;
        int after;
        QString expected;
        int page;
        int line;
        const char *reason;
    };
    const QString x = QStringLiteral("x");
    const Row rows[] = {
        {most, 0, lineEnds(6) + x, 3, 1, "more blank lines than are left"},
        {least, 0, lineEnds(6) + x, 3, 1, "below zero"},
        {0, most, x + lineEnds(1) + lineEnds(5), 3, 1, "more lines than are left after the line end"},
        {0, least, x + lineEnds(1) + lineEnds(5), 3, 1, "one less than the least number is not a large one"},
        {least, least, lineEnds(6) + x + lineEnds(1) + lineEnds(9), 4, 1, "below zero on both sides"},
        {most, most, lineEnds(6) + x + lineEnds(1) + lineEnds(9), 4, 1, "the largest on both sides"},
    };
    for (const Row &row : rows) {
        PageWriter writer;
        writer.setLinesPerPage(10);
        writer.lineFeed(1);
        writer.newPage(-1);
        writer.lineFeed(4);
        const int page = writer.pageNumber();
        ASSERT_EQ(writer.lineNumber(), 5);
        const qint64 size = writer.text().size();
        writer.writeLine(u"x", row.before, row.after, 0);
        EXPECT_EQ(writer.text().view().sliced(size).toString(), row.expected) << row.reason;
        EXPECT_EQ(writer.pageNumber(), page + row.page - 2) << row.reason;
        EXPECT_EQ(writer.lineNumber(), row.line) << row.reason;
    }
}

TEST(PageWriterLimits, ProductsBeyondIntAreTheNearestInt)
{
    struct Row
    {
        int a;
        int b;
        int c;
        int expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {most, 2, 1, most, "twice the largest"},
        {most, most, 1, most, "the largest product"},
        {least, least, 1, most, "two below zero"},
        {least, most, 1, least, "one below zero"},
        {least, -1, 1, most, "one more than the largest"},
        {least, 1, 1, least, "the least itself fits"},
        {most, 600, 2540, 507279602, "600 dots an inch: 507279601.7"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(mulDiv(row.a, row.b, row.c), row.expected) << row.reason;
    }
}

TEST(PageWriterLimits, MarginsOfAnySizeGiveFigures)
{
    struct Row
    {
        int resolution;
        QMargins margins;
        int lines;
        int characters;
        const char *reason;
    };
    const Row rows[] = {
        {254, {0, most, 0, 0}, -21474736, 100, "(1000-214748365)/10 = -21474736.5"},
        {254, {0, 0, 0, most}, -21474736, 100, "the bottom margin alike"},
        {254, {most, 0, 0, 0}, 100, -21474736, "the left margin takes characters"},
        {254, {0, least, 0, 0}, 21474936, 100, "(1000+214748365)/10 = 21474936.5"},
        {254, {0, most, 0, least}, 100, 100, "one against the other"},
        {25400, {most, most, most, most}, -429496629, -429496629, "each is 2147483647 dots: -4294966294/10"},
        {25400, {least, least, least, least}, 429496829, 429496829, "each is -2147483648 dots: 4294968296/10"},
    };
    for (const Row &row : rows) {
        const auto page = measurePage({{1000, 1000}, row.resolution}, row.margins, {10, 0, 10});
        EXPECT_EQ(page.linesPerPage, row.lines) << row.reason;
        EXPECT_EQ(page.charsPerRow, row.characters) << row.reason;
    }
    const auto fewest = measurePage({{1000, 1000}, 25400}, {most, most, most, most}, {1, 0, 1});
    EXPECT_EQ(fewest.linesPerPage, least) << "-4294966294 is beyond int";
    EXPECT_EQ(fewest.charsPerRow, least);
    const auto largest = measurePage({{1000, 1000}, 25400}, {least, least, least, least}, {1, 0, 1});
    EXPECT_EQ(largest.linesPerPage, most) << "4294968296 is beyond int";
    EXPECT_EQ(largest.charsPerRow, most);
}

/// Memory that moves whenever it grows, and whose earlier places are filled with other bytes and kept.
class MovingMemory
{
public:
    MovingMemory() { sizes.clear(); }
    ~MovingMemory()
    {
        for (void *place : left) {
            std::free(place);
        }
        left.clear();
    }
    MovingMemory(const MovingMemory &) = delete;
    MovingMemory &operator=(const MovingMemory &) = delete;

    static void *reallocate(void *memory, std::size_t bytes)
    {
        void *moved = std::malloc(bytes);
        if (memory != nullptr) {
            std::memcpy(moved, memory, std::min(bytes, sizes[memory]));
            std::memset(memory, 'z', sizes[memory]);
            left.push_back(memory);
        }
        sizes[moved] = bytes;
        return moved;
    }

private:
    static inline std::map<void *, std::size_t> sizes;
    static inline std::vector<void *> left;
};

TEST(PageWriterLimits, LineFeedsOfAPieceOfTheVeryTextAreCountedWhenItMoves)
{
    const MovingMemory memory;
    PageWriter writer(nullptr, MovingMemory::reallocate);
    const QString text = QStringLiteral(u"\u6E2C\r\n").repeated(8000);
    ASSERT_TRUE(writer.write(text, 0));
    ASSERT_EQ(writer.lineCount(), 8000);
    EXPECT_TRUE(writer.write(writer.text().view(), 0));
    EXPECT_TRUE(writer.text().view() == text + text);
    EXPECT_EQ(writer.lineCount(), 16000);
}

} // namespace
