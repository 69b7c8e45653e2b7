#include "Progress.h"

namespace kareport
{

namespace
{

constexpr qint64 millisecondsBetween = 100;

} // namespace

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

} // namespace kareport
