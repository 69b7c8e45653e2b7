#include "SectionRows.h"

#include "VariableType.h"
#include "Xlate.h"

#include <algorithm>
#include <cmath>

namespace kareport
{

struct SectionRows::Variables
{
    using Rows = SectionRows;
    static const LandXmlSectionPoint &point(const Rows &rows) { return rows.surface_->points[rows.index_]; }
    static LandXmlValue coordinate(const Rows &rows, double PlanePoint::*part)
    {
        if (!rows.place_) {
            return {};
        }
        return valueOf(pointBeside(rows.place_->point, rows.place_->bearing, point(rows).offset).*part);
    }

    static LandXmlValue width(const Rows &rows, bool isRight)
    {
        const LandXmlWidths *widths = rows.model_.widths.find(rows.route_->stored->name);
        return widths != nullptr ? valueOf(widths->at(rows.section_->station, isRight)) : LandXmlValue();
    }

    static constexpr LandXmlGetter<Rows> getters[] = {
        {"Alignment", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.route_->stored->name); }},
        {"Station", VARIABLE_STATION,
         [](const Rows &rows) { return valueOf(rows.route_->stationing.nameOf(rows.section_->station).station); }},
        {"Section", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.section_->name); }},
        {"Surface", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.surface_->name); }},
        {"IsDesign", VARIABLE_BOOLEAN,
         [](const Rows &rows) { return LandXmlValue(rows.surface_->isDesign ? 1.0 : 0.0); }},
        {"Side", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.surface_->side); }},
        {"Material", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.surface_->material); }},
        {"Point", VARIABLE_INTEGER, [](const Rows &rows) { return countOf(rows.index_ + 1); }},
        {"Code", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(point(rows).code); }},
        {"Offset", VARIABLE_OFFSET, [](const Rows &rows) { return valueOf(point(rows).offset); }},
        {"Elevation", VARIABLE_ELEVATION, [](const Rows &rows) { return valueOf(point(rows).height); }},
        {"Northing", VARIABLE_COORDINATE, [](const Rows &rows) { return coordinate(rows, &PlanePoint::northing); }},
        {"Easting", VARIABLE_COORDINATE, [](const Rows &rows) { return coordinate(rows, &PlanePoint::easting); }},
        {"Width", VARIABLE_LENGTH, [](const Rows &rows) { return valueOf(rows.surface_->width); }},
        {"Thickness", VARIABLE_LENGTH, [](const Rows &rows) { return valueOf(rows.surface_->thickness); }},
        {"LeftWidth", VARIABLE_LENGTH, [](const Rows &rows) { return width(rows, false); }},
        {"RightWidth", VARIABLE_LENGTH, [](const Rows &rows) { return width(rows, true); }},
        {"CutArea", VARIABLE_AREA, [](const Rows &rows) { return valueOf(rows.section_->cutArea); }},
        {"FillArea", VARIABLE_AREA, [](const Rows &rows) { return valueOf(rows.section_->fillArea); }},
    };
};

std::vector<LandXmlVariable> SectionRows::variables() const
{
    return variablesOf(Variables::getters);
}

LandXmlValue SectionRows::value(std::size_t variable) const
{
    return Variables::getters[variable].get(*this);
}

bool SectionRows::load()
{
    LandXmlWants wants;
    wants.sections = true;
    wants.gradeSurfaces = isAsked("LeftWidth") || isAsked("RightWidth");
    if (!readNamedAlignments(model_, wants)) {
        return false;
    }
    for (const LandXmlRoute &route : model_.routes) {
        for (const LandXmlSection &section : route.stored->sections) {
            noteStation(route, section);
            for (const LandXmlSectionSurface &layer : section.surfaces) {
                const std::size_t points = surfaces_.matches(layer.name) ? layer.points.size() : 0;
                for (std::size_t i = 0; i < points; ++i) {
                    rows_.push_back({&route, &section, &layer, i});
                }
            }
        }
    }
    count_ = rows_.size();
    return expectNames();
}

/// How far along the alignment a section is. Stations have few digits: one that these put before the start or after the end is
/// at it.
double SectionRows::distanceOf(const LandXmlRoute &route, const LandXmlSection &section) const
{
    const double distance = section.station - route.stationing.start();
    const double inside = std::clamp(distance, 0.0, route.alignment.length());
    return std::fabs(distance - inside) <= source_.query.tolerance.length ? inside : distance;
}

/// Notes a section that is beyond the ends of its alignment: its points have no coordinates.
void SectionRows::noteStation(const LandXmlRoute &route, const LandXmlSection &section)
{
    const bool isBeside = !route.fault && !route.alignment.elements().empty();
    if (isBeside && !route.alignment.at(distanceOf(route, section))) {
        modelNotes_.add(section.byte,
                        Xlate("the cross section is before the start or after the end of the alignment: its "
                              "points have no coordinates"));
    }
}

void SectionRows::take(std::size_t index)
{
    const Row &row = rows_[index];
    const bool isNew = section_ != row.section;
    route_ = row.route;
    section_ = row.section;
    surface_ = row.surface;
    index_ = row.point;
    if (isNew) {
        const bool isPlaced = !route_->fault && !section_->isSkew;
        place_ = isPlaced ? route_->alignment.at(distanceOf(*route_, *section_)) : std::nullopt;
    }
}

} // namespace kareport
