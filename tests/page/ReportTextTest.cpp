#include "ReportText.h"

#include "LimitedMemory.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <limits>
#include <new>

namespace
{

using kareport::ReportText;

/// A text in which no two neighbours are alike, without zeros. Beyond 255 characters it is kept in UTF-16.
QString pattern(qsizetype size)
{
    QString text(size, u' ');
    for (qsizetype i = 0; i < size; ++i) {
        text[i] = QChar(static_cast<char16_t>(1 + i % 50021));
    }
    return text;
}

qint64 endOfBlocks(qint64 size)
{
    return std::max<qint64>(1, (size + ReportText::blockSize - 1) / ReportText::blockSize) * ReportText::blockSize;
}

/// Whether everything from a position to the end of the last block, and the character after it, is 0.
bool isZeroFrom(const ReportText &text, qint64 from, qint64 end)
{
    return std::all_of(text.data() + from, text.data() + end + 1, [](char16_t c) { return c == 0; });
}

TEST(ReportText, BeginsAsOneZeroedBlock)
{
    const LimitedMemory memory;
    const ReportText text(LimitedMemory::reallocate);
    EXPECT_EQ(text.size(), 0);
    EXPECT_TRUE(text.isNarrow());
    EXPECT_EQ(memory.lastBytes, LimitedMemory::bytesFor(32000)) << "one byte a character at first";
    EXPECT_TRUE(text.view().isEmpty());
    EXPECT_TRUE(isZeroFrom(text, 0, 32000));
    EXPECT_FALSE(text.isNarrow()) << "it was asked for in UTF-16";
    EXPECT_EQ(memory.lastBytes, LimitedMemory::wideBytesFor(32000));
}

TEST(ReportText, GrowingPastABlockKeepsEveryCharacterWrittenBefore)
{
    struct Row
    {
        qsizetype first;
        qsizetype second;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, 0, "nothing at all"},
        {31999, 1, "fills the block to its last character"},
        {32000, 0, "nothing more for a full block"},
        {32000, 1, "the first character of the second block"},
        {31999, 2, "a text across the boundary"},
        {0, 64001, "two growths at once"},
        {1, 100000, "from the first block to the fourth"},
        {64000, 64000, "two full blocks after two full blocks"},
    };
    for (const Row &row : rows) {
        ReportText text;
        const QString whole = pattern(row.first + row.second);
        ASSERT_TRUE(text.append(QStringView(whole).first(row.first))) << row.reason;
        EXPECT_TRUE(text.view() == QStringView(whole).first(row.first)) << row.reason;
        ASSERT_TRUE(text.append(QStringView(whole).sliced(row.first))) << row.reason;
        EXPECT_EQ(text.size(), whole.size()) << row.reason;
        EXPECT_TRUE(text.view() == whole) << row.reason;
        EXPECT_TRUE(isZeroFrom(text, text.size(), endOfBlocks(text.size()))) << row.reason;
    }
}

TEST(ReportText, ASurrogatePairMayCrossTheBlockBoundary)
{
    ReportText text;
    const QString start = pattern(31999);
    const QString pair = QString::fromUtf8("\xF0\x9F\x98\x80");
    ASSERT_EQ(pair.size(), 2);
    ASSERT_TRUE(text.append(start));
    ASSERT_TRUE(text.append(pair));
    EXPECT_TRUE(text.view() == start + pair);
}

TEST(ReportText, LineEndsAreCrLfAtEveryPlaceAroundTheBlockBoundary)
{
    for (qsizetype size = 31995; size <= 32001; ++size) {
        ReportText text;
        const QString start = pattern(size);
        ASSERT_TRUE(text.append(start));
        ASSERT_TRUE(text.appendLineEnd());
        EXPECT_TRUE(text.view() == start + QStringLiteral("\r\n")) << size;
        EXPECT_EQ(text.data()[text.size()], u'\0') << size;
    }
}

