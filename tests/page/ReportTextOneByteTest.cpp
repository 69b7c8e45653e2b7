#include "ReportText.h"

#include "LimitedMemory.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <type_traits>

namespace
{

using kareport::ReportText;

const QString eAcute = QStringLiteral(u"\u00E9");
const QString wide = QStringLiteral(u"\u6E2C");

/// Every character that one byte holds, over and over.
QString latin1(qsizetype size)
{
    QString text(size, u' ');
    for (qsizetype i = 0; i < size; ++i) {
        text[i] = QChar(static_cast<char16_t>(i % 256));
    }
    return text;
}

QString narrowText(const ReportText &text)
{
    return text.narrowView().toString();
}

TEST(ReportTextOneByte, TheFirstCharacterAboveU00FFWidensTheText)
{
    struct Row
    {
        const char16_t *text;
        bool narrow;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", true, "empty"},
        {u"x", true, "ASCII"},
        {u"\x7F\x80\x9F\xA0", true, "control characters"},
        {u"\xFF", true, "the last character of one byte"},
        {u"\x0100", false, "the first character of two"},
        {u"\x6E2C", false, "CJK"},
        {u"\xD83D\xDE00", false, "a surrogate pair"},
        {u"\xDC00", false, "half of a pair"},
        {u"0123456789012345678901234567890123456789\x2028", false, "the last of many"},
    };
    for (const Row &row : rows) {
        const QString added = QString::fromUtf16(row.text);
        ReportText text;
        ASSERT_TRUE(text.append(u"a"));
        EXPECT_TRUE(text.append(added)) << row.reason;
        EXPECT_EQ(text.isNarrow(), row.narrow) << row.reason;
        EXPECT_EQ(narrowText(text), row.narrow ? u'a' + added : QString()) << row.reason;
        EXPECT_EQ(text.size(), 1 + added.size()) << row.reason;
        EXPECT_EQ(text.view().toString(), u'a' + added) << row.reason;

        ReportText assigned;
        EXPECT_TRUE(assigned.assign(added)) << row.reason;
        EXPECT_EQ(assigned.isNarrow(), row.narrow) << row.reason;
        EXPECT_EQ(assigned.view().toString(), added) << row.reason;
    }
}

TEST(ReportTextOneByte, WideningKeepsEveryCharacterAndTheZerosAfterThem)
{
    ReportText text;
    for (int i = 0; i < 40000; ++i) {
        ASSERT_TRUE(text.append(eAcute));
    }
    EXPECT_TRUE(text.isNarrow());
    EXPECT_TRUE(narrowText(text) == eAcute.repeated(40000));
    ASSERT_TRUE(text.append(wide));
    EXPECT_FALSE(text.isNarrow());
    EXPECT_EQ(text.size(), 40001);
    EXPECT_TRUE(text.view() == eAcute.repeated(40000) + wide);
    EXPECT_TRUE(std::all_of(text.data() + 40001, text.data() + 64001, [](char16_t c) { return c == 0; }));
}

TEST(ReportTextOneByte, AVisitorReadsTheTextAsItIsKept)
{
    const auto form = [](auto whole) {
        return QString(std::is_same_v<decltype(whole), QLatin1StringView> ? u'1' : u'2') + whole.toString();
    };
    ReportText text;
    ASSERT_TRUE(text.append(QStringView(u"a")));
    EXPECT_EQ(text.visit(form), QStringLiteral("1a"));
    ASSERT_TRUE(text.replace(0, 1, u"bc")) << "also with an edit that has not been carried out yet";
    EXPECT_EQ(text.visit(form), QStringLiteral("1bc"));
    EXPECT_TRUE(text.isNarrow()) << "reading does not change how it is kept";
    ASSERT_TRUE(text.append(wide));
    EXPECT_EQ(text.visit(form), QStringLiteral("2bc") + wide);
}

TEST(ReportTextOneByte, BytesAreTakenAsCharactersAndNotAsSignedNumbers)
{
    ReportText text;
    ASSERT_TRUE(text.append(latin1(70000)));
    EXPECT_TRUE(text.isNarrow());
    EXPECT_TRUE(narrowText(text) == latin1(70000));
    EXPECT_TRUE(text.view() == latin1(70000)) << "asked for in UTF-16";
    EXPECT_FALSE(text.isNarrow());
    EXPECT_EQ(narrowText(text), QString()) << "there is no such view any more";
}

TEST(ReportTextOneByte, WithoutMemoryForUtf16AWiderCharacterIsRefused)
{
    const LimitedMemory memory = LimitedMemory::ofCharacters(32000);
    ReportText text(LimitedMemory::reallocate);
    ASSERT_TRUE(text.append(latin1(32000)));
    EXPECT_FALSE(text.append(wide));
    EXPECT_TRUE(text.isNarrow());
    EXPECT_EQ(text.size(), 32000);
    EXPECT_TRUE(narrowText(text) == latin1(32000));
    EXPECT_EQ(text.data()[0], u'\0') << "shows as an empty text";
    EXPECT_TRUE(text.view().isEmpty());
    EXPECT_EQ(text.size(), 32000) << "its length stays";

    memory.largest = LimitedMemory::wideBytesFor(64000);
    EXPECT_TRUE(text.append(wide)) << "usable again when there is memory";
    EXPECT_TRUE(text.view() == latin1(32000) + wide);
}

TEST(ReportTextOneByte, WithoutMemoryNothingIsWritten)
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
        const LimitedMemory memory = LimitedMemory::ofCharacters(32000);
        ReportText text(LimitedMemory::reallocate);
        ASSERT_TRUE(text.append(latin1(row.size)));
        EXPECT_EQ(text.append(latin1(row.more)), row.expected) << row.reason;
        EXPECT_TRUE(narrowText(text) == latin1(row.size) + (row.expected ? latin1(row.more) : QString())) << row.reason;
        EXPECT_EQ(memory.largest, LimitedMemory::bytesFor(32000));
    }
}

