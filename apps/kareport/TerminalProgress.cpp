#include "TerminalProgress.h"

#include "Printing.h"

#include <algorithm>
#include <atomic>
#include <cstdio>

namespace kareport
{

namespace
{

std::atomic<qsizetype> shownWidth = 0; ///< of the line on standard error; there is one for all

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

void TerminalProgress::show(std::size_t done)
{
    QString line = visibleText(prefix() + what());
    if (total() > 0) {
        line += QStringLiteral(" %1 %").arg(std::min(done, total()) * 100 / total());
    }
    std::fprintf(stderr, "\r%s", qUtf8Printable(line.leftJustified(shownWidth)));
    std::fflush(stderr);
    shownWidth = std::max<qsizetype>(shownWidth, line.size());
}

void TerminalProgress::finish()
{
    // Of many short works the next one follows at once.
    if (prefix().isEmpty()) {
        eraseProgress();
    }
}

} // namespace kareport
