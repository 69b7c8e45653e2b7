#include "ScanText.h"
#include "PrintQt.h"

#include <gtest/gtest.h>

#include <random>
#include <vector>

using kareport::ScanText;

namespace
{

/// The sources of all characters of a text and of its end.
std::vector<qsizetype> sources(const ScanText &text)
{
    std::vector<qsizetype> found;
    for (qsizetype i = 0; i <= text.size(); ++i) {
        found.push_back(text.sourceOf(i));
    }
    return found;
}

using Sources = std::vector<qsizetype>;

TEST(ScanText, StaysWhereItIsWhenItIsATextOfItsOwn)
{
    const ScanText text(QStringLiteral("abc"));
    EXPECT_EQ(text.text(), QStringLiteral("abc"));
    EXPECT_EQ(text.size(), 3);
    EXPECT_FALSE(text.isEmpty());
    EXPECT_EQ(sources(text), (Sources{0, 1, 2, 3}));
}

TEST(ScanText, IsEmptyAtFirst)
{
    EXPECT_TRUE(ScanText().isEmpty());
    EXPECT_EQ(ScanText().size(), 0);
    EXPECT_EQ(ScanText().sourceOf(0), 0);
    EXPECT_TRUE(ScanText(QString()).isEmpty());
    EXPECT_EQ(ScanText(QString()).sourceOf(0), 0);
}

TEST(ScanText, AppendsPiecesFromDifferentPlaces)
{
    ScanText text;
    text.append(u"ab", 10);
    text.append(u"cd", 12); // continues where the first piece ended
    text.append(u"", 99);   // no character, no place
    text.append(u"ef", 30);
    EXPECT_EQ(text.text(), QStringLiteral("abcdef"));
    EXPECT_EQ(sources(text), (Sources{10, 11, 12, 13, 30, 31, 32}));
}

TEST(ScanText, AppendsToAnEmptyTextOfItsOwn)
{
    ScanText text{QString()};
    text.append(u"ab", 7);
    EXPECT_EQ(sources(text), (Sources{7, 8, 9}));
}

struct Cut
{
    qsizetype from;
    qsizetype count;
    const char *text;
    Sources sources;
    const char *reason;
};

// "abcdef" from 10 to 15 and "ghij" from 20 to 23.
ScanText twoPieces()
{
    ScanText text;
    text.append(u"abcdef", 10);
    text.append(u"ghij", 20);
    return text;
}

TEST(ScanText, SliceKeepsThePlaces)
{
    const Cut rows[] = {
        {0, 10, "abcdefghij", {10, 11, 12, 13, 14, 15, 20, 21, 22, 23, 24}, "all of it"},
        {0, 0, "", {10}, "nothing, at the front"},
        {3, 0, "", {13}, "nothing, in the middle: it still has a place"},
        {2, 3, "cde", {12, 13, 14, 15}, "in the first piece"},
        {4, 4, "efgh", {14, 15, 20, 21, 22}, "across the joint"},
        {6, 2, "gh", {20, 21, 22}, "from the joint on"},
        {0, 6, "abcdef", {10, 11, 12, 13, 14, 15, 16}, "up to the joint: the end is after the last character"},
        {9, 1, "j", {23, 24}, "the last character"},
        {10, 0, "", {24}, "nothing, at the end"},
    };
    for (const Cut &row : rows) {
        const ScanText slice = twoPieces().sliced(row.from, row.count);
        EXPECT_EQ(slice.text(), QString::fromLatin1(row.text)) << row.reason;
        EXPECT_EQ(sources(slice), row.sources) << row.reason;
    }
}

TEST(ScanText, RemovalKeepsThePlacesOfWhatIsLeft)
{
    const Cut rows[] = {
        {0, 0, "abcdefghij", {10, 11, 12, 13, 14, 15, 20, 21, 22, 23, 24}, "nothing"},
        {2, 2, "abefghij", {10, 11, 14, 15, 20, 21, 22, 23, 24}, "in the first piece"},
        {0, 3, "defghij", {13, 14, 15, 20, 21, 22, 23, 24}, "at the front"},
        {5, 2, "abcdehij", {10, 11, 12, 13, 14, 21, 22, 23, 24}, "across the joint"},
        {0, 6, "ghij", {20, 21, 22, 23, 24}, "the whole first piece"},
        {6, 4, "abcdef", {10, 11, 12, 13, 14, 15, 16}, "the whole second piece"},
        {8, 2, "abcdefgh", {10, 11, 12, 13, 14, 15, 20, 21, 22}, "at the end"},
        {1, 8, "aj", {10, 23, 24}, "all but the first and the last character"},
    };
    for (const Cut &row : rows) {
        ScanText text = twoPieces();
        text.remove(row.from, row.count);
        EXPECT_EQ(text.text(), QString::fromLatin1(row.text)) << row.reason;
        EXPECT_EQ(sources(text), row.sources) << row.reason;
    }
}

TEST(ScanText, CanBeEmptiedAndFilledAgain)
{
    ScanText text = twoPieces();
    text.remove(0, 10);
    EXPECT_TRUE(text.isEmpty());
    text.append(u"xy", 3);
    EXPECT_EQ(text.text(), QStringLiteral("xy"));
    EXPECT_EQ(sources(text), (Sources{3, 4, 5}));
}

/// The same text with the place of every character kept beside it.
struct Model
{
    QString text;
    Sources places;
};

TEST(ScanText, AgreesWithAPlaceKeptForEveryCharacter)
{
    std::mt19937 random(7);
    const auto below = [&random](qsizetype limit) {
        return static_cast<qsizetype>(random() % static_cast<unsigned>(limit));
    };
    for (int round = 0; round < 3000; ++round) {
        ScanText text;
        Model model;
        qsizetype place = 0;
        for (int step = 0; step < 12; ++step) {
            const qsizetype size = model.text.size();
            const qsizetype from = below(size + 1);
            const qsizetype count = below(size - from + 1);
            switch (random() % 3) {
            case 0:
                text.remove(from, count);
                model.text.remove(from, count);
                model.places.erase(model.places.begin() + from, model.places.begin() + from + count);
                break;
            case 1:
                if (random() % 4 == 0) {
                    text = text.sliced(from, count);
                    model.text = model.text.sliced(from, count);
                    model.places = Sources(model.places.begin() + from, model.places.begin() + from + count);
                }
                break;
            default: {
                place += below(3);
                const QString piece(below(6), QChar(u'a' + step));
                text.append(piece, place);
                for (qsizetype i = 0; i < piece.size(); ++i) {
                    model.places.push_back(place++);
                }
                model.text += piece;
            }
            }
            ASSERT_EQ(text.text(), model.text);
            if (!model.places.empty()) {
                Sources expected = model.places;
                expected.push_back(expected.back() + 1);
                ASSERT_EQ(sources(text), expected);
            }
        }
    }
}

} // namespace
