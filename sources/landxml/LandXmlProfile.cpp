#include "LandXmlProfile.h"

#include "Xlate.h"

#include <cmath>

namespace kareport
{

namespace
{

ProfilePoint profilePointOf(const LandXmlGradePoint &stored)
{
    using Kind = LandXmlGradePoint::Kind;
    ProfilePoint point{stored.station, stored.height};
    if (stored.kind == Kind::Circle && stored.radius != 0) {
        point.rounding = ProfilePoint::Rounding::Circle;
        point.radius = std::fabs(stored.radius); // some write it below zero for a crest
    } else if (stored.kind == Kind::Parabola && stored.length != 0) {
        point.rounding = ProfilePoint::Rounding::Parabola;
        point.lengthIn = point.lengthOut = stored.length / 2;
    } else if (stored.kind == Kind::UnsymmetricParabola) {
        point.rounding = ProfilePoint::Rounding::Parabola;
        point.lengthIn = stored.lengthIn;
        point.lengthOut = stored.lengthOut;
    }
    return point;
}

LandXmlFault faultOf(const ProfileFault &fault, const LandXmlGradeLine &line, const std::vector<std::size_t> &bytes)
{
    const std::size_t byte = fault.point < bytes.size() ? bytes[fault.point] : line.byte;
    switch (fault.kind) {
    case ProfileFault::Kind::TooFew: return LandXmlFault{Xlate("the grade line has fewer than two points"), byte};
    case ProfileFault::Kind::NotFinite:
    case ProfileFault::Kind::NoCurve:
        return LandXmlFault{Xlate("the grade line has no heights: a length or a radius above zero was expected"), byte};
    case ProfileFault::Kind::NotAhead:
        return LandXmlFault{
            Xlate("the grade line has no heights: a station ahead of that of the point before was expected"), byte};
    case ProfileFault::Kind::CurveAtEnd:
        return LandXmlFault{
            Xlate("the first or the last point of the grade line has a curve, where only one grade meets"), byte};
    case ProfileFault::Kind::Overlap: break;
    }
    return LandXmlFault{Xlate("the vertical curve begins before the curve of the point before has ended"), byte};
}

} // namespace

std::variant<LandXmlProfile, LandXmlFault> profileOf(const LandXmlGradeLine &line)
{
    std::vector<ProfilePoint> points;
    std::vector<std::size_t> bytes;
    std::vector<std::size_t> vertices;
    for (const LandXmlGradePoint &stored : line.points) {
        const bool isRepeated = !points.empty() && stored.kind == LandXmlGradePoint::Kind::Point &&
                                stored.station == points.back().station && stored.height == points.back().height;
        if (!isRepeated) { // what is there twice is one point
            points.push_back(profilePointOf(stored));
            bytes.push_back(stored.byte);
        }
        vertices.push_back(points.size() - 1);
    }
    auto made = VerticalProfile::make(points);
    if (auto *heights = std::get_if<VerticalProfile>(&made)) {
        return LandXmlProfile{std::move(*heights), std::move(vertices)};
    }
    return faultOf(std::get<ProfileFault>(made), line, bytes);
}

} // namespace kareport
