#include "ResultFile.h"

namespace kareport
{

void ResultFile::flush()
{
    if (isTooLarge_ || !problem_.isEmpty()) {
        spool_.buffer().clear();
        return;
    }
    if (mostBytes_ >= 0 && spool_.size() > static_cast<std::size_t>(mostBytes_)) {
        isTooLarge_ = true;
    } else if (!spool_.flushFull()) {
        problem_ = spool_.wrong();
    }
}

std::string_view ResultFile::page(std::size_t number) const
{
    if (pages_.empty()) {
        return bytes();
    }
    const std::size_t start = pages_[number - 1];
    return bytes().substr(start, number < pages_.size() ? pages_[number] - start : std::string_view::npos);
}

void ResultFile::release(std::string_view read) const
{
    const auto begin = static_cast<std::size_t>(read.data() - bytes().data());
    spool_.release(begin, begin + read.size());
}

bool ResultFile::finish()
{
    writeEnd();
    flush();
    if (isTooLarge_ || !problem_.isEmpty()) {
        return false;
    }
    if (!spool_.finish()) {
        problem_ = spool_.wrong();
    }
    return problem_.isEmpty();
}

} // namespace kareport
