#include "AlignmentRows.h"

#include "CurveFit.h"
#include "VariableType.h"
#include "Xlate.h"

#include <limits>

namespace kareport
{

namespace
{

constexpr double infinite = std::numeric_limits<double>::infinity();

LandXmlValue northingOf(const std::optional<PlanePoint> &point)
{
    return point ? valueOf(point->northing) : LandXmlValue();
}

LandXmlValue eastingOf(const std::optional<PlanePoint> &point)
{
    return point ? valueOf(point->easting) : LandXmlValue();
}

LandXmlValue northingOf(const std::optional<CurvePlace> &place)
{
    return place ? valueOf(place->point.northing) : LandXmlValue();
}

LandXmlValue eastingOf(const std::optional<CurvePlace> &place)
{
    return place ? valueOf(place->point.easting) : LandXmlValue();
}

LandXmlValue bearingOf(const std::optional<CurvePlace> &place)
{
    return place ? valueOf(place->bearing) : LandXmlValue();
}

double radiusOf(double curvature)
{
    return curvature == 0 ? infinite : std::fabs(1 / curvature);
}

LandXmlValue count(std::size_t number)
{
    return static_cast<double>(number);
}

} // namespace

struct AlignmentRows::Variables
{
    using Rows = AlignmentRows;
    static std::optional<CurvePlace> at(const Rows &rows, double distance)
    {
        return rows.route_->fault ? std::nullopt : rows.route_->alignment.at(distance);
    }
    static LandXmlValue length(const Rows &rows)
    {
        return rows.route_->isLengthKnown ? valueOf(rows.route_->length) : LandXmlValue();
    }
    static constexpr LandXmlGetter<Rows> getters[] = {
        {"Alignment", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.route_->stored->name); }},
        {"Description", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.route_->stored->description); }},
        {"Length", VARIABLE_LENGTH, [](const Rows &rows) { return length(rows); }},
        {"StartStation", VARIABLE_STATION, [](const Rows &rows) { return valueOf(rows.route_->nameOf(0).station); }},
        {"EndStation", VARIABLE_STATION,
         [](const Rows &rows) {
             return rows.route_->isLengthKnown ? valueOf(rows.route_->nameOf(rows.route_->length, true).station)
                                               : LandXmlValue();
         }},
        {"Elements", VARIABLE_INTEGER, [](const Rows &rows) { return count(rows.route_->stored->elements.size()); }},
        {"Equations", VARIABLE_INTEGER, [](const Rows &rows) { return count(rows.route_->stored->equations.size()); }},
        {"GradeLines", VARIABLE_INTEGER,
         [](const Rows &rows) { return count(rows.route_->stored->gradeLines.size()); }},
        {"StartNorthing", VARIABLE_COORDINATE, [](const Rows &rows) { return northingOf(at(rows, 0)); }},
        {"StartEasting", VARIABLE_COORDINATE, [](const Rows &rows) { return eastingOf(at(rows, 0)); }},
        {"EndNorthing", VARIABLE_COORDINATE,
         [](const Rows &rows) { return northingOf(at(rows, rows.route_->length)); }},
        {"EndEasting", VARIABLE_COORDINATE, [](const Rows &rows) { return eastingOf(at(rows, rows.route_->length)); }},
    };
};

std::vector<LandXmlVariable> AlignmentRows::variables() const
{
    return variablesOf(Variables::getters);
}

LandXmlValue AlignmentRows::value(std::size_t variable) const
{
    return Variables::getters[variable].get(*this);
}

bool AlignmentRows::load()
{
    if (!readAlignments(model_, {})) {
        return false;
    }
    for (const LandXmlRoute &route : model_.routes) {
        if (isNamed(route.stored->name)) {
            rows_.push_back(&route);
        }
    }
    count_ = rows_.size();
    return expectNames();
}

