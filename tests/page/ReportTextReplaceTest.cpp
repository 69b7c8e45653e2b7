#include "ReportText.h"

#include "LimitedMemory.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

#include <random>
#include <utility>

namespace
{

using kareport::ReportText;

const QString wide = QStringLiteral(u"\u6E2C");
const QString pair = QString::fromUtf8("\xF0\x9F\x98\x80");

/// The text without changing how it is kept.
QString contentOf(const ReportText &text)
{
    return text.isNarrow() ? text.narrowView().toString() : text.view().toString();
}

TEST(ReportTextReplace, ReplacesAPieceOfTheText)
{
    struct Row
    {
        qint64 at;
        qint64 removed;
        QString inserted;
        QString expected;
        const char *reason;
    };
    const Row rows[] = {
        {0, 0, QString(), QStringLiteral("ab\r\ncd"), "nothing at all"},
        {0, 0, QStringLiteral("x"), QStringLiteral("xab\r\ncd"), "before the first character"},
        {6, 0, QStringLiteral("x"), QStringLiteral("ab\r\ncdx"), "after the last character"},
        {0, 1, QString(), QStringLiteral("b\r\ncd"), "the first character goes"},
        {5, 1, QString(), QStringLiteral("ab\r\nc"), "the last character goes"},
        {0, 6, QString(), QString(), "everything goes"},
        {2, 2, QString(), QStringLiteral("abcd"), "a line end goes: two lines become one"},
        {2, 1, QString(), QStringLiteral("ab\ncd"), "half of a line end"},
        {2, 0, QStringLiteral("\r\n"), QStringLiteral("ab\r\n\r\ncd"), "a line end beside another"},
        {1, 4, QStringLiteral("12345678"), QStringLiteral("a12345678d"), "longer than what goes"},
        {1, 1, wide, u'a' + wide + QStringLiteral("\r\ncd"), "the first character of two bytes"},
        {1, 1, pair, u'a' + pair + QStringLiteral("\r\ncd"), "a surrogate pair"},
    };
    for (const Row &row : rows) {
        for (const bool narrow : {true, false}) {
            ReportText text;
            ASSERT_TRUE(text.append(u"ab\r\ncd"));
            if (!narrow) {
                ASSERT_NE(text.data(), nullptr); // in UTF-16 from now on
            }
            EXPECT_TRUE(text.replace(row.at, row.removed, row.inserted)) << row.reason;
            EXPECT_EQ(text.size(), row.expected.size()) << row.reason << ", before it is read";
            EXPECT_EQ(contentOf(text), row.expected) << row.reason;
            EXPECT_EQ(text.size(), row.expected.size()) << row.reason;
            EXPECT_EQ(text.data()[text.size()], u'\0') << row.reason;
            EXPECT_EQ(text.view().toString(), row.expected) << row.reason;
        }
    }
}

TEST(ReportTextReplace, WhatIsNotInTheTextIsRefused)
{
    struct Row
    {
        qint64 at;
        qint64 removed;
        const char *reason;
    };
    constexpr Row rows[] = {
        {-1, 0, "before the text"},
        {5, 0, "after the text"},
        {0, -1, "fewer than none"},
        {3, 2, "one character past the end"},
        {4, 1, "only the 0 is there"},
        {0, std::numeric_limits<qint64>::max(), "as many as there are numbers"},
        {4, std::numeric_limits<qint64>::max(), "the end would not be a number any more"},
    };
    for (const Row &row : rows) {
        ReportText text;
        ASSERT_TRUE(text.append(u"ac"));
        ASSERT_TRUE(text.replace(1, 0, u"bb"));
        EXPECT_FALSE(text.replace(row.at, row.removed, u"x")) << row.reason;
        EXPECT_EQ(contentOf(text), QStringLiteral("abbc")) << row.reason;
    }
}

TEST(ReportTextReplace, EditsCountFromTheTextAsEditedSoFar)
{
    ReportText text;
    ASSERT_TRUE(text.append(u"0123456789"));
    EXPECT_TRUE(text.replace(8, 1, u"eight"));  // 01234567eight9
    EXPECT_TRUE(text.replace(2, 1, u"two"));    // 01two34567eight9
    EXPECT_TRUE(text.replace(7, 2, QString())); // 01two347eight9
    EXPECT_TRUE(text.replace(3, 1, u"W"));      // 01tWo347eight9: within what was inserted
    EXPECT_TRUE(text.replace(5, 0, u"+"));      // 01tWo+347eight9: at its end
    EXPECT_TRUE(text.replace(1, 0, u"-"));      // 0-1tWo+347eight9: before it
    EXPECT_TRUE(text.replace(6, 6, u"/"));      // 0-1tWo/ght9: across three edits
    EXPECT_EQ(contentOf(text), QStringLiteral("0-1tWo/ght9"));
}

TEST(ReportTextReplace, ManyEditsGiveTheSameAsInAPlainString)
{
    std::mt19937 random(20240305);
    const auto below = [&random](qint64 end) { return qint64(random() % static_cast<unsigned>(end)); };
    for (const bool narrow : {true, false}) {
        QString expected = (narrow ? QStringLiteral("abc") : wide).repeated(3000);
        ReportText text;
        ASSERT_TRUE(text.append(expected));
        qint64 at = 0;
        for (int i = 0; i < 12000; ++i) {
            // Mostly on from the last place, as a person types.
            at = i % 5 == 0 || at > expected.size() ? below(expected.size() + 1) : at;
            const qint64 removed = std::min<qint64>(below(4), expected.size() - at);
            const QString inserted(below(6), QChar(u'a' + static_cast<char16_t>(i % 26)));
            ASSERT_TRUE(text.replace(at, removed, inserted));
            expected.replace(at, removed, inserted);
            at += inserted.size();
            ASSERT_EQ(text.size(), expected.size());
            if (i % 1000 == 999) {
                ASSERT_TRUE(contentOf(text) == expected) << i;
            }
        }
        EXPECT_EQ(text.isNarrow(), narrow);
        EXPECT_TRUE(contentOf(text) == expected);
    }
}

TEST(ReportTextReplace, MoreEditsThanAreKeptPendingAreCarriedOut)
{
    QString expected(20000, u'.');
    ReportText text;
    ASSERT_TRUE(text.append(expected));
    for (qint64 at = 0; at < 20000; at += 2) {
        ASSERT_TRUE(text.replace(at, 1, u"#"));
        expected[at] = u'#';
    }
    EXPECT_TRUE(contentOf(text) == expected);
}

TEST(ReportTextReplace, WhateverElseIsDoneSeesTheEdits)
{
    struct Row
    {
        void (*act)(ReportText &text);
        const char16_t *expected;
        const char *reason;
    };
    const Row rows[] = {
        {[](ReportText &text) { text.append(u"!"); }, u"a+b!", "appended"},
        {[](ReportText &text) { text.append(u"\u6E2C"); }, u"a+b\u6E2C", "a character that widens the text"},
        {[](ReportText &text) { text.appendLineEnd(); }, u"a+b\r\n", "a line end"},
        {[](ReportText &text) { text.reserve(100000); }, u"a+b", "room for more"},
        {[](ReportText &text) { text.data(); }, u"a+b", "read in UTF-16"},
        {[](ReportText &text) { text.assign(u"new"); }, u"new", "replaced whole"},
        {[](ReportText &text) { text.assign(text.view().first(2)); }, u"a+", "replaced by a piece of itself"},
        {[](ReportText &text) { text.clear(); }, u"", "emptied"},
        {[](ReportText &text) { text.replace(2, 0, text.view().last(2)); }, u"a++bb", "a piece of the very text"},
    };
    for (const Row &row : rows) {
        ReportText text;
        ASSERT_TRUE(text.append(u"ab"));
        ASSERT_TRUE(text.replace(1, 0, u"+"));
        row.act(text);
        EXPECT_EQ(contentOf(text), QString::fromUtf16(row.expected)) << row.reason;
        ASSERT_TRUE(text.replace(text.size(), 0, u"$")) << row.reason;
        EXPECT_EQ(contentOf(text), QString::fromUtf16(row.expected) + u'$') << row.reason;
    }
}

TEST(ReportTextReplace, WithoutMemoryNothingIsChanged)
{
    struct Row
    {
        qint64 removed;
        qint64 inserted;
        bool expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {0, 2, true, "exactly what the block holds"},       {0, 3, false, "one character more"},
        {10, 12, true, "what is removed makes room"},       {10, 13, false, "not enough of it"},
        {31000, 32002, false, "more than the block holds"}, {31998, 32000, true, "a whole block of other text"},
    };
    for (const Row &row : rows) {
        const LimitedMemory memory = LimitedMemory::ofCharacters(32000);
        ReportText text(LimitedMemory::reallocate);
        const QString before(31998, u'x');
        ASSERT_TRUE(text.append(before));
        EXPECT_EQ(text.replace(0, row.removed, QString(row.inserted, u'y')), row.expected) << row.reason;
        EXPECT_EQ(contentOf(text), row.expected ? QString(row.inserted, u'y') + before.sliced(row.removed) : before)
            << row.reason;
        EXPECT_EQ(memory.largest, LimitedMemory::bytesFor(32000));
    }
}

TEST(ReportTextReplace, WhatWasTakenInCanBeCarriedOutWithoutMoreMemory)
{
    const LimitedMemory memory;
    ReportText text(LimitedMemory::reallocate);
    QString expected(31990, u'x');
    ASSERT_TRUE(text.append(expected));
    for (const qint64 at : {30000, 20000, 10}) {
        ASSERT_TRUE(text.replace(at, 0, QString(20000, u'y')));
        expected.insert(at, QString(20000, u'y'));
    }
    memory.largest = 0;
    EXPECT_TRUE(contentOf(text) == expected);
    EXPECT_TRUE(text.isNarrow());
}

TEST(ReportTextReplace, WithoutMemoryForUtf16AWiderCharacterIsRefused)
{
    const LimitedMemory memory = LimitedMemory::ofCharacters(32000);
    ReportText text(LimitedMemory::reallocate);
    ASSERT_TRUE(text.append(QString(20000, u'x')));
    ASSERT_TRUE(text.replace(0, 1, u"y"));
    EXPECT_FALSE(text.replace(0, 1, wide));
    EXPECT_TRUE(text.isNarrow());
    EXPECT_EQ(contentOf(text), u'y' + QString(19999, u'x'));
    EXPECT_EQ(memory.largest, LimitedMemory::bytesFor(32000)) << "there was no more memory";
}

/// What makes a text longer, and how it is then.
using Grow = bool (*)(ReportText &, QString &);
const std::pair<Grow, const char *> grows[] = {
    {[](ReportText &text, QString &expected) {
         expected += QString(100, u'w');
         return text.append(QString(100, u'w'));
     },
     "a text is written"},
    {[](ReportText &text, QString &expected) {
         expected += QStringLiteral("0123456789\r\n");
         return text.append(QLatin1StringView("0123456789")) && text.appendLineEnd();
     },
     "a line is written"},
    {[](ReportText &text, QString &) { return text.reserve(text.size() + 32001); }, "room is made"},
    {[](ReportText &text, QString &expected) {
         expected.insert(3, QString(70000, u'i'));
         return text.replace(3, 0, QString(70000, u'i'));
     },
     "a long text is inserted"},
    {[](ReportText &text, QString &expected) {
         expected.insert(3, QString(40000, u'i'));
         return text.replace(3, 0, QString(40000, u'i'));
     },
     "a text is inserted and kept for later"},
    {[](ReportText &text, QString &expected) {
         expected += QString(100, u'w') + wide;
         return text.append(QString(100, u'w') + wide);
     },
     "the text becomes one of two bytes a character"},
};

TEST(ReportTextReplace, GrowingKeepsWhatIsAfterAnEdit)
{
    struct Row
    {
        qsizetype size;
        qint64 at;
        qint64 removed;
        QString inserted;
        const char *reason;
    };
    const Row rows[] = {
        {31990, 5, 1, QStringLiteral("XY"), "near the start: nearly all of the text is after it"},
        {31990, 0, 0, QStringLiteral("X"), "before the first character"},
        {31990, 31989, 1, QString(), "the last character goes"},
        {31990, 100, 20000, QString(), "most of the text goes"},
        {63990, 32000, 1, QStringLiteral("XY"), "where a block ends"},
        {31990, 5, 1, QString(70000, u'X'), "longer than what is kept to be carried out later"},
    };
    for (const Row &row : rows) {
        for (const auto &[grow, how] : grows) {
            for (const bool narrow : {true, false}) {
                ReportText text;
                QString expected(row.size, u' ');
                for (qsizetype i = 0; i < row.size; ++i) {
                    expected[i] = QChar(static_cast<char16_t>(1 + i % 250));
                }
                ASSERT_TRUE(text.append(expected));
                if (!narrow) {
                    ASSERT_NE(text.data(), nullptr); // in UTF-16 from now on
                }
                ASSERT_TRUE(text.replace(row.at, row.removed, row.inserted));
                expected.replace(row.at, row.removed, row.inserted);
                ASSERT_TRUE(grow(text, expected));
                EXPECT_TRUE(contentOf(text) == expected) << row.reason << "; " << how << "; narrow " << narrow;
            }
        }
    }
}

} // namespace
