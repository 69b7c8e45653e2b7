#include "UDictionary.h"

#include "PrintQt.h"

#include <gtest/gtest.h>

#include <limits>

namespace
{

template <typename T>
const T &dataOf(const UDictEntry &entry)
{
    return *static_cast<const T *>(entry.GetData());
}

TEST(UDictEntry, CarriesItsKindAndPointsToItsValue)
{
    const UDictEntry boolean(1, true);
    EXPECT_EQ(boolean.GetKind(), 1);
    EXPECT_EQ(dataOf<unsigned char>(boolean), 1) << "a boolean is one byte";
    EXPECT_EQ(dataOf<unsigned char>(UDictEntry(1, false)), 0);

    const UDictEntry small(2, qint16{-32768});
    EXPECT_EQ(small.GetKind(), 2);
    EXPECT_EQ(dataOf<qint16>(small), -32768);

    const UDictEntry integer(3, qint32{2147483647});
    EXPECT_EQ(integer.GetKind(), 4);
    EXPECT_EQ(dataOf<qint32>(integer), 2147483647);

    const UDictEntry number(4, -0.125);
    EXPECT_EQ(number.GetKind(), 8);
    EXPECT_EQ(dataOf<double>(number), -0.125);

    const UDictEntry text(5, QStringLiteral("測量 😀"));
    EXPECT_EQ(text.GetKind(), 16);
    EXPECT_EQ(dataOf<QString>(text), QStringLiteral("測量 😀"));

    const UDictEntry point(6, UPointNumber(QStringLiteral("BM-3")));
    EXPECT_EQ(point.GetKind(), 32);
    EXPECT_EQ(dataOf<UPointNumber>(point).Convert(), QStringLiteral("BM-3"));
    EXPECT_EQ(point.GetId(), 6U);
}

TEST(UDictEntry, TakesAnotherKindWithAnotherValue)
{
    UDictEntry entry(7, 1.5);
    entry.value() = QStringLiteral("text");
    EXPECT_EQ(entry.GetKind(), 16);
    EXPECT_EQ(dataOf<QString>(entry), QStringLiteral("text"));
    EXPECT_EQ(entry.GetId(), 7U);
}

TEST(UPointNumber, ShowsItsText)
{
    EXPECT_EQ(UPointNumber().Convert(), QString());
    UPointNumber point(QStringLiteral("012A"));
    EXPECT_EQ(point.Convert(), QStringLiteral("012A")) << "leading zeros stay";
    point.text() = QStringLiteral("9");
    EXPECT_EQ(point.Convert(), QStringLiteral("9"));
}

TEST(UDictionary, FindsNothingWhenEmpty)
{
    const UDictionary dictionary;
    EXPECT_EQ(dictionary.Find(0), nullptr);
    EXPECT_EQ(dictionary.Find(std::numeric_limits<unsigned>::max()), nullptr);
}

/// Dictionaries of many sizes: small ones are searched in another way than large ones.
constexpr unsigned sizes[] = {1, 2, 11, 12, 13, 14, 100, 1000};

TEST(UDictionary, FindsEveryEntryAndNoOtherAtEverySize)
{
    for (const unsigned size : sizes) {
        UDictionary dictionary;
        for (unsigned i = 0; i < size; ++i) {
            // Multiplied by a unit modulo `size`: every identifier once, out of order.
            const unsigned id = 10 + 2 * (i * 7 % size);
            dictionary.Set(size % 7 == 0 ? 10 + 2 * (size - 1 - i) : id, static_cast<double>(i));
        }
        for (unsigned id = 8; id < 10 + 2 * size + 3; ++id) {
            const bool expected = id % 2 == 0 && id >= 10 && id < 10 + 2 * size;
            const UDictEntry *entry = dictionary.Find(id);
            ASSERT_EQ(entry != nullptr, expected) << "id " << id << " of " << size;
            if (entry != nullptr) {
                EXPECT_EQ(entry->GetId(), id);
                EXPECT_EQ(entry->GetKind(), 8);
            }
        }
        EXPECT_EQ(dictionary.Find(0), nullptr);
        EXPECT_EQ(dictionary.Find(std::numeric_limits<unsigned>::max()), nullptr);
    }
}

TEST(UDictionary, HoldsTheFirstAndTheLastIdentifierThereIs)
{
    UDictionary dictionary;
    dictionary.Set(std::numeric_limits<unsigned>::max(), qint32{2});
    dictionary.Set(0, qint32{1});
    ASSERT_NE(dictionary.Find(0), nullptr);
    EXPECT_EQ(dataOf<qint32>(*dictionary.Find(0)), 1);
    ASSERT_NE(dictionary.Find(std::numeric_limits<unsigned>::max()), nullptr);
    EXPECT_EQ(dataOf<qint32>(*dictionary.Find(std::numeric_limits<unsigned>::max())), 2);
    EXPECT_EQ(dictionary.Find(1), nullptr);
}

TEST(UDictionary, SetReplacesValueAndKind)
{
    for (const unsigned size : sizes) {
        UDictionary dictionary;
        for (unsigned id = 0; id < size; ++id) {
            dictionary.Set(id, 1.0);
        }
        dictionary.Set(size / 2, QStringLiteral("second"));
        for (unsigned id = 0; id < size; ++id) {
            ASSERT_NE(dictionary.Find(id), nullptr);
            EXPECT_EQ(dictionary.Find(id)->GetKind(), id == size / 2 ? 16 : 8) << id << " of " << size;
        }
        EXPECT_EQ(dataOf<QString>(*dictionary.Find(size / 2)), QStringLiteral("second"));
    }
}

TEST(UDictionary, RefillGivesTheHeldValueOrAnEmptyOne)
{
    UDictionary dictionary;
    EXPECT_EQ(dictionary.Refill<bool>(1), false) << "new";
    EXPECT_EQ(dictionary.Refill<qint16>(2), 0) << "new";
    EXPECT_EQ(dictionary.Refill<qint32>(3), 0) << "new";
    EXPECT_EQ(dictionary.Refill<double>(4), 0.0) << "new";
    EXPECT_EQ(dictionary.Refill<QString>(5), QString()) << "new";
    EXPECT_EQ(dictionary.Refill<UPointNumber>(6).Convert(), QString()) << "new";
    constexpr int kinds[] = {1, 2, 4, 8, 16, 32};
    for (unsigned id = 1; id <= 6; ++id) {
        ASSERT_NE(dictionary.Find(id), nullptr);
        EXPECT_EQ(dictionary.Find(id)->GetKind(), kinds[id - 1]);
    }

    dictionary.Refill<double>(4) = 2.5;
    EXPECT_EQ(dataOf<double>(*dictionary.Find(4)), 2.5);
    EXPECT_EQ(dictionary.Refill<double>(4), 2.5) << "the same kind keeps its value";
    EXPECT_EQ(dictionary.Refill<QString>(4), QString()) << "another kind begins empty";
    EXPECT_EQ(dictionary.Find(4)->GetKind(), 16);

    QString &text = dictionary.Refill<QString>(5);
    text = QStringLiteral("a text that has memory of its own");
    const QChar *memory = text.constData();
    EXPECT_EQ(dictionary.Refill<QString>(5).constData(), memory) << "refilled in place";
}

TEST(UDictionary, RemoveTakesOneEntry)
{
    for (const unsigned size : sizes) {
        UDictionary dictionary;
        dictionary.Remove(3);
        EXPECT_EQ(dictionary.Find(3), nullptr) << "nothing there to remove";
        for (unsigned id = 0; id < size; ++id) {
            dictionary.Set(2 * id, 1.0);
        }
        dictionary.Remove(1);
        dictionary.Remove(2 * size);
        const unsigned removed = 2 * (size - 1);
        dictionary.Remove(removed);
        dictionary.Remove(removed);
        for (unsigned id = 0; id < size; ++id) {
            EXPECT_EQ(dictionary.Find(2 * id) == nullptr, 2 * id == removed) << id << " of " << size;
        }
        dictionary.Set(removed, 2.0);
        ASSERT_NE(dictionary.Find(removed), nullptr) << "set again";
        EXPECT_EQ(dataOf<double>(*dictionary.Find(removed)), 2.0);
    }
}

TEST(UDictionary, ClearTakesAllEntries)
{
    UDictionary dictionary;
    dictionary.Set(1, 1.0);
    dictionary.Set(2, 2.0);
    dictionary.Clear();
    EXPECT_EQ(dictionary.Find(1), nullptr);
    EXPECT_EQ(dictionary.Find(2), nullptr);
    dictionary.Set(2, 3.0);
    ASSERT_NE(dictionary.Find(2), nullptr);
    EXPECT_EQ(dataOf<double>(*dictionary.Find(2)), 3.0);
}

} // namespace