struct ElementRows::Variables
{
    using Rows = ElementRows;
    static double radius(const Rows &rows, double stored)
    {
        using Kind = LandXmlElement::Kind;
        const Kind kind = rows.element_->kind;
        switch (kind) {
        case Kind::Spiral: return stored;
        case Kind::Curve: return arcRadius(rows);
        case Kind::Other: return notGiven;
        default: return infinite;
        }
    }
    static double arcRadius(const Rows &rows)
    {
        return rows.start_ ? radiusOf(rows.start_->curvature) : rows.element_->radius;
    }
    static LandXmlValue typeOf(const LandXmlElement &element)
    {
        using Kind = LandXmlElement::Kind;
        switch (element.kind) {
        case Kind::Line: return "Line";
        case Kind::IrregularLine: return "IrregularLine";
        case Kind::Curve: return "Curve";
        case Kind::Spiral: return "Spiral";
        case Kind::Other: break;
        }
        return valueOf(element.form);
    }
    /// Of a clothoid, the root of its length over its change of curvature.
    static LandXmlValue parameter(const Rows &rows)
    {
        const LandXmlElement &element = *rows.element_;
        if (element.kind != LandXmlElement::Kind::Spiral || element.form != "clothoid") {
            return {};
        }
        const double change = std::fabs(1 / element.radiusStart - 1 / element.radiusEnd);
        return change > 0 ? valueOf(std::sqrt(element.length / change)) : LandXmlValue();
    }
    static LandXmlValue deflection(const Rows &rows)
    {
        double turn = 0;
        for (const PlaneCurve &curve : rows.piece_->curves) {
            turn += curve.turnTo(curve.length());
        }
        return rows.piece_->curves.empty() ? LandXmlValue() : valueOf(turn);
    }

    static constexpr LandXmlGetter<Rows> getters[] = {
        {"Alignment", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.route_->stored->name); }},
        {"Element", VARIABLE_INTEGER, [](const Rows &rows) { return count(rows.piece_->element + 1); }},
        {"Name", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.element_->name); }},
        {"Type", VARIABLE_TEXT, [](const Rows &rows) { return typeOf(*rows.element_); }},
        {"Form", VARIABLE_TEXT,
         [](const Rows &rows) {
             return rows.element_->kind == LandXmlElement::Kind::Spiral ? valueOf(rows.element_->form) : LandXmlValue();
         }},
        {"Rotation", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.element_->rotation); }},
        {"StartStation", VARIABLE_STATION,
         [](const Rows &rows) {
             return rows.piece_->isPlaced ? valueOf(rows.route_->nameOf(rows.piece_->start).station) : LandXmlValue();
         }},
        {"EndStation", VARIABLE_STATION,
         [](const Rows &rows) {
             const LandXmlRoute::Piece &piece = *rows.piece_;
             return piece.isPlaced && piece.length > 0
                        ? valueOf(rows.route_->nameOf(piece.start + piece.length, true).station)
                        : LandXmlValue();
         }},
        {"Length", VARIABLE_LENGTH,
         [](const Rows &rows) { return rows.piece_->length > 0 ? valueOf(rows.piece_->length) : LandXmlValue(); }},
        {"Radius", VARIABLE_LENGTH,
         [](const Rows &rows) {
             return rows.element_->kind == LandXmlElement::Kind::Spiral ? LandXmlValue() : valueOf(radius(rows, 0));
         }},
        {"StartRadius", VARIABLE_LENGTH,
         [](const Rows &rows) { return valueOf(radius(rows, rows.element_->radiusStart)); }},
        {"EndRadius", VARIABLE_LENGTH,
         [](const Rows &rows) { return valueOf(radius(rows, rows.element_->radiusEnd)); }},
        {"Parameter", VARIABLE_LENGTH, [](const Rows &rows) { return parameter(rows); }},
        {"StartBearing", VARIABLE_BEARING, [](const Rows &rows) { return bearingOf(rows.start_); }},
        {"EndBearing", VARIABLE_BEARING, [](const Rows &rows) { return bearingOf(rows.end_); }},
        {"Deflection", VARIABLE_ANGLE, [](const Rows &rows) { return deflection(rows); }},
        {"StartPoint", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.element_->start.name); }},
        {"StartNorthing", VARIABLE_COORDINATE, [](const Rows &rows) { return northingOf(rows.start_); }},
        {"StartEasting", VARIABLE_COORDINATE, [](const Rows &rows) { return eastingOf(rows.start_); }},
        {"EndPoint", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.element_->end.name); }},
        {"EndNorthing", VARIABLE_COORDINATE, [](const Rows &rows) { return northingOf(rows.end_); }},
        {"EndEasting", VARIABLE_COORDINATE, [](const Rows &rows) { return eastingOf(rows.end_); }},
        {"CentreNorthing", VARIABLE_COORDINATE, [](const Rows &rows) { return northingOf(rows.centre_); }},
        {"CentreEasting", VARIABLE_COORDINATE, [](const Rows &rows) { return eastingOf(rows.centre_); }},
        {"PINorthing", VARIABLE_COORDINATE, [](const Rows &rows) { return northingOf(rows.intersection_); }},
        {"PIEasting", VARIABLE_COORDINATE, [](const Rows &rows) { return eastingOf(rows.intersection_); }},
    };
};

