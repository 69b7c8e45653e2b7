#include "PlainNumbers.h"

#include <clocale>

namespace kareport
{

namespace
{

locale_t plainLocale()
{
    static const locale_t plain = newlocale(LC_ALL_MASK, "C", nullptr);
    return plain;
}

} // namespace

PlainNumbers::PlainNumbers() : before_(uselocale(plainLocale())), mode_(0) {}

PlainNumbers::~PlainNumbers()
{
    uselocale(static_cast<locale_t>(before_));
}

} // namespace kareport
