#include "PointRows.h"

#include "LandXmlReferences.h"
#include "ModelRows.h"
#include "VariableType.h"
#include "Xlate.h"

namespace kareport
{

struct PointRows::Variables
{
    using Rows = PointRows;
    static const std::string &owner(const Rows &rows) { return rows.owners_[rows.point_->owner]; }
    /// A text of the point, or else of the point that it refers to.
    static LandXmlValue text(const Rows &rows, const std::string &own,
                             std::string_view LandXmlPointTable::Found::*other)
    {
        if (!own.empty() || !rows.referred_ || ((*rows.referred_).*other).empty()) {
            return valueOf(own);
        }
        return (*rows.referred_).*other;
    }

    static constexpr LandXmlGetter<Rows> getters[] = {
        {"Name", VARIABLE_NUMBER,
         [](const Rows &rows) { return text(rows, rows.point_->name, &LandXmlPointTable::Found::name); }},
        {"Code", VARIABLE_TEXT,
         [](const Rows &rows) { return text(rows, rows.point_->code, &LandXmlPointTable::Found::code); }},
        {"Description", VARIABLE_TEXT,
         [](const Rows &rows) { return text(rows, rows.point_->description, &LandXmlPointTable::Found::description); }},
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
    wants.owner = source_.query.name.toStdString();
    bytes_.clear();
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
    hashes_.clear();
    for (std::size_t i = 0; i < reader_->pointCount(); ++i) {
        hashes_.push_back(hashOf(reader_->point(i)));
        seen_.prepare(hashes_.back());
    }
    return reader_->pointCount() > 0;
}

std::uint64_t PointRows::hashOf(const LandXmlPoint &point) const
{
    const std::uint64_t hash = std::hash<std::string>()(point.name);
    return isOfSurfaces() ? (hash ^ point.owner) * 0x9E3779B97F4A7C15U : hash;
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
    if (!take()) {
        return false;
    }
    if (!isKept_) {
        bytes_.push_back(point_->at.byte);
    }
    noteNames();
    return true;
}

std::optional<std::size_t> PointRows::byteOf(std::size_t index)
{
    if (isKept_) {
        return index < kept_.size() ? std::optional(kept_[index].at.byte) : std::nullopt;
    }
    return index < bytes_.size() ? std::optional(bytes_[index]) : std::nullopt;
}

void PointRows::goTo(std::size_t index)
{
    point_ = &kept_[index];
    take();
}

bool PointRows::take()
{
    referred_.reset();
    height_ = point_->at.height;
    if (point_->at.position) {
        at_ = *point_->at.position;
        return true;
    }
    const LandXmlPointTable *points = pointTable();
    if (points == nullptr) {
        return false;
    }
    referred_ = points->find(point_->at.reference);
    if (!referred_) {
        const std::string &name = point_->at.reference;
        fail(point_->at.byte, noPosition(name, points->isUnreadable(name)));
        return false;
    }
    at_ = referred_->position;
    height_ = referred_->height;
    return true;
}

/// Notes names that several points have. Others refer to points by their names, so that each is expected to have its own; in
/// a surface as well. A point that refers to one of its own name is the same point in another group.
void PointRows::noteNames()
{
    const std::string &reference = point_->at.reference;
    if (referred_ && referred_->isAmbiguous) {
        noteAmbiguous(reference, point_->at.byte, passNotes_);
    }
    const bool isAlias = referred_ && (reference == point_->name || referred_->name == point_->name);
    if (point_->name.empty() || isAlias) {
        return;
    }
    if (!seen_.add(hashes_[index_ - 1])) {
        passNotes_.add(point_->at.byte,
                       Xlate("several points have the name \"%1\"").arg(QString::fromStdString(point_->name)));
    }
}

} // namespace kareport
