#include "LandXmlPointTable.h"

namespace kareport
{

void LandXmlPointTable::add(const LandXmlPoint &point)
{
    const std::string &reference = point.at.reference;
    const bool isAlias = !point.at.position && (reference == point.name || reference == point.id);
    if (isAlias || (point.name.empty() && point.id.empty())) {
        return;
    }
    const Entry &entry = points_.emplace_back(
        Entry{point.at.position, point.at.height, reference, point.name, point.id, point.code, point.description});
    addTo(byName_, entry.name, entry);
    addTo(byId_, entry.id, entry);
}

void LandXmlPointTable::addTo(Entries &entries, std::string_view key, const Entry &entry)
{
    if (key.empty()) {
        return;
    }
    const auto [known, isNew] = entries.try_emplace(key, Known{&entry, false});
    known->second.isAmbiguous = !isNew;
}

const LandXmlPointTable::Known *LandXmlPointTable::known(std::string_view name) const
{
    if (const auto point = byName_.find(name); point != byName_.end()) {
        return &point->second;
    }
    const auto point = byId_.find(name);
    return point != byId_.end() ? &point->second : nullptr;
}

std::optional<LandXmlPointTable::Found> LandXmlPointTable::find(std::string_view name) const
{
    const auto take = [](std::string_view &text, const std::string &from) {
        text = text.empty() ? std::string_view(from) : text;
    };
    Found found;
    std::string_view next = name;
    constexpr int longestChain = 100;
    for (int step = 0; step <= longestChain; ++step) {
        const Known *point = known(next);
        if (point == nullptr) {
            return std::nullopt;
        }
        const Entry &entry = *point->entry;
        take(found.name, entry.name);
        take(found.code, entry.code);
        take(found.description, entry.description);
        found.isAmbiguous = found.isAmbiguous || point->isAmbiguous;
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
