#include "Progress.h"

#include "VisibleText.h"

#include <algorithm>
#include <atomic>
#include <cstdio>

namespace kareport
{

namespace
{

constexpr qint64 millisecondsBetween = 100;

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

void Progress::begin(const QString &what, std::size_t total)
{
    what_ = what;
    total_ = total;
    if (shown_ && (prefix_.isEmpty() || !sinceShown_.isValid() || sinceShown_.elapsed() >= millisecondsBetween)) {
        sinceShown_.start();
        show(0);
    }
}

void Progress::advance(std::size_t done)
{
    if (shown_ && sinceShown_.elapsed() >= millisecondsBetween) {
        sinceShown_.start();
        show(done);
    }
}

void Progress::advance(std::size_t done, std::size_t total)
{
    total_ = total;
    advance(done);
}

void Progress::show(std::size_t done)
{
    QString line = visibleText(prefix_ + what_);
    if (total_ > 0) {
        line += QStringLiteral(" %1 %").arg(std::min(done, total_) * 100 / total_);
    }
    std::fprintf(stderr, "\r%s", qUtf8Printable(line.leftJustified(shownWidth)));
    std::fflush(stderr);
    shownWidth = std::max<qsizetype>(shownWidth, line.size());
}

void Progress::finish()
{
    // Of many short works the next one follows at once.
    if (prefix_.isEmpty()) {
        eraseProgress();
    }
}

} // namespace kareport
