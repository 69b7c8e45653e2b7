#include "PlainNumbers.h"

#include <clocale>
#include <cstdlib>
#include <cstring>

namespace kareport
{

PlainNumbers::PlainNumbers() : before_(nullptr), mode_(_configthreadlocale(_ENABLE_PER_THREAD_LOCALE))
{
    const char *const name = std::setlocale(LC_NUMERIC, nullptr);
    if (std::strcmp(name, "C") != 0) {
        before_ = _strdup(name);
        std::setlocale(LC_NUMERIC, "C");
    }
}

PlainNumbers::~PlainNumbers()
{
    if (before_ != nullptr) {
        std::setlocale(LC_NUMERIC, static_cast<const char *>(before_));
        std::free(before_);
    }
    _configthreadlocale(mode_);
}

} // namespace kareport
