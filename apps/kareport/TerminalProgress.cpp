#include "TerminalProgress.h"

#include "CharacterCells.h"
#include "Printing.h"
#include "TerminalColumns.h"

#include <algorithm>
#include <atomic>
#include <cstdio>

namespace kareport
{

namespace
{

constexpr int allOfIt = 100;

std::atomic<qint64> shownWidth = 0; ///< cells of the line on standard error; there is one for all

/// A text with its middle left out: the beginning says what is done, and the end of a path is what tells it from others.
QString shortened(const QString &text, qint64 cells)
{
    if (cellsOf(text) <= cells) {
        return text;
    }
    if (cells < 1) {
        return {};
    }
    const qint64 atBegin = (cells - 1) / 3;
    qsizetype head = 0;
    while (head < text.size() && cellsOf(QStringView(text).left(clusterEnd(text, head))) <= atBegin) {
        head = clusterEnd(text, head);
    }
    qsizetype tail = head;
    while (tail < text.size() && cellsOf(QStringView(text).mid(tail)) > cells - 1 - atBegin) {
        tail = clusterEnd(text, tail);
    }
    return text.left(head) + u'…' + text.mid(tail);
}

/// Writes a line over the one that is shown.
void writeOver(const QString &line)
{
    const qint64 width = cellsOf(line);
    const QString blanks(std::max<qint64>(shownWidth - width, 0), u' ');
    std::fprintf(stderr, "\r%s%s", qUtf8Printable(line), qUtf8Printable(blanks));
    shownWidth = std::max<qint64>(shownWidth, width);
}

} // namespace

void eraseProgress()
{
    if (shownWidth > 0) {
        std::fprintf(stderr, "\r%s\r", qUtf8Printable(QString(shownWidth, u' ')));
        std::fflush(stderr);
        shownWidth = 0;
    }
}

bool isProgressShown()
{
    return shownWidth > 0;
}

QString progressLine(const QString &what, int percent, int columns)
{
    QString end;
    if (percent >= 0) {
        end = QStringLiteral("%1 %").arg(percent);
        end.prepend(what.isEmpty() ? QString() : QStringLiteral(" "));
    }
    return columns > 0 ? shortened(what, columns - 1 - end.size()) + end : what + end;
}

void TerminalProgress::show(std::size_t done)
{
    if (isComplete_) {
        return;
    }
    // What is left is at least what comes after the last piece: a line that says that all is done says it when it is.
    const double part = partOfAll(done);
    const int percent = std::min(static_cast<int>(part * allOfIt), allOfIt - 1);
    const bool isKnown = total() > 0 || part > 0;
    writeOver(progressLine(visibleText(prefix() + what()), isKnown ? percent : -1, terminalColumns()));
    std::fflush(stderr);
}

void TerminalProgress::finish()
{
    // Of many short works the next one follows at once.
    if (prefix().isEmpty()) {
        eraseProgress();
    }
}

void TerminalProgress::complete()
{
    if (!isShown() || isComplete_) {
        return;
    }
    isComplete_ = true;
    writeOver(progressLine(prefix().trimmed(), allOfIt, terminalColumns()));
    std::fputs("\n", stderr);
    std::fflush(stderr);
    shownWidth = 0;
}

} // namespace kareport
