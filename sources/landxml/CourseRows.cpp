#include "CourseRows.h"

#include "VariableType.h"

namespace kareport
{

struct CourseRows::Variables
{
    using Rows = CourseRows;
    static LandXmlValue ofArc(const Rows &rows, double value)
    {
        return rows.curve_->isArc() ? valueOf(value) : LandXmlValue();
    }
    static const LandXmlElement &element(const Rows &rows)
    {
        return rows.border_->stored->elements[rows.border_->courses[rows.index_].first];
    }

    static constexpr LandXmlGetter<Rows> getters[] = {
        {"Parcel", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.border_->stored->name); }},
        {"Area", VARIABLE_AREA, [](const Rows &rows) { return valueOf(rows.border_->area); }},
        {"Perimeter", VARIABLE_LENGTH, [](const Rows &rows) { return valueOf(rows.border_->perimeter); }},
        {"Course", VARIABLE_INTEGER, [](const Rows &rows) { return countOf(rows.index_ + 1); }},
        {"Name", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(element(rows).name); }},
        {"Rotation", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(element(rows).rotation); }},
        {"StartNorthing", VARIABLE_COORDINATE,
         [](const Rows &rows) { return valueOf(rows.curve_->start().point.northing); }},
        {"StartEasting", VARIABLE_COORDINATE,
         [](const Rows &rows) { return valueOf(rows.curve_->start().point.easting); }},
        {"EndNorthing", VARIABLE_COORDINATE,
         [](const Rows &rows) { return valueOf(rows.curve_->end().point.northing); }},
        {"EndEasting", VARIABLE_COORDINATE, [](const Rows &rows) { return valueOf(rows.curve_->end().point.easting); }},
        {"Bearing", VARIABLE_BEARING,
         [](const Rows &rows) {
             return valueOf(bearingBetween(rows.curve_->start().point, rows.curve_->end().point));
         }},
        {"Distance", VARIABLE_DISTANCE,
         [](const Rows &rows) {
             return valueOf(distanceBetween(rows.curve_->start().point, rows.curve_->end().point));
         }},
        {"Length", VARIABLE_LENGTH, [](const Rows &rows) { return valueOf(rows.curve_->length()); }},
        {"Radius", VARIABLE_LENGTH,
         [](const Rows &rows) {
             const double radius = radiusOf(rows.curve_->startCurvature());
             return rows.curve_->isLine() ? valueOf(radius) : ofArc(rows, radius);
         }},
        {"Deflection", VARIABLE_ANGLE,
         [](const Rows &rows) { return ofArc(rows, rows.curve_->turnTo(rows.curve_->length())); }},
        {"StartBearing", VARIABLE_BEARING, [](const Rows &rows) { return valueOf(rows.curve_->start().bearing); }},
        {"EndBearing", VARIABLE_BEARING, [](const Rows &rows) { return valueOf(rows.curve_->end().bearing); }},
    };
};

std::vector<LandXmlVariable> CourseRows::variables() const
{
    return variablesOf(Variables::getters);
}

LandXmlValue CourseRows::value(std::size_t variable) const
{
    return Variables::getters[variable].get(*this);
}

std::size_t CourseRows::byte() const
{
    return Variables::element(*this).byte;
}

bool CourseRows::load()
{
    const bool isRead = readParcels();
    for (std::size_t border = 0; border < borders_.size(); ++border) {
        for (std::size_t course = 0; course < borders_[border].courses.size(); ++course) {
            rows_.emplace_back(border, course);
        }
    }
    count_ = rows_.size();
    return isRead;
}

void CourseRows::take(std::size_t index)
{
    border_ = &borders_[rows_[index].first];
    index_ = rows_[index].second;
    curve_ = &border_->courses[index_].second;
}

} // namespace kareport
