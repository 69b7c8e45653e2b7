#pragma once

#include "LandXmlModel.h"

#include <deque>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>

namespace kareport
{

/// The points of a file by their names, for coordinates that refer to them.
class LandXmlPointTable
{
public:
    /// Adds a point under its name and its identifier. Of several points with one name the first is found. A name counts
    /// before an identifier: many programs number both, from different points. A point that refers to its own name is the
    /// same point in another group, and is not added.
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
    };
    struct Known
    {
        const Entry *entry;
        bool isAmbiguous;
    };
    using Entries = std::unordered_map<std::string_view, Known>;

    static void addTo(Entries &entries, std::string_view key, const Entry &entry);
    const Known *known(std::string_view name) const;

    std::deque<Entry> points_; ///< they stay where they are
    Entries byName_;
    Entries byId_;
};

} // namespace kareport
