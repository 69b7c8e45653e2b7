#include "LandXmlPointTable.h"

namespace kareport
{

void LandXmlPointTable::add(const LandXmlPoint &point)
{
    const std::string &reference = point.at.reference;
    const bool isAlias = !point.at.position && !reference.empty() && (reference == point.name || reference == point.id);
    if (isAlias || (point.name.empty() && point.id.empty())) {
        return;
    }
    Entry &entry = points_.emplace_back(
        Entry{point.at.position, point.at.height, reference, point.name, point.id, point.code, point.description});
    addTo(byName_, entry.name, entry, &Entry::nextOfName);
    addTo(byId_, entry.id, entry, &Entry::nextOfId);
}

void LandXmlPointTable::addTo(Entries &entries, std::string_view key, Entry &entry, Next next)
{
    if (key.empty()) {
        return;
    }
    const auto [place, isNew] = entries.try_emplace(key, Known{&entry, &entry, {}});
    if (!isNew) {
        place->second.last->*next = &entry;
        place->second.last = &entry;
    }
}

/// The points of a name, and how they are linked; null where there are none.
std::pair<const LandXmlPointTable::Known *, LandXmlPointTable::Next>
LandXmlPointTable::known(std::string_view name) const
{
    if (const auto point = byName_.find(name); point != byName_.end()) {
        return {&point->second, &Entry::nextOfName};
    }
    const auto point = byId_.find(name);
    return {point != byId_.end() ? &point->second : nullptr, &Entry::nextOfId};
}

/// The point with the position that a point has or refers to; null where there is none.
const LandXmlPointTable::Entry *LandXmlPointTable::resolved(const Entry *entry) const
{
    for (int step = 0; step <= longestChain && entry != nullptr && !entry->position; ++step) {
        const Known *next = known(entry->reference).first;
        entry = next != nullptr ? next->entry : nullptr;
    }
    return entry != nullptr && entry->position ? entry : nullptr;
}

/// Whether points of one name are not one point.
bool LandXmlPointTable::isAmbiguous(const Known &known, Next next) const
{
    if (!known.isAmbiguous) {
        const Entry *const first = resolved(known.entry);
        const Entry *other = known.entry->*next;
        while (other != nullptr && resolved(other) == first) {
            other = other->*next;
        }
        known.isAmbiguous = other != nullptr;
    }
    return *known.isAmbiguous;
}

bool LandXmlPointTable::isUnreadable(std::string_view name) const
{
    for (int step = 0; step <= longestChain; ++step) {
        const Known *const point = known(name).first;
        if (point == nullptr || point->entry->position) {
            return false;
        }
        if (point->entry->reference.empty()) {
            return true;
        }
        name = point->entry->reference;
    }
    return false;
}

std::optional<LandXmlPointTable::Found> LandXmlPointTable::find(std::string_view name) const
{
    const auto take = [](std::string_view &text, const std::string &from) {
        text = text.empty() ? std::string_view(from) : text;
    };
    Found found;
    std::string_view next = name;
    for (int step = 0; step <= longestChain; ++step) {
        const auto [point, link] = known(next);
        if (point == nullptr) {
            return std::nullopt;
        }
        const Entry &entry = *point->entry;
        take(found.name, entry.name);
        take(found.code, entry.code);
        take(found.description, entry.description);
        found.isAmbiguous = found.isAmbiguous || isAmbiguous(*point, link);
        if (entry.position) {
            found.position = *entry.position;
            found.height = entry.height;
            return found;
        }
        next = entry.reference;
    }
    return std::nullopt;
}

} // namespace kareport