TEST(ReportText, WithoutMemoryAppendingAnswersFalseAndChangesNothing)
{
    struct Row
    {
        qsizetype size;
        qsizetype more;
        bool expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, 32000, true, "exactly what the block holds"},
        {0, 32001, false, "one character more than the block holds"},
        {32000, 0, true, "an empty text needs nothing"},
        {32000, 1, false, "the block is full"},
        {31999, 1, true, "the last character of the block"},
        {31999, 2, false, "half of the text would fit, none of it is written"},
    };
    for (const Row &row : rows) {
        const LimitedMemory memory = LimitedMemory::ofWideCharacters(32000);
        ReportText text(LimitedMemory::reallocate);
        const QString start = pattern(row.size);
        ASSERT_TRUE(text.append(start));
        const QString more = pattern(row.more);
        EXPECT_EQ(text.append(more), row.expected) << row.reason;
        EXPECT_TRUE(text.view() == (row.expected ? start + more : start)) << row.reason;
        EXPECT_EQ(text.data()[text.size()], u'\0') << row.reason;

        memory.largest = LimitedMemory::wideBytesFor(1000000);
        const QString before = text.view().toString();
        EXPECT_TRUE(text.append(more)) << row.reason << ": usable again when there is memory";
        EXPECT_TRUE(text.view() == before + more) << row.reason;
    }
}

TEST(ReportText, WithoutMemoryALineEndAnswersFalseAndChangesNothing)
{
    struct Row
    {
        qsizetype size;
        bool expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {31996, true, "room to spare"},
        {31997, true, "a line end asks for three characters: CR, LF and the 0 after them"},
        {31998, false, "CR and LF alone would fit, the third character does not"},
        {32000, false, "the block is full"},
    };
    for (const Row &row : rows) {
        const LimitedMemory memory = LimitedMemory::ofWideCharacters(32000);
        ReportText text(LimitedMemory::reallocate);
        const QString start = pattern(row.size);
        ASSERT_TRUE(text.append(start));
        EXPECT_EQ(text.appendLineEnd(), row.expected) << row.reason;
        EXPECT_TRUE(text.view() == (row.expected ? start + QStringLiteral("\r\n") : start)) << row.reason;
        EXPECT_EQ(memory.largest, LimitedMemory::wideBytesFor(32000));
    }
}

TEST(ReportText, AssigningReplacesTheTextAndLeavesItEmptyWithoutMemory)
{
    const LimitedMemory memory = LimitedMemory::ofWideCharacters(32000);
    ReportText text(LimitedMemory::reallocate);
    const QString longer = pattern(500);
    const QString shorter = QStringLiteral("abc");
    ASSERT_TRUE(text.assign(longer));
    ASSERT_TRUE(text.assign(shorter));
    EXPECT_TRUE(text.view() == shorter);
    EXPECT_EQ(text.data()[3], u'\0') << "the longer text before does not show through";
    EXPECT_FALSE(text.assign(pattern(32001))) << "more than there is memory for";
    EXPECT_EQ(text.size(), 0);
    EXPECT_EQ(text.data()[0], u'\0');
    EXPECT_TRUE(text.assign(longer));
    EXPECT_TRUE(text.view() == longer);
    EXPECT_TRUE(text.assign(QString()));
    EXPECT_EQ(text.size(), 0);
    EXPECT_EQ(memory.lastBytes, LimitedMemory::wideBytesFor(64000)) << "the block that was refused";
}

TEST(ReportText, MoreCharactersThanFitIntoALengthAreRefusedWithoutAllocating)
{
    for (const bool narrow : {true, false}) {
        const LimitedMemory memory = LimitedMemory::ofWideCharacters(64000);
        ReportText text(LimitedMemory::reallocate);
        ASSERT_TRUE(text.append(narrow ? u"x" : u"\u6E2C"));
        ASSERT_EQ(text.isNarrow(), narrow);
        constexpr qint64 longest = 2147483647;
        const int calls = memory.calls;
        EXPECT_FALSE(text.reserve(longest + 1)) << narrow;
        EXPECT_FALSE(text.reserve(std::numeric_limits<qint64>::max())) << narrow;
        // Never read: only its length counts.
        EXPECT_FALSE(text.append(QStringView(u"x", longest))) << narrow << ": 2^31 characters together";
        EXPECT_EQ(memory.calls, calls) << narrow << ": nothing was allocated";
        EXPECT_FALSE(text.reserve(longest)) << narrow << ": no memory for so many here";
        EXPECT_GT(memory.calls, calls) << narrow << ": the longest text of all is asked for";
        EXPECT_EQ(text.isNarrow(), narrow);
        EXPECT_TRUE(text.view() == (narrow ? u"x" : u"\u6E2C"));
    }
}

