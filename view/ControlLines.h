#pragma once

#include <QString>
#include <QtGlobal>

#include <vector>

class QTextBlock;
class QTextDocument;

namespace kareport
{

// A control makes a block of every line, whatever ends it in the report's text: CR LF, LF, CR, or a separator of paragraphs.
// The text that it returns has CR LF in their places. A break within a line, which only rich text has, is an LF there and
// ends no block.

/// Whether a text has so many lines where it is shown. Rich text ends with its last line, a text with the line after it.
bool hasLines(const QString &text, int lineCount);

/// The blocks of a control that has loaded a text which begin at recorded page starts, given in ascending order. A start
/// that begins no line is left out.
std::vector<int> blocksOfStarts(const QString &text, const std::vector<qint64> &starts);

/// Where a block begins in the text that its control returns.
qint64 startOfBlock(const QTextBlock &block);
/// The blocks that begin at places, given in ascending order, of the text that their control returns.
std::vector<int> blocksAt(const QTextDocument &document, const std::vector<qint64> &starts);

/// A text as a control gives it back that has loaded it, and where pages begin in it.
struct ControlText
{
    QString text;
    std::vector<qint64> starts;
};

ControlText controlText(const QString &text, const std::vector<qint64> &starts);

} // namespace kareport
