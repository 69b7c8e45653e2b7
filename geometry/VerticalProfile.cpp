#include "VerticalProfile.h"

#include "Stationing.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace kareport
{

namespace
{

// Curves that follow each other without a grade between them overlap by what a file's digits leave out.
constexpr double allowedOverlap = 0.002;

bool isFinite(const ProfilePoint &point)
{
    for (const double measure : {point.station, point.height, point.lengthIn, point.lengthOut, point.radius}) {
        if (!std::isfinite(measure)) {
            return false;
        }
    }
    return true;
}

/// Where the curve of a vertex begins and ends; not ahead of each other where it has no measure for it.
void layCurve(VerticalProfile::Vertex &vertex)
{
    const ProfilePoint &point = vertex.point;
    double in = point.lengthIn;
    double out = point.lengthOut;
    if (point.rounding == ProfilePoint::Rounding::Circle) {
        const double from = std::atan(vertex.gradeIn);
        const double to = std::atan(vertex.gradeOut);
        const double tangent = point.radius * std::tan(std::fabs(to - from) / 2);
        in = tangent * std::cos(from);
        out = tangent * std::cos(to);
    }
    const bool hasCurve = point.rounding != ProfilePoint::Rounding::None;
    vertex.start = hasCurve ? point.station - in : point.station;
    vertex.end = hasCurve ? point.station + out : point.station;
}

} // namespace

double VerticalProfile::gradeOn(const Piece &piece, double station)
{
    const double along = station - piece.start;
    if (piece.radius == 0) {
        return piece.grade + piece.rate * along;
    }
    const double sine = piece.grade / std::hypot(1.0, piece.grade) + along / piece.radius;
    return sine / std::sqrt(std::max(1e-30, (1 - sine) * (1 + sine)));
}

double VerticalProfile::heightOn(const Piece &piece, double station)
{
    const double along = station - piece.start;
    if (piece.radius == 0) {
        return piece.height + along * (piece.grade + piece.rate * along / 2);
    }
    // The mean grade from the sines and cosines of both ends keeps all digits of a large circle.
    const double cosine = 1 / std::hypot(1.0, piece.grade);
    const double sine = piece.grade * cosine;
    const double endSine = sine + along / piece.radius;
    const double endCosine = std::sqrt(std::max(0.0, (1 - endSine) * (1 + endSine)));
    return piece.height + along * (sine + endSine) / (cosine + endCosine);
}

std::variant<VerticalProfile, ProfileFault> VerticalProfile::make(const std::vector<ProfilePoint> &points)
{
    using Kind = ProfileFault::Kind;
    constexpr double none = std::numeric_limits<double>::quiet_NaN();
    if (points.size() < 2) {
        return ProfileFault{Kind::TooFew, 0};
    }
    for (std::size_t i = 0; i < points.size(); ++i) {
        if (!isFinite(points[i])) {
            return ProfileFault{Kind::NotFinite, i};
        }
        if (i > 0 && !(points[i].station > points[i - 1].station)) {
            return ProfileFault{Kind::NotAhead, i};
        }
        if (i > 0 && !std::isfinite(points[i].station - points[i - 1].station)) {
            return ProfileFault{Kind::NotFinite, i};
        }
    }
    VerticalProfile profile;
    profile.vertices_.reserve(points.size());
    double grade = none;
    for (std::size_t i = 0; i < points.size(); ++i) {
        const bool isLast = i + 1 == points.size();
        const double next =
            isLast ? none : (points[i + 1].height - points[i].height) / (points[i + 1].station - points[i].station);
        if (!isLast && !std::isfinite(next)) {
            return ProfileFault{Kind::NotFinite, i + 1};
        }
        Vertex &vertex = profile.vertices_.emplace_back(Vertex{points[i], grade, next, 0, 0});
        if ((i == 0 || isLast) && points[i].rounding != ProfilePoint::Rounding::None) {
            return ProfileFault{Kind::CurveAtEnd, i};
        }
        layCurve(vertex);
        grade = next;
    }
    for (std::size_t i = 1; i < points.size(); ++i) {
        if (const auto kind = profile.addCurve(profile.vertices_[i])) {
            return ProfileFault{*kind, i};
        }
    }
    return profile;
}

/// Adds the grade that leads to a vertex, and its curve.
std::optional<ProfileFault::Kind> VerticalProfile::addCurve(const Vertex &vertex)
{
    const ProfilePoint &point = vertex.point;
    const bool isCircle = point.rounding == ProfilePoint::Rounding::Circle;
    const bool isParabola = point.rounding == ProfilePoint::Rounding::Parabola;
    if ((isCircle && !(point.radius > 0)) || (isParabola && !(point.lengthIn > 0 && point.lengthOut > 0))) {
        return ProfileFault::Kind::NoCurve;
    }
    const Vertex &before = *(&vertex - 1);
    const double from = pieces_.empty() ? before.point.station : pieces_.back().end;
    if (vertex.start < from - allowedOverlap) {
        return ProfileFault::Kind::Overlap;
    }
    // A grade is laid through the points themselves, so that no rounding adds up along the profile.
    const double start = std::max(from, vertex.start);
    const double height = before.point.height + (from - before.point.station) * vertex.gradeIn;
    if (start > from) {
        pieces_.push_back({from, start, height, vertex.gradeIn, 0, 0});
    }
    if (!isCircle && !isParabola) {
        return std::nullopt;
    }
    const double curveHeight = point.height - (point.station - start) * vertex.gradeIn;
    if (isCircle) {
        const double radius = vertex.gradeOut > vertex.gradeIn ? point.radius : -point.radius;
        pieces_.push_back({start, vertex.end, curveHeight, vertex.gradeIn, 0, radius});
        return std::nullopt;
    }
    // Two parabolas with one grade at the point; of equal lengths they are one.
    const double in = point.station - start;
    const double out = point.lengthOut;
    const double middle = (vertex.gradeIn * in + vertex.gradeOut * out) / (in + out);
    pieces_.push_back({start, point.station, curveHeight, vertex.gradeIn, (middle - vertex.gradeIn) / in, 0});
    pieces_.push_back({point.station, vertex.end, heightOn(pieces_.back(), point.station), middle,
                       (vertex.gradeOut - middle) / out, 0});
    return std::nullopt;
}

const VerticalProfile::Piece *VerticalProfile::pieceAt(double station, bool before) const
{
    if (!(station >= start() - stationTolerance && station <= end() + stationTolerance)) {
        return nullptr;
    }
    // What misses a border by its last digits is on it.
    const auto next =
        std::upper_bound(pieces_.begin(), pieces_.end(), station + (before ? -stationTolerance : stationTolerance),
                         [](double at, const Piece &piece) { return at < piece.start; });
    return next == pieces_.begin() ? &pieces_.front() : &*(next - 1);
}

std::optional<double> VerticalProfile::heightAt(double station) const
{
    const Piece *piece = pieceAt(station, false);
    return piece != nullptr ? std::optional(heightOn(*piece, station)) : std::nullopt;
}

std::optional<double> VerticalProfile::gradeAt(double station, bool before) const
{
    const Piece *piece = pieceAt(station, before);
    return piece != nullptr ? std::optional(gradeOn(*piece, station)) : std::nullopt;
}

std::vector<ProfileExtreme> VerticalProfile::extremes(double from, double to) const
{
    std::vector<ProfileExtreme> found;
    const auto add = [&](const Piece &piece, double station, bool isHigh) {
        if (station >= from && station <= to) {
            found.push_back({station, heightOn(piece, station), isHigh});
        }
    };
    // From the piece before the first one on, which says how the grade comes there.
    const auto next = std::upper_bound(pieces_.begin(), pieces_.end(), from,
                                       [](double at, const Piece &piece) { return at < piece.start; });
    double before = 0; // the last grade that was not level; 0 after a level stretch
    for (auto at = next - std::min<std::ptrdiff_t>(2, next - pieces_.begin()); at != pieces_.end() && at->start <= to;
         ++at) {
        const Piece &piece = *at;
        const double first = piece.grade;
        const double last = gradeOn(piece, piece.end);
        const double after = first != 0 ? first : last;
        if (before * after < 0) {
            add(piece, piece.start, before > 0);
        }
        if (first * last < 0) {
            const double along =
                piece.radius != 0 ? -piece.radius * first / std::hypot(1.0, first) : -first / piece.rate;
            add(piece, piece.start + along, first > 0);
        }
        before = last != 0 ? last : first;
    }
    return found;
}

std::optional<double> VerticalProfile::kValue(const Vertex &vertex)
{
    const ProfilePoint &point = vertex.point;
    const double change = 100 * std::fabs(vertex.gradeOut - vertex.gradeIn);
    if (point.rounding != ProfilePoint::Rounding::Parabola || point.lengthIn != point.lengthOut || !(change > 0)) {
        return std::nullopt;
    }
    return (point.lengthIn + point.lengthOut) / change;
}

} // namespace kareport
