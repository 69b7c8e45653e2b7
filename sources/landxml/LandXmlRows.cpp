#include "LandXmlRows.h"

#include "AlignmentRows.h"
#include "CourseRows.h"
#include "ElementRows.h"
#include "ParcelRows.h"
#include "PointRows.h"
#include "ProfileRows.h"
#include "ProjectedRows.h"
#include "SectionRows.h"
#include "StationRows.h"
#include "Xlate.h"

#include <QStringList>

#include <array>
#include <utility>

namespace kareport
{

namespace
{

using Kind = LandXmlListKind;

struct ListKey
{
    QStringView key;
    Kind kind;
};

constexpr std::array<ListKey, 10> keys = {{{u"points", Kind::Points},
                                           {u"surfacePoints", Kind::SurfacePoints},
                                           {u"parcels", Kind::Parcels},
                                           {u"courses", Kind::Courses},
                                           {u"alignments", Kind::Alignments},
                                           {u"elements", Kind::Elements},
                                           {u"stations", Kind::Stations},
                                           {u"profile", Kind::Profile},
                                           {u"crossSections", Kind::CrossSections},
                                           {u"offsetsOf", Kind::OffsetsOf}}};

/// Whether the row of each kind is at its own number, so that a key is found by it.
constexpr bool areInOrder()
{
    for (std::size_t i = 0; i < keys.size(); ++i) {
        if (static_cast<std::size_t>(keys[i].kind) != i) {
            return false;
        }
    }
    return static_cast<std::size_t>(Kind::OffsetsOf) + 1 == keys.size();
}
static_assert(areInOrder());

/// What the name of a query of a kind is that of.
LandXmlNames::Of namesFor(Kind kind)
{
    using Of = LandXmlNames::Of;
    switch (kind) {
    case Kind::Points:
    case Kind::OffsetsOf: return Of::Group;
    case Kind::SurfacePoints: return Of::Surface;
    case Kind::Parcels:
    case Kind::Courses: return Of::Parcel;
    default: return Of::Alignment;
    }
}

} // namespace

std::optional<LandXmlListKind> landXmlListFromKey(QStringView key)
{
    for (const auto &[known, kind] : keys) {
        if (known == key) {
            return kind;
        }
    }
    return std::nullopt;
}

QStringView keyOf(LandXmlListKind kind)
{
    return keys[static_cast<std::size_t>(kind)].key;
}

std::unique_ptr<LandXmlRows> LandXmlRows::make(LandXmlSource source)
{
    switch (source.query.kind) {
    case Kind::Points:
    case Kind::SurfacePoints: return std::make_unique<PointRows>(std::move(source));
    case Kind::OffsetsOf: return std::make_unique<ProjectedRows>(std::move(source));
    case Kind::Parcels: return std::make_unique<ParcelRows>(std::move(source));
    case Kind::Courses: return std::make_unique<CourseRows>(std::move(source));
    case Kind::Alignments: return std::make_unique<AlignmentRows>(std::move(source));
    case Kind::Elements: return std::make_unique<ElementRows>(std::move(source));
    case Kind::Stations: return std::make_unique<StationRows>(std::move(source));
    case Kind::Profile: return std::make_unique<ProfileRows>(std::move(source));
    case Kind::CrossSections: break;
    }
    return std::make_unique<SectionRows>(std::move(source));
}

LandXmlRows::LandXmlRows(LandXmlSource source)
    : source_(std::move(source)),
      names_(namesFor(source_.query.kind), source_.query.name),
      gradeLines_(LandXmlNames::Of::GradeLine, source_.query.gradeLine),
      surfaces_(LandXmlNames::Of::Surface, source_.query.surface),
      modelNotes_(source_.file),
      passNotes_(source_.file)
{
    const QString &version = source_.header.version;
    const QStringList known = {QString(), QStringLiteral("1.0"), QStringLiteral("1.1"), QStringLiteral("1.2"),
                               QStringLiteral("2.0")};
    if (!known.contains(version)) {
        modelNotes_.add(0, Xlate("the file is of version %1: versions 1.0 to 2.0 are known").arg(version));
    }
    if (const QString &unit = source_.header.otherElevationUnit; !unit.isEmpty()) {
        modelNotes_.add(source_.header.unitsByte,
                        Xlate("elevationUnit is \"%1\": heights are taken to be in the unit of lengths").arg(unit));
    }
}

void LandXmlRows::fail(std::size_t byte, const QString &text)
{
    if (!error_) {
        error_ = InputError{source_.file->path(), FilePlaces(*source_.file).of(byte), text};
    }
}

const LandXmlPointTable *LandXmlRows::pointTable()
{
    if (!pointTable_) {
        auto table = std::make_unique<LandXmlPointTable>();
        LandXmlNotes unheard(source_.file); // the pass that makes the rows has them, too
        LandXmlWants wants;
        wants.points = true;
        wants.isForReferences = true; // one that is not referred to may be wrong
        LandXmlReader reader(source_.file, source_.header.units, wants, unheard);
        for (bool isMore = true; isMore;) {
            isMore = reader.readSome();
            for (std::size_t i = 0; i < reader.pointCount(); ++i) {
                table->add(reader.point(i));
            }
            reader.dropPoints();
            if (isMore && source_.progress && !source_.progress(reader.position())) {
                isStopped_ = true;
                return nullptr;
            }
        }
        if (reader.error()) {
            error_ = reader.error();
            return nullptr;
        }
        pointTable_ = std::move(table);
    }
    return pointTable_.get();
}

std::unique_ptr<LandXmlReader> LandXmlRows::readAll(const LandXmlWants &wants)
{
    auto reader = std::make_unique<LandXmlReader>(source_.file, source_.header.units, wants, modelNotes_);
    while (reader->readSome()) {
        position_ = reader->position();
        if (source_.progress && !source_.progress(position_)) {
            isStopped_ = true;
            return nullptr;
        }
    }
    position_ = reader->position();
    error_ = reader->error();
    return error_ ? nullptr : std::move(reader);
}

bool LandXmlRows::expectNames()
{
    for (const LandXmlNames *names : {&names_, &gradeLines_, &surfaces_}) {
        if (!error_) {
            error_ = names->error(source_.file->path());
        }
    }
    return !error_;
}

std::vector<InputError> LandXmlRows::notes() const
{
    std::vector<InputError> all = modelNotes_.all();
    for (InputError &note : passNotes_.all()) {
        all.push_back(std::move(note));
    }
    return all;
}

} // namespace kareport
