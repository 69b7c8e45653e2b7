#include "StationRows.h"

#include "VariableType.h"
#include "Xlate.h"

#include <algorithm>
#include <limits>

namespace kareport
{

namespace
{

constexpr double samePlace = 1e-4; // stations that lie nearer to each other are one row
constexpr const char *offsetNames[] = {"Offset", "Northing", "Easting", "Elevation"};
constexpr int offsetTypes[] = {VARIABLE_OFFSET, VARIABLE_COORDINATE, VARIABLE_COORDINATE, VARIABLE_ELEVATION};

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

    static constexpr LandXmlGetter<Rows> getters[] = {
        {"Alignment", VARIABLE_TEXT, [](const Rows &rows) { return valueOf(rows.route_->stored->name); }},
        {"Station", VARIABLE_STATION, [](const Rows &rows) { return valueOf(name(rows).station); }},
        {"StationBack", VARIABLE_STATION,
         [](const Rows &rows) {
             return rows.equation_ != nullptr ? valueOf(rows.route_->nameOf(rows.distance_, true).station)
                                              : LandXmlValue();
         }},
        {"Region", VARIABLE_INTEGER,
         [](const Rows &rows) { return LandXmlValue(static_cast<double>(name(rows).region)); }},
        {"Along", VARIABLE_LENGTH, [](const Rows &rows) { return valueOf(rows.distance_); }},
        {"Point", VARIABLE_TEXT, [](const Rows &rows) { return border(rows); }},
        {"Northing", VARIABLE_COORDINATE, [](const Rows &rows) { return valueOf(rows.place_.point.northing); }},
        {"Easting", VARIABLE_COORDINATE, [](const Rows &rows) { return valueOf(rows.place_.point.easting); }},
        {"Bearing", VARIABLE_BEARING, [](const Rows &rows) { return valueOf(rows.place_.bearing); }},
        {"Radius", VARIABLE_LENGTH,
         [](const Rows &rows) {
             constexpr double infinite = std::numeric_limits<double>::infinity();
             return valueOf(rows.place_.curvature == 0 ? infinite : 1 / rows.place_.curvature);
         }},
        {"Design", VARIABLE_ELEVATION, [](const Rows &rows) { return valueOf(rows.design_); }},
        {"Grade", VARIABLE_DOUBLE,
         [](const Rows &rows) { return rows.grade_ ? valueOf(*rows.grade_ * 100) : LandXmlValue(); }},
        {"Ground", VARIABLE_ELEVATION, [](const Rows &rows) { return valueOf(rows.ground_); }},
        {"CutFill", VARIABLE_LENGTH,
         [](const Rows &rows) {
             return rows.design_ && rows.ground_ ? valueOf(*rows.design_ - *rows.ground_) : LandXmlValue();
         }},
    };
};

std::vector<LandXmlVariable> StationRows::variables() const
{
    std::vector<LandXmlVariable> variables = variablesOf(Variables::getters);
    for (std::size_t offset = 1; offset <= source_.query.offsets.size(); ++offset) {
        for (std::size_t part = 0; part < 4; ++part) {
            variables.push_back({QString::fromLatin1(offsetNames[part]) + QString::number(offset), offsetTypes[part]});
        }
    }
    return variables;
}

LandXmlValue StationRows::value(std::size_t variable) const
{
    constexpr std::size_t own = std::size(Variables::getters);
    return variable < own ? Variables::getters[variable].get(*this)
                          : offsetValue((variable - own) / 4, (variable - own) % 4);
}

LandXmlValue StationRows::offsetValue(std::size_t offset, std::size_t part) const
{
    const LandXmlOffset &line = source_.query.offsets[offset];
    switch (part) {
    case 0: return valueOf(line.offset);
    case 1: return valueOf(place_.point.northing - line.offset * sine_);
    case 2: return valueOf(place_.point.easting + line.offset * cosine_);
    default: break;
    }
    return design_ && line.crossfall ? valueOf(*design_ + std::fabs(line.offset) * *line.crossfall / 100)
                                     : LandXmlValue();
}

bool StationRows::load()
{
    LandXmlWants wants;
    wants.surfaceLines = true;
    if (!readAlignments(model_, wants)) {
        return false;
    }
    const std::string gradeLine = source_.query.gradeLine.toStdString();
    const std::string surface = source_.query.surface.toStdString();
    for (std::size_t i = 0; i < model_.routes.size(); ++i) {
        const LandXmlRoute &route = model_.routes[i];
        lines_.push_back({route.profile(gradeLine), route.surface(surface)});
        if (isNamed(route.stored->name)) {
            lookAtNames(*route.stored);
            if (!addRoute(i)) {
                return false;
            }
        }
    }
    count_ = rows_.size();
    return expectNames();
}

void StationRows::lookAtNames(const LandXmlAlignment &alignment)
{
    for (const LandXmlGradeLine &line : alignment.gradeLines) {
        gradeLines_.matches(line.name);
    }
    for (const LandXmlHeightLine &line : alignment.surfaceLines) {
        surfaces_.matches(line.name);
    }
}

/// Adds the rows of an alignment.
bool StationRows::addRoute(std::size_t index)
{
    const LandXmlRoute &route = model_.routes[index];
    if (route.fault) {
        fail(*route.fault);
        return false;
    }
    std::vector<double> chosen; // those that the interval has give way to them
    if (source_.query.atElements) {
        for (const LandXmlRoute::Piece &piece : route.pieces) {
            chosen.push_back(piece.start);
        }
        chosen.push_back(route.length);
    }
    for (const StationEquation &equation : route.stationing.equations()) {
        chosen.push_back(equation.internal - route.stationing.start());
    }
    addStations(route, chosen);
    std::sort(chosen.begin(), chosen.end());
    std::vector<double> regular;
    if (!addInterval(route, regular)) {
        fail(route.stored->byte, Xlate("the interval gives more than %1 stations").arg(most));
        return false;
    }
    std::vector<double> distances(chosen.size() + regular.size());
    std::merge(chosen.begin(), chosen.end(), regular.begin(), regular.end(), distances.begin());
    double last = -1;
    for (const double distance : distances) {
        if (distance < 0 || distance > route.length + samePlace || route.alignment.elements().empty()) {
            continue;
        }
        if (last < 0 || distance - last > samePlace) {
            rows_.push_back({index, std::min(distance, route.length)});
            last = distance;
        } else if (std::binary_search(chosen.begin(), chosen.end(), distance)) {
            rows_.back().distance = distance;
        }
    }
    return true;
}

bool StationRows::addInterval(const LandXmlRoute &route, std::vector<double> &distances)
{
    const double interval = source_.query.interval;
    if (!(interval > 0)) {
        return true;
    }
    if (!(route.length / interval + static_cast<double>(rows_.size() + distances.size()) < most)) {
        return false;
    }
    if (source_.query.fromRound) {
        return addRound(route, distances);
    }
    const auto last = static_cast<std::size_t>(route.length / interval);
    for (std::size_t i = 0; i <= last; ++i) {
        distances.push_back(static_cast<double>(i) * interval);
    }
    return true;
}

/// Adds stations that are whole multiples of the interval, in each region between equations.
bool StationRows::addRound(const LandXmlRoute &route, std::vector<double> &distances) const
{
    const Stationing &stationing = route.stationing;
    const double interval = source_.query.interval;
    for (std::size_t region = 0; region <= stationing.equations().size(); ++region) {
        const auto internal = [&](std::size_t index) { return stationing.equations()[index].internal; };
        const double from = region == 0 ? stationing.start() : internal(region - 1);
        const double end = stationing.start() + route.length;
        const double to = region == stationing.equations().size() ? end : std::min(internal(region), end);
        if (to < from) {
            continue;
        }
        const double first = stationing.nameOf(from).station;
        const double last = first + (stationing.internalIn(region, first + 1) < from ? from - to : to - from);
        const double low = std::ceil(std::min(first, last) / interval - 1e-9);
        const double high = std::floor(std::max(first, last) / interval + 1e-9);
        // Far from 0 neighbouring multiples are one number, and stations may be infinite: what is counted is their difference.
        const double count = high - low + 1;
        if (!(count + static_cast<double>(rows_.size() + distances.size()) < most)) {
            return false;
        }
        for (qint64 i = 0; i < static_cast<qint64>(count); ++i) {
            const double number = low + static_cast<double>(i);
            distances.push_back(stationing.internalIn(region, number * interval) - stationing.start());
        }
    }
    std::sort(distances.begin(), distances.end());
    return true;
}

void StationRows::addStations(const LandXmlRoute &route, std::vector<double> &distances)
{
    const double end = route.stationing.start() + route.length;
    for (const double station : source_.query.stations) {
        const std::vector<double> places = route.stationing.placesOf(station, end);
        if (places.size() != 1) {
            modelNotes_.add(
                route.stored->byte,
                places.empty()
                    ? Xlate("the alignment has no station %1").arg(QString::number(station / source_.unit, 'f', 3))
                    : Xlate("the alignment has the station %1 at several places")
                          .arg(QString::number(station / source_.unit, 'f', 3)));
        }
        for (const double place : places) {
            distances.push_back(place - route.stationing.start());
        }
    }
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

void StationRows::take(std::size_t index)
{
    const Row &row = rows_[index];
    route_ = &model_.routes[row.route];
    distance_ = row.distance;
    place_ = route_->alignment.at(distance_).value_or(CurvePlace());
    sine_ = std::sin(place_.bearing);
    cosine_ = std::cos(place_.bearing);
    const Lines &lines = lines_[row.route];
    const double internal = distance_ + route_->stationing.start();
    design_ = lines.profile != nullptr ? lines.profile->heightAt(internal) : std::nullopt;
    grade_ = lines.profile != nullptr ? lines.profile->gradeAt(internal) : std::nullopt;
    ground_ = lines.surface != nullptr ? heightOn(*lines.surface, internal) : std::nullopt;
    equation_ = route_->stationing.equationAt(internal);
}

} // namespace kareport
