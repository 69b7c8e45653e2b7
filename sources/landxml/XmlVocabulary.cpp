#include "XmlVocabulary.h"

#include <optional>

namespace kareport
{

namespace
{

std::string_view prefixOf(std::string_view name)
{
    const std::size_t colon = name.find(':');
    return colon == std::string_view::npos ? std::string_view() : name.substr(0, colon);
}

/// The prefix that an attribute declares; nothing for any other attribute.
std::optional<std::string_view> declaredPrefix(std::string_view attribute)
{
    constexpr std::string_view keyword = "xmlns";
    if (!attribute.starts_with(keyword)) {
        return std::nullopt;
    }
    if (attribute.size() == keyword.size()) {
        return std::string_view();
    }
    return attribute[keyword.size()] == ':' ? std::optional(attribute.substr(keyword.size() + 1)) : std::nullopt;
}

} // namespace

void XmlVocabulary::begin(std::string_view name, const char *const *pairs, int depth)
{
    if (depth == 1) {
        rootPrefix_ = prefixOf(name);
        for (const char *const *pair = pairs; *pair != nullptr; pair += 2) {
            if (declaredPrefix(pair[0]) == rootPrefix_) {
                uri_ = pair[1];
            }
        }
    }
    for (const char *const *pair = pairs; *pair != nullptr; pair += 2) {
        if (pair[0][0] != 'x') {
            continue; // as nearly all are
        }
        if (const auto prefix = declaredPrefix(pair[0])) {
            auto known = prefixes_.find(*prefix);
            if (known == prefixes_.end()) {
                known = prefixes_.emplace(*prefix, Declarations()).first;
            }
            known->second.push_back(uri_ == pair[1]);
            open_.push_back({&known->second, depth});
            root_ = *prefix == rootPrefix_ ? &known->second : root_;
        }
    }
}

void XmlVocabulary::end(int depth)
{
    while (!open_.empty() && open_.back().depth >= depth) {
        open_.back().declarations->pop_back();
        open_.pop_back();
    }
}

bool XmlVocabulary::has(std::string_view name) const
{
    const std::string_view prefix = prefixOf(name);
    const Declarations *declarations = root_;
    if (prefix != rootPrefix_) {
        const auto known = prefixes_.find(prefix);
        declarations = known != prefixes_.end() ? &known->second : nullptr;
    }
    const bool isDeclared = declarations != nullptr && !declarations->empty();
    return isDeclared ? declarations->back() : prefix == rootPrefix_;
}

} // namespace kareport
