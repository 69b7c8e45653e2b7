#pragma once

#include "LandXmlGeometry.h"

#include <QString>
#include <QStringView>

#include <optional>
#include <vector>

namespace kareport
{

/// What the rows are.
enum class LandXmlListKind
{
    Points,        ///< coordinate geometry points
    SurfacePoints, ///< points of the surfaces' definitions
    Parcels,
    Courses, ///< the sides of the parcels, in turn
    Alignments,
    Elements,      ///< of the alignments' horizontal geometry, as they are stored
    Stations,      ///< places along the alignments, with points beside them
    Profile,       ///< points of the grade lines with their vertical curves
    CrossSections, ///< points of the cross sections
    OffsetsOf      ///< points, projected onto an alignment
};

/// The kind of a key such as "points" or "offsetsOf"; nothing for any other text. Case matters.
std::optional<LandXmlListKind> landXmlListFromKey(QStringView key);
/// The key of a kind.
QStringView keyOf(LandXmlListKind kind);

/// A line beside an alignment.
struct LandXmlOffset
{
    double offset = 0; ///< metres, positive to the right
    std::optional<double>
        crossfall; ///< percent: how much the height rises away from the alignment, below zero where it
                   ///< falls; without it the points have no height
};

/// Which rows a job wants of a file. Lengths are in metres.
struct LandXmlQuery
{
    LandXmlListKind kind = LandXmlListKind::Points;
    /// Only what belongs to this: a group of points, a surface, a parcel or an alignment; everything where it is empty. The
    /// points of `OffsetsOf` are of this group.
    QString name;
    LandXmlTolerance tolerance;

    // Of stations and of projected points:
    QString alignment; ///< of `OffsetsOf`; may be empty when there is one alone
    QString gradeLine; ///< its name; the alignment's first where it is empty
    QString surface;   ///< along the alignment: its name; the first where it is empty

    // Of stations:
    double interval = 0;          ///< none at 0
    bool fromRound = false;       ///< the interval counts from round stations, not from the alignment's start
    bool atElements = true;       ///< where elements begin and end, too
    std::vector<double> stations; ///< others; each wherever the alignment has it
    std::vector<LandXmlOffset> offsets;
};

} // namespace kareport
