#include "StationRows.h"

#include "StationPlaces.h"
#include "VariableType.h"
#include "Xlate.h"

#include <algorithm>
#include <iterator>

namespace kareport
{

namespace
{

enum class OffsetPart
{
    Offset,
    Northing,
    Easting,
    Elevation
};

/// The variables of a point beside the alignment.
constexpr struct
{
    OffsetPart part;
    const char *name;
    int type;
} offsetVariables[] = {{OffsetPart::Offset, "Offset", VARIABLE_OFFSET},
                       {OffsetPart::Northing, "Northing", VARIABLE_COORDINATE},
                       {OffsetPart::Easting, "Easting", VARIABLE_COORDINATE},
                       {OffsetPart::Elevation, "Elevation", VARIABLE_ELEVATION}};

} // namespace

struct StationRows::Variables
{
    using Rows = StationRows;
    static Stationing::Name name(const Rows &rows) { return rows.route_->nameOf(rows.distance_); }
    static LandXmlValue border(const Rows &rows)
    {
        bool isEnd = false;
        const LandXmlRoute::Piece *piece = rows.borderAt(rows.distance_, isEnd);
        if (piece == nullptr) {
            return {};
        }
        const LandXmlElement &element = rows.route_->stored->elements[piece->element];
        return valueOf(isEnd ? element.end.name : element.start.name);
    }

    static LandXmlValue width(const Rows &rows, bool isRight)
    {
        return valueOf(rows.widthAt(rows.distance_ + rows.route_->stationing.start(), isRight));
    }

    static constexpr LandXmlGetter<Rows> getters[] = {
        {"Alignment", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.route_->stored->name); }},
        {"Station", VARIABLE_STATION, [](const Rows &rows) { return valueOf(name(rows).station); }},
        {"StationBack", VARIABLE_STATION,
         [](const Rows &rows) {
             return rows.equation_ != nullptr ? valueOf(rows.route_->nameOf(rows.distance_, true).station)
                                              : LandXmlValue();
         }},
        {"Region", VARIABLE_INTEGER, [](const Rows &rows) { return countOf(name(rows).region); }},
        {"Along", VARIABLE_LENGTH, [](const Rows &rows) { return valueOf(rows.distance_); }},
        {"Point", VARIABLE_TEXT, [](const Rows &rows) { return border(rows); }},
        {"Northing", VARIABLE_COORDINATE, [](const Rows &rows) { return northingOf(rows.place_); }},
        {"Easting", VARIABLE_COORDINATE, [](const Rows &rows) { return eastingOf(rows.place_); }},
        {"Bearing", VARIABLE_BEARING, [](const Rows &rows) { return bearingOf(rows.place_); }},
        {"Radius", VARIABLE_LENGTH,
         [](const Rows &rows) {
             return rows.place_ ? valueOf(signedRadiusOf(rows.place_->curvature)) : LandXmlValue();
         }},
        {"Design", VARIABLE_ELEVATION, [](const Rows &rows) { return valueOf(rows.design_); }},
        {"Grade", VARIABLE_DOUBLE,
         [](const Rows &rows) { return rows.grade_ ? valueOf(*rows.grade_ * 100) : LandXmlValue(); }},
        {"Ground", VARIABLE_ELEVATION, [](const Rows &rows) { return valueOf(rows.ground_); }},
        {"CutFill", VARIABLE_LENGTH,
         [](const Rows &rows) {
             return rows.design_ && rows.ground_ ? valueOf(*rows.design_ - *rows.ground_) : LandXmlValue();
         }},
        {"LeftWidth", VARIABLE_LENGTH, [](const Rows &rows) { return width(rows, false); }},
        {"RightWidth", VARIABLE_LENGTH, [](const Rows &rows) { return width(rows, true); }},
    };
};

std::vector<LandXmlVariable> StationRows::variables() const
{
    std::vector<LandXmlVariable> variables = variablesOf(Variables::getters);
    for (std::size_t offset = 1; offset <= source_.query.offsets.size(); ++offset) {
        for (const auto &variable : offsetVariables) {
            variables.push_back({QString::fromLatin1(variable.name) + QString::number(offset), variable.type});
        }
    }
    return variables;
}

LandXmlValue StationRows::value(std::size_t variable) const
{
    constexpr std::size_t own = std::size(Variables::getters);
    constexpr std::size_t parts = std::size(offsetVariables);
    return variable < own ? Variables::getters[variable].get(*this)
                          : offsetValue((variable - own) / parts, (variable - own) % parts);
}

LandXmlValue StationRows::offsetValue(std::size_t offset, std::size_t variable) const
{
    const LandXmlOffset &line = source_.query.offsets[offset];
    switch (offsetVariables[variable].part) {
    case OffsetPart::Offset: return valueOf(line.offset);
    case OffsetPart::Northing: return place_ ? valueOf(place_->point.northing - line.offset * sine_) : LandXmlValue();
    case OffsetPart::Easting: return place_ ? valueOf(place_->point.easting + line.offset * cosine_) : LandXmlValue();
    case OffsetPart::Elevation: break;
    }
    return design_ && line.crossfall ? valueOf(*design_ + std::fabs(line.offset) * *line.crossfall / 100)
                                     : LandXmlValue();
}

/// The element that begins at a distance, or at the end the one that ends there; null where there is no border.
const LandXmlRoute::Piece *StationRows::borderAt(double distance, bool &isEnd) const
{
    const auto &pieces = route_->pieces;
    const auto next = std::lower_bound(pieces.begin(), pieces.end(), distance - samePlace,
                                       [](const LandXmlRoute::Piece &piece, double at) { return piece.start < at; });
    if (next != pieces.end() && next->start <= distance + samePlace) {
        return &*next;
    }
    isEnd = distance >= route_->length - samePlace;
    return isEnd ? &pieces.back() : nullptr;
}

double StationRows::widthAt(double internal, bool isRight) const
{
    const LandXmlWidths *widths = lines_[rowRoute_].widths;
    return widths != nullptr ? widths->at(internal, isRight) : notGiven;
}

void StationRows::take(std::size_t index)
{
    const Row &row = rows_[index];
    rowRoute_ = row.route;
    route_ = &model_.routes[row.route];
    distance_ = row.distance;
    // The lengths of many curves add up to an end that differs by their last digits.
    place_ = route_->alignment.at(std::min(distance_, route_->alignment.length()));
    sine_ = place_ ? std::sin(place_->bearing) : 0;
    cosine_ = place_ ? std::cos(place_->bearing) : 1;
    const Lines &lines = lines_[row.route];
    const double internal = distance_ + route_->stationing.start();
    design_ = lines.profile != nullptr ? lines.profile->heightAt(internal) : std::nullopt;
    grade_ = lines.profile != nullptr ? lines.profile->gradeAt(internal) : std::nullopt;
    ground_ = lines.surface != nullptr ? heightOn(*lines.surface, internal) : std::nullopt;
    equation_ = route_->stationing.equationAt(internal);
}

} // namespace kareport
