#include "UDictionary.h"

#include <algorithm>

namespace
{
/// Up to this many entries a walk is faster than halving.
constexpr std::size_t fewEntries = 12;
} // namespace

UDictionary::Entries::const_iterator UDictionary::lowerBound(unsigned id) const
{
    if (entries_.size() <= fewEntries) {
        return std::find_if(entries_.begin(), entries_.end(),
                            [id](const UDictEntry &entry) { return entry.GetId() >= id; });
    }
    return std::lower_bound(entries_.begin(), entries_.end(), id,
                            [](const UDictEntry &entry, unsigned wanted) { return entry.GetId() < wanted; });
}

const UDictEntry *UDictionary::Find(unsigned id) const
{
    const auto found = lowerBound(id);
    return found != entries_.end() && found->GetId() == id ? &*found : nullptr;
}

UDictEntry::Value &UDictionary::valueOf(unsigned id)
{
    auto place = entries_.begin() + (lowerBound(id) - entries_.cbegin());
    if (place == entries_.end() || place->GetId() != id) {
        place = entries_.emplace(place, id);
    }
    return place->value();
}

void UDictionary::Set(unsigned id, UDictEntry::Value value)
{
    valueOf(id) = std::move(value);
}

void UDictionary::Remove(unsigned id)
{
    const auto found = lowerBound(id);
    if (found != entries_.end() && found->GetId() == id) {
        entries_.erase(found);
    }
}
