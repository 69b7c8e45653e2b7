#include "AlignmentRows.h"

#include "VariableType.h"

namespace kareport
{

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
        {"Elements", VARIABLE_INTEGER, [](const Rows &rows) { return countOf(rows.route_->stored->elements.size()); }},
        {"Equations", VARIABLE_INTEGER,
         [](const Rows &rows) { return countOf(rows.route_->stored->equations.size()); }},
        {"GradeLines", VARIABLE_INTEGER,
         [](const Rows &rows) { return countOf(rows.route_->stored->gradeLines.size()); }},
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
    const bool isRead = readNamedAlignments(model_);
    count_ = model_.routes.size();
    return isRead && expectNames();
}

} // namespace kareport
