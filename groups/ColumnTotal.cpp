#include "ColumnTotal.h"

namespace kareport
{

void ColumnTotal::add(const ColumnTotal &other)
{
    sum.add(other.sum);
    if (other.count != 0) {
        addRange(other.least, other.greatest, other.count);
    }
}

void ColumnTotal::clear()
{
    sum.clear();
    count = 0;
}

} // namespace kareport
