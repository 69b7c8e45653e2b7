#pragma once

#include <cstddef>

namespace kareport
{

/// Asks the system to give memory that was not used yet in large pages, where it has such: fetching it then takes a
/// fraction of the time. Without effect otherwise. The memory must not move afterwards, which would split the pages.
void preferLargePages(void *memory, std::size_t bytes);

} // namespace kareport