TEST(ReportText, NoRoomIsNeededForNothingOrLess)
{
    const LimitedMemory memory;
    ReportText text(LimitedMemory::reallocate);
    ASSERT_NE(text.data(), nullptr); // in UTF-16 from now on
    const int calls = memory.calls;
    for (const qint64 characters : {qint64(0), qint64(-1), qint64(32000)}) {
        EXPECT_TRUE(text.reserve(characters)) << characters;
    }
    EXPECT_EQ(memory.calls, calls);
    EXPECT_TRUE(text.reserve(32001));
    EXPECT_TRUE(isZeroFrom(text, 0, 64000)) << "a new block is zeroed";
}

TEST(ReportText, WithoutMemoryForTheFirstBlockThereIsNoText)
{
    const LimitedMemory memory = LimitedMemory::ofCharacters(31999);
    EXPECT_THROW(ReportText(LimitedMemory::reallocate), std::bad_alloc);
    EXPECT_EQ(memory.calls, 2) << "asked for in both sizes";
}

TEST(ReportText, WithLittleMemoryLeftItGrowsByWhatIsNeeded)
{
    const LimitedMemory memory = LimitedMemory::ofWideCharacters(96000);
    ReportText text(LimitedMemory::reallocate);
    const QString whole = pattern(96000);
    ASSERT_TRUE(text.append(QStringView(whole).first(64000)));
    EXPECT_TRUE(text.append(QStringView(whole).sliced(64000)))
        << "there is no memory for twice the size, but for three blocks";
    EXPECT_TRUE(text.view() == whole);
    EXPECT_FALSE(text.append(u"x"));
    EXPECT_EQ(memory.largest, LimitedMemory::wideBytesFor(96000));
}

TEST(ReportText, MemoryGrowsGeometrically)
{
    const LimitedMemory memory;
    ReportText text(LimitedMemory::reallocate);
    const QString piece = pattern(100);
    for (int i = 0; i < 100000; ++i) {
        ASSERT_TRUE(text.append(piece));
    }
    EXPECT_EQ(text.size(), 10000000);
    EXPECT_LE(memory.calls, 12) << "313 blocks are 9 doublings";
}

TEST(ReportText, ClearingGoesBackToOneZeroedBlock)
{
    const LimitedMemory memory;
    ReportText text(LimitedMemory::reallocate);
    ASSERT_TRUE(text.append(pattern(70000)));
    text.clear();
    EXPECT_EQ(text.size(), 0);
    EXPECT_TRUE(text.isNarrow()) << "one byte a character again";
    EXPECT_EQ(memory.lastBytes, LimitedMemory::bytesFor(32000));
    EXPECT_TRUE(isZeroFrom(text, 0, 32000));

    ASSERT_TRUE(text.append(pattern(32000)));
    text.clear();
    EXPECT_TRUE(isZeroFrom(text, 0, 32000)) << "a single block is zeroed as well";
}

TEST(ReportText, ClearingWorksWithoutAnyMemory)
{
    const LimitedMemory memory;
    ReportText text(LimitedMemory::reallocate);
    ASSERT_TRUE(text.append(pattern(70000)));
    memory.largest = 0;
    text.clear();
    EXPECT_EQ(text.size(), 0);
    EXPECT_FALSE(text.isNarrow()) << "there is no memory for another block";
    EXPECT_TRUE(isZeroFrom(text, 0, 32000));
    EXPECT_TRUE(text.append(pattern(32000)));
    EXPECT_TRUE(text.view() == pattern(32000));
}

TEST(ReportText, TextsOfEveryKindAreExchanged)
{
    ReportText narrow;
    ASSERT_TRUE(narrow.append(u"one byte a character"));
    ASSERT_TRUE(narrow.replace(3, 1, u"-")); // not carried out yet
    ReportText wide;
    ASSERT_TRUE(wide.append(pattern(70'000)));
    const char16_t *place = wide.data();
    narrow.swap(wide);
    EXPECT_EQ(narrow.data(), place) << "nothing was copied";
    EXPECT_TRUE(narrow.view() == pattern(70'000));
    EXPECT_TRUE(wide.isNarrow());
    EXPECT_EQ(wide.piece(0, wide.size()), QStringLiteral("one-byte a character"));
    ASSERT_TRUE(narrow.append(u"x"));
    ASSERT_TRUE(wide.append(u"y"));
    EXPECT_EQ(narrow.size(), 70'001);
    EXPECT_TRUE(wide.view().endsWith(u"charactery"));
}

} // namespace
