#include "RowReader.h"

#include "EntryOrder.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

bool RowReader::isOther(const UDictEntry &before, const UDictEntry *now)
{
    return std::is_neq(compareEntries(&before, now));
}

QString RowReader::overText(const QString &column)
{
    return Xlate("a row has values in several columns whose variables have one ID: that of \"%1\", the last one, shows")
        .arg(column);
}

/// Whether values of an identifier were not noted before.
bool RowReader::isFirstOver(unsigned id)
{
    const bool isFirst = std::find(notedIds_.begin(), notedIds_.end(), id) == notedIds_.end();
    if (isFirst) {
        notedIds_.push_back(id);
    }
    return isFirst;
}

} // namespace kareport