std::vector<LandXmlVariable> ElementRows::variables() const
{
    return variablesOf(Variables::getters);
}

LandXmlValue ElementRows::value(std::size_t variable) const
{
    return Variables::getters[variable].get(*this);
}

bool ElementRows::load()
{
    if (!readAlignments(model_, {})) {
        return false;
    }
    for (const LandXmlRoute &route : model_.routes) {
        const std::size_t pieces = isNamed(route.stored->name) ? route.pieces.size() : 0;
        for (std::size_t i = 0; i < pieces; ++i) {
            rows_.emplace_back(&route, i);
        }
    }
    count_ = rows_.size();
    return expectNames();
}

void ElementRows::take(std::size_t index)
{
    route_ = rows_[index].first;
    piece_ = &route_->pieces[rows_[index].second];
    element_ = &route_->stored->elements[piece_->element];
    start_.reset();
    end_.reset();
    intersection_.reset();
    centre_.reset();
    if (!piece_->curves.empty()) {
        start_ = piece_->curves.front().start();
        end_ = piece_->curves.back().end();
        centre_ = centreOf(piece_->curves.front());
        if (piece_->curves.size() == 1) {
            intersection_ = tangentIntersection(piece_->curves.front());
        }
    }
}

struct ProfileRows::Variables
{
    using Rows = ProfileRows;
    using Kind = LandXmlGradePoint::Kind;
    static bool hasCurve(const Rows &rows)
    {
        return rows.vertex_ != nullptr && rows.vertex_->point.rounding != ProfilePoint::Rounding::None;
    }
    static const char *typeOf(Kind kind)
    {
        return kind == Kind::Point                 ? "PVI"
               : kind == Kind::Parabola            ? "ParaCurve"
               : kind == Kind::UnsymmetricParabola ? "UnsymParaCurve"
                                                   : "CircCurve";
    }
    static LandXmlValue percent(const Rows &rows, double VerticalProfile::Vertex::*grade)
    {
        return rows.vertex_ != nullptr ? valueOf(rows.vertex_->*grade * 100) : LandXmlValue();
    }
    static LandXmlValue height(const Rows &rows, double VerticalProfile::Vertex::*station)
    {
        return hasCurve(rows) ? valueOf(rows.heightAt(rows.vertex_->*station)) : LandXmlValue();
    }
    static LandXmlValue station(const Rows &rows, double VerticalProfile::Vertex::*station)
    {
        return hasCurve(rows) ? valueOf(rows.stationOf(rows.vertex_->*station)) : LandXmlValue();
    }

