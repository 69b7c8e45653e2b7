#include "ControlLines.h"

#include <QTextBlock>
#include <QTextDocument>

#include <algorithm>

namespace kareport
{

namespace
{

/// What is one line end in a control, whatever it is in a text: CR LF, or one character.
bool isLineEnd(const QString &text, qsizetype at)
{
    const QChar character = text[at];
    const bool isPairsFirst = character == u'\r' && at + 1 < text.size() && text[at + 1] == u'\n';
    return (character == u'\r' && !isPairsFirst) || character == u'\n' || character == QChar::ParagraphSeparator;
}

} // namespace

bool hasLines(const QString &text, int lineCount)
{
    const qsizetype lineEnds = text.count(u'\n');
    return lineEnds + 1 == lineCount || (lineEnds == lineCount && text.endsWith(u'\n'));
}

std::vector<int> blocksOfStarts(const QString &text, const std::vector<qint64> &starts)
{
    std::vector<int> blocks;
    int block = 0;
    qint64 at = 0;
    for (const qint64 start : starts) {
        for (; at < std::min<qint64>(start, text.size()); ++at) {
            block += isLineEnd(text, at) ? 1 : 0;
        }
        if (at == start && (at == 0 || text[at - 1] == u'\n')) {
            blocks.push_back(block);
        }
    }
    return blocks;
}

qint64 startOfBlock(const QTextBlock &block)
{
    return qint64(block.position()) + block.blockNumber();
}

std::vector<int> blocksAt(const QTextDocument &document, const std::vector<qint64> &starts)
{
    const int count = document.blockCount();
    const auto startOf = [&document](int number) { return startOfBlock(document.findBlockByNumber(number)); };
    std::vector<int> blocks;
    int first = 0; // no block before it begins at the start or after it
    int distance = 1;
    for (const qint64 start : starts) {
        // Nearly all pages have as many lines as the page before: looking there first makes a long report's pages cost
        // one search each, which else would be a pause of the window.
        int last = first + distance < count ? first + distance : count;
        int from = first;
        while (last < count && startOf(last) < start) {
            from = last + 1;
            distance *= 2;
            last = from < count - distance ? from + distance : count;
        }
        if (last < count && startOf(last) == start) {
            from = last;
        }
        while (from < last) {
            const int middle = from + (last - from) / 2;
            if (startOf(middle) < start) {
                from = middle + 1;
            } else {
                last = middle;
            }
        }
        const bool isThere = from < count && startOf(from) == start;
        if (isThere) {
            blocks.push_back(from);
        }
        distance = std::max(from - first, 1);
        first = from;
    }
    return blocks;
}

ControlText controlText(const QString &text, const std::vector<qint64> &starts)
{
    ControlText control;
    control.text.reserve(text.size());
    auto start = starts.begin();
    for (qsizetype at = 0; at <= text.size(); ++at) {
        for (; start != starts.end() && *start <= at; ++start) {
            if (*start == at && (at == 0 || text[at - 1] == u'\n')) {
                control.starts.push_back(control.text.size());
            }
        }
        if (at == text.size()) {
            break;
        }
        if (isLineEnd(text, at)) {
            control.text += QLatin1String("\r\n");
        } else if (text[at] == QChar::LineSeparator) {
            control.text += u'\n';
        } else if (text[at] != u'\r') { // the first of a pair
            control.text += text[at];
        }
    }
    return control;
}

} // namespace kareport
