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
    std::vector<int> blocks;
    int first = 0;
    for (const qint64 start : starts) {
        int last = document.blockCount();
        while (first < last) {
            const int middle = first + (last - first) / 2;
            if (startOfBlock(document.findBlockByNumber(middle)) < start) {
                first = middle + 1;
            } else {
                last = middle;
            }
        }
        const QTextBlock block = document.findBlockByNumber(first);
        if (block.isValid() && startOfBlock(block) == start) {
            blocks.push_back(first);
        }
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
