#include "Clock.h"

namespace kareport
{

namespace
{

std::optional<QDateTime> &fixedTime()
{
    static std::optional<QDateTime> time;
    return time;
}

} // namespace

QDateTime currentTime()
{
    return fixedTime() ? *fixedTime() : QDateTime::currentDateTime();
}

void fixTime(const std::optional<QDateTime> &time)
{
    fixedTime() = time;
}

} // namespace kareport
