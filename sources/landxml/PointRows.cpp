#include "PointRows.h"

#include "ModelRows.h"
#include "VariableType.h"
#include "Xlate.h"

namespace kareport
{

struct PointRows::Variables
{
    using Rows = PointRows;
    static const std::string &owner(const Rows &rows) { return rows.owners_[rows.point_->owner]; }

    static constexpr LandXmlGetter<Rows> getters[] = {
        {"Name", VARIABLE_NUMBER, [](const Rows &rows) { return valueOf(rows.point_->name); }},
        {"Code", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.point_->code); }},
        {"Description", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.point_->description); }},
        {"Group", VARIABLE_TEXT,
         [](const Rows &rows) { return rows.isOfSurfaces() ? LandXmlValue() : valueOf(owner(rows)); }},
        {"Surface", VARIABLE_TEXT,
         [](const Rows &rows) { return rows.isOfSurfaces() ? valueOf(owner(rows)) : LandXmlValue(); }},
        {"Northing", VARIABLE_COORDINATE, [](const Rows &rows) { return valueOf(rows.at_.northing); }},
        {"Easting", VARIABLE_COORDINATE, [](const Rows &rows) { return valueOf(rows.at_.easting); }},
        {"Elevation", VARIABLE_ELEVATION, [](const Rows &rows) { return valueOf(rows.height_); }},
    };
};

const std::size_t PointRows::ownVariables = std::size(Variables::getters);

PointRows::PointRows(LandXmlSource source) : LandXmlRows(std::move(source)), unheard_(source_.file)
{
    startReading();
}

void PointRows::startReading()
{
    LandXmlWants wants;
    (isOfSurfaces() ? wants.surfacePoints : wants.points) = true;
    passNotes_.clear();
    unheard_.clear();
    reader_ = std::make_unique<LandXmlReader>(source_.file, source_.header.units, wants,
                                              isReaderHeard_ ? passNotes_ : unheard_);
    isMore_ = true;
    index_ = 0;
    seen_.clear();
}

void PointRows::rewind()
{
    error_.reset();
    isKept_ = false;
    startReading();
}

std::vector<LandXmlVariable> PointRows::variables() const
{
    return variablesOf(Variables::getters);
}

LandXmlValue PointRows::value(std::size_t variable) const
{
    return Variables::getters[variable].get(*this);
}

bool PointRows::readMore()
{
    reader_->dropPoints();
    index_ = 0;
    while (isMore_ && reader_->pointCount() == 0) {
        isMore_ = reader_->readSome();
        position_ = reader_->position();
        while (owners_.size() < reader_->owners().size()) {
            const std::size_t owner = owners_.size();
            owners_.push_back(reader_->owners()[owner]);
            isOwnerWanted_.push_back(reader_->isSurface(owner) == isOfSurfaces() && isNamed(owners_.back()));
        }
    }
    return reader_->pointCount() > 0;
}

bool PointRows::next()
{
    while (true) {
        if (index_ == reader_->pointCount() && !readMore()) {
            error_ = reader_->error();
            if (!error_ && !isMore_) {
                expectNames();
            }
            return false;
        }
        point_ = &reader_->point(index_++);
        if (isOwnerWanted_[point_->owner]) {
            break;
        }
    }
    if (isKept_) {
        kept_.push_back(*point_);
    }
    noteRepeated();
    return take();
}

void PointRows::goTo(std::size_t index)
{
    point_ = &kept_[index];
    take();
}

bool PointRows::take()
{
    height_ = point_->at.height;
    if (point_->at.position) {
        at_ = *point_->at.position;
        return true;
    }
    const LandXmlPointTable *points = pointTable();
    const auto found = points != nullptr ? points->find(point_->at.reference) : std::nullopt;
    if (!found) {
        fail(point_->at.byte,
             Xlate("the point \"%1\" is not in the file").arg(QString::fromStdString(point_->at.reference)));
        return false;
    }
    at_ = found->position;
    height_ = found->height;
    return true;
}

/// Points that others refer to by their names, and surfaces' points, are expected to have one each.
void PointRows::noteRepeated()
{
    if (point_->name.empty()) {
        return;
    }
    std::size_t hash = std::hash<std::string>()(point_->name);
    if (isOfSurfaces()) {
        hash = (hash ^ point_->owner) * 0x9E3779B97F4A7C15U;
    }
    if (!seen_.insert(hash).second) {
        passNotes_.add(point_->at.byte,
                       Xlate("the name \"%1\" stands for several points").arg(QString::fromStdString(point_->name)));
    }
}

