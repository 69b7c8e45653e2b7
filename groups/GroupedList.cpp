#include "GroupedList.h"

namespace kareport
{

GroupedList::~GroupedList() = default;

} // namespace kareport
