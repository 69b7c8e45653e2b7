#include "UDataObjectList.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <limits>
#include <random>
#include <utility>
#include <vector>

namespace
{

constexpr unsigned key = 7;
constexpr unsigned secondKey = 3;
constexpr unsigned mark = 100; ///< tells the objects apart
constexpr double infinite = std::numeric_limits<double>::infinity();

UPointNumber point(QStringView text)
{
    return UPointNumber(text.toString());
}

int markOf(UDataObjectList &list, std::size_t index)
{
    return std::get<qint32>(list.GetAt(index)->Find(mark)->value());
}

std::vector<int> marksOf(UDataObjectList &list)
{
    std::vector<int> marks;
    for (std::size_t i = 0; list.GetAt(i) != nullptr; ++i) {
        marks.push_back(markOf(list, i));
    }
    return marks;
}

UDataObject &add(UDataObjectList &list, int number)
{
    UDataObject &object = list.Add();
    object.Set(mark, qint32{number});
    return object;
}

TEST(UDataObjectList, GivesItsObjectsByIndexFromZero)
{
    UDataObjectList list;
    EXPECT_EQ(list.GetAt(0), nullptr) << "empty";
    UDataObject &first = list.Add();
    UDataObject &second = list.Add();
    EXPECT_EQ(list.GetAt(0), &first);
    EXPECT_EQ(list.GetAt(1), &second);
    EXPECT_EQ(list.GetAt(2), nullptr) << "after the last one";
    EXPECT_EQ(list.GetAt(std::numeric_limits<std::size_t>::max()), nullptr) << "far after the last one";
    EXPECT_EQ(second.Find(key), nullptr) << "a new object is empty";
}

TEST(UDataObjectList, SortOfNothingChangesNothing)
{
    UDataObjectList list;
    list.Sort({key});
    EXPECT_EQ(list.GetAt(0), nullptr) << "an empty list";
    add(list, 2).Set(key, 2.0);
    list.Sort({key});
    EXPECT_EQ(marksOf(list), (std::vector{2})) << "one object";
    add(list, 1).Set(key, 1.0);
    list.Sort({});
    EXPECT_EQ(marksOf(list), (std::vector{2, 1})) << "no identifiers";
    list.Sort({9999});
    EXPECT_EQ(marksOf(list), (std::vector{2, 1})) << "an identifier that no object has";
    list.Sort({key});
    EXPECT_EQ(marksOf(list), (std::vector{1, 2}));
}

/// Sorts the two values in both orders. @return -1 when the left one comes first either way, 1 when the right one does,
/// 0 when they keep the order they had
int orderOf(const std::optional<UDictEntry::Value> &left, const std::optional<UDictEntry::Value> &right)
{
    const auto firstOf = [](const std::optional<UDictEntry::Value> *values[2]) {
        UDataObjectList list;
        for (int i = 0; i < 2; ++i) {
            UDataObject &object = add(list, i);
            if (values[i]->has_value()) {
                object.Set(key, **values[i]);
            }
        }
        list.Sort({key});
        return markOf(list, 0);
    };
    const std::optional<UDictEntry::Value> *inOrder[] = {&left, &right};
    const std::optional<UDictEntry::Value> *swapped[] = {&right, &left};
    const bool leftFirst = firstOf(inOrder) == 0;
    const bool leftFirstOfSwapped = firstOf(swapped) == 1;
    if (leftFirst == leftFirstOfSwapped) {
        return leftFirst ? -1 : 1;
    }
    return leftFirst ? 0 : 99;
}

TEST(UDataObjectList, SortOrdersValuesOfEveryKind)
{
    const std::optional<UDictEntry::Value> missing;
    struct Row
    {
        std::optional<UDictEntry::Value> left;
        std::optional<UDictEntry::Value> right;
        int expected;
        const char *reason;
    };
    const Row rows[] = {
        {missing, missing, 0, "both missing"},
        {missing, false, -1, "a missing one before the smallest boolean"},
        {missing, -infinite, -1, "a missing one before any number"},
        {missing, QString(), -1, "a missing one before an empty text"},
        {missing, point(u""), -1, "a missing one before an empty point number"},
        {false, true, -1, "booleans"},
        {qint16{-5}, qint16{3}, -1, "16-bit numbers"},
        {qint32{-5}, qint32{3}, -1, "32-bit numbers"},
        {qint32{10}, qint32{9}, 1, "as numbers, not as texts"},
        {-1.5, 1.25, -1, "doubles"},
        {-infinite, -1e308, -1, "infinite below zero"},
        {infinite, 1e308, 1, "infinite"},
        {0.0, -0.0, 0, "zero with a sign is zero"},
        {qint32{2}, 2.0, 0, "numbers of two kinds"},
        {true, qint16{1}, 0, "a boolean is 1"},
        {qint32{2}, 2.5, -1, "numbers of two kinds compare as numbers"},
        {true, 0.5, 1, "a boolean against a number"},
        {qint32{2147483647}, 2147483646.5, 1, "the largest 32-bit number is held exactly"},
        {std::numeric_limits<double>::quiet_NaN(), -infinite, -1, "not a number before all other numbers"},
        {std::numeric_limits<double>::quiet_NaN(), missing, 1, "not a number is not missing"},
        {std::numeric_limits<double>::quiet_NaN(), -std::numeric_limits<double>::quiet_NaN(), 0,
         "two that are not numbers"},
        {infinite, QString(), -1, "any number before a text"},
        {1e9, QStringLiteral("1"), -1, "a number before a text of digits"},
        {1e9, point(u"1"), -1, "a number before a point number"},
        {QStringLiteral("zzz"), point(u"1"), -1, "a text before a point number"},
        {QStringLiteral("a"), QStringLiteral("b"), -1, "texts"},
        {QStringLiteral("a"), QStringLiteral("B"), -1, "case does not matter"},
        {QStringLiteral("B"), QStringLiteral("a"), 1, "case does not matter"},
        {QStringLiteral("abc"), QStringLiteral("ABC"), 0, "the same but for case"},
        {QStringLiteral("Ärger"), QStringLiteral("ärger"), 0, "the same but for case, beyond ASCII"},
        {QStringLiteral("Σ"), QStringLiteral("ς"), 0, "both fold to the same character"},
        {QStringLiteral("𐐀"), QStringLiteral("𐐨"), 0, "the same but for case, a surrogate pair"},
        {QStringLiteral("[x"), QStringLiteral("Ax"), -1, "folded to small letters, not to capitals"},
        {QStringLiteral("z"), QStringLiteral("ä"), -1, "by character, not by any language"},
        {QString(), QStringLiteral("a"), -1, "an empty text first"},
        {QString(), QStringLiteral(""), 0, "a null text is empty"},
        {QStringLiteral("ab"), QStringLiteral("abc"), -1, "the beginning of another"},
        {QStringLiteral("10"), QStringLiteral("9"), -1, "texts of digits compare as texts"},
        {QStringLiteral("測"), QStringLiteral("量"), -1, "by their codes"},
        {point(u"10"), point(u"9"), 1, "point numbers in natural order"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(orderOf(row.left, row.right), row.expected) << row.reason;
        EXPECT_EQ(orderOf(row.right, row.left), -row.expected) << row.reason << ", exchanged";
    }
}

TEST(UDataObjectList, SortOrdersPointNumbersNaturally)
{
    struct Row
    {
        QStringView left;
        QStringView right;
        int expected;
        const char *reason;
    };
    constexpr Row rows[] = {
        {u"", u"", 0, "both empty"},
        {u"", u"0", -1, "fewer runs first: none"},
        {u"1", u"1", 0, "the same"},
        {u"9", u"10", -1, "by number"},
        {u"12", u"12A", -1, "fewer runs first"},
        {u"12A", u"13", -1, "the first run decides"},
        {u"12A", u"12B", -1, "the second run decides"},
        {u"12a", u"12B", -1, "case does not matter"},
        {u"12a", u"12A", 0, "the same but for case"},
        {u"BM-3", u"bm-20", -1, "digits after other characters"},
        {u"A2B10", u"A2B9", 1, "the last run decides"},
        {u"A1B", u"A01B", -1, "the shorter run first when the numbers are the same"},
        {u"7", u"007", -1, "the shorter run first when the numbers are the same"},
        {u"007", u"8", -1, "but the number decides first"},
        {u"007Z", u"7A", 1, "the shorter run first before any later run"},
        {u"0", u"00", -1, "zeros only: the shorter run first"},
        {u"00", u"1", -1, "zeros only are 0"},
        {u"100000000000000000000", u"99999999999999999999", 1, "beyond 64 bits"},
        {u"18446744073709551616", u"0", 1, "a number that 64 bits would make 0"},
        {u"00000000000000000000000001", u"2", -1, "many zeros"},
        {u"9", u"A", -1, "a digit run before another run"},
        {u"9", u"-", -1, "a digit run before any other character"},
        {u"9", u" ", -1, "a digit run before a blank"},
        {u"A1", u"AB", -1, "the runs are A and AB, and A begins AB"},
        {u"A1", u"A-", -1, "the runs are A and A-, and A begins A-"},
        {u"A", u"A1", -1, "fewer runs first"},
        {u"-5", u"5", 1, "a sign is another run, after a digit run"},
        {u"-5", u"-10", -1, "and is not part of the number"},
        {u"1.5", u"1.10", -1, "nor is a point"},
        {u"٣", u"9", 1, "only ASCII digits are digits"},
        {u"٣", u"a", 1, "and others compare as characters"},
        {u"９", u"10", 1, "a full-width digit is not a digit"},
        {u"测9", u"测10", -1, "characters beyond ASCII in another run"},
        {u"😀9", u"😀10", -1, "a surrogate pair in another run"},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(orderOf(point(row.left), point(row.right)), row.expected) << row.reason;
        EXPECT_EQ(orderOf(point(row.right), point(row.left)), -row.expected) << row.reason << ", exchanged";
    }
}

TEST(UDataObjectList, SortTakesTheIdentifiersInTurn)
{
    struct Values
    {
        double first;
        double second;
    };
    constexpr Values values[] = {{2, 1}, {1, 2}, {2, 0}, {1, 1}};
    UDataObjectList list;
    for (int i = 0; i < 4; ++i) {
        UDataObject &object = add(list, i);
        object.Set(key, values[i].first);
        object.Set(secondKey, values[i].second);
    }
    list.Sort({key, secondKey});
    EXPECT_EQ(marksOf(list), (std::vector{3, 1, 2, 0})) << "first one, then the other";
    list.Sort({secondKey, key});
    EXPECT_EQ(marksOf(list), (std::vector{2, 3, 0, 1})) << "the other way round";
    list.Sort({9999, secondKey, key});
    EXPECT_EQ(marksOf(list), (std::vector{2, 3, 0, 1})) << "an identifier that no object has decides nothing";
    list.Sort({key, key});
    EXPECT_EQ(marksOf(list), (std::vector{3, 1, 2, 0})) << "equal ones keep the order that they had";
}

TEST(UDataObjectList, SortKeepsTheOrderOfEqualOnes)
{
    constexpr int count = 5000;
    std::mt19937 random(20240305);
    std::vector<std::pair<double, int>> expected;
    UDataObjectList list;
    for (int i = 0; i < count; ++i) {
        const auto value = static_cast<double>(random() % 10);
        add(list, i).Set(key, value);
        expected.emplace_back(value, i);
    }
    std::sort(expected.begin(), expected.end()); // by value, then by place
    list.Sort({key});
    const std::vector<int> marks = marksOf(list);
    ASSERT_EQ(marks.size(), expected.size());
    for (std::size_t i = 0; i < marks.size(); ++i) {
        ASSERT_EQ(marks[i], expected[i].second) << "at " << i;
    }
}

TEST(UDataObjectList, SortMovesTheObjectsThemselves)
{
    UDataObjectList list;
    UDataObject &large = add(list, 2);
    UDataObject &small = add(list, 1);
    large.Set(key, 2.0);
    small.Set(key, 1.0);
    list.Sort({key});
    EXPECT_EQ(list.GetAt(0), &small);
    EXPECT_EQ(list.GetAt(1), &large);
}

} // namespace
