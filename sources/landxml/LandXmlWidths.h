#pragma once

#include "LandXmlModel.h"
#include "LandXmlNotes.h"

#include <cstddef>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

namespace kareport
{

/// How wide the zones beside an alignment are, as the file stores them.
class LandXmlWidths
{
public:
    /// Adds a zone, unless there are more than a road has: each of them has to be looked at for a place.
    /// @param notes  receives widths that are not whole
    /// @return whether it was added
    bool add(const LandXmlZone &stored, LandXmlNotes &notes);

    /// The width of all zones of a side together, in metres; not a number where no zone has one. Where two pieces of a zone
    /// meet, that of the piece ahead.
    /// @param station  counted without equations
    double at(double station, bool isRight) const;

private:
    /// The pieces of a zone in the order of their stations.
    struct Zone
    {
        bool isRight;
        std::vector<LandXmlWidth> pieces;
    };

    std::vector<Zone> zones_;
};

/// The widths of the alignments of a file, by the names of the alignments.
class LandXmlWidthTable
{
public:
    /// Takes the zones of each side from the first grade surface of the alignment that has some: others are other layers of the
    /// same road. @param notes  receives what is not taken
    void fill(const std::vector<LandXmlGradeSurface> &surfaces, const std::vector<LandXmlAlignment> &alignments,
              LandXmlNotes &notes);
    /// The widths beside an alignment; null where the file has none. Valid as long as the table.
    const LandXmlWidths *find(const std::string &alignment) const;

private:
    /// The widths beside an alignment, and the bytes of the grade surfaces that those of its left and its right side are from.
    struct Known
    {
        LandXmlWidths widths;
        std::optional<std::size_t> left;
        std::optional<std::size_t> right;
        std::size_t others = 0; ///< grade surfaces with zones that were not taken
    };

    static void take(const LandXmlGradeSurface &surface, Known &known, LandXmlNotes &notes);

    std::unordered_map<std::string, Known> byName_; ///< of all alignments
};

} // namespace kareport
