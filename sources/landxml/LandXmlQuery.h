#pragma once

#include "LandXmlComparison.h"

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
    Courses, ///< the sides of the parcels, in order
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

/// Which rows a job wants of a file. Lengths are in metres unless `unit` says otherwise.
struct LandXmlQuery
{
    LandXmlListKind kind = LandXmlListKind::Points;
    /// Only what belongs to this: a group of points, a surface, a parcel or an alignment; everything where it is empty. The
    /// points of `OffsetsOf` are of this group. A name here, or one of those below, that the file does not have is an error.
    QString name;
    LandXmlTolerance tolerance;

    QString alignment; ///< of `OffsetsOf`; may be empty when there is one alone
    /// Of `Profile`: the grade lines of this name alone. Of `Stations` and `OffsetsOf`: the one of this name, or the
    /// alignment's first where it is empty. Other lists must not ask for one.
    QString gradeLine;
    /// Of `CrossSections`: the surfaces of this name alone. Of `Stations`: the one of this name along the alignment, or the
    /// first where it is empty. Other lists must not ask for one.
    QString surface;

    /// Metres in the unit of `interval`, `stations` and `offsets`; nothing for the unit of the file's lengths, which is not
    /// known before the file is read.
    std::optional<double> unit = 1.0;

    // Of stations:
    double interval = 0;          ///< none at 0
    bool fromRound = false;       ///< the interval counts from round stations, not from the alignment's start
    bool atElements = true;       ///< where elements begin and end, too
    std::vector<double> stations; ///< others; each wherever the alignment has it
    std::vector<LandXmlOffset> offsets;
};

} // namespace kareport
