#include "ProfileRows.h"

#include "VariableType.h"
#include "Xlate.h"

namespace kareport
{

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
        {"Vertex", VARIABLE_INTEGER, [](const Rows &rows) { return countOf(rows.row_.point + 1); }},
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
    if (!readNamedAlignments(model_)) {
        return false;
    }
    for (const LandXmlRoute &route : model_.routes) {
        addGradeLines(route);
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
