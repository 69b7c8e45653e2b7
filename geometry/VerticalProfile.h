#pragma once

#include <cstddef>
#include <optional>
#include <variant>
#include <vector>

namespace kareport
{

/// A point where two grades of a profile meet, and the curve that rounds it off.
struct ProfilePoint
{
    enum class Rounding
    {
        None,
        Parabola, ///< over the length in before the point and the length out after it, which may differ
        Circle    ///< of a radius
    };

    double station; ///< horizontal; counted without equations
    double height;
    Rounding rounding = Rounding::None;
    double lengthIn = 0;  ///< horizontal, of a parabola from its start to the point
    double lengthOut = 0; ///< from the point to its end
    double radius = 0;    ///< of a circle
};

/// A place where a profile is highest or lowest in its surroundings.
struct ProfileExtreme
{
    double station;
    double height;
    bool isHigh;
};

/// What is wrong with a profile's points: with which, by its index.
struct ProfileFault
{
    enum class Kind
    {
        NotFinite,
        TooFew,     ///< fewer than two points
        NotAhead,   ///< the point's station is not greater than that of the point before it
        CurveAtEnd, ///< the first or the last point has a curve, though only one grade meets there
        NoCurve,    ///< the length or the radius is not above zero
        Overlap     ///< the curve begins before the curve of the point before it has ended
    };

    Kind kind;
    std::size_t point;
};

/// A grade line: straight grades, rounded off by vertical curves. Heights and stations are of one unit; a grade is height
/// by station, so that 0.01 is one percent upwards.
class VerticalProfile
{
public:
    /// The grades and the curve at one of the points.
    struct Vertex
    {
        ProfilePoint point;
        double gradeIn;  ///< not a number at the first point
        double gradeOut; ///< not a number at the last point
        double start;    ///< station where the curve begins; of the point, where it has none
        double end;
    };

    static std::variant<VerticalProfile, ProfileFault> make(const std::vector<ProfilePoint> &points);

    const std::vector<Vertex> &vertices() const { return vertices_; }
    double start() const { return pieces_.front().start; }
    double end() const { return pieces_.back().end; }

    /// The height at a station; nothing outside the profile.
    std::optional<double> heightAt(double station) const;
    /// The grade at a station; nothing outside the profile. @param before  at a break, the grade that leads to it
    std::optional<double> gradeAt(double station, bool before = false) const;
    /// The high and low points between two stations, in order: where the grade changes its sign. A level stretch is reported by
    /// neither of its ends.
    std::vector<ProfileExtreme> extremes(double from, double to) const;
    /// The horizontal length over which a parabola of equal lengths in and out changes the grade by one percent; nothing
    /// for other curves.
    static std::optional<double> kValue(const Vertex &vertex);

private:
    /// A stretch of one grade or of one curve.
    struct Piece
    {
        double start;
        double end;
        double height; ///< at the start
        double grade;  ///< at the start
        double rate;   ///< of a parabola, the change of grade by station
        double radius; ///< of a circle, positive where it opens upwards; otherwise 0
    };

    static double heightOn(const Piece &piece, double station);
    static double gradeOn(const Piece &piece, double station);
    const Piece *pieceAt(double station, bool before) const;
    std::optional<ProfileFault::Kind> addCurve(const Vertex &vertex);

    std::vector<Vertex> vertices_;
    std::vector<Piece> pieces_;
};

} // namespace kareport
