#pragma once

#include "LandXmlModel.h"

#include <deque>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>

namespace kareport
{

/// The points of a file by their names, for coordinates that refer to them.
class LandXmlPointTable
{
public:
    /// Adds a point under its name and its identifier. Of several points with one name the first is found. A name counts
    /// before an identifier: many programs number both, from different points. A point that refers to another one of its own
    /// name is the same point in another group.
    ///
    /// A point takes up to 400 bytes, and where its texts are long, up to twice their bytes. The reader counts 30 bytes of the
    /// file for each, so that the table takes at most 16 times the memory of the file, and 14 MB.
    void add(const LandXmlPoint &point);

    /// A point that was found. The texts are empty where it has none, and valid as long as the table.
    struct Found
    {
        PlanePoint position;
        double height = notGiven;
        std::string_view name;
        std::string_view code;
        std::string_view description;
        bool isAmbiguous = false; ///< several points have the name
    };
    /// Whether the point of a name is there, and its coordinates, or those of the point that it refers to, cannot be read.
    bool isUnreadable(std::string_view name) const;
    /// The point of a name. It may itself refer to another one, and what it does not say is then that one's. Nothing when
    /// there is no such point, or it refers to itself in the end.
    std::optional<Found> find(std::string_view name) const;

private:
    struct Entry
    {
        std::optional<PlanePoint> position;
        double height;
        std::string reference;
        std::string name;
        std::string id;
        std::string code;
        std::string description;
        Entry *nextOfName = nullptr; ///< another point of the name, or of the identifier
        Entry *nextOfId = nullptr;
    };
    struct Known
    {
        const Entry *entry;
        Entry *last;
        mutable std::optional<bool> isAmbiguous; ///< once it was asked for
    };
    using Entries = std::unordered_map<std::string_view, Known>;
    using Next = Entry *Entry::*;

    static constexpr int longestChain = 100; ///< of references

    static void addTo(Entries &entries, std::string_view key, Entry &entry, Next next);
    std::pair<const Known *, Next> known(std::string_view name) const;
    const Entry *resolved(const Entry *entry) const;
    bool isAmbiguous(const Known &known, Next next) const;

    std::deque<Entry> points_; ///< they stay where they are
    Entries byName_;
    Entries byId_;
};

} // namespace kareport
