#include "PageLines.h"
#include "RandomSequence.h"
#include "ReportPages.h"

#include <gtest/gtest.h>

#include <QString>

#include <algorithm>
#include <vector>

using kareport::PageLines;

namespace
{

constexpr int linesPerPage = 3;

/// A text that is edited line by line, and the lines that its pages begin with.
class LinedText
{
public:
    explicit LinedText(RandomNumbers &random) : random_(random)
    {
        lines_.resize(static_cast<std::size_t>(1 + random_.below(12)));
        std::generate(lines_.begin(), lines_.end(), [this] { return randomLine(); });
        starts_ = randomStarts(0, lineCount() - 1);
        pages_.load(starts_, lineCount(), isBlank());
    }

    void edit()
    {
        const int line = random_.below(lineCount());
        const int removed = random_.below(std::min(lineCount() - line, 4));
        const int added = random_.below(4);
        const auto first = lines_.begin() + line;
        lines_.insert(lines_.erase(first, first + removed + 1), static_cast<std::size_t>(added) + 1, QString());
        std::generate_n(lines_.begin() + line, added + 1, [this] { return randomLine(); });

        const std::vector<int> brought = randomStarts(line, line + added);
        std::vector<int> starts;
        for (const int start : starts_) {
            if (start < line || start > line + removed) {
                starts.push_back(start < line ? start : start + added - removed);
            }
        }
        starts.insert(starts.end(), brought.begin(), brought.end());
        std::sort(starts.begin(), starts.end());
        starts_ = starts;
        pages_.replace(line, removed, added, brought, isBlank());
    }

    void expectPagesOfText() const
    {
        QString text;
        std::vector<qint64> places; // where each line begins
        for (const QString &line : lines_) {
            places.push_back(text.size());
            text += line + u'\n';
        }
        text.chop(1);
        std::vector<qint64> starts;
        for (const int start : starts_) {
            starts.push_back(places[static_cast<std::size_t>(start)]);
        }
        const auto pages = kareport::reportPages(QStringView(text), starts, linesPerPage);
        ASSERT_EQ(pages_.lineCount(), lineCount());
        ASSERT_EQ(pages_.pageCount(linesPerPage), std::max(1, static_cast<int>(pages.size()))) << qPrintable(text);
        for (std::size_t page = 0; page < pages.size(); ++page) {
            const auto line = std::find(places.begin(), places.end(), pages[page].begin) - places.begin();
            const int number = static_cast<int>(page) + 1;
            ASSERT_EQ(pages_.firstLineOf(number, linesPerPage), line) << number << "\n" << qPrintable(text);
            ASSERT_EQ(pages_.pageOf(static_cast<int>(line), linesPerPage), number) << qPrintable(text);
        }
    }

private:
    int lineCount() const { return static_cast<int>(lines_.size()); }
    PageLines::IsBlank isBlank() const
    {
        return [this](int line) { return kareport::isBlankLine(lines_[static_cast<std::size_t>(line)]); };
    }
    QString randomLine() { return random_.below(3) == 0 ? QString(random_.below(2), u' ') : QStringLiteral("a"); }
    std::vector<int> randomStarts(int first, int last)
    {
        std::vector<int> starts;
        for (int line = first; line <= last; ++line) {
            if (random_.below(4) == 0) {
                starts.push_back(line);
            }
        }
        return starts;
    }

    RandomNumbers &random_;
    std::vector<QString> lines_;
    std::vector<int> starts_;
    PageLines pages_;
};

TEST(PageLines, AreThePagesOfTheTextAfterEveryEdit)
{
    for (quint64 seed = 1; seed <= 300; ++seed) {
        SCOPED_TRACE(testing::Message() << "seed " << seed);
        RandomNumbers random(seed);
        LinedText text(random);
        for (int step = 0; step < 20; ++step) {
            ASSERT_NO_FATAL_FAILURE(text.expectPagesOfText()) << "before edit " << step;
            text.edit();
        }
    }
}

TEST(PageLines, PagesThatThereAreNotAreTheNearestOnes)
{
    PageLines pages;
    pages.load({0, 4}, 8, [](int) { return false; });
    EXPECT_EQ(pages.pageCount(linesPerPage), 2);
    EXPECT_EQ(pages.firstLineOf(0, linesPerPage), 0);
    EXPECT_EQ(pages.firstLineOf(3, linesPerPage), 4);
    EXPECT_EQ(pages.pageOf(-1, linesPerPage), 1);
    EXPECT_EQ(pages.pageOf(100, linesPerPage), 2);
}

} // namespace
