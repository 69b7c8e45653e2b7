// What the reader takes from the text in elements: numbers.
#include "LandXmlReader.h"
#include "LandXmlTags.h"
#include "Xlate.h"

#include <algorithm>
#include <charconv>
#include <cmath>

namespace kareport
{

namespace
{

bool isBlank(char character)
{
    return character == ' ' || character == '\n' || character == '\t' || character == '\r';
}

} // namespace

QString LandXmlReader::quoteOf(std::string_view text)
{
    constexpr std::size_t longest = 60;
    const QString quote = QString::fromUtf8(text.data(), static_cast<qsizetype>(std::min(text.size(), longest)));
    return (text.size() > longest ? quote + u'…' : quote).simplified();
}

void LandXmlReader::end(Tag tag)
{
    switch (tag) {
    case Tag::Point:
    case Tag::SurfacePoint:
        if (takeCoordinates(points_[pointCount_].at) || wants_.isForReferences) {
            addPoint();
        }
        isInPoint_ = false;
        break;
    case Tag::Start:
    case Tag::End:
    case Tag::Centre:
    case Tag::Intersection: takeCoordinates(coordinatesOf(tag)); break;
    case Tag::GradePoint:
    case Tag::Parabola:
    case Tag::UnsymmetricParabola:
    case Tag::Circle: {
        LandXmlGradePoint &point = alignments.back().gradeLines.back().points.back();
        takePair(point.station, point.height);
        break;
    }
    case Tag::SectionPoint: {
        LandXmlSectionPoint &point = alignments.back().sections.back().surfaces.back().points.back();
        takePair(point.offset, point.height);
        break;
    }
    case Tag::PointList2:
    case Tag::PointList3: endPointList(tag); break;
    default: break;
    }
}

void LandXmlReader::addPoint()
{
    if (++pointCount_ == points_.size()) {
        points_.emplace_back();
    }
}

void LandXmlReader::dropPoints()
{
    if (pointCount_ > 0) {
        std::swap(points_.front(), points_[pointCount_]);
        pointCount_ = 0;
    }
}

/// Reads the text as numbers with blanks between them. A sign that a line end separates from its number belongs to it.
bool LandXmlReader::takeNumbers()
{
    numbers_.clear();
    const char *at = text_.data();
    const char *const end = at + text_.size();
    bool isSignApart = false;
    while (true) {
        while (at != end && isBlank(*at)) {
            ++at;
        }
        if (at == end) {
            break;
        }
        const char *const begin = at;
        bool isNegative = false;
        if (*at == '-' || *at == '+') {
            isNegative = *at++ == '-';
            if (at != end && isBlank(*at)) {
                isSignApart = true;
                while (at != end && isBlank(*at)) {
                    ++at;
                }
            }
        }
        double number = 0;
        const auto result = std::from_chars(at, end, number);
        const bool isNumber = result.ec == std::errc() && std::isfinite(number * units_.metres) &&
                              (result.ptr == end || isBlank(*result.ptr)) && *at != '-';
        if (!isNumber) {
            const char *last = at;
            while (last != end && !isBlank(*last)) {
                ++last;
            }
            failNumber(textByte_, Xlate("\"%1\" does not fit: a number was expected")
                                      .arg(quoteOf({begin, static_cast<std::size_t>(last - begin)})));
            return false;
        }
        numbers_.push_back(isNegative ? -number : number);
        at = result.ptr;
    }
    if (isSignApart) {
        notes_.add(textByte_, Xlate("signs are separated from their numbers by blanks, and were taken with them"));
    }
    return true;
}

/// Takes the text as coordinates. @return whether it is some, or a reference stands for them
bool LandXmlReader::takeCoordinates(LandXmlCoordinates &at)
{
    if (!takeNumbers()) {
        return false;
    }
    if (numbers_.empty() && !at.reference.empty()) {
        return true;
    }
    if (numbers_.size() != 2 && numbers_.size() != 3) {
        failNumber(textByte_, Xlate("the coordinates \"%1\" do not fit: northing, easting and perhaps a height were "
                                    "expected")
                                  .arg(quoteOf(text_)));
        return false;
    }
    at.position = PlanePoint{numbers_[0] * units_.metres, numbers_[1] * units_.metres};
    if (numbers_.size() == 3) {
        at.height = numbers_[2] * units_.metres;
    }
    return true;
}

void LandXmlReader::takePair(double &first, double &second)
{
    if (!takeNumbers()) {
        return;
    }
    if (numbers_.size() != 2) {
        failNumber(textByte_, Xlate("\"%1\" does not fit: two numbers were expected").arg(quoteOf(text_)));
        return;
    }
    first = numbers_[0] * units_.metres;
    second = numbers_[1] * units_.metres;
}

void LandXmlReader::endPointList(Tag tag)
{
    if (!takeNumbers()) {
        return;
    }
    const std::size_t each = tag == Tag::PointList2 ? 2 : 3;
    if (numbers_.size() % each != 0) {
        notes_.add(textByte_, Xlate("the list of numbers ends in the middle of a point, which was left out"));
    }
    const Tag owner = open_.back().tag;
    if (owner == Tag::SurfaceLine) {
        LandXmlHeightLine &line = alignments.back().surfaceLines.back();
        line.pieces.push_back(line.points.size());
    }
    weigh((owner == Tag::IrregularLine ? leastPoint : leastPair) * (numbers_.size() / each));
    for (std::size_t i = 0; i + each <= numbers_.size(); i += each) {
        const double first = numbers_[i] * units_.metres;
        const double second = numbers_[i + 1] * units_.metres;
        if (owner == Tag::SurfaceLine) {
            alignments.back().surfaceLines.back().points.emplace_back(first, second);
        } else if (owner == Tag::SectionSurface) {
            alignments.back().sections.back().surfaces.back().points.push_back({first, second, {}});
        } else {
            element().between.push_back({first, second});
        }
    }
}

} // namespace kareport