TEST(ReportTextOneByte, ALineEndAsksForThreeCharacters)
{
    for (qsizetype size = 31996; size <= 32000; ++size) {
        const LimitedMemory memory = LimitedMemory::ofCharacters(32000);
        ReportText text(LimitedMemory::reallocate);
        ASSERT_TRUE(text.append(latin1(size)));
        const bool fits = size <= 31997;
        EXPECT_EQ(text.appendLineEnd(), fits) << size;
        EXPECT_TRUE(narrowText(text) == latin1(size) + (fits ? QStringLiteral("\r\n") : QString())) << size;
        EXPECT_EQ(memory.largest, LimitedMemory::bytesFor(32000));
    }
}

TEST(ReportTextOneByte, ClearingAWideTextGivesOneZeroedBlockOfBytes)
{
    const LimitedMemory memory;
    ReportText text(LimitedMemory::reallocate);
    ASSERT_TRUE(text.append(wide.repeated(70000)));
    ASSERT_FALSE(text.isNarrow());
    text.clear();
    EXPECT_TRUE(text.isNarrow());
    EXPECT_EQ(text.size(), 0);
    EXPECT_EQ(memory.lastBytes, LimitedMemory::bytesFor(32000));
    const char *bytes = text.narrowView().data();
    EXPECT_TRUE(std::all_of(bytes, bytes + 32001, [](char c) { return c == 0; }));
    EXPECT_TRUE(text.append(u"x"));
    EXPECT_TRUE(text.isNarrow());

    ASSERT_TRUE(text.append(latin1(70000)));
    text.clear();
    bytes = text.narrowView().data();
    EXPECT_TRUE(std::all_of(bytes, bytes + 32001, [](char c) { return c == 0; })) << "a text that was never wide";
}

TEST(ReportTextOneByte, APieceOfTheVeryTextMayBeAppendedAndAssigned)
{
    const QString whole = latin1(31000) + wide;
    struct Row
    {
        qsizetype at;
        qsizetype count;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, 31001, "all of it, which moves the memory"},
        {31000, 1, "its last character"},
        {1, 500, "a piece from the middle, without moving"},
        {31001, 0, "nothing, from its end"},
    };
    for (const Row &row : rows) {
        const QString expected = whole.sliced(row.at, row.count);
        ReportText text;
        ASSERT_TRUE(text.append(whole));
        const QString piece = QString::fromRawData(reinterpret_cast<const QChar *>(text.data()) + row.at, row.count);
        EXPECT_TRUE(text.append(piece)) << row.reason;
        EXPECT_TRUE(text.view() == whole + expected) << row.reason;

        ReportText assigned;
        ASSERT_TRUE(assigned.append(whole));
        EXPECT_TRUE(assigned.assign(QStringView(assigned.data() + row.at, row.count))) << row.reason;
        EXPECT_TRUE(assigned.view() == expected) << row.reason;
    }
}

} // namespace
