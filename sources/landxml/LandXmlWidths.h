#pragma once

#include "LandXmlModel.h"
#include "LandXmlNotes.h"

#include <string>
#include <unordered_map>
#include <vector>

namespace kareport
{

/// How wide the zones beside an alignment are, as the file stores them.
class LandXmlWidths
{
public:
    /// Adds a zone, unless there are more than a road has: a place would have to look at each of them.
    /// @return whether it was added
    bool add(const LandXmlZone &stored);

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
    /// @param notes  receives zones that cannot be taken
    void fill(const std::vector<LandXmlGradeSurface> &surfaces, const std::vector<LandXmlAlignment> &alignments,
              LandXmlNotes &notes);
    /// The widths beside an alignment; null where the file has none. Valid as long as the table.
    const LandXmlWidths *find(const std::string &alignment) const;

private:
    std::unordered_map<std::string, LandXmlWidths> byName_; ///< of all alignments
};

} // namespace kareport
