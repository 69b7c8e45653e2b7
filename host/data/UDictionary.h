#pragma once

#include "KaReportExport.h"
#include "UDictEntry.h"

#include <vector>

/// The values of one object, found by their identifiers.
class KAREPORT_EXPORT UDictionary
{
public:
    /// The entry of an identifier, or null. The pointer is valid until the dictionary is changed.
    const UDictEntry *Find(unsigned id) const;

    /// Stores a value under an identifier, replacing an earlier one. Throws std::bad_alloc without memory, with the values
    /// as they were: one that is missing would show as blanks or as 0.
    void Set(unsigned id, UDictEntry::Value value);
    /// The value under an identifier for refilling in place; a new entry holds an empty `T`. Throws like `Set`.
    template <typename T>
    T &Refill(unsigned id)
    {
        UDictEntry::Value &value = valueOf(id);
        if (T *held = std::get_if<T>(&value)) {
            return *held;
        }
        return value.emplace<T>();
    }
    /// Takes the value under an identifier away; nothing when there is none.
    void Remove(unsigned id);
    /// Takes all values away.
    void Clear() { entries_.clear(); }

private:
    using Entries = std::vector<UDictEntry>;

    Entries::const_iterator lowerBound(unsigned id) const;
    UDictEntry::Value &valueOf(unsigned id);

    Entries entries_; ///< ascending by identifier
};
