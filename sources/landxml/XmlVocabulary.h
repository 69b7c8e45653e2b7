#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace kareport
{

/// Which prefixes of an XML file mean the vocabulary of its outermost element. What a name costs does not depend on how
/// many prefixes are declared.
class XmlVocabulary
{
public:
    /// Takes the declarations of an element that begins.
    /// @param pairs  names and values of its attributes in order, with a null at the end
    /// @param depth  of the element, 1 for the outermost one
    void begin(std::string_view name, const char *const *pairs, int depth);
    /// Ends the declarations of the element of a depth.
    void end(int depth);
    /// Whether an element belongs to the vocabulary. @param name  with its prefix
    bool has(std::string_view name) const;
    /// The name of an element after its prefix.
    static std::string_view withoutPrefix(std::string_view name)
    {
        const std::size_t colon = name.find(':');
        return colon == std::string_view::npos ? name : name.substr(colon + 1);
    }

private:
    struct Hash : std::hash<std::string_view>
    {
        using is_transparent = void;
    };
    /// Whether a prefix means the vocabulary, the innermost declaration last.
    using Declarations = std::vector<bool>;
    using Prefixes = std::unordered_map<std::string, Declarations, Hash, std::equal_to<>>;

    struct Open
    {
        Declarations *declarations;
        int depth;
    };

    std::string uri_; ///< of the vocabulary; empty where the outermost element has none
    std::string rootPrefix_;
    Prefixes prefixes_;
    const Declarations *root_ = nullptr; ///< those of the outermost element's prefix, which most elements have
    std::vector<Open> open_;             ///< all declarations that hold, in order
};

} // namespace kareport
