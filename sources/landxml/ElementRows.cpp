#include "ElementRows.h"

#include "CurveFit.h"
#include "VariableType.h"
#include "Xlate.h"

#include <cmath>
#include <numbers>

namespace kareport
{

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
        default: return radiusOf(0);
        }
    }
    static double arcRadius(const Rows &rows)
    {
        const double stated = rows.element_->radius;
        return std::isnan(stated) && rows.start_ ? radiusOf(rows.start_->curvature) : stated;
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
        {"Element", VARIABLE_INTEGER, [](const Rows &rows) { return countOf(rows.piece_->element + 1); }},
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
        {"StartNorthing", VARIABLE_COORDINATE, [](const Rows &rows) { return northingOf(rows.startPoint_); }},
        {"StartEasting", VARIABLE_COORDINATE, [](const Rows &rows) { return eastingOf(rows.startPoint_); }},
        {"EndPoint", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.element_->end.name); }},
        {"EndNorthing", VARIABLE_COORDINATE, [](const Rows &rows) { return northingOf(rows.endPoint_); }},
        {"EndEasting", VARIABLE_COORDINATE, [](const Rows &rows) { return eastingOf(rows.endPoint_); }},
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
    if (!readNamedAlignments(model_)) {
        return false;
    }
    const bool isIntersectionAsked = isAsked("PINorthing") || isAsked("PIEasting");
    for (const LandXmlRoute &route : model_.routes) {
        for (std::size_t i = 0; i < route.pieces.size(); ++i) {
            rows_.emplace_back(&route, i);
            if (isIntersectionAsked) {
                noteIntersection(route, route.pieces[i]);
            }
        }
    }
    count_ = rows_.size();
    return expectNames();
}

/// Where the tangents of an element meet; nothing of one that turns by half a circle, but for what its ends are rounded to.
std::optional<PlanePoint> ElementRows::intersectionOf(const LandXmlRoute::Piece &piece) const
{
    if (piece.curves.size() != 1) {
        return std::nullopt;
    }
    const PlaneCurve &curve = piece.curves.front();
    const double turn = std::fabs(curve.turnTo(curve.length()));
    const double beyondHalf = std::fabs(std::remainder(turn - std::numbers::pi, 2 * std::numbers::pi));
    return beyondHalf * curve.length() > source_.query.tolerance.length ? tangentIntersection(curve) : std::nullopt;
}

void ElementRows::noteIntersection(const LandXmlRoute &route, const LandXmlRoute::Piece &piece)
{
    const bool isCurved = piece.curves.size() == 1 && !piece.curves.front().isLine();
    const LandXmlElement &element = route.stored->elements[piece.element];
    if (isCurved && !element.intersection.position && !intersectionOf(piece)) {
        modelNotes_.add(element.byte, Xlate("the tangents of the element are parallel: it has no PI"));
    }
}

void ElementRows::take(std::size_t index)
{
    route_ = rows_[index].first;
    piece_ = &route_->pieces[rows_[index].second];
    element_ = &route_->stored->elements[piece_->element];
    start_.reset();
    end_.reset();
    startPoint_ = element_->start.position;
    endPoint_ = element_->end.position;
    intersection_ = element_->intersection.position;
    centre_ = element_->centre.position;
    if (piece_->curves.empty()) {
        return;
    }
    start_ = piece_->curves.front().start();
    end_ = piece_->curves.back().end();
    // What the file states is listed as it is: where it differs from the geometry, a note has said so.
    centre_ = centre_ ? centre_ : centreOf(piece_->curves.front());
    intersection_ = intersection_ ? intersection_ : intersectionOf(*piece_);
}

} // namespace kareport
