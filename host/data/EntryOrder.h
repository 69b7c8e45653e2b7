#pragma once

#include "UDataObject.h"

#include <QStringView>

#include <compare>
#include <optional>
#include <vector>

namespace kareport
{

/// The number that an entry holds; nothing for null, for true and false, and for a text.
std::optional<double> numberOf(const UDictEntry *entry);

/// The order of two values; null means a missing entry. A missing one comes first, then numbers by their value,
/// true and false among them as 1 and 0, then texts by their case-folded characters, then point numbers in natural order. Not-a-number comes before all other
/// numbers, so that the order stays one.
std::weak_ordering compareEntries(const UDictEntry *left, const UDictEntry *right);

/// Compares two objects by the values under the identifiers in turn.
std::weak_ordering compareObjects(const UDataObject &left, const UDataObject &right, const std::vector<unsigned> &ids);

/// Natural order: runs of ASCII digits compare by number, other runs case-folded, so 9 comes before 10 and 12 before
/// 12A.
std::weak_ordering compareNaturally(QStringView left, QStringView right);

} // namespace kareport
