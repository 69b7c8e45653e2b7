#include "ControlLines.h"

#include <gtest/gtest.h>

#include <QPlainTextDocumentLayout>
#include <QTextDocument>

#include <random>
#include <string>
#include <vector>

using kareport::blocksAt;

namespace
{

/// The blocks of page starts, found line by line.
std::vector<int> expectedBlocks(const std::vector<qint64> &lineStarts, const std::vector<qint64> &starts)
{
    std::vector<int> blocks;
    for (const qint64 start : starts) {
        for (std::size_t line = 0; line < lineStarts.size(); ++line) {
            if (lineStarts[line] == start) {
                blocks.push_back(static_cast<int>(line));
            }
        }
    }
    return blocks;
}

/// A document of lines of given lengths, and where they begin in a text whose lines end with CR LF.
class Lines
{
public:
    explicit Lines(const std::vector<int> &lengths)
    {
        QString text;
        qint64 at = 0;
        for (const int length : lengths) {
            starts_.push_back(at);
            text += (starts_.size() > 1 ? QStringLiteral("\n") : QString()) + QString(length, u'x');
            at += length + 2;
        }
        document_.setDocumentLayout(new QPlainTextDocumentLayout(&document_));
        document_.setPlainText(text);
    }
    const QTextDocument &document() const { return document_; }
    const std::vector<qint64> &starts() const { return starts_; }

private:
    QTextDocument document_;
    std::vector<qint64> starts_;
};

} // namespace

TEST(ControlLines, PagesBeginWithTheBlocksOfTheirStarts)
{
    struct Row
    {
        const char *reason;
        std::vector<int> lengths;
        std::vector<qint64> starts;
        std::vector<int> blocks;
    };
    const Row rows[] = {
        {"none", {5}, {}, {}},
        {"the first line", {5}, {0}, {0}},
        {"every line, also the last one, which is empty", {1, 1, 0}, {0, 3, 6}, {0, 1, 2}},
        {"within a line no page begins", {5, 5}, {3, 7}, {1}},
        {"between CR and LF no page begins", {5, 5}, {6}, {}},
        {"after the end no page begins", {5, 5}, {0, 14, 200}, {0}},
        {"pages of one line, of many, of one", {0, 0, 0, 0, 0, 0, 0, 0}, {0, 2, 12, 14}, {0, 1, 6, 7}},
        {"one start twice", {5, 5}, {7, 7}, {1, 1}},
    };
    for (const Row &row : rows) {
        EXPECT_EQ(blocksAt(Lines(row.lengths).document(), row.starts), row.blocks) << row.reason;
    }
}

TEST(ControlLines, RandomPagesAreFoundAsLineByLine)
{
    std::mt19937 random(20261122);
    const auto below = [&random](unsigned count) { return static_cast<int>(random() % count); };
    for (int turn = 0; turn < 200; ++turn) {
        std::vector<int> lengths;
        for (int line = below(120); line >= 0; --line) {
            lengths.push_back(below(4));
        }
        const Lines lines(lengths);
        std::vector<qint64> starts;
        const int most = 1 + below(20); // lines of a page
        for (std::size_t line = 0; line < lengths.size();
             line += static_cast<std::size_t>(below(3) == 0 ? 1 + below(20) : most))
        {
            starts.push_back(lines.starts()[line] + (below(10) == 0 ? 1 : 0));
        }
        EXPECT_EQ(blocksAt(lines.document(), starts), expectedBlocks(lines.starts(), starts)) << turn;
    }
}
