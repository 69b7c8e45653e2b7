#include "PrintQt.h"
#include "TagScanner.h"

#include <gtest/gtest.h>

#include <array>
#include <random>
#include <vector>

using kareport::ExtractNode;
using kareport::GetNode;
using kareport::NodeSequence;
using kareport::ScanElement;
using kareport::ScanNotes;
using kareport::ScanText;

namespace
{

QString capitals(const QString &text)
{
    QString upper;
    for (const QChar character : text) {
        upper += character.toUpper();
    }
    return upper;
}

struct Cut
{
    qsizetype open = -1;
    qsizetype close = -1;
    QString value;
    bool found = false;
};

/// The scanner in its plainest form: capitals of everything, three searches, two cuts.
Cut plainCut(QString &text, const QString &tag, bool remove)
{
    const QString upperText = capitals(text);
    const QString upperTag = capitals(tag);
    Cut cut;
    cut.open = upperText.indexOf(u'<' + upperTag + u'>');
    cut.close = upperText.indexOf(QStringLiteral("</") + upperTag + u'>');
    if (cut.close < 0 && cut.open >= 0) {
        cut.close = upperText.indexOf(QStringLiteral("</>"), cut.open);
    }
    if (cut.open < 0 || cut.close < 0 || cut.close <= cut.open) {
        return cut;
    }
    cut.found = true;
    const qsizetype start = cut.open + tag.size() + 2;
    cut.value = text.mid(start, cut.close - start);
    if (remove) {
        text = text.left(cut.open) + text.mid(cut.close + tag.size() + 3);
    }
    return cut;
}

constexpr std::array<const char16_t *, 24> fragments = {
    u"<A>", u"</A>", u"</>", u"<", u"/",    u"A>",    u"<a",  u">",  u"x",          u"ı",    u"ſ",     u"ß",
    u"<a>", u"</a>", u"<A>", u"A", u"<İI>", u"</ıi>", u"<ı>", u"</", u"\U0001F600", u"<ſS>", u"</sS>", u" "};

constexpr std::array<const char16_t *, 3> tags = {u"A", u"II", u"SS"};

class RandomText
{
public:
    QString next()
    {
        QString text;
        const std::size_t count = random_() % 24;
        // Few kinds of fragments in a text make long chains of cuts.
        const std::size_t kinds = random_() % 2 == 0 ? 8 : fragments.size();
        for (std::size_t i = 0; i < count; ++i) {
            text += QString::fromUtf16(fragments[random_() % kinds]);
        }
        return text;
    }

private:
    std::mt19937 random_{20240305};
};

std::vector<qsizetype> sources(const ScanText &text)
{
    std::vector<qsizetype> found;
    for (qsizetype i = 0; i < text.size(); ++i) {
        found.push_back(text.sourceOf(i));
    }
    return found;
}

std::vector<qsizetype> counted(qsizetype size)
{
    std::vector<qsizetype> numbers;
    for (qsizetype i = 0; i < size; ++i) {
        numbers.push_back(i);
    }
    return numbers;
}

constexpr int texts = 40000;

TEST(TagScannerRandom, CutsAsThePlainestScannerDoes)
{
    RandomText random;
    int found = 0;
    for (int i = 0; i < texts; ++i) {
        const QString original = random.next();
        for (const auto *name : tags) {
            const QString tag = QString::fromUtf16(name);
            QString plain = original;
            const Cut expected = plainCut(plain, tag, i % 2 == 0);
            ScanText text(original);
            const ScanElement element = ExtractNode(text, tag, i % 2 == 0);
            ASSERT_EQ(element.exists(), expected.found) << original.toStdString();
            ASSERT_EQ(element.source, expected.found ? expected.open : -1) << original.toStdString();
            ASSERT_EQ(element.value.text(), expected.value) << original.toStdString();
            ASSERT_EQ(text.text(), plain) << original.toStdString();
            ASSERT_EQ(GetNode(ScanText(original), tag).value.text(), expected.value) << original.toStdString();
            found += expected.found ? 1 : 0;
        }
    }
    EXPECT_GT(found, texts / 4) << "the texts hold too few elements to say anything";
}

TEST(TagScannerRandom, SequenceGivesWhatRepeatedCuttingGives)
{
    RandomText random;
    int longest = 0;
    int joined = 0;
    for (int i = 0; i < texts; ++i) {
        const QString original = random.next();
        for (const auto *name : tags) {
            const QString tag = QString::fromUtf16(name);
            const ScanText text(original);
            NodeSequence sequence(text, tag);
            QString plain = original;
            std::vector<qsizetype> places = counted(original.size());
            int count = 0;
            for (;; ++count) {
                const qsizetype before = plain.size();
                const Cut expected = plainCut(plain, tag, true);
                const auto element = sequence.next();
                ASSERT_EQ(element.has_value(), !expected.value.isEmpty())
                    << original.toStdString() << " at element " << count;
                if (!element) {
                    break;
                }
                ASSERT_EQ(element->value.text(), expected.value) << original.toStdString() << " at element " << count;
                const auto open = places.begin() + expected.open;
                const auto start = open + tag.size() + 2;
                ASSERT_EQ(sources(element->value), std::vector<qsizetype>(start, start + expected.value.size()))
                    << original.toStdString() << " at element " << count;
                if (*(start - 1) - *open == tag.size() + 1) {
                    ASSERT_EQ(element->source, *open) << original.toStdString() << " at element " << count;
                } else {
                    ++joined;
                }
                places.erase(open, open + (before - plain.size()));
            }
            longest = std::max(longest, count);
        }
    }
    EXPECT_GE(longest, 4) << "the texts hold too few elements to say anything";
    EXPECT_GE(joined, 20) << "too few cuts join to a new tag to say anything";
}

TEST(TagScannerRandom, PlacesStayRightThroughRepeatedCuts)
{
    RandomText random;
    for (int i = 0; i < texts / 2; ++i) {
        const QString original = random.next();
        ScanText text(original);
        QString plain = original;
        std::vector<qsizetype> places = counted(original.size());
        for (;;) {
            const qsizetype before = plain.size();
            const Cut expected = plainCut(plain, QStringLiteral("A"), true);
            const ScanElement element = ExtractNode(text, u"A", true);
            ASSERT_EQ(element.exists(), expected.found) << original.toStdString();
            if (!expected.found) {
                break;
            }
            const auto open = places.begin() + expected.open;
            ASSERT_EQ(element.source, *open) << original.toStdString();
            ASSERT_EQ(sources(element.value), std::vector<qsizetype>(open + 3, open + 3 + expected.value.size()))
                << original.toStdString();
            places.erase(open, open + (before - plain.size()));
            ASSERT_EQ(sources(text), places) << original.toStdString();
        }
    }
}

TEST(TagScannerRandom, NotesChangeNothingOfWhatIsRead)
{
    RandomText random;
    for (int i = 0; i < texts / 2; ++i) {
        const ScanText text(random.next());
        ScanNotes notes;
        NodeSequence quiet(text, u"A");
        NodeSequence noted(text, u"A", &notes);
        for (bool more = true; more;) {
            const auto left = quiet.next();
            const auto right = noted.next();
            ASSERT_EQ(left.has_value(), right.has_value()) << text.text().toStdString();
            if (left) {
                ASSERT_EQ(left->value.text(), right->value.text()) << text.text().toStdString();
            }
            more = left.has_value();
        }
        for (const auto &note : notes) {
            ASSERT_GE(note.source, 0) << text.text().toStdString();
            ASSERT_LE(note.source, text.size()) << text.text().toStdString();
        }
    }
}

} // namespace