struct ProjectedRows::Variables
{
    using Rows = ProjectedRows;
    static constexpr LandXmlGetter<Rows> getters[] = {
        {"Alignment", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.route_->stored->name); }},
        {"Station", VARIABLE_STATION, [](const Rows &rows) { return valueOf(rows.station_); }},
        {"Region", VARIABLE_INTEGER,
         [](const Rows &rows) {
             return LandXmlValue(static_cast<double>(rows.route_->nameOf(rows.foot_.distance).region));
         }},
        {"Along", VARIABLE_LENGTH, [](const Rows &rows) { return valueOf(rows.foot_.distance); }},
        {"Offset", VARIABLE_OFFSET, [](const Rows &rows) { return valueOf(rows.foot_.offset); }},
        {"Distance", VARIABLE_DISTANCE, [](const Rows &rows) { return valueOf(std::fabs(rows.foot_.offset)); }},
        {"Place", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.kind_); }},
        {"Design", VARIABLE_ELEVATION, [](const Rows &rows) { return valueOf(rows.design_); }},
        {"HeightDifference", VARIABLE_LENGTH, [](const Rows &rows) { return valueOf(rows.height_ - rows.design_); }},
    };
};

ProjectedRows::ProjectedRows(LandXmlSource source) : PointRows(std::move(source)) {}

std::vector<LandXmlVariable> ProjectedRows::variables() const
{
    std::vector<LandXmlVariable> variables = PointRows::variables();
    for (LandXmlVariable &own : variablesOf(Variables::getters)) {
        variables.push_back(std::move(own));
    }
    return variables;
}

LandXmlValue ProjectedRows::value(std::size_t variable) const
{
    return variable < ownVariables ? PointRows::value(variable)
                                   : Variables::getters[variable - ownVariables].get(*this);
}

bool ProjectedRows::next()
{
    if (!isLoaded_) {
        isLoaded_ = true;
        if (!load()) {
            route_ = nullptr;
            return false;
        }
        // The file has been read through, and all was said. Rows that are to be kept still are.
        isReaderHeard_ = false;
        startReading();
    }
    return route_ != nullptr && PointRows::next();
}

bool ProjectedRows::load()
{
    if (!readAlignments(model_, {})) {
        return false;
    }
    LandXmlNames alignments(source_.query.alignment);
    for (const LandXmlRoute &route : model_.routes) {
        if (alignments.matches(route.stored->name)) {
            if (route_ != nullptr && source_.query.alignment.isEmpty()) {
                fail(route.stored->byte, Xlate("the file has several alignments: the name of one was expected"));
                return false;
            }
            route_ = route_ == nullptr ? &route : route_;
        }
    }
    error_ = alignments.error(source_.file->path());
    if (error_) {
        return false;
    }
    if (route_ == nullptr) {
        error_ = InputError{source_.file->path(), std::nullopt, Xlate("the file has no alignment")};
        return false;
    }
    if (route_->fault) {
        fail(*route_->fault);
        return false;
    }
    if (route_->alignment.elements().empty()) {
        fail(route_->stored->byte, Xlate("the alignment has no elements"));
        return false;
    }
    for (const LandXmlGradeLine &line : route_->stored->gradeLines) {
        gradeLines_.matches(line.name);
    }
    error_ = gradeLines_.error(source_.file->path());
    if (error_) {
        return false;
    }
    profile_ = route_->profile(source_.query.gradeLine.toStdString());
    return true;
}

bool ProjectedRows::take()
{
    if (!PointRows::take()) {
        return false;
    }
    foot_ = *nearestFoot(route_->alignment, at_);
    station_ = notGiven;
    design_ = notGiven;
    switch (foot_.kind) {
    case AlignmentFoot::Kind::Perpendicular: kind_.clear(); break;
    case AlignmentFoot::Kind::Corner: kind_ = Xlate("outside of a corner").toStdString(); break;
    case AlignmentFoot::Kind::BeforeStart: kind_ = Xlate("before the start").toStdString(); break;
    case AlignmentFoot::Kind::AfterEnd: kind_ = Xlate("after the end").toStdString(); break;
    case AlignmentFoot::Kind::Undetermined: kind_ = Xlate("at a centre").toStdString(); return true;
    }
    station_ = route_->nameOf(foot_.distance).station;
    if (profile_ != nullptr) {
        design_ = profile_->heightAt(foot_.distance + route_->stationing.start()).value_or(notGiven);
    }
    return true;
}

} // namespace kareport
