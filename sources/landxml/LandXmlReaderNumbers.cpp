// Numbers in attributes of elements.
#include "LandXmlReader.h"
#include "NumberText.h"
#include "Xlate.h"

#include <cmath>

namespace kareport
{

namespace
{

QString numberExpected(const char *name, const QString &value)
{
    return Xlate("the attribute %1=\"%2\" does not fit: a number was expected").arg(QString::fromUtf8(name), value);
}

} // namespace

/// Whether what is being read belongs to what was asked for.
bool LandXmlReader::isNeeded() const
{
    const auto isAskedFor = [](const std::string &wanted, const std::string &name) {
        return wanted.empty() || wanted == name;
    };
    if (wants_.isTolerant || wants_.isForReferences || isInGradeModel_) {
        return false;
    }
    if (isInPoint_) {
        return isAskedFor(wants_.owner, owners_[openOwners_.back()]);
    }
    if (!parcelPath_.empty()) {
        return isAskedFor(wants_.parcel, parcels[parcelPath_.back()].name);
    }
    return !isInAlignment_ || isAskedFor(wants_.alignment, alignments.back().name);
}

/// Ends the reading because of a number that cannot be read; where it was not asked for, it is noted.
void LandXmlReader::failNumber(std::size_t byte, const QString &text)
{
    if (isNeeded()) {
        stream_.fail(byte, text);
    } else {
        notes_.add(byte, text);
    }
}

/// A length in metres; not a number where the attribute is missing.
double LandXmlReader::length(const XmlAttributes &attributes, const char *name)
{
    const double metres = radius(attributes, name);
    if (std::isinf(metres)) {
        failNumber(stream_.currentByte(), numberExpected(name, quoteOf(attributes.text(name))));
        return notGiven;
    }
    return metres;
}

/// The same of a radius, which may be infinite: that of a line is.
double LandXmlReader::radius(const XmlAttributes &attributes, const char *name)
{
    const std::string_view value = attributes.text(name);
    double number = notGiven;
    if (!value.empty() && (!parseNumber(value, number) || std::isnan(number))) {
        failNumber(stream_.currentByte(), numberExpected(name, quoteOf(value)));
        return notGiven;
    }
    return number * units_.metres;
}

/// An area in square metres. It is listed as it is stated, and nothing is made of it: one that cannot be read is noted.
double LandXmlReader::area(const XmlAttributes &attributes, const char *name)
{
    const std::string_view value = attributes.text(name);
    double number = notGiven;
    if (!value.empty() && (!parseNumber(value, number) || !std::isfinite(number * units_.squareMetres))) {
        notes_.add(stream_.currentByte(), numberExpected(name, quoteOf(value)));
        return notGiven;
    }
    return number * units_.squareMetres;
}

/// An angle or a direction in radians. The geometry does without them: one that cannot be read is noted.
double LandXmlReader::angle(const XmlAttributes &attributes, const char *name, LandXmlAngle form)
{
    const std::string_view value = attributes.text(name);
    double radians = notGiven;
    if (!value.empty() && !parseLandXmlAngle(value, form, radians)) {
        notes_.add(stream_.currentByte(),
                   Xlate("the attribute %1=\"%2\" does not fit: an angle in the file's unit was expected")
                       .arg(QString::fromUtf8(name), quoteOf(value)));
        return notGiven;
    }
    return radians;
}

} // namespace kareport
