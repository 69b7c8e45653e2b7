#pragma once

#include "Alignment.h"
#include "LandXmlProfile.h"
#include "Stationing.h"

#include <optional>
#include <variant>
#include <vector>

namespace kareport
{

/// The geometry of a stored alignment.
struct LandXmlRoute
{
    /// An element of the alignment along it.
    struct Piece
    {
        std::size_t element;            ///< index among the stored ones
        double start;                   ///< distance from the alignment's start
        double length;                  ///< 0 where it is not known
        std::vector<PlaneCurve> curves; ///< none where it has no geometry
        bool isPlaced = true;           ///< `start` is known: the length of each element before it is
    };

    const LandXmlAlignment *stored = nullptr;
    std::vector<Piece> pieces; ///< elements of no length are left out
    Alignment alignment;       ///< all curves, up to the first element without
    double length = 0;
    bool isLengthKnown = true; ///< not where an element has neither a geometry nor a stated length
    Stationing stationing{0};
    std::vector<std::variant<LandXmlProfile, LandXmlFault>> profiles; ///< of the grade lines, in their order
    std::optional<LandXmlFault> fault;                                ///< why places along it are not known
    std::optional<LandXmlFault> stationFault;                         ///< why places along it have no stations
    std::vector<bool> isSurfaceSound;                                 ///< of the stored surfaces: their stations ascend

    /// The station of a distance. @param back  the name that a place on an equation has before it
    Stationing::Name nameOf(double distance, bool back = false) const
    {
        return stationing.nameOf(distance + stationing.start(), back);
    }
    /// The grade line of a name, or the first where it is empty; null when there is none, or it has no geometry.
    const VerticalProfile *profile(const std::string &name) const;
    /// The surface of a name along the alignment, or the first where it is empty; null when there is none, or its stations do
    /// not ascend.
    const LandXmlHeightLine *surface(const std::string &name) const;
};

/// The height on a line at a station, between two points of a piece; nothing outside, and in the gap between two pieces.
std::optional<double> heightOn(const LandXmlHeightLine &line, double station);

/// Makes the geometry of alignments whose references are resolved, and notes what does not fit together. @return one for
/// each. They refer to the alignments, which must outlive them
std::vector<LandXmlRoute> routesOf(const std::vector<const LandXmlAlignment *> &alignments,
                                   LandXmlComparison &comparison, LandXmlNotes &notes);

} // namespace kareport
