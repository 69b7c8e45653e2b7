#include "LeadingInteger.h"

#include <algorithm>
#include <limits>

namespace kareport
{

qint32 leadingInteger(QStringView text)
{
    const auto isDigit = [](QChar character) { return character >= u'0' && character <= u'9'; };
    qsizetype position = 0;
    while (position < text.size() && text[position].isSpace()) {
        ++position;
    }
    bool negative = false;
    if (position < text.size() && (text[position] == u'-' || text[position] == u'+')) {
        negative = text[position] == u'-';
        ++position;
    }
    constexpr qint64 beyond = qint64(std::numeric_limits<qint32>::max()) + 1;
    qint64 number = 0;
    for (; position < text.size() && isDigit(text[position]); ++position) {
        number = std::min(number * 10 + (text[position].unicode() - u'0'), beyond);
    }
    return static_cast<qint32>(negative ? -number : std::min(number, beyond - 1));
}

} // namespace kareport
