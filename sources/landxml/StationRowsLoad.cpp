#include "StationRows.h"

#include "StationPlaces.h"
#include "Xlate.h"

#include <algorithm>
#include <string>

// Which places along alignments are listed, and the notes on them.

namespace kareport
{

bool StationRows::load()
{
    LandXmlWants wants;
    wants.surfaceLines = true;
    wants.gradeSurfaces = isAsked("LeftWidth") || isAsked("RightWidth");
    if (!readNamedAlignments(model_, wants)) {
        return false;
    }
    const std::string gradeLine = source_.query.gradeLine.toStdString();
    const std::string surface = source_.query.surface.toStdString();
    for (std::size_t i = 0; i < model_.routes.size(); ++i) {
        const LandXmlRoute &route = model_.routes[i];
        lines_.push_back({route.profile(gradeLine), route.surface(surface), model_.widths.find(route.stored->name)});
        lookAtNames(*route.stored);
        if (!addRoute(i)) {
            return false;
        }
    }
    count_ = rows_.size();
    return expectNames();
}

void StationRows::lookAtNames(const LandXmlAlignment &alignment)
{
    for (const LandXmlGradeLine &line : alignment.gradeLines) {
        gradeLines_.matches(line.name);
    }
    for (const LandXmlHeightLine &line : alignment.surfaceLines) {
        surfaces_.matches(line.name);
    }
    if (isDesignAsked()) {
        noteOtherGradeLines(alignment);
    }
    if (isAsked("Ground") || isAsked("CutFill")) {
        noteOtherSurfaces(alignment);
    }
}

/// Whether a height of the grade line is asked for.
bool StationRows::isDesignAsked() const
{
    bool isAskedFor = isAsked("Design") || isAsked("Grade") || isAsked("CutFill");
    for (std::size_t offset = 1; offset <= source_.query.offsets.size(); ++offset) {
        isAskedFor = isAskedFor || isAsked(("Elevation" + std::to_string(offset)).c_str());
    }
    return isAskedFor;
}

/// Adds the rows of an alignment.
bool StationRows::addRoute(std::size_t index)
{
    const LandXmlRoute &route = model_.routes[index];
    if (route.fault) {
        fail(*route.fault);
        return false;
    }
    if (route.alignment.elements().empty()) {
        modelNotes_.add(route.stored->byte, Xlate("the alignment has no elements, and therefore no stations"));
        return true;
    }
    noteOffsetsPastCentres(route);
    const auto distances =
        StationPlaces(source_.query, source_.unit, modelNotes_).of(route, most - std::min(most, rows_.size()));
    if (!distances) {
        fail(route.stored->byte, Xlate("the interval gives more than %1 stations").arg(most));
        return false;
    }
    for (const double distance : *distances) {
        rows_.push_back({index, distance});
    }
    return true;
}

/// Notes lines beside the alignment that are at the centre of an element, or past it: they turn back there, and their points
/// are not fit to be set out.
void StationRows::noteOffsetsPastCentres(const LandXmlRoute &route)
{
    const auto length = [this](double metres) { return QString::number(metres / source_.unit, 'f', 3); };
    for (const LandXmlRoute::Piece &piece : route.pieces) {
        for (const PlaneCurve &curve : piece.curves) {
            const auto [low, high] = std::minmax({curve.startCurvature(), curve.endCurvature()});
            for (const LandXmlOffset &line : source_.query.offsets) {
                const double curvature = line.offset > 0 ? high : low;
                if (line.offset * curvature >= 1) {
                    modelNotes_.add(
                        route.stored->elements[piece.element].byte,
                        Xlate("the line at the offset %1 does not run forward here: the radius of the element is "
                              "%2")
                            .arg(length(line.offset), length(radiusOf(curvature))));
                }
            }
        }
    }
}

} // namespace kareport