    static constexpr LandXmlGetter<Rows> getters[] = {
        {"Alignment", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.row_.route->stored->name); }},
        {"GradeLine", VARIABLE_TEXT,
         [](const Rows &rows) { return valueOf(rows.row_.route->stored->gradeLines[rows.row_.line].name); }},
        {"Vertex", VARIABLE_INTEGER, [](const Rows &rows) { return count(rows.row_.point + 1); }},
        {"Type", VARIABLE_TEXT, [](const Rows &rows) { return LandXmlValue(typeOf(rows.point_->kind)); }},
        {"Station", VARIABLE_STATION, [](const Rows &rows) { return valueOf(rows.stationOf(rows.point_->station)); }},
        {"Elevation", VARIABLE_ELEVATION, [](const Rows &rows) { return valueOf(rows.point_->height); }},
        {"GradeIn", VARIABLE_DOUBLE, [](const Rows &rows) { return percent(rows, &VerticalProfile::Vertex::gradeIn); }},
        {"GradeOut", VARIABLE_DOUBLE,
         [](const Rows &rows) { return percent(rows, &VerticalProfile::Vertex::gradeOut); }},
        {"CurveLength", VARIABLE_LENGTH,
         [](const Rows &rows) {
             return hasCurve(rows) ? valueOf(rows.vertex_->end - rows.vertex_->start) : LandXmlValue();
         }},
        {"Radius", VARIABLE_LENGTH,
         [](const Rows &rows) {
             return hasCurve(rows) && rows.point_->kind == Kind::Circle ? valueOf(rows.vertex_->point.radius)
                                                                        : LandXmlValue();
         }},
        {"K", VARIABLE_LENGTH,
         [](const Rows &rows) {
             return hasCurve(rows) ? valueOf(VerticalProfile::kValue(*rows.vertex_)) : LandXmlValue();
         }},
        {"CurveStart", VARIABLE_STATION,
         [](const Rows &rows) { return station(rows, &VerticalProfile::Vertex::start); }},
        {"CurveStartElevation", VARIABLE_ELEVATION,
         [](const Rows &rows) { return height(rows, &VerticalProfile::Vertex::start); }},
        {"CurveEnd", VARIABLE_STATION, [](const Rows &rows) { return station(rows, &VerticalProfile::Vertex::end); }},
        {"CurveEndElevation", VARIABLE_ELEVATION,
         [](const Rows &rows) { return height(rows, &VerticalProfile::Vertex::end); }},
        {"CurveElevation", VARIABLE_ELEVATION,
         [](const Rows &rows) {
             return hasCurve(rows) ? valueOf(rows.heightAt(rows.point_->station)) : LandXmlValue();
         }},
        {"Extreme", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.extremeText_); }},
        {"ExtremeStation", VARIABLE_STATION,
         [](const Rows &rows) {
             return rows.extreme_ ? valueOf(rows.stationOf(rows.extreme_->station)) : LandXmlValue();
         }},
        {"ExtremeElevation", VARIABLE_ELEVATION,
         [](const Rows &rows) { return rows.extreme_ ? valueOf(rows.extreme_->height) : LandXmlValue(); }},
    };
};

std::vector<LandXmlVariable> ProfileRows::variables() const
{
    return variablesOf(Variables::getters);
}

LandXmlValue ProfileRows::value(std::size_t variable) const
{
    return Variables::getters[variable].get(*this);
}

bool ProfileRows::load()
{
    if (!readAlignments(model_, {})) {
        return false;
    }
    for (const LandXmlRoute &route : model_.routes) {
        if (isNamed(route.stored->name)) {
            addGradeLines(route);
        }
    }
    count_ = rows_.size();
    return expectNames();
}

void ProfileRows::addGradeLines(const LandXmlRoute &route)
{
    const auto &lines = route.stored->gradeLines;
    for (std::size_t line = 0; line < lines.size(); ++line) {
        const std::size_t points = gradeLines_.matches(lines[line].name) ? lines[line].points.size() : 0;
        for (std::size_t i = 0; i < points; ++i) {
            rows_.push_back({&route, line, i});
        }
    }
}

double ProfileRows::stationOf(double internal) const
{
    return row_.route->stationing.nameOf(internal).station;
}

std::optional<double> ProfileRows::heightAt(double internal) const
{
    return profile_ != nullptr ? profile_->heightAt(internal) : std::nullopt;
}

void ProfileRows::take(std::size_t index)
{
    row_ = rows_[index];
    point_ = &row_.route->stored->gradeLines[row_.line].points[row_.point];
    const auto *profile = std::get_if<LandXmlProfile>(&row_.route->profiles[row_.line]);
    profile_ = profile != nullptr ? &profile->heights : nullptr;
    vertex_ = profile != nullptr ? &profile_->vertices()[profile->vertices[row_.point]] : nullptr;
    extreme_.reset();
    extremeText_.clear();
    if (vertex_ != nullptr) {
        constexpr double rounding = 1e-6;
        const auto extremes = profile_->extremes(vertex_->start - rounding, vertex_->end + rounding);
        if (!extremes.empty()) {
            extreme_ = extremes.front();
            extremeText_ = (extreme_->isHigh ? Xlate("high point") : Xlate("low point")).toStdString();
        }
    }
}

} // namespace kareport
