#include "ParcelRows.h"

#include "LandXmlReferences.h"
#include "VariableType.h"
#include "Xlate.h"

#include <algorithm>

namespace kareport
{

bool BorderRows::readParcels()
{
    LandXmlWants wants;
    wants.parcels = true;
    wants.parcel = source_.query.name.toStdString();
    const auto reader = readAll(wants);
    if (!reader) {
        return false;
    }
    parcels_ = std::move(reader->parcels);
    std::vector<LandXmlParcel *> named;
    for (LandXmlParcel &parcel : parcels_) {
        if (isNamed(parcel.name)) {
            named.push_back(&parcel);
        }
    }
    if (!resolveReferences(named)) {
        return false;
    }
    LandXmlComparison comparison(source_.header.units, source_.query.tolerance, modelNotes_);
    for (const LandXmlParcel *parcel : named) {
        borders_.push_back(borderOf(*parcel, comparison));
        if (error_) {
            return false;
        }
    }
    comparison.noteDirections();
    return expectNames();
}

bool BorderRows::resolveReferences(const std::vector<LandXmlParcel *> &parcels)
{
    const bool refers = std::any_of(parcels.begin(), parcels.end(), [](const LandXmlParcel *parcel) {
        return isReference(parcel->centre) || hasReferences(parcel->elements);
    });
    const LandXmlPointTable *points = refers ? pointTable() : nullptr;
    if (points == nullptr) {
        return !refers;
    }
    for (LandXmlParcel *parcel : parcels) {
        resolve(parcel->elements, *points, modelNotes_);
        resolve(parcel->centre, *points, modelNotes_);
        if (isReference(parcel->centre)) {
            modelNotes_.add(parcel->centre.byte, noPosition(parcel->centre.reference, parcel->centre.isUnreadable));
        }
    }
    return true;
}

ParcelBorder BorderRows::borderOf(const LandXmlParcel &parcel, LandXmlComparison &comparison)
{
    ParcelBorder border;
    border.stored = &parcel;
    bool isWhole = !parcel.elements.empty();
    for (std::size_t i = 0; i < parcel.elements.size(); ++i) {
        const LandXmlCurves made = curvesOf(parcel.elements[i], comparison);
        if (const auto *fault = std::get_if<LandXmlFault>(&made)) {
            modelNotes_.add(fault->byte, fault->text);
            isWhole = false;
            continue;
        }
        for (const PlaneCurve &curve : std::get<std::vector<PlaneCurve>>(made)) {
            border.courses.emplace_back(i, curve);
            // A small file can hold curves whose area would take minutes. Those of real borders do not wind at all.
            const std::size_t pieces = curve.isLine() || curve.pieces() == 1 ? 0 : curve.pieces();
            if (pieces > budget_) {
                fail(parcel.byte, Xlate("the elements turn too many times"));
                return border;
            }
            budget_ -= pieces;
        }
    }
    measure(border, isWhole && !border.courses.empty());
    if (border.area) {
        comparison.area(parcel.byte, "area", parcel.area, *border.area);
    }
    return border;
}

void BorderRows::measure(ParcelBorder &border, bool isWhole)
{
    if (!isWhole) {
        return;
    }
    const PlanePoint origin = border.courses.front().second.start().point;
    double area = 0;
    double perimeter = 0;
    double gap = 0;
    PlanePoint before = border.courses.back().second.end().point - origin;
    for (const auto &[element, curve] : border.courses) {
        const PlanePoint from = curve.start().point - origin;
        const PlanePoint to = curve.end().point - origin;
        gap = std::max(gap, distanceBetween(before, from));
        area += (from.northing * to.easting - from.easting * to.northing) / 2 + curve.areaBesideChord();
        perimeter += curve.length();
        before = to;
    }
    border.perimeter = perimeter;
    // Rounding leaves a few centimetres open; more is another border than the one that was meant.
    constexpr double widest = 0.1;
    if (gap > widest) {
        modelNotes_.add(border.stored->byte,
                        Xlate("the border of the parcel does not close: there is a gap of %1 metres")
                            .arg(QString::number(gap, 'f', 3)));
        return;
    }
    border.area = std::fabs(area);
}

struct ParcelRows::Variables
{
    using Rows = ParcelRows;
    static constexpr LandXmlGetter<Rows> getters[] = {
        {"Parcel", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.border_->stored->name); }},
        {"Description", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.border_->stored->description); }},
        {"PartOf", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.border_->stored->owner); }},
        {"Area", VARIABLE_AREA, [](const Rows &rows) { return valueOf(rows.border_->area); }},
        {"StatedArea", VARIABLE_AREA, [](const Rows &rows) { return valueOf(rows.border_->stored->area); }},
        {"Perimeter", VARIABLE_LENGTH, [](const Rows &rows) { return valueOf(rows.border_->perimeter); }},
        {"Courses", VARIABLE_INTEGER, [](const Rows &rows) { return countOf(rows.border_->courses.size()); }},
        {"CentreNorthing", VARIABLE_COORDINATE,
         [](const Rows &rows) { return northingOf(rows.border_->stored->centre.position); }},
        {"CentreEasting", VARIABLE_COORDINATE,
         [](const Rows &rows) { return eastingOf(rows.border_->stored->centre.position); }},
    };
};

std::vector<LandXmlVariable> ParcelRows::variables() const
{
    return variablesOf(Variables::getters);
}

LandXmlValue ParcelRows::value(std::size_t variable) const
{
    return Variables::getters[variable].get(*this);
}

bool ParcelRows::load()
{
    const bool isRead = readParcels();
    count_ = borders_.size();
    return isRead;
}

} // namespace kareport
